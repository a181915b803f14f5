// SPDX-License-Identifier: Apache-2.0
#include "CxPropList.h"

#include <string>

#include <gtest/gtest.h>

#include "support/Buffers.h"
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
