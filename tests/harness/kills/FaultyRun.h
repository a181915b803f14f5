// SPDX-License-Identifier: Apache-2.0
// One run of a process that logs, with a fault at one of its system calls.
#pragma once

#include <vector>

#include "CallFaults.h"
#include "process/Job.h"

namespace zelvo_test {

/// A fault at the call of that number, or at so many from there on; none for 0.
struct Fault {
    uint32_t number = 0;
    CallFault kind = FAULT_NONE;
    uint32_t count = 1;
    int code = 0; ///< with which calls fail; 0 leaves the choice
};

/// When a process tells that a record is safe.
enum class Acknowledges { AFTER_THE_CALL, TOO_EARLY };

/// What became of a run.
struct FaultyRun {
    bool hasEnded = false;         ///< by itself, rather than by a signal
    bool leavesDescriptor = false; ///< open, that was not before
    std::vector<uint32_t> acknowledged;
    std::vector<FaultyCall> calls;
};

/// Runs a process that opens the toolkit, logs the records of a job, closes the toolkit. What it
/// acknowledges comes through a pipe.
FaultyRun runFaulty(const char *handlerClass, const Job &job, Fault fault,
                    Acknowledges when = Acknowledges::AFTER_THE_CALL);

} // namespace zelvo_test
