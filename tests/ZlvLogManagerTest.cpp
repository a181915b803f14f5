// SPDX-License-Identifier: Apache-2.0
// The registry of configurations: finding, making and naming them, its own life, the file's entry.
#include "ZlvLogManager.h"

#include <thread>

#include "support/BrokenMutex.h"
#include "support/CfgFixture.h"
#include "support/FailAlloc.h"

namespace zelvo_test {
namespace {

class ZlvLogManager : public CfgFixture {
protected:
    static ZlvBool addFromFile(const char *name, const char *key, const char *value)
    {
        HeldMutex held;
        return zlvLogMgrAddCfgFromFile(name, key, value);
    }
};

TEST_F(ZlvLogManager, GetMakesAndRegistersAnUnknownConfiguration)
{
    ZlvObjCfg *cfg = get("a");
    EXPECT_STREQ(cfg->name, "a");
    EXPECT_EQ(cfg->refCount, 2U);
    EXPECT_EQ(cfg->properties, nullptr);
    EXPECT_EQ(cfg->fromFile, 0);
    EXPECT_TRUE(has("a"));
}

TEST_F(ZlvLogManager, GetFindsARegisteredConfigurationAndAddsAReference)
{
    ZlvObjCfg *cfg = get("a");
    EXPECT_EQ(get("a"), cfg);
    EXPECT_EQ(cfg->refCount, 3U);
    EXPECT_EQ(registered(), Names{"a"});
}

TEST_F(ZlvLogManager, GetTellsUpperAndLowerCaseApart)
{
    EXPECT_NE(get("a"), get("A"));
    EXPECT_EQ(registered(), (Names{"a", "A"}));
}

TEST_F(ZlvLogManager, GetOfTheRootIsNullAndRegistersNothing)
{
    EXPECT_EQ(ZlvLogMgrGetCfg("/"), nullptr);
    EXPECT_EQ(registered(), Names{});
    EXPECT_FALSE(has("/"));
}

TEST_F(ZlvLogManager, GetOfNullIsNullAndRegistersNothing)
{
    EXPECT_EQ(ZlvLogMgrGetCfg(nullptr), nullptr);
    EXPECT_EQ(registered(), Names{});
}

TEST_F(ZlvLogManager, GetWithoutMemoryIsNullAndRegistersNothing)
{
    {
        FailAlloc fail(0);
        EXPECT_EQ(ZlvLogMgrGetCfg("a"), nullptr);
    }
    EXPECT_EQ(registered(), Names{});
}

TEST_F(ZlvLogManager, HasNeverCreates)
{
    EXPECT_EQ(ZlvLogMgrHasCfg("a"), 0);
    EXPECT_EQ(ZlvLogMgrHasCfg("a"), 0);
    EXPECT_EQ(registered(), Names{});
}

TEST_F(ZlvLogManager, HasOfNullIsFalse)
{
    EXPECT_EQ(ZlvLogMgrHasCfg(nullptr), 0);
}

TEST_F(ZlvLogManager, NamesAreListedInTheOrderOfRegistration)
{
    get("z");
    get("a.b");
    get("a");
    EXPECT_EQ(registered(), (Names{"z", "a.b", "a"}));
}

TEST_F(ZlvLogManager, AddRegistersAConfigurationAndTakesAReference)
{
    ZlvObjCfg *cfg = alloc("a");
    ZlvLogMgrAddCfg(cfg);
    EXPECT_EQ(cfg->refCount, 2U);
    EXPECT_EQ(get("a"), cfg);
    EXPECT_EQ(registered(), Names{"a"});
}

TEST_F(ZlvLogManager, AddIgnoresASecondConfigurationOfAName)
{
    ZlvObjCfg *first = get("a");
    ZlvObjCfg *second = alloc("a");
    ZlvLogMgrAddCfg(second);
    EXPECT_EQ(get("a"), first);
    EXPECT_EQ(second->refCount, 1U);
    EXPECT_EQ(registered(), Names{"a"});
}

TEST_F(ZlvLogManager, AddIgnoresNullAndAConfigurationWithoutName)
{
    ZlvObjCfg nameless{};
    nameless.refCount = 1;
    ZlvLogMgrAddCfg(nullptr);
    ZlvLogMgrAddCfg(&nameless);
    EXPECT_EQ(nameless.refCount, 1U);
    EXPECT_EQ(registered(), Names{});
}

TEST_F(ZlvLogManager, RemForgetsTheConfigurationAndGivesItsReferenceBack)
{
    ZlvObjCfg *cfg = get("a");
    ZlvLogMgrRemCfg(cfg);
    EXPECT_EQ(cfg->refCount, 1U);
    EXPECT_FALSE(has("a"));
    EXPECT_EQ(registered(), Names{});
}

TEST_F(ZlvLogManager, AConfigurationLivesOnAfterItsRemovalWhileItIsHeld)
{
    ZlvObjCfg *cfg = get("a");
    set(cfg, "p", "v");
    ZlvLogMgrRemCfg(cfg);
    EXPECT_EQ(lookup(cfg, "p"), "v");
    EXPECT_NE(get("a"), cfg);
}

TEST_F(ZlvLogManager, AConfigurationThatOnlyTheManagerHoldsCanBeRemoved)
{
    get("a");
    ZlvObjCfg *cfg = ZlvLogMgrGetCfg("a.b");
    ZlvReleaseObjCfg(cfg);
    ZlvLogMgrRemCfg(cfg);
    EXPECT_EQ(registered(), Names{"a"});
}

TEST_F(ZlvLogManager, RemIgnoresWhatIsNotRegistered)
{
    ZlvObjCfg nameless{};
    nameless.refCount = 1;
    get("a");
    ZlvObjCfg *unregistered = alloc("b");
    ZlvLogMgrRemCfg(nullptr);
    ZlvLogMgrRemCfg(&nameless);
    ZlvLogMgrRemCfg(unregistered);
    EXPECT_EQ(unregistered->refCount, 1U);
    EXPECT_EQ(registered(), Names{"a"});
}

TEST_F(ZlvLogManager, ARemovedConfigurationCanBeAddedAgainAtTheEndOfTheNames)
{
    ZlvObjCfg *cfg = get("a");
    get("b");
    ZlvLogMgrRemCfg(cfg);
    ZlvLogMgrAddCfg(cfg);
    EXPECT_EQ(registered(), (Names{"b", "a"}));
    EXPECT_EQ(get("a"), cfg);
}

TEST_F(ZlvLogManager, UpdateOfWhatIsNotRegisteredDoesNothing)
{
    ZlvObjCfg nameless{};
    nameless.refCount = 1;
    ZlvLogMgrUpdateCfg(nullptr);
    ZlvLogMgrUpdateCfg(&nameless);
    ZlvLogMgrUpdateCfg(alloc("a"));
    EXPECT_EQ(registered(), Names{});
}

TEST_F(ZlvLogManager, UpdateRemovesAndAddsAgain)
{
    ZlvObjCfg *cfg = get("a");
    get("b");
    ZlvLogMgrUpdateCfg(cfg);
    EXPECT_EQ(registered(), (Names{"b", "a"}));
    EXPECT_EQ(cfg->refCount, 2U);
}

TEST_F(ZlvLogManager, UpdatePutsTheGivenConfigurationInThePlaceOfItsName)
{
    get("a");
    ZlvObjCfg *other = alloc("a");
    ZlvLogMgrUpdateCfg(other);
    EXPECT_EQ(get("a"), other);
}

TEST_F(ZlvLogManager, UpdateKeepsAConfigurationThatOnlyTheManagerHolds)
{
    ZlvObjCfg *cfg = ZlvLogMgrGetCfg("a");
    ZlvReleaseObjCfg(cfg);
    ZlvLogMgrUpdateCfg(cfg);
    EXPECT_EQ(get("a"), cfg);
}

TEST_F(ZlvLogManager, OpeningMakesConfigurationsForTheDefaultObjects)
{
    EXPECT_EQ(names(ZlvLogMgrConfigNames()),
              (Names{"zelvo.errorLogger", "zelvo.defaultFormatter", "zelvo.defaultConsole"}));
}

TEST_F(ZlvLogManager, ThreadsThatGetOneNameMakeItOnce)
{
    auto getAll = [] {
        for (const char *name : {"a", "a.b", "a.b.c", "d"})
            ZlvReleaseObjCfg(ZlvLogMgrGetCfg(name));
    };
    std::thread one(getAll);
    std::thread other(getAll);
    one.join();
    other.join();
    EXPECT_EQ(registered(), (Names{"a", "a.b", "a.b.c", "d"}));
}

TEST_F(ZlvLogManager, FromFileMakesAMarkedConfigurationWithTheProperty)
{
    EXPECT_EQ(addFromFile("a.b", "p", "v"), 1);
    ZlvObjCfg *cfg = get("a.b");
    EXPECT_EQ(lookup(cfg, "p"), "v");
    EXPECT_EQ(ZlvObjCfgIsFromFile(cfg), 1);
    EXPECT_EQ(cfg->refCount, 2U);
    EXPECT_EQ(registered(), Names{"a.b"});
}

TEST_F(ZlvLogManager, FromFileAddsToAConfigurationOfTheSameFile)
{
    addFromFile("a", "p", "v");
    addFromFile("a", "q", "w");
    addFromFile("a", "p", "x");
    ZlvObjCfg *cfg = get("a");
    EXPECT_EQ(lookup(cfg, "p"), "x");
    EXPECT_EQ(lookup(cfg, "q"), "w");
    EXPECT_EQ(ZlvObjCfgIsFromFile(cfg), 1);
}

TEST_F(ZlvLogManager, FromFileDoesNotMarkAConfigurationThatWasThereBefore)
{
    ZlvObjCfg *cfg = get("a");
    EXPECT_EQ(addFromFile("a", "p", "v"), 1);
    EXPECT_EQ(ZlvObjCfgIsFromFile(cfg), 0);
    EXPECT_EQ(lookup(cfg, "p"), "v");
}

TEST_F(ZlvLogManager, FromFileAcceptsAnEmptyValue)
{
    EXPECT_EQ(addFromFile("a", "p", ""), 1);
    EXPECT_EQ(lookup(get("a"), "p"), "");
}

TEST_F(ZlvLogManager, FromFileRefusesNullArguments)
{
    EXPECT_EQ(addFromFile(nullptr, "p", "v"), 0);
    EXPECT_EQ(addFromFile("a", nullptr, "v"), 0);
    EXPECT_EQ(addFromFile("a", "p", nullptr), 0);
    EXPECT_EQ(registered(), Names{});
}

TEST_F(ZlvLogManager, FromFileRefusesAnEmptyNameOrKey)
{
    EXPECT_EQ(addFromFile("", "p", "v"), 0);
    EXPECT_EQ(addFromFile("a", "", "v"), 0);
    EXPECT_EQ(registered(), Names{});
}

TEST_F(ZlvLogManager, FromFileRefusesTheRoot)
{
    EXPECT_EQ(addFromFile("/", "p", "v"), 0);
    EXPECT_EQ(registered(), Names{});
}

TEST_F(ZlvLogManager, WithoutTheMutexNothingIsFoundOrMade)
{
    get("a");
    BrokenMutex broken;
    EXPECT_EQ(ZlvLogMgrGetCfg("a"), nullptr);
    EXPECT_EQ(ZlvLogMgrHasCfg("a"), 0);
    EXPECT_EQ(ZlvLogMgrConfigNames(), nullptr);
}

TEST_F(ZlvLogManager, WithoutTheMutexNothingIsAddedUpdatedOrRemoved)
{
    ZlvObjCfg *first = get("a");
    get("b");
    ZlvObjCfg *unregistered = alloc("c");
    {
        BrokenMutex broken;
        ZlvLogMgrAddCfg(unregistered);
        ZlvLogMgrUpdateCfg(first);
        ZlvLogMgrRemCfg(first);
    }
    EXPECT_EQ(registered(), (Names{"a", "b"}));
}

TEST_F(ZlvLogManager, WithoutTheMutexNothingIsApplied)
{
    set(get("app"), "p", "v");
    ZlvObject *object = logger("other");
    {
        BrokenMutex broken;
        EXPECT_EQ(ZlvLogMgrApplyCfg(object, "app"), 0);
    }
    EXPECT_EQ(prop(object, "p"), std::nullopt);
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
        EXPECT_EQ(fail.failed(), 1U);
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
