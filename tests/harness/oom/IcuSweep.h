// SPDX-License-Identifier: Apache-2.0
// Plays an act again and again, each time in a process of its own, with ICU's first allocation
// failing, its second, and so on.
#pragma once

#include <cstdio>
#include <map>
#include <string>

#include "IcuTrial.h"
#include "LifeJudge.h"

namespace zelvo_test {

/// What ICU is known to do by itself: by its innermost place, where it stands and how often it was
/// met.
class IcuFaults {
public:
    /// Reads the notes of IcuAlone.cpp.
    explicit IcuFaults(const char *notes);

    /// Whether ICU does by itself what a site tells, as "crash PLACE" or "leak PLACE".
    bool excuses(const std::string &site);

    void print(FILE *report) const;

private:
    struct Fault {
        std::string where;
        uint64_t times;
    };

    std::map<std::string, Fault> faults_;
};

class IcuSweep {
public:
    IcuSweep(FILE *report, const Act &act, IcuFaults &known);

    /// Tries every STRIDEth allocation; the number of faults that are not ICU's own.
    uint32_t run(uint64_t stride);

    const LifeFigures &figures() const { return figures_; }

private:
    /// Tells whether an allocation has failed.
    bool tryOne(IcuFault fault);
    Stage play() const;
    std::string judged();
    std::string judgedAgain() const;
    void complain(const std::string &what);

    FILE *report_;
    const Act &act_;
    LifeFigures &figures_;
    LifeJudge judge_;
    IcuFaults &known_;
    std::string fault_; ///< the one under trial
    uint32_t faults_ = 0;
};

} // namespace zelvo_test
