// SPDX-License-Identifier: Apache-2.0
// Makes the creation and the destruction of mutexes fail. As with FailAlloc.h, the linker sends the
// calls that cross a source file here first.
#pragma once

#include <cstdint>

namespace zelvo_test {

/// While one lives, mutexes report failures as it was told; code 0 means none.
class MutexFaults {
public:
    MutexFaults();
    MutexFaults(const MutexFaults &) = delete;
    MutexFaults &operator=(const MutexFaults &) = delete;
    ~MutexFaults();

    int32_t createCode = 0;  ///< nothing is created, and this is reported
    int32_t destroyCode = 0; ///< destroyed all the same, and this is reported

    static MutexFaults *current();
};

} // namespace zelvo_test
