// SPDX-License-Identifier: Apache-2.0
// A process whose threads log and roll over while it forks.
#pragma once

#include <atomic>
#include <functional>
#include <map>
#include <thread>
#include <vector>

#include "process/OwnSemaphore.h"
#include "process/RecordLogger.h"
#include "process/Records.h"
#include "support/TestDir.h"

namespace zelvo_test {

constexpr uint32_t THREADS = 4;

/// Who writes records: the threads by their numbers, then these.
enum Writer : uint32_t { CHILDREN = THREADS, PARENT, FORKING_CALLS, WRITERS };

/// A logger on a file, and what its writers have been told is safe.
class ForkedLog : public TestDir {
protected:
    /// Ends the process when a test takes far longer than any should.
    ForkedLog();
    ~ForkedLog() override;

    void open(const char *handlerClass);
    /// Gives everything back and counts what stands in the files.
    Census close();

    Job jobOf(uint32_t writer) const;

    /// Logs a record of this process; what a child logs is noted when it has ended.
    void log(uint32_t writer, uint32_t number);

    /// Lets the threads log from now on; each keeps within a few records of the forks.
    void startThreads();
    void stopThreads();

    /// Forks; the child logs records of the writer CHILDREN and exits, and the parent waits for it.
    void forkOnce(uint32_t firstNumber, uint32_t count);
    /// The end of a child that LOG has told whether its records were logged.
    [[noreturn]] static void endChild(const std::function<bool()> &log);
    /// Waits for a child that exits with 0; one that hangs is ended by its own alarm.
    void awaitChild(pid_t child);

    /// Records that a call succeeded for and that are nowhere.
    size_t lost(const Census &census) const;
    size_t acknowledged() const;

    ZlvObject *logger_ = nullptr;
    OwnSemaphore semaphore_;
    std::atomic<uint32_t> forks_ = 0;

private:
    void logTillStopped(uint32_t thread);

    std::atomic<bool> stopped_ = false;
    std::vector<std::thread> threads_;
    std::vector<uint32_t> acknowledged_[WRITERS]; ///< each written by its writer alone
};

} // namespace zelvo_test
