// SPDX-License-Identifier: Apache-2.0
// A process that logs records to a shared file, as its arguments tell (Job.h), and notes for each
// record when it hands it to the library and when the library has acknowledged it.
//
// It begins when its standard input ends, so that many writers can begin at once.
#include <csignal>
#include <fcntl.h>
#include <sys/mman.h>
#include <sys/time.h>
#include <unistd.h>

#include "process/Job.h"
#include "process/RecordLogger.h"

using namespace zelvo_test;

namespace {

Progress *mapProgress(const std::string &file)
{
    const int descriptor = open(file.c_str(), O_RDWR | O_CLOEXEC);
    void *area = mmap(nullptr, sizeof(Progress), PROT_READ | PROT_WRITE, MAP_SHARED, descriptor, 0);
    close(descriptor);
    return area == MAP_FAILED ? nullptr : static_cast<Progress *>(area);
}

/// Signals that interrupt system calls, again and again.
void startSignals(uint32_t micros)
{
    struct sigaction action {};
    action.sa_handler = [](int) {};
    sigaction(SIGALRM, &action, nullptr);
    const timeval interval{.tv_sec = 0, .tv_usec = static_cast<suseconds_t>(micros)};
    const itimerval timer{.it_interval = interval, .it_value = interval};
    setitimer(ITIMER_REAL, &timer, nullptr);
}

void awaitStart()
{
    char byte = 0;
    while (read(STDIN_FILENO, &byte, 1) > 0) {
    }
}

/// Goes on behind the last record that a writer of this progress has begun.
WriterResult logRecords(ZlvObject *logger, const Job &job, Progress &progress)
{
    const uint32_t first = progress.begun + 1;
    for (uint32_t number = first; job.count == 0 || number < first + job.count; ++number) {
        if (progress.stop != 0)
            break;
        progress.begun = number;
        if (!logRecord(logger, job, number))
            return WRITER_RECORD_FAILED;
        progress.acknowledged = number;
    }
    return WRITER_DONE;
}

} // namespace

int main(int argc, char **argv)
{
    const Job job = jobOf({argv + 1, argv + argc});
    Progress *progress = mapProgress(job.progress);
    if (progress == nullptr || !ZlvOpenToolkit(nullptr, nullptr))
        return WRITER_UNUSABLE;
    ZlvObject *logger = makeRecordLogger("zlv_multiproc_filehandler", job);
    awaitStart();
    if (job.signalMicros != 0)
        startSignals(job.signalMicros);
    const WriterResult result = logRecords(logger, job, *progress);
    ZlvReleaseObject(logger);
    ZlvCloseToolkit();
    return result;
}
