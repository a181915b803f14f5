// SPDX-License-Identifier: Apache-2.0
// The rules that every list family keeps, in its public and in its internal form alike.
#pragma once

#include <gtest/gtest.h>

#include <climits>
#include <string>

#include "support/Elements.h"
#include "support/FailAlloc.h"

namespace zelvo_test {

// One form of the calls of a list family under common names. The link-level calls have one form.
#define ZELVO_LIST_CALLS(PREFIX, MEMBER)                                                           \
    using Container = MEMBER;                                                                      \
    using Node = MEMBER##Node;                                                                     \
    static constexpr auto alloc = PREFIX##Alloc##MEMBER;                                           \
    static constexpr auto copy = PREFIX##Copy##MEMBER;                                             \
    static constexpr auto free = PREFIX##Free##MEMBER;                                             \
    static constexpr auto append = PREFIX##MEMBER##Append;                                         \
    static constexpr auto iterator = PREFIX##MEMBER##Iterator;                                     \
    static constexpr auto hasNext = PREFIX##MEMBER##IterHasNext;                                   \
    static constexpr auto get = PREFIX##MEMBER##IterGet;                                           \
    static constexpr auto remove = PREFIX##MEMBER##IterRem;                                        \
    static constexpr auto next = PREFIX##MEMBER##IterNext;                                         \
    static constexpr auto getLink = Zlv##MEMBER##GetLink;                                          \
    static constexpr auto getIndex = Zlv##MEMBER##GetIndex;                                        \
    static constexpr auto remLink = Zlv##MEMBER##RemLink;                                          \
    [[maybe_unused]] static constexpr auto sort = ZlvSort##MEMBER;

template <class F>
class ListFixture : public testing::Test {
protected:
    using Node = typename F::Node;
    using Container = typename F::Container;

    ~ListFixture() override { F::free(list); }

    void append(const char *letters)
    {
        for (; *letters != '\0'; ++letters)
            EXPECT_EQ(F::append(list, F::give(*letters)), 1);
    }

    /// The letters of OTHER's elements in order; checks every link and the count on the way.
    static std::string contents(const Container *other)
    {
        std::string letters;
        const Node *previous = nullptr;
        for (const Node *node = other->first; node != nullptr; node = node->next) {
            EXPECT_EQ(node->prev, previous);
            EXPECT_EQ(node->owner, other);
            letters += F::letter(node->element);
            previous = node;
        }
        EXPECT_EQ(other->last, previous);
        EXPECT_EQ(other->count, letters.size());
        return letters;
    }
    std::string contents() const { return contents(list); }

    Node *second() const { return list->first->next; }

