/* SPDX-License-Identifier: Apache-2.0 */
#define _GNU_SOURCE
#include "soak_faults.h"

#include <errno.h>
#include <limits.h>
#include <stdio.h>
#include <string.h>
#include <sys/syscall.h>
#include <unistd.h>

static struct SoakFaults *faults;
static _Thread_local int isFull;
static _Thread_local int isSwallowing;
static _Thread_local int isCut;

void startSoakFaults(struct SoakFaults *met)
{
    faults = met;
}

void refuseWrites(int refused)
{
    isFull = refused;
}

void swallowNextWrite(void)
{
    isSwallowing = 1;
}

int wasCutShort(void)
{
    const int result = isCut;
    isCut = 0;
    return result;
}

static int refuse(void)
{
    errno = ENOSPC;
    return -1;
}

static ssize_t noted(ssize_t written, size_t wanted)
{
    if (faults != NULL && written >= 0 && (size_t)written < wanted) {
        isCut = 1;
        ++faults->cutShort;
    }
    return written;
}

ssize_t write(int descriptor, const void *bytes, size_t length)
{
    if (isFull)
        return refuse();
    if (isSwallowing) {
        isSwallowing = 0;
        return (ssize_t)length;
    }
    return noted(syscall(SYS_write, descriptor, bytes, length), length);
}

/* Moves a file into the directory of those removed. */
static int keep(const char *path)
{
    char kept[PATH_MAX];
    const char *end = strrchr(path, '/');
    snprintf(kept, sizeof kept, "%.*s/removed/%d-%u", (int)(end - path), path, (int)getpid(),
             faults->removed);
    const int result = rename(path, kept);
    faults->removed += result == 0 ? 1 : 0;
    return result;
}

int remove(const char *path)
{
    if (faults != NULL)
        return keep(path);
    const int result = unlink(path);
    return result == -1 && errno == EISDIR ? rmdir(path) : result;
}
