// SPDX-License-Identifier: Apache-2.0
#include "ZlvStringToObjMap.h"

#include "support/MapFormRules.h"

namespace zelvo_test {
namespace {

struct PublicStringToObjMap : ObjectElements {
    ZELVO_MAP_CALLS(Zlv, StringToObjMap)
    using Scope = NoMutex;
};
struct InternalStringToObjMap : ObjectElements {
    ZELVO_MAP_CALLS(zlvIntl, StringToObjMap)
    using Scope = HeldMutex;
};

using BothForms = testing::Types<PublicStringToObjMap, InternalStringToObjMap>;
using PublicForm = testing::Types<PublicStringToObjMap>;
using InternalForm = testing::Types<InternalStringToObjMap>;
INSTANTIATE_TYPED_TEST_SUITE_P(StringToObjMap, MapRules, BothForms);
INSTANTIATE_TYPED_TEST_SUITE_P(StringToObjMap, MapWalkRules, BothForms);
INSTANTIATE_TYPED_TEST_SUITE_P(StringToObjMap, PublicMapRules, PublicForm);
INSTANTIATE_TYPED_TEST_SUITE_P(StringToObjMap, InternalMapRules, InternalForm);
INSTANTIATE_TYPED_TEST_SUITE_P(StringToObjMap, CountedMapRules, BothForms);

} // namespace
} // namespace zelvo_test
