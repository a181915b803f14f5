// SPDX-License-Identifier: Apache-2.0
#include "ZlvLevelFilter.h"

#include <ostream>

#include "ZlvObjClass.h"
#include "support/Bundles.h"
#include "support/Recorder.h"
#include "support/VaList.h"

namespace zelvo_test {
namespace {

/// The logger "app" accepts all levels and sends to the filter "filter", whose one listener is the
/// recorder.
class ZlvLevelFilter : public RecordedToolkit {
protected:
    void SetUp() override
    {
        RecordedToolkit::SetUp();
        setProp(app_, "level", "ALL");
        setProp(app_, "listenerNames", "");
        filter_ = filter("filter");
        ZlvAddListener(app_, filter_);
        ZlvAddListener(filter_, recorder_);
    }

    /// Logs one event of each level and two without.
    void logEach()
    {
        ZlvLogFatal(app_, nullptr, nullptr);
        ZlvLogError(app_, nullptr, nullptr);
        ZlvLogWarn(app_, nullptr, nullptr);
        ZlvLogInfo(app_, nullptr, nullptr);
        ZlvLogDebugMin(app_, nullptr, nullptr, 0, u"");
        ZlvLogDebugMid(app_, nullptr, nullptr, 0, u"");
        ZlvLogDebugMax(app_, nullptr, nullptr, 0, u"");
        ZlvLogUMsg(app_, nullptr, nullptr);
        ZlvLogUText(app_, u"");
    }

    static std::vector<ZlvLevel> passed()
    {
        std::vector<ZlvLevel> levels;
        for (const Record &record : records())
            levels.push_back(record.level);
        return levels;
    }

    ZlvObject *filter_ = nullptr;
};

using Levels = std::vector<ZlvLevel>;

/* What passes at each threshold. */

struct FilterRow {
    const char *label;
    const char *level;
    Levels passed;
};

void PrintTo(const FilterRow &row, std::ostream *out)
{
    *out << row.label;
}

class ZlvLevelFilterAt : public ZlvLevelFilter, public testing::WithParamInterface<FilterRow> {};

TEST_P(ZlvLevelFilterAt, PassesTheLevelsFromThereOnAndEventsWithoutLevel)
{
    setProp(filter_, "level", GetParam().level);
    logEach();
    EXPECT_EQ(passed(), GetParam().passed);
}

const FilterRow thresholds[] = {
    {"Fatal", "FATAL", {7000, -9999, -9999}},
    {"Error", "ERROR", {7000, 6000, -9999, -9999}},
    {"Warn", "WARN", {7000, 6000, 5000, -9999, -9999}},
    {"Info", "INFO", {7000, 6000, 5000, 4000, -9999, -9999}},
    {"DebugMin", "DEBUG_MIN", {7000, 6000, 5000, 4000, 3000, -9999, -9999}},
    {"DebugMid", "DEBUG_MID", {7000, 6000, 5000, 4000, 3000, 2000, -9999, -9999}},
    {"DebugMax", "DEBUG_MAX", {7000, 6000, 5000, 4000, 3000, 2000, 1000, -9999, -9999}},
    {"All", "ALL", {7000, 6000, 5000, 4000, 3000, 2000, 1000, -9999, -9999}},
    {"Zero", "0", {7000, 6000, 5000, 4000, 3000, 2000, 1000, -9999, -9999}},
    {"Off", "OFF", {-9999, -9999}},
    {"Between", "5500", {7000, 6000, -9999, -9999}},
    {"Unparsable", "?", {7000, 6000, 5000, 4000, 3000, 2000, 1000, -9999, -9999}},
    {"Removed", nullptr, {7000, 6000, 5000, 4000, 3000, 2000, 1000, -9999, -9999}},
};

INSTANTIATE_TEST_SUITE_P(Each, ZlvLevelFilterAt, testing::ValuesIn(thresholds),
                         [](const auto &test) { return std::string(test.param.label); });

TEST_F(ZlvLevelFilter, StartsWithTheThresholdZeroAndPassesEverything)
{
    EXPECT_EQ(filter_->filter.level, 0);
    logEach();
    EXPECT_EQ(passed(), (Levels{7000, 6000, 5000, 4000, 3000, 2000, 1000, -9999, -9999}));
}

TEST_F(ZlvLevelFilter, HandsTheEventAndItsArgumentsOn)
{
    ZlvLogError(app_, bundlePath, "both", u"disk", 3);
    ASSERT_EQ(records().size(), 1u);
    EXPECT_EQ(records()[0].text, u"disk: 3 entries");
}

TEST_F(ZlvLevelFilter, SendsToItsListenersInTheirOrder)
{
    ZlvAddListener(filter_, handler("second", Recorder::className));
    ZlvLogError(app_, nullptr, nullptr);
    EXPECT_EQ(Recorder::order(), (Names{"recorder", "second"}));
}

TEST_F(ZlvLevelFilter, MayListenToAFilter)
{
    ZlvObject *inner = filter("inner");
    setProp(inner, "level", "FATAL");
    setProp(filter_, "listenerNames", "");
    ZlvAddListener(filter_, inner);
    ZlvAddListener(inner, recorder_);
    setProp(filter_, "level", "INFO");
    logEach();
    EXPECT_EQ(passed(), (Levels{7000, -9999, -9999}));
}

TEST_F(ZlvLevelFilter, ThatIsDisabledPassesNothing)
{
    setProp(filter_, "logging", "off");
    logEach();
    EXPECT_EQ(passed(), Levels{});
    setProp(filter_, "logging", "on");
    ZlvLogFatal(app_, nullptr, nullptr);
    EXPECT_EQ(passed(), Levels{7000});
}

/* The accept test by itself. */

class ZlvLevelFilterTest : public testing::Test {
protected:
    int32_t accepts(ZlvLevel threshold, ZlvLevel level)
    {
        filter_.filter.level = threshold;
        event_.level = level;
        return ZlvLevelFilterFIsLoggable(&filter_, &event_, noArgs());
    }

