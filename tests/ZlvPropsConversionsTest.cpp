// SPDX-License-Identifier: Apache-2.0
// The conversions of property text to values.
#include <gtest/gtest.h>

#include <cmath>
#include <cstdint>
#include <string>

#include "ZlvPropsIntl.h"

namespace zelvo_test {
namespace {

/// A text, the value it converts to and the verdict.
template <class Value>
struct Row {
    const char *name;
    const char *text;
    Value value;
    ZlvBool found;
};

const auto rowName = [](const auto &row) { return std::string(row.param.name); };

/// Converts with the flag preset to the opposite of what it must become, and again without a flag.
template <class Value, class Convert>
void check(const Row<Value> &row, Convert convert)
{
    ZlvBool found = row.found == 0 ? 1 : 0;
    EXPECT_EQ(convert(row.text, &found), row.value);
    EXPECT_EQ(found, row.found);
    EXPECT_EQ(convert(row.text, nullptr), row.value);
}

class ZlvPropStrToBool : public testing::TestWithParam<Row<ZlvBool>> {};
TEST_P(ZlvPropStrToBool, ConvertsTheRow)
{
    check(GetParam(), zlvPropStrToBool);
}
const Row<ZlvBool> boolRows[] = {
    {"True", "true", 1, 1},
    {"False", "false", 0, 1},
    {"UpperTrue", "TRUE", 1, 1},
    {"MixedFalse", "fAlSe", 0, 1},
    {"Yes", "yes", 0, 0},
    {"One", "1", 0, 0},
    {"Empty", "", 0, 0},
    {"LeadingBlank", " true", 0, 0},
    {"TrailingBlank", "true ", 0, 0},
    {"Prefix", "tru", 0, 0},
    {"LongerWord", "trueish", 0, 0},
    {"Null", nullptr, 0, 0},
};
INSTANTIATE_TEST_SUITE_P(Rows, ZlvPropStrToBool, testing::ValuesIn(boolRows), rowName);

class ZlvPropStrToChar : public testing::TestWithParam<Row<char>> {};
TEST_P(ZlvPropStrToChar, ConvertsTheRow)
{
    check(GetParam(), zlvPropStrToChar);
}
const Row<char> charRows[] = {
    {"OneByte", "x", 'x', 1}, {"FirstOfMany", "yes", 'y', 1},   {"Blank", " a", ' ', 1},
    {"Empty", "", '\0', 1},   {"HighByte", "\xE9t", '\xE9', 1}, {"Null", nullptr, '\0', 0},
};
INSTANTIATE_TEST_SUITE_P(Rows, ZlvPropStrToChar, testing::ValuesIn(charRows), rowName);

class ZlvPropStrToInt32 : public testing::TestWithParam<Row<int32_t>> {};
TEST_P(ZlvPropStrToInt32, ConvertsTheRow)
{
    check(GetParam(), zlvPropStrToInt32);
}
const Row<int32_t> int32Rows[] = {
    {"Number", "42", 42, 1},
    {"Negative", "-7", -7, 1},
    {"PlusSign", "+7", 7, 1},
    {"LeadingBlanks", " \t\n42", 42, 1},
    {"TrailingText", "12abc", 12, 1},
    {"Hexadecimal", "0x10", 0, 1},
    {"LeadingZeros", "010", 10, 1},
    {"Fraction", "1.9", 1, 1},
    {"Zero", "0", 0, 1},
    {"Largest", "2147483647", INT32_MAX, 1},
    {"Smallest", "-2147483648", INT32_MIN, 1},
    {"Letters", "abc", 0, 0},
    {"Empty", "", 0, 0},
    {"Blanks", "  ", 0, 0},
    {"SignAlone", "-", 0, 0},
    {"SignAndBlank", "- 1", 0, 0},
    {"Null", nullptr, 0, 0},
};
INSTANTIATE_TEST_SUITE_P(Rows, ZlvPropStrToInt32, testing::ValuesIn(int32Rows), rowName);

class ZlvPropStrToInt64 : public testing::TestWithParam<Row<int64_t>> {};
TEST_P(ZlvPropStrToInt64, ConvertsTheRow)
{
    check(GetParam(), zlvPropStrToInt64);
}
const Row<int64_t> int64Rows[] = {
    {"Number", "42", 42, 1},
    {"Beyond32Bits", "4294967297", 4294967297, 1},
    {"Largest", "9223372036854775807", INT64_MAX, 1},
    {"Smallest", "-9223372036854775808", INT64_MIN, 1},
    {"LeadingBlanks", "  -5", -5, 1},
    {"TrailingText", "12abc", 12, 1},
    {"Hexadecimal", "0x10", 0, 1},
    {"Letters", "abc", 0, 0},
    {"Empty", "", 0, 0},
    {"Null", nullptr, 0, 0},
};
INSTANTIATE_TEST_SUITE_P(Rows, ZlvPropStrToInt64, testing::ValuesIn(int64Rows), rowName);

class ZlvPropStrToFloat32 : public testing::TestWithParam<Row<float>> {};
TEST_P(ZlvPropStrToFloat32, ConvertsTheRow)
{
    check(GetParam(), zlvPropStrToFloat32);
}
const Row<float> float32Rows[] = {
    {"Number", "1.5", 1.5F, 1},        {"Integer", "3", 3.0F, 1},
    {"Negative", "-0.25", -0.25F, 1},  {"NoLeadingDigit", ".5", 0.5F, 1},
    {"Exponent", "1e2", 100.0F, 1},    {"LeadingBlanks", " \t2.5", 2.5F, 1},
    {"TrailingText", "2.5x", 2.5F, 1}, {"Infinity", "inf", INFINITY, 1},
    {"Hexadecimal", "0x10", 16.0F, 1}, {"Letters", "abc", 0.0F, 0},
    {"PointAlone", ".", 0.0F, 0},      {"Empty", "", 0.0F, 0},
    {"Null", nullptr, 0.0F, 0},
};
INSTANTIATE_TEST_SUITE_P(Rows, ZlvPropStrToFloat32, testing::ValuesIn(float32Rows), rowName);

class ZlvPropStrToFloat64 : public testing::TestWithParam<Row<double>> {};
TEST_P(ZlvPropStrToFloat64, ConvertsTheRow)
{
    check(GetParam(), zlvPropStrToFloat64);
}
const Row<double> float64Rows[] = {
    {"Number", "1.5", 1.5, 1},           {"DoublePrecision", "0.1", 0.1, 1},
    {"BeyondFloat", "1e300", 1e300, 1},  {"Negative", "-0.25", -0.25, 1},
    {"LeadingBlanks", " \t2.5", 2.5, 1}, {"TrailingText", "2.5x", 2.5, 1},
    {"Letters", "abc", 0.0, 0},          {"Empty", "", 0.0, 0},
    {"Null", nullptr, 0.0, 0},
};
INSTANTIATE_TEST_SUITE_P(Rows, ZlvPropStrToFloat64, testing::ValuesIn(float64Rows), rowName);

} // namespace
} // namespace zelvo_test
