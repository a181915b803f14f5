// SPDX-License-Identifier: Apache-2.0
#include "CxFile.h"

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

#include "util/CxFileFacts.h"
#include "util/CxFileIntl.h"
#include "util/CxStatusIntl.h"

using namespace zelvo;

// Files larger than 2 GiB are ordinary here: the plain calls must be the large-file ones.
static_assert(sizeof(off_t) == sizeof(int64_t));

namespace {

/// Who may read and write a file that CxFileOpen() creates: its owner.
constexpr uint32_t ownerOnly = S_IRUSR | S_IWUSR;

/// Reports a transfer and hands its count on: -1 becomes the all-ones value.
CxStatus finishTransfer(ssize_t transferred, size_t *count)
{
    *count = static_cast<size_t>(transferred);
    return statusOfCall(transferred);
}

} // namespace

CxStatus CxFileOpen(CxFile *file, const char *name, int32_t flags)
{
    return CxFileOpenMode(file, name, flags, ownerOnly);
}

CxStatus CxFileOpenMode(CxFile *file, const char *name, int32_t flags, uint32_t mode)
{
    if (file == nullptr)
        return missingArgument;
    *file = -1;
    LocalName local;
    const CxStatus localized = localName(name, local);
    if (localized.type != CX_STATUS_OK)
        return localized;
    *file = open(local.text, flags | O_CLOEXEC, mode);
    return statusOfCall(*file);
}

CxStatus CxFileRead(CxFile *file, void *buffer, size_t length, size_t *count)
{
    if (file == nullptr || buffer == nullptr || count == nullptr)
        return missingArgument;
    return finishTransfer(read(*file, buffer, length), count);
}

CxStatus CxFileWrite(CxFile *file, const void *buffer, size_t length, size_t *count)
{
    if (file == nullptr || buffer == nullptr || count == nullptr)
        return missingArgument;
    return finishTransfer(write(*file, buffer, length), count);
}

CxStatus CxFileSeek(CxFile *file, int64_t offset, int32_t origin)
{
    if (file == nullptr)
        return missingArgument;
    const off_t position = lseek(*file, static_cast<int32_t>(offset), origin);
    return position == 0 ? success : lastError();
}

CxStatus CxFileTrunc(CxFile *file)
{
    if (file == nullptr)
        return missingArgument;
    const CxStatus atStart = CxFileSeek(file, 0, SEEK_SET);
    const CxStatus emptied =
        atStart.type == CX_STATUS_OK ? statusOfCall(ftruncate(*file, 0)) : atStart;
    // The size decides: content that is still there is a failure of its own.
    uint64_t size = 0;
    const CxStatus measured = CxFileGetSize(file, &size);
    if (measured.type != CX_STATUS_OK)
        return measured;
    return size == 0 ? emptied : platformError(EINVAL);
}

CxStatus CxFileGetSize(CxFile *file, uint64_t *size)
{
    if (file == nullptr || size == nullptr)
        return missingArgument;
    FileFacts facts;
    if (!readFacts(*file, facts))
        return lastError();
    *size = facts.size;
    return success;
}

CxStatus CxFileFlush(CxFile *file)
{
    return file == nullptr ? missingArgument : statusOfCall(fsync(*file));
}

CxStatus CxFileClose(CxFile *file)
{
    if (file == nullptr)
        return missingArgument;
    const CxStatus status = statusOfCall(close(*file));
    *file = -1;
    return status;
}
