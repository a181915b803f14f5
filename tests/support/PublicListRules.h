// SPDX-License-Identifier: Apache-2.0
// The rules that only the public form of a list family has: sorting, and what happens when the API
// mutex cannot be taken.
#pragma once

#include <algorithm>
#include <functional>

#include "support/BrokenMutex.h"
#include "support/ListWalkRules.h"

namespace zelvo_test {

template <class F>
class PublicListRules : public ListFixture<F> {
protected:
    using Slot = decltype(F::Node::element);

    /// Compares by letter; notes the lowest slot it was shown, where the sorted array begins.
    static int byLetter(const void *a, const void *b)
    {
        for (const void *shown : {a, b}) {
            auto *slot = static_cast<const Slot *>(shown);
            if (array == nullptr || std::less<>()(slot, array))
                array = slot;
        }
        return F::letter(*static_cast<const Slot *>(a)) - F::letter(*static_cast<const Slot *>(b));
    }

    static inline const Slot *array = nullptr;
};
TYPED_TEST_SUITE_P(PublicListRules);

TYPED_TEST_P(PublicListRules, SortOrdersTheElementsWithinTheSameNodes)
{
    this->append("cab");
    auto *first = this->list->first;
    auto *second = this->second();
    auto *third = this->list->last;
    TypeParam::sort(this->list, this->byLetter);
    EXPECT_EQ(this->contents(), "abc");
    EXPECT_EQ(this->list->first, first);
    EXPECT_EQ(this->second(), second);
    EXPECT_EQ(this->list->last, third);
}

TYPED_TEST_P(PublicListRules, SortMovesElementsWithoutCopyingThem)
{
    this->append("ba");
    auto *last = this->list->last->element;
    TypeParam::sort(this->list, this->byLetter);
    EXPECT_EQ(this->list->first->element, last);
}

TYPED_TEST_P(PublicListRules, SortKeepsDuplicates)
{
    this->append("bcab");
    TypeParam::sort(this->list, this->byLetter);
    EXPECT_EQ(this->contents(), "abbc");
}

TYPED_TEST_P(PublicListRules, SortLeavesItsArrayAllocated)
{
    this->array = nullptr;
    this->append("ba");
    TypeParam::sort(this->list, this->byLetter);
    ASSERT_NE(this->array, nullptr);
    EXPECT_EQ(this->array[0], this->list->first->element);
    EXPECT_EQ(this->array[1], this->list->last->element);
}

TYPED_TEST_P(PublicListRules, SortOfAnEmptyListChangesNothing)
{
    TypeParam::sort(this->list, this->byLetter);
    EXPECT_EQ(this->contents(), "");
}

TYPED_TEST_P(PublicListRules, SortIgnoresANullListOrComparison)
{
    this->append("ba");
    TypeParam::sort(nullptr, this->byLetter);
    TypeParam::sort(this->list, nullptr);
    TypeParam::sort(nullptr, nullptr);
    EXPECT_EQ(this->contents(), "ba");
}

TYPED_TEST_P(PublicListRules, SortWithoutMemoryChangesNothing)
{
    this->append("ba");
    FailAlloc fail(0);
    TypeParam::sort(this->list, this->byLetter);
    EXPECT_EQ(fail.failed(), 1U);
    EXPECT_EQ(this->contents(), "ba");
}

TYPED_TEST_P(PublicListRules, SortReleasesTheMutexWhateverItFound)
{
    TypeParam::sort(nullptr, nullptr);
    TypeParam::sort(this->list, this->byLetter);
    this->append("ba");
    TypeParam::sort(this->list, this->byLetter);
    EXPECT_EQ(TypeParam::append(this->list, TypeParam::give('c')), 1);
}

TYPED_TEST_P(PublicListRules, WithoutTheMutexSortChangesNothing)
{
    this->append("ba");
    BrokenMutex broken;
    TypeParam::sort(this->list, this->byLetter);
    EXPECT_EQ(this->contents(), "ba");
}

TYPED_TEST_P(PublicListRules, WithoutTheMutexAllocGivesNull)
{
    BrokenMutex broken;
    EXPECT_EQ(TypeParam::alloc(), nullptr);
}

TYPED_TEST_P(PublicListRules, WithoutTheMutexCopyGivesNull)
{
    this->append("a");
    BrokenMutex broken;
    EXPECT_EQ(TypeParam::copy(this->list), nullptr);
}

TYPED_TEST_P(PublicListRules, WithoutTheMutexFreeDoesNothing)
{
    this->append("a");
    BrokenMutex broken;
    TypeParam::free(this->list);
    EXPECT_EQ(this->contents(), "a");
}

TYPED_TEST_P(PublicListRules, WithoutTheMutexAppendIsRefused)
{
    BrokenMutex broken;
    EXPECT_EQ(TypeParam::append(this->list, TypeParam::give('a')), 0);
    EXPECT_EQ(this->contents(), "");
}

TYPED_TEST_P(PublicListRules, WithoutTheMutexIteratorsGiveNothing)
{
    this->append("ab");
    auto *first = this->list->first;
    BrokenMutex broken;
    EXPECT_EQ(TypeParam::iterator(this->list), nullptr);
    EXPECT_EQ(TypeParam::hasNext(first), 0);
    EXPECT_EQ(TypeParam::get(first), nullptr);
    EXPECT_EQ(TypeParam::next(first), nullptr);
}

TYPED_TEST_P(PublicListRules, WithoutTheMutexIterRemRemovesNothing)
{
    this->append("ab");
    BrokenMutex broken;
    EXPECT_EQ(TypeParam::remove(this->list->first), nullptr);
    EXPECT_EQ(this->contents(), "ab");
}

TYPED_TEST_P(PublicListRules, TheLinkLevelCallsTakeNoMutex)
{
    this->append("ab");
    BrokenMutex broken;
    EXPECT_EQ(TypeParam::getIndex(this->list, 1), this->list->last->element);
    EXPECT_EQ(TypeParam::getLink(this->list, TypeParam::give('b')), this->list->last);
    TypeParam::remLink(this->list, this->list->first);
    EXPECT_EQ(this->contents(), "b");
}

REGISTER_TYPED_TEST_SUITE_P(PublicListRules, SortOrdersTheElementsWithinTheSameNodes,
                            SortMovesElementsWithoutCopyingThem, SortKeepsDuplicates,
                            SortLeavesItsArrayAllocated, SortOfAnEmptyListChangesNothing,
                            SortIgnoresANullListOrComparison, SortWithoutMemoryChangesNothing,
                            SortReleasesTheMutexWhateverItFound, WithoutTheMutexSortChangesNothing,
                            WithoutTheMutexAllocGivesNull, WithoutTheMutexCopyGivesNull,
                            WithoutTheMutexFreeDoesNothing, WithoutTheMutexAppendIsRefused,
                            WithoutTheMutexIteratorsGiveNothing,
                            WithoutTheMutexIterRemRemovesNothing, TheLinkLevelCallsTakeNoMutex);

} // namespace zelvo_test
