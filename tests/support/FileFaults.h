// SPDX-License-Identifier: Apache-2.0
// Makes reads and closes of the library's files fail, and counts what is handed to the reporting
// hook. As with FailAlloc.h, the linker sends the calls that cross a source file here first.
#pragma once

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

    /// Fails every read after ALLOWED good ones, with the error number CODE.
    void failReads(uint32_t allowed, int32_t code);
    /// A failing read says that it read one byte, so that it does not look like the end of input.
    void failReadsWithAByte(uint32_t allowed, int32_t code);
    /// Reports CODE for every close; the file is closed all the same.
    void failCloses(int32_t code);

    /// The calls of the reporting hook so far, and what the last one was given.
    uint32_t reports = 0;
    CxStatus reported{};

    /// The faults of this thread; null when there are none.
    static FileFaults *current();

    /// Used by the interposed functions.
    bool strikesRead();
    uint32_t allowedReads = UINT32_MAX;
    int32_t readCode = 0;
    int32_t closeCode = 0;
    bool failedReadHasByte = false;
};

} // namespace zelvo_test
