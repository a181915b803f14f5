// SPDX-License-Identifier: Apache-2.0
// The end of the API mutex, and the one shape that all public calls share.
#pragma once

#include "ZlvOwned.h"

namespace zelvo {

/// Destroys the API mutex, which nobody holds; the next call that takes it creates a new one.
void destroyApiMutex();

/// A public call: takes the lock, calls the twin, gives its answer; nothing if there is no lock.
template <class Result, class... Parameters, class... Arguments>
Result locked(Result (*twin)(Parameters...), Arguments... arguments)
{
    ApiLock lock;
    if (!lock)
        return Result();
    return twin(arguments...);
}

} // namespace zelvo
