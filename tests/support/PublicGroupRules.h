// SPDX-License-Identifier: Apache-2.0
// What the public form of a group family does when the API mutex cannot be taken.
#pragma once

#include "support/BrokenMutex.h"
#include "support/GroupRules.h"

namespace zelvo_test {

template <class F>
class PublicGroupRules : public GroupFixture<F> {
};
TYPED_TEST_SUITE_P(PublicGroupRules);

TYPED_TEST_P(PublicGroupRules, WithoutTheMutexAllocGivesNull)
{
    BrokenMutex broken;
    EXPECT_EQ(TypeParam::alloc(), nullptr);
}

TYPED_TEST_P(PublicGroupRules, WithoutTheMutexFreeDoesNothing)
{
    this->add("a");
    BrokenMutex broken;
    TypeParam::free(this->group);
    EXPECT_EQ(this->contents(), "a");
}

TYPED_TEST_P(PublicGroupRules, WithoutTheMutexAddAndRemAreRefused)
{
    this->add("a");
    BrokenMutex broken;
    EXPECT_EQ(TypeParam::add(this->group, this->give('b')), 0);
    EXPECT_EQ(TypeParam::rem(this->group, this->give('a')), 0);
    EXPECT_EQ(this->contents(), "a");
}

TYPED_TEST_P(PublicGroupRules, WithoutTheMutexIteratorsGiveNothing)
{
    this->add("ab");
    auto *first = this->group->first;
    BrokenMutex broken;
    EXPECT_EQ(TypeParam::iterator(this->group), nullptr);
    EXPECT_EQ(TypeParam::hasNext(first), 0);
    EXPECT_EQ(TypeParam::get(first), nullptr);
    EXPECT_EQ(TypeParam::next(first), nullptr);
}

TYPED_TEST_P(PublicGroupRules, WithoutTheMutexIterRemRemovesNothing)
{
    this->add("ab");
    BrokenMutex broken;
    EXPECT_EQ(TypeParam::iterRem(this->group->first), nullptr);
    EXPECT_EQ(this->contents(), "ab");
}

TYPED_TEST_P(PublicGroupRules, TheLinkLookupTakesNoMutex)
{
    this->add("ab");
    BrokenMutex broken;
    EXPECT_EQ(TypeParam::getLink(this->group, this->give('b')), this->group->last);
}

REGISTER_TYPED_TEST_SUITE_P(PublicGroupRules, WithoutTheMutexAllocGivesNull,
                            WithoutTheMutexFreeDoesNothing, WithoutTheMutexAddAndRemAreRefused,
                            WithoutTheMutexIteratorsGiveNothing,
                            WithoutTheMutexIterRemRemovesNothing, TheLinkLookupTakesNoMutex);

} // namespace zelvo_test
