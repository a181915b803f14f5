// SPDX-License-Identifier: Apache-2.0
#include "CxFilePath.h"

#include <cerrno>
#include <cstring>
#include <sys/stat.h>

namespace {

constexpr int32_t none = -1;

/// Asks the platform about a path: 0 or an error number.
int32_t inspect(const CxFilePath *path, struct stat &facts)
{
    if (path == nullptr || path->pathLength < 1)
        return EINVAL;
    return stat(path->path, &facts) == -1 ? errno : 0;
}

/// The index of the last '/' in the first LENGTH bytes of a text.
int32_t lastSeparatorBefore(const char *text, int32_t length)
{
    int32_t index = length - 1;
    while (index >= 0 && text[index] != '/')
        --index;
    return index;
}

/// Makes one directory, whose parent exists. A directory that somebody else made meanwhile will do.
int32_t makeDirectory(const char *path, uint32_t mode)
{
    const int32_t failure = mkdir(path, S_IRWXU | S_IRWXG | S_IRWXO) == -1 ? errno : 0;
    // Sets the bits that the umask took away. Its own failure is not one of creating the directory.
    static_cast<void>(chmod(path, mode));
    return failure == EEXIST ? 0 : failure;
}

} // namespace

ZlvBool CxInitFilePath(CxFilePath *path, const char *text)
{
    if (path == nullptr)
        return 0;
    path->pathLength = none;
    path->lastSeparator = none;
    if (text == nullptr)
        return 0;
    for (int32_t index = 0; index < CX_FILE_PATH_SIZE; ++index) {
        const char c = text[index] == '\\' ? '/' : text[index];
        path->path[index] = c;
        if (c == '/')
            path->lastSeparator = index;
        if (c == '\0') {
            path->pathLength = index;
            return 1;
        }
    }
    return 0;
}

int32_t CxFilePathIsDir(const CxFilePath *path)
{
    struct stat facts;
    const int32_t failure = inspect(path, facts);
    if (failure != 0)
        return failure;
    return S_ISDIR(facts.st_mode) ? 0 : ENOTDIR;
}

int32_t CxFilePathExists(const CxFilePath *path)
{
    struct stat facts;
    return inspect(path, facts);
}

ZlvBool CxFilePathParent(const CxFilePath *path, CxFilePath *parent)
{
    if (path == nullptr || parent == nullptr)
        return 0;
    const int32_t length = path->lastSeparator;
    if (path->pathLength == none || length == none)
        return 0;
    std::memmove(parent->path, path->path, static_cast<size_t>(length));
    parent->path[length] = '\0';
    parent->pathLength = length;
    parent->lastSeparator = lastSeparatorBefore(parent->path, length);
    return 1;
}

int32_t CxFilePathMkdirs(const CxFilePath *path, uint32_t mode)
{
    const int32_t found = CxFilePathIsDir(path);
    if (found != ENOENT)
        return found;
    CxFilePath parent;
    if (CxFilePathParent(path, &parent) != 0) {
        const int32_t failure = CxFilePathMkdirs(&parent, mode);
        if (failure != 0)
            return failure;
    }
    return makeDirectory(path->path, mode);
}
