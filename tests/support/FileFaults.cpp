// SPDX-License-Identifier: Apache-2.0
#include "support/FileFaults.h"

#include <algorithm>

#include "CxFile.h"
#include "ZlvMisc.h"

namespace zelvo_test {
namespace {
thread_local FileFaults *faults = nullptr;
}

FileFaults::FileFaults()
{
    faults = this;
}

FileFaults::~FileFaults()
{
    faults = nullptr;
}

void FileFaults::failReads(size_t bytes, int32_t code, size_t count)
{
    readableBytes = bytes;
    readCode = code;
    failedReadCount = count;
}

void FileFaults::failCloses(int32_t code)
{
    closeCode = code;
}

FileFaults *FileFaults::current()
{
    return faults;
}

} // namespace zelvo_test

using zelvo_test::FileFaults;

// The names are the linker's: --wrap=f sends calls of f to __wrap_f and names the real one
// __real_f. NOLINTBEGIN(bugprone-reserved-identifier, cert-dcl37-c, cert-dcl51-cpp)
extern "C" {
CxStatus __real_CxFileRead(CxFile *file, void *buffer, size_t length, size_t *count);
CxStatus __real_CxFileClose(CxFile *file);
const char *__real_ZlvReportPlatformErr(char type, int32_t code);
CxStatus __wrap_CxFileRead(CxFile *file, void *buffer, size_t length, size_t *count);
CxStatus __wrap_CxFileClose(CxFile *file);
const char *__wrap_ZlvReportPlatformErr(char type, int32_t code);

CxStatus __wrap_CxFileRead(CxFile *file, void *buffer, size_t length, size_t *count)
{
    FileFaults *faults = FileFaults::current();
    if (faults == nullptr)
        return __real_CxFileRead(file, buffer, length, count);
    if (faults->readableBytes == 0) {
        *count = faults->failedReadCount;
        return CxStatus{CX_STATUS_PLATFORM, faults->readCode};
    }
    CxStatus status =
        __real_CxFileRead(file, buffer, std::min(length, faults->readableBytes), count);
    if (status.type == CX_STATUS_OK)
        faults->readableBytes -= *count;
    return status;
}

CxStatus __wrap_CxFileClose(CxFile *file)
{
    FileFaults *faults = FileFaults::current();
    CxStatus status = __real_CxFileClose(file);
    if (faults == nullptr || faults->closeCode == 0)
        return status;
    return CxStatus{CX_STATUS_PLATFORM, faults->closeCode};
}

const char *__wrap_ZlvReportPlatformErr(char type, int32_t code)
{
    if (FileFaults *faults = FileFaults::current()) {
        ++faults->reports;
        faults->reported = CxStatus{type, code};
    }
    return __real_ZlvReportPlatformErr(type, code);
}
}
// NOLINTEND(bugprone-reserved-identifier, cert-dcl37-c, cert-dcl51-cpp)
