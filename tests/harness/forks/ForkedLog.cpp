// SPDX-License-Identifier: Apache-2.0
#include "ForkedLog.h"

#include <sys/wait.h>
#include <unistd.h>

namespace zelvo_test {

namespace {

/// Far beyond what a test may take. A child has SECONDS_OF_A_CHILD, which the build defines.
constexpr unsigned SECONDS_OF_A_TEST = 120;

/// How far a thread may be ahead of the forks, so that all of them are met by running threads and
/// the number of records does not depend on the machine.
constexpr uint32_t RECORDS_OF_A_FORK = 30;

} // namespace

ForkedLog::ForkedLog()
{
    alarm(SECONDS_OF_A_TEST);
}

ForkedLog::~ForkedLog()
{
    alarm(0);
}

void ForkedLog::open(const char *handlerClass)
{
    ASSERT_EQ(ZlvOpenToolkit(nullptr, nullptr), 1);
    logger_ = makeRecordLogger(handlerClass, jobOf(PARENT));
}

Census ForkedLog::close()
{
    ZlvReleaseObject(logger_);
    ZlvCloseToolkit();
    return Census(directory(), jobOf(PARENT).seed);
}

Job ForkedLog::jobOf(uint32_t writer) const
{
    return {.key = semaphore_.key(), .writer = writer};
}

void ForkedLog::log(uint32_t writer, uint32_t number)
{
    if (logRecord(logger_, jobOf(writer), number))
        acknowledged_[writer].push_back(number);
}

void ForkedLog::startThreads()
{
    for (uint32_t thread = 0; thread < THREADS; ++thread)
        threads_.emplace_back([this, thread] { logTillStopped(thread); });
}

void ForkedLog::stopThreads()
{
    stopped_ = true;
    for (std::thread &thread : threads_)
        thread.join();
}

void ForkedLog::logTillStopped(uint32_t thread)
{
    for (uint32_t number = 1; !stopped_; ++number) {
        log(thread, number);
        while (!stopped_ && number >= (forks_ + 1) * RECORDS_OF_A_FORK)
            std::this_thread::yield();
    }
}

void ForkedLog::forkOnce(uint32_t firstNumber, uint32_t count)
{
    ++forks_;
    const pid_t child = fork();
    if (child == 0)
        endChild([=, this] {
            bool isWell = true;
            for (uint32_t number = firstNumber; number < firstNumber + count; ++number)
                isWell = logRecord(logger_, jobOf(CHILDREN), number) && isWell;
            return isWell;
        });
    awaitChild(child);
    for (uint32_t number = firstNumber; number < firstNumber + count; ++number)
        acknowledged_[CHILDREN].push_back(number);
}

void ForkedLog::endChild(const std::function<bool()> &log)
{
    alarm(SECONDS_OF_A_CHILD);
    _exit(log() ? 0 : 1);
}

void ForkedLog::awaitChild(pid_t child)
{
    int status = -1;
    EXPECT_EQ(waitpid(child, &status, 0), child);
    EXPECT_EQ(status, 0) << (WIFSIGNALED(status) ? "the child hangs" : "a record failed");
}

size_t ForkedLog::lost(const Census &census) const
{
    size_t sum = 0;
    for (uint32_t writer = 0; writer < WRITERS; ++writer)
        for (uint32_t number : acknowledged_[writer])
            sum += census.copiesOf(writer, number) == 0 ? 1 : 0;
    return sum;
}

size_t ForkedLog::acknowledged() const
{
    size_t sum = 0;
    for (const auto &numbers : acknowledged_)
        sum += numbers.size();
    return sum;
}

} // namespace zelvo_test
