// SPDX-License-Identifier: Apache-2.0
// Processes that die at each system call of a write and of a rollover in turn, and die or meet a
// failing call again while they recover.
#include <cstdio>

#include "Damage.h"
#include "process/OwnSemaphore.h"
#include "process/Records.h"
#include "support/TestDir.h"

using namespace zelvo_test;

namespace {

constexpr const char *FILE_HANDLER = "zlv_filehandler";
constexpr const char *SHARED_HANDLER = "zlv_multiproc_filehandler";
constexpr const char *LOG = "log";
constexpr uint32_t RECORDS_OF_A_RUN = 3;
constexpr int32_t MOST_FILES = 7; // enough for a rollover of each run, and for those before

/// Each run writes the records of a writer of its own.
enum Writer : uint32_t { OLDER_FILES, LIVE_FILE, FIRST, SECOND, LAST, WRITERS };

/// What a log is before the first fault.
enum class Start { NO_DIRECTORY, NEARLY_FULL };

struct Trial {
    const char *name;
    const char *handlerClass;
    Start start;
};

class KillsAtCalls : public TestDir, public testing::WithParamInterface<Trial> {
protected:
    bool isShared() const { return GetParam().handlerClass == SHARED_HANDLER; }

    Job job(Writer writer, uint32_t count) const
    {
        return {.file = std::string(LOG) + "/shared.log",
                .key = semaphore_.key(),
                .maxBytes = limit_,
                .maxFiles = MOST_FILES,
                .writer = writer,
                .count = count};
    }

    FaultyRun run(Writer writer, Fault fault = {}, uint32_t count = RECORDS_OF_A_RUN)
    {
        ++runs_;
        const FaultyRun result =
            runFaulty(GetParam().handlerClass, job(writer, count), fault, when_);
        acknowledged_[writer] = result.acknowledged;
        return result;
    }

    /// A log whose live file takes one record more and copies in two pieces, behind two older ones.
    void makeNearlyFullLog()
    {
        limit_ = 600;
        run(OLDER_FILES, {}, 14);
        limit_ = 1 << 20;
        run(LIVE_FILE, {}, 80);
        limit_ = static_cast<int32_t>(std::filesystem::file_size("log/shared.log")) + 50;
    }

    void SetUp() override
    {
        if (GetParam().start == Start::NEARLY_FULL)
            makeNearlyFullLog();
        keep("start");
    }

    /// Keeps files and semaphore as they are, to begin there again.
    void keep(const std::string &name)
    {
        copyTree(LOG, name);
        hadSemaphore_[name] = semaphore_.id() != -1;
    }

    void beginAt(const std::string &name)
    {
        copyTree(name, LOG);
        if (hadSemaphore_[name])
            semaphore_.makeFree();
        else
            semaphore_.remove();
    }

    static void copyTree(const std::string &from, const std::string &to)
    {
        std::filesystem::remove_all(to);
        if (std::filesystem::exists(from))
            std::filesystem::copy(from, to, std::filesystem::copy_options::recursive);
    }

    /// A process that dies between making the set and giving it its value leaves one that nobody
    /// ever frees. The remedy is to remove it.
    void removeUnusableSemaphore(const FaultyRun &dead)
    {
        if (!isShared() || semaphore_.id() == -1 || semaphore_.value() == 1)
            return;
        EXPECT_TRUE(dead.calls.back() == CALL_SEMGET || dead.calls.back() == CALL_SEMCTL);
        ++unusable_;
        semaphore_.remove();
    }

    /// Runs a process that meets a fault.
    void befall(Writer writer, Fault fault)
    {
        const FaultyRun met = run(writer, fault);
        EXPECT_GE(met.calls.size(), fault.number);
        failed_ = fault.kind == FAULT_FAIL;
        EXPECT_EQ(met.hasEnded, failed_);
        removeUnusableSemaphore(met);
        allowed_[writer] = mostDamage(met, fault, limits());
    }

    LogLimits limits() const
    {
        return {.isShared = isShared(),
                .recordsOfAFile = static_cast<size_t>(limit_) / 100 + 1,
                .recordsOfARun = RECORDS_OF_A_RUN};
    }

    /// A last run without a fault, and what has become of the records.
    void settle()
    {
        const FaultyRun last = run(LAST);
        EXPECT_TRUE(last.hasEnded);
        EXPECT_EQ(last.acknowledged.size(), RECORDS_OF_A_RUN);
        const Census census(directory() / LOG, job(LAST, 0).seed);
        for (uint32_t number : last.acknowledged)
            EXPECT_EQ(census.copiesOf(LAST, number), 1U);
        EXPECT_TRUE(!isShared() || semaphore_.value() == 1);
        note({lost(census), census.doubled(), census.fragments()});
    }

    void note(const Damage &done)
    {
        Damage allowed;
        for (const Damage &each : allowed_)
            allowed += each;
        judge(done, allowed);
        (failed_ ? afterFailures_ : afterKills_) += done;
        for (Writer writer : {FIRST, SECOND, LAST})
            recordsAcknowledged_ += acknowledged_[writer].size();
    }

