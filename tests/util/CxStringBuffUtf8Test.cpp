// SPDX-License-Identifier: Apache-2.0
// Code points as UTF-8, with the five- and six-byte forms and the early end of the two-byte form.
#include "CxStringBuff.h"

#include <cstdint>
#include <string>

#include <gtest/gtest.h>

#include "support/Buffers.h"
#include "support/FailAlloc.h"

namespace zelvo_test {
namespace {

struct Form {
    const char *label;
    int32_t codePoint;
    std::string bytes;
};

class CxStringBuffUtf8 : public testing::TestWithParam<Form> {};

TEST_P(CxStringBuffUtf8, IsAppendedInItsForm)
{
    Buff buff("<");
    EXPECT_EQ(CxStringBuffAppendUTF32Char(&buff, GetParam().codePoint), 1);
    EXPECT_EQ(buff.text(), "<" + GetParam().bytes);
    EXPECT_TRUE(buff.terminated());
}

INSTANTIATE_TEST_SUITE_P(
    OneToThreeBytes, CxStringBuffUtf8,
    testing::Values(Form{"Zero", 0, std::string(1, '\0')}, Form{"LetterA", 0x41, "\x41"},
                    Form{"LastOneByte", 0x7F, "\x7F"}, Form{"FirstTwoBytes", 0x80, "\xC2\x80"},
                    Form{"LetterEAcute", 0xE9, "\xC3\xA9"}, Form{"LastTwoBytes", 0x7FE, "\xDF\xBE"},
                    Form{"FirstThreeBytes", 0x7FF, "\xE0\x9F\xBF"},
                    Form{"AfterTheFirstThreeBytes", 0x800, "\xE0\xA0\x80"},
                    Form{"Euro", 0x20AC, "\xE2\x82\xAC"}, Form{"Surrogate", 0xD800, "\xED\xA0\x80"},
                    Form{"LastThreeBytes", 0xFFFF, "\xEF\xBF\xBF"}),
    [](const auto &row) { return row.param.label; });

INSTANTIATE_TEST_SUITE_P(
    FourToSixBytes, CxStringBuffUtf8,
    testing::Values(Form{"FirstFourBytes", 0x10000, "\xF0\x90\x80\x80"},
                    Form{"LastUnicode", 0x10FFFF, "\xF4\x8F\xBF\xBF"},
                    Form{"LastFourBytes", 0x1FFFFF, "\xF7\xBF\xBF\xBF"},
                    Form{"FirstFiveBytes", 0x200000, "\xF8\x88\x80\x80\x80"},
                    Form{"LastFiveBytes", 0x3FFFFFF, "\xFB\xBF\xBF\xBF\xBF"},
                    Form{"FirstSixBytes", 0x4000000, "\xFC\x84\x80\x80\x80\x80"},
                    Form{"LastWithoutBit30", 0x3FFFFFFF, "\xFC\xBF\xBF\xBF\xBF\xBF"},
                    Form{"FirstWithBit30", 0x40000000, "\xFD\x80\x80\x80\x80\x80"},
                    Form{"Most", INT32_MAX, "\xFD\xBF\xBF\xBF\xBF\xBF"}),
    [](const auto &row) { return row.param.label; });

// Comparisons are signed: a negative code point is below 0x7F and leaves its low seven bits.
INSTANTIATE_TEST_SUITE_P(Negative, CxStringBuffUtf8,
                         testing::Values(Form{"MinusOne", -1, "\x7F"}, Form{"MinusTwo", -2, "\x7E"},
                                         Form{"Minus191", -191, "\x41"},
                                         Form{"Least", INT32_MIN, std::string(1, '\0')}),
                         [](const auto &row) { return row.param.label; });

TEST(CxStringBuffUcs2, EveryUnitGivesTheBytesOfItsCodePoint)
{
    Buff unit, codePoint;
    for (int32_t value = 0; value <= 0xFFFF; ++value) {
        CxStringBuffRestart(&unit);
        CxStringBuffRestart(&codePoint);
        ASSERT_EQ(CxStringBuffAppendUCS2Char(&unit, static_cast<uint16_t>(value)), 1);
        ASSERT_EQ(CxStringBuffAppendUTF32Char(&codePoint, value), 1);
        ASSERT_EQ(unit.text(), codePoint.text()) << value;
    }
}

TEST(CxStringBuffUcs2, KeepsTheEarlyEndOfTheTwoByteForm)
{
    Buff buff;
    EXPECT_EQ(CxStringBuffAppendUCS2Char(&buff, 0x7FF), 1);
    EXPECT_EQ(buff.text(), "\xE0\x9F\xBF");
}

TEST(CxStringBuffUtf8Null, EveryCallTakesANullBuffer)
{
    EXPECT_EQ(CxStringBuffAppendUTF32Char(nullptr, 0x41), 0);
    EXPECT_EQ(CxStringBuffAppendUTF32Char(nullptr, INT32_MAX), 0);
    EXPECT_EQ(CxStringBuffAppendUCS2Char(nullptr, 0x41), 0);
}

TEST(CxStringBuffUtf8Failure, EveryFormFailsWhenNoneFindsRoom)
{
    for (int32_t codePoint : {0x41, 0xE9, 0x20AC, 0x10000, 0x200000, INT32_MAX}) {
        Buff buff;
        FailAlloc fail(0);
        EXPECT_EQ(CxStringBuffAppendUTF32Char(&buff, codePoint), 0) << codePoint;
        EXPECT_EQ(buff.data, nullptr);
        EXPECT_EQ(buff.length, 0U);
    }
}

TEST(CxStringBuffUtf8Failure, AllLongerFormsAreTriedBeforeGivingUp)
{
    Buff buff;
    FailAlloc fail(0);
    EXPECT_EQ(CxStringBuffAppendUTF32Char(&buff, 0x41), 0);
    EXPECT_EQ(fail.failed(), 6U);
}

TEST(CxStringBuffUtf8Failure, AFormWithoutRoomGivesWayToTheNextLonger)
{
    Buff two, three;
    {
        FailAlloc fail(0, FailAlloc::Once);
        EXPECT_EQ(CxStringBuffAppendUTF32Char(&two, 0x41), 1);
    }
    FailAlloc fail(0, FailAlloc::Once);
    EXPECT_EQ(CxStringBuffAppendUTF32Char(&three, 0xE9), 1);
    EXPECT_EQ(two.text(), "\xC1\x81");
    EXPECT_EQ(three.text(), "\xE0\x83\xA9");
}

TEST(CxStringBuffUtf8Failure, AFailedGrowthLeavesTheBufferAsItWas)
{
    const std::string full(1023, 'x');
    Buff buff(full.c_str());
    FailAlloc fail(0);
    EXPECT_EQ(CxStringBuffAppendUTF32Char(&buff, 0x20AC), 0);
    EXPECT_EQ(CxStringBuffAppendUCS2Char(&buff, 0x20AC), 0);
    EXPECT_EQ(buff.text(), full);
    EXPECT_EQ(buff.capacity, 1024U);
}

} // namespace
} // namespace zelvo_test
