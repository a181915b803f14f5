// SPDX-License-Identifier: Apache-2.0
// Formatter classes with records short enough to count, for tests of what handlers write.
#pragma once

#include <unicode/ustring.h>

#include "CxMemory.h"
#include "CxString.h"
#include "CxUString.h"
#include "ZlvIntl.h"

namespace zelvo_test {

/// The class LineFormatter::plain, whose record is the event's text and a newline, or nothing when
/// there is no text; the class
/// LineFormatter::framed, which adds a header and a trailer.
class LineFormatter {
public:
    static constexpr const char *plain = "test_line";
    static constexpr const char *framed = "test_framed";
    static constexpr const char *header = "[\n";
    static constexpr const char *trailer = "]\n";

    /// Registers both classes.
    static void addClasses()
    {
        formatted_ = 0;
        ZlvAddUFormatterClass(plain, nullptr, nullptr, nullptr, nullptr, format, nullptr, nullptr,
                              nullptr);
        ZlvAddUFormatterClass(framed, nullptr, nullptr, nullptr, nullptr, format, getHeader,
                              getTrailer, nullptr);
    }

    /// The records made so far.
    static int formatted() { return formatted_; }

private:
    static UChar *format(ZlvObject * /*formatter*/, ZlvEvent *event, va_list args)
    {
        ++formatted_;
        UChar *text = zlvIntlBindUI18Msg(event->message, args);
        if (text == nullptr)
            return nullptr;
        const auto length = static_cast<size_t>(u_strlen(text));
        auto *record = static_cast<UChar *>(RkoMemoryRealloc(text, (length + 2) * sizeof(UChar)));
        if (record == nullptr) {
            RkoMemoryFree(text);
            return nullptr;
        }
        record[length] = u'\n';
        record[length + 1] = 0;
        return record;
    }

    static char *getHeader(ZlvObject * /*formatter*/) { return RkoStringDup(header); }
    static char *getTrailer(ZlvObject * /*formatter*/) { return RkoStringDup(trailer); }

    inline static int formatted_ = 0;
};

} // namespace zelvo_test
