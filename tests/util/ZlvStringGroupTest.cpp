// SPDX-License-Identifier: Apache-2.0
#include "ZlvStringGroup.h"

#include "support/PublicGroupRules.h"
#include "support/Text.h"

namespace zelvo_test {
namespace {

struct PublicStringGroup : StringElements {
    ZELVO_GROUP_CALLS(Zlv, StringGroup)
    using Scope = NoMutex;
};
struct InternalStringGroup : StringElements {
    ZELVO_GROUP_CALLS(zlvIntl, StringGroup)
    using Scope = HeldMutex;
};

using BothForms = testing::Types<PublicStringGroup, InternalStringGroup>;
using PublicForm = testing::Types<PublicStringGroup>;
INSTANTIATE_TYPED_TEST_SUITE_P(StringGroup, GroupRules, BothForms);
INSTANTIATE_TYPED_TEST_SUITE_P(StringGroup, PublicGroupRules, PublicForm);

class StringGroupTest : public testing::Test {
protected:
    ~StringGroupTest() override { ZlvFreeStringGroup(group); }

    StringGroup *group = ZlvAllocStringGroup();
};

TEST_F(StringGroupTest, AddStoresACopyOfTheText)
{
    char text[] = "before";
    ZlvStringGroupAdd(group, text);
    text[0] = 'B';
    EXPECT_STREQ(group->first->element, "before");
}

TEST_F(StringGroupTest, TextsThatDifferInCaseAreDifferent)
{
    EXPECT_EQ(ZlvStringGroupAdd(group, "x"), 1);
    EXPECT_EQ(ZlvStringGroupAdd(group, "X"), 1);
    EXPECT_EQ(ZlvStringGroupAdd(group, "x"), 0);
}

TEST_F(StringGroupTest, IterGetHandsOutANewText)
{
    ZlvStringGroupAdd(group, "x");
    char *text = ZlvStringGroupIterGet(group->first);
    EXPECT_NE(text, group->first->element);
    EXPECT_EQ(taken(text), "x");
}

TEST_F(StringGroupTest, ATextThatCannotBeCopiedIsNotAdded)
{
    FailAlloc fail(1);
    EXPECT_EQ(ZlvStringGroupAdd(group, "x"), 0);
    EXPECT_EQ(fail.failed(), 1U);
    EXPECT_EQ(group->first, nullptr);
}

TEST_F(StringGroupTest, TheStoredTextMayNameTheElementToRemove)
{
    ZlvStringGroupAdd(group, "x");
    EXPECT_EQ(ZlvStringGroupRem(group, group->first->element), 1);
    EXPECT_EQ(group->first, nullptr);
}

} // namespace
} // namespace zelvo_test
