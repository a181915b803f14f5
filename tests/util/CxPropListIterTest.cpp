// SPDX-License-Identifier: Apache-2.0
// Walks over a property list. The iterator starts on the first entry and looks one entry ahead.
#include "CxPropList.h"

#include <string>

#include <gtest/gtest.h>

#include "support/Buffers.h"
#include "support/FailAlloc.h"

namespace zelvo_test {
namespace {

class CxPropListIterTest : public testing::Test {
protected:
    /// Fills the list with COUNT entries a=1, b=2 ...
    CxPropListIter walk(int count)
    {
        for (int i = 0; i < count; ++i)
            CxPropListPutStr(&list, std::string(1, static_cast<char>('a' + i)).c_str(),
                             std::to_string(i + 1).c_str());
        return CxPropListIterator(&list);
    }

    Props list;
};

TEST_F(CxPropListIterTest, StartsOnTheFirstEntry)
{
    CxPropListIter iterator = walk(2);
    EXPECT_EQ(iterator.list, &list);
    EXPECT_EQ(iterator.index, 0);
    EXPECT_STREQ(CxPropListIterPeekKey(&iterator), "a");
    EXPECT_STREQ(CxPropListIterPeekVal(&iterator), "1");
}

TEST_F(CxPropListIterTest, AOneEntryListHasAKeyAndNoNext)
{
    CxPropListIter iterator = walk(1);
    EXPECT_STREQ(CxPropListIterPeekKey(&iterator), "a");
    EXPECT_EQ(CxPropListIterHasNext(&iterator), 0);
}

TEST_F(CxPropListIterTest, AnEmptyListHasNeitherKeyNorNext)
{
    CxPropListIter iterator = walk(0);
    EXPECT_EQ(CxPropListIterHasNext(&iterator), 0);
    EXPECT_EQ(CxPropListIterPeekKey(&iterator), nullptr);
    EXPECT_EQ(CxPropListIterPeekVal(&iterator), nullptr);
    EXPECT_EQ(CxPropListIterCopyKey(&iterator), nullptr);
    EXPECT_EQ(CxPropListIterCopyVal(&iterator), nullptr);
}

TEST_F(CxPropListIterTest, AFullWalkReadsFirstAndThenAdvances)
{
    CxPropListIter iterator = walk(3);
    std::string seen = CxPropListIterPeekKey(&iterator);
    while (CxPropListIterHasNext(&iterator)) {
        CxPropListIterNext(&iterator);
        seen += CxPropListIterPeekKey(&iterator);
        seen += CxPropListIterPeekVal(&iterator);
    }
    EXPECT_EQ(seen, "ab2c3");
    EXPECT_EQ(iterator.index, 2);
}

TEST_F(CxPropListIterTest, AdvancingBehindTheLastEntryExhaustsIt)
{
    CxPropListIter iterator = walk(1);
    CxPropListIterNext(&iterator);
    EXPECT_EQ(iterator.list, nullptr);
    EXPECT_EQ(iterator.index, 0);
    EXPECT_EQ(CxPropListIterHasNext(&iterator), 0);
    EXPECT_EQ(CxPropListIterPeekKey(&iterator), nullptr);
}

TEST_F(CxPropListIterTest, AdvancingAnExhaustedIteratorKeepsItExhausted)
{
    CxPropListIter iterator{nullptr, 0};
    CxPropListIterNext(&iterator);
    EXPECT_EQ(iterator.list, nullptr);
    EXPECT_EQ(iterator.index, 0);
}

TEST_F(CxPropListIterTest, ANegativeIndexIsNoPosition)
{
    walk(2);
    CxPropListIter iterator{&list, -1};
    EXPECT_EQ(CxPropListIterHasNext(&iterator), 0);
    EXPECT_EQ(CxPropListIterPeekKey(&iterator), nullptr);
    CxPropListIterNext(&iterator);
    EXPECT_EQ(iterator.list, &list);
    EXPECT_EQ(iterator.index, -1);
}

TEST_F(CxPropListIterTest, AnIndexBehindTheListIsNoPosition)
{
    walk(2);
    CxPropListIter iterator{&list, 2};
    EXPECT_EQ(CxPropListIterHasNext(&iterator), 0);
    EXPECT_EQ(CxPropListIterPeekKey(&iterator), nullptr);
    EXPECT_EQ(CxPropListIterPeekVal(&iterator), nullptr);
}

TEST_F(CxPropListIterTest, TheGreatestIndexHasNoNext)
{
    walk(2);
    CxPropListIter iterator{&list, INT32_MAX};
    EXPECT_EQ(CxPropListIterHasNext(&iterator), 0);
    CxPropListIterNext(&iterator);
    EXPECT_EQ(iterator.list, nullptr);
    EXPECT_EQ(iterator.index, 0);
}

TEST_F(CxPropListIterTest, PeekLendsAndCopyGivesAStringOfItsOwn)
{
    CxPropListIter iterator = walk(1);
    EXPECT_EQ(CxPropListIterPeekKey(&iterator), list.entries[0].key);
    EXPECT_EQ(CxPropListIterPeekVal(&iterator), list.entries[0].value);
    char *key = CxPropListIterCopyKey(&iterator);
    char *value = CxPropListIterCopyVal(&iterator);
    EXPECT_NE(key, list.entries[0].key);
    EXPECT_NE(value, list.entries[0].value);
    EXPECT_EQ(taken(key), "a");
    EXPECT_EQ(taken(value), "1");
}

TEST_F(CxPropListIterTest, CopiesWithoutMemoryAreNull)
{
    CxPropListIter iterator = walk(1);
    FailAlloc fail(0);
    EXPECT_EQ(CxPropListIterCopyKey(&iterator), nullptr);
    EXPECT_EQ(CxPropListIterCopyVal(&iterator), nullptr);
}

TEST_F(CxPropListIterTest, ANullListGivesAnIteratorOverNothing)
{
    CxPropListIter iterator = CxPropListIterator(nullptr);
    EXPECT_EQ(iterator.list, nullptr);
    EXPECT_EQ(iterator.index, 0);
    EXPECT_EQ(CxPropListIterHasNext(&iterator), 0);
}

TEST_F(CxPropListIterTest, EveryCallTakesANullIterator)
{
    EXPECT_EQ(CxPropListIterHasNext(nullptr), 0);
    CxPropListIterNext(nullptr);
    EXPECT_EQ(CxPropListIterPeekKey(nullptr), nullptr);
    EXPECT_EQ(CxPropListIterPeekVal(nullptr), nullptr);
    EXPECT_EQ(CxPropListIterCopyKey(nullptr), nullptr);
    EXPECT_EQ(CxPropListIterCopyVal(nullptr), nullptr);
}

} // namespace
} // namespace zelvo_test
