// SPDX-License-Identifier: Apache-2.0
// Storage of a property list: growth, and what stays when memory runs out.
#include "CxPropList.h"

#include <string>

#include <gtest/gtest.h>

#include "support/Buffers.h"
#include "support/FailAlloc.h"

namespace zelvo_test {
namespace {

TEST(CxPropListGrowth, TheFirstPutAllocates32Entries)
{
    Props list;
    EXPECT_EQ(CxPropListPutStr(&list, "a", "1"), 1);
    EXPECT_EQ(list.capacity, 32);
}

TEST(CxPropListGrowth, OneEntryIsKeptFree)
{
    Props list;
    for (int i = 0; i < 31; ++i)
        ASSERT_EQ(CxPropListPutStr(&list, std::to_string(i).c_str(), "v"), 1);
    EXPECT_EQ(list.capacity, 32);
    ASSERT_EQ(CxPropListPutStr(&list, "31", "v"), 1); // needs 31 + 1 + 1 = 33
    EXPECT_EQ(list.capacity, 64);
    EXPECT_EQ(list.count, 32);
    EXPECT_STREQ(list.entries[0].key, "0");
    EXPECT_STREQ(list.entries[31].key, "31");
}

TEST(CxPropListGrowth, DoublesUntilItExceedsTheNeed)
{
    Props exact, above;
    EXPECT_EQ(cxPropListHasCapacity(&exact, 31), 1); // needs 32, which 32 meets
    EXPECT_EQ(exact.capacity, 32);
    EXPECT_EQ(cxPropListHasCapacity(&exact, 63), 1); // needs 64, which 64 does not exceed
    EXPECT_EQ(exact.capacity, 128);
    EXPECT_EQ(cxPropListHasCapacity(&above, 62), 1);
    EXPECT_EQ(above.capacity, 64);
    EXPECT_EQ(above.count, 0);
}

TEST(CxPropListFailure, AFailedFirstAllocationLeavesTheListEmpty)
{
    Props list;
    FailAlloc fail(0);
    EXPECT_EQ(CxPropListPutStr(&list, "a", "1"), 0);
    EXPECT_EQ(list.count, 0);
    EXPECT_EQ(list.capacity, 0);
    EXPECT_EQ(list.entries, nullptr);
}

TEST(CxPropListFailure, AFailedGrowthLeavesTheListAsItWas)
{
    Props list;
    for (int i = 0; i < 31; ++i)
        ASSERT_EQ(CxPropListPutStr(&list, std::to_string(i).c_str(), "v"), 1);
    const std::string before = list.all();
    FailAlloc fail(0, FailAlloc::Once);
    EXPECT_EQ(CxPropListPutStr(&list, "x", "v"), 0);
    EXPECT_EQ(list.capacity, 32);
    EXPECT_EQ(list.all(), before);
}

// Allocation 0 of a put into a list with room copies the value, allocation 1 a new key.
class CxPropListHalfAdded : public testing::TestWithParam<uint32_t> {};

TEST_P(CxPropListHalfAdded, AFailedCopyLeavesAnEmptySlotThatSearchesSkip)
{
    Props list;
    ASSERT_EQ(CxPropListPutStr(&list, "a", "1"), 1);
    {
        FailAlloc fail(GetParam(), FailAlloc::Once);
        EXPECT_EQ(CxPropListPutStr(&list, "b", "2"), 0);
        EXPECT_EQ(fail.failed(), 1U);
    }
    EXPECT_EQ(list.count, 2);
    EXPECT_EQ(list.entries[1].key, nullptr);
    EXPECT_EQ(list.entries[1].value, nullptr);
    EXPECT_EQ(CxPropListHasKey(&list, "b"), 0);
    EXPECT_EQ(CxPropListHasKey(&list, nullptr), 0);
    EXPECT_EQ(CxPropListPutStr(&list, "b", "3"), 1);
    EXPECT_EQ(list.count, 3);
    EXPECT_EQ(list.value("b"), "3");
}

INSTANTIATE_TEST_SUITE_P(ValueThenKey, CxPropListHalfAdded, testing::Values(0U, 1U));

TEST(CxPropListFailure, AFailedCopyKeepsTheOldValueOfAKnownKey)
{
    Props list;
    ASSERT_EQ(CxPropListPutStr(&list, "a", "1"), 1);
    FailAlloc fail(0);
    EXPECT_EQ(CxPropListPutStr(&list, "a", "2"), 0);
    EXPECT_EQ(list.all(), "a=1");
}

TEST(CxPropListFailure, ACopyWithoutMemoryIsNullAndStillFound)
{
    Props list;
    ZlvBool found = 7;
    ASSERT_EQ(CxPropListPutStr(&list, "a", "1"), 1);
    FailAlloc fail(0);
    EXPECT_EQ(CxPropListCopyStr(&list, "a", &found), nullptr);
    EXPECT_EQ(found, 1);
}

} // namespace
} // namespace zelvo_test
