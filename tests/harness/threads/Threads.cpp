// SPDX-License-Identifier: Apache-2.0
// Eight threads that do everything at once to one toolkit, for as many seconds as the first
// argument tells.
#include <chrono>
#include <csignal>
#include <cstdio>
#include <cstdlib>
#include <thread>

#include <unistd.h>

#include "Activities.h"
#include "Twins.h"
#include "process/OwnSemaphore.h"
#include "process/Records.h"
#include "support/TestDir.h"

using namespace zelvo_test;

namespace {

constexpr uint32_t THREADS = 8;
constexpr unsigned SECONDS_TO_HANG = 120;

int seconds = 45;

class Threads : public TestDir {
protected:
    Threads()
    {
        std::signal(SIGALRM, [](int) {
            constexpr char text[] = "the threads wait for each other\n";
            static_cast<void>(::write(STDOUT_FILENO, text, sizeof text - 1) + 1);
            _exit(3);
        });
        alarm(static_cast<unsigned>(seconds) + SECONDS_TO_HANG);
        for (uint32_t thread = 0; thread < THREADS; ++thread)
            workers_.push_back({.common = common_, .records = jobOf(thread)});
    }

    Job jobOf(uint32_t writer) const
    {
        return {.key = semaphore_.key(), .maxBytes = 16 * 1024, .maxFiles = 1000, .writer = writer};
    }

    void actAll()
    {
        const auto end = std::chrono::steady_clock::now() + std::chrono::seconds(seconds);
        std::vector<std::thread> threads;
        for (Worker &worker : workers_)
            threads.emplace_back([&worker, end, this] {
                worker.random.seed(worker.records.writer + 1);
                for (; std::chrono::steady_clock::now() < end; ++acts_)
                    actOnce(worker);
            });
        for (std::thread &thread : threads)
            thread.join();
    }

    /// Each numbered record of each thread stands once and in order.
    void checkRecords(const std::filesystem::path &place)
    {
        const Census census(place, jobOf(0).seed);
        size_t written = 0;
        for (const Worker &worker : workers_)
            written += worker.written;
        std::printf("figures: threads: %zu records, %u rollovers\n", written, census.olderFiles());
        EXPECT_EQ(census.distinct(), written);
        EXPECT_EQ(census.doubled() + census.fragments() + census.outOfOrder(), 0U);
    }

    /// Each line of a log begins with its date and is not cut off.
    static void checkLines(const std::string &name)
    {
        std::istringstream log(read(name));
        for (std::string line; std::getline(log, line);) {
            EXPECT_EQ(line.substr(0, 2), "20") << name << ": " << line;
            EXPECT_FALSE(log.eof()) << name << ": " << line;
        }
    }

    static long descriptors()
    {
        const std::filesystem::directory_iterator all("/proc/self/fd");
        return std::distance(begin(all), end(all));
    }

    OwnSemaphore semaphore_;
    Common common_{};
    std::vector<Worker> workers_;
    std::atomic<size_t> acts_ = 0;
};

} // namespace

TEST_F(Threads, MayDoEverythingAtOnce)
{
    const long before = descriptors();
    ASSERT_EQ(ZlvOpenToolkit(nullptr, nullptr), 1);
    common_ = makeCommon(jobOf(0));
    actAll();
    releaseCommon(common_);
    ZlvCloseToolkit();
    std::printf("figures: threads: %u threads, %d seconds, %zu acts\n", THREADS, seconds,
                acts_.load());
    checkRecords(directory());
    checkRecords(directory() / "own");
    for (const char *name : {"busy.file.txt", "busy.file1.txt", "busy.shared.txt"})
        checkLines(name);
    for (const Worker &worker : workers_)
        EXPECT_EQ(worker.failed, 0U);
    EXPECT_EQ(descriptors(), before);
    EXPECT_EQ(semaphore_.value(), 1);
}

TEST(Twins, HaveAllBeenCalledAndAnsweredRight)
{
    const TwinCount count = countTwins(ZELVO_TEST_EXPORTS);
    std::printf("figures: threads: %zu of %zu twins called from class functions\n",
                count.listed - count.missing.size(), count.listed);
    EXPECT_GT(count.listed, 0U);
    for (const std::string &name : count.missing)
        ADD_FAILURE() << name << " was not called";
    for (const std::string &claim : wrongAnswers())
        ADD_FAILURE() << claim;
}

int main(int argc, char **argv)
{
    testing::InitGoogleTest(&argc, argv);
    if (argc > 1)
        seconds = std::atoi(argv[1]);
    return RUN_ALL_TESTS();
}
