// SPDX-License-Identifier: Apache-2.0
// Whole properties files, read into the log manager's configurations.
#include "ZlvIntl.h"
#include "ZlvLogManager.h"
#include "ZlvObjConfig.h"
#include "ZlvReadPropsIntl.h"
#include "ZlvToolkitIntl.h"
#include "support/ReadProps.h"

namespace zelvo_test {
namespace {

// An initialised log manager of the test's own.
class ZlvReadPropsConfigs : public ReadProps {
protected:
    ZlvReadPropsConfigs() { zlvInitLogMgr(); }
    ~ZlvReadPropsConfigs() override { zlvCloseLogMgr(); }

    bool configures(const std::string &text)
    {
        return zlvDoReadProps(write("test.properties", text).c_str(), nullptr, &error) == 1;
    }

    static bool has(const char *name) { return ZlvLogMgrHasCfg(name) == 1; }

    /// The property of a registered configuration; "(absent)" when either is missing.
    static std::string property(const char *name, const char *key)
    {
        if (!has(name))
            return "(absent)";
        ZlvObjCfg *cfg = ZlvLogMgrGetCfg(name);
        ZlvBool found = 7;
        Text text = taken(ZlvGetObjCfgProp(cfg, key, &found));
        ZlvReleaseObjCfg(cfg);
        return found == 1 ? text.value_or("(null)") : "(absent)";
    }

    static bool fromFile(const char *name)
    {
        ZlvObjCfg *cfg = ZlvLogMgrGetCfg(name);
        bool flag = ZlvObjCfgIsFromFile(cfg) == 1;
        ZlvReleaseObjCfg(cfg);
        return flag;
    }

