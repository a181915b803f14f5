// SPDX-License-Identifier: Apache-2.0
// How the filter by message identifiers is made and configured.
#include <ostream>

#include "support/FailAlloc.h"
#include "support/MsgIdFilterFixture.h"

namespace zelvo_test {
namespace {

class ZlvMsgIdFilterConfig : public MsgIdFilterFixture {};

TEST_F(ZlvMsgIdFilterConfig, AtFirstBlocksWarningsAndInformation)
{
    EXPECT_EQ(vars()->mode, ZLV_MSG_ID_BLOCK);
    EXPECT_EQ(patterns(), (Names{"*W", "*I"}));
    EXPECT_EQ(vars()->repeatTime, 0);
    EXPECT_EQ(vars()->lastPassed->first, nullptr);
}

TEST(ZlvMsgIdFilterModes, AreNumbersOneAndTwo)
{
    EXPECT_EQ(ZLV_MSG_ID_BLOCK, 1);
    EXPECT_EQ(ZLV_MSG_ID_PASSTHRU, 2);
}

/* "mode" */

struct ModeRow {
    const char *label;
    const char *value;
    int32_t mode;
};

void PrintTo(const ModeRow &row, std::ostream *out)
{
    *out << row.label;
}

class ZlvMsgIdFilterMode : public ZlvMsgIdFilterConfig,
                           public testing::WithParamInterface<ModeRow> {};

TEST_P(ZlvMsgIdFilterMode, ComesFromItsProperty)
{
    vars()->mode = 3 - GetParam().mode; // the other one
    setProp(ids_, "mode", GetParam().value);
    EXPECT_EQ(vars()->mode, GetParam().mode);
}

const ModeRow modes[] = {
    {"Block", "BLOCK", 1},
    {"BlockInLowerCase", "block", 1},
    {"BlockInMixedCase", "bLoCk", 1},
    {"Passthru", "PASSTHRU", 2},
    {"PassthruInLowerCase", "passthru", 2},
    {"PassthruInMixedCase", "PassThru", 2},
    {"AnUnknownWord", "DROP", 1},
    {"TheEmptyWord", "", 1},
    {"ANumber", "2", 1},
    {"PartOfAWord", "PASS", 1},
    {"MoreThanAWord", "PASSTHRUX", 1},
    {"AWordWithABlank", " PASSTHRU", 1},
};

INSTANTIATE_TEST_SUITE_P(, ZlvMsgIdFilterMode, testing::ValuesIn(modes),
                         [](const auto &row) { return std::string(row.param.label); });

/* "msgIds" */

TEST_F(ZlvMsgIdFilterConfig, TakesPatternsInPlaceOfThoseBefore)
{
    setProp(ids_, "msgIds", "ABC* \t XYZ*\n*E");
    EXPECT_EQ(patterns(), (Names{"ABC*", "XYZ*", "*E"}));
}

TEST_F(ZlvMsgIdFilterConfig, TakesAnEmptyValueForNoPattern)
{
    setProp(ids_, "msgIds", "");
    EXPECT_NE(vars()->patterns, nullptr);
    EXPECT_EQ(patterns(), Names{});
}

/* "msgIdRepeatTime" */

struct TimeRow {
    const char *label;
    const char *value;
    int64_t time; ///< 77 is what stands before
};

void PrintTo(const TimeRow &row, std::ostream *out)
{
    *out << row.label;
}

class ZlvMsgIdFilterRepeatTime : public ZlvMsgIdFilterConfig,
                                 public testing::WithParamInterface<TimeRow> {};

TEST_P(ZlvMsgIdFilterRepeatTime, ComesFromItsProperty)
{
    setProp(ids_, "msgIdRepeatTime", "77");
    setProp(ids_, "msgIdRepeatTime", GetParam().value);
    EXPECT_EQ(vars()->repeatTime, GetParam().time);
}

const TimeRow times[] = {
    {"ANumber", "60000", 60000},
    {"Zero", "0", 0},
    {"BelowZero", "-5", -5},
    {"WithASign", "+5", 5},
    {"BehindBlanks", " \t5", 5},
    {"BeforeOtherText", "5s", 5},
    {"BeforeAPoint", "5.9", 5},
    {"MoreThan32Bits", "4294967296", 4294967296},
    {"TheLargest", "9223372036854775807", INT64_MAX},
    {"TheSmallest", "-9223372036854775808", INT64_MIN},
    {"BeyondTheLargest", "99999999999999999999", INT64_MAX},
    {"NoNumber", "soon", 77},
    {"Empty", "", 77},
    {"ASignAlone", "-", 77},
    {"Removed", nullptr, 77},
};

INSTANTIATE_TEST_SUITE_P(, ZlvMsgIdFilterRepeatTime, testing::ValuesIn(times),
                         [](const auto &row) { return std::string(row.param.label); });

/* All of them. */

TEST_F(ZlvMsgIdFilterConfig, KeepsTheSettingOfAPropertyThatIsRemoved)
{
    setProp(ids_, "mode", "PASSTHRU");
    setProp(ids_, "msgIds", "ABC*");
    setProp(ids_, "msgIdRepeatTime", "60000");
    for (const char *property : {"mode", "msgIds", "msgIdRepeatTime"})
        setProp(ids_, property, nullptr);
    EXPECT_EQ(vars()->mode, ZLV_MSG_ID_PASSTHRU);
    EXPECT_EQ(patterns(), Names{"ABC*"});
    EXPECT_EQ(vars()->repeatTime, 60000);
}

TEST_F(ZlvMsgIdFilterConfig, KeepsItsDefaultsWhenTheChangedPropertyIsNotThere)
{
    for (const char *property : {"mode", "msgIds", "msgIdRepeatTime"})
        ZlvMsgIdFilterFCfgChange(ids_, property);
    EXPECT_EQ(vars()->mode, ZLV_MSG_ID_BLOCK);
    EXPECT_EQ(patterns(), (Names{"*W", "*I"}));
    EXPECT_EQ(vars()->repeatTime, 0);
}

TEST_F(ZlvMsgIdFilterConfig, ComparesNamesOfPropertiesExactly)
{
    for (const char *property : {"Mode", "MODE", "mode ", "msgids", "MsgIds", "msgId", "msgIdsX",
                                 "msgIdRepeattime", "msgidRepeatTime"})
        setProp(ids_, property, "5");
    EXPECT_EQ(patterns(), (Names{"*W", "*I"}));
    EXPECT_EQ(vars()->repeatTime, 0);
}

TEST_F(ZlvMsgIdFilterConfig, LeavesOtherPropertiesToTheBasicObject)
{
    setProp(ids_, "logging", "off");
    EXPECT_EQ(ZlvIsObjectEnabled(ids_), 0);
    setProp(ids_, "listenerNames", "");
    EXPECT_EQ(listeners(ids_), Names{});
}

TEST_F(ZlvMsgIdFilterConfig, HasNoUseForALevel)
{
    setProp(ids_, "level", "OFF");
    EXPECT_EQ(ids_->filter.level, 0);
    EXPECT_TRUE(passes("ABC0001E"));
}

TEST_F(ZlvMsgIdFilterConfig, ReadsItsConfiguration)
{
    close();
    open("ids.className=zlv_msgidfilter\nids.mode=passthru\nids.msgIds=ABC* *E\n"
         "ids.msgIdRepeatTime=60000\n");
    ids_ = filter("ids", nullptr);
    ASSERT_NE(ids_, nullptr);
    EXPECT_EQ(vars()->mode, ZLV_MSG_ID_PASSTHRU);
    EXPECT_EQ(patterns(), (Names{"ABC*", "*E"}));
    EXPECT_EQ(vars()->repeatTime, 60000);
}

/* Nothing to work with. */

TEST_F(ZlvMsgIdFilterConfig, AChangeWithANullArgumentDoesNothing)
{
    ZlvMsgIdFilterFCfgChange(nullptr, "mode");
    ZlvMsgIdFilterFCfgChange(ids_, nullptr);
    ZlvMsgIdFilterFCfgChange(nullptr, nullptr);
    EXPECT_EQ(vars()->mode, ZLV_MSG_ID_BLOCK);
}

TEST_F(ZlvMsgIdFilterConfig, AChangeWithoutVariablesDoesNothingAtAll)
{
    ZlvObject *bare = filter("bare"); // a level filter, which has none
    setProp(bare, "level", "WARN");
    zlvIntlStringToStringMapPut(bare->properties, "logging", "off");
    for (const char *property : {"mode", "msgIds", "msgIdRepeatTime", "logging"})
        ZlvMsgIdFilterFCfgChange(bare, property);
    EXPECT_EQ(ZlvIsObjectEnabled(bare), 1);
}

TEST_F(ZlvMsgIdFilterConfig, AcceptsNothingOfANullArgument)
{
    OwnEvent event;
    EXPECT_EQ(ZlvMsgIdFilterFIsLoggable(nullptr, event.get(), noArgs()), 0);
    EXPECT_EQ(ZlvMsgIdFilterFIsLoggable(ids_, nullptr, noArgs()), 0);
    EXPECT_EQ(ZlvMsgIdFilterFIsLoggable(nullptr, nullptr, noArgs()), 0);
}

TEST_F(ZlvMsgIdFilterConfig, AcceptsEverythingWithoutVariables)
{
    OwnEvent event(u"ABC0001I started");
    EXPECT_EQ(ZlvMsgIdFilterFIsLoggable(filter("bare"), event.get(), noArgs()), 1);
}

TEST_F(ZlvMsgIdFilterConfig, VariablesOfNullAreFreed)
{
    ZlvMsgIdFilterFFreeVars(nullptr);
}

/* Memory that runs out. */

TEST_F(ZlvMsgIdFilterConfig, VariablesAreThereOrNullWhicheverAllocationFails)
{
    uint32_t made = 0;
    for (uint32_t allowed = 0, failed = 1; failed > 0; ++allowed) {
        FailAlloc fail(allowed);
        void *mine = ZlvMsgIdFilterFAllocVars();
        failed = fail.failed();
        made += mine != nullptr ? 1 : 0;
        ZlvMsgIdFilterFFreeVars(mine);
    }
    EXPECT_GT(made, 0u);
}

TEST_F(ZlvMsgIdFilterConfig, VariablesAreNullWithoutTheirRecordPatternsOrMap)
{
    FailAlloc none(0);
    EXPECT_EQ(ZlvMsgIdFilterFAllocVars(), nullptr);
    FailAlloc noList(1, FailAlloc::Once);
    EXPECT_EQ(ZlvMsgIdFilterFAllocVars(), nullptr);
}

TEST_F(ZlvMsgIdFilterConfig, AFilterIsMadeOrNotWhicheverAllocationFails)
{
    for (uint32_t allowed = 0, failed = 1; failed > 0; ++allowed) {
        FailAlloc fail(allowed, FailAlloc::Once);
        ZlvReleaseObject(ZlvGetObject("other", "zlv_msgidfilter"));
        failed = fail.failed();
    }
    EXPECT_NE(filter("other", "zlv_msgidfilter"), nullptr);
}

TEST_F(ZlvMsgIdFilterConfig, ADecisionIsMadeWhicheverAllocationFails)
{
    setProp(ids_, "msgIdRepeatTime", "60000");
    for (uint32_t allowed = 0, failed = 1; failed > 0; ++allowed) {
        OwnEvent event(u"ABC0001E stopped");
        FailAlloc fail(allowed);
        const int32_t accepted = ZlvMsgIdFilterFIsLoggable(ids_, event.get(), noArgs());
        failed = fail.failed();
        EXPECT_TRUE(accepted == 0 || accepted == 1);
    }
}

TEST_F(ZlvMsgIdFilterConfig, PatternsThatFindNoMemoryMatchNothing)
{
    setProp(ids_, "msgIds", "*");
    FailAlloc fail(1); // the value is read
    ZlvMsgIdFilterFCfgChange(ids_, "msgIds");
    EXPECT_GT(fail.failed(), 0u);
    EXPECT_EQ(ZlvMsgIdFilterMatchMsgId(vars()->patterns, "ABC0001E"), 0);
}

} // namespace
} // namespace zelvo_test
