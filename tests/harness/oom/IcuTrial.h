// SPDX-License-Identifier: Apache-2.0
// Runs something in a process of its own while ICU's memory runs out, since ICU may not survive it.
#pragma once

#include <functional>
#include <set>
#include <string>

#include "IcuHeap.h"

namespace zelvo_test {

/// How a trial has ended.
struct Ending {
    std::string crash{};           ///< where it crashed
    std::set<std::string> leaks{}; ///< where blocks were allocated that are left
    uint64_t failed = 0;           ///< ICU's allocations that failed
    bool isBad = false;            ///< ended in another way than by returning
    std::string complaint{};
};

/// Runs UNDER_FAULT and then, without a fault, AFTERWARDS, twice if blocks are left: to find out
/// from where. What they give are the trial's complaints.
Ending tryWithout(IcuFault fault, const std::function<std::string()> &underFault,
                  const std::function<std::string()> &afterwards);

} // namespace zelvo_test
