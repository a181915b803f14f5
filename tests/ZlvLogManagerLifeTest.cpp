// SPDX-License-Identifier: Apache-2.0
// The registry's own life, and the entry through which the properties file fills it.
#include "ZlvLogManager.h"

#include "support/CfgFixture.h"
#include "support/FailAlloc.h"

namespace zelvo_test {
namespace {

class ZlvLogManagerFile : public CfgFixture {
protected:
    static ZlvBool addFromFile(const char *name, const char *key, const char *value)
    {
        HeldMutex held;
        return zlvLogMgrAddCfgFromFile(name, key, value);
    }
};

TEST_F(ZlvLogManagerFile, MakesAMarkedConfigurationWithTheProperty)
{
    EXPECT_EQ(addFromFile("a.b", "p", "v"), 1);
    ZlvObjCfg *cfg = get("a.b");
    EXPECT_EQ(lookup(cfg, "p"), "v");
    EXPECT_EQ(ZlvObjCfgIsFromFile(cfg), 1);
    EXPECT_EQ(cfg->refCount, 2U);
    EXPECT_EQ(registered(), Names{"a.b"});
}

TEST_F(ZlvLogManagerFile, AddsToAConfigurationOfTheSameFile)
{
    addFromFile("a", "p", "v");
    addFromFile("a", "q", "w");
    addFromFile("a", "p", "x");
    ZlvObjCfg *cfg = get("a");
    EXPECT_EQ(lookup(cfg, "p"), "x");
    EXPECT_EQ(lookup(cfg, "q"), "w");
    EXPECT_EQ(ZlvObjCfgIsFromFile(cfg), 1);
}

TEST_F(ZlvLogManagerFile, DoesNotMarkAConfigurationThatWasThereBefore)
{
    ZlvObjCfg *cfg = get("a");
    EXPECT_EQ(addFromFile("a", "p", "v"), 1);
    EXPECT_EQ(ZlvObjCfgIsFromFile(cfg), 0);
    EXPECT_EQ(lookup(cfg, "p"), "v");
}

TEST_F(ZlvLogManagerFile, AcceptsAnEmptyValue)
{
    EXPECT_EQ(addFromFile("a", "p", ""), 1);
    EXPECT_EQ(lookup(get("a"), "p"), "");
}

TEST_F(ZlvLogManagerFile, RefusesNullArguments)
{
    EXPECT_EQ(addFromFile(nullptr, "p", "v"), 0);
    EXPECT_EQ(addFromFile("a", nullptr, "v"), 0);
    EXPECT_EQ(addFromFile("a", "p", nullptr), 0);
    EXPECT_EQ(registered(), Names{});
}

TEST_F(ZlvLogManagerFile, RefusesAnEmptyNameOrKey)
{
    EXPECT_EQ(addFromFile("", "p", "v"), 0);
    EXPECT_EQ(addFromFile("a", "", "v"), 0);
    EXPECT_EQ(registered(), Names{});
}

TEST_F(ZlvLogManagerFile, RefusesTheRoot)
{
    EXPECT_EQ(addFromFile("/", "p", "v"), 0);
    EXPECT_EQ(registered(), Names{});
}

/// The registry's own life, without the toolkit around it.
class ZlvLogManagerLife : public ToolkitFixture {};

TEST_F(ZlvLogManagerLife, NothingIsThereBeforeItIsInitialised)
{
    EXPECT_EQ(ZLV_TK_LOG_MGR_INITIALIZED, 0);
    EXPECT_EQ(ZlvLogMgrHasCfg("a"), 0);
    EXPECT_EQ(ZlvLogMgrConfigNames(), nullptr);
}

TEST_F(ZlvLogManagerLife, InitMakesBothContainersOnce)
{
    HeldMutex held;
    zlvInitLogMgr();
    EXPECT_EQ(ZLV_TK_LOG_MGR_INITIALIZED, 1);
    StringGroup *groupBefore = ZLV_TK_CFG_NAMES;
    StringToObjCfgMap *mapBefore = ZLV_TK_CFG_DATA;
    EXPECT_NE(groupBefore, nullptr);
    EXPECT_NE(mapBefore, nullptr);
    zlvInitLogMgr();
    EXPECT_EQ(ZLV_TK_CFG_NAMES, groupBefore);
    EXPECT_EQ(ZLV_TK_CFG_DATA, mapBefore);
}

TEST_F(ZlvLogManagerLife, InitWithoutMemoryLeavesNothing)
{
    HeldMutex held;
    for (uint32_t allowed = 0; allowed < 2; ++allowed) {
        FailAlloc fail(allowed);
        zlvInitLogMgr();
        EXPECT_GT(fail.failed(), 0U);
        EXPECT_EQ(ZLV_TK_LOG_MGR_INITIALIZED, 0);
        EXPECT_EQ(ZLV_TK_CFG_NAMES, nullptr);
        EXPECT_EQ(ZLV_TK_CFG_DATA, nullptr);
    }
}

TEST_F(ZlvLogManagerLife, CloseReleasesEveryConfiguration)
{
    HeldMutex held;
    zlvInitLogMgr();
    ZlvObjCfg *cfg = zlvIntlLogMgrGetCfg("a");
    zlvCloseLogMgr();
    EXPECT_EQ(ZLV_TK_LOG_MGR_INITIALIZED, 0);
    EXPECT_EQ(ZLV_TK_CFG_NAMES, nullptr);
    EXPECT_EQ(ZLV_TK_CFG_DATA, nullptr);
    EXPECT_EQ(cfg->refCount, 1U);
    zlvIntlReleaseObjCfg(cfg);
}

TEST_F(ZlvLogManagerLife, CloseOfAClosedOneDoesNothing)
{
    HeldMutex held;
    zlvCloseLogMgr();
    EXPECT_EQ(ZLV_TK_LOG_MGR_INITIALIZED, 0);
}

TEST_F(ZlvLogManagerLife, CloseOfTheToolkitForgetsConfigurationsForTheNextOpen)
{
    open();
    ZlvReleaseObjCfg(ZlvLogMgrGetCfg("a"));
    close();
    open();
    EXPECT_EQ(ZlvLogMgrHasCfg("a"), 0);
}

} // namespace
} // namespace zelvo_test
