// SPDX-License-Identifier: Apache-2.0
// expect: zelvo: a property is set to a bool, an int32_t, a float, a double or a const char *
#include "zelvo_object.hpp"

void limit(const zelvo::Object &object, int64_t bytes);

void limit(const zelvo::Object &object, int64_t bytes)
{
#ifdef FAULT_REMOVED
    object.setProperty("maxFileBytes", static_cast<int32_t>(bytes));
#else
    object.setProperty("maxFileBytes", bytes);
#endif
}
