// SPDX-License-Identifier: Apache-2.0
// Configurations as records: their life, their place in the tree and their own properties.
#include "ZlvObjConfig.h"

#include "support/CfgFixture.h"
#include "support/FailAlloc.h"

namespace zelvo_test {
namespace {

class ZlvObjConfig : public CfgFixture {};

TEST_F(ZlvObjConfig, ANewConfigurationHasANameAndNothingElse)
{
    ZlvObjCfg *cfg = alloc("a");
    EXPECT_EQ(cfg->refCount, 1U);
    EXPECT_STREQ(cfg->name, "a");
    EXPECT_EQ(cfg->parentName, nullptr);
    EXPECT_EQ(cfg->children, nullptr);
    EXPECT_EQ(cfg->properties, nullptr);
    EXPECT_EQ(cfg->fromFile, 0);
}

TEST_F(ZlvObjConfig, ANewConfigurationIsNotRegistered)
{
    alloc("a");
    EXPECT_FALSE(has("a"));
}

TEST_F(ZlvObjConfig, ANewConfigurationCopiesItsName)
{
    char name[] = "before";
    ZlvObjCfg *cfg = alloc(name);
    name[0] = 'B';
    EXPECT_STREQ(cfg->name, "before");
}

TEST_F(ZlvObjConfig, WithoutANameThereIsNoConfiguration)
{
    EXPECT_EQ(ZlvAllocObjCfg(nullptr), nullptr);
}

TEST_F(ZlvObjConfig, WithoutMemoryThereIsNoConfiguration)
{
    FailAlloc fail(0);
    EXPECT_EQ(ZlvAllocObjCfg("a"), nullptr);
}

TEST_F(ZlvObjConfig, AcquireAddsAReferenceAndGivesTheSameConfiguration)
{
    ZlvObjCfg *cfg = alloc("a");
    EXPECT_EQ(keepCfg(ZlvAcquireObjCfg(cfg)), cfg);
    EXPECT_EQ(cfg->refCount, 2U);
}

TEST_F(ZlvObjConfig, AcquireOfNullIsNull)
{
    EXPECT_EQ(ZlvAcquireObjCfg(nullptr), nullptr);
}

TEST_F(ZlvObjConfig, ReleaseDropsAReference)
{
    ZlvObjCfg *cfg = alloc("a");
    ZlvAcquireObjCfg(cfg);
    ZlvReleaseObjCfg(cfg);
    EXPECT_EQ(cfg->refCount, 1U);
}

TEST_F(ZlvObjConfig, ReleaseIgnoresNull)
{
    ZlvReleaseObjCfg(nullptr);
    EXPECT_EQ(registered(), Names{});
}

TEST_F(ZlvObjConfig, TheLastReleaseFreesEverythingTheConfigurationOwns)
{
    ZlvObjCfg *cfg = ZlvAllocObjCfg("a.b");
    ZlvObjCfgSetParent(cfg, alloc("a"));
    ZlvObjCfgAddChild(cfg, alloc("a.b.c"));
    set(cfg, "p", "v");
    ZlvReleaseObjCfg(cfg);
    EXPECT_FALSE(has("a.b"));
}

TEST_F(ZlvObjConfig, TheNameIsHandedOutAsACopy)
{
    ZlvObjCfg *cfg = alloc("a");
    char *name = ZlvObjCfgGetName(cfg);
    EXPECT_NE(name, cfg->name);
    EXPECT_EQ(taken(name), "a");
}

TEST_F(ZlvObjConfig, TheNameOfNullIsNull)
{
    EXPECT_EQ(ZlvObjCfgGetName(nullptr), nullptr);
}

TEST_F(ZlvObjConfig, TheFromFileFlagCanBeSetAndCleared)
{
    ZlvObjCfg *cfg = alloc("a");
    ZlvObjCfgSetFromFile(cfg, 1);
    EXPECT_EQ(ZlvObjCfgIsFromFile(cfg), 1);
    ZlvObjCfgSetFromFile(cfg, 0);
    EXPECT_EQ(ZlvObjCfgIsFromFile(cfg), 0);
}

TEST_F(ZlvObjConfig, TheFromFileFlagOfNullIsFalse)
{
    ZlvObjCfgSetFromFile(nullptr, 1);
    EXPECT_EQ(ZlvObjCfgIsFromFile(nullptr), 0);
}

TEST_F(ZlvObjConfig, SetParentStoresACopyOfTheParentsName)
{
    ZlvObjCfg *parent = alloc("p");
    ZlvObjCfg *cfg = alloc("c");
    ZlvObjCfgSetParent(cfg, parent);
    EXPECT_EQ(parentOf(cfg), "p");
    EXPECT_NE(cfg->parentName, parent->name);
}

TEST_F(ZlvObjConfig, SetParentReplacesAnotherParent)
{
    ZlvObjCfg *cfg = alloc("c");
    ZlvObjCfgSetParent(cfg, alloc("p"));
    ZlvObjCfgSetParent(cfg, alloc("q"));
    EXPECT_EQ(parentOf(cfg), "q");
}

TEST_F(ZlvObjConfig, SetParentToTheStoredParentKeepsTheText)
{
    ZlvObjCfg *parent = alloc("p");
    ZlvObjCfg *cfg = alloc("c");
    ZlvObjCfgSetParent(cfg, parent);
    const char *stored = cfg->parentName;
    ZlvObjCfgSetParent(cfg, parent);
    EXPECT_EQ(cfg->parentName, stored);
}

TEST_F(ZlvObjConfig, SetParentToNullChangesNothing)
{
    ZlvObjCfg *cfg = alloc("c");
    ZlvObjCfgSetParent(cfg, alloc("p"));
    ZlvObjCfgSetParent(cfg, nullptr);
    ZlvObjCfgSetParent(nullptr, cfg);
    EXPECT_EQ(parentOf(cfg), "p");
}

TEST_F(ZlvObjConfig, SetParentAddsNoChild)
{
    ZlvObjCfg *parent = alloc("p");
    ZlvObjCfgSetParent(alloc("c"), parent);
    EXPECT_EQ(childrenOf(parent), Names{});
}

TEST_F(ZlvObjConfig, GetParentGivesTheRegisteredConfigurationOfThatName)
{
    ZlvObjCfg *parent = get("p");
    ZlvObjCfg *cfg = alloc("c");
    ZlvObjCfgSetParent(cfg, parent);
    uint32_t before = parent->refCount;
    EXPECT_EQ(keepCfg(ZlvObjCfgGetParent(cfg)), parent);
    EXPECT_EQ(parent->refCount, before + 1);
}

TEST_F(ZlvObjConfig, GetParentRegistersAParentThatIsAbsent)
{
    ZlvObjCfg *cfg = alloc("c");
    ZlvObjCfg *unregistered = alloc("p");
    ZlvObjCfgSetParent(cfg, unregistered);
    ZlvObjCfg *parent = keepCfg(ZlvObjCfgGetParent(cfg));
    EXPECT_NE(parent, unregistered);
    EXPECT_EQ(registered(), Names{"p"});
}

TEST_F(ZlvObjConfig, GetParentIsNullWhenNoneIsStored)
{
    EXPECT_EQ(ZlvObjCfgGetParent(alloc("c")), nullptr);
    EXPECT_EQ(ZlvObjCfgGetParent(nullptr), nullptr);
}

TEST_F(ZlvObjConfig, GetParentIsNullForTheRoot)
{
    ZlvObjCfg *cfg = alloc("c");
    ZlvObjCfgSetParent(cfg, alloc("/"));
    EXPECT_EQ(parentOf(cfg), "/");
    EXPECT_EQ(ZlvObjCfgGetParent(cfg), nullptr);
    EXPECT_EQ(registered(), Names{});
}

TEST_F(ZlvObjConfig, AddChildListsTheNameAndSetsTheParent)
{
    ZlvObjCfg *parent = alloc("p");
    ZlvObjCfg *child = alloc("c");
    ZlvObjCfgAddChild(parent, child);
    EXPECT_EQ(childrenOf(parent), Names{"c"});
    EXPECT_EQ(parentOf(child), "p");
}

TEST_F(ZlvObjConfig, AddChildListsANameOnce)
{
    ZlvObjCfg *parent = alloc("p");
    ZlvObjCfg *child = alloc("c");
    ZlvObjCfgAddChild(parent, child);
    ZlvObjCfgAddChild(parent, child);
    EXPECT_EQ(childrenOf(parent), Names{"c"});
}

TEST_F(ZlvObjConfig, ChildrenAreListedInTheOrderOfTheirAdding)
{
    ZlvObjCfg *parent = alloc("p");
    ZlvObjCfgAddChild(parent, alloc("z"));
    ZlvObjCfgAddChild(parent, alloc("a"));
    EXPECT_EQ(childrenOf(parent), (Names{"z", "a"}));
}

TEST_F(ZlvObjConfig, AddChildIgnoresNull)
{
    ZlvObjCfg *cfg = alloc("c");
    ZlvObjCfgAddChild(cfg, nullptr);
    ZlvObjCfgAddChild(nullptr, cfg);
    EXPECT_EQ(cfg->children, nullptr);
    EXPECT_EQ(cfg->parentName, nullptr);
}

TEST_F(ZlvObjConfig, RemChildTakesTheNameOutButLeavesTheStoredParent)
{
    ZlvObjCfg *parent = alloc("p");
    ZlvObjCfg *child = alloc("c");
    ZlvObjCfgAddChild(parent, child);
    ZlvObjCfgRemChild(parent, child);
    EXPECT_EQ(childrenOf(parent), Names{});
    EXPECT_EQ(parentOf(child), "p");
}

TEST_F(ZlvObjConfig, RemChildOfAnotherNameChangesNothing)
{
    ZlvObjCfg *parent = alloc("p");
    ZlvObjCfgAddChild(parent, alloc("c"));
    ZlvObjCfgRemChild(parent, alloc("d"));
    EXPECT_EQ(childrenOf(parent), Names{"c"});
}

TEST_F(ZlvObjConfig, RemChildIgnoresNullAndAParentWithoutChildren)
{
    ZlvObjCfg *parent = alloc("p");
    ZlvObjCfg *child = alloc("c");
    ZlvObjCfgRemChild(parent, child);
    EXPECT_EQ(parent->children, nullptr);
    ZlvObjCfgAddChild(parent, child);
    ZlvObjCfgRemChild(parent, nullptr);
    ZlvObjCfgRemChild(nullptr, child);
    EXPECT_EQ(childrenOf(parent), Names{"c"});
}

TEST_F(ZlvObjConfig, ThereIsNoChildToIterateWithoutChildren)
{
    EXPECT_EQ(ZlvObjCfgChildrenNames(alloc("p")), nullptr);
    EXPECT_EQ(ZlvObjCfgChildrenNames(nullptr), nullptr);
}

TEST_F(ZlvObjConfig, OwnPropertiesAreIteratedInTheOrderOfTheirSetting)
{
    ZlvObjCfg *cfg = alloc("a");
    set(cfg, "z", "1");
    set(cfg, "b", "2");
    set(cfg, "z", "3");
    StringToStringMapIterator at = ZlvObjCfgProperties(cfg);
    EXPECT_EQ(taken(ZlvStringToStringMapIterGetKey(at)), "z");
    EXPECT_EQ(taken(ZlvStringToStringMapIterGetVal(at)), "3");
    at = ZlvStringToStringMapIterNext(at);
    EXPECT_EQ(taken(ZlvStringToStringMapIterGetKey(at)), "b");
    EXPECT_EQ(ZlvStringToStringMapIterNext(at), nullptr);
}

TEST_F(ZlvObjConfig, InheritedPropertiesAreNotIterated)
{
    set(get("a"), "p", "v");
    EXPECT_EQ(ZlvObjCfgProperties(get("a.b")), nullptr);
}

TEST_F(ZlvObjConfig, ThereIsNoPropertyToIterateWithoutProperties)
{
    EXPECT_EQ(ZlvObjCfgProperties(alloc("a")), nullptr);
    EXPECT_EQ(ZlvObjCfgProperties(nullptr), nullptr);
}

} // namespace
} // namespace zelvo_test
