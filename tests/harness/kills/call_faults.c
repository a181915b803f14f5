/* SPDX-License-Identifier: Apache-2.0 */
#define _GNU_SOURCE
#include "CallFaults.h"

#include <errno.h>
#include <fcntl.h>
#include <signal.h>
#include <stdarg.h>
#include <stddef.h>
#include <sys/ipc.h>
#include <sys/sem.h>
#include <sys/stat.h>
#include <sys/syscall.h>
#include <time.h>
#include <unistd.h>

static struct CallTrace *trace;
static struct CallPlot plot;

void plotCallFault(struct CallTrace *shared, struct CallPlot whole)
{
    plot = whole;
    trace = shared;
}

static enum CallFault faultOf(uint32_t number)
{
    const int isMeant =
        plot.number != 0 && number >= plot.number && number - plot.number < plot.count;
    return isMeant ? plot.fault : FAULT_NONE;
}

/* Numbers a call, and gives what is to become of it. */
static enum CallFault meet(enum FaultyCall call)
{
    if (trace == NULL)
        return FAULT_NONE;
    if (trace->count < MOST_CALLS)
        trace->calls[trace->count] = (uint8_t)call;
    return faultOf(++trace->count);
}

/* Fails instead of the call; the answer of a call that fails. */
static int fail(int code)
{
    errno = plot.code != 0 ? plot.code : code;
    return -1;
}

/* The body of a function: the call between what befalls it. */
#define MAKE(TYPE, CALL, FAILURE, MADE)                                                            \
    const enum CallFault fault = meet(CALL);                                                       \
    if (fault == FAULT_KILL_BEFORE)                                                                \
        raise(SIGKILL);                                                                            \
    if (fault == FAULT_FAIL)                                                                       \
        return FAILURE;                                                                            \
    const TYPE result = (TYPE)(MADE);                                                              \
    if (fault == FAULT_KILL_WITHIN || fault == FAULT_KILL_AFTER)                                   \
        raise(SIGKILL);                                                                            \
    return result

int stat(const char *path, struct stat *facts)
{
    MAKE(int, CALL_STAT, fail(EIO), syscall(SYS_newfstatat, AT_FDCWD, path, facts, 0));
}

int fstatat(int directory, const char *path, struct stat *facts, int flags)
{
    MAKE(int, CALL_STAT, fail(EIO), syscall(SYS_newfstatat, directory, path, facts, flags));
}

/* Without a path it asks about an open file. */
int statx(int directory, const char *path, int flags, unsigned wanted, struct statx *facts)
{
    const enum FaultyCall call = *path == '\0' ? CALL_FSTAT : CALL_STAT;
    MAKE(int, call, fail(EIO), syscall(SYS_statx, directory, path, flags, wanted, facts));
}

int open(const char *path, int flags, ...)
{
    va_list rest;
    va_start(rest, flags);
    const mode_t mode = va_arg(rest, mode_t);
    va_end(rest);
    MAKE(int, CALL_OPEN, fail(EIO), syscall(SYS_openat, AT_FDCWD, path, flags, mode));
}

ssize_t read(int descriptor, void *bytes, size_t length)
{
    MAKE(ssize_t, CALL_READ, fail(EIO), syscall(SYS_read, descriptor, bytes, length));
}

static size_t lengthToWrite(size_t length)
{
    const enum CallFault fault = trace != NULL ? faultOf(trace->count + 1) : FAULT_NONE;
    return fault == FAULT_KILL_WITHIN || fault == FAULT_CUT ? length / 2 : length;
}

static ssize_t writeOrSwallow(int descriptor, const void *bytes, size_t length)
{
    const int isSwallowed = trace != NULL && faultOf(trace->count) == FAULT_SWALLOW;
    return isSwallowed ? (ssize_t)length : syscall(SYS_write, descriptor, bytes, length);
}

ssize_t write(int descriptor, const void *bytes, size_t whole)
{
    const size_t length = lengthToWrite(whole);
    MAKE(ssize_t, CALL_WRITE, fail(EIO), writeOrSwallow(descriptor, bytes, length));
}

off_t lseek(int descriptor, off_t offset, int whence)
{
    MAKE(off_t, CALL_LSEEK, fail(EIO), syscall(SYS_lseek, descriptor, offset, whence));
}

int ftruncate(int descriptor, off_t length)
{
    MAKE(int, CALL_FTRUNCATE, fail(EIO), syscall(SYS_ftruncate, descriptor, length));
}

int fsync(int descriptor)
{
    MAKE(int, CALL_FSYNC, fail(EIO), syscall(SYS_fsync, descriptor));
}

/* A descriptor is gone even if closing it fails. */
static int failToClose(int descriptor)
{
    syscall(SYS_close, descriptor);
    return fail(EIO);
}

int close(int descriptor)
{
    MAKE(int, CALL_CLOSE, failToClose(descriptor), syscall(SYS_close, descriptor));
}

static long removeAny(const char *path)
{
    const long result = syscall(SYS_unlink, path);
    return result == -1 && errno == EISDIR ? syscall(SYS_rmdir, path) : result;
}

int remove(const char *path)
{
    MAKE(int, CALL_REMOVE, fail(EIO), removeAny(path));
}

int rename(const char *from, const char *to)
{
    MAKE(int, CALL_RENAME, fail(EIO), syscall(SYS_rename, from, to));
}

int mkdir(const char *path, mode_t mode)
{
    MAKE(int, CALL_MKDIR, fail(EIO), syscall(SYS_mkdir, path, mode));
}

int chmod(const char *path, mode_t mode)
{
    MAKE(int, CALL_CHMOD, fail(EIO), syscall(SYS_chmod, path, mode));
}

int semget(key_t key, int count, int flags)
{
    MAKE(int, CALL_SEMGET, fail(ENOSPC), syscall(SYS_semget, key, count, flags));
}

/* Somebody removes the set; the answer of the call that finds it gone. */
static int failWithoutSet(int id)
{
    syscall(SYS_semctl, id, 0, IPC_RMID, NULL);
    return fail(EIDRM);
}

static int failToTake(int id)
{
    return plot.code != 0 ? fail(plot.code) : failWithoutSet(id);
}

int semctl(int id, int number, int command, ...)
{
    va_list rest;
    va_start(rest, command);
    void *argument = va_arg(rest, void *);
    va_end(rest);
    if (plot.code != 0)
        return (int)syscall(SYS_semctl, id, number, command, argument);
    MAKE(int, CALL_SEMCTL, failWithoutSet(id), syscall(SYS_semctl, id, number, command, argument));
}

/* Nobody waits for the second that passes before a call is made again. */
int nanosleep(const struct timespec *time, struct timespec *rest)
{
    return trace != NULL ? 0 : (int)syscall(SYS_nanosleep, time, rest);
}

int semop(int id, struct sembuf *steps, size_t count)
{
    if (count > 1 && plot.code != 0)
        return (int)syscall(SYS_semop, id, steps, count);
    MAKE(int, CALL_SEMOP, failToTake(id), syscall(SYS_semop, id, steps, count));
}
