// SPDX-License-Identifier: Apache-2.0
// What the toolkit asks the system about a file before each write.
#pragma once

#include <cstdint>
#include <sys/types.h>

namespace zelvo {

struct FileFacts {
    dev_t device;
    ino_t inode;
    uint64_t size; ///< bytes
    bool isRegular;
};

/// Both ask without the file's times: on systems that keep those finely, whoever looks at them
/// makes the next write dearer. False when the system refuses, with its reason in errno.
bool readFacts(const char *path, FileFacts &facts);
bool readFacts(int descriptor, FileFacts &facts);

} // namespace zelvo
