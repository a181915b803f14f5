// SPDX-License-Identifier: Apache-2.0
// Bytes that end where memory ends.
#pragma once

#include <cstring>
#include <string_view>

#include <sys/mman.h>
#include <unistd.h>

namespace zelvo_test {

/// A copy of bytes whose last one is the last of a page; reading the next one ends the process.
class GuardedText {
public:
    explicit GuardedText(std::string_view bytes)
        : pages_(static_cast<char *>(mmap(nullptr, 2 * page_, PROT_READ | PROT_WRITE,
                                          MAP_PRIVATE | MAP_ANONYMOUS, -1, 0))),
          text_(pages_ + page_ - bytes.size())
    {
        std::memcpy(text_, bytes.data(), bytes.size());
        mprotect(pages_ + page_, page_, PROT_NONE);
    }
    GuardedText(const GuardedText &) = delete;
    GuardedText &operator=(const GuardedText &) = delete;
    ~GuardedText() { munmap(pages_, 2 * page_); }

    const char *get() const { return text_; }

private:
    size_t page_ = static_cast<size_t>(sysconf(_SC_PAGESIZE));
    char *pages_;
    char *text_;
};

} // namespace zelvo_test
