// SPDX-License-Identifier: Apache-2.0
// Forks while other threads log and roll over, from outside and from inside the library.
#include <cstdio>

#include <unistd.h>

#include "ForkedLog.h"

using namespace zelvo_test;

namespace {

constexpr uint32_t FORKS = 500;
constexpr uint32_t CALLS = 100; // of the class function that forks
constexpr uint32_t MORE_THAN_A_FILE = 700;

class Forks : public ForkedLog {
protected:
    /// Every fiftieth child logs so much that it has to roll over.
    void forkAgainAndAgain()
    {
        uint32_t number = 1;
        for (uint32_t fork = 1; fork <= FORKS; ++fork) {
            const uint32_t count = fork % 50 == 0 ? MORE_THAN_A_FILE : 2;
            forkOnce(number, count);
            number += count;
        }
    }

    Census count(const char *name)
    {
        log(PARENT, 1);
        const Census census = close();
        std::printf("figures: forks: %s: %u forks, %zu acknowledged, %u rollovers, lost %zu, "
                    "doubled %zu, fragments %zu, out of order %zu\n",
                    name, forks_.load(), acknowledged(), census.olderFiles(), lost(census),
                    census.doubled(), census.fragments(), census.outOfOrder());
        return census;
    }
};

/// Set by the class function that forks, in the child.
bool isChild = false;
pid_t childOfClassFunction = -1;

/// Both processes return from here, and so go on with the event.
void forkAndLog(ZlvObject *logger, ZlvEvent *event, va_list args)
{
    childOfClassFunction = fork();
    isChild = childOfClassFunction == 0;
    ZlvBasicObjectFLog(logger, event, args);
}

} // namespace

TEST_F(Forks, OfASharedFileLeaveEveryRecordWholeAndOnce)
{
    open("zlv_multiproc_filehandler");
    startThreads();
    forkAgainAndAgain();
    stopThreads();
    const Census census = count("shared file");
    EXPECT_EQ(lost(census), 0U);
    EXPECT_EQ(census.doubled() + census.fragments() + census.outOfOrder(), 0U);
    EXPECT_EQ(semaphore_.value(), 1);
}

TEST_F(Forks, OfAFileOfOneProcessLeaveEveryRecordWhole)
{
    open("zlv_filehandler");
    startThreads();
    forkAgainAndAgain();
    stopThreads();
    const Census census = count("file of one process");
    EXPECT_EQ(census.doubled() + census.fragments(), 0U);
}

TEST_F(Forks, FromAClassFunctionGoOnWithTheEventInBothProcesses)
{
    open("zlv_multiproc_filehandler");
    ZlvAddLoggerClass("forking_logger", nullptr, nullptr, nullptr, ZlvBasicLoggerFCfgChange,
                      forkAndLog);
    ZlvObject *forking = ZlvGetObject("forking.log", "forking_logger");
    ZlvSetObjProp(forking, "listenerNames", "writer.file");
    startThreads();
    std::thread other([this] { forkAgainAndAgain(); });
    for (uint32_t number = 1; number <= CALLS; ++number) {
        EXPECT_TRUE(logRecord(forking, jobOf(FORKING_CALLS), number));
        if (isChild)
            endChild([&] { return logRecord(logger_, jobOf(FORKING_CALLS), CALLS + number); });
        awaitChild(childOfClassFunction);
    }
    other.join();
    stopThreads();
    ZlvReleaseObject(forking);
    const Census census = count("from a class function");
    for (uint32_t number = 1; number <= CALLS; ++number) {
        EXPECT_EQ(census.copiesOf(FORKING_CALLS, number), 2U);
        EXPECT_EQ(census.copiesOf(FORKING_CALLS, CALLS + number), 1U);
    }
    EXPECT_EQ(lost(census) + census.fragments(), 0U);
    EXPECT_EQ(census.doubled(), CALLS);
}

TEST_F(Forks, WhileTheToolkitOpensAndClosesHangNobody)
{
    std::atomic<bool> ended = false;
    std::thread forking([&] {
        for (uint32_t number = 0; number < FORKS; ++number) {
            const pid_t child = fork();
            if (child == 0)
                endChild([] { return ZlvOpenToolkit(nullptr, nullptr) == 1; });
            awaitChild(child);
        }
        ended = true;
    });
    uint32_t lives = 0;
    for (; !ended; ++lives) {
        ZlvOpenToolkit(nullptr, nullptr);
        ZlvCloseToolkit();
    }
    forking.join();
    EXPECT_GT(lives, 0U);
    std::printf("figures: forks: %u forks while the toolkit opened and closed\n", FORKS);
}
