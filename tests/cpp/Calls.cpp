// SPDX-License-Identifier: Apache-2.0
// Each logging call of a logger makes the event that its C call makes, with its place in the
// source.
#include "CppTest.h"
#include "support/Bundles.h"

namespace zelvo_test {
namespace {

constexpr const char *FILE_PROPERTY = "zlv_prop_srcfile";
constexpr const char *FUNCTION_PROPERTY = "zlv_prop_srcfunction";
constexpr const char *LINE_PROPERTY = "zlv_prop_srcline";

void logFromHere(const zelvo::Logger &logger, int32_t &line)
{
    line = __LINE__ + 1;
    logger.debugMin(u"here");
}

struct Shop {
    static void open(const zelvo::Logger &logger) { logger.debugMin(u"open"); }
};

} // namespace

using CppCalls = CppTest;

TEST_F(CppCalls, EachCallHasItsLevel)
{
    app_.fatal("bundle", "key");
    app_.error("bundle", "key");
    app_.warn("bundle", "key");
    app_.info("bundle", "key");
    app_.debugMin(u"text");
    app_.debugMid(u"text");
    app_.debugMax(u"text");
    app_.message("bundle", "key");
    app_.text(u"text");
    std::vector<ZlvLevel> levels;
    for (const auto &event : memory_.events())
        levels.push_back(event.level);
    EXPECT_EQ(levels,
              (std::vector<ZlvLevel>{ZLV_LEVEL_FATAL, ZLV_LEVEL_ERROR, ZLV_LEVEL_WARN,
                                     ZLV_LEVEL_INFO, ZLV_LEVEL_DEBUG_MIN, ZLV_LEVEL_DEBUG_MID,
                                     ZLV_LEVEL_DEBUG_MAX, ZLV_LEVEL_NONE, ZLV_LEVEL_NONE}));
}

TEST_F(CppCalls, AMessageNamesItsBundleAndKey)
{
    app_.info("some/bundle", "opened", u"x");
    const auto event = memory_.last();
    ASSERT_TRUE(event);
    EXPECT_TRUE(event->isMessage);
    EXPECT_EQ(event->bundle, "some/bundle");
    EXPECT_EQ(event->key, "opened");
}

TEST_F(CppCalls, AMessageOfABundleIsBoundWithItsArguments)
{
    app_.warn(bundlePath, "four", u"Tee", 1250, 2500.5, 1.0);
    EXPECT_EQ(text(), u"Tee 1,250 2,500.5 some");
}

TEST_F(CppCalls, TheResultTellsWhatBindingLeft)
{
    const ZlvStatus status = app_.error("no such bundle", "key");
    EXPECT_EQ(status.type, CX_STATUS_OK);
    EXPECT_EQ(status.icuError, U_MISSING_RESOURCE_ERROR);
    EXPECT_EQ(memory_.last()->icuError, U_MISSING_RESOURCE_ERROR);
}

TEST_F(CppCalls, ALevelBelowTheThresholdIsRefused)
{
    app_.setProperty("level", "INFO");
    EXPECT_TRUE(app_.takes(ZLV_LEVEL_INFO));
    EXPECT_FALSE(app_.takes(ZLV_LEVEL_DEBUG_MIN));
    app_.debugMin(u"no");
    app_.debugMid(u"no");
    app_.debugMax(u"no");
    EXPECT_EQ(memory_.count(), 0U);
    app_.info("bundle", "key");
    EXPECT_EQ(memory_.count(), 1U);
}

TEST_F(CppCalls, AnEmptyHandleRefusesEveryCallWithSuccess)
{
    const zelvo::Logger none;
    EXPECT_FALSE(none.takes(ZLV_LEVEL_FATAL));
    const ZlvStatus status = none.fatal("bundle", "key", u"x");
    EXPECT_EQ(status.type, CX_STATUS_OK);
    EXPECT_EQ(status.code, 0);
    EXPECT_EQ(status.icuError, 0);
    none.text(u"text");
    none.debugMax(u"text");
}

TEST_F(CppCalls, ADebugCallTellsItsPlace)
{
    int32_t line = 0;
    logFromHere(app_, line);
    EXPECT_EQ(property(FILE_PROPERTY), __FILE__);
    EXPECT_EQ(property(FUNCTION_PROPERTY), "logFromHere");
    EXPECT_EQ(property(LINE_PROPERTY), std::to_string(line));
}

TEST_F(CppCalls, ThePlaceOfAMemberIsItsPlainName)
{
    Shop::open(app_);
    EXPECT_EQ(property(FUNCTION_PROPERTY), "open");
}

TEST_F(CppCalls, APlaceMayBeTold)
{
    app_.debugMid({u"told {0}", "other.c", "there", 12}, u"place");
    EXPECT_EQ(text(), u"told place");
    EXPECT_EQ(property(FILE_PROPERTY), "other.c");
    EXPECT_EQ(property(FUNCTION_PROPERTY), "there");
    EXPECT_EQ(property(LINE_PROPERTY), "12");
}

TEST_F(CppCalls, ANullPlaceLeavesItsPropertiesOut)
{
    app_.debugMid({u"nowhere", nullptr, nullptr, 12});
    EXPECT_EQ(property(FILE_PROPERTY), "(none)");
    EXPECT_EQ(property(FUNCTION_PROPERTY), "(none)");
    EXPECT_EQ(property(LINE_PROPERTY), "(none)");
}

#ifdef __cpp_lib_source_location
TEST_F(CppCalls, APlaceMayBeHandedOn)
{
    const auto place = std::source_location::current();
    app_.debugMax({u"handed {0}", place}, u"on");
    EXPECT_EQ(text(), u"handed on");
    EXPECT_EQ(property(FILE_PROPERTY), place.file_name());
    EXPECT_EQ(property(FUNCTION_PROPERTY), place.function_name());
    EXPECT_EQ(property(LINE_PROPERTY), std::to_string(place.line()));
}
#endif

TEST_F(CppCalls, TextAndMessageTellNoPlace)
{
    app_.text(u"text");
    EXPECT_EQ(property(FILE_PROPERTY), "(none)");
    app_.info("bundle", "key");
    EXPECT_EQ(property(FILE_PROPERTY), "(none)");
}

} // namespace zelvo_test
