// SPDX-License-Identifier: Apache-2.0
// Hex digits of the reader, whose letters count from zero.
#include "ZlvReadPropsIntl.h"

#include <string>

#include <gtest/gtest.h>

namespace zelvo_test {
namespace {

TEST(ZlvReadPropsHex, OnlyDigitsAndTheLettersAToFHaveAValue)
{
    std::string digits;
    for (int code = 0; code < 256; ++code) {
        int32_t digit = -7;
        if (zlvRdprHexConv(static_cast<char>(code), &digit) != 0)
            digits += static_cast<char>(code);
    }
    EXPECT_EQ(digits, "0123456789ABCDEFabcdef");
}

TEST(ZlvReadPropsHex, WithoutASlotNothingHasAValue)
{
    EXPECT_EQ(zlvRdprHexConv('7', nullptr), 0);
}

TEST(ZlvReadPropsHex, LettersCountFromZero)
{
    const struct {
        char c;
        int32_t value;
    } digits[] = {{'0', 0}, {'1', 1}, {'2', 2}, {'3', 3}, {'4', 4}, {'5', 5}, {'6', 6}, {'7', 7},
                  {'8', 8}, {'9', 9}, {'a', 0}, {'b', 1}, {'c', 2}, {'d', 3}, {'e', 4}, {'f', 5},
                  {'A', 0}, {'B', 1}, {'C', 2}, {'D', 3}, {'E', 4}, {'F', 5}};
    for (const auto &expected : digits) {
        int32_t digit = -7;
        EXPECT_EQ(zlvRdprHexConv(expected.c, &digit), 1);
        EXPECT_EQ(digit, expected.value) << expected.c;
    }
}

} // namespace
} // namespace zelvo_test
