// SPDX-License-Identifier: Apache-2.0
#include "ZlvLocaleName.h"

#include <gtest/gtest.h>

#include <array>
#include <string>
#include <thread>

#include "support/FailAlloc.h"

namespace zelvo_test {
namespace {

using zelvo::internLocaleName;

TEST(ZlvLocaleName, IsOneForEqualNames)
{
    std::string first = "de_CH", second = "de_CH";
    const char *name = internLocaleName(first.c_str());
    EXPECT_EQ(internLocaleName(second.c_str()), name);
    EXPECT_NE(name, first.c_str());
    EXPECT_STREQ(name, "de_CH");
}

TEST(ZlvLocaleName, DiffersForOtherNames)
{
    EXPECT_NE(internLocaleName("de"), internLocaleName("de_CH"));
    EXPECT_NE(internLocaleName("de"), internLocaleName("DE"));
    EXPECT_STREQ(internLocaleName("de"), "de");
}

TEST(ZlvLocaleName, KeepsItsTextWhenTheCallersChanges)
{
    std::string text = "ja";
    const char *name = internLocaleName(text.c_str());
    text = "xx";
    EXPECT_STREQ(name, "ja");
}

TEST(ZlvLocaleName, OfItselfIsItself)
{
    const char *name = internLocaleName("fr");
    EXPECT_EQ(internLocaleName(name), name);
}

TEST(ZlvLocaleName, MayBeEmpty)
{
    EXPECT_STREQ(internLocaleName(""), "");
}

TEST(ZlvLocaleName, OfNullIsNull)
{
    EXPECT_EQ(internLocaleName(nullptr), nullptr);
}

TEST(ZlvLocaleName, IsNullWithoutMemoryAndComesBackWithIt)
{
    {
        FailAlloc fail(0);
        EXPECT_EQ(internLocaleName("is_IS"), nullptr);
        EXPECT_GT(fail.failed(), 0u);
    }
    EXPECT_STREQ(internLocaleName("is_IS"), "is_IS");
}

TEST(ZlvLocaleName, CostsNoMemoryTheSecondTime)
{
    internLocaleName("is_IS");
    FailAlloc fail(0);
    EXPECT_STREQ(internLocaleName("is_IS"), "is_IS");
    EXPECT_EQ(fail.asked(), 0u);
}

TEST(ZlvLocaleName, IsOneForAllThreads)
{
    std::array<const char *, 4> names{};
    std::array<std::thread, 4> threads;
    for (size_t i = 0; i < threads.size(); ++i)
        threads[i] = std::thread([&names, i] {
            for (int round = 0; round < 100; ++round)
                names[i] = internLocaleName(("l" + std::to_string(round)).c_str());
        });
    for (std::thread &thread : threads)
        thread.join();
    for (const char *name : names)
        EXPECT_EQ(name, internLocaleName("l99"));
}

} // namespace
} // namespace zelvo_test
