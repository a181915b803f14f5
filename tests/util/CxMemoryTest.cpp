// SPDX-License-Identifier: Apache-2.0
#include <gtest/gtest.h>

#include <algorithm>
#include <cstdint>
#include <cstdlib>
#include <cstring>

#include "CxMemory.h"
#include "support/FakeSystem.h"

namespace zelvo_test {
namespace {

TEST(CxMemory, MallocGivesABlockOfTheSize)
{
    auto *block = static_cast<char *>(RkoMemoryMalloc(64));
    ASSERT_NE(block, nullptr);
    std::memset(block, 'x', 64);
    EXPECT_EQ(block[63], 'x');
    RkoMemoryFree(block);
}

TEST(CxMemory, MallocOfNothingGivesNull)
{
    EXPECT_EQ(RkoMemoryMalloc(0), nullptr);
}

TEST(CxMemory, MallocOfNothingDoesNotAllocate)
{
    int asked = 0;
    FakeSystem system;
    system.malloc = [&](size_t) -> void * { return ++asked, nullptr; };
    RkoMemoryMalloc(0);
    system.malloc = nullptr;
    EXPECT_EQ(asked, 0);
}

TEST(CxMemory, MallocGivesNullWhenMemoryRanOut)
{
    FakeSystem system;
    system.malloc = [](size_t) { return nullptr; };
    void *block = RkoMemoryMalloc(8);
    system.malloc = nullptr;
    EXPECT_EQ(block, nullptr);
}

TEST(CxMemory, CallocGivesZeroedMemoryForAllElements)
{
    auto *block = static_cast<char *>(RkoMemoryCalloc(7, 9));
    ASSERT_NE(block, nullptr);
    EXPECT_TRUE(std::all_of(block, block + 63, [](char c) { return c == 0; }));
    RkoMemoryFree(block);
}

TEST(CxMemory, CallocOfNoElementsGivesNull)
{
    EXPECT_EQ(RkoMemoryCalloc(0, 8), nullptr);
}

TEST(CxMemory, CallocOfElementsWithoutSizeGivesNull)
{
    EXPECT_EQ(RkoMemoryCalloc(8, 0), nullptr);
}

TEST(CxMemory, CallocGivesNullWhenMemoryRanOut)
{
    FakeSystem system;
    system.calloc = [](size_t, size_t) { return nullptr; };
    void *block = RkoMemoryCalloc(1, 8);
    system.calloc = nullptr;
    EXPECT_EQ(block, nullptr);
}

TEST(CxMemory, ReallocKeepsTheContent)
{
    auto *block = static_cast<char *>(RkoMemoryMalloc(4));
    std::memcpy(block, "abc", 4);
    block = static_cast<char *>(RkoMemoryRealloc(block, 4096));
    ASSERT_NE(block, nullptr);
    EXPECT_STREQ(block, "abc");
    RkoMemoryFree(block);
}

TEST(CxMemory, ReallocOfNullAllocatesAfresh)
{
    auto *block = static_cast<char *>(RkoMemoryRealloc(nullptr, 16));
    ASSERT_NE(block, nullptr);
    std::memset(block, 'x', 16);
    RkoMemoryFree(block);
}

TEST(CxMemory, ReallocToNothingGivesNullAndLeavesTheBlockToTheCaller)
{
    auto *block = static_cast<char *>(RkoMemoryMalloc(4));
    std::memcpy(block, "abc", 4);
    EXPECT_EQ(RkoMemoryRealloc(block, 0), nullptr);
    EXPECT_STREQ(block, "abc");
    RkoMemoryFree(block);
}

TEST(CxMemory, ReallocOfNullToNothingGivesNull)
{
    EXPECT_EQ(RkoMemoryRealloc(nullptr, 0), nullptr);
}

TEST(CxMemory, ReallocGivesNullAndKeepsTheBlockWhenMemoryRanOut)
{
    auto *block = static_cast<char *>(RkoMemoryMalloc(4));
    std::memcpy(block, "abc", 4);
    FakeSystem system;
    system.realloc = [](void *, size_t) { return nullptr; };
    void *larger = RkoMemoryRealloc(block, 8);
    system.realloc = nullptr;
    EXPECT_EQ(larger, nullptr);
    EXPECT_STREQ(block, "abc");
    RkoMemoryFree(block);
}

TEST(CxMemory, FreeIgnoresNull)
{
    void *block = nullptr;
    RkoMemoryFree(block);
    EXPECT_EQ(block, nullptr);
}

TEST(CxMemory, FreeTakesABlockOfTheCLibrary)
{
    void *block = std::malloc(8);
    ASSERT_NE(block, nullptr);
    RkoMemoryFree(block);
}

TEST(CxMemory, TheCLibraryFreesABlockOfTheWrappers)
{
    void *block = RkoMemoryMalloc(8);
    ASSERT_NE(block, nullptr);
    std::free(block);
}

} // namespace
} // namespace zelvo_test