    ZlvObject filter_{};
    ZlvEvent event_{};
};

TEST_F(ZlvLevelFilterTest, RefusesANullFilterAndANullEvent)
{
    EXPECT_EQ(ZlvLevelFilterFIsLoggable(nullptr, &event_, noArgs()), 0);
    EXPECT_EQ(ZlvLevelFilterFIsLoggable(&filter_, nullptr, noArgs()), 0);
    EXPECT_EQ(ZlvLevelFilterFIsLoggable(nullptr, nullptr, noArgs()), 0);
}

TEST_F(ZlvLevelFilterTest, AcceptsAnythingAtThresholdZeroLevelsBelowItIncluded)
{
    EXPECT_EQ(accepts(0, 7000), 1);
    EXPECT_EQ(accepts(0, -1), 1);
    EXPECT_EQ(accepts(0, INT32_MIN), 1);
}

TEST_F(ZlvLevelFilterTest, AcceptsAnEventWithoutLevelAtAnyThreshold)
{
    EXPECT_EQ(accepts(9999, -9999), 1);
    EXPECT_EQ(accepts(INT32_MAX, -9999), 1);
}

TEST_F(ZlvLevelFilterTest, ComparesSignedNumbers)
{
    EXPECT_EQ(accepts(5000, 5000), 1);
    EXPECT_EQ(accepts(5000, 4999), 0);
    EXPECT_EQ(accepts(-5, -5), 1);
    EXPECT_EQ(accepts(-5, -6), 0);
    EXPECT_EQ(accepts(-9999, -10000), 0);
}

TEST_F(ZlvLevelFilterTest, DoesNotLookAtTheEnabledFlag)
{
    filter_.enabled = 0;
    EXPECT_EQ(accepts(5000, 6000), 1);
}

TEST_F(ZlvLevelFilter, AnswersThroughThePublicTest)
{
    ZlvEvent event{};
    event.level = ZLV_LEVEL_INFO;
    setProp(filter_, "level", "INFO");
    EXPECT_EQ(ZlvIsLoggableByFilter(filter_, &event, noArgs()), 1);
    setProp(filter_, "level", "WARN");
    EXPECT_EQ(ZlvIsLoggableByFilter(filter_, &event, noArgs()), 0);
}

/* Configuration. */

TEST_F(ZlvLevelFilter, TakesItsThresholdFromTheLevelProperty)
{
    setProp(filter_, "level", "Warning");
    EXPECT_EQ(filter_->filter.level, 5000);
    setProp(filter_, "level", nullptr);
    EXPECT_EQ(filter_->filter.level, ZLV_LEVEL_NONE);
}

TEST_F(ZlvLevelFilter, AChangeOfALevelThatWasNeverSetGivesNone)
{
    ZlvLevelFilterFCfgChange(filter_, "level");
    EXPECT_EQ(filter_->filter.level, ZLV_LEVEL_NONE);
}

TEST_F(ZlvLevelFilter, ThePropertyNameLevelIsComparedWithCase)
{
    setProp(filter_, "LEVEL", "OFF");
    EXPECT_EQ(filter_->filter.level, 0);
}

TEST_F(ZlvLevelFilter, OtherPropertiesReachTheBasicObject)
{
    setProp(filter_, "logging", "OFF");
    EXPECT_EQ(ZlvIsObjectEnabled(filter_), 0);
    setProp(filter_, "listenerNames", "");
    EXPECT_EQ(listeners(filter_), Names{});
}

TEST_F(ZlvLevelFilter, AConfigurationChangeWithANullArgumentDoesNothing)
{
    setProp(filter_, "level", "ERROR");
    ZlvLevelFilterFCfgChange(nullptr, "level");
    ZlvLevelFilterFCfgChange(filter_, nullptr);
    EXPECT_EQ(filter_->filter.level, 6000);
}

/* The entry that every filter class shares. */

int32_t answer;
int asked;

int32_t giveAnswer(ZlvObject *, ZlvEvent *, va_list)
{
    ++asked;
    return answer;
}

/// A filter of a class of our own, which answers as the test says.
class ZlvBasicFilter : public ZlvLevelFilter {
protected:
    void SetUp() override
    {
        ZlvLevelFilter::SetUp();
        ZlvAddFilterClass("test_filter", nullptr, nullptr, nullptr, nullptr, nullptr, giveAnswer,
                          nullptr);
        own_ = filter("own", "test_filter");
        ZlvAddListener(own_, recorder_);
        answer = 1;
        asked = 0;
    }

