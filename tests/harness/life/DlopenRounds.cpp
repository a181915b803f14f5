// SPDX-License-Identifier: Apache-2.0
// A program that loads the library, logs and unloads it, again and again.
//
// The program keeps ICU loaded, except where the test says otherwise: an ICU that is unloaded
// leaves behind what it has allocated.
#include <algorithm>
#include <barrier>
#include <cstdio>
#include <forward_list>
#include <thread>

#include <unistd.h>

#include "LoadedLibrary.h"
#include "support/Child.h"
#include "support/HeapInUse.h"
#include "support/TestDir.h"

using namespace zelvo_test;

namespace {

constexpr int ROUNDS = 1000;
constexpr int ROUNDS_BEFORE = 100;
/// Less than two bytes for each round.
constexpr long SLACK_BYTES = 1024;

enum class Ending { CLOSED, LEFT_OPEN };

/// What a process has.
struct Possessions {
    long heap = static_cast<long>(heapInUse());
    long resident = residentBytes();
    long descriptors = entriesOf("/proc/self/fd");
    long threads = entriesOf("/proc/self/task");

    static long residentBytes()
    {
        long pages = 0;
        std::ifstream("/proc/self/statm") >> pages >> pages;
        return pages * sysconf(_SC_PAGESIZE);
    }

    static long entriesOf(const char *directory)
    {
        const std::filesystem::directory_iterator all(directory);
        return std::distance(begin(all), end(all));
    }
};

/// What has been added by the rounds after the first ones.
struct Growth {
    long heap;
    long resident;
    long descriptors;
    long threads;
};

class DlopenRounds : public TestDir {
protected:
    /// Loads the library, opens the toolkit with a log file, logs; unloads the library.
    static void liveOnce(Ending ending)
    {
        const LoadedLibrary library;
        ASSERT_TRUE(library) << dlerror();
#define ZELVO(NAME) library.find<decltype(::NAME)>(#NAME)
        ZELVO(ZlvOpenToolkit)("life.properties", nullptr);
        ZlvObject *logger = ZELVO(ZlvGetObject)("life.log", nullptr);
        const ZlvStatus status = ZELVO(ZlvLogUText)(logger, u"{0} lives", u"größer");
        EXPECT_EQ(status.type, CX_STATUS_OK);
        if (ending == Ending::LEFT_OPEN)
            return;
        ZELVO(ZlvReleaseObject)(logger);
        ZELVO(ZlvCloseToolkit)();
#undef ZELVO
    }

    void SetUp() override
    {
        configure("");
    }

    static void configure(const std::string &more)
    {
        write("life.properties", more + "life.log.className = zlv_basiclogger\n"
                                        "life.log.listenerNames = life.file\n"
                                        "life.file.className = zlv_filehandler\n"
                                        "life.file.fileName = life.log\n"
                                        "life.file.maxFiles = 1\n"
                                        "life.file.formatterName = zelvo.defaultFormatter\n");
    }

    static bool isMapped(const std::string &name)
    {
        std::ifstream maps("/proc/self/maps");
        for (std::string line; std::getline(maps, line);)
            if (line.find(name) != line.npos)
                return true;
        return false;
    }

    static void keepIcuLoaded()
    {
        ASSERT_NE(dlopen(ICU_LIBRARY, RTLD_NOW | RTLD_GLOBAL), nullptr) << dlerror();
    }

    static void makeRounds(int rounds, Ending ending, const std::function<void()> &besides)
    {
        for (int round = 0; round < rounds; ++round) {
            liveOnce(ending);
            besides();
        }
    }

    /// Makes the rounds, with something besides in each of them.
    static Growth grow(
        const char *what, Ending ending, const std::function<void()> &besides = [] {})
    {
        makeRounds(ROUNDS_BEFORE, ending, besides);
        const Possessions before;
        makeRounds(ROUNDS - ROUNDS_BEFORE, ending, besides);
        const Possessions after;
        const Growth growth = {after.heap - before.heap, after.resident - before.resident,
                               after.descriptors - before.descriptors,
                               after.threads - before.threads};
        std::printf("figures: life: rounds %d to %d of loading, %s: %ld bytes of heap, %ld "
                    "resident, %ld descriptors, %ld threads more\n",
                    ROUNDS_BEFORE, ROUNDS, what, growth.heap, growth.resident, growth.descriptors,
                    growth.threads);
        return growth;
    }

