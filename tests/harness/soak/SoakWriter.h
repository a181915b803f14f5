// SPDX-License-Identifier: Apache-2.0
// A process that logs without end, while another thread of it changes the configuration.
#pragma once

#include "Ledger.h"
#include "process/Job.h"

namespace zelvo_test {

/// Directories of the logs, and the two names that a log has in turn.
constexpr const char *SHARED_PLACE = "shared";
constexpr const char *OWN_PLACES = "disk";
constexpr std::array<const char *, 2> LOG_NAMES = {"a.log", "b.log"};

/// A process does not log as fast as it can: a run of hours would count for hours.
constexpr uint32_t MOST_RECORDS_A_SECOND = 2000;

/// What a writer is to do.
struct SoakJob {
    uint32_t process; ///< its number
    int32_t key;      ///< of the semaphore
    uint32_t seed;
    uint32_t swallowed; ///< number of the record of its own log that is not written; 0 for none
};

/// The directory of the log that only one process writes.
std::string ownPlace(uint32_t process);

/// Logs until the ledger's board says stop; the exit status of the process.
int soak(const SoakJob &job, Ledger &ledger);

} // namespace zelvo_test
