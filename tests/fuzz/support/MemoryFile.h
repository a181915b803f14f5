// SPDX-License-Identifier: Apache-2.0
// A file in memory.
#pragma once

#include <string>
#include <string_view>

#include <sys/mman.h>
#include <unistd.h>

#include "support/Fuzz.h"

namespace zelvo_fuzz {

class MemoryFile {
public:
    MemoryFile()
        : descriptor_(memfd_create("fuzz", MFD_CLOEXEC)),
          name_("/proc/self/fd/" + std::to_string(descriptor_))
    {
        check(descriptor_ != -1, "there are files in memory");
    }
    MemoryFile(const MemoryFile &) = delete;
    MemoryFile &operator=(const MemoryFile &) = delete;
    ~MemoryFile() { close(descriptor_); }

    /// A name that opens it anew.
    const char *name() const { return name_.c_str(); }

    void hold(std::string_view bytes) const
    {
        check(ftruncate(descriptor_, 0) == 0, "a file in memory can be emptied");
        const ssize_t written = pwrite(descriptor_, bytes.data(), bytes.size(), 0);
        check(written == static_cast<ssize_t>(bytes.size()), "a file in memory can be written");
    }

private:
    int descriptor_;
    std::string name_;
};

} // namespace zelvo_fuzz
