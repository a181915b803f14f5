// SPDX-License-Identifier: Apache-2.0
// Writers that are killed at a known step of a rollover.
#include <cstdio>
#include <cstdlib>

#include "process/Records.h"
#include "process/WriterProcess.h"

using namespace zelvo_test;

namespace {

/// A step of the third rollover, and what stands twice or in pieces when a process dies there.
struct Step {
    const char *name;
    const char *call; ///< of which this one is not made, or only half
    bool doublesSome; ///< records of the live file that stand in a copy too
    size_t fragments;
};

constexpr int32_t MAX_BYTES = 64 * 1024;
constexpr int32_t MAX_FILES = 10;
constexpr size_t MOST_RECORDS_OF_A_FILE = MAX_BYTES / 100 + 1;

const Step STEPS[] = {
    {"BeforeTheFirstRename", "rename 17", false, 0},
    {"BetweenTheRenames", "rename 24", false, 0},
    {"BeforeTheCopy", "lseek 7", false, 0},
    {"InTheMiddleOfTheCopy", "write 21", true, 1},
    {"BeforeTheFlush", "fsync 3", true, 0},
    {"BeforeTheLiveFileIsEmptied", "ftruncate 3", true, 0},
    {"AfterTheLiveFileIsEmptied", "lseek 9", false, 0},
};

class RolloverKills : public SharedLogTest, public testing::WithParamInterface<Step> {
protected:
    Job job(uint32_t count)
    {
        Job result = jobFor(0, count);
        result.maxBytes = MAX_BYTES;
        result.maxFiles = MAX_FILES;
        return result;
    }
};

} // namespace

TEST_P(RolloverKills, LoseNothingAtAnyStep)
{
    const auto dieAt = [] { setenv("DIE_AT", GetParam().call, 1); };
    EXPECT_EQ(WriterProcess(DYING_WRITER, job(0), nullptr, dieAt).result(), -SIGKILL);
    const SharedProgress progress(job(0).progress);
    const uint32_t unanswered = progress->begun;
    ASSERT_EQ(progress->acknowledged + 1, unanswered);
    EXPECT_EQ(semaphore_.value(), 1);
    EXPECT_EQ(runWriter(job(1000)), WRITER_DONE);

    const Census census(directory(), 1);
    std::printf("%s: doubled %zu, fragments %zu\n", GetParam().name, census.doubled(),
                census.fragments());
    EXPECT_EQ(census.copiesOf(0, unanswered), 0U);
    EXPECT_EQ(census.distinct(), progress->acknowledged - 1);
    EXPECT_EQ(census.doubled() > 0, GetParam().doublesSome);
    EXPECT_LE(census.doubled(), MOST_RECORDS_OF_A_FILE);
    EXPECT_EQ(census.fragments(), GetParam().fragments);
}

INSTANTIATE_TEST_SUITE_P(Step, RolloverKills, testing::ValuesIn(STEPS),
                         [](const auto &step) { return step.param.name; });
