// SPDX-License-Identifier: Apache-2.0
// Writers that are killed at any moment and started again.
#include <cstdio>
#include <random>
#include <set>

#include "process/Records.h"
#include "process/WriterProcess.h"

using namespace zelvo_test;

namespace {

constexpr uint32_t WRITERS = 4;
constexpr uint32_t KILLS = 200;
constexpr uint32_t MOST_RECORDS_BETWEEN = 150;
constexpr uint32_t MOST_MICROSECONDS_MORE = 2000;
constexpr int32_t MAX_BYTES = 16 * 1024; // a good part of all time is spent in rollovers
constexpr int32_t MOST_FILES = 2000;

class Kills : public SharedLogTest {
protected:
    /// A writer that is played by one process after the other.
    struct Role {
        Role(const Job &itsJob) : job(itsJob), progress(itsJob.progress) { start(); }

        void start() { process = std::make_unique<WriterProcess>(WRITER, job); }

        /// Kills the process once it has written so many more records and a while has passed, and
        /// starts another.
        void killAfter(uint32_t records, uint32_t microseconds)
        {
            const uint32_t goal = progress->acknowledged + records;
            EXPECT_TRUE(eventually([&] { return progress->acknowledged >= goal; }));
            usleep(microseconds); // waits for nothing: it moves the kill to a random step
            process->kill();
            if (progress->begun != progress->acknowledged)
                unanswered.insert(progress->begun);
            start();
        }

        bool wasAcknowledged(uint32_t number) const { return unanswered.count(number) == 0; }

        Job job;
        SharedProgress progress;
        std::unique_ptr<WriterProcess> process;
        std::set<uint32_t> unanswered; ///< records begun by those killed before the call returned
    };

    Kills()
    {
        for (uint32_t writer = 0; writer < WRITERS; ++writer) {
            Job job = jobFor(writer, 0);
            job.maxBytes = MAX_BYTES;
            job.maxFiles = MOST_FILES;
            roles_.push_back(std::make_unique<Role>(job));
        }
    }

    void killAtRandom()
    {
        std::minstd_rand random(20);
        const auto next = [&random](uint32_t bound) {
            return static_cast<uint32_t>(random() % bound);
        };
        for (uint32_t kill = 0; kill < KILLS; ++kill)
            roles_[next(WRITERS)]->killAfter(next(MOST_RECORDS_BETWEEN),
                                             next(MOST_MICROSECONDS_MORE));
    }

    void stopAll()
    {
        for (const auto &role : roles_)
            role->progress->stop = 1;
        for (const auto &role : roles_)
            EXPECT_EQ(role->process->result(), WRITER_DONE);
    }

    /// Acknowledged records that are nowhere.
    size_t lost(const Census &census) const
    {
        size_t sum = 0;
        for (const auto &role : roles_)
            for (uint32_t number = 1; number <= role->progress->begun; ++number)
                sum +=
                    role->wasAcknowledged(number) && census.copiesOf(role->job.writer, number) == 0
                        ? 1
                        : 0;
        return sum;
    }

    size_t unanswered() const
    {
        size_t sum = 0;
        for (const auto &role : roles_)
            sum += role->unanswered.size();
        return sum;
    }

    std::vector<std::unique_ptr<Role>> roles_;
};

} // namespace

TEST_F(Kills, LoseNoAcknowledgedRecordAndLeaveTheSemaphoreFree)
{
    killAtRandom();
    stopAll();
    const Census census(directory(), 1);
    std::printf("%u kills, %zu in a call: %zu records, %u rollovers, lost %zu, doubled %zu, "
                "fragments %zu\n",
                KILLS, unanswered(), census.distinct(), census.olderFiles(), lost(census),
                census.doubled(), census.fragments());
    EXPECT_EQ(lost(census), 0U);
    EXPECT_LE(census.fragments(), KILLS);
    EXPECT_GT(census.olderFiles(), 0U);
    EXPECT_LT(census.olderFiles(), MOST_FILES - 1U);
    EXPECT_EQ(semaphore_.value(), 1);
}

TEST_F(Kills, LetTheNextWriterProceed)
{
    for (uint32_t kill = 0; kill < 20; ++kill)
        roles_[kill % WRITERS]->killAfter(kill, 0);
    stopAll();
    const auto start = std::chrono::steady_clock::now();
    EXPECT_EQ(runWriter(jobFor(WRITERS, 1)), WRITER_DONE);
    std::printf("the next writer took %.3f s\n", secondsSince(start));
    EXPECT_EQ(Census(directory(), 1).copiesOf(WRITERS, 1), 1U);
}
