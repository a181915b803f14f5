// SPDX-License-Identifier: Apache-2.0
#include "support/FailAlloc.h"

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
