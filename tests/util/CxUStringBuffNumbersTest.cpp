// SPDX-License-Identifier: Apache-2.0
// Whole numbers, which are always written unsigned, and the two number patterns.
#include "CxUStringBuff.h"

#include <cstdint>
#include <string>

#include <gtest/gtest.h>

#include "support/Buffers.h"
#include "support/FailAlloc.h"
#include "support/IcuDefaults.h"

namespace zelvo_test {
namespace {

struct Whole {
    const char *label;
    int64_t value;
    const char16_t *text;
};

class CxUStringBuffInt64 : public testing::TestWithParam<Whole> {};

TEST_P(CxUStringBuffInt64, IsWrittenAsAnUnsignedNumber)
{
    UBuff asSigned, asUnsigned;
    EXPECT_EQ(CxUStringBuffAppendInt64(&asSigned, GetParam().value), 1);
    EXPECT_EQ(CxUStringBuffAppendUInt64(&asUnsigned, static_cast<uint64_t>(GetParam().value)), 1);
    EXPECT_EQ(asSigned.text(), GetParam().text);
    EXPECT_EQ(asUnsigned.text(), GetParam().text);
    EXPECT_TRUE(asSigned.terminated());
}

INSTANTIATE_TEST_SUITE_P(Values, CxUStringBuffInt64,
                         testing::Values(Whole{"Zero", 0, u"0"}, Whole{"Seven", 7, u"7"},
                                         Whole{"Ten", 10, u"10"},
                                         Whole{"NoGrouping", 1234567890123, u"1234567890123"},
                                         Whole{"Most", INT64_MAX, u"9223372036854775807"},
                                         Whole{"Least", INT64_MIN, u"9223372036854775808"},
                                         Whole{"MinusOne", -1, u"18446744073709551615"},
                                         Whole{"MinusFive", -5, u"18446744073709551611"}),
                         [](const auto &row) { return row.param.label; });

class CxUStringBuffInt32 : public testing::TestWithParam<Whole> {};

TEST_P(CxUStringBuffInt32, IsSignExtendedBeforeItIsWrittenUnsigned)
{
    UBuff buff;
    EXPECT_EQ(CxUStringBuffAppendInt32(&buff, static_cast<int32_t>(GetParam().value)), 1);
    EXPECT_EQ(buff.text(), GetParam().text);
}

INSTANTIATE_TEST_SUITE_P(Values, CxUStringBuffInt32,
                         testing::Values(Whole{"Zero", 0, u"0"}, Whole{"Seven", 7, u"7"},
                                         Whole{"Most", INT32_MAX, u"2147483647"},
                                         Whole{"MinusOne", -1, u"18446744073709551615"},
                                         Whole{"Least", INT32_MIN, u"18446744071562067968"}),
                         [](const auto &row) { return row.param.label; });

TEST(CxUStringBuffNumbers, WholeNumbersAreTheSameInEveryDefaultLocale)
{
    DefaultLocale egypt("ar_EG");
    UBuff buff;
    EXPECT_EQ(CxUStringBuffAppendInt64(&buff, 1234), 1);
    EXPECT_EQ(buff.text(), u"1234");
}

struct Real {
    const char *label;
    double value;
    const char16_t *text;
};

class CxUStringBuffUDouble : public testing::TestWithParam<Real> {};

TEST_P(CxUStringBuffUDouble, HasAtMostFiveFractionDigitsAndNoGrouping)
{
    UBuff buff;
    EXPECT_EQ(CxUStringBuffAppendUDouble(&buff, GetParam().value), 1);
    EXPECT_EQ(buff.text(), GetParam().text);
    EXPECT_TRUE(buff.terminated());
}

INSTANTIATE_TEST_SUITE_P(
    Values, CxUStringBuffUDouble,
    testing::Values(Real{"TwoAndAHalf", 2.5, u"2.5"}, Real{"One", 1.0, u"1"},
                    Real{"Rounded", 0.1234567, u"0.12346"}, Real{"Zero", 0.0, u"0"},
                    Real{"Negative", -2.25, u"-2.25"}, Real{"Great", 1234567.5, u"1234567.5"},
                    Real{"ThirtyOneUnits", 1e30, u"1000000000000000000000000000000"}),
    [](const auto &row) { return row.param.label; });

class CxUStringBuffUDate : public testing::TestWithParam<Real> {};

TEST_P(CxUStringBuffUDate, IsAPlainCountOfMilliseconds)
{
    UBuff buff;
    EXPECT_EQ(CxUStringBuffAppendUDate(&buff, GetParam().value), 1);
    EXPECT_EQ(buff.text(), GetParam().text);
    EXPECT_TRUE(buff.terminated());
}

INSTANTIATE_TEST_SUITE_P(Values, CxUStringBuffUDate,
                         testing::Values(Real{"Thousand", 1000.0, u"1000"}, Real{"Zero", 0, u"0"},
                                         Real{"Today", 1700000000123.0, u"1700000000123"},
                                         Real{"Before1970", -1500.0, u"-1500"},
                                         Real{"WithoutFraction", 1000.25, u"1000"}),
                         [](const auto &row) { return row.param.label; });

TEST(CxUStringBuffNumbers, PatternsFollowTheDefaultLocale)
{
    DefaultLocale german("de_DE");
    UBuff number, date;
    EXPECT_EQ(CxUStringBuffAppendUDouble(&number, 12345.5), 1);
    EXPECT_EQ(CxUStringBuffAppendUDate(&date, 12345.0), 1);
    EXPECT_EQ(number.text(), u"12345,5");
    EXPECT_EQ(date.text(), u"12345");
}

TEST(CxUStringBuffNumbers, NumbersAreAppendedToTheText)
{
    UBuff buff;
    CxUStringBuffAppendStr(&buff, "t=");
    EXPECT_EQ(CxUStringBuffAppendUDate(&buff, 1.0), 1);
    EXPECT_EQ(CxUStringBuffAppendUDouble(&buff, 2.5), 1);
    EXPECT_EQ(CxUStringBuffAppendInt32(&buff, 3), 1);
    EXPECT_EQ(buff.text(), u"t=12.53");
}

TEST(CxUStringBuffNumbers, ATextOfMoreThan31UnitsIsRefused)
{
    UBuff buff;
    CxUStringBuffAppendStr(&buff, "t=");
    for (double great : {1e31, -1e30, 1e100, -1e300}) {
        EXPECT_EQ(CxUStringBuffAppendUDate(&buff, great), 0) << great;
        EXPECT_EQ(CxUStringBuffAppendUDouble(&buff, great), 0) << great;
    }
    EXPECT_EQ(buff.text(), u"t=");
}

TEST(CxUStringBuffNumbers, EveryCallTakesANullBuffer)
{
    EXPECT_EQ(CxUStringBuffAppendInt32(nullptr, 1), 0);
    EXPECT_EQ(CxUStringBuffAppendInt64(nullptr, 1), 0);
    EXPECT_EQ(CxUStringBuffAppendUInt64(nullptr, 1), 0);
    EXPECT_EQ(CxUStringBuffAppendUDate(nullptr, 1), 0);
    EXPECT_EQ(CxUStringBuffAppendUDouble(nullptr, 1), 0);
}

TEST(CxUStringBuffNumbers, AFailedGrowthLeavesTheBufferAsItWas)
{
    const std::u16string full(511, u'x');
    UBuff buff;
    ASSERT_EQ(CxUStringBuffAppendUStr(&buff, full.c_str()), 1);
    FailAlloc fail(0);
    EXPECT_EQ(CxUStringBuffAppendInt32(&buff, 1), 0);
    EXPECT_EQ(CxUStringBuffAppendInt64(&buff, 1), 0);
    EXPECT_EQ(CxUStringBuffAppendUInt64(&buff, 1), 0);
    EXPECT_EQ(CxUStringBuffAppendUDate(&buff, 1), 0);
    EXPECT_EQ(CxUStringBuffAppendUDouble(&buff, 1), 0);
    EXPECT_EQ(buff.text(), full);
    EXPECT_EQ(buff.capacity, 1024U);
}

} // namespace
} // namespace zelvo_test