    typename F::Scope scope;
    Container *list = F::alloc();
};

template <class F>
class ListRules : public ListFixture<F> {
};
TYPED_TEST_SUITE_P(ListRules);

TYPED_TEST_P(ListRules, ANewListIsEmpty)
{
    EXPECT_EQ(this->list->first, nullptr);
    EXPECT_EQ(this->list->last, nullptr);
    EXPECT_EQ(this->list->count, 0U);
}

TYPED_TEST_P(ListRules, AllocWithoutMemoryIsNull)
{
    FailAlloc fail(0);
    EXPECT_EQ(TypeParam::alloc(), nullptr);
}

TYPED_TEST_P(ListRules, AppendKeepsTheOrderAndDuplicates)
{
    this->append("bab");
    EXPECT_EQ(this->contents(), "bab");
    EXPECT_EQ(this->list->count, 3U);
}

TYPED_TEST_P(ListRules, AppendRefusesANullList)
{
    EXPECT_EQ(TypeParam::append(nullptr, TypeParam::give('a')), 0);
}

TYPED_TEST_P(ListRules, AppendRefusesANullElement)
{
    this->append("a");
    EXPECT_EQ(TypeParam::append(this->list, nullptr), 0);
    EXPECT_EQ(this->contents(), "a");
}

TYPED_TEST_P(ListRules, AppendStoresACopyOfItsOwn)
{
    this->append("b");
    EXPECT_NE(this->list->first->element, TypeParam::give('b'));
}

TYPED_TEST_P(ListRules, AppendWithoutMemoryForNodeOrElementChangesNothing)
{
    this->append("a");
    for (uint32_t allowed = 0; allowed < 2; ++allowed) {
        FailAlloc fail(allowed);
        EXPECT_EQ(TypeParam::append(this->list, TypeParam::give('b')), 0);
        EXPECT_GT(fail.failed(), 0U);
    }
    EXPECT_EQ(this->contents(), "a");
}

TYPED_TEST_P(ListRules, GetIndexLendsTheStoredElement)
{
    this->append("bab");
    EXPECT_EQ(TypeParam::getIndex(this->list, 0), this->list->first->element);
    EXPECT_EQ(TypeParam::getIndex(this->list, 1), this->second()->element);
    EXPECT_EQ(TypeParam::getIndex(this->list, 2), this->list->last->element);
}

TYPED_TEST_P(ListRules, GetIndexPastTheEndIsNull)
{
    this->append("bab");
    EXPECT_EQ(TypeParam::getIndex(this->list, 3), nullptr);
    EXPECT_EQ(TypeParam::getIndex(this->list, INT_MAX), nullptr);
}

TYPED_TEST_P(ListRules, GetIndexOfANegativePositionIsNull)
{
    this->append("bab");
    EXPECT_EQ(TypeParam::getIndex(this->list, -1), nullptr);
    EXPECT_EQ(TypeParam::getIndex(this->list, INT_MIN), nullptr);
}

TYPED_TEST_P(ListRules, GetIndexOfANullListIsNull)
{
    EXPECT_EQ(TypeParam::getIndex(nullptr, 0), nullptr);
}

TYPED_TEST_P(ListRules, RemLinkOfTheOnlyNodeLeavesAnEmptyList)
{
    this->append("a");
    TypeParam::remLink(this->list, this->list->first);
    EXPECT_EQ(this->contents(), "");
    EXPECT_EQ(this->list->first, nullptr);
    EXPECT_EQ(this->list->last, nullptr);
}

TYPED_TEST_P(ListRules, RemLinkOfTheFirstOfThreeLeavesTheOthers)
{
    this->append("abc");
    TypeParam::remLink(this->list, this->list->first);
    EXPECT_EQ(this->contents(), "bc");
}

TYPED_TEST_P(ListRules, RemLinkOfTheMiddleOfThreeJoinsItsNeighbours)
{
    this->append("abc");
    TypeParam::remLink(this->list, this->second());
    EXPECT_EQ(this->contents(), "ac");
}

TYPED_TEST_P(ListRules, RemLinkOfTheLastOfThreeMovesLastToTheSecond)
{
    this->append("abc");
    TypeParam::remLink(this->list, this->list->last);
    EXPECT_EQ(this->contents(), "ab");
    EXPECT_EQ(this->list->last, this->second());
}

TYPED_TEST_P(ListRules, RemLinkIgnoresANullListOrNode)
{
    this->append("a");
    TypeParam::remLink(this->list, nullptr);
    TypeParam::remLink(nullptr, this->list->first);
    TypeParam::remLink(nullptr, nullptr);
    EXPECT_EQ(this->contents(), "a");
}

REGISTER_TYPED_TEST_SUITE_P(
    ListRules, ANewListIsEmpty, AllocWithoutMemoryIsNull, AppendKeepsTheOrderAndDuplicates,
    AppendRefusesANullList, AppendRefusesANullElement, AppendStoresACopyOfItsOwn,
    AppendWithoutMemoryForNodeOrElementChangesNothing, GetIndexLendsTheStoredElement,
    GetIndexPastTheEndIsNull, GetIndexOfANegativePositionIsNull, GetIndexOfANullListIsNull,
    RemLinkOfTheOnlyNodeLeavesAnEmptyList, RemLinkOfTheFirstOfThreeLeavesTheOthers,
    RemLinkOfTheMiddleOfThreeJoinsItsNeighbours, RemLinkOfTheLastOfThreeMovesLastToTheSecond,
    RemLinkIgnoresANullListOrNode);

} // namespace zelvo_test
