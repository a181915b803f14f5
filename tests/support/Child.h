// SPDX-License-Identifier: Apache-2.0
// Child processes of a test.
#pragma once

#include <gtest/gtest.h>

#include <csignal>
#include <functional>

#include <sys/wait.h>
#include <unistd.h>

namespace zelvo_test {

/// A child process that runs a piece of the test and ends with its result, running no exit handler.
/// One that is still there at the end of the scope is killed.
class Child {
public:
    explicit Child(const std::function<int()> &body) : pid_(fork())
    {
        if (pid_ == 0)
            _exit(body());
    }
    Child(const Child &) = delete;
    Child &operator=(const Child &) = delete;
    ~Child()
    {
        if (pid_ > 0)
            kill();
    }

    /// Waits for the child's end; the exit status, or -1 when a signal ended it.
    int result()
    {
        int status = 0;
        waitpid(pid_, &status, 0);
        pid_ = -1;
        return WIFEXITED(status) ? WEXITSTATUS(status) : -1;
    }

    /// Kills the child, which must still be there.
    void kill()
    {
        ::kill(pid_, SIGKILL);
        result();
    }

private:
    pid_t pid_;
};

/// The exit status of a child that runs BODY.
inline int inChild(const std::function<int()> &body)
{
    return Child(body).result();
}

/// Makes this process, which is root, one of an ordinary user with no groups.
inline bool becomeNobody()
{
    constexpr id_t nobody = 65534;
    return setgid(nobody) == 0 && setuid(nobody) == 0;
}

} // namespace zelvo_test
