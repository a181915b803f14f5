// SPDX-License-Identifier: Apache-2.0
// The rules that every group family keeps, in its public and in its internal form alike.
#pragma once

#include <gtest/gtest.h>

#include <string>

#include "support/Elements.h"
#include "support/FailAlloc.h"

namespace zelvo_test {

// One form of the calls of a group family under common names. The link lookup has one form.
#define ZELVO_GROUP_CALLS(PREFIX, MEMBER)                                                          \
    using Container = MEMBER;                                                                      \
    using Node = MEMBER##Node;                                                                     \
    static constexpr auto alloc = PREFIX##Alloc##MEMBER;                                           \
    static constexpr auto free = PREFIX##Free##MEMBER;                                             \
    static constexpr auto add = PREFIX##MEMBER##Add;                                               \
    static constexpr auto rem = PREFIX##MEMBER##Rem;                                               \
    static constexpr auto iterator = PREFIX##MEMBER##Iterator;                                     \
    static constexpr auto hasNext = PREFIX##MEMBER##IterHasNext;                                   \
    static constexpr auto get = PREFIX##MEMBER##IterGet;                                           \
    static constexpr auto iterRem = PREFIX##MEMBER##IterRem;                                       \
    static constexpr auto next = PREFIX##MEMBER##IterNext;                                         \
    static constexpr auto getLink = Zlv##MEMBER##GetLink;

template <class F>
class GroupFixture : public testing::Test {
protected:
    using Node = typename F::Node;

    ~GroupFixture() override { F::free(group); }

    auto *give(char letter) { return family.give(letter); }
    void add(const char *letters)
    {
        for (; *letters != '\0'; ++letters)
            EXPECT_EQ(F::add(group, give(*letters)), 1);
    }

    /// The letters of the elements in order; checks every link on the way.
    std::string contents()
    {
        std::string letters;
        const Node *previous = nullptr;
        for (const Node *node = group->first; node != nullptr; node = node->next) {
            EXPECT_EQ(node->prev, previous);
            EXPECT_EQ(node->owner, group);
            letters += family.letter(node->element);
            previous = node;
        }
        EXPECT_EQ(group->last, previous);
        return letters;
    }

