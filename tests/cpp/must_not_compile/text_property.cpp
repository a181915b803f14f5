// SPDX-License-Identifier: Apache-2.0
// expect: zelvo: a property is read as bool, int32_t, int64_t, float or double
#include "zelvo_object.hpp"

bool has(const zelvo::Object &object);

bool has(const zelvo::Object &object)
{
#ifdef FAULT_REMOVED
    return bool(object.property("name"));
#else
    return bool(object.property<std::string>("name"));
#endif
}
