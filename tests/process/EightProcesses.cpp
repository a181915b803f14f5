// SPDX-License-Identifier: Apache-2.0
// Eight processes that write to one file while it rolls over.
#include <cstdio>

#include "process/Records.h"
#include "process/WriterProcess.h"

using namespace zelvo_test;

namespace {

constexpr uint32_t WRITERS = 8;
constexpr uint32_t RECORDS = 25000;

class EightProcesses : public SharedLogTest, public testing::WithParamInterface<uint32_t> {
protected:
    /// Runs eight writers to their end.
    Census writeAll(const char *program, uint32_t seed, uint32_t records)
    {
        Gate gate;
        std::vector<std::unique_ptr<WriterProcess>> writers;
        for (uint32_t writer = 0; writer < WRITERS; ++writer) {
            Job job = jobFor(writer, records);
            job.seed = seed;
            writers.push_back(std::make_unique<WriterProcess>(program, job, &gate));
        }
        gate.open();
        for (const auto &writer : writers)
            EXPECT_EQ(writer->result(), WRITER_DONE);
        return Census(directory(), seed);
    }
};

} // namespace

TEST_P(EightProcesses, LoseTearDoubleAndMixNothingIn200000Records)
{
    const auto start = std::chrono::steady_clock::now();
    const Census census = writeAll(WRITER, GetParam(), RECORDS);
    std::printf("%zu records, %u rollovers, %.1f s\n", census.distinct(), census.olderFiles(),
                secondsSince(start));
    EXPECT_EQ(census.distinct(), WRITERS * RECORDS);
    EXPECT_EQ(census.doubled(), 0U);
    EXPECT_EQ(census.fragments(), 0U);
    EXPECT_EQ(census.outOfOrder(), 0U);
    EXPECT_GE(census.olderFiles(), 300U);
    EXPECT_EQ(semaphore_.value(), 1);
}

INSTANTIATE_TEST_SUITE_P(Seed, EightProcesses, testing::Range(1U, SEEDS + 1U));

// Without it the test above would prove little.
TEST_F(EightProcesses, DamageTheLogWithoutTheLock)
{
    const Census census = writeAll(UNLOCKED_WRITER, 1, RECORDS);
    const size_t lost = WRITERS * RECORDS - census.distinct();
    std::printf("lost %zu, doubled %zu, fragments %zu, out of order %zu\n", lost, census.doubled(),
                census.fragments(), census.outOfOrder());
    EXPECT_GT(lost + census.doubled() + census.fragments(), 0U);
}
