// SPDX-License-Identifier: Apache-2.0
// Processes that log while each of their system calls in turn fails, once and several in a row,
// with each of some codes, or writes less than it was given.
#include <algorithm>
#include <cerrno>
#include <cstdio>

#include "Damage.h"
#include "process/OwnSemaphore.h"
#include "process/Records.h"
#include "support/TestDir.h"

using namespace zelvo_test;

namespace {

constexpr uint32_t RECORDS = 6;
constexpr int32_t LIMIT = 150;     // bytes: two records to a file
constexpr int32_t MOST_FILES = 12; // enough for each rollover of both runs

enum Writer : uint32_t { FAULTY, LAST };

struct Trial {
    const char *name;
    const char *handlerClass;
    CallFault kind;
    int code;
};

class FailingCalls : public TestDir, public testing::WithParamInterface<Trial> {
protected:
    bool isShared() const
    {
        return GetParam().handlerClass == std::string("zlv_multiproc_filehandler");
    }

    FaultyRun run(Writer writer, Fault fault)
    {
        const Job job{.file = "log/shared.log",
                      .key = semaphore_.key(),
                      .maxBytes = LIMIT,
                      .maxFiles = MOST_FILES,
                      .writer = writer,
                      .count = RECORDS};
        return runFaulty(GetParam().handlerClass, job, fault);
    }

    void beginAnew()
    {
        std::filesystem::remove_all("log");
        semaphore_.remove();
    }

    /// What the failing calls may cost together. A write that was cut is not noticed.
    Damage allowed(const FaultyRun &met, Fault fault) const
    {
        const LogLimits limits{isShared(), static_cast<size_t>(LIMIT) / 100 + 1, RECORDS};
        Damage sum;
        for (uint32_t i = 0; i < fault.count && fault.number <= met.calls.size(); ++i) {
            fault.kind = FAULT_FAIL;
            sum += mostDamage(met, fault, limits);
            if (GetParam().kind == FAULT_CUT && met.calls[fault.number - 1] == CALL_WRITE)
                sum += {.lost = 1, .fragments = 1};
            ++fault.number;
        }
        return sum;
    }

    /// A file of one process that cannot be measured is opened anew, with the old one left open.
    bool mayLeaveDescriptor(const FaultyRun &met, Fault fault) const
    {
        const auto first = met.calls.begin() + (fault.number - 1);
        const auto many = std::min<ptrdiff_t>(fault.count, met.calls.end() - first);
        return !isShared() && std::find(first, first + many, CALL_FSTAT) != first + many;
    }

    /// A faulty run, and one without a fault that follows it.
    void befall(Fault fault)
    {
        beginAnew();
        const FaultyRun met = run(FAULTY, fault);
        EXPECT_TRUE(met.hasEnded);
        EXPECT_TRUE(!met.leavesDescriptor || mayLeaveDescriptor(met, fault));
        const FaultyRun last = run(LAST, {});
        EXPECT_TRUE(last.hasEnded && !last.leavesDescriptor);
        EXPECT_EQ(last.acknowledged.size(), RECORDS);
        const Census census(directory() / "log", Job{}.seed);
        for (const uint32_t number : last.acknowledged)
            EXPECT_GE(census.copiesOf(LAST, number), 1U);
        EXPECT_TRUE(!isShared() || semaphore_.value() == 1);
        note(met, census, allowed(met, fault));
    }

    void note(const FaultyRun &met, const Census &census, const Damage &most)
    {
        size_t lost = 0;
        for (const uint32_t number : met.acknowledged)
            lost += census.copiesOf(FAULTY, number) == 0 ? 1 : 0;
        judge(lost, most.lost);
        EXPECT_LE(census.fragments(), most.fragments);
        ++runs_;
        acknowledged_ += met.acknowledged.size() + RECORDS;
        told_ += RECORDS - met.acknowledged.size();
        lost_ += lost;
    }

    virtual void judge(size_t lost, size_t most) { EXPECT_LE(lost, most); }

    void atEachCall(uint32_t count)
    {
        beginAnew();
        const FaultyRun whole = run(FAULTY, {});
        ASSERT_TRUE(whole.hasEnded);
        ASSERT_EQ(whole.acknowledged.size(), RECORDS);
        for (uint32_t number = 1; number <= whole.calls.size(); ++number) {
            SCOPED_TRACE("call " + std::to_string(number) + " of kind " +
                         std::to_string(whole.calls[number - 1]));
            befall({number, GetParam().kind, count, GetParam().code});
        }
    }

    void print() const
    {
        std::printf("figures: faults: %s: %zu runs, %zu acknowledged, %zu told to have failed, "
                    "%zu lost as stated\n",
                    GetParam().name, runs_, acknowledged_, told_, lost_);
    }

    OwnSemaphore semaphore_;
    size_t runs_ = 0;
    size_t acknowledged_ = 0;
    size_t told_ = 0;
    size_t lost_ = 0;
};

/// Writes that take nothing and say that they took all: each costs a record.
class FailingCallsControl : public FailingCalls {
protected:
    void judge(size_t lost, size_t most) override { found_ += lost > most ? 1 : 0; }

    size_t found_ = 0;
};

std::string nameOf(const testing::TestParamInfo<Trial> &trial)
{
    return trial.param.name;
}

#define TRIALS_OF(NAME, CLASS)                                                                     \
    {NAME "_EINTR", CLASS, FAULT_FAIL, EINTR}, {NAME "_EIO", CLASS, FAULT_FAIL, EIO},              \
        {NAME "_ENOSPC", CLASS, FAULT_FAIL, ENOSPC}, {NAME "_EACCES", CLASS, FAULT_FAIL, EACCES},  \
        {NAME "_EMFILE", CLASS, FAULT_FAIL, EMFILE}, {NAME "_short", CLASS, FAULT_CUT, 0},

const Trial TRIALS[] = {TRIALS_OF("file", "zlv_filehandler")
                            TRIALS_OF("shared", "zlv_multiproc_filehandler")};

const Trial SEEDED[] = {{"swallowed", "zlv_filehandler", FAULT_SWALLOW, 0},
                        {"swallowed_shared", "zlv_multiproc_filehandler", FAULT_SWALLOW, 0}};

} // namespace

TEST_P(FailingCalls, CostWhatIsStatedAndLoggingGoesOn)
{
    atEachCall(1);
    atEachCall(4);
    print();
}

TEST_P(FailingCallsControl, AreFoundWhenAWriteIsSwallowed)
{
    atEachCall(1);
    EXPECT_GE(found_, RECORDS);
}

INSTANTIATE_TEST_SUITE_P(Trial, FailingCalls, testing::ValuesIn(TRIALS), nameOf);
INSTANTIATE_TEST_SUITE_P(Trial, FailingCallsControl, testing::ValuesIn(SEEDED), nameOf);
