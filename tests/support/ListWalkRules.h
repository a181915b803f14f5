// SPDX-License-Identifier: Apache-2.0
// The rules of iterating, searching, copying and freeing that every list family keeps, in both
// forms.
#pragma once

#include "support/ListRules.h"

namespace zelvo_test {

template <class F>
class ListWalkRules : public ListFixture<F> {
};
TYPED_TEST_SUITE_P(ListWalkRules);

TYPED_TEST_P(ListWalkRules, IterRemGivesTheNodeToGoOnFrom)
{
    this->append("abc");
    auto *second = this->second();
    EXPECT_EQ(TypeParam::remove(TypeParam::iterator(this->list)), second);
    EXPECT_EQ(this->contents(), "bc");
}

TYPED_TEST_P(ListWalkRules, IterRemOfTheLastNodeGivesNull)
{
    this->append("abc");
    EXPECT_EQ(TypeParam::remove(this->list->last), nullptr);
    EXPECT_EQ(this->contents(), "ab");
}

TYPED_TEST_P(ListWalkRules, IterRemTakesTheNodeItselfAndNotAnEqualOne)
{
    this->append("abca");
    TypeParam::remove(this->list->last);
    EXPECT_EQ(this->contents(), "abc");
}

TYPED_TEST_P(ListWalkRules, IterRemOfNullIsNull)
{
    EXPECT_EQ(TypeParam::remove(nullptr), nullptr);
}

TYPED_TEST_P(ListWalkRules, ANullIteratorStandsNowhere)
{
    EXPECT_EQ(TypeParam::hasNext(nullptr), 0);
    EXPECT_EQ(TypeParam::get(nullptr), nullptr);
    EXPECT_EQ(TypeParam::next(nullptr), nullptr);
}

TYPED_TEST_P(ListWalkRules, TheIteratorOfAnEmptyListIsNull)
{
    EXPECT_EQ(TypeParam::iterator(this->list), nullptr);
}

TYPED_TEST_P(ListWalkRules, TheIteratorOfANullListIsNull)
{
    EXPECT_EQ(TypeParam::iterator(nullptr), nullptr);
}

TYPED_TEST_P(ListWalkRules, IteratingVisitsEveryElementInOrder)
{
    this->append("bab");
    std::string seen;
    for (auto at = TypeParam::iterator(this->list); TypeParam::hasNext(at) == 1;
         at = TypeParam::next(at)) {
        auto *element = TypeParam::get(at);
        seen += TypeParam::letter(element);
        TypeParam::letGo(element);
    }
    EXPECT_EQ(seen, "bab");
}

TYPED_TEST_P(ListWalkRules, IterGetHandsOutANewCopyEachTime)
{
    this->append("b");
    auto *one = TypeParam::get(this->list->first);
    auto *other = TypeParam::get(this->list->first);
    EXPECT_NE(one, other);
    EXPECT_NE(one, this->list->first->element);
    TypeParam::letGo(one);
    TypeParam::letGo(other);
    EXPECT_EQ(this->contents(), "b");
}

TYPED_TEST_P(ListWalkRules, GetLinkFindsTheFirstEqualElement)
{
    this->append("abb");
    EXPECT_EQ(TypeParam::getLink(this->list, TypeParam::give('b')), this->second());
}

TYPED_TEST_P(ListWalkRules, GetLinkOfAnAbsentElementIsNull)
{
    this->append("ab");
    EXPECT_EQ(TypeParam::getLink(this->list, TypeParam::give('c')), nullptr);
}

TYPED_TEST_P(ListWalkRules, GetLinkOfANullListOrElementIsNull)
{
    this->append("a");
    EXPECT_EQ(TypeParam::getLink(nullptr, TypeParam::give('a')), nullptr);
    EXPECT_EQ(TypeParam::getLink(this->list, nullptr), nullptr);
}

TYPED_TEST_P(ListWalkRules, ACopyHasTheSameElementsInTheSameOrder)
{
    this->append("cab");
    auto *copy = TypeParam::copy(this->list);
    EXPECT_EQ(this->contents(copy), "cab");
    TypeParam::free(copy);
}

TYPED_TEST_P(ListWalkRules, ACopyOwnsItsElements)
{
    this->append("b");
    auto *copy = TypeParam::copy(this->list);
    EXPECT_NE(copy->first->element, this->list->first->element);
    TypeParam::free(copy);
    EXPECT_EQ(this->contents(), "b");
}

TYPED_TEST_P(ListWalkRules, ACopyOfAnEmptyListIsEmpty)
{
    auto *copy = TypeParam::copy(this->list);
    EXPECT_EQ(this->contents(copy), "");
    TypeParam::free(copy);
}

TYPED_TEST_P(ListWalkRules, ACopyOfNullIsNull)
{
    EXPECT_EQ(TypeParam::copy(nullptr), nullptr);
}

TYPED_TEST_P(ListWalkRules, CopyWithoutMemoryForTheListIsNull)
{
    this->append("ab");
    FailAlloc fail(0);
    EXPECT_EQ(TypeParam::copy(this->list), nullptr);
}

TYPED_TEST_P(ListWalkRules, CopySkipsAnElementThatCannotBeAppended)
{
    this->append("abc");
    FailAlloc fail(1, FailAlloc::Once);
    auto *copy = TypeParam::copy(this->list);
    EXPECT_EQ(this->contents(copy), "bc");
    TypeParam::free(copy);
}

TYPED_TEST_P(ListWalkRules, FreeIgnoresNull)
{
    this->append("a");
    TypeParam::free(nullptr);
    EXPECT_EQ(this->contents(), "a");
}

REGISTER_TYPED_TEST_SUITE_P(ListWalkRules, IterRemGivesTheNodeToGoOnFrom,
                            IterRemOfTheLastNodeGivesNull,
                            IterRemTakesTheNodeItselfAndNotAnEqualOne, IterRemOfNullIsNull,
                            ANullIteratorStandsNowhere, TheIteratorOfAnEmptyListIsNull,
                            TheIteratorOfANullListIsNull, IteratingVisitsEveryElementInOrder,
                            IterGetHandsOutANewCopyEachTime, GetLinkFindsTheFirstEqualElement,
                            GetLinkOfAnAbsentElementIsNull, GetLinkOfANullListOrElementIsNull,
                            ACopyHasTheSameElementsInTheSameOrder, ACopyOwnsItsElements,
                            ACopyOfAnEmptyListIsEmpty, ACopyOfNullIsNull,
                            CopyWithoutMemoryForTheListIsNull,
                            CopySkipsAnElementThatCannotBeAppended, FreeIgnoresNull);

} // namespace zelvo_test
