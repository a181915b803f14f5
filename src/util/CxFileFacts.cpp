// SPDX-License-Identifier: Apache-2.0
#include "CxFileFacts.h"

#include <cerrno>
#include <fcntl.h>
#include <sys/stat.h>
#include <sys/sysmacros.h>

namespace zelvo {
namespace {

constexpr unsigned WANTED = STATX_TYPE | STATX_INO | STATX_SIZE;

/// Old systems do not know the call, and old sandboxes do not permit it.
bool isRefusedAsSuch(int code)
{
    return code == ENOSYS || code == EPERM || code == EINVAL;
}

bool readAllFacts(int directory, const char *path, int flags, FileFacts &facts)
{
    struct stat all;
    if (fstatat(directory, path, &all, flags) == -1)
        return false;
    facts = {all.st_dev, all.st_ino, static_cast<uint64_t>(all.st_size), S_ISREG(all.st_mode)};
    return true;
}

bool readWantedFacts(int directory, const char *path, int flags, FileFacts &facts)
{
    struct statx wanted;
    const bool isRead = statx(directory, path, flags, WANTED, &wanted) == 0;
    if (!isRead && !isRefusedAsSuch(errno))
        return false;
    if (!isRead || (wanted.stx_mask & WANTED) != WANTED)
        return readAllFacts(directory, path, flags, facts);
    facts = {makedev(wanted.stx_dev_major, wanted.stx_dev_minor), wanted.stx_ino, wanted.stx_size,
             S_ISREG(wanted.stx_mode)};
    return true;
}

} // namespace

bool readFacts(const char *path, FileFacts &facts)
{
    return readWantedFacts(AT_FDCWD, path, 0, facts);
}

bool readFacts(int descriptor, FileFacts &facts)
{
    if (descriptor >= 0) // below are numbers that stand for directories
        return readWantedFacts(descriptor, "", AT_EMPTY_PATH, facts);
    errno = EBADF;
    return false;
}

} // namespace zelvo
