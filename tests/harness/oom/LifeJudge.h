// SPDX-License-Identifier: Apache-2.0
// Judges what came out of an act in which memory ran out, by what comes out of it otherwise.
#pragma once

#include <cstdint>
#include <string>
#include <vector>

#include "Act.h"

namespace zelvo_test {

/// What has been counted so far.
struct LifeFigures {
    uint64_t lives;
    uint64_t failures; ///< allocations that failed
    uint64_t records;
    uint64_t reported; ///< calls that told of a failure
    uint64_t cut;      ///< records that lack pieces, or everything
    uint64_t passed;   ///< records that a filter had no memory for the identifiers of
    uint64_t lost;     ///< records lost by rollovers without memory for a name
};

class LifeJudge {
public:
    LifeJudge(const Act &act, LifeFigures &figures) : act_(act), figures_(figures) {}

    /// Takes what comes out when nothing fails.
    void expect(const Stage &reference);

    /// The faults of an act in which something failed.
    std::vector<std::string> judge(const Stage &found);

    /// Tells whether an act has gone as expected.
    bool isAsExpected(const Stage &found) const;

private:
    void judgeStatuses(const Stage &found);
    void judgeOutputs(const Stage &found);
    void judgeOutput(size_t number, const Stage::Call &call);
    void judgeFiles(const Stage &found);
    bool isRollover(size_t call) const;

    const Act &act_;
    LifeFigures &figures_;
    std::vector<Stage::Call> calls_;
    std::string files_;
    std::vector<std::string> faults_;
};

} // namespace zelvo_test
