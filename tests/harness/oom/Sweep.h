// SPDX-License-Identifier: Apache-2.0
// Tries a call with its first allocation failing, its second, its third, until it asks for no more,
// each time in a new world, and judges what the call answers and leaves behind.
#pragma once

#include <cstdio>
#include <map>
#include <set>
#include <string>

#include "Case.h"

namespace zelvo_test {

/// What has been tried so far.
struct Figures {
    uint64_t worlds = 0;
    uint64_t failures = 0;                   ///< allocations that failed
    uint64_t done = 0;                       ///< calls that did their work all the same
    uint64_t refused = 0;                    ///< calls that failed and left everything as it was
    uint64_t partly = 0;                     ///< composite calls of which some steps failed
    uint64_t cut = 0;                        ///< records printed without some of their pieces
    std::map<std::string, uint64_t> known{}; ///< by name, the other outcomes
    std::set<std::string> calls{};
};

class Sweep {
public:
    explicit Sweep(FILE *report) : report_(report) {}

    /// Tries a call with both kinds of buffers; the number of faults found.
    uint32_t run(const Case &call);

    const Figures &figures() const { return figures_; }

private:
    /// What a call answers, prints and leaves, and the same for its repetition without a fault.
    struct Outcome {
        std::string answer;
        std::string output;
        Lines state;
    };
    struct Trial {
        Lines before;
        Outcome first;
        Outcome second;
        uint32_t asked;
        uint32_t failed;
        int64_t left; ///< blocks
        Lines flaws;
    };

    Trial attempt(const Case &call, Buffers buffers, Fault fault);
    void runWith(Buffers buffers, const Case &call);
    void runWithoutMutex(const Case &call);
    void judge(const Case &call, const Trial &reference, const Trial &trial);
    bool isDone(const Case &call, const Outcome &expected, const Outcome &found);
    void judgeComposite(const Case &call, const Trial &reference, const Trial &trial);
    void judgeKnown(const Case &call, const Trial &reference, const Trial &trial);
    void complain(const Case &call, const std::string &what);

    FILE *report_;
    Figures figures_;
    uint32_t faults_ = 0;
    std::string fault_; ///< the fault under trial
    bool withoutMutex_ = false;
};

} // namespace zelvo_test