    /// Whether the filter passes an event on when its accept entry gives RESULT.
    bool passesOn(int32_t result)
    {
        answer = result;
        Recorder::clear();
        process();
        return !records().empty();
    }
    void process()
    {
        ZlvEvent event{};
        ZlvBasicFilterFProcess(own_, &event, noArgs());
    }

    ZlvObject *own_ = nullptr;
};

TEST_F(ZlvBasicFilter, PassesOnWhatItsClassAccepts)
{
    EXPECT_TRUE(passesOn(1));
    EXPECT_FALSE(passesOn(0));
    EXPECT_EQ(asked, 2);
}

TEST_F(ZlvBasicFilter, TakesTwoForARefusal)
{
    EXPECT_FALSE(passesOn(2));
    EXPECT_FALSE(passesOn(-1));
    EXPECT_FALSE(passesOn(255));
}

TEST_F(ZlvBasicFilter, LooksAtTheLowestEightBitsOfTheAnswer)
{
    EXPECT_TRUE(passesOn(257));
    EXPECT_FALSE(passesOn(256));
}

TEST_F(ZlvBasicFilter, IsNotAskedWhileDisabled)
{
    ZlvSetObjectEnabled(own_, 0);
    EXPECT_FALSE(passesOn(1));
    EXPECT_EQ(asked, 0);
}

TEST_F(ZlvBasicFilter, OfNullDoesNothing)
{
    ZlvEvent event{};
    ZlvBasicFilterFProcess(nullptr, &event, noArgs());
    EXPECT_EQ(asked, 0);
}

TEST_F(ZlvBasicFilter, WithoutALogEntryPassesNothing)
{
    own_->objClass->filter.fLog = nullptr;
    EXPECT_FALSE(passesOn(1));
    EXPECT_EQ(asked, 0);
}

TEST_F(ZlvBasicFilter, WithoutAnAcceptEntryPassesNothing)
{
    own_->objClass->filter.fIsLoggable = nullptr;
    EXPECT_FALSE(passesOn(1));
}

TEST_F(ZlvBasicFilter, WithoutAClassDoesNothing)
{
    ZlvObject bare{};
    bare.enabled = 1;
    ZlvEvent event{};
    ZlvBasicFilterFProcess(&bare, &event, noArgs());
    EXPECT_EQ(asked, 0);
}

TEST_F(ZlvBasicFilter, OfAnotherKindDoesNothing)
{
    ZlvEvent event{};
    ZlvAddListener(app_, recorder_);
    ZlvBasicFilterFProcess(app_, &event, noArgs());
    EXPECT_TRUE(records().empty());
}

TEST_F(ZlvBasicFilter, RegisteredWithNothingFiltersByLevelAndForwards)
{
    ZlvAddFilterClass("test_bare", nullptr, nullptr, nullptr, nullptr, nullptr, nullptr, nullptr);
    ZlvObject *bare = filter("bare", "test_bare");
    bare->filter.level = ZLV_LEVEL_WARN;
    setProp(app_, "listenerNames", "");
    ZlvAddListener(app_, bare);
    ZlvAddListener(bare, recorder_);
    logEach();
    EXPECT_EQ(passed(), (Levels{7000, 6000, 5000, -9999, -9999}));
}

TEST_F(ZlvBasicFilter, WithANullEventPassesNothing)
{
    ZlvBasicFilterFProcess(filter_, nullptr, noArgs());
    EXPECT_TRUE(records().empty());
}

} // namespace
} // namespace zelvo_test