    static size_t records()
    {
        const std::string log = read("life.log");
        return static_cast<size_t>(std::count(log.begin(), log.end(), '\n'));
    }
};

} // namespace

TEST_F(DlopenRounds, LeaveTheProcessAsItWas)
{
    keepIcuLoaded();
    const Growth growth = grow("closed each time", Ending::CLOSED);
    EXPECT_LT(growth.heap, SLACK_BYTES);
    EXPECT_LT(growth.resident, 1024 * 1024);
    EXPECT_EQ(growth.descriptors, 0);
    EXPECT_EQ(growth.threads, 0);
    EXPECT_FALSE(isMapped("libzelvo"));
    EXPECT_TRUE(isMapped("libicuuc"));
    EXPECT_EQ(records(), size_t{ROUNDS});
}

TEST_F(DlopenRounds, LeaveNoForkHandlerBehind)
{
    keepIcuLoaded();
    for (int round = 0; round < 100; ++round) {
        liveOnce(Ending::CLOSED);
        ASSERT_FALSE(isMapped("libzelvo"));
        EXPECT_EQ(inChild([] {
                      liveOnce(Ending::CLOSED);
                      return HasFailure() ? 1 : 0;
                  }),
                  0);
    }
    EXPECT_EQ(records(), 200U);
}

TEST_F(DlopenRounds, MayBeMadeInTurnByThreadsThatLiveOn)
{
    keepIcuLoaded();
    bool ended = false;
    std::barrier turn(2);
    std::thread other([&] {
        for (turn.arrive_and_wait(); !ended; turn.arrive_and_wait()) {
            liveOnce(Ending::CLOSED);
            turn.arrive_and_wait();
        }
    });
    const Growth growth = grow("by two threads in turn", Ending::CLOSED, [&] {
        turn.arrive_and_wait();
        turn.arrive_and_wait();
    });
    ended = true;
    turn.arrive_and_wait();
    other.join();
    EXPECT_LT(growth.heap, SLACK_BYTES);
    EXPECT_EQ(growth.descriptors, 0);
    EXPECT_FALSE(isMapped("libzelvo"));
    EXPECT_EQ(records(), size_t{2} * ROUNDS);
}

// Names of locales are kept until the process ends, and the library forgets where.
TEST_F(DlopenRounds, WithALocaleLeakItsName)
{
    keepIcuLoaded();
    configure("zelvo.defaultFormatter.className = zlv_basicformatter\n"
              "zelvo.defaultFormatter.locale = de\n");
    const Growth growth = grow("with a locale", Ending::CLOSED);
    EXPECT_GT(growth.heap, 0);
    EXPECT_LE(growth.heap, (ROUNDS - ROUNDS_BEFORE) * 64);
    EXPECT_EQ(growth.descriptors, 0);
}

TEST_F(DlopenRounds, WithoutClosingLeakWhatWasOpen)
{
    keepIcuLoaded();
    const Growth growth = grow("never closed", Ending::LEFT_OPEN);
    EXPECT_EQ(growth.descriptors, ROUNDS - ROUNDS_BEFORE);
    EXPECT_GT(growth.heap, SLACK_BYTES);
    EXPECT_FALSE(isMapped("libzelvo"));
    EXPECT_EQ(records(), size_t{ROUNDS});
}

TEST_F(DlopenRounds, ThatUnloadIcuTooLeakWhatIcuHasAllocated)
{
    ASSERT_FALSE(isMapped("libicuuc"));
    const Growth growth = grow("ICU unloaded as well", Ending::CLOSED);
    EXPECT_FALSE(isMapped("libicuuc"));
    EXPECT_EQ(growth.descriptors, 0);
    EXPECT_EQ(records(), size_t{ROUNDS});
}

TEST_F(DlopenRounds, WithALeakAreFoundOut)
{
    keepIcuLoaded();
    const Growth growth = grow("with a leak made on purpose", Ending::CLOSED, [] {
        static std::forward_list<long> leaked;
        leaked.push_front(0);
        EXPECT_NE(dup(STDIN_FILENO), -1);
    });
    EXPECT_GT(growth.heap, SLACK_BYTES);
    EXPECT_EQ(growth.descriptors, ROUNDS - ROUNDS_BEFORE);
}