    /// The number of registered configurations.
    static int count()
    {
        int number = 0;
        for (auto *node = ZLV_TK_CFG_DATA->first; node != nullptr; node = node->next)
            ++number;
        return number;
    }
};

TEST_F(ZlvReadPropsConfigs, AKeySetsThePropertyBehindItsLastDot)
{
    EXPECT_TRUE(configures("zelvo.errorLogger.level=DEBUG_MIN\n"));
    EXPECT_EQ(property("zelvo.errorLogger", "level"), "DEBUG_MIN");
    EXPECT_EQ(count(), 1);
    EXPECT_TRUE(errorUntouched());
}

TEST_F(ZlvReadPropsConfigs, TheConfigurationIsMarkedAsFromFile)
{
    EXPECT_TRUE(configures("a.b=c\n"));
    EXPECT_TRUE(fromFile("a"));
}

TEST_F(ZlvReadPropsConfigs, AKnownConfigurationKeepsItsMark)
{
    ZlvReleaseObjCfg(ZlvLogMgrGetCfg("a"));
    EXPECT_TRUE(configures("a.b=c\n"));
    EXPECT_EQ(property("a", "b"), "c");
    EXPECT_FALSE(fromFile("a"));
}

TEST_F(ZlvReadPropsConfigs, BlanksAroundOrInsteadOfTheSeparatorSetTheSameProperty)
{
    EXPECT_TRUE(configures("a.b = c\nd.b c\ne.b=c  \n"));
    EXPECT_EQ(property("a", "b"), "c");
    EXPECT_EQ(property("d", "b"), "c");
    EXPECT_EQ(property("e", "b"), "c  ");
}

TEST_F(ZlvReadPropsConfigs, CommentsAndBlankLinesCreateNothing)
{
    EXPECT_TRUE(configures("# one\n\n   \n! two\n"));
    EXPECT_EQ(count(), 0);
}

TEST_F(ZlvReadPropsConfigs, SeveralPropertiesOfOneNameShareAConfiguration)
{
    EXPECT_TRUE(configures("a.b=1\nx.y=2\na.c=3\na.b=4\n"));
    EXPECT_EQ(count(), 2);
    EXPECT_EQ(property("a", "b"), "4");
    EXPECT_EQ(property("a", "c"), "3");
    EXPECT_EQ(property("x", "y"), "2");
}

TEST_F(ZlvReadPropsConfigs, AnEscapedDotlessKeyKeepsItsOddCharactersInTheName)
{
    EXPECT_TRUE(configures("my\\ app\\=1.level=INFO\n"));
    EXPECT_EQ(property("my app=1", "level"), "INFO");
}

TEST_F(ZlvReadPropsConfigs, ADottedNameIsLinkedToItsRegisteredParent)
{
    EXPECT_TRUE(configures("app.level=INFO\napp.net.out.logging=on\n"));
    EXPECT_EQ(property("app.net.out", "level"), "INFO");
    EXPECT_FALSE(has("app.net"));
}

struct BadKey {
    const char *label;
    const char *line;
};

class ZlvReadPropsBadKey : public ZlvReadPropsConfigs,
                           public testing::WithParamInterface<BadKey> {};

TEST_P(ZlvReadPropsBadKey, FailsTheReadAndKeepsWhatCameBefore)
{
    EXPECT_FALSE(configures(std::string("a.b=c\n") + GetParam().line + "\nlast.one=2\n"));
    EXPECT_EQ(count(), 1);
    EXPECT_EQ(property("a", "b"), "c");
    EXPECT_TRUE(errorUntouched());
}

INSTANTIATE_TEST_SUITE_P(Keys, ZlvReadPropsBadKey,
                         testing::Values(BadKey{"WithoutDot", "x=1"}, BadKey{"WithoutName", ".x=1"},
                                         BadKey{"WithoutProperty", "x.=1"},
                                         BadKey{"OfADotAlone", ".=1"},
                                         BadKey{"WithoutSeparator", "x.y"}),
                         [](const auto &row) { return row.param.label; });

TEST_F(ZlvReadPropsConfigs, AnEmptyValueFailsBeforeAnyValueHadACharacter)
{
    EXPECT_FALSE(configures("a.b=\n"));
    EXPECT_EQ(count(), 0);
    EXPECT_TRUE(errorUntouched());
}

TEST_F(ZlvReadPropsConfigs, AnEmptyValueIsSetOnceAnyValueHadACharacter)
{
    EXPECT_TRUE(configures("x.y=1\na.b=\n"));
    EXPECT_EQ(property("a", "b"), "");
}

TEST_F(ZlvReadPropsConfigs, ALastLineWithoutSeparatorAndLineEndSetsAnEmptyValue)
{
    EXPECT_TRUE(configures("x.y=1\na.b"));
    EXPECT_EQ(property("a", "b"), "");
}

TEST_F(ZlvReadPropsConfigs, ALastLineWithoutSeparatorFailsWhenNoValueHadACharacter)
{
    EXPECT_FALSE(configures("a.b"));
    EXPECT_EQ(count(), 0);
}

TEST_F(ZlvReadPropsConfigs, TheSecondEmitOfTheLastEntryIsHarmless)
{
    EXPECT_TRUE(configures("a.b=c\n\n"));
    EXPECT_EQ(property("a", "b"), "c");
    EXPECT_EQ(count(), 1);
    EXPECT_TRUE(fromFile("a"));
}

TEST_F(ZlvReadPropsConfigs, AReadErrorKeepsWhatCameBefore)
{
    FileFaults faults;
    faults.failReads(8, EIO);
    EXPECT_FALSE(configures("a.b=c\nd.e=f\n"));
    EXPECT_TRUE(errorIs('p', EIO));
    EXPECT_EQ(property("a", "b"), "c");
    EXPECT_EQ(count(), 1);
}

/// Emits KEY and VALUE as one entry and gives the key as it stands afterwards.
std::string keyAfterEmit(const char *key, const char *value, ZlvBool expected)
{
    Buff keyBuff(key), valueBuff(value);
    ZlvReadPropsContext context{keyBuff, valueBuff, 0, nullptr};
    EXPECT_EQ(zlvRdprEmitCfg(&context), expected);
    return keyBuff.text();
}

TEST_F(ZlvReadPropsConfigs, AnEmitRestoresTheKey)
{
    EXPECT_EQ(keyAfterEmit("a.b.c", "1", 1), "a.b.c");
    EXPECT_EQ(property("a.b", "c"), "1");
}

TEST_F(ZlvReadPropsConfigs, ARefusedEmitRestoresTheKeyToo)
{
    EXPECT_EQ(keyAfterEmit("nodot", "1", 0), "nodot");
    EXPECT_EQ(keyAfterEmit(".c", "1", 0), ".c");
    EXPECT_EQ(keyAfterEmit("a.", "1", 0), "a.");
    EXPECT_EQ(count(), 0);
}

TEST_F(ZlvReadPropsConfigs, AnEmitWithATargetNeedsNoDotAndCreatesNoConfiguration)
{
    Buff key("nodot"), value("1");
    ZlvReadPropsContext context{key, value, 0, &list};
    EXPECT_EQ(zlvRdprEmitCfg(&context), 1);
    EXPECT_EQ(list.all(), "nodot=1");
    EXPECT_EQ(count(), 0);
}

TEST_F(ZlvReadPropsConfigs, AnEmitOfNothingFails)
{
    ZlvReadPropsContext context{};
    EXPECT_EQ(zlvRdprEmitCfg(&context), 0);
    context.target = &list;
    EXPECT_EQ(zlvRdprEmitCfg(&context), 0);
    EXPECT_EQ(list.count, 0);
}

} // namespace
} // namespace zelvo_test
