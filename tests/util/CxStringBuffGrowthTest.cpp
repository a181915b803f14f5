// SPDX-License-Identifier: Apache-2.0
// Storage of a byte buffer: growth, packing, and what stays when memory runs out.
#include "CxStringBuff.h"

#include <string>

#include <gtest/gtest.h>

#include "support/Buffers.h"
#include "support/FailAlloc.h"

namespace zelvo_test {
namespace {

TEST(CxStringBuff, TheFirstAppendAllocates1024Bytes)
{
    Buff buff;
    EXPECT_EQ(CxStringBuffAppendChar(&buff, 'a'), 1);
    EXPECT_EQ(buff.capacity, 1024U);
    EXPECT_EQ(buff.length, 1U);
    EXPECT_STREQ(buff.data, "a");
}

TEST(CxStringBuff, The1023rdByteFitsTheFirstStorage)
{
    Buff buff;
    ASSERT_EQ(CxStringBuffAppendStr(&buff, std::string(1023, 'x').c_str()), 1);
    EXPECT_EQ(buff.capacity, 1024U);
    EXPECT_TRUE(buff.terminated());
}

TEST(CxStringBuff, The1024thByteDoublesTheStorage)
{
    Buff buff(std::string(1023, 'x').c_str());
    ASSERT_EQ(CxStringBuffAppendChar(&buff, 'y'), 1);
    EXPECT_EQ(buff.capacity, 2048U);
    EXPECT_EQ(buff.text(), std::string(1023, 'x').append("y"));
    EXPECT_TRUE(buff.terminated());
}

TEST(CxStringBuff, GrowthDoublesUntilItExceedsTheNeed)
{
    Buff exact("a"), above("a");
    ASSERT_EQ(CxStringBuffAppendStr(&exact, std::string(2046, 'x').c_str()), 1); // needs 2048
    EXPECT_EQ(exact.capacity, 4096U);
    ASSERT_EQ(CxStringBuffAppendStr(&above, std::string(2045, 'x').c_str()), 1); // needs 2047
    EXPECT_EQ(above.capacity, 2048U);
}

TEST(CxStringBuff, HasCapacityAllocatesAnEmptyText)
{
    Buff buff;
    EXPECT_EQ(cxStringBuffHasCapacity(&buff, 0), 1);
    EXPECT_EQ(buff.capacity, 1024U);
    EXPECT_EQ(buff.length, 0U);
    EXPECT_STREQ(buff.data, "");
}

TEST(CxStringBuff, HasCapacityGrowsRightAfterTheFirstAllocation)
{
    Buff buff;
    EXPECT_EQ(cxStringBuffHasCapacity(&buff, 5000), 1);
    EXPECT_EQ(buff.capacity, 8192U);
    EXPECT_EQ(buff.length, 0U);
}

TEST(CxStringBuff, HasCapacityLeavesEnoughRoomAlone)
{
    Buff buff("abc");
    const char *before = buff.data;
    EXPECT_EQ(cxStringBuffHasCapacity(&buff, 1020), 1);
    EXPECT_EQ(buff.capacity, 1024U);
    EXPECT_EQ(buff.data, before);
}

TEST(CxStringBuff, HasCapacityRefusesANeedThatNoBufferCanHold)
{
    Buff buff("abc");
    EXPECT_EQ(cxStringBuffHasCapacity(&buff, UINT32_MAX - 2), 0);
    EXPECT_EQ(buff.capacity, 1024U);
    EXPECT_EQ(buff.text(), "abc");
}

TEST(CxStringBuff, PackTrimsTheStorageToTheText)
{
    Buff buff("abc");
    EXPECT_EQ(CxStringBuffPack(&buff), 1);
    EXPECT_EQ(buff.capacity, 4U);
    EXPECT_EQ(buff.text(), "abc");
    EXPECT_TRUE(buff.terminated());
}

TEST(CxStringBuff, PackOfAPackedBufferIsFalseAndChangesNothing)
{
    Buff buff("abc");
    ASSERT_EQ(CxStringBuffPack(&buff), 1);
    const char *storage = buff.data;
    EXPECT_EQ(CxStringBuffPack(&buff), 0);
    EXPECT_EQ(buff.data, storage);
    EXPECT_EQ(buff.capacity, 4U);
    EXPECT_EQ(buff.text(), "abc");
}

TEST(CxStringBuff, PackOfAnEmptyTextDiscardsTheStorage)
{
    Buff buff("abc");
    CxStringBuffRestart(&buff);
    EXPECT_EQ(CxStringBuffPack(&buff), 1);
    EXPECT_EQ(buff.data, nullptr);
    EXPECT_EQ(buff.capacity, 0U);
}

TEST(CxStringBuff, PackOfAFreshBufferIsTrue)
{
    Buff buff;
    EXPECT_EQ(CxStringBuffPack(&buff), 1);
    EXPECT_EQ(buff.data, nullptr);
}

TEST(CxStringBuff, APackedBufferGrowsByDoublingItsSize)
{
    Buff buff("abc");
    ASSERT_EQ(CxStringBuffPack(&buff), 1);
    EXPECT_EQ(CxStringBuffAppendStr(&buff, "defgh"), 1); // needs 9: 4, 8, 16
    EXPECT_EQ(buff.capacity, 16U);
    EXPECT_EQ(buff.text(), "abcdefgh");
}

TEST(CxStringBuffFailure, AFailedFirstAllocationLeavesTheBufferEmpty)
{
    Buff buff;
    FailAlloc fail(0);
    EXPECT_EQ(CxStringBuffAppendChar(&buff, 'a'), 0);
    EXPECT_EQ(CxStringBuffAppendStr(&buff, "a"), 0);
    EXPECT_EQ(CxStringBuffAppendStrN(&buff, "a", 1), 0);
    EXPECT_EQ(CxStringBuffInsertStr(&buff, "a", 0), 0);
    EXPECT_EQ(fail.failed(), 4U);
    EXPECT_EQ(buff.data, nullptr);
    EXPECT_EQ(buff.length, 0U);
    EXPECT_EQ(buff.capacity, 0U);
}

TEST(CxStringBuffFailure, AFailedGrowthLeavesTheBufferAsItWas)
{
    const std::string full(1023, 'x');
    Buff buff(full.c_str());
    const char *storage = buff.data;
    FailAlloc fail(0);
    EXPECT_EQ(CxStringBuffAppendChar(&buff, 'a'), 0);
    EXPECT_EQ(CxStringBuffAppendStr(&buff, "a"), 0);
    EXPECT_EQ(CxStringBuffAppendStrN(&buff, "a", 1), 0);
    EXPECT_EQ(CxStringBuffInsertStr(&buff, "a", 0), 0);
    EXPECT_EQ(fail.failed(), 4U);
    EXPECT_EQ(buff.data, storage);
    EXPECT_EQ(buff.text(), full);
    EXPECT_EQ(buff.capacity, 1024U);
    EXPECT_TRUE(buff.terminated());
}

TEST(CxStringBuffFailure, AFailedPackLeavesTheBufferAsItWas)
{
    Buff buff("abc");
    FailAlloc fail(0);
    EXPECT_EQ(CxStringBuffPack(&buff), 0);
    EXPECT_EQ(fail.failed(), 1U);
    EXPECT_EQ(buff.text(), "abc");
    EXPECT_EQ(buff.capacity, 1024U);
}

TEST(CxStringBuffFailure, AFailedCopyGivesNull)
{
    Buff buff("abc");
    FailAlloc fail(0);
    EXPECT_EQ(CxStringBuffCopyStr(&buff), nullptr);
    EXPECT_EQ(buff.text(), "abc");
}

} // namespace
} // namespace zelvo_test
