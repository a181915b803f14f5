// SPDX-License-Identifier: Apache-2.0
#include "CxDirectory.h"

#include <dirent.h>

#include "CxFilePath.h"
#include "CxString.h"
#include "util/CxStatusIntl.h"

using namespace zelvo;

CxStatus CxDirectoryOpen(CxDirectory *slot, const char *path)
{
    if (slot == nullptr)
        return missingArgument;
    *slot = nullptr;
    CxFilePath local;
    if (CxInitFilePath(&local, path) == 0 || CxFilePathIsDir(&local) != 0)
        return platformError(EINVAL);
    *slot = opendir(local.path);
    return *slot == nullptr ? lastError() : success;
}

CxStatus CxDirectoryGetNext(CxDirectory *slot, char *name, size_t size)
{
    if (slot == nullptr || *slot == nullptr || name == nullptr)
        return missingArgument;
    *name = '\0';
    // readdir() leaves errno alone at the end of the listing, which ENOENT therefore stands for.
    errno = ENOENT;
    const dirent *entry = readdir(static_cast<DIR *>(*slot));
    if (entry == nullptr)
        return errno == ENOENT ? success : lastError();
    RkoStringNCat(name, entry->d_name, size);
    return success;
}

CxStatus CxDirectoryClose(CxDirectory *slot)
{
    if (slot == nullptr || *slot == nullptr)
        return missingArgument;
    const CxStatus status = statusOfCall(closedir(static_cast<DIR *>(*slot)));
    *slot = nullptr;
    return status;
}
