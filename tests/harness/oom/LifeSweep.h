// SPDX-License-Identifier: Apache-2.0
// Plays an act again and again, with the library's first allocation failing, its second, and so on.
#pragma once

#include <cstdio>
#include <string>

#include "LifeJudge.h"
#include "support/FailAlloc.h"

namespace zelvo_test {

class LifeSweep {
public:
    LifeSweep(FILE *report, const Act &act) : report_(report), act_(act), judge_(act, figures_) {}

    /// The number of faults found.
    uint32_t run();

    const LifeFigures &figures() const { return figures_; }

private:
    /// Plays the act, and judges it; the allocations that failed.
    uint32_t tryOne(uint32_t allowed, FailAlloc::Span span);
    void repeat();
    void complain(const std::string &what);

    FILE *report_;
    const Act &act_;
    LifeFigures figures_{};
    LifeJudge judge_;
    std::string fault_; ///< the one under trial
    uint32_t faults_ = 0;
};

/// Prints what was counted of an act.
void printFigures(FILE *report, const char *what, const LifeFigures &figures, uint32_t faults);

} // namespace zelvo_test
