// SPDX-License-Identifier: Apache-2.0
// Text, inserting and handing over; storage, numbers and UTF-8 have files of their own.
#include "CxStringBuff.h"

#include <string>

#include <gtest/gtest.h>

#include "support/Buffers.h"

namespace zelvo_test {
namespace {

constexpr uint32_t WholeString = UINT32_MAX;

TEST(CxStringBuff, AppendsAreJoined)
{
    Buff buff;
    EXPECT_EQ(CxStringBuffAppendStr(&buff, "ab"), 1);
    EXPECT_EQ(CxStringBuffAppendStr(&buff, ""), 1);
    EXPECT_EQ(CxStringBuffAppendChar(&buff, 'c'), 1);
    EXPECT_EQ(CxStringBuffAppendStrN(&buff, "def", 2), 1);
    EXPECT_EQ(buff.text(), "abcde");
    EXPECT_TRUE(buff.terminated());
}

TEST(CxStringBuff, AnEmptyStringIsAnAppendThatAllocates)
{
    Buff buff;
    EXPECT_EQ(CxStringBuffAppendStr(&buff, ""), 1);
    EXPECT_STREQ(buff.data, "");
    EXPECT_EQ(buff.capacity, 1024U);
}

TEST(CxStringBuff, AZeroByteIsAppendedLikeAnyOther)
{
    Buff buff;
    EXPECT_EQ(CxStringBuffAppendChar(&buff, '\0'), 1);
    EXPECT_EQ(CxStringBuffAppendChar(&buff, 'b'), 1);
    EXPECT_EQ(buff.text(), std::string("\0b", 2));
}

TEST(CxStringBuff, AppendStrNCopiesAtMostNBytes)
{
    Buff buff;
    EXPECT_EQ(CxStringBuffAppendStrN(&buff, "abcdef", 4), 1);
    EXPECT_EQ(buff.text(), "abcd");
    EXPECT_TRUE(buff.terminated());
}

TEST(CxStringBuff, AppendStrNStopsAtAZeroByte)
{
    Buff buff;
    EXPECT_EQ(CxStringBuffAppendStrN(&buff, "ab\0cd", 5), 1);
    EXPECT_EQ(buff.text(), "ab");
    EXPECT_TRUE(buff.terminated());
}

TEST(CxStringBuff, AppendStrNGrowsForAllNBytesEvenWhenItStopsEarly)
{
    Buff buff;
    EXPECT_EQ(CxStringBuffAppendStrN(&buff, "ab", 3000), 1);
    EXPECT_EQ(buff.text(), "ab");
    EXPECT_EQ(buff.capacity, 4096U);
}

TEST(CxStringBuff, AppendStrNOfNoBytesAppendsNothing)
{
    Buff buff;
    EXPECT_EQ(CxStringBuffAppendStrN(&buff, "ab", 0), 1);
    EXPECT_STREQ(buff.data, "");
}

TEST(CxStringBuff, AppendStrNOfAllOnesMeansTheWholeString)
{
    Buff buff;
    EXPECT_EQ(CxStringBuffAppendStrN(&buff, "abcdef", WholeString), 1);
    EXPECT_EQ(buff.text(), "abcdef");
    EXPECT_EQ(buff.capacity, 1024U);
}

TEST(CxStringBuff, InsertMovesTheTail)
{
    Buff buff("abc");
    EXPECT_EQ(CxStringBuffInsertStr(&buff, "XY", 1), 1);
    EXPECT_EQ(buff.text(), "aXYbc");
    EXPECT_TRUE(buff.terminated());
}

TEST(CxStringBuff, InsertAtTheStartAndAtTheEnd)
{
    Buff buff("abc");
    EXPECT_EQ(CxStringBuffInsertStr(&buff, "<", 0), 1);
    EXPECT_EQ(CxStringBuffInsertStr(&buff, ">", 4), 1);
    EXPECT_EQ(buff.text(), "<abc>");
    EXPECT_TRUE(buff.terminated());
}

TEST(CxStringBuff, InsertBehindTheEndIsRefused)
{
    Buff buff("abc");
    EXPECT_EQ(CxStringBuffInsertStr(&buff, "XY", 4), 0);
    EXPECT_EQ(buff.text(), "abc");
}

TEST(CxStringBuff, InsertAtANegativePositionIsRefused)
{
    Buff buff("abc");
    EXPECT_EQ(CxStringBuffInsertStr(&buff, "XY", -1), 0);
    EXPECT_EQ(CxStringBuffInsertStr(&buff, "XY", INT32_MIN), 0);
    EXPECT_EQ(buff.text(), "abc");
}

TEST(CxStringBuff, InsertOfNothingKeepsTheText)
{
    Buff buff("abc");
    EXPECT_EQ(CxStringBuffInsertStr(&buff, "", 2), 1);
    EXPECT_EQ(buff.text(), "abc");
}

TEST(CxStringBuff, InsertFillsAFreshBuffer)
{
    Buff buff;
    EXPECT_EQ(CxStringBuffInsertStr(&buff, "XY", 0), 1);
    EXPECT_EQ(buff.text(), "XY");
    EXPECT_TRUE(buff.terminated());
}

TEST(CxStringBuff, InsertReservesTheCurrentLengthTwice)
{
    Buff once(std::string(510, 'x').c_str()), twice(std::string(512, 'x').c_str());
    EXPECT_EQ(CxStringBuffInsertStr(&once, "YZ", 0), 1); // needs 510 + 512 + 1 = 1023
    EXPECT_EQ(once.capacity, 1024U);
    EXPECT_EQ(CxStringBuffInsertStr(&twice, "YZ", 0), 1); // needs 512 + 514 + 1 = 1027
    EXPECT_EQ(twice.capacity, 2048U);
}

TEST(CxStringBuff, PeekLendsTheText)
{
    Buff buff("abc");
    EXPECT_EQ(CxStringBuffPeekStr(&buff), buff.data);
    EXPECT_STREQ(CxStringBuffPeekStr(&buff), "abc");
}

TEST(CxStringBuff, CopyLeavesTheBufferWithItsText)
{
    Buff buff("abc");
    char *copy = CxStringBuffCopyStr(&buff);
    EXPECT_NE(copy, buff.data);
    EXPECT_EQ(taken(copy), "abc");
    EXPECT_EQ(buff.text(), "abc");
}

TEST(CxStringBuff, TakeHandsTheTextOverAndZeroesTheBuffer)
{
    Buff buff("abc");
    const char *text = buff.data;
    char *mine = CxStringBuffTakeStr(&buff);
    EXPECT_EQ(mine, text);
    EXPECT_EQ(taken(mine), "abc");
    EXPECT_EQ(buff.data, nullptr);
    EXPECT_EQ(buff.length, 0U);
    EXPECT_EQ(buff.capacity, 0U);
}

TEST(CxStringBuff, ABufferNeverAppendedToGivesNoText)
{
    Buff buff;
    EXPECT_EQ(CxStringBuffPeekStr(&buff), nullptr);
    EXPECT_EQ(CxStringBuffCopyStr(&buff), nullptr);
    EXPECT_EQ(CxStringBuffTakeStr(&buff), nullptr);
}

TEST(CxStringBuff, RestartKeepsTheStorage)
{
    Buff buff("abc");
    const char *storage = buff.data;
    CxStringBuffRestart(&buff);
    EXPECT_EQ(buff.length, 0U);
    EXPECT_EQ(buff.capacity, 1024U);
    EXPECT_EQ(buff.data, storage);
    EXPECT_STREQ(buff.data, "");
}

TEST(CxStringBuff, RestartOfAFreshBufferAllocatesNothing)
{
    Buff buff;
    CxStringBuffRestart(&buff);
    EXPECT_EQ(buff.data, nullptr);
    EXPECT_EQ(buff.capacity, 0U);
}

TEST(CxStringBuff, DiscardZeroesEverything)
{
    Buff buff("abc");
    CxStringBuffDiscard(&buff);
    EXPECT_EQ(buff.data, nullptr);
    EXPECT_EQ(buff.length, 0U);
    EXPECT_EQ(buff.capacity, 0U);
}

TEST(CxStringBuff, EveryCallTakesANullBuffer)
{
    EXPECT_EQ(cxStringBuffHasCapacity(nullptr, 1), 0);
    EXPECT_EQ(CxStringBuffAppendChar(nullptr, 'a'), 0);
    EXPECT_EQ(CxStringBuffAppendStr(nullptr, "a"), 0);
    EXPECT_EQ(CxStringBuffAppendStrN(nullptr, "a", 1), 0);
    EXPECT_EQ(CxStringBuffInsertStr(nullptr, "a", 0), 0);
    EXPECT_EQ(CxStringBuffPack(nullptr), 0);
    EXPECT_EQ(CxStringBuffPeekStr(nullptr), nullptr);
    EXPECT_EQ(CxStringBuffCopyStr(nullptr), nullptr);
    EXPECT_EQ(CxStringBuffTakeStr(nullptr), nullptr);
    CxStringBuffRestart(nullptr);
    CxStringBuffDiscard(nullptr);
}

TEST(CxStringBuff, ANullStringIsRefused)
{
    Buff buff("abc");
    EXPECT_EQ(CxStringBuffAppendStr(&buff, nullptr), 0);
    EXPECT_EQ(CxStringBuffAppendStrN(&buff, nullptr, 1), 0);
    EXPECT_EQ(CxStringBuffAppendStrN(&buff, nullptr, WholeString), 0);
    EXPECT_EQ(CxStringBuffInsertStr(&buff, nullptr, 0), 0);
    EXPECT_EQ(buff.text(), "abc");
}

} // namespace
} // namespace zelvo_test
