// SPDX-License-Identifier: Apache-2.0
// The end of an object's life, and the pieces of it that stand in files of their own.
#pragma once

#include "ZlvObject.h"

namespace zelvo {

/// Destroys an object, whoever still holds references to it; one that is destroyed is left alone.
/// The record stays readable, without a class, until the API mutex is released.
void destroyObject(ZlvObject *object);

/// Removes an object's entry from the registry, unless the entry holds another object of its name.
void leaveRegistry(const ZlvObject *object);

/// Releases all listeners of an object, which has no group afterwards.
void dropListeners(ZlvObject *object);

} // namespace zelvo
