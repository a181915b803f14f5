// SPDX-License-Identifier: Apache-2.0
// Growth, text and handing over; numbers have a file of their own.
#include "CxUStringBuff.h"

#include <string>

#include <gtest/gtest.h>

#include "support/Buffers.h"
#include "support/FailAlloc.h"
#include "support/IcuDefaults.h"

namespace zelvo_test {
namespace {

constexpr uint32_t WholeString = UINT32_MAX;

/// Appends COUNT units to BUFF.
bool fill(UBuff &buff, size_t count)
{
    return CxUStringBuffAppendUStr(&buff, std::u16string(count, u'x').c_str()) == 1;
}

TEST(CxUStringBuff, TheFirstAppendAllocates1024Bytes)
{
    UBuff buff;
    EXPECT_EQ(CxUStringBuffAppendStr(&buff, "abc"), 1);
    EXPECT_EQ(buff.length, 3U);
    EXPECT_EQ(buff.capacity, 1024U);
    EXPECT_EQ(buff.text(), u"abc");
    EXPECT_TRUE(buff.terminated());
}

TEST(CxUStringBuff, The511thUnitFitsTheFirstStorage)
{
    UBuff buff;
    ASSERT_TRUE(fill(buff, 511));
    EXPECT_EQ(buff.capacity, 1024U);
    EXPECT_EQ(buff.length, 511U);
    EXPECT_TRUE(buff.terminated());
}

TEST(CxUStringBuff, The512thUnitDoublesTheStorage)
{
    UBuff buff;
    ASSERT_TRUE(fill(buff, 511));
    EXPECT_EQ(CxUStringBuffAppendUStr(&buff, u"y"), 1);
    EXPECT_EQ(buff.capacity, 2048U);
    EXPECT_EQ(buff.text(), std::u16string(511, u'x') + u"y");
    EXPECT_TRUE(buff.terminated());
}

TEST(CxUStringBuff, GrowthDoublesUntilItExceedsTheNeed)
{
    UBuff exact, above;
    ASSERT_TRUE(fill(exact, 1023)); // needs 2048 bytes
    EXPECT_EQ(exact.capacity, 4096U);
    ASSERT_TRUE(fill(above, 1022)); // needs 2046
    EXPECT_EQ(above.capacity, 2048U);
}

TEST(CxUStringBuff, HasCapacityAllocatesAnEmptyText)
{
    UBuff buff;
    EXPECT_EQ(cxUStringBuffHasCapacity(&buff, 0), 1);
    EXPECT_EQ(buff.capacity, 1024U);
    EXPECT_EQ(buff.length, 0U);
    EXPECT_TRUE(buff.terminated());
}

TEST(CxUStringBuff, HasCapacityRefusesANeedThatNoBufferCanHold)
{
    UBuff buff;
    ASSERT_TRUE(fill(buff, 3));
    EXPECT_EQ(cxUStringBuffHasCapacity(&buff, UINT32_MAX / 2), 0);
    EXPECT_EQ(cxUStringBuffHasCapacity(&buff, UINT32_MAX), 0);
    EXPECT_EQ(buff.capacity, 1024U);
    EXPECT_EQ(buff.text(), u"xxx");
}

TEST(CxUStringBuff, AppendsAreJoined)
{
    UBuff buff;
    EXPECT_EQ(CxUStringBuffAppendUStr(&buff, u"a\u20AC"), 1);
    EXPECT_EQ(CxUStringBuffAppendUStr(&buff, u""), 1);
    EXPECT_EQ(CxUStringBuffAppendStr(&buff, "cd"), 1);
    EXPECT_EQ(CxUStringBuffAppendStr(&buff, ""), 1);
    EXPECT_EQ(CxUStringBuffAppendStrN(&buff, "efgh", 2), 1);
    EXPECT_EQ(CxUStringBuffAppendChar(&buff, '!'), 1);
    EXPECT_EQ(buff.text(), u"a\u20ACcdef!");
    EXPECT_TRUE(buff.terminated());
}

TEST(CxUStringBuff, BytesAreConvertedByTheDefaultConverter)
{
    DefaultConverter utf8("UTF-8");
    UBuff buff;
    EXPECT_EQ(CxUStringBuffAppendStr(&buff, "\xC3\xA9"), 1);
    EXPECT_EQ(CxUStringBuffAppendStrN(&buff, "\xC3\xA8!", 2), 1);
    EXPECT_EQ(buff.text(), u"\u00E9\u00E8");
}

TEST(CxUStringBuff, AByteIsConvertedOnItsOwn)
{
    DefaultConverter utf8("UTF-8");
    UBuff buff;
    EXPECT_EQ(CxUStringBuffAppendChar(&buff, '\xC3'), 1);
    EXPECT_EQ(CxUStringBuffAppendChar(&buff, '\xA9'), 1);
    EXPECT_EQ(buff.text(), u"\uFFFD\uFFFD");
}

TEST(CxUStringBuff, TheLengthCountsUnitsAndNotBytes)
{
    DefaultConverter utf8("UTF-8");
    UBuff buff;
    EXPECT_EQ(CxUStringBuffAppendStr(&buff, "\xE2\x82\xAC"), 1);
    EXPECT_EQ(buff.length, 1U);
    EXPECT_EQ(buff.text(), u"\u20AC");
}

TEST(CxUStringBuff, AppendStrNOfAllOnesMeansTheWholeString)
{
    UBuff buff;
    EXPECT_EQ(CxUStringBuffAppendStrN(&buff, "abcdef", WholeString), 1);
    EXPECT_EQ(buff.text(), u"abcdef");
}

TEST(CxUStringBuff, AppendStrNStopsAtAZeroByte)
{
    UBuff buff;
    EXPECT_EQ(CxUStringBuffAppendStrN(&buff, "ab\0cd", 5), 1);
    EXPECT_EQ(buff.text(), u"ab");
}

TEST(CxUStringBuff, AppendStrNOfNoBytesAppendsNothing)
{
    UBuff buff;
    EXPECT_EQ(CxUStringBuffAppendStrN(&buff, "ab", 0), 1);
    EXPECT_EQ(buff.length, 0U);
}

TEST(CxUStringBuff, AZeroByteAppendsNothing)
{
    UBuff buff;
    ASSERT_EQ(CxUStringBuffAppendStr(&buff, "abc"), 1);
    EXPECT_EQ(CxUStringBuffAppendChar(&buff, '\0'), 1);
    EXPECT_EQ(buff.length, 3U);
    EXPECT_EQ(buff.capacity, 1024U);
    EXPECT_EQ(buff.text(), u"abc");
}

TEST(CxUStringBuff, TakeHandsTheTextOverAndZeroesTheBuffer)
{
    UBuff buff;
    ASSERT_EQ(CxUStringBuffAppendStr(&buff, "abc"), 1);
    const UChar *storage = buff.data;
    UChar *mine = CxUStringBuffTakeUStr(&buff);
    EXPECT_EQ(mine, storage);
    EXPECT_EQ(taken(mine), u"abc");
    EXPECT_EQ(buff.data, nullptr);
    EXPECT_EQ(buff.length, 0U);
    EXPECT_EQ(buff.capacity, 0U);
}

TEST(CxUStringBuff, ABufferNeverAppendedToGivesNoText)
{
    UBuff buff;
    EXPECT_EQ(CxUStringBuffTakeUStr(&buff), nullptr);
}

TEST(CxUStringBuff, RestartKeepsTheStorage)
{
    UBuff buff;
    ASSERT_EQ(CxUStringBuffAppendStr(&buff, "abc"), 1);
    const UChar *storage = buff.data;
    CxUStringBuffRestart(&buff);
    EXPECT_EQ(buff.length, 0U);
    EXPECT_EQ(buff.capacity, 1024U);
    EXPECT_EQ(buff.data, storage);
    EXPECT_TRUE(buff.terminated());
}

TEST(CxUStringBuff, RestartOfAFreshBufferAllocatesNothing)
{
    UBuff buff;
    CxUStringBuffRestart(&buff);
    EXPECT_EQ(buff.data, nullptr);
    EXPECT_EQ(buff.capacity, 0U);
}

TEST(CxUStringBuff, AppendsAfterARestartBeginAtTheStart)
{
    UBuff buff;
    ASSERT_EQ(CxUStringBuffAppendStr(&buff, "abc"), 1);
    CxUStringBuffRestart(&buff);
    EXPECT_EQ(CxUStringBuffAppendStr(&buff, "d"), 1);
    EXPECT_EQ(buff.text(), u"d");
}

TEST(CxUStringBuff, DiscardZeroesEverything)
{
    UBuff buff;
    ASSERT_EQ(CxUStringBuffAppendStr(&buff, "abc"), 1);
    CxUStringBuffDiscard(&buff);
    EXPECT_EQ(buff.data, nullptr);
    EXPECT_EQ(buff.length, 0U);
    EXPECT_EQ(buff.capacity, 0U);
}

TEST(CxUStringBuff, EveryCallTakesANullBuffer)
{
    EXPECT_EQ(cxUStringBuffHasCapacity(nullptr, 1), 0);
    EXPECT_EQ(CxUStringBuffAppendUStr(nullptr, u"a"), 0);
    EXPECT_EQ(CxUStringBuffAppendStr(nullptr, "a"), 0);
    EXPECT_EQ(CxUStringBuffAppendStrN(nullptr, "a", 1), 0);
    EXPECT_EQ(CxUStringBuffAppendChar(nullptr, 'a'), 0);
    EXPECT_EQ(CxUStringBuffAppendChar(nullptr, '\0'), 0);
    EXPECT_EQ(CxUStringBuffTakeUStr(nullptr), nullptr);
    CxUStringBuffRestart(nullptr);
    CxUStringBuffDiscard(nullptr);
}

TEST(CxUStringBuff, ANullStringIsRefused)
{
    UBuff buff;
    ASSERT_EQ(CxUStringBuffAppendStr(&buff, "abc"), 1);
    EXPECT_EQ(CxUStringBuffAppendUStr(&buff, nullptr), 0);
    EXPECT_EQ(CxUStringBuffAppendStr(&buff, nullptr), 0);
    EXPECT_EQ(CxUStringBuffAppendStrN(&buff, nullptr, 1), 0);
    EXPECT_EQ(CxUStringBuffAppendStrN(&buff, nullptr, WholeString), 0);
    EXPECT_EQ(buff.text(), u"abc");
}

TEST(CxUStringBuffFailure, AFailedFirstAllocationLeavesTheBufferEmpty)
{
    UBuff buff;
    FailAlloc fail(0);
    EXPECT_EQ(CxUStringBuffAppendUStr(&buff, u"a"), 0);
    EXPECT_EQ(buff.data, nullptr);
    EXPECT_EQ(buff.length, 0U);
    EXPECT_EQ(buff.capacity, 0U);
}

TEST(CxUStringBuffFailure, AFailedGrowthLeavesTheBufferAsItWas)
{
    UBuff buff;
    ASSERT_TRUE(fill(buff, 511));
    const UChar *storage = buff.data;
    FailAlloc fail(0);
    EXPECT_EQ(CxUStringBuffAppendUStr(&buff, u"a"), 0);
    EXPECT_EQ(fail.failed(), 1U);
    EXPECT_EQ(buff.data, storage);
    EXPECT_EQ(buff.text(), std::u16string(511, u'x'));
    EXPECT_EQ(buff.capacity, 1024U);
    EXPECT_TRUE(buff.terminated());
}

// A full buffer: an append of bytes grows it, and some first make copies of the bytes. Whichever of
// these allocations fails, the append is false and the text stays.
template <class Append>
void expectFailureOfEachAllocation(uint32_t allocations, Append append)
{
    for (uint32_t allowed = 0; allowed <= allocations; ++allowed) {
        UBuff buff;
        ASSERT_TRUE(fill(buff, 511));
        FailAlloc fail(allowed);
        const bool isAppended = append(&buff) != 0;
        EXPECT_EQ(isAppended, allowed == allocations) << allowed;
        EXPECT_EQ(buff.text().size(), isAppended ? 512U : 511U) << allowed;
    }
}

TEST(CxUStringBuffFailure, AnAppendOfAsciiFailsWithItsOnlyAllocation)
{
    expectFailureOfEachAllocation(1, [](UBuff *buff) { return CxUStringBuffAppendStr(buff, "a"); });
    expectFailureOfEachAllocation(1,
                                  [](UBuff *buff) { return CxUStringBuffAppendChar(buff, 'a'); });
}

TEST(CxUStringBuffFailure, AnAppendOfOtherBytesFailsWithEitherOfItsAllocations)
{
    expectFailureOfEachAllocation(2, [](UBuff *buff) { return CxUStringBuffAppendStr(buff, "é"); });
}

TEST(CxUStringBuffFailure, AnAppendOfSoManyBytesFailsWithEitherOfItsAllocations)
{
    expectFailureOfEachAllocation(
        2, [](UBuff *buff) { return CxUStringBuffAppendStrN(buff, "a", 1); });
}

} // namespace
} // namespace zelvo_test
