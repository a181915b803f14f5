// SPDX-License-Identifier: Apache-2.0
// The rules of map families that concern one form: the node-level calls of the internal one, what
// the public one does when the API mutex cannot be taken; and the counting of shared values.
#pragma once

#include "support/BrokenMutex.h"
#include "support/MapWalkRules.h"

namespace zelvo_test {

template <class F>
class InternalMapRules : public MapFixture<F> {
};
TYPED_TEST_SUITE_P(InternalMapRules);

TYPED_TEST_P(InternalMapRules, GetNodeFindsTheNodeOfAKey)
{
    this->putThree();
    EXPECT_EQ(TypeParam::getNode(this->map, "l"), this->map->first->next);
}

TYPED_TEST_P(InternalMapRules, GetNodeComparesKeysExactly)
{
    this->put("key", 'a');
    EXPECT_EQ(TypeParam::getNode(this->map, "Key"), nullptr);
    EXPECT_EQ(TypeParam::getNode(this->map, "ke"), nullptr);
}

TYPED_TEST_P(InternalMapRules, GetNodeOfANullMapOrKeyIsNull)
{
    this->put("k", 'a');
    EXPECT_EQ(TypeParam::getNode(nullptr, "k"), nullptr);
    EXPECT_EQ(TypeParam::getNode(this->map, nullptr), nullptr);
}

TYPED_TEST_P(InternalMapRules, RemNodeUnlinksAnyNode)
{
    this->putThree();
    TypeParam::remNode(this->map, this->map->first->next);
    EXPECT_EQ(this->contents(), "k=a m=c ");
    TypeParam::remNode(this->map, this->map->last);
    EXPECT_EQ(this->contents(), "k=a ");
    TypeParam::remNode(this->map, this->map->first);
    EXPECT_EQ(this->contents(), "");
}

TYPED_TEST_P(InternalMapRules, RemNodeIgnoresANullMapOrNode)
{
    this->put("k", 'a');
    TypeParam::remNode(nullptr, this->map->first);
    TypeParam::remNode(this->map, nullptr);
    EXPECT_EQ(this->contents(), "k=a ");
}

REGISTER_TYPED_TEST_SUITE_P(InternalMapRules, GetNodeFindsTheNodeOfAKey, GetNodeComparesKeysExactly,
                            GetNodeOfANullMapOrKeyIsNull, RemNodeUnlinksAnyNode,
                            RemNodeIgnoresANullMapOrNode);

template <class F>
class PublicMapRules : public MapFixture<F> {
};
TYPED_TEST_SUITE_P(PublicMapRules);

TYPED_TEST_P(PublicMapRules, WithoutTheMutexAllocGivesNull)
{
    BrokenMutex broken;
    EXPECT_EQ(TypeParam::alloc(), nullptr);
}

TYPED_TEST_P(PublicMapRules, WithoutTheMutexCopyGivesNull)
{
    this->put("k", 'a');
    BrokenMutex broken;
    EXPECT_EQ(TypeParam::copy(this->map), nullptr);
}

TYPED_TEST_P(PublicMapRules, WithoutTheMutexFreeDoesNothing)
{
    this->put("k", 'a');
    BrokenMutex broken;
    TypeParam::free(this->map);
    EXPECT_EQ(this->contents(), "k=a ");
}

TYPED_TEST_P(PublicMapRules, WithoutTheMutexPutIsRefused)
{
    this->put("k", 'a');
    BrokenMutex broken;
    EXPECT_EQ(TypeParam::put(this->map, "k", this->give('b')), 0);
    EXPECT_EQ(TypeParam::put(this->map, "l", this->give('b')), 0);
    EXPECT_EQ(this->contents(), "k=a ");
}

TYPED_TEST_P(PublicMapRules, WithoutTheMutexNoKeyIsFound)
{
    this->put("k", 'a');
    BrokenMutex broken;
    EXPECT_EQ(TypeParam::get(this->map, "k"), nullptr);
    EXPECT_EQ(TypeParam::hasKey(this->map, "k"), 0);
}

TYPED_TEST_P(PublicMapRules, WithoutTheMutexRemRemovesNothing)
{
    this->put("k", 'a');
    BrokenMutex broken;
    TypeParam::rem(this->map, "k");
    EXPECT_EQ(this->contents(), "k=a ");
}

TYPED_TEST_P(PublicMapRules, WithoutTheMutexIteratorsGiveNothing)
{
    this->putThree();
    auto *first = this->map->first;
    BrokenMutex broken;
    EXPECT_EQ(TypeParam::iterator(this->map), nullptr);
    EXPECT_EQ(TypeParam::hasNext(first), 0);
    EXPECT_EQ(TypeParam::getKey(first), nullptr);
    EXPECT_EQ(TypeParam::getVal(first), nullptr);
    EXPECT_EQ(TypeParam::next(first), nullptr);
}

REGISTER_TYPED_TEST_SUITE_P(PublicMapRules, WithoutTheMutexAllocGivesNull,
                            WithoutTheMutexCopyGivesNull, WithoutTheMutexFreeDoesNothing,
                            WithoutTheMutexPutIsRefused, WithoutTheMutexNoKeyIsFound,
                            WithoutTheMutexRemRemovesNothing, WithoutTheMutexIteratorsGiveNothing);

template <class F>
class CountedMapRules : public MapFixture<F> {
};
TYPED_TEST_SUITE_P(CountedMapRules);

TYPED_TEST_P(CountedMapRules, PutTakesOneReferenceAndRemGivesItBack)
{
    this->put("k", 'a');
    EXPECT_EQ(this->family.references('a'), 1U);
    TypeParam::rem(this->map, "k");
    EXPECT_EQ(this->family.references('a'), 0U);
}

TYPED_TEST_P(CountedMapRules, ReplacingMovesTheReferenceToTheNewValue)
{
    this->put("k", 'a');
    this->put("k", 'b');
    EXPECT_EQ(this->family.references('a'), 0U);
    EXPECT_EQ(this->family.references('b'), 1U);
}

TYPED_TEST_P(CountedMapRules, PuttingTheSameValueAgainLeavesItsCount)
{
    this->put("k", 'a');
    this->put("k", 'a');
    EXPECT_EQ(this->family.references('a'), 1U);
}

TYPED_TEST_P(CountedMapRules, GetAndIterGetValEachHandOutAReference)
{
    this->put("k", 'a');
    auto *got = TypeParam::get(this->map, "k");
    auto *iterated = TypeParam::getVal(this->map->first);
    EXPECT_EQ(got, this->give('a'));
    EXPECT_EQ(iterated, this->give('a'));
    EXPECT_EQ(this->family.references('a'), 3U);
    this->family.letGo(got);
    this->family.letGo(iterated);
}

TYPED_TEST_P(CountedMapRules, ACopyTakesReferencesOfItsOwnUntilItIsFreed)
{
    this->put("k", 'a');
    this->put("l", 'b');
    auto *copy = TypeParam::copy(this->map);
    EXPECT_EQ(this->family.references('a'), 2U);
    EXPECT_EQ(this->family.references('b'), 2U);
    TypeParam::free(copy);
    EXPECT_EQ(this->family.references('a'), 1U);
    EXPECT_EQ(this->family.references('b'), 1U);
}

TYPED_TEST_P(CountedMapRules, ARefusedPutTakesNoReference)
{
    EXPECT_EQ(TypeParam::put(this->map, nullptr, this->give('a')), 0);
    FailAlloc fail(0);
    EXPECT_EQ(TypeParam::put(this->map, "k", this->give('a')), 0);
    EXPECT_EQ(this->family.references('a'), 0U);
}

REGISTER_TYPED_TEST_SUITE_P(CountedMapRules, PutTakesOneReferenceAndRemGivesItBack,
                            ReplacingMovesTheReferenceToTheNewValue,
                            PuttingTheSameValueAgainLeavesItsCount,
                            GetAndIterGetValEachHandOutAReference,
                            ACopyTakesReferencesOfItsOwnUntilItIsFreed,
                            ARefusedPutTakesNoReference);

} // namespace zelvo_test
