// SPDX-License-Identifier: Apache-2.0
// Conversions of text that is all ASCII. Where the default converter leaves ASCII alone they are
// copies, and the converter need not be asked.
#pragma once

#include <cstddef>

#include <unicode/umachine.h>

namespace zelvo {

/// Tells whether a conversion of a text between bytes and UTF-16 is a copy of its units.
bool isCopiedPlainly(const char *text, size_t length);
bool isCopiedPlainly(const UChar *text, size_t length);

/// Copies so many units, each of which is ASCII.
template <class To, class From>
void copyAscii(To *to, const From *from, size_t length)
{
    for (size_t i = 0; i < length; ++i)
        to[i] = static_cast<To>(from[i]);
}

} // namespace zelvo
