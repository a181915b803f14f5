// SPDX-License-Identifier: Apache-2.0
// How often a record of each kind asks for memory. This program's allocating functions stand before
// those of the C library for all libraries in the process.
#include <atomic>
#include <deque>

#include "process/OwnSemaphore.h"
#include "support/Records.h"

using namespace zelvo_bench;

namespace {

std::atomic<uint64_t> asked;

constexpr int WARM_UP = 1000;
constexpr int RECORDS = 10000;

} // namespace

extern "C" {

void *__libc_malloc(size_t size) noexcept;
void *__libc_calloc(size_t count, size_t size) noexcept;
void *__libc_realloc(void *area, size_t size) noexcept;

void *malloc(size_t size) noexcept
{
    ++asked;
    return __libc_malloc(size);
}

void *calloc(size_t count, size_t size) noexcept
{
    ++asked;
    return __libc_calloc(count, size);
}

void *realloc(void *area, size_t size) noexcept
{
    ++asked;
    return __libc_realloc(area, size);
}
}

namespace {

void countFor(const std::string &name, const Tree &tree)
{
    const auto count = [&tree](benchmark::State &state) {
        for (int i = 0; i < WARM_UP; ++i)
            tree.log();
        uint64_t before = asked;
        for ([[maybe_unused]] auto run : state)
            tree.log();
        state.counters["allocations"] = benchmark::Counter(static_cast<double>(asked - before),
                                                           benchmark::Counter::kAvgIterations);
    };
    benchmark::RegisterBenchmark(name.c_str(), count)->Iterations(RECORDS)->Repetitions(1);
}

} // namespace

int main(int argc, char **argv)
{
    const Place place;
    const zelvo_test::OwnSemaphore semaphore;
    const OpenToolkit toolkit;
    std::deque<Tree> trees;
    for (const Kind &kind : allKinds)
        countFor(kind.name, trees.emplace_back(place, kind));
    countFor("shared", trees.emplace_back(place, LINE, Shared{semaphore.key()}));
    return runBenchmarks(argc, argv);
}
