// SPDX-License-Identifier: Apache-2.0
#include "CxPropList.h"

#include <string>

#include <gtest/gtest.h>

#include "support/Buffers.h"
#include "support/FailAlloc.h"
#include "support/TestDir.h"

namespace zelvo_test {
namespace {

// A list of a=1 b=2 c=3.
class CxPropListOfThree : public testing::Test {
protected:
    CxPropListOfThree()
    {
        CxPropListPutStr(&list, "a", "1");
        CxPropListPutStr(&list, "b", "2");
        CxPropListPutStr(&list, "c", "3");
    }

    Props list;
    ZlvBool found = 7;
};

TEST_F(CxPropListOfThree, KeepsTheOrderOfInsertion)
{
    EXPECT_EQ(list.count, 3);
    EXPECT_EQ(list.all(), "a=1 b=2 c=3");
}

TEST_F(CxPropListOfThree, APutOfAKnownKeyReplacesTheValueInItsPlace)
{
    EXPECT_EQ(CxPropListPutStr(&list, "b", "two"), 1);
    EXPECT_EQ(list.all(), "a=1 b=two c=3");
}

TEST_F(CxPropListOfThree, AValueCanBeReplacedByItsOwnStoredText)
{
    EXPECT_EQ(CxPropListPutStr(&list, "b", CxPropListPeekStr(&list, "b", nullptr)), 1);
    EXPECT_EQ(list.all(), "a=1 b=2 c=3");
}

TEST_F(CxPropListOfThree, KeysAreComparedExactly)
{
    EXPECT_EQ(CxPropListHasKey(&list, "A"), 0);
    EXPECT_EQ(CxPropListHasKey(&list, "a "), 0);
    EXPECT_EQ(CxPropListHasKey(&list, ""), 0);
    EXPECT_EQ(CxPropListHasKey(&list, "a"), 1);
    EXPECT_EQ(CxPropListHasKey(&list, "c"), 1);
}

TEST_F(CxPropListOfThree, PeekLendsTheStoredValue)
{
    EXPECT_EQ(CxPropListPeekStr(&list, "b", &found), list.entries[1].value);
    EXPECT_EQ(found, 1);
}

TEST_F(CxPropListOfThree, PeekOfAnAbsentKeyIsNullAndClearsTheFlag)
{
    EXPECT_EQ(CxPropListPeekStr(&list, "x", &found), nullptr);
    EXPECT_EQ(found, 0);
}

TEST_F(CxPropListOfThree, CopyGivesAStringOfItsOwn)
{
    char *copy = CxPropListCopyStr(&list, "b", &found);
    EXPECT_NE(copy, list.entries[1].value);
    EXPECT_EQ(taken(copy), "2");
    EXPECT_EQ(found, 1);
}

TEST_F(CxPropListOfThree, CopyOfAnAbsentKeyIsNullAndClearsTheFlag)
{
    EXPECT_EQ(CxPropListCopyStr(&list, "x", &found), nullptr);
    EXPECT_EQ(found, 0);
}

TEST_F(CxPropListOfThree, TheFoundFlagMayBeNull)
{
    EXPECT_STREQ(CxPropListPeekStr(&list, "a", nullptr), "1");
    EXPECT_EQ(CxPropListPeekStr(&list, "x", nullptr), nullptr);
    EXPECT_EQ(taken(CxPropListCopyStr(&list, "a", nullptr)), "1");
    EXPECT_EQ(CxPropListCopyStr(&list, "x", nullptr), nullptr);
}

TEST_F(CxPropListOfThree, RemovingTheFirstMovesTheLastIntoItsPlace)
{
    EXPECT_EQ(CxPropListRemove(&list, "a"), 1);
    EXPECT_EQ(list.all(), "c=3 b=2");
    EXPECT_EQ(list.entries[2].key, nullptr);
    EXPECT_EQ(list.entries[2].value, nullptr);
}

TEST_F(CxPropListOfThree, RemovingTheLastMovesNothing)
{
    EXPECT_EQ(CxPropListRemove(&list, "c"), 1);
    EXPECT_EQ(list.all(), "a=1 b=2");
    EXPECT_EQ(list.entries[2].key, nullptr);
    EXPECT_EQ(list.entries[2].value, nullptr);
}

TEST_F(CxPropListOfThree, RemovingAnAbsentKeyIsFalse)
{
    EXPECT_EQ(CxPropListRemove(&list, "x"), 0);
    EXPECT_EQ(list.all(), "a=1 b=2 c=3");
}

TEST_F(CxPropListOfThree, ARemovedKeyCanBePutAgain)
{
    EXPECT_EQ(CxPropListRemove(&list, "a"), 1);
    EXPECT_EQ(CxPropListPutStr(&list, "a", "9"), 1);
    EXPECT_EQ(list.all(), "c=3 b=2 a=9");
}

TEST_F(CxPropListOfThree, DiscardZeroesEverything)
{
    CxPropListDiscard(&list);
    EXPECT_EQ(list.count, 0);
    EXPECT_EQ(list.capacity, 0);
    EXPECT_EQ(list.entries, nullptr);
}

TEST_F(CxPropListOfThree, PutRefusesNulls)
{
    EXPECT_EQ(CxPropListPutStr(nullptr, "a", "1"), 0);
    EXPECT_EQ(CxPropListPutStr(&list, nullptr, "1"), 0);
    EXPECT_EQ(CxPropListPutStr(&list, "a", nullptr), 0);
    EXPECT_EQ(CxPropListPutStr(&list, "d", nullptr), 0);
    EXPECT_EQ(list.all(), "a=1 b=2 c=3");
}

TEST_F(CxPropListOfThree, ANullKeyIsNeverPresent)
{
    EXPECT_EQ(CxPropListHasKey(&list, nullptr), 0);
    EXPECT_EQ(CxPropListPeekStr(&list, nullptr, &found), nullptr);
    EXPECT_EQ(found, 0);
    found = 7;
    EXPECT_EQ(CxPropListCopyStr(&list, nullptr, &found), nullptr);
    EXPECT_EQ(found, 0);
    EXPECT_EQ(CxPropListRemove(&list, nullptr), 0);
    EXPECT_EQ(list.count, 3);
}

TEST(CxPropList, EveryCallTakesANullList)
{
    ZlvBool found = 7;
    EXPECT_EQ(cxPropListHasCapacity(nullptr, 1), 0);
    EXPECT_EQ(CxPropListHasKey(nullptr, "a"), 0);
    EXPECT_EQ(CxPropListPeekStr(nullptr, "a", &found), nullptr);
    EXPECT_EQ(found, 0);
    found = 7;
    EXPECT_EQ(CxPropListCopyStr(nullptr, "a", &found), nullptr);
    EXPECT_EQ(found, 0);
    EXPECT_EQ(CxPropListRemove(nullptr, "a"), 0);
    CxPropListDiscard(nullptr);
}

TEST(CxPropList, EmptyStringsAreKeysAndValuesToo)
{
    Props list;
    EXPECT_EQ(CxPropListPutStr(&list, "", ""), 1);
    EXPECT_EQ(CxPropListHasKey(&list, ""), 1);
    EXPECT_EQ(list.value(""), "");
}

TEST(CxPropList, ThePutStringsAreCopied)
{
    Props list;
    char key[] = "k", value[] = "v";
    EXPECT_EQ(CxPropListPutStr(&list, key, value), 1);
    key[0] = value[0] = 'x';
    EXPECT_EQ(list.all(), "k=v");
}

TEST(CxPropList, AnEmptyListHasNothing)
{
    Props list;
    EXPECT_EQ(CxPropListHasKey(&list, "a"), 0);
    EXPECT_EQ(CxPropListRemove(&list, "a"), 0);
    CxPropListDiscard(&list);
    EXPECT_EQ(list.entries, nullptr);
}

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

class CxPropListReadTest : public TestDir {
protected:
    Props list;
    CxStatus error{'x', -7};
};

TEST_F(CxPropListReadTest, FillsTheListFromAFile)
{
    EXPECT_EQ(CxPropListRead(write("p", "a=1\nb=2\n").c_str(), &list, &error), 1);
    EXPECT_EQ(list.all(), "a=1 b=2");
}

TEST_F(CxPropListReadTest, AddsToWhatTheListHolds)
{
    CxPropListPutStr(&list, "b", "old");
    CxPropListPutStr(&list, "z", "kept");
    EXPECT_EQ(CxPropListRead(write("p", "a=1\nb=2\n").c_str(), &list, &error), 1);
    EXPECT_EQ(list.all(), "b=2 z=kept a=1");
}

TEST_F(CxPropListReadTest, RefusesANullListWithoutTouchingTheErrorRecord)
{
    EXPECT_EQ(CxPropListRead(write("p", "a=1\n").c_str(), nullptr, &error), 0);
    EXPECT_EQ(error.type, 'x');
    EXPECT_EQ(error.code, -7);
}

TEST_F(CxPropListReadTest, ReportsAFileThatCannotBeOpened)
{
    EXPECT_EQ(CxPropListRead("missing", &list, &error), 0);
    EXPECT_EQ(error.type, 'p');
    EXPECT_EQ(error.code, ENOENT);
}

TEST_F(CxPropListReadTest, ReportsANullFileNameAsAMissingArgument)
{
    EXPECT_EQ(CxPropListRead(nullptr, &list, &error), 0);
    EXPECT_EQ(error.type, 'p');
    EXPECT_EQ(error.code, EINVAL);
}

TEST_F(CxPropListReadTest, TakesANullErrorRecord)
{
    EXPECT_EQ(CxPropListRead("missing", &list, nullptr), 0);
    EXPECT_EQ(CxPropListRead(write("p", "a=1\n").c_str(), &list, nullptr), 1);
    EXPECT_EQ(list.all(), "a=1");
}

} // namespace
} // namespace zelvo_test
