// SPDX-License-Identifier: Apache-2.0
// Sees what the process writes to its standard output, byte by byte, while it is being written.
#pragma once

#include <gtest/gtest.h>

#include <cstdio>
#include <string>

#include <sys/mman.h>
#include <unistd.h>

namespace zelvo_test {

/// While one lives, descriptor 1 leads into memory. What the C stream held before goes to the old
/// output first; what it still holds at the end goes to the new one.
class Console {
public:
    Console() : capture_(memfd_create("console", MFD_CLOEXEC))
    {
        std::fflush(stdout);
        previous_ = dup(STDOUT_FILENO);
        dup2(capture_, STDOUT_FILENO);
    }
    Console(const Console &) = delete;
    Console &operator=(const Console &) = delete;
    ~Console()
    {
        std::fflush(stdout);
        dup2(previous_, STDOUT_FILENO);
        if (testing::Test::HasFailure()) // whose report may have gone here too
            std::fputs(seen().c_str(), stdout);
        ::close(previous_);
        ::close(capture_);
    }

    /// The bytes that have reached the descriptor: those in the C stream's buffer are not seen yet.
    std::string seen() const
    {
        std::string bytes(static_cast<size_t>(lseek(capture_, 0, SEEK_END)), '\0');
        ssize_t count = pread(capture_, bytes.data(), bytes.size(), 0);
        bytes.resize(count > 0 ? static_cast<size_t>(count) : 0);
        return bytes;
    }

private:
    int capture_;
    int previous_;
};

} // namespace zelvo_test
