// SPDX-License-Identifier: Apache-2.0
// Buffers and lists that let go of their storage when a test ends, and their contents as C++
// strings.
#pragma once

#include <string>

#include "CxPropList.h"
#include "CxStringBuff.h"
#include "CxUStringBuff.h"
#include "support/Text.h"

namespace zelvo_test {

/// An empty byte buffer of the test's own.
struct Buff : CxStringBuff {
    Buff() : CxStringBuff{} {}
    explicit Buff(const char *text) : Buff() { CxStringBuffAppendStr(this, text); }
    Buff(const Buff &) = delete;
    Buff &operator=(const Buff &) = delete;
    ~Buff() { CxStringBuffDiscard(this); }

    /// The bytes in use, zero bytes among them too; "" before the first append.
    std::string text() const { return data == nullptr ? std::string() : std::string(data, length); }
    /// Whether a zero byte follows the bytes in use.
    bool terminated() const { return data != nullptr && data[length] == 0; }
};

/// An empty UTF-16 buffer of the test's own.
struct UBuff : CxUStringBuff {
    UBuff() : CxUStringBuff{} {}
    UBuff(const UBuff &) = delete;
    UBuff &operator=(const UBuff &) = delete;
    ~UBuff() { CxUStringBuffDiscard(this); }

    std::u16string text() const
    {
        return data == nullptr ? std::u16string() : std::u16string(data, length);
    }
    bool terminated() const { return data != nullptr && data[length] == 0; }
};

/// An empty property list of the test's own.
struct Props : CxPropList {
    Props() : CxPropList{} {}
    Props(const Props &) = delete;
    Props &operator=(const Props &) = delete;
    ~Props() { CxPropListDiscard(this); }

    /// The value of KEY; "(absent)" when the list has none.
    std::string value(const char *key) const
    {
        const char *text = CxPropListPeekStr(this, key, nullptr);
        return text == nullptr ? "(absent)" : text;
    }

    /// All entries in their order, as "key=value key=value".
    std::string all() const
    {
        std::string text;
        for (int32_t i = 0; i < count; ++i)
            text.append(i == 0 ? "" : " ")
                .append(entries[i].key)
                .append("=")
                .append(entries[i].value);
        return text;
    }
};

} // namespace zelvo_test
