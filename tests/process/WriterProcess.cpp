// SPDX-License-Identifier: Apache-2.0
#include "process/WriterProcess.h"

#include <algorithm>
#include <csignal>
#include <fcntl.h>
#include <sys/mman.h>
#include <sys/wait.h>
#include <unistd.h>

namespace zelvo_test {

namespace {

constexpr int NO_END = -1000;

/// Becomes the program, with the gate as its standard input.
[[noreturn]] void become(const char *program, const Job &job, const Gate *gate)
{
    const int input = gate != nullptr ? gate->input() : open("/dev/null", O_RDONLY | O_CLOEXEC);
    dup2(input, STDIN_FILENO);
    std::vector<std::string> texts = argumentsOf(job);
    std::vector<char *> arguments = {const_cast<char *>(program)};
    std::transform(texts.begin(), texts.end(), std::back_inserter(arguments),
                   [](std::string &text) { return text.data(); });
    arguments.push_back(nullptr);
    execv(program, arguments.data());
    _exit(127);
}

} // namespace

bool eventually(const std::function<bool()> &condition)
{
    const auto start = std::chrono::steady_clock::now();
    while (!condition()) {
        if (std::chrono::steady_clock::now() - start > LONG_ENOUGH)
            return false;
        usleep(100); // between two looks, to leave the processor to who is being waited for
    }
    return true;
}

double secondsSince(std::chrono::steady_clock::time_point start)
{
    return std::chrono::duration<double>(std::chrono::steady_clock::now() - start).count();
}

Gate::Gate()
{
    if (pipe2(ends_, O_CLOEXEC) != 0)
        ADD_FAILURE() << "no pipe";
}

Gate::~Gate()
{
    open();
    close(ends_[0]);
}

void Gate::open()
{
    if (ends_[1] != -1)
        close(ends_[1]);
    ends_[1] = -1;
}

WriterProcess::WriterProcess(const char *program, const Job &job, const Gate *gate,
                             const std::function<void()> &prepare)
    : pid_(fork())
{
    if (pid_ != 0)
        return;
    if (prepare)
        prepare();
    become(program, job, gate);
}

WriterProcess::~WriterProcess()
{
    kill();
}

bool WriterProcess::hasEnded()
{
    if (pid_ > 0 && waitpid(pid_, &status_, WNOHANG) == pid_)
        pid_ = -1;
    return pid_ <= 0;
}

int WriterProcess::result()
{
    if (!eventually([this] { return hasEnded(); }))
        return NO_END;
    return WIFEXITED(status_) ? WEXITSTATUS(status_) : -WTERMSIG(status_);
}

void WriterProcess::kill()
{
    if (pid_ <= 0)
        return;
    ::kill(pid_, SIGKILL);
    waitpid(pid_, &status_, 0);
    pid_ = -1;
}

SharedProgress::SharedProgress(const std::string &file)
{
    const int descriptor = open(file.c_str(), O_RDWR | O_CLOEXEC);
    void *area = mmap(nullptr, sizeof(Progress), PROT_READ | PROT_WRITE, MAP_SHARED, descriptor, 0);
    close(descriptor);
    area_ = static_cast<Progress *>(area);
}

SharedProgress::~SharedProgress()
{
    munmap(area_, sizeof(Progress));
}

Job SharedLogTest::jobFor(uint32_t writer, uint32_t count)
{
    Job job{.key = semaphore_.key(), .writer = writer, .count = count};
    job.progress = "progress" + std::to_string(writer);
    if (!std::filesystem::exists(job.progress))
        write(job.progress, std::string(sizeof(Progress), '\0'));
    return job;
}

int SharedLogTest::runWriter(const Job &job, const char *program)
{
    return WriterProcess(program, job).result();
}

size_t SharedLogTest::liveSize() const
{
    return std::filesystem::file_size("shared.log");
}

} // namespace zelvo_test
