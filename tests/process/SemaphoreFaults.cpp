// SPDX-License-Identifier: Apache-2.0
// Semaphores that are interrupted, held for ever, removed, or not ours.
#include <csignal>
#include <cstdio>
#include <linux/capability.h>
#include <sys/prctl.h>

#include "process/Records.h"
#include "process/WriterProcess.h"
#include "support/Child.h"

using namespace zelvo_test;

namespace {

class SemaphoreFaults : public SharedLogTest {
protected:
    bool eventuallyWaiting(int writers)
    {
        return eventually([&] { return semaphore_.waiters() == writers; });
    }
};

} // namespace

TEST_F(SemaphoreFaults, AStormOfSignalsCostsNoRecord)
{
    constexpr uint32_t writers = 4;
    constexpr uint32_t records = 2000;
    Gate gate;
    std::vector<std::unique_ptr<WriterProcess>> processes;
    for (uint32_t writer = 0; writer < writers; ++writer) {
        Job job = jobFor(writer, records);
        job.signalMicros = 500;
        processes.push_back(std::make_unique<WriterProcess>(WRITER, job, &gate));
    }
    const auto start = std::chrono::steady_clock::now();
    gate.open();
    for (const auto &process : processes)
        EXPECT_EQ(process->result(), WRITER_DONE);
    std::printf("%.1f s\n", secondsSince(start));
    const Census census(directory(), 1);
    EXPECT_EQ(census.distinct(), writers * records);
    EXPECT_EQ(census.doubled() + census.fragments() + census.outOfOrder(), 0U);
    EXPECT_EQ(semaphore_.value(), 1);
}

TEST_F(SemaphoreFaults, SignalsDuringAWaitEndItUnguardedAfterTenWholeSeconds)
{
    semaphore_.makeHeld();
    Job job = jobFor(0, 1);
    job.signalMicros = 5000;
    const auto start = std::chrono::steady_clock::now();
    EXPECT_EQ(runWriter(job), WRITER_DONE);
    const double seconds = secondsSince(start);
    std::printf("gave up after %.1f s\n", seconds);
    EXPECT_GE(seconds, 10.0);
    EXPECT_EQ(Census(directory(), 1).distinct(), 1U);
}

TEST_F(SemaphoreFaults, AHolderThatDiesLetsTheWaitingWriterProceed)
{
    ASSERT_EQ(runWriter(jobFor(0, 1)), WRITER_DONE);
    Child holder([this] {
        semaphore_.take();
        return pause();
    });
    ASSERT_TRUE(eventually([this] { return semaphore_.value() == 0; }));
    WriterProcess writer(WRITER, jobFor(1, 1));
    EXPECT_TRUE(eventuallyWaiting(1));
    const auto start = std::chrono::steady_clock::now();
    holder.kill();
    EXPECT_EQ(writer.result(), WRITER_DONE);
    std::printf("proceeded after %.3f s\n", secondsSince(start));
    EXPECT_EQ(Census(directory(), 1).distinct(), 2U);
    EXPECT_EQ(semaphore_.value(), 1);
}

TEST_F(SemaphoreFaults, RemovingTheSetWakesThoseWhoWaitAndTheirRecordsAreDropped)
{
    constexpr uint32_t writers = 4;
    semaphore_.makeHeld();
    std::vector<std::unique_ptr<WriterProcess>> processes;
    for (uint32_t writer = 0; writer < writers; ++writer)
        processes.push_back(std::make_unique<WriterProcess>(WRITER, jobFor(writer, 10)));
    EXPECT_TRUE(eventuallyWaiting(writers));
    semaphore_.remove();
    for (const auto &process : processes)
        EXPECT_EQ(process->result(), WRITER_DONE);
    EXPECT_EQ(liveSize(), 0U);
    EXPECT_EQ(semaphore_.id(), -1);
}

TEST_F(SemaphoreFaults, AProcessThatStartsAfterTheRemovalMakesANewSet)
{
    ASSERT_EQ(runWriter(jobFor(0, 1)), WRITER_DONE);
    semaphore_.remove();
    EXPECT_EQ(runWriter(jobFor(0, 1)), WRITER_DONE);
    EXPECT_EQ(Census(directory(), 1).distinct(), 2U);
    EXPECT_EQ(semaphore_.value(), 1);
}

TEST_F(SemaphoreFaults, ASetThatMayNotBeUsedDropsTheRecordsAndHangsNobody)
{
    semget(semaphore_.key(), 1, IPC_CREAT);
    // Root may use any set, unless it lacks the capability.
    const auto obeyPermissions = [] { prctl(PR_CAPBSET_DROP, CAP_IPC_OWNER); };
    EXPECT_EQ(WriterProcess(WRITER, jobFor(0, 10), nullptr, obeyPermissions).result(), WRITER_DONE);
    EXPECT_EQ(liveSize(), 0U);
}
