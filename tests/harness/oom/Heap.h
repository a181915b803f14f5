// SPDX-License-Identifier: Apache-2.0
// The allocator as the library sees it: what it gives is counted, and fails when a test says so.
#pragma once

#include <cstdint>
#include <string>

#include "support/FailAlloc.h"

namespace zelvo_test {

/// Blocks that the library, or a test in its place, has allocated and not freed.
int64_t liveBlocks();

/// Which allocation fails: the one after so many others, alone or with all that follow.
class Fault {
public:
    Fault(uint32_t allowed, FailAlloc::Span span) : allowed_(allowed), span_(span) {}

    /// One that never strikes.
    static Fault none() { return {UINT32_MAX, FailAlloc::Once}; }

    /// Runs CALL while allocations fail. The first call alone: what comes later is spared.
    template <class Call>
    auto during(Call call)
    {
        FailAlloc fail(isSpent_ ? UINT32_MAX : allowed_, isSpent_ ? FailAlloc::Once : span_);
        const Tally tally{*this, fail};
        return call();
    }

    uint32_t asked() const { return asked_; }
    uint32_t failed() const { return failed_; }

    /// "allocation 3 fails" or "allocations from 3 on fail".
    std::string text() const
    {
        const std::string number = std::to_string(allowed_ + 1);
        return span_ == FailAlloc::Once ? "allocation " + number + " fails"
                                        : "allocations from " + number + " on fail";
    }

private:
    /// Notes at the end of a call what it asked for.
    struct Tally {
        Fault &fault;
        const FailAlloc &fail;
        ~Tally()
        {
            if (fault.isSpent_)
                return;
            fault.asked_ = fail.asked();
            fault.failed_ = fail.failed();
            fault.isSpent_ = true;
        }
    };

    uint32_t allowed_;
    FailAlloc::Span span_;
    bool isSpent_ = false;
    uint32_t asked_ = 0;
    uint32_t failed_ = 0;
};

} // namespace zelvo_test
