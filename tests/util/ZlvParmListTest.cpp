// SPDX-License-Identifier: Apache-2.0
#include "ZlvParmList.h"

#include "support/PublicListRules.h"

namespace zelvo_test {
namespace {

struct PublicParmList : ParmElements {
    ZELVO_LIST_CALLS(Zlv, ParmList)
    using Scope = NoMutex;
};
struct InternalParmList : ParmElements {
    ZELVO_LIST_CALLS(zlvIntl, ParmList)
    using Scope = HeldMutex;
};

using BothForms = testing::Types<PublicParmList, InternalParmList>;
INSTANTIATE_TYPED_TEST_SUITE_P(ParmList, ListRules, BothForms);
INSTANTIATE_TYPED_TEST_SUITE_P(ParmList, ListWalkRules, BothForms);
using PublicForm = testing::Types<PublicParmList>;
INSTANTIATE_TYPED_TEST_SUITE_P(ParmList, PublicListRules, PublicForm);

class ParmListTest : public testing::Test {
protected:
    ~ParmListTest() override { ZlvFreeParmList(list); }

    ParmList *list = ZlvAllocParmList();
};

TEST_F(ParmListTest, AStringParameterIsCopiedWithItsText)
{
    char text[] = "before";
    ZlvParm parm{ZLV_PARM_STRING, {.stringValue = text}};
    ZlvParmListAppend(list, &parm);
    text[0] = 'B';
    EXPECT_STREQ(ZlvParmListGetIndex(list, 0)->value.stringValue, "before");
}

TEST_F(ParmListTest, AHandedOutStringParameterHasATextOfItsOwn)
{
    ZlvParmListAppend(list, ParmElements::give('b'));
    ZlvParm *parm = ZlvParmListIterGet(ZlvParmListIterator(list));
    EXPECT_NE(parm->value.stringValue, ZlvParmListGetIndex(list, 0)->value.stringValue);
    EXPECT_STREQ(parm->value.stringValue, "text");
    ZlvFreeParm(parm);
}

TEST_F(ParmListTest, AStringParameterWhoseTextCannotBeCopiedIsNotAppended)
{
    FailAlloc fail(2);
    EXPECT_EQ(ZlvParmListAppend(list, ParmElements::give('b')), 0);
    EXPECT_EQ(fail.failed(), 1U);
    EXPECT_EQ(list->count, 0U);
}

TEST_F(ParmListTest, GetLinkTellsEqualNumbersOfDifferentTypesApart)
{
    ZlvParm number{ZLV_PARM_INT, {.intValue = 1}};
    ZlvParm sameAsLong{ZLV_PARM_LONG, {.intValue = 1}};
    ZlvParmListAppend(list, &number);
    ZlvParmListAppend(list, &sameAsLong);
    EXPECT_EQ(ZlvParmListGetLink(list, &sameAsLong), list->last);
}

TEST_F(ParmListTest, AParameterWithAnUnknownTagIsKeptButNeverFound)
{
    ZlvParm unknown{999, {.intValue = 1}};
    EXPECT_EQ(ZlvParmListAppend(list, &unknown), 1);
    EXPECT_EQ(ZlvParmListGetIndex(list, 0)->type, 999U);
    EXPECT_EQ(ZlvParmListGetLink(list, &unknown), nullptr);
}

} // namespace
} // namespace zelvo_test
