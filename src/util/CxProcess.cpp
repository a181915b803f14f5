// SPDX-License-Identifier: Apache-2.0
#include "CxProcess.h"

#include <cstdlib>
#include <unistd.h>

#include "util/CxStatusIntl.h"

using namespace zelvo;

char *CxProcessGetEnv(const char *name)
{
    return name == nullptr ? nullptr : std::getenv(name);
}

int64_t CxProcessGetCurrentID()
{
    return getpid();
}

CxStatus CxProcessGetCwd(char *buffer, size_t size)
{
    if (buffer == nullptr)
        return missingArgument;
    *buffer = '\0';
    if (size == 0)
        return missingArgument;
    if (getcwd(buffer, size) != nullptr)
        return success;
    *buffer = '\0';
    return lastError();
}

CxStatus CxProcessCreate(int64_t *process, const char *path, char *const argv[])
{
    if (process == nullptr || path == nullptr || *path == '\0')
        return missingArgument;
    *process = -1;
    const pid_t child = fork();
    if (child == -1)
        return lastError();
    if (child != 0) {
        *process = child;
        return success;
    }
    char *const noArguments[] = {nullptr};
    execv(path, argv == nullptr ? noArguments : argv);
    return success;
}

CxStatus CxProcessRelease(int64_t process)
{
    return process == 0 ? missingArgument : success;
}
