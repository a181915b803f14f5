// SPDX-License-Identifier: Apache-2.0
// How an action becomes a benchmark.
#pragma once

#include <chrono>
#include <string>
#include <vector>

#include <benchmark/benchmark.h>

#include "support/Place.h"

namespace zelvo_bench {

using Benchmark = benchmark::internal::Benchmark;

/// Log files that an action writes to, and how many bytes each of its runs adds to each of them.
struct Output {
    std::vector<std::string> files;
    size_t bytesEach;
};

/// Refuses a result when records are missing, torn or still in a buffer.
inline void check(benchmark::State &state, const Output &output)
{
    const auto runs = static_cast<size_t>(state.iterations() * state.threads());
    for (const std::string &file : output.files)
        if (sizeOf(file) != runs * output.bytesEach)
            state.SkipWithError("the log file has not the size that its records make");
}

/// An action that writes to log files. They are empty at the beginning of each repetition.
template <class Action>
Benchmark *measure(const std::string &name, const Output &output, Action action)
{
    return benchmark::RegisterBenchmark(name.c_str(),
                                        [=](benchmark::State &state) {
                                            if (state.thread_index() == 0)
                                                for (const std::string &file : output.files)
                                                    empty(file);
                                            for ([[maybe_unused]] auto run : state)
                                                action();
                                            if (state.thread_index() == 0)
                                                check(state, output);
                                        })
        ->UseRealTime();
}

/// An action that takes a few nanoseconds, so that the loop around it must not count.
template <class Action>
Benchmark *measureCheap(const std::string &name, Action action)
{
    return benchmark::RegisterBenchmark(name.c_str(),
                                        [=](benchmark::State &state) {
                                            constexpr int RUNS = 100;
                                            while (state.KeepRunningBatch(RUNS)) {
#pragma GCC unroll 10
                                                for (int i = 0; i < RUNS; ++i)
                                                    action();
                                            }
                                        })
        ->UseRealTime();
}

/// An action that measures itself, and gives the seconds that each of its runs took.
template <class Action>
Benchmark *measureItself(const std::string &name, Action action)
{
    return benchmark::RegisterBenchmark(name.c_str(),
                                        [=](benchmark::State &state) {
                                            for ([[maybe_unused]] auto run : state)
                                                state.SetIterationTime(action());
                                        })
        ->UseManualTime();
}

template <class Action>
double secondsOf(Action action)
{
    const auto begin = std::chrono::steady_clock::now();
    action();
    return std::chrono::duration<double>(std::chrono::steady_clock::now() - begin).count();
}

/// Runs what was registered, as the arguments tell. Gives what main() returns.
int runBenchmarks(int argc, char **argv);

} // namespace zelvo_bench
