// SPDX-License-Identifier: Apache-2.0
#include "ZlvListenerGroup.h"

#include "support/PublicGroupRules.h"

namespace zelvo_test {
namespace {

struct PublicListenerGroup : ObjectElements {
    ZELVO_GROUP_CALLS(Zlv, ListenerGroup)
    using Scope = NoMutex;
};
struct InternalListenerGroup : ObjectElements {
    ZELVO_GROUP_CALLS(zlvIntl, ListenerGroup)
    using Scope = HeldMutex;
};

using BothForms = testing::Types<PublicListenerGroup, InternalListenerGroup>;
using PublicForm = testing::Types<PublicListenerGroup>;
INSTANTIATE_TYPED_TEST_SUITE_P(ListenerGroup, GroupRules, BothForms);
INSTANTIATE_TYPED_TEST_SUITE_P(ListenerGroup, PublicGroupRules, PublicForm);

template <class F>
class ListenerGroupRules : public GroupFixture<F> {
};
TYPED_TEST_SUITE(ListenerGroupRules, BothForms);

TYPED_TEST(ListenerGroupRules, AddTakesOneReferenceAndRemGivesItBack)
{
    this->add("a");
    EXPECT_EQ(this->family.references('a'), 1U);
    TypeParam::rem(this->group, this->give('a'));
    EXPECT_EQ(this->family.references('a'), 0U);
}

TYPED_TEST(ListenerGroupRules, ARefusedAddTakesNoReference)
{
    this->add("a");
    EXPECT_EQ(TypeParam::add(this->group, this->give('a')), 0);
    EXPECT_EQ(TypeParam::add(nullptr, this->give('a')), 0);
    EXPECT_EQ(this->family.references('a'), 1U);
}

TYPED_TEST(ListenerGroupRules, AnAddWithoutMemoryTakesNoReference)
{
    FailAlloc fail(0);
    EXPECT_EQ(TypeParam::add(this->group, this->give('a')), 0);
    EXPECT_EQ(this->family.references('a'), 0U);
}

TYPED_TEST(ListenerGroupRules, ElementsAreTheObjectsThemselves)
{
    this->add("ab");
    EXPECT_EQ(this->group->first->element, this->give('a'));
    EXPECT_EQ(this->group->last->element, this->give('b'));
}

TYPED_TEST(ListenerGroupRules, IterGetHandsOutAReference)
{
    this->add("a");
    auto *object = TypeParam::get(this->group->first);
    EXPECT_EQ(object, this->give('a'));
    EXPECT_EQ(this->family.references('a'), 2U);
    this->family.letGo(object);
}

TYPED_TEST(ListenerGroupRules, IterRemGivesTheReferenceBack)
{
    this->add("ab");
    TypeParam::iterRem(this->group->first);
    EXPECT_EQ(this->family.references('a'), 0U);
    EXPECT_EQ(this->family.references('b'), 1U);
}

TYPED_TEST(ListenerGroupRules, FreeGivesEveryReferenceBack)
{
    auto *other = TypeParam::alloc();
    TypeParam::add(other, this->give('a'));
    TypeParam::add(other, this->give('b'));
    TypeParam::free(other);
    EXPECT_EQ(this->family.references('a'), 0U);
    EXPECT_EQ(this->family.references('b'), 0U);
}

} // namespace
} // namespace zelvo_test
