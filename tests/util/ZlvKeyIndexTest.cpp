// SPDX-License-Identifier: Apache-2.0
// Large maps, which find their keys by an index, against a map of the standard library.
#include "util/ZlvKeyIndex.h"

#include <map>
#include <random>
#include <string>

#include <gtest/gtest.h>

#include "ZlvStringToStringMap.h"
#include "support/FailAlloc.h"
#include "support/Text.h"

namespace zelvo_test {
namespace {

class ZlvLargeMap : public ::testing::Test {
protected:
    void TearDown() override { zlvIntlFreeStringToStringMap(map_); }

    void put(const std::string &key, const std::string &value)
    {
        ASSERT_EQ(zlvIntlStringToStringMapPut(map_, key.c_str(), value.c_str()), 1);
        model_[key] = value;
    }

    void remove(const std::string &key)
    {
        zlvIntlStringToStringMapRem(map_, key.c_str());
        model_.erase(key);
    }

    void expectFound(const std::string &key)
    {
        const auto known = model_.find(key);
        const Text expected = known != model_.end() ? Text(known->second) : std::nullopt;
        ASSERT_EQ(taken(zlvIntlStringToStringMapGet(map_, key.c_str())), expected) << key;
    }

    void fill(int count)
    {
        for (int number = 0; number < count; ++number)
            put("key " + std::to_string(number), "value " + std::to_string(number));
    }

    void expectAllFound(int count)
    {
        for (int number = 0; number <= count; ++number)
            expectFound("key " + std::to_string(number));
    }

    StringToStringMap *map_ = zlvIntlAllocStringToStringMap();
    std::map<std::string, std::string> model_;
};

TEST_F(ZlvLargeMap, HasAnIndexAndASmallOneHasNone)
{
    fill(30);
    EXPECT_EQ(map_->index, nullptr);
    fill(100);
    EXPECT_NE(map_->index, nullptr);
    expectAllFound(100);
}

TEST_F(ZlvLargeMap, KeepsTheOrderInWhichKeysWerePut)
{
    fill(200);
    int number = 0;
    for (const auto *node = map_->first; node != nullptr; node = node->next)
        EXPECT_EQ(node->key, "key " + std::to_string(number++));
    EXPECT_EQ(number, 200);
}

TEST_F(ZlvLargeMap, FindsWhatAMapOfTheStandardLibraryFinds)
{
    std::mt19937 random(11);
    for (int step = 0; step < 20000; ++step) {
        const std::string key = std::to_string(random() % 400);
        if (random() % 5 < 3)
            put(key, std::to_string(step));
        else
            remove(key);
        expectFound(std::to_string(random() % 400));
    }
    EXPECT_GT(model_.size(), 100u);
}

TEST_F(ZlvLargeMap, FindsWhatIsLeftAfterEachRemoval)
{
    fill(150);
    for (int number = 0; number < 150; number += 2) {
        remove("key " + std::to_string(number));
        expectAllFound(150);
    }
}

TEST_F(ZlvLargeMap, WithoutMemoryForAnIndexIsWalked)
{
    fill(32);
    for (int number = 32; number < 40; ++number)
        put("key " + std::to_string(number), "value");
    RkoMemoryFree(map_->index);
    map_->index = nullptr;
    const FailAlloc fail(0);
    EXPECT_EQ(zlvIntlStringToStringMapHasKey(map_, "key 39"), 1);
    EXPECT_EQ(zlvIntlStringToStringMapHasKey(map_, "key 40"), 0);
    EXPECT_EQ(fail.failed(), 2u);
    EXPECT_EQ(map_->index, nullptr);
}

TEST_F(ZlvLargeMap, LeavesAKeyThatCouldNotBeCopiedOutOfItsIndex)
{
    fill(100);
    {
        const FailAlloc fail(1, FailAlloc::Once); // the node is there, its key is not
        zlvIntlStringToStringMapPut(map_, "lost", "value");
    }
    expectFound("lost");
    expectAllFound(100);
    zlvIntlStringToStringMapRemNode(map_, map_->last);
    expectAllFound(100);
}

} // namespace
} // namespace zelvo_test
