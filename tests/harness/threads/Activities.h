// SPDX-License-Identifier: Apache-2.0
// What a thread does to the toolkit, in turns of its own choice.
#pragma once

#include <random>
#include <vector>

#include "process/Job.h"
#include "zelvo.h"

namespace zelvo_test {

/// The objects that all threads use.
struct Common {
    ZlvObject *sharedLog; ///< writes numbered records to a file that processes could share
    ZlvObject *ownLog;    ///< writes numbered records to a file of its own
    ZlvObject *busyLog;   ///< changes all the time
    ZlvObject *busyFile;  ///< its handler
    ZlvObject *reportLog; ///< stamps what it logs
    ZlvObject *twinsLog;  ///< runs class functions that call all twins
    StringList *texts;    ///< only grows, so that it can be walked at any time
};

/// Makes them, in the working directory. RECORDS tells of the files with numbered records.
Common makeCommon(const Job &records);

/// Gives them back, apart from the list, which is freed.
void releaseCommon(const Common &common);

/// One thread's share of it.
struct Worker {
    const Common &common;
    Job records;          ///< its number is that of the writer
    uint32_t written = 0; ///< numbered records so far, in each of the two files
    uint32_t failed = 0;  ///< calls that should have succeeded
    std::minstd_rand random{};

    uint32_t below(uint32_t bound) { return static_cast<uint32_t>(random() % bound); }
};

/// Does one thing, chosen at random.
void actOnce(Worker &worker);

} // namespace zelvo_test
