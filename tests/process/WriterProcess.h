// SPDX-License-Identifier: Apache-2.0
// Writers as processes of a test, and waits that end.
#pragma once

#include <chrono>
#include <functional>
#include <memory>
#include <string>

#include <sys/types.h>

#include "process/Job.h"
#include "process/OwnSemaphore.h"
#include "support/TestDir.h"

namespace zelvo_test {

/// Far beyond what anything here takes: reaching it means that something hangs.
constexpr std::chrono::seconds LONG_ENOUGH{120};

/// Waits until a condition holds; false when it does not within LONG_ENOUGH.
bool eventually(const std::function<bool()> &condition);

/// Seconds since a time.
double secondsSince(std::chrono::steady_clock::time_point start);

/// Holds writers back that were started with its input, until it is opened.
class Gate {
public:
    Gate();
    Gate(const Gate &) = delete;
    Gate &operator=(const Gate &) = delete;
    ~Gate();

    int input() const { return ends_[0]; }
    void open();

private:
    int ends_[2] = {-1, -1};
};

/// A running writer; one that is still there at the end of the scope is killed.
class WriterProcess {
public:
    /// Starts PROGRAM. Without a gate it begins at once. PREPARE runs in the new process.
    WriterProcess(const char *program, const Job &job, const Gate *gate = nullptr,
                  const std::function<void()> &prepare = {});
    WriterProcess(const WriterProcess &) = delete;
    WriterProcess &operator=(const WriterProcess &) = delete;
    ~WriterProcess();

    /// Waits for the end: the exit status, or minus the signal that ended it; -1000 for no end.
    int result();
    void kill();

private:
    bool hasEnded();

    pid_t pid_;
    int status_ = 0;
};

/// The progress of one writer, whatever processes play it one after the other.
class SharedProgress {
public:
    explicit SharedProgress(const std::string &file);
    SharedProgress(const SharedProgress &) = delete;
    SharedProgress &operator=(const SharedProgress &) = delete;
    ~SharedProgress();

    Progress *operator->() const { return area_; }

private:
    Progress *area_;
};

/// A directory, a semaphore and writers on the file shared.log in it.
class SharedLogTest : public TestDir {
protected:
    /// A job for a writer, whose progress file is made if there is none.
    Job jobFor(uint32_t writer, uint32_t count);
    /// The result of a writer that runs alone.
    int runWriter(const Job &job, const char *program = WRITER);
    size_t liveSize() const;

    OwnSemaphore semaphore_;
};

} // namespace zelvo_test
