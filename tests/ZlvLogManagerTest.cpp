// SPDX-License-Identifier: Apache-2.0
// The registry of configurations: finding, making, naming, removing and updating them.
#include "ZlvLogManager.h"

#include <thread>

#include "support/BrokenMutex.h"
#include "support/CfgFixture.h"
#include "support/FailAlloc.h"

namespace zelvo_test {
namespace {

class ZlvLogManager : public CfgFixture {};

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
    ZlvObjCfg *lower = get("a");
    EXPECT_NE(get("A"), lower);
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

} // namespace
} // namespace zelvo_test
