// SPDX-License-Identifier: Apache-2.0
#include "ZlvStringToObjCfgMap.h"

#include "support/MapFormRules.h"

namespace zelvo_test {
namespace {

struct PublicStringToObjCfgMap : CfgElements {
    ZELVO_MAP_CALLS(Zlv, StringToObjCfgMap)
    using Scope = NoMutex;
};
struct InternalStringToObjCfgMap : CfgElements {
    ZELVO_MAP_CALLS(zlvIntl, StringToObjCfgMap)
    using Scope = HeldMutex;
};

using BothForms = testing::Types<PublicStringToObjCfgMap, InternalStringToObjCfgMap>;
using PublicForm = testing::Types<PublicStringToObjCfgMap>;
using InternalForm = testing::Types<InternalStringToObjCfgMap>;
INSTANTIATE_TYPED_TEST_SUITE_P(StringToObjCfgMap, MapRules, BothForms);
INSTANTIATE_TYPED_TEST_SUITE_P(StringToObjCfgMap, MapWalkRules, BothForms);
INSTANTIATE_TYPED_TEST_SUITE_P(StringToObjCfgMap, PublicMapRules, PublicForm);
INSTANTIATE_TYPED_TEST_SUITE_P(StringToObjCfgMap, InternalMapRules, InternalForm);
INSTANTIATE_TYPED_TEST_SUITE_P(StringToObjCfgMap, CountedMapRules, BothForms);

TEST(StringToObjCfgMapTest, AConfigurationThatOnlyTheMapHoldsGoesWithIt)
{
    StringToObjCfgMap *map = ZlvAllocStringToObjCfgMap();
    ZlvObjCfg *cfg = ZlvAllocObjCfg("a");
    ZlvStringToObjCfgMapPut(map, "a", cfg);
    ZlvReleaseObjCfg(cfg);
    EXPECT_EQ(map->first->value->refCount, 1U);
    ZlvFreeStringToObjCfgMap(map);
}

} // namespace
} // namespace zelvo_test
