// SPDX-License-Identifier: Apache-2.0
// Decimal numbers as texts begin with them, read digit by digit.
#pragma once

#include <cstdint>
#include <limits>
#include <string_view>

namespace zelvo_fuzz {

struct LeadingNumber {
    bool isThere;    ///< there is at least one digit
    bool isAllBlank; ///< the text ends before anything else comes
    int64_t value;   ///< the nearest one that 64 bits can hold

    int32_t low32() const { return static_cast<int32_t>(static_cast<uint64_t>(value)); }
};

/// Adds a digit, unless that goes beyond what 64 bits hold.
inline int64_t withDigit(int64_t value, char digit, bool isNegative)
{
    int64_t result = 0;
    const int64_t step = isNegative ? '0' - digit : digit - '0';
    if (__builtin_mul_overflow(value, 10, &result) || __builtin_add_overflow(result, step, &result))
        return isNegative ? std::numeric_limits<int64_t>::min()
                          : std::numeric_limits<int64_t>::max();
    return result;
}

inline LeadingNumber leadingNumber(std::string_view text)
{
    text.remove_prefix(std::min(text.find_first_not_of(" \t\n\v\f\r"), text.size()));
    if (text.empty())
        return {false, true, 0};
    const bool isNegative = text.front() == '-';
    if (isNegative || text.front() == '+')
        text.remove_prefix(1);
    LeadingNumber number{false, false, 0};
    for (; !text.empty() && text.front() >= '0' && text.front() <= '9'; text.remove_prefix(1))
        number = {true, false, withDigit(number.value, text.front(), isNegative)};
    return number;
}

} // namespace zelvo_fuzz
