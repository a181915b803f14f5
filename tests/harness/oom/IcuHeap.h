// SPDX-License-Identifier: Apache-2.0
// The allocator of the Unicode library, which fails when it is told to.
#pragma once

#include <cstdint>
#include <set>
#include <string>

namespace zelvo_test {

/// Which of ICU's allocations fails, counted from when this was said.
struct IcuFault {
    uint64_t allowed; ///< so many succeed before
    bool once;        ///< else all that follow fail as well

    std::string text() const;
};

/// Puts the allocator in place; before any other call of ICU.
bool takeIcuHeap();

void failIcu(IcuFault fault);
void failIcuNoMore();

uint64_t icuAsked();  ///< allocations since failIcu()
uint64_t icuFailed(); ///< those of them that failed
int64_t icuLive();    ///< blocks that are allocated and not freed

/// From now on notes where blocks are allocated.
void traceIcu();
/// Where the blocks come from that were allocated since and are still there.
std::set<std::string> leakSites();

/// The place in an ICU library at which a stack of calls has arrived: the innermost ones, each as
/// the library and the distance from its start, with the name of the first.
std::string icuSite(void *const *stack, int depth);

} // namespace zelvo_test
