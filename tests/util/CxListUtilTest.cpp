// SPDX-License-Identifier: Apache-2.0
#include "CxListUtil.h"

#include <cstdint>

#include <gtest/gtest.h>

#include "CxMemory.h"
#include "support/FailAlloc.h"

namespace zelvo_test {
namespace {

// The three variables a caller keeps for one array.
class CxListUtil : public testing::Test {
protected:
    ~CxListUtil() override { RkoMemoryFree(array); }

    bool ensure(uint32_t needed)
    {
        return CxListEnsureCapacity(&array, &capacity, &length, needed, sizeof *array) == 1;
    }

    int64_t *array = nullptr;
    uint32_t capacity = 0;
    uint32_t length = 0;
};

TEST_F(CxListUtil, ANullArrayIsAllocatedWithExactlyTheNeededRoom)
{
    length = 7;
    ASSERT_TRUE(ensure(20));
    EXPECT_EQ(capacity, 20U);
    EXPECT_EQ(length, 0U);
    for (int i = 0; i < 20; ++i)
        array[i] = i;
    EXPECT_EQ(array[19], 19);
}

TEST_F(CxListUtil, ANeedOfNothingFailsForANullArray)
{
    EXPECT_FALSE(ensure(0));
    EXPECT_EQ(array, nullptr);
}

TEST_F(CxListUtil, ANeedOfNothingIsMetByAnArray)
{
    ASSERT_TRUE(ensure(3));
    EXPECT_TRUE(ensure(0));
    EXPECT_EQ(capacity, 3U);
}

TEST_F(CxListUtil, EnoughRoomIsLeftAlone)
{
    ASSERT_TRUE(ensure(20));
    length = 20;
    const int64_t *before = array;
    EXPECT_TRUE(ensure(20));
    EXPECT_EQ(capacity, 20U);
    EXPECT_EQ(length, 20U);
    EXPECT_EQ(array, before);
}

struct Growth {
    uint32_t first, needed, capacity;
};

// Growth goes to the smallest of 16, 32, 64 ... that exceeds the need.
class CxListGrowth : public CxListUtil, public testing::WithParamInterface<Growth> {};

TEST_P(CxListGrowth, GoesToTheSmallestPowerOfTwoFrom16ThatExceedsTheNeed)
{
    ASSERT_TRUE(ensure(GetParam().first));
    EXPECT_TRUE(ensure(GetParam().needed));
    EXPECT_EQ(capacity, GetParam().capacity);
}

INSTANTIATE_TEST_SUITE_P(Needs, CxListGrowth,
                         testing::Values(Growth{1, 2, 16}, Growth{1, 15, 16}, Growth{1, 16, 32},
                                         Growth{1, 17, 32}, Growth{20, 21, 32}, Growth{20, 31, 32},
                                         Growth{20, 32, 64}, Growth{20, 63, 64},
                                         Growth{20, 64, 128}, Growth{20, 1000, 1024}),
                         [](const auto &row) {
                             return std::to_string(row.param.first) + "To" +
                                    std::to_string(row.param.needed);
                         });

TEST_F(CxListUtil, GrowthKeepsElementsAndLength)
{
    ASSERT_TRUE(ensure(2));
    array[0] = 11;
    array[1] = 22;
    length = 2;
    ASSERT_TRUE(ensure(40));
    EXPECT_EQ(array[0], 11);
    EXPECT_EQ(array[1], 22);
    EXPECT_EQ(length, 2U);
    array[63] = 1;
    EXPECT_EQ(array[63], 1);
}

TEST_F(CxListUtil, AFailedGrowthKeepsTheOldArray)
{
    ASSERT_TRUE(ensure(2));
    array[1] = 22;
    const int64_t *before = array;
    FailAlloc fail(0);
    EXPECT_FALSE(ensure(40));
    EXPECT_EQ(fail.failed(), 1U);
    EXPECT_EQ(array, before);
    EXPECT_EQ(array[1], 22);
    EXPECT_EQ(capacity, 2U);
}

TEST_F(CxListUtil, AFailedFirstAllocationIsReported)
{
    FailAlloc fail(0);
    EXPECT_FALSE(ensure(4));
    EXPECT_EQ(fail.failed(), 1U);
    EXPECT_EQ(array, nullptr);
}

TEST_F(CxListUtil, EnsureRefusesANullArraySlot)
{
    EXPECT_EQ(CxListEnsureCapacity(nullptr, &capacity, &length, 4, sizeof *array), 0);
}

TEST_F(CxListUtil, EnsureRefusesANullCapacitySlot)
{
    EXPECT_EQ(CxListEnsureCapacity(&array, nullptr, &length, 4, sizeof *array), 0);
    EXPECT_EQ(array, nullptr);
}

TEST_F(CxListUtil, EnsureRefusesANullLengthSlot)
{
    EXPECT_EQ(CxListEnsureCapacity(&array, &capacity, nullptr, 4, sizeof *array), 0);
    EXPECT_EQ(array, nullptr);
}

TEST_F(CxListUtil, DiscardFreesTheArrayAndZeroesAllThree)
{
    ASSERT_TRUE(ensure(4));
    length = 3;
    CxListDiscard(&array, &capacity, &length);
    EXPECT_EQ(array, nullptr);
    EXPECT_EQ(capacity, 0U);
    EXPECT_EQ(length, 0U);
}

TEST_F(CxListUtil, DiscardOfANullArrayZeroesTheNumbers)
{
    capacity = 4;
    length = 3;
    CxListDiscard(&array, &capacity, &length);
    EXPECT_EQ(capacity, 0U);
    EXPECT_EQ(length, 0U);
}

TEST_F(CxListUtil, DiscardDoesNothingWithoutAllThreeSlots)
{
    ASSERT_TRUE(ensure(4));
    length = 3;
    CxListDiscard(nullptr, &capacity, &length);
    CxListDiscard(&array, nullptr, &length);
    CxListDiscard(&array, &capacity, nullptr);
    EXPECT_NE(array, nullptr);
    EXPECT_EQ(capacity, 4U);
    EXPECT_EQ(length, 3U);
}

} // namespace
} // namespace zelvo_test
