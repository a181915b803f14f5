// SPDX-License-Identifier: Apache-2.0
// How the filter by message identifiers damps repeats.
#include <cmath>
#include <limits>
#include <set>

#include "ZlvEvent.h"
#include "support/FailAlloc.h"
#include "support/HeapInUse.h"
#include "support/MsgIdFilterFixture.h"

namespace zelvo_test {
namespace {

class ZlvMsgIdFilterRepeat : public MsgIdFilterFixture {
protected:
    void SetUp() override
    {
        MsgIdFilterFixture::SetUp();
        repeatTime("60000");
    }

    void repeatTime(const char *milliseconds) { setProp(ids_, "msgIdRepeatTime", milliseconds); }

    /// The number of identifiers that the filter remembers.
    size_t remembered() const
    {
        size_t count = 0;
        for (auto *node = vars()->lastPassed->first; node != nullptr; node = node->next)
            ++count;
        return count;
    }
};

TEST_F(ZlvMsgIdFilterRepeat, PassesOncePerRepeatTimeFromTheLastThatPassed)
{
    EXPECT_TRUE(passes("ABC0001E", 1000));
    EXPECT_FALSE(passes("ABC0001E", 30000));
    EXPECT_TRUE(passes("ABC0001E", 61000));
    EXPECT_FALSE(passes("ABC0001E", 61500));
}

TEST_F(ZlvMsgIdFilterRepeat, PassesAgainExactlyWhenTheTimeIsOver)
{
    EXPECT_TRUE(passes("ABC0001E", 1000));
    EXPECT_FALSE(passes("ABC0001E", 60999));
    EXPECT_TRUE(passes("ABC0001E", 61000));
}

TEST_F(ZlvMsgIdFilterRepeat, IsNotExtendedByWhatIsDropped)
{
    EXPECT_TRUE(passes("ABC0001E", 0));
    for (double time = 1000; time < 60000; time += 1000)
        EXPECT_FALSE(passes("ABC0001E", time)) << time;
    EXPECT_TRUE(passes("ABC0001E", 60000));
}

TEST_F(ZlvMsgIdFilterRepeat, IsOfEachIdentifierByItself)
{
    EXPECT_TRUE(passes("ABC0001E", 1000));
    EXPECT_TRUE(passes("ABC0002E", 1001));
    EXPECT_FALSE(passes("ABC0001E", 1002));
    EXPECT_FALSE(passes("ABC0002E", 1003));
}

TEST_F(ZlvMsgIdFilterRepeat, TellsIdentifiersApartByCase)
{
    EXPECT_TRUE(passes("ABC0001E", 1000));
    EXPECT_TRUE(passes("abc0001E", 1000));
}

TEST_F(ZlvMsgIdFilterRepeat, NeverConcernsTheEmptyIdentifier)
{
    EXPECT_TRUE(passes("", 1000));
    EXPECT_TRUE(passes("", 1000));
    EXPECT_EQ(remembered(), 0u);
}

TEST_F(ZlvMsgIdFilterRepeat, NeverConcernsATextWithoutIdentifier)
{
    EXPECT_TRUE(passes(nullptr, 1000));
    EXPECT_TRUE(passes(nullptr, 1000));
    EXPECT_EQ(remembered(), 0u);
}

TEST_F(ZlvMsgIdFilterRepeat, DoesNotRememberWhatTheModeDrops)
{
    EXPECT_FALSE(passes("ABC0001I", 1000));
    EXPECT_EQ(remembered(), 0u);
}

TEST_F(ZlvMsgIdFilterRepeat, OfZeroIsOff)
{
    repeatTime("0");
    EXPECT_TRUE(passes("ABC0001E", 1000));
    EXPECT_TRUE(passes("ABC0001E", 1000));
    EXPECT_EQ(remembered(), 0u);
}

TEST_F(ZlvMsgIdFilterRepeat, BelowZeroIsOff)
{
    repeatTime("-5");
    EXPECT_TRUE(passes("ABC0001E", 1000));
    EXPECT_TRUE(passes("ABC0001E", 1000));
}

TEST_F(ZlvMsgIdFilterRepeat, IsOffAtFirst)
{
    EXPECT_EQ(static_cast<MsgIdFilterVars *>(filter("new", "zlv_msgidfilter")->vars)->repeatTime,
              0);
}

TEST_F(ZlvMsgIdFilterRepeat, HoldsForWhatPassesThru)
{
    setProp(ids_, "mode", "PASSTHRU");
    EXPECT_TRUE(passes("ABC0001I", 1000));
    EXPECT_FALSE(passes("ABC0001I", 2000));
}

TEST_F(ZlvMsgIdFilterRepeat, IsSharedByTheLoggersThatSendToTheFilter)
{
    ZlvObject *other = logger("other");
    ZlvAddListener(other, ids_);
    repeatTime("9223372036854775807");
    log(app_, u"ABC0001E one");
    log(other, u"ABC0001E two");
    ASSERT_EQ(records().size(), 1u);
    EXPECT_EQ(records()[0].text, u"ABC0001E one");
}

/* What it remembers. */

TEST_F(ZlvMsgIdFilterRepeat, RemembersTheTimeAsDecimalText)
{
    passes("ABC0001E", 1104580800123.0);
    EXPECT_EQ(lastPassed("ABC0001E"), "1104580800123");
}

TEST_F(ZlvMsgIdFilterRepeat, CutsTheTimeTowardZero)
{
    passes("ABC0001E", 1000.9);
    EXPECT_EQ(lastPassed("ABC0001E"), "1000");
    passes("ABC0002E", -1000.9);
    EXPECT_EQ(lastPassed("ABC0002E"), "-1000");
}

TEST_F(ZlvMsgIdFilterRepeat, ReplacesTheTimeWhenAnEventPasses)
{
    passes("ABC0001E", 1000);
    passes("ABC0001E", 61000);
    EXPECT_EQ(lastPassed("ABC0001E"), "61000");
    EXPECT_EQ(remembered(), 1u);
}

TEST_F(ZlvMsgIdFilterRepeat, KeepsTheTimeWhenAnEventIsDropped)
{
    passes("ABC0001E", 1000);
    passes("ABC0001E", 2000);
    EXPECT_EQ(lastPassed("ABC0001E"), "1000");
}

TEST_F(ZlvMsgIdFilterRepeat, TakesAnUnreadableTimeForZero)
{
    zlvIntlStringToStringMapPut(vars()->lastPassed, "ABC0001E", "never");
    EXPECT_FALSE(passes("ABC0001E", 59999));
    EXPECT_TRUE(passes("ABC0001E", 60000));
}

TEST_F(ZlvMsgIdFilterRepeat, SurvivesAChangeOfModeAndPatterns)
{
    EXPECT_TRUE(passes("ABC0001E", 1000));
    setProp(ids_, "msgIds", "*");
    setProp(ids_, "mode", "PASSTHRU");
    EXPECT_FALSE(passes("ABC0001E", 2000));
    EXPECT_EQ(remembered(), 1u);
}

TEST_F(ZlvMsgIdFilterRepeat, ANewRepeatTimeHoldsForWhatHasPassed)
{
    EXPECT_TRUE(passes("ABC0001E", 1000));
    repeatTime("500");
    EXPECT_FALSE(passes("ABC0001E", 1499));
    EXPECT_TRUE(passes("ABC0001E", 1500));
}

TEST_F(ZlvMsgIdFilterRepeat, DropsWhatComesFromEarlierTimes)
{
    EXPECT_TRUE(passes("ABC0001E", 61000));
    EXPECT_FALSE(passes("ABC0001E", 1000));
}

/* The ends of the numbers. */

TEST_F(ZlvMsgIdFilterRepeat, OfTheLargestNumberPassesOnceAndNeverOverflows)
{
    repeatTime("9223372036854775807");
    EXPECT_TRUE(passes("ABC0001E", 1000));
    EXPECT_FALSE(passes("ABC0001E", 2000));
    EXPECT_FALSE(passes("ABC0001E", 9e18));
}

TEST_F(ZlvMsgIdFilterRepeat, NearTheLargestNumberEndsWithTheNumbers)
{
    repeatTime("9223372036854775000");
    EXPECT_TRUE(passes("ABC0001E", 5000));
    EXPECT_FALSE(passes("ABC0001E", 9e18));
    EXPECT_TRUE(passes("ABC0001E", 1e300)); // as late as a whole number can be
}

TEST_F(ZlvMsgIdFilterRepeat, OfTheLargestNumberEndsForTimesBeforeZero)
{
    repeatTime("9223372036854775807");
    EXPECT_TRUE(passes("ABC0001E", -1e300));
    EXPECT_FALSE(passes("ABC0001E", -2));
    EXPECT_TRUE(passes("ABC0001E", 0));
}

TEST_F(ZlvMsgIdFilterRepeat, TakesTimesBeyondTheRangeForItsEnds)
{
    constexpr double infinity = std::numeric_limits<double>::infinity();
    EXPECT_TRUE(passes("ABC0001E", infinity));
    EXPECT_EQ(lastPassed("ABC0001E"), "9223372036854775807");
    EXPECT_TRUE(passes("ABC0002E", -infinity));
    EXPECT_EQ(lastPassed("ABC0002E"), "-9223372036854775808");
    EXPECT_TRUE(passes("ABC0003E", std::nan("")));
    EXPECT_EQ(lastPassed("ABC0003E"), "-9223372036854775808");
}

/* Memory. */

TEST_F(ZlvMsgIdFilterRepeat, PassesWhatItHasNoMemoryToRemember)
{
    OwnEvent event;
    ZlvSetEventMessageId(event.get(), "ABC0001E");
    FailAlloc fail(1); // the copy of the identifier is there
    EXPECT_EQ(ZlvMsgIdFilterFIsLoggable(ids_, event.get(), noArgs()), 1);
    EXPECT_GT(fail.failed(), 0u);
    EXPECT_EQ(remembered(), 0u);
}

TEST_F(ZlvMsgIdFilterRepeat, MemoryGrowsWithDistinctIdentifiersOnly)
{
    constexpr int distinct = 100;
    constexpr int rounds = 200;
    double now = 1104580800000.0;
    auto sendEachOnce = [&] {
        for (int i = 0; i < distinct; ++i)
            passes(("ABC" + std::to_string(1000 + i) + "E").c_str(), now);
        now += 30000; // every other round passes
    };
    const size_t before = heapInUse();
    sendEachOnce();
    EXPECT_EQ(remembered(), static_cast<size_t>(distinct));
    const size_t afterOne = heapInUse();
    EXPECT_GE(afterOne - before, distinct * sizeof(StringToStringMapNode));
    for (int round = 1; round < rounds; ++round)
        sendEachOnce();
    EXPECT_EQ(remembered(), static_cast<size_t>(distinct));
    EXPECT_LT(heapInUse(), afterOne + 8192); // less than one byte for each event
}

TEST_F(ZlvMsgIdFilterRepeat, ForgetsWithTheFilter)
{
    passes("ABC0001E", 1000);
    ZlvObject *other = ZlvGetObject("short", "zlv_msgidfilter");
    ZlvSetObjProp(other, "msgIdRepeatTime", "60000");
    OwnEvent event;
    ZlvSetEventMessageId(event.get(), "ABC0001E");
    EXPECT_EQ(ZlvIsLoggableByFilter(other, event.get(), noArgs()), 1);
    EXPECT_EQ(ZlvIsLoggableByFilter(other, event.get(), noArgs()), 0);
    ZlvReleaseObject(other);
    other = filter("short", "zlv_msgidfilter");
    ZlvSetObjProp(other, "msgIdRepeatTime", "60000");
    EXPECT_EQ(ZlvIsLoggableByFilter(other, event.get(), noArgs()), 1);
}

} // namespace
} // namespace zelvo_test
