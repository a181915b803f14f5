// SPDX-License-Identifier: Apache-2.0
// Files by name; the declarations stand in CxFile.h.
#include "CxFile.h"

#include <algorithm>
#include <cstdio>
#include <cstring>
#include <sys/stat.h>

#include "CxString.h"
#include "util/CxFileIntl.h"
#include "util/CxStatusIntl.h"

namespace zelvo {

CxStatus localName(const char *name, LocalName &local)
{
    if (name == nullptr)
        return missingArgument;
    const size_t length = std::strlen(name);
    if (length >= sizeof local.text)
        return platformError(ENAMETOOLONG);
    std::replace_copy(name, name + length + 1, local.text, '\\', '/');
    return success;
}

} // namespace zelvo

using namespace zelvo;

ZlvBool CxFileNameLocalize(const char *name, char *dst, size_t size)
{
    return size == 0 ? 0 : CxFileNameGetNative(name, dst, size);
}

ZlvBool CxFileNameGetNative(const char *name, char *dst, size_t size)
{
    if (name == nullptr || dst == nullptr)
        return 0;
    RkoStringNCpy(dst, name, size);
    std::replace(dst, dst + size, '\\', '/');
    return 1;
}

CxStatus CxFileNameRemove(const char *name)
{
    LocalName local;
    const CxStatus localized = localName(name, local);
    return localized.type == CX_STATUS_OK ? statusOfCall(std::remove(local.text)) : localized;
}

CxStatus CxFileNameRename(const char *oldName, const char *newName)
{
    if (oldName == nullptr || newName == nullptr)
        return missingArgument;
    LocalName from;
    LocalName to;
    for (const CxStatus localized : {localName(oldName, from), localName(newName, to)})
        if (localized.type != CX_STATUS_OK)
            return localized;
    return statusOfCall(std::rename(from.text, to.text));
}

CxStatus CxFileNameGetSize(const char *name, uint64_t *size)
{
    if (name == nullptr || size == nullptr)
        return missingArgument;
    struct stat facts;
    if (stat(name, &facts) == -1)
        return lastError();
    *size = static_cast<uint64_t>(facts.st_size);
    return success;
}

CxStatus CxFileNameGetInfo(CxFileInfo *info, const char *name)
{
    if (info == nullptr || name == nullptr || *name == '\0')
        return missingArgument;
    struct stat facts;
    if (stat(name, &facts) == -1)
        return lastError();
    *info = {facts.st_size, facts.st_ctime, facts.st_mtime, facts.st_atime};
    return success;
}
