// SPDX-License-Identifier: Apache-2.0
// Stands between the library's files and its allocating wrappers.
#include <cstddef>

#include "support/FailAlloc.h"

// The names are the linker's: --wrap=f sends calls of f to __wrap_f and names the real one
// __real_f. NOLINTBEGIN(bugprone-reserved-identifier, cert-dcl37-c, cert-dcl51-cpp)
extern "C" {
void *__real_RkoMemoryMalloc(size_t size);
void *__real_RkoMemoryCalloc(size_t count, size_t size);
void *__real_RkoMemoryRealloc(void *block, size_t size);
void *__wrap_RkoMemoryMalloc(size_t size);
void *__wrap_RkoMemoryCalloc(size_t count, size_t size);
void *__wrap_RkoMemoryRealloc(void *block, size_t size);

void *__wrap_RkoMemoryMalloc(size_t size)
{
    return zelvo_test::FailAlloc::strikes() ? nullptr : __real_RkoMemoryMalloc(size);
}

void *__wrap_RkoMemoryCalloc(size_t count, size_t size)
{
    return zelvo_test::FailAlloc::strikes() ? nullptr : __real_RkoMemoryCalloc(count, size);
}

void *__wrap_RkoMemoryRealloc(void *block, size_t size)
{
    return zelvo_test::FailAlloc::strikes() ? nullptr : __real_RkoMemoryRealloc(block, size);
}
}
// NOLINTEND(bugprone-reserved-identifier, cert-dcl37-c, cert-dcl51-cpp)
