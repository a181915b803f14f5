// SPDX-License-Identifier: Apache-2.0
// What a fault may cost a log, at most.
#pragma once

#include <cstddef>

#include "FaultyRun.h"

namespace zelvo_test {

struct Damage {
    size_t lost = 0; ///< acknowledged records that are nowhere
    size_t doubled = 0;
    size_t fragments = 0;

    void operator+=(const Damage &other)
    {
        lost += other.lost;
        doubled += other.doubled;
        fragments += other.fragments;
    }
};

/// The most that stands in one file of a log, and whether processes share it.
struct LogLimits {
    bool isShared;
    size_t recordsOfAFile;
    size_t recordsOfARun;
};

/// What the fault that has befallen a run may cost.
Damage mostDamage(const FaultyRun &run, Fault fault, const LogLimits &log);

} // namespace zelvo_test
