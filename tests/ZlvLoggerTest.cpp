// SPDX-License-Identifier: Apache-2.0
// What a logger accepts, where its threshold comes from, and its log function.
#include "ZlvLogger.h"

#include <atomic>
#include <string>
#include <thread>

#include "support/BrokenMutex.h"
#include "support/Recorder.h"

namespace zelvo_test {
namespace {

using ZlvLogger = RecordedToolkit;

/* The threshold. */

TEST_F(ZlvLogger, StartsEnabledWithTheThresholdDebugMin)
{
    EXPECT_EQ(ZlvIsObjectEnabled(app_), 1);
    EXPECT_EQ(app_->logger.level, 3000);
}

TEST_F(ZlvLogger, WithoutALevelAcceptsDebugMinAndAbove)
{
    EXPECT_EQ(ZlvIsLoggable(app_, ZLV_LEVEL_DEBUG_MIN), 1);
    EXPECT_EQ(ZlvIsLoggable(app_, ZLV_LEVEL_FATAL), 1);
}

TEST_F(ZlvLogger, WithoutALevelRefusesDebugMidAndDebugMax)
{
    ZlvLogDebugMid(app_, nullptr, nullptr, 0, u"mid");
    ZlvLogDebugMax(app_, nullptr, nullptr, 0, u"max");
    EXPECT_TRUE(records().empty());
}

TEST_F(ZlvLogger, WithThresholdInfoAcceptsInfoAndWarnAndRefusesDebugMin)
{
    setProp(app_, "level", "INFO");
    ZlvLogWarn(app_, nullptr, nullptr);
    ZlvLogInfo(app_, nullptr, nullptr);
    ZlvLogDebugMin(app_, nullptr, nullptr, 0, u"min");
    ASSERT_EQ(records().size(), 2u);
    EXPECT_EQ(records()[0].level, 5000);
    EXPECT_EQ(records()[1].level, 4000);
}

TEST_F(ZlvLogger, PassesEventsWithoutLevelEvenWhenOff)
{
    setProp(app_, "level", "OFF");
    ZlvLogUMsg(app_, nullptr, nullptr);
    ZlvLogUText(app_, u"text");
    ZlvLogFatal(app_, nullptr, nullptr);
    EXPECT_EQ(records().size(), 2u);
}

TEST_F(ZlvLogger, InlineTestAnswersAsTheFunctionForEveryThresholdLevelAndState)
{
    const ZlvLevel levels[] = {-5, 0, 2000, 3000, 4000, 7000, INT32_MAX, ZLV_LEVEL_NONE};
    int accepted = 0;
    for (const ZlvBool enabled : {ZlvBool{0}, ZlvBool{1}})
        for (const ZlvLevel threshold : levels)
            for (const ZlvLevel level : levels) {
                ZlvSetObjectEnabled(app_, enabled);
                setProp(app_, "level", std::to_string(threshold).c_str());
                EXPECT_EQ(ZlvIsLoggableInline(app_, level), ZlvIsLoggable(app_, level));
                accepted += ZlvIsLoggableInline(app_, level);
            }
    EXPECT_GT(accepted, 8);
    EXPECT_LT(accepted, 64);
    EXPECT_EQ(ZlvIsLoggableInline(nullptr, ZLV_LEVEL_FATAL), 0);
}

TEST_F(ZlvLogger, LevelComparesAsASignedNumber)
{
    setProp(app_, "level", "-5");
    EXPECT_EQ(ZlvIsLoggable(app_, -5), 1);
    EXPECT_EQ(ZlvIsLoggable(app_, -6), 0);
    EXPECT_EQ(ZlvIsLoggable(app_, 0), 1);
}

TEST_F(ZlvLogger, AThresholdOfNoneAcceptsEveryLevel)
{
    setProp(app_, "level", "unheard of");
    EXPECT_EQ(app_->logger.level, ZLV_LEVEL_NONE);
    EXPECT_EQ(ZlvIsLoggable(app_, -2000000000), 1);
}

TEST_F(ZlvLogger, DisabledRefusesEverythingTheLevelNoneIncluded)
{
    setProp(app_, "level", "ALL");
    ZlvSetObjectEnabled(app_, 0);
    EXPECT_EQ(ZlvIsLoggable(app_, ZLV_LEVEL_FATAL), 0);
    EXPECT_EQ(ZlvIsLoggable(app_, ZLV_LEVEL_NONE), 0);
    ZlvLogUText(app_, u"text");
    ZlvLogFatal(app_, nullptr, nullptr);
    EXPECT_TRUE(records().empty());
}

TEST_F(ZlvLogger, IsLoggableTakesNoLock)
{
    BrokenMutex broken;
    EXPECT_EQ(ZlvIsLoggable(app_, ZLV_LEVEL_ERROR), 1);
}

TEST(ZlvLoggerNull, IsNeverLoggable)
{
    EXPECT_EQ(ZlvIsLoggable(nullptr, ZLV_LEVEL_FATAL), 0);
    EXPECT_EQ(ZlvIsLoggable(nullptr, ZLV_LEVEL_NONE), 0);
}

TEST(ZlvLoggerInternal, IsLoggableIsAlwaysZero)
{
    EXPECT_EQ(zlvIntlIsLoggable(), 0);
}

/* The "level" property. */

TEST_F(ZlvLogger, TakesItsThresholdFromTheLevelProperty)
{
    setProp(app_, "level", "Warning");
    EXPECT_EQ(app_->logger.level, 5000);
    setProp(app_, "level", "17");
    EXPECT_EQ(app_->logger.level, 17);
}

TEST_F(ZlvLogger, ARemovedLevelPropertyAcceptsEverything)
{
    setProp(app_, "level", "OFF");
    setProp(app_, "level", nullptr);
    EXPECT_EQ(app_->logger.level, ZLV_LEVEL_NONE);
}

TEST_F(ZlvLogger, AChangeOfALevelThatWasNeverSetGivesNone)
{
    ZlvBasicLoggerFCfgChange(app_, "level");
    EXPECT_EQ(app_->logger.level, ZLV_LEVEL_NONE);
}

TEST_F(ZlvLogger, ThePropertyNameLevelIsComparedWithCase)
{
    setProp(app_, "Level", "OFF");
    EXPECT_EQ(app_->logger.level, 3000);
}

TEST_F(ZlvLogger, OtherPropertiesReachTheBasicObject)
{
    setProp(app_, "logging", "off");
    EXPECT_EQ(ZlvIsObjectEnabled(app_), 0);
    setProp(app_, "listenerNames", "");
    EXPECT_EQ(listeners(app_), Names{});
}

TEST_F(ZlvLogger, AConfigurationChangeWithANullArgumentDoesNothing)
{
    setProp(app_, "level", "ERROR");
    ZlvBasicLoggerFCfgChange(nullptr, "level");
    ZlvBasicLoggerFCfgChange(app_, nullptr);
    EXPECT_EQ(app_->logger.level, 6000);
}

TEST_F(ZlvLogger, TheLevelMayChangeWhileOthersLog)
{
    std::atomic<bool> done{false};
    std::thread changer([&] {
        while (!done) {
            setProp(app_, "level", "OFF");
            setProp(app_, "level", "ALL");
        }
    });
    for (int i = 0; i < 200; ++i)
        ZlvLogInfo(app_, nullptr, nullptr);
    done = true;
    changer.join();
    EXPECT_LE(records().size(), 200u);
}

/* The log function. */

TEST_F(ZlvLogger, OfTheBasicClassLogsByDispatch)
{
    EXPECT_EQ(ZlvLoggerGetFLog(app_), ZlvBasicObjectFLog);
    EXPECT_EQ(zlvIntlLoggerGetFLog(app_), ZlvBasicObjectFLog);
}

TEST_F(ZlvLogger, RegisteredWithoutALogFunctionDispatches)
{
    ZlvAddLoggerClass("test_bare", nullptr, nullptr, nullptr, nullptr, nullptr);
    ZlvObject *bare = logger("bare", "test_bare");
    ZlvAddListener(bare, recorder_);
    log(bare, u"text");
    EXPECT_EQ(Recorder::order(), Names{"recorder"});
}

TEST_F(ZlvLogger, ThatIsNullHasNoLogFunction)
{
    EXPECT_EQ(ZlvLoggerGetFLog(nullptr), nullptr);
    EXPECT_EQ(zlvIntlLoggerGetFLog(nullptr), nullptr);
}

TEST_F(ZlvLogger, ThatIsDisabledHasNoLogFunction)
{
    ZlvSetObjectEnabled(app_, 0);
    EXPECT_EQ(ZlvLoggerGetFLog(app_), nullptr);
}

TEST_F(ZlvLogger, OfAnotherKindHasNoLogFunction)
{
    EXPECT_EQ(ZlvLoggerGetFLog(recorder_), nullptr);
    EXPECT_EQ(ZlvLoggerGetFLog(filter("filter")), nullptr);
    EXPECT_EQ(ZlvLoggerGetFLog(formatter("formatter")), nullptr);
}

TEST(ZlvLoggerInternal, WithoutAClassHasNoLogFunction)
{
    ZlvObject bare{};
    bare.enabled = 1;
    EXPECT_EQ(zlvIntlLoggerGetFLog(&bare), nullptr);
}

TEST_F(ZlvLogger, GivesNoLogFunctionWhenTheMutexCannotBeTaken)
{
    BrokenMutex broken;
    EXPECT_EQ(ZlvLoggerGetFLog(app_), nullptr);
    EXPECT_EQ(zlvIntlLoggerGetFLog(app_), ZlvBasicObjectFLog);
}

} // namespace
} // namespace zelvo_test
