// SPDX-License-Identifier: Apache-2.0
#include "FaultyRun.h"

#include <algorithm>
#include <filesystem>

#include <fcntl.h>
#include <sys/mman.h>
#include <sys/syscall.h>

#include "process/RecordLogger.h"
#include "support/Child.h"

namespace zelvo_test {

namespace {

constexpr unsigned SECONDS_TO_HANG = 60;
constexpr int DESCRIPTOR_LEFT = 2; // exit status

/// The trace of one process after the other.
CallTrace *sharedTrace()
{
    static void *area =
        mmap(nullptr, sizeof(CallTrace), PROT_READ | PROT_WRITE, MAP_SHARED | MAP_ANONYMOUS, -1, 0);
    return static_cast<CallTrace *>(area);
}

/// Numbers from a child to its parent, by calls that are not numbered.
class NumberPipe {
public:
    NumberPipe()
    {
        if (pipe2(ends_, O_CLOEXEC | O_NONBLOCK) != 0)
            ADD_FAILURE() << "no pipe";
    }
    NumberPipe(const NumberPipe &) = delete;
    NumberPipe &operator=(const NumberPipe &) = delete;
    ~NumberPipe()
    {
        close(ends_[0]);
        close(ends_[1]);
    }

    void put(uint32_t number) const { syscall(SYS_write, ends_[1], &number, sizeof number); }

    std::vector<uint32_t> takeAll() const
    {
        std::vector<uint32_t> numbers;
        for (uint32_t number = 0; read(ends_[0], &number, sizeof number) == sizeof number;)
            numbers.push_back(number);
        return numbers;
    }

private:
    int ends_[2] = {-1, -1};
};

auto descriptors()
{
    const std::filesystem::directory_iterator all("/proc/self/fd");
    return std::distance(begin(all), end(all));
}

int logRecords(const char *handlerClass, const Job &job, const NumberPipe &acknowledged,
               Acknowledges when)
{
    if (!ZlvOpenToolkit(nullptr, nullptr))
        return 1;
    ZlvObject *logger = makeRecordLogger(handlerClass, job);
    for (uint32_t number = 1; number <= job.count; ++number) {
        if (when == Acknowledges::TOO_EARLY)
            acknowledged.put(number);
        if (logRecord(logger, job, number) && when == Acknowledges::AFTER_THE_CALL)
            acknowledged.put(number);
    }
    ZlvReleaseObject(logger);
    ZlvCloseToolkit();
    return 0;
}

std::vector<FaultyCall> callsOf(const CallTrace &trace)
{
    std::vector<FaultyCall> calls;
    const uint32_t count = std::min<uint32_t>(trace.count, MOST_CALLS);
    for (uint32_t call = 0; call < count; ++call)
        calls.push_back(static_cast<FaultyCall>(trace.calls[call]));
    return calls;
}

} // namespace

FaultyRun runFaulty(const char *handlerClass, const Job &job, Fault fault, Acknowledges when)
{
    CallTrace &trace = *sharedTrace();
    trace.count = 0;
    const NumberPipe acknowledged;
    Child process([&] {
        alarm(SECONDS_TO_HANG);
        const auto before = descriptors();
        plotCallFault(&trace, {fault.number, fault.kind, fault.count, fault.code});
        const int result = logRecords(handlerClass, job, acknowledged, when);
        plotCallFault(nullptr, {});
        return result == 0 && descriptors() != before ? DESCRIPTOR_LEFT : result;
    });
    const int result = process.result();
    return {result == 0 || result == DESCRIPTOR_LEFT, result == DESCRIPTOR_LEFT,
            acknowledged.takeAll(), callsOf(trace)};
}

} // namespace zelvo_test
