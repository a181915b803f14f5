// SPDX-License-Identifier: Apache-2.0
// The built-in classes, and the end of all classes.
#pragma once

#include "ZlvObjClass.h"

namespace zelvo {

/// Makes a record of each built-in class, in order, and hands it to TAKE, which owns it then. A
/// record that cannot be made for want of memory is left out.
void forEachBuiltinClass(void (*take)(const char *name, ZlvObjClass *objClass));

/// Frees all classes and their registry. No object is left.
void freeClasses();

} // namespace zelvo
