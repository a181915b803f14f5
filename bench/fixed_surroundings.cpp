// SPDX-License-Identifier: Apache-2.0
// The linker gives these functions of the program to the shared libraries in place of the system's.
#include "fixed_surroundings.h"

#include <cstdint>
#include <sys/time.h>
#include <unistd.h>

namespace {

constexpr int64_t MILLISECONDS_PER_SECOND = 1000;
constexpr int64_t MICROSECONDS_PER_MILLISECOND = 1000;

int64_t milliseconds = 1'709'294'400'000; // 2024-03-01 12:00:00 UTC

} // namespace

void zelvo_bench::passMillisecond()
{
    ++milliseconds;
}

extern "C" int gettimeofday(timeval *now, void * /*zone*/) noexcept
{
    now->tv_sec = milliseconds / MILLISECONDS_PER_SECOND;
    now->tv_usec = milliseconds % MILLISECONDS_PER_SECOND * MICROSECONDS_PER_MILLISECOND;
    return 0;
}

extern "C" pid_t getpid() noexcept
{
    return 4242;
}
