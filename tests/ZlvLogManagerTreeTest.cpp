// SPDX-License-Identifier: Apache-2.0
// The tree of configurations: how names find their parents, and what adding and removing relinks.
#include "ZlvLogManager.h"

#include "support/CfgFixture.h"

namespace zelvo_test {
namespace {

class ZlvLogManagerTree : public CfgFixture {};

TEST_F(ZlvLogManagerTree, AConfigurationWithoutRegisteredPrefixStandsAtTheTop)
{
    ZlvObjCfg *cfg = get("x.y");
    EXPECT_EQ(parentOf(cfg), std::nullopt);
    EXPECT_EQ(ZlvObjCfgGetParent(cfg), nullptr);
    EXPECT_EQ(registered(), Names{"x.y"});
}

TEST_F(ZlvLogManagerTree, AddingLinksParentAndChildBothWays)
{
    ZlvObjCfg *parent = get("a");
    ZlvObjCfg *child = get("a.b");
    EXPECT_EQ(parentOf(child), "a");
    EXPECT_EQ(childrenOf(parent), Names{"a.b"});
}

TEST_F(ZlvLogManagerTree, TheLongestRegisteredPrefixIsTheParent)
{
    ZlvObjCfg *top = get("a");
    ZlvObjCfg *middle = get("a.b");
    EXPECT_EQ(parentOf(get("a.b.c")), "a.b");
    EXPECT_EQ(childrenOf(middle), Names{"a.b.c"});
    EXPECT_EQ(childrenOf(top), Names{"a.b"});
}

TEST_F(ZlvLogManagerTree, GapsInTheDottedPathAreSkipped)
{
    ZlvObjCfg *top = get("a");
    EXPECT_EQ(parentOf(get("a.b.c.d")), "a");
    EXPECT_EQ(childrenOf(top), Names{"a.b.c.d"});
    EXPECT_FALSE(has("a.b.c"));
}

TEST_F(ZlvLogManagerTree, APrefixThatEndsInsideAWordIsNoParent)
{
    get("ap");
    EXPECT_EQ(parentOf(get("app.net")), std::nullopt);
}

TEST_F(ZlvLogManagerTree, AnEarlierGrandchildStaysWhereItIs)
{
    ZlvObjCfg *top = get("a");
    ZlvObjCfg *grandchild = get("a.b.c");
    ZlvObjCfg *middle = get("a.b");
    EXPECT_EQ(parentOf(grandchild), "a");
    EXPECT_EQ(parentOf(middle), "a");
    EXPECT_EQ(childrenOf(top), (Names{"a.b.c", "a.b"}));
    EXPECT_EQ(childrenOf(middle), Names{});
}

TEST_F(ZlvLogManagerTree, ALaterParentIsNotReachedBeforeTheChildIsLinkedAnew)
{
    ZlvObjCfg *child = get("x.y");
    ZlvObjCfg *parent = get("x");
    set(parent, "p", "v");
    EXPECT_EQ(parentOf(child), std::nullopt);
    EXPECT_EQ(childrenOf(parent), Names{});
    EXPECT_EQ(lookup(child, "p"), std::nullopt);
}

TEST_F(ZlvLogManagerTree, UpdateLinksAConfigurationToALaterParent)
{
    ZlvObjCfg *child = get("x.y");
    ZlvObjCfg *parent = get("x");
    set(parent, "p", "v");
    ZlvLogMgrUpdateCfg(child);
    EXPECT_EQ(parentOf(child), "x");
    EXPECT_EQ(childrenOf(parent), Names{"x.y"});
    EXPECT_EQ(lookup(child, "p"), "v");
}

TEST_F(ZlvLogManagerTree, ApplyingStoresALaterParent)
{
    ZlvObjCfg *child = get("x.y");
    set(get("x"), "p", "v");
    ZlvObject *object = logger("object");
    EXPECT_EQ(ZlvLogMgrApplyCfg(object, "x.y"), 1);
    EXPECT_EQ(parentOf(child), "x");
    EXPECT_EQ(prop(object, "p"), "v");
}

TEST_F(ZlvLogManagerTree, TheComputedParentIsTheStoredOneWhenThereIsOne)
{
    ZlvObjCfg *cfg = get("a.b");
    get("a");
    ZlvObjCfgSetParent(cfg, alloc("elsewhere"));
    EXPECT_EQ(computedParentOf(cfg), "elsewhere");
    EXPECT_FALSE(has("elsewhere"));
}

TEST_F(ZlvLogManagerTree, TheComputedParentIsStoredWhenItIsFound)
{
    ZlvObjCfg *cfg = alloc("a.b.c");
    get("a");
    EXPECT_EQ(computedParentOf(cfg), "a");
    EXPECT_EQ(parentOf(cfg), "a");
}

TEST_F(ZlvLogManagerTree, TheComputedParentIsTheRootWhenNoPrefixIsRegistered)
{
    ZlvObjCfg *cfg = alloc("a.b.c");
    EXPECT_EQ(computedParentOf(cfg), "/");
    EXPECT_EQ(parentOf(cfg), std::nullopt);
    EXPECT_EQ(computedParentOf(alloc("nodots")), "/");
}

TEST_F(ZlvLogManagerTree, ComputingAParentRegistersNothing)
{
    EXPECT_EQ(computedParentOf(alloc("a.b.c")), "/");
    EXPECT_EQ(registered(), Names{});
}

TEST_F(ZlvLogManagerTree, TheComputedParentOfNullIsNull)
{
    EXPECT_EQ(computedParentOf(nullptr), std::nullopt);
}

TEST_F(ZlvLogManagerTree, AStoredParentIsMadeWhenItsChildIsAdded)
{
    ZlvObjCfg *cfg = alloc("c");
    ZlvObjCfgSetParent(cfg, alloc("p"));
    ZlvLogMgrAddCfg(cfg);
    EXPECT_EQ(childrenOf(get("p")), Names{"c"});
    EXPECT_EQ(registered(), (Names{"p", "c"}));
}

TEST_F(ZlvLogManagerTree, AddingMovesSiblingsWhoseParentIsAnotherNow)
{
    ZlvObjCfg *top = get("a");
    ZlvObjCfg *first = get("a.b.c");
    ZlvObjCfg *stays = get("a.e");
    ZlvObjCfg *second = get("a.b.d");
    ZlvObjCfg *elsewhere = get("z");
    ZlvObjCfgSetParent(first, elsewhere);
    ZlvObjCfgSetParent(second, elsewhere);
    ZlvObjCfg *middle = get("a.b");
    EXPECT_EQ(childrenOf(top), (Names{"a.e", "a.b"}));
    EXPECT_EQ(childrenOf(middle), (Names{"a.b.c", "a.b.d"}));
    EXPECT_EQ(parentOf(first), "a.b");
    EXPECT_EQ(parentOf(second), "a.b");
    EXPECT_EQ(parentOf(stays), "a");
}

TEST_F(ZlvLogManagerTree, AddingKeepsNoReferenceToRelatives)
{
    ZlvObjCfg *top = get("a");
    ZlvObjCfg *sibling = get("a.c");
    get("a.b");
    EXPECT_EQ(top->refCount, 2U);
    EXPECT_EQ(sibling->refCount, 2U);
}

TEST_F(ZlvLogManagerTree, RemovingHandsTheChildrenToTheParent)
{
    ZlvObjCfg *top = get("a");
    ZlvObjCfg *middle = get("a.b");
    ZlvObjCfg *first = get("a.b.c");
    ZlvObjCfg *second = get("a.b.d");
    ZlvLogMgrRemCfg(middle);
    EXPECT_EQ(childrenOf(top), (Names{"a.b.c", "a.b.d"}));
    EXPECT_EQ(childrenOf(middle), Names{});
    EXPECT_EQ(parentOf(first), "a");
    EXPECT_EQ(parentOf(second), "a");
}

TEST_F(ZlvLogManagerTree, RemovingLeavesTheStoredParentOfTheRemoved)
{
    ZlvObjCfg *top = get("a");
    ZlvObjCfg *child = get("a.b");
    set(top, "p", "v");
    ZlvLogMgrRemCfg(child);
    EXPECT_EQ(childrenOf(top), Names{});
    EXPECT_EQ(parentOf(child), "a");
    EXPECT_EQ(lookup(child, "p"), "v");
}

TEST_F(ZlvLogManagerTree, ChildrenOfARemovedTopKeepItsNameAsTheirParent)
{
    ZlvObjCfg *top = get("a");
    ZlvObjCfg *child = get("a.b");
    ZlvLogMgrRemCfg(top);
    EXPECT_EQ(childrenOf(top), Names{});
    EXPECT_EQ(parentOf(child), "a");
    EXPECT_EQ(registered(), Names{"a.b"});
}

TEST_F(ZlvLogManagerTree, ALookupBringsARemovedParentBackEmpty)
{
    ZlvObjCfg *top = get("a");
    ZlvObjCfg *child = get("a.b");
    set(top, "p", "v");
    ZlvLogMgrRemCfg(top);
    EXPECT_EQ(lookup(child, "p"), std::nullopt);
    EXPECT_NE(get("a"), top);
    EXPECT_EQ(registered(), (Names{"a.b", "a"}));
}

TEST_F(ZlvLogManagerTree, RemovingAChildMakesItsAbsentParent)
{
    ZlvObjCfg *top = get("a");
    ZlvObjCfg *child = get("a.b");
    ZlvLogMgrRemCfg(top);
    ZlvLogMgrRemCfg(child);
    EXPECT_EQ(registered(), Names{"a"});
}

TEST_F(ZlvLogManagerTree, RemovingKeepsNoReferenceToRelatives)
{
    ZlvObjCfg *top = get("a");
    ZlvObjCfg *middle = get("a.b");
    ZlvObjCfg *bottom = get("a.b.c");
    ZlvLogMgrRemCfg(middle);
    EXPECT_EQ(top->refCount, 2U);
    EXPECT_EQ(bottom->refCount, 2U);
}

TEST_F(ZlvLogManagerTree, UpdateKeepsTheChildrenAtTheirNewParent)
{
    ZlvObjCfg *top = get("a");
    ZlvObjCfg *middle = get("a.b");
    ZlvObjCfg *bottom = get("a.b.c");
    ZlvLogMgrUpdateCfg(middle);
    EXPECT_EQ(parentOf(bottom), "a");
    EXPECT_EQ(childrenOf(top), (Names{"a.b.c", "a.b"}));
}

} // namespace
} // namespace zelvo_test
