// SPDX-License-Identifier: Apache-2.0
// Makes reads and closes of the library's files fail, and counts what is handed to the reporting
// hook. As with FailAlloc.h, the linker sends the calls that cross a source file here first.
#pragma once

#include <cstddef>
#include <cstdint>

#include "CxTypes.h"

namespace zelvo_test {

/// While one lives, this thread's file operations fail as it was told.
class FileFaults {
public:
    FileFaults();
    FileFaults(const FileFaults &) = delete;
    FileFaults &operator=(const FileFaults &) = delete;
    ~FileFaults();

    /// Lets BYTES bytes of all files be read, then fails every read with the error number CODE. A
    /// failing read gives COUNT as its number of bytes, by default the one that real failures give.
    void failReads(size_t bytes, int32_t code, size_t count = SIZE_MAX);
    /// Reports CODE for every close; the file is closed all the same.
    void failCloses(int32_t code);

    /// The calls of the reporting hook so far, and what the last one was given.
    uint32_t reports = 0;
    CxStatus reported{};

    /// The faults of this thread; null when there are none.
    static FileFaults *current();

    /// Read by the interposed functions.
    size_t readableBytes = SIZE_MAX;
    size_t failedReadCount = SIZE_MAX;
    int32_t readCode = 0;
    int32_t closeCode = 0;
};

} // namespace zelvo_test
