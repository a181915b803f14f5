// SPDX-License-Identifier: Apache-2.0
#include "ZlvStringToStringMap.h"

#include "support/MapFormRules.h"

namespace zelvo_test {
namespace {

struct PublicStringToStringMap : StringElements {
    ZELVO_MAP_CALLS(Zlv, StringToStringMap)
    using Scope = NoMutex;
};
struct InternalStringToStringMap : StringElements {
    ZELVO_MAP_CALLS(zlvIntl, StringToStringMap)
    using Scope = HeldMutex;
};

using BothForms = testing::Types<PublicStringToStringMap, InternalStringToStringMap>;
using PublicForm = testing::Types<PublicStringToStringMap>;
using InternalForm = testing::Types<InternalStringToStringMap>;
INSTANTIATE_TYPED_TEST_SUITE_P(StringToStringMap, MapRules, BothForms);
INSTANTIATE_TYPED_TEST_SUITE_P(StringToStringMap, MapWalkRules, BothForms);
INSTANTIATE_TYPED_TEST_SUITE_P(StringToStringMap, PublicMapRules, PublicForm);
INSTANTIATE_TYPED_TEST_SUITE_P(StringToStringMap, InternalMapRules, InternalForm);

class StringToStringMapTest : public testing::Test {
protected:
    ~StringToStringMapTest() override { ZlvFreeStringToStringMap(map); }

    StringToStringMap *map = ZlvAllocStringToStringMap();
};

TEST_F(StringToStringMapTest, PutStoresACopyOfTheValue)
{
    char value[] = "before";
    ZlvStringToStringMapPut(map, "k", value);
    value[0] = 'B';
    EXPECT_EQ(taken(ZlvStringToStringMapGet(map, "k")), "before");
}

TEST_F(StringToStringMapTest, GetHandsOutANewTextEachTime)
{
    ZlvStringToStringMapPut(map, "k", "v");
    char *one = ZlvStringToStringMapGet(map, "k");
    char *other = ZlvStringToStringMapGet(map, "k");
    EXPECT_NE(one, other);
    EXPECT_NE(one, map->first->value);
    EXPECT_EQ(taken(one), "v");
    EXPECT_EQ(taken(other), "v");
    EXPECT_STREQ(map->first->value, "v");
}

TEST_F(StringToStringMapTest, IterGetValHandsOutANewText)
{
    ZlvStringToStringMapPut(map, "k", "v");
    char *value = ZlvStringToStringMapIterGetVal(map->first);
    EXPECT_NE(value, map->first->value);
    EXPECT_EQ(taken(value), "v");
}

TEST_F(StringToStringMapTest, AValueThatCannotBeCopiedIsStoredAsNull)
{
    FailAlloc fail(2, FailAlloc::Once);
    EXPECT_EQ(ZlvStringToStringMapPut(map, "k", "v"), 1);
    EXPECT_EQ(ZlvStringToStringMapHasKey(map, "k"), 1);
    EXPECT_EQ(ZlvStringToStringMapGet(map, "k"), nullptr);
}

TEST_F(StringToStringMapTest, AReplacingValueThatCannotBeCopiedLeavesNull)
{
    ZlvStringToStringMapPut(map, "k", "v");
    FailAlloc fail(0);
    EXPECT_EQ(ZlvStringToStringMapPut(map, "k", "w"), 1);
    EXPECT_EQ(map->first->value, nullptr);
}

TEST_F(StringToStringMapTest, TheStoredTextMayBePutUnderItsOwnKey)
{
    ZlvStringToStringMapPut(map, "k", "v");
    EXPECT_EQ(ZlvStringToStringMapPut(map, "k", map->first->value), 1);
    EXPECT_STREQ(map->first->value, "v");
}

TEST_F(StringToStringMapTest, ACopyHasValuesOfItsOwn)
{
    ZlvStringToStringMapPut(map, "k", "v");
    StringToStringMap *copy = ZlvCopyStringToStringMap(map);
    EXPECT_NE(copy->first->value, map->first->value);
    ZlvFreeStringToStringMap(copy);
    EXPECT_STREQ(map->first->value, "v");
}

TEST_F(StringToStringMapTest, ACopyKeepsNullValues)
{
    ZlvStringToStringMapPut(map, "k", nullptr);
    StringToStringMap *copy = ZlvCopyStringToStringMap(map);
    EXPECT_EQ(ZlvStringToStringMapHasKey(copy, "k"), 1);
    EXPECT_EQ(ZlvStringToStringMapGet(copy, "k"), nullptr);
    ZlvFreeStringToStringMap(copy);
}

} // namespace
} // namespace zelvo_test
