// SPDX-License-Identifier: Apache-2.0
// Makes the API mutex impossible to take, so that the nothing value of a public call can be seen.
#pragma once

#include <utility>

#include "ZlvToolkitIntl.h"

namespace zelvo_test {

/// While it lives, the API mutex counts as created but is an empty handle: every lock fails. The
/// mutex that was there before comes back with the end of the scope.
class BrokenMutex {
public:
    BrokenMutex()
        : mutex_(std::exchange(ZLV_TK_API_MUTEX, nullptr)),
          exists_(std::exchange(ZLV_TK_API_MUTEX_EXISTS, ZlvBool{1}))
    {
    }
    BrokenMutex(const BrokenMutex &) = delete;
    BrokenMutex &operator=(const BrokenMutex &) = delete;
    ~BrokenMutex()
    {
        ZLV_TK_API_MUTEX = mutex_;
        ZLV_TK_API_MUTEX_EXISTS = exists_;
    }

private:
    CxMutex mutex_;
    ZlvBool exists_;
};

} // namespace zelvo_test
