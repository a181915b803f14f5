// SPDX-License-Identifier: Apache-2.0
// What is logged while a process ends.
#include <cstdio>

#include "support/Child.h"
#include "support/TestDir.h"

using namespace zelvo_test;

namespace {

/// A way to log late (late_logger.cpp), and the lines that stand in the file afterwards.
struct Late {
    const char *way;
    const char *log;
};

const Late LATE[] = {
    {"destructor", "- from a destructor\n"},
    {"destructor_left_open", "- from a destructor\n"},
    {"atexit", "- from atexit\n"},
    {"after_close", "- before\n"},
    {"second_life", "- before\n- from a second life\n"},
    {"thread_ends", "- from the end of a thread\n- from the end of a thread\n"},
    {"at_once", "- before\n"},
};

class LateLogging : public TestDir, public testing::WithParamInterface<Late> {
protected:
    /// The exit status of the program; -1 when a signal ended it.
    static int run(const char *way)
    {
        write("late.properties", "late.log.className = zlv_basiclogger\n"
                                 "late.log.listenerNames = late.file\n"
                                 "late.file.className = zlv_filehandler\n"
                                 "late.file.fileName = late.log\n"
                                 "late.file.maxFiles = 1\n"
                                 "late.file.formatterName = late.line\n"
                                 "late.line.className = zlv_basicformatter\n"
                                 "late.line.dateTimeFormat = '-'\n");
        return inChild([way] {
            execl(LATE_LOGGER, LATE_LOGGER, way, nullptr);
            return 127;
        });
    }
};

} // namespace

TEST_P(LateLogging, IsWritten)
{
    EXPECT_EQ(run(GetParam().way), 0);
    EXPECT_EQ(read("late.log"), GetParam().log);
}

INSTANTIATE_TEST_SUITE_P(, LateLogging, testing::ValuesIn(LATE),
                         [](const auto &late) { return late.param.way; });

TEST_F(LateLogging, OfThreadsThatAreLeftEndsWithTheProcess)
{
    constexpr int rounds = 20;
    size_t sum = 0;
    for (int round = 0; round < rounds; ++round) {
        ASSERT_EQ(run("threads_left"), 0);
        std::istringstream log(read("late.log"));
        size_t records = 0;
        for (std::string line; std::getline(log, line); ++records)
            ASSERT_TRUE(line == "- from a thread that is left" || log.eof()) << line;
        ASSERT_GE(records, 1000U);
        sum += records;
    }
    std::printf("figures: life: %d processes ended while four threads logged, %zu records\n",
                rounds, sum);
}
