// SPDX-License-Identifier: Apache-2.0
#include "Heap.h"

#include <atomic>
#include <cstddef>

#include <sys/time.h>
#include <sys/types.h>

namespace zelvo_test {
namespace {

std::atomic<int64_t> live{0};

void *counted(void *block)
{
    live += block != nullptr ? 1 : 0;
    return block;
}

} // namespace

int64_t liveBlocks()
{
    return live;
}

} // namespace zelvo_test

using zelvo_test::counted;
using zelvo_test::FailAlloc;

// --wrap=f sends the library's calls of f to __wrap_f and names the real one __real_f.
extern "C" {
void *__real_malloc(size_t size);
void *__real_calloc(size_t count, size_t size);
void *__real_realloc(void *block, size_t size);
void __real_free(void *block);
void *__wrap_malloc(size_t size);
void *__wrap_calloc(size_t count, size_t size);
void *__wrap_realloc(void *block, size_t size);
void __wrap_free(void *block);
int __wrap_gettimeofday(timeval *now, void *zone);
int __wrap_fsync(int file);
pid_t __wrap_getpid();

void *__wrap_malloc(size_t size)
{
    return FailAlloc::strikes() ? nullptr : counted(__real_malloc(size));
}

void *__wrap_calloc(size_t count, size_t size)
{
    return FailAlloc::strikes() ? nullptr : counted(__real_calloc(count, size));
}

void *__wrap_realloc(void *block, size_t size)
{
    if (FailAlloc::strikes())
        return nullptr;
    void *grown = __real_realloc(block, size);
    return block == nullptr ? counted(grown) : grown;
}

void __wrap_free(void *block)
{
    zelvo_test::live -= block != nullptr ? 1 : 0;
    __real_free(block);
}

/// It is always noon on 1 March 2024, so that records can be compared.
int __wrap_gettimeofday(timeval *now, void *)
{
    *now = {.tv_sec = 1709294400, .tv_usec = 0};
    return 0;
}

/// All processes are one, so that their records can be compared.
pid_t __wrap_getpid()
{
    return 4711;
}

/// Nobody wants to wait for a disk thousands of times.
int __wrap_fsync(int)
{
    return 0;
}
}
