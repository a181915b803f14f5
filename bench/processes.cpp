// SPDX-License-Identifier: Apache-2.0
// How many line records per second go to one shared file when several processes write it.
#include <algorithm>

#include <sys/wait.h>
#include <unistd.h>

#include "process/OwnSemaphore.h"
#include "support/Records.h"

using namespace zelvo_bench;

namespace {

constexpr int RECORDS_EACH = 5000;

struct Pipe {
    int ends[2];

    Pipe()
    {
        if (pipe(ends) != 0)
            _exit(1);
    }
    Pipe(const Pipe &) = delete;
    Pipe &operator=(const Pipe &) = delete;
    ~Pipe()
    {
        close(ends[0]);
        closeWriting();
    }
    void closeWriting()
    {
        close(ends[1]);
        ends[1] = -1;
    }
    void tell() const
    {
        if (write(ends[1], "!", 1) != 1)
            _exit(1);
    }
    /// Waits for a byte, or for the end; tells whether it was a byte.
    bool await() const
    {
        char byte;
        return read(ends[0], &byte, 1) == 1;
    }
};

/// Reports twice: when it has logged a first record, and when it has logged all others.
[[noreturn]] void logAll(const Place &place, int32_t key, Pipe &start, const Pipe &reports)
{
    start.closeWriting();
    const OpenToolkit toolkit;
    const Tree tree(place, LINE, Shared{key});
    tree.log();
    reports.tell();
    start.await();
    for (int i = 0; i < RECORDS_EACH; ++i)
        tree.log();
    reports.tell();
    _exit(0);
}

/// Lets so many processes write at once; gives the seconds from the start to the last of them.
double logFrom(const Place &place, int32_t key, int processes)
{
    Pipe start;
    Pipe reports;
    for (int i = 0; i < processes; ++i)
        if (fork() == 0)
            logAll(place, key, start, reports);
    reports.closeWriting();
    for (int i = 0; i < processes; ++i)
        reports.await();
    const double seconds = secondsOf([&] {
        start.closeWriting();
        for (int i = 0; i < processes; ++i)
            reports.await();
    });
    while (wait(nullptr) > 0) {
    }
    return seconds;
}

size_t linesOf(const std::string &file)
{
    const std::string content = contentOf(file);
    return static_cast<size_t>(std::count(content.begin(), content.end(), '\n'));
}

void measureProcesses(const Place &place, int32_t key, int processes)
{
    const std::string name = "processes " + std::to_string(processes);
    const std::string file = Tree::sharedFile(place);
    benchmark::RegisterBenchmark(
        name.c_str(),
        [=, &place](benchmark::State &state) {
            empty(file);
            for ([[maybe_unused]] auto run : state)
                state.SetIterationTime(logFrom(place, key, processes));
            state.SetItemsProcessed(state.iterations() * processes * RECORDS_EACH);
            const auto logged = state.iterations() * processes * (RECORDS_EACH + 1);
            if (linesOf(file) != static_cast<size_t>(logged))
                state.SkipWithError("the log file has not all records");
        })
        ->UseManualTime()
        ->Repetitions(7);
}

} // namespace

int main(int argc, char **argv)
{
    const Place place;
    const zelvo_test::OwnSemaphore semaphore;
    for (const int processes : {1, 2, 4})
        measureProcesses(place, semaphore.key(), processes);
    return runBenchmarks(argc, argv);
}