    typename F::Scope scope;
    F family;
    typename F::Container *group = F::alloc();
};

template <class F>
class GroupRules : public GroupFixture<F> {
};
TYPED_TEST_SUITE_P(GroupRules);

TYPED_TEST_P(GroupRules, ANewGroupIsEmpty)
{
    EXPECT_EQ(this->group->first, nullptr);
    EXPECT_EQ(this->group->last, nullptr);
}

TYPED_TEST_P(GroupRules, AllocWithoutMemoryIsNull)
{
    FailAlloc fail(0);
    EXPECT_EQ(TypeParam::alloc(), nullptr);
}

TYPED_TEST_P(GroupRules, AddKeepsTheOrder)
{
    this->add("bac");
    EXPECT_EQ(this->contents(), "bac");
}

TYPED_TEST_P(GroupRules, AddRefusesAnEqualElement)
{
    this->add("ab");
    EXPECT_EQ(TypeParam::add(this->group, this->give('a')), 0);
    EXPECT_EQ(this->contents(), "ab");
}

TYPED_TEST_P(GroupRules, AddRefusesANullGroupOrElement)
{
    EXPECT_EQ(TypeParam::add(nullptr, this->give('a')), 0);
    EXPECT_EQ(TypeParam::add(this->group, nullptr), 0);
    EXPECT_EQ(this->contents(), "");
}

TYPED_TEST_P(GroupRules, AddWithoutMemoryChangesNothing)
{
    this->add("a");
    FailAlloc fail(0);
    EXPECT_EQ(TypeParam::add(this->group, this->give('b')), 0);
    EXPECT_EQ(this->contents(), "a");
}

TYPED_TEST_P(GroupRules, RemOfTheOnlyElementLeavesAnEmptyGroup)
{
    this->add("a");
    EXPECT_EQ(TypeParam::rem(this->group, this->give('a')), 1);
    EXPECT_EQ(this->group->first, nullptr);
    EXPECT_EQ(this->group->last, nullptr);
}

TYPED_TEST_P(GroupRules, RemOfTheFirstOfThreeLeavesTheOthers)
{
    this->add("abc");
    EXPECT_EQ(TypeParam::rem(this->group, this->give('a')), 1);
    EXPECT_EQ(this->contents(), "bc");
}

TYPED_TEST_P(GroupRules, RemOfTheMiddleOfThreeJoinsItsNeighbours)
{
    this->add("abc");
    EXPECT_EQ(TypeParam::rem(this->group, this->give('b')), 1);
    EXPECT_EQ(this->contents(), "ac");
}

TYPED_TEST_P(GroupRules, RemOfTheLastOfThreeLeavesTheOthers)
{
    this->add("abc");
    EXPECT_EQ(TypeParam::rem(this->group, this->give('c')), 1);
    EXPECT_EQ(this->contents(), "ab");
}

TYPED_TEST_P(GroupRules, RemOfAnAbsentElementIsRefused)
{
    this->add("a");
    EXPECT_EQ(TypeParam::rem(this->group, this->give('b')), 0);
    EXPECT_EQ(this->contents(), "a");
}

TYPED_TEST_P(GroupRules, RemRefusesANullGroupOrElement)
{
    this->add("a");
    EXPECT_EQ(TypeParam::rem(nullptr, this->give('a')), 0);
    EXPECT_EQ(TypeParam::rem(this->group, nullptr), 0);
    EXPECT_EQ(this->contents(), "a");
}

TYPED_TEST_P(GroupRules, ARemovedElementCanBeAddedAgainAtTheEnd)
{
    this->add("ab");
    TypeParam::rem(this->group, this->give('a'));
    this->add("a");
    EXPECT_EQ(this->contents(), "ba");
}

TYPED_TEST_P(GroupRules, IterRemGivesTheNodeToGoOnFrom)
{
    this->add("abc");
    auto *second = this->group->first->next;
    EXPECT_EQ(TypeParam::iterRem(TypeParam::iterator(this->group)), second);
    EXPECT_EQ(this->contents(), "bc");
}

TYPED_TEST_P(GroupRules, IterRemOfTheLastNodeGivesNull)
{
    this->add("ab");
    EXPECT_EQ(TypeParam::iterRem(this->group->last), nullptr);
    EXPECT_EQ(this->contents(), "a");
}

TYPED_TEST_P(GroupRules, ANullIteratorStandsNowhere)
{
    EXPECT_EQ(TypeParam::hasNext(nullptr), 0);
    EXPECT_EQ(TypeParam::get(nullptr), nullptr);
    EXPECT_EQ(TypeParam::next(nullptr), nullptr);
    EXPECT_EQ(TypeParam::iterRem(nullptr), nullptr);
}

TYPED_TEST_P(GroupRules, TheIteratorOfAnEmptyOrNullGroupIsNull)
{
    EXPECT_EQ(TypeParam::iterator(this->group), nullptr);
    EXPECT_EQ(TypeParam::iterator(nullptr), nullptr);
}

TYPED_TEST_P(GroupRules, IteratingVisitsEveryElementInOrder)
{
    this->add("bac");
    std::string seen;
    for (auto at = TypeParam::iterator(this->group); TypeParam::hasNext(at) == 1;
         at = TypeParam::next(at)) {
        auto *element = TypeParam::get(at);
        seen += this->family.letter(element);
        this->family.letGo(element);
    }
    EXPECT_EQ(seen, "bac");
}

TYPED_TEST_P(GroupRules, GetLinkFindsTheNodeOfAnElement)
{
    this->add("ab");
    EXPECT_EQ(TypeParam::getLink(this->group, this->give('b')), this->group->last);
}

TYPED_TEST_P(GroupRules, GetLinkOfAnAbsentElementIsNull)
{
    this->add("ab");
    EXPECT_EQ(TypeParam::getLink(this->group, this->give('c')), nullptr);
}

TYPED_TEST_P(GroupRules, GetLinkOfANullGroupOrElementIsNull)
{
    this->add("a");
    EXPECT_EQ(TypeParam::getLink(nullptr, this->give('a')), nullptr);
    EXPECT_EQ(TypeParam::getLink(this->group, nullptr), nullptr);
}

TYPED_TEST_P(GroupRules, FreeIgnoresNull)
{
    this->add("a");
    TypeParam::free(nullptr);
    EXPECT_EQ(this->contents(), "a");
}

REGISTER_TYPED_TEST_SUITE_P(GroupRules, ANewGroupIsEmpty, AllocWithoutMemoryIsNull,
                            AddKeepsTheOrder, AddRefusesAnEqualElement,
                            AddRefusesANullGroupOrElement, AddWithoutMemoryChangesNothing,
                            RemOfTheOnlyElementLeavesAnEmptyGroup,
                            RemOfTheFirstOfThreeLeavesTheOthers,
                            RemOfTheMiddleOfThreeJoinsItsNeighbours,
                            RemOfTheLastOfThreeLeavesTheOthers, RemOfAnAbsentElementIsRefused,
                            RemRefusesANullGroupOrElement, ARemovedElementCanBeAddedAgainAtTheEnd,
                            IterRemGivesTheNodeToGoOnFrom, IterRemOfTheLastNodeGivesNull,
                            ANullIteratorStandsNowhere, TheIteratorOfAnEmptyOrNullGroupIsNull,
                            IteratingVisitsEveryElementInOrder, GetLinkFindsTheNodeOfAnElement,
                            GetLinkOfAnAbsentElementIsNull, GetLinkOfANullGroupOrElementIsNull,
                            FreeIgnoresNull);

} // namespace zelvo_test
