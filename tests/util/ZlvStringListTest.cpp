// SPDX-License-Identifier: Apache-2.0
#include "ZlvStringList.h"

#include "support/PublicListRules.h"
#include "support/Text.h"

namespace zelvo_test {
namespace {

struct PublicStringList : StringElements {
    ZELVO_LIST_CALLS(Zlv, StringList)
    using Scope = NoMutex;
};
struct InternalStringList : StringElements {
    ZELVO_LIST_CALLS(zlvIntl, StringList)
    using Scope = HeldMutex;
};

using BothForms = testing::Types<PublicStringList, InternalStringList>;
INSTANTIATE_TYPED_TEST_SUITE_P(StringList, ListRules, BothForms);
INSTANTIATE_TYPED_TEST_SUITE_P(StringList, ListWalkRules, BothForms);
using PublicForm = testing::Types<PublicStringList>;
INSTANTIATE_TYPED_TEST_SUITE_P(StringList, PublicListRules, PublicForm);

class StringListTest : public testing::Test {
protected:
    ~StringListTest() override { ZlvFreeStringList(list); }

    StringList *list = ZlvAllocStringList();
};

TEST_F(StringListTest, UpperAndLowerCaseAreDifferentElements)
{
    ZlvStringListAppend(list, "Name");
    EXPECT_EQ(ZlvStringListGetLink(list, "name"), nullptr);
    EXPECT_EQ(ZlvStringListGetLink(list, "Name"), list->first);
}

TEST_F(StringListTest, TheEmptyStringIsAnElement)
{
    EXPECT_EQ(ZlvStringListAppend(list, ""), 1);
    EXPECT_EQ(taken(ZlvStringListIterGet(ZlvStringListIterator(list))), "");
}

TEST_F(StringListTest, AppendedTextIsIndependentOfTheCallers)
{
    char text[] = "before";
    ZlvStringListAppend(list, text);
    text[0] = 'B';
    EXPECT_STREQ(ZlvStringListGetIndex(list, 0), "before");
}

TEST_F(StringListTest, ThePublicAndTheInternalFormWorkOnTheSameList)
{
    ZlvStringListAppend(list, "a");
    {
        HeldMutex held;
        EXPECT_EQ(zlvIntlStringListAppend(list, "b"), 1);
    }
    EXPECT_STREQ(ZlvStringListGetIndex(list, 1), "b");
}

} // namespace
} // namespace zelvo_test
