// SPDX-License-Identifier: Apache-2.0
#include "support/FailAlloc.h"

#include <cstddef>

namespace zelvo_test {
namespace {
thread_local FailAlloc *current = nullptr;
}

FailAlloc::FailAlloc(uint32_t allowed, Span span) : allowed_(allowed), span_(span), outer_(current)
{
    current = this;
}

FailAlloc::~FailAlloc()
{
    current = outer_;
}

bool FailAlloc::strikes()
{
    if (current == nullptr)
        return false;
    uint32_t before = current->asked_++;
    bool fails = current->span_ == Once ? before == current->allowed_ : before >= current->allowed_;
    current->failed_ += fails ? 1 : 0;
    return fails;
}

} // namespace zelvo_test

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
