// SPDX-License-Identifier: Apache-2.0
// The rules of iterating, copying and freeing that every map family keeps, in both forms.
#pragma once

#include "support/MapRules.h"

namespace zelvo_test {

template <class F>
class MapWalkRules : public MapFixture<F> {
};
TYPED_TEST_SUITE_P(MapWalkRules);

TYPED_TEST_P(MapWalkRules, IteratingVisitsTheEntriesInTheOrderOfTheirFirstPut)
{
    this->putThree();
    std::string seen;
    for (auto at = TypeParam::iterator(this->map); TypeParam::hasNext(at) == 1;
         at = TypeParam::next(at)) {
        seen += taken(TypeParam::getKey(at)).value_or("(null)");
        seen += this->took(TypeParam::getVal(at));
    }
    EXPECT_EQ(seen, "kalbmc");
}

TYPED_TEST_P(MapWalkRules, IteratingAnEmptyOrNullMapEndsAtOnce)
{
    EXPECT_EQ(TypeParam::iterator(this->map), nullptr);
    EXPECT_EQ(TypeParam::iterator(nullptr), nullptr);
    EXPECT_EQ(TypeParam::hasNext(nullptr), 0);
}

TYPED_TEST_P(MapWalkRules, ANullIteratorGivesNoKeyNoValueAndNoNext)
{
    EXPECT_EQ(TypeParam::getKey(nullptr), nullptr);
    EXPECT_EQ(TypeParam::getVal(nullptr), nullptr);
    EXPECT_EQ(TypeParam::next(nullptr), nullptr);
}

TYPED_TEST_P(MapWalkRules, AnIteratedKeyIsACopy)
{
    this->put("k", 'a');
    char *key = TypeParam::getKey(this->map->first);
    EXPECT_NE(key, this->map->first->key);
    EXPECT_EQ(taken(key), "k");
}

TYPED_TEST_P(MapWalkRules, ACallerMayRemoveAnEntryAfterTakingTheNext)
{
    this->putThree();
    auto next = TypeParam::next(TypeParam::iterator(this->map));
    TypeParam::rem(this->map, "k");
    EXPECT_EQ(taken(TypeParam::getKey(next)), "l");
}

TYPED_TEST_P(MapWalkRules, ACopyHasTheSameEntriesInTheSameOrder)
{
    this->putThree();
    auto *copy = TypeParam::copy(this->map);
    EXPECT_EQ(this->contents(copy), "k=a l=b m=c ");
    TypeParam::free(copy);
    EXPECT_EQ(this->contents(), "k=a l=b m=c ");
}

TYPED_TEST_P(MapWalkRules, ACopyHasKeysOfItsOwn)
{
    this->put("k", 'a');
    auto *copy = TypeParam::copy(this->map);
    EXPECT_NE(copy->first->key, this->map->first->key);
    TypeParam::free(copy);
}

TYPED_TEST_P(MapWalkRules, ACopyOfANullMapIsNull)
{
    EXPECT_EQ(TypeParam::copy(nullptr), nullptr);
}

TYPED_TEST_P(MapWalkRules, ACopyOfAnEmptyMapIsEmpty)
{
    auto *copy = TypeParam::copy(this->map);
    EXPECT_EQ(this->contents(copy), "");
    TypeParam::free(copy);
}

TYPED_TEST_P(MapWalkRules, CopyWithoutMemoryForTheMapIsNull)
{
    this->putThree();
    FailAlloc fail(0);
    EXPECT_EQ(TypeParam::copy(this->map), nullptr);
}

TYPED_TEST_P(MapWalkRules, CopySkipsAnEntryWithoutMemoryForItsNode)
{
    this->putThree();
    FailAlloc fail(1, FailAlloc::Once);
    auto *copy = TypeParam::copy(this->map);
    EXPECT_EQ(this->contents(copy), "l=b m=c ");
    TypeParam::free(copy);
}

TYPED_TEST_P(MapWalkRules, FreeIgnoresNull)
{
    this->put("k", 'a');
    TypeParam::free(nullptr);
    EXPECT_EQ(this->contents(), "k=a ");
}

REGISTER_TYPED_TEST_SUITE_P(MapWalkRules, IteratingVisitsTheEntriesInTheOrderOfTheirFirstPut,
                            IteratingAnEmptyOrNullMapEndsAtOnce,
                            ANullIteratorGivesNoKeyNoValueAndNoNext, AnIteratedKeyIsACopy,
                            ACallerMayRemoveAnEntryAfterTakingTheNext,
                            ACopyHasTheSameEntriesInTheSameOrder, ACopyHasKeysOfItsOwn,
                            ACopyOfANullMapIsNull, ACopyOfAnEmptyMapIsEmpty,
                            CopyWithoutMemoryForTheMapIsNull,
                            CopySkipsAnEntryWithoutMemoryForItsNode, FreeIgnoresNull);

} // namespace zelvo_test
