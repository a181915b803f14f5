// SPDX-License-Identifier: Apache-2.0
// Decimal text of integers, without locale and allocation, for byte and UTF-16 buffers alike.
#pragma once

#include <charconv>
#include <cstddef>

namespace zelvo {

/// Zero-terminated decimal text; the longest, of a 64-bit number, has 20 characters.
struct DecimalText {
    static constexpr size_t SIZE = 24;
    char text[SIZE];
};

template <class Integer>
DecimalText decimalText(Integer value)
{
    DecimalText result{};
    std::to_chars(result.text, result.text + DecimalText::SIZE - 1, value);
    return result;
}

} // namespace zelvo