    virtual void judge(const Damage &done, const Damage &allowed)
    {
        EXPECT_LE(done.lost, allowed.lost);
        EXPECT_LE(done.doubled, allowed.doubled);
        EXPECT_LE(done.fragments, allowed.fragments);
    }

    size_t lost(const Census &census)
    {
        size_t sum = 0;
        for (uint32_t writer = 0; writer < WRITERS; ++writer)
            for (uint32_t number : acknowledged_[writer])
                sum += census.copiesOf(writer, number) == 0 ? 1 : 0;
        return sum;
    }

    /// Each call of the process in turn meets each fault; AFTERWARDS is what follows each time.
    void atEachCall(const std::string &start, Writer writer, const std::vector<CallFault> &faults,
                    const std::function<void()> &afterwards)
    {
        beginAt(start);
        const FaultyRun whole = run(writer);
        EXPECT_TRUE(whole.hasEnded);
        for (uint32_t number = 1; number <= whole.calls.size(); ++number)
            for (CallFault fault : faults)
                if (fault != FAULT_KILL_WITHIN || whole.calls[number - 1] == CALL_WRITE) {
                    SCOPED_TRACE("call " + std::to_string(number) + " of kind " +
                                 std::to_string(whole.calls[number - 1]) + ", fault " +
                                 std::to_string(fault));
                    beginAt(start);
                    befall(writer, {number, fault});
                    afterwards();
                }
    }

    void print(const char *what, const Damage &damage) const
    {
        std::printf("figures: kills: %s: %s: lost %zu, doubled %zu, fragments %zu\n",
                    GetParam().name, what, damage.lost, damage.doubled, damage.fragments);
    }

    void printAll() const
    {
        std::printf("figures: kills: %s: %zu first faults, %zu runs, %zu acknowledged, "
                    "%zu semaphores left unusable\n",
                    GetParam().name, firstFaults_, runs_, recordsAcknowledged_, unusable_);
        print("after kills", afterKills_);
        print("with failing calls", afterFailures_);
    }

    OwnSemaphore semaphore_;
    int32_t limit_ = 150; // bytes: a new file takes two records
    Acknowledges when_ = Acknowledges::AFTER_THE_CALL;
    std::vector<uint32_t> acknowledged_[WRITERS];
    std::map<std::string, bool> hadSemaphore_;
    bool failed_ = false;
    Damage allowed_[WRITERS];
    Damage afterKills_;
    Damage afterFailures_;
    size_t firstFaults_ = 0;
    size_t runs_ = 0;
    size_t recordsAcknowledged_ = 0;
    size_t unusable_ = 0;
};

// After a call is before the next one: the first process dies on both sides, a second one on one.
const std::vector<CallFault> ALL = {FAULT_KILL_BEFORE, FAULT_KILL_WITHIN, FAULT_KILL_AFTER,
                                    FAULT_FAIL};
const std::vector<CallFault> KILLS = {FAULT_KILL_BEFORE, FAULT_KILL_WITHIN};
const std::vector<CallFault> BEFORE_OR_INSTEAD = {FAULT_KILL_BEFORE, FAULT_KILL_WITHIN, FAULT_FAIL};

const Trial TRIALS[] = {
    {"new_file", FILE_HANDLER, Start::NO_DIRECTORY},
    {"full_file", FILE_HANDLER, Start::NEARLY_FULL},
    {"new_shared_file", SHARED_HANDLER, Start::NO_DIRECTORY},
    {"full_shared_file", SHARED_HANDLER, Start::NEARLY_FULL},
};

/// A program that acknowledges before it logs, so that each kill in between costs a record.
class KillsControl : public KillsAtCalls {
protected:
    KillsControl() { when_ = Acknowledges::TOO_EARLY; }

    void judge(const Damage &done, const Damage &allowed) override
    {
        found_ += done.lost > allowed.lost ? 1 : 0;
    }

    size_t found_ = 0;
};

std::string nameOf(const testing::TestParamInfo<Trial> &trial)
{
    return trial.param.name;
}

} // namespace

TEST_P(KillsAtCalls, CostNoAcknowledgedRecord)
{
    atEachCall("start", FIRST, ALL, [this] {
        ++firstFaults_;
        settle();
    });
    printAll();
}

TEST_P(KillsAtCalls, CostNoneWhenTheNextProcessMeetsAFaultToo)
{
    atEachCall("start", FIRST, KILLS, [this] {
        ++firstFaults_;
        keep("interrupted");
        atEachCall("interrupted", SECOND, BEFORE_OR_INSTEAD, [this] { settle(); });
    });
    printAll();
}

TEST_P(KillsControl, FindsTheLossOfAProgramThatAcknowledgesTooEarly)
{
    atEachCall("start", FIRST, KILLS, [this] { settle(); });
    EXPECT_GE(found_, RECORDS_OF_A_RUN);
}

INSTANTIATE_TEST_SUITE_P(Trial, KillsAtCalls, testing::ValuesIn(TRIALS), nameOf);
INSTANTIATE_TEST_SUITE_P(Trial, KillsControl, testing::ValuesIn(TRIALS), nameOf);
