// SPDX-License-Identifier: Apache-2.0
// The arguments of a message pattern, as far as a record can show them.
//
// A record shows the arguments that a plain reading of the pattern finds, in which every quote
// begins or ends quoted text. ICU, which binds the message, reads quotes otherwise, and the caller
// has passed what ICU asks for. So there are two readings, and an argument is fetched from the list
// only as long as they agree on its kind.
#pragma once

#include <cstdint>

#include <unicode/umachine.h>

namespace zelvo {

enum class ArgKind : uint8_t { ABSENT, TEXT, INTEGER, DOUBLE, UNKNOWN };

/// The kinds of the arguments {0} to {9}; all absent at first.
struct ArgKinds {
    static constexpr int32_t COUNT = 10;
    ArgKind of[COUNT];

    /// Sets the kind of an argument; a number that stands for none sets nothing.
    void set(int64_t number, ArgKind kind)
    {
        if (number >= 0 && number < COUNT)
            of[number] = kind;
    }
};

/// The plain reading; all absent when it had to be abandoned.
ArgKinds kindsInPlainReading(const UChar *pattern);

/// ICU's reading, up to the first place where it finds the pattern malformed.
ArgKinds kindsInIcuReading(const UChar *pattern);

/// The kinds to fetch, in order; from the first that cannot be fetched on, all are absent.
ArgKinds fetchableKinds(const UChar *pattern);

} // namespace zelvo
