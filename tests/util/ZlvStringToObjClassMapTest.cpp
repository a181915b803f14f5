// SPDX-License-Identifier: Apache-2.0
#include "ZlvStringToObjClassMap.h"

#include "support/MapFormRules.h"

namespace zelvo_test {
namespace {

struct PublicStringToObjClassMap : ClassElements {
    ZELVO_MAP_CALLS(Zlv, StringToObjClassMap)
    using Scope = NoMutex;
};
struct InternalStringToObjClassMap : ClassElements {
    ZELVO_MAP_CALLS(zlvIntl, StringToObjClassMap)
    using Scope = HeldMutex;
};

using BothForms = testing::Types<PublicStringToObjClassMap, InternalStringToObjClassMap>;
using PublicForm = testing::Types<PublicStringToObjClassMap>;
using InternalForm = testing::Types<InternalStringToObjClassMap>;
INSTANTIATE_TYPED_TEST_SUITE_P(StringToObjClassMap, MapRules, BothForms);
INSTANTIATE_TYPED_TEST_SUITE_P(StringToObjClassMap, MapWalkRules, BothForms);
INSTANTIATE_TYPED_TEST_SUITE_P(StringToObjClassMap, PublicMapRules, PublicForm);
INSTANTIATE_TYPED_TEST_SUITE_P(StringToObjClassMap, InternalMapRules, InternalForm);

TEST(StringToObjClassMapTest, GetLendsTheStoredRecordItself)
{
    ZlvObjClass record{};
    StringToObjClassMap *map = ZlvAllocStringToObjClassMap();
    ZlvStringToObjClassMapPut(map, "k", &record);
    EXPECT_EQ(ZlvStringToObjClassMapGet(map, "k"), &record);
    EXPECT_EQ(ZlvStringToObjClassMapIterGetVal(map->first), &record);
    ZlvFreeStringToObjClassMap(map);
}

} // namespace
} // namespace zelvo_test
