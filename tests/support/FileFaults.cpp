// SPDX-License-Identifier: Apache-2.0
#include "support/FileFaults.h"

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

void FileFaults::failReads(uint32_t allowed, int32_t code)
{
    allowedReads = allowed;
    readCode = code;
}

void FileFaults::failReadsWithAByte(uint32_t allowed, int32_t code)
{
    failReads(allowed, code);
    failedReadHasByte = true;
}

void FileFaults::failCloses(int32_t code)
{
    closeCode = code;
}

FileFaults *FileFaults::current()
{
    return faults;
}

bool FileFaults::strikesRead()
{
    if (allowedReads == 0)
        return true;
    --allowedReads;
    return false;
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
    if (faults == nullptr || !faults->strikesRead())
        return __real_CxFileRead(file, buffer, length, count);
    *count = faults->failedReadHasByte ? 1 : SIZE_MAX;
    return CxStatus{CX_STATUS_PLATFORM, faults->readCode};
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
