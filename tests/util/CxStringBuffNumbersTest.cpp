// SPDX-License-Identifier: Apache-2.0
// Decimal text of whole numbers, in ASCII and in EBCDIC.
#include "CxStringBuff.h"

#include <cstdint>
#include <string>

#include <gtest/gtest.h>

#include "support/Buffers.h"
#include "support/FailAlloc.h"

namespace zelvo_test {
namespace {

struct Signed {
    const char *label;
    int64_t value;
    const char *text;
};

class CxStringBuffInt64 : public testing::TestWithParam<Signed> {};

TEST_P(CxStringBuffInt64, IsAppendedAsSignedDecimalText)
{
    Buff buff("n=");
    EXPECT_EQ(CxStringBuffAppendInt64(&buff, GetParam().value), 1);
    EXPECT_EQ(buff.text(), std::string("n=") + GetParam().text);
    EXPECT_TRUE(buff.terminated());
}

INSTANTIATE_TEST_SUITE_P(
    Values, CxStringBuffInt64,
    testing::Values(Signed{"Zero", 0, "0"}, Signed{"One", 1, "1"}, Signed{"Nine", 9, "9"},
                    Signed{"Ten", 10, "10"}, Signed{"InnerZeros", 1002003, "1002003"},
                    Signed{"MinusOne", -1, "-1"}, Signed{"MinusFive", -5, "-5"},
                    Signed{"MinusTen", -10, "-10"}, Signed{"Above32Bits", 4294967296, "4294967296"},
                    Signed{"Most", INT64_MAX, "9223372036854775807"},
                    Signed{"Least", INT64_MIN, "-9223372036854775808"}),
    [](const auto &row) { return row.param.label; });

class CxStringBuffInt32 : public testing::TestWithParam<Signed> {};

TEST_P(CxStringBuffInt32, IsSignExtended)
{
    Buff buff;
    EXPECT_EQ(CxStringBuffAppendInt32(&buff, static_cast<int32_t>(GetParam().value)), 1);
    EXPECT_EQ(buff.text(), GetParam().text);
}

INSTANTIATE_TEST_SUITE_P(Values, CxStringBuffInt32,
                         testing::Values(Signed{"Zero", 0, "0"}, Signed{"Seven", 7, "7"},
                                         Signed{"MinusOne", -1, "-1"},
                                         Signed{"Most", INT32_MAX, "2147483647"},
                                         Signed{"Least", INT32_MIN, "-2147483648"}),
                         [](const auto &row) { return row.param.label; });

struct Unsigned {
    const char *label;
    uint64_t value;
    const char *text;
};

class CxStringBuffUInt64 : public testing::TestWithParam<Unsigned> {};

TEST_P(CxStringBuffUInt64, IsAppendedAsUnsignedDecimalText)
{
    Buff buff("n=");
    EXPECT_EQ(CxStringBuffAppendUInt64(&buff, GetParam().value), 1);
    EXPECT_EQ(buff.text(), std::string("n=") + GetParam().text);
    EXPECT_TRUE(buff.terminated());
}

INSTANTIATE_TEST_SUITE_P(Values, CxStringBuffUInt64,
                         testing::Values(Unsigned{"Zero", 0, "0"}, Unsigned{"Ten", 10, "10"},
                                         Unsigned{"Many", 1234567890123, "1234567890123"},
                                         Unsigned{"SignBit", 9223372036854775808U,
                                                  "9223372036854775808"},
                                         Unsigned{"AllOnes", UINT64_MAX, "18446744073709551615"}),
                         [](const auto &row) { return row.param.label; });

class CxStringBuffEbcdic : public testing::TestWithParam<Signed> {};

TEST_P(CxStringBuffEbcdic, IsAppendedAsEbcdicBytes)
{
    Buff buff("n");
    EXPECT_EQ(CxStringBuffAppendEBCDICInt64(&buff, GetParam().value), 1);
    EXPECT_EQ(buff.text(), std::string("n") + GetParam().text);
    EXPECT_TRUE(buff.terminated());
}

INSTANTIATE_TEST_SUITE_P(
    Values, CxStringBuffEbcdic,
    testing::Values(
        Signed{"ZeroIsNothing", 0, ""}, Signed{"One", 1, "\xF1"}, Signed{"Ten", 10, "\xF1\xF0"},
        Signed{"MinusTwelve", -12, "\x60\xF1\xF2"},
        Signed{"AllDigits", 9876543210, "\xF9\xF8\xF7\xF6\xF5\xF4\xF3\xF2\xF1\xF0"},
        Signed{"Least", INT64_MIN,
               "\x60\xF9\xF2\xF2\xF3\xF3\xF7\xF2\xF0\xF3\xF6\xF8\xF5\xF4\xF7\xF7\xF5\xF8\xF0\xF8"}),
    [](const auto &row) { return row.param.label; });

TEST(CxStringBuffNumbers, EveryCallTakesANullBuffer)
{
    EXPECT_EQ(CxStringBuffAppendInt32(nullptr, 1), 0);
    EXPECT_EQ(CxStringBuffAppendInt64(nullptr, 1), 0);
    EXPECT_EQ(CxStringBuffAppendUInt64(nullptr, 1), 0);
    EXPECT_EQ(CxStringBuffAppendUInt64(nullptr, 0), 0);
    EXPECT_EQ(CxStringBuffAppendEBCDICInt64(nullptr, 1), 0);
    EXPECT_EQ(CxStringBuffAppendEBCDICInt64(nullptr, 0), 0);
}

TEST(CxStringBuffNumbers, AFailedGrowthLeavesTheBufferAsItWas)
{
    const std::string nearlyFull(1020, 'x');
    Buff buff(nearlyFull.c_str());
    FailAlloc fail(0);
    EXPECT_EQ(CxStringBuffAppendInt32(&buff, -1234), 0);
    EXPECT_EQ(CxStringBuffAppendInt64(&buff, 12345), 0);
    EXPECT_EQ(CxStringBuffAppendEBCDICInt64(&buff, -1234), 0);
    EXPECT_EQ(fail.failed(), 3U);
    EXPECT_EQ(buff.text(), nearlyFull);
    EXPECT_EQ(buff.capacity, 1024U);
}

TEST(CxStringBuffNumbers, SignAndDigitsAskForRoomOnce)
{
    Buff buff(std::string(1020, 'x').c_str());
    FailAlloc counted(UINT32_MAX);
    EXPECT_EQ(CxStringBuffAppendInt64(&buff, INT64_MIN), 1);
    EXPECT_EQ(counted.asked(), 1U);
    EXPECT_EQ(buff.capacity, 2048U);
}

TEST(CxStringBuffNumbers, AFailedAppendOfAnUnsignedNumberIsNotReported)
{
    const std::string nearlyFull(1021, 'x');
    Buff buff(nearlyFull.c_str());
    FailAlloc fail(0);
    EXPECT_EQ(CxStringBuffAppendUInt64(&buff, 123456), 1);
    EXPECT_EQ(fail.failed(), 4U); // digits go in one by one; the last four found no room
    EXPECT_EQ(buff.text(), nearlyFull + "12");
    EXPECT_TRUE(buff.terminated());
}

TEST(CxStringBuffNumbers, AnUnsignedNumberWithoutAnyStorageIsNotReportedEither)
{
    Buff buff;
    FailAlloc fail(0);
    EXPECT_EQ(CxStringBuffAppendUInt64(&buff, 7), 1);
    EXPECT_EQ(fail.failed(), 1U);
    EXPECT_EQ(buff.data, nullptr);
}

} // namespace
} // namespace zelvo_test
