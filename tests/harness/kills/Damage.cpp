// SPDX-License-Identifier: Apache-2.0
#include "Damage.h"

#include <algorithm>

namespace zelvo_test {

namespace {

/// Tells whether a call is one of a rollover of a shared file, before the live file is emptied.
bool isBeforeEmptying(const std::vector<FaultyCall> &calls, uint32_t number)
{
    const auto before = calls.rend() - number + 1; // the calls before it, the last one first
    const auto last = [&](FaultyCall call) { return std::find(before, calls.rend(), call); };
    return last(CALL_REMOVE) < last(CALL_FTRUNCATE);
}

/// No acknowledged record. The rollover that the kill interrupts is done again.
Damage mostOfKill(Fault fault, bool inCopy, const LogLimits &log)
{
    return {.doubled = inCopy ? log.recordsOfAFile : 0,
            .fragments = inCopy || fault.kind == FAULT_KILL_WITHIN ? size_t{1} : size_t{0}};
}

/// A failing step does not stop the others: what it was to save goes. Without the semaphore records
/// are dropped. A file that is copied twice has its older fragment twice too.
Damage mostOfFailure(FaultyCall call, bool inCopy, const LogLimits &log)
{
    switch (call) {
    case CALL_SEMGET:
    case CALL_SEMCTL:
    case CALL_SEMOP:
        return {.lost = log.recordsOfARun};
    case CALL_RENAME:
        return {.lost = log.recordsOfAFile, .fragments = 1};
    case CALL_OPEN:
    case CALL_READ:
    case CALL_WRITE:
    case CALL_LSEEK:
        return inCopy ? Damage{log.recordsOfAFile, log.recordsOfAFile, 1} : Damage{};
    case CALL_FTRUNCATE:
    case CALL_FSTAT:
        return inCopy ? Damage{.doubled = log.recordsOfAFile, .fragments = 1} : Damage{};
    default:
        return {};
    }
}

} // namespace

Damage mostDamage(const FaultyRun &run, Fault fault, const LogLimits &log)
{
    const bool inCopy = log.isShared && isBeforeEmptying(run.calls, fault.number);
    return fault.kind == FAULT_FAIL ? mostOfFailure(run.calls[fault.number - 1], inCopy, log)
                                    : mostOfKill(fault, inCopy, log);
}

} // namespace zelvo_test
