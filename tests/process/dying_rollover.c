/* SPDX-License-Identifier: Apache-2.0 */
/*
 * Kills a writer inside a rollover: the environment variable DIE_AT names a call and which one of
 * it, as in "write 5". Of the writes only those of whole chunks count, and the fatal one is cut in
 * half; of the other calls the fatal one is not made at all.
 */
#define _GNU_SOURCE
#include <signal.h>
#include <stdio.h>
#include <stdlib.h>
#include <string.h>
#include <sys/syscall.h>
#include <unistd.h>

enum { CHUNK_SIZE = 8192 };

/* Tells whether this call of that name is the fatal one. */
static int isFatal(const char *name)
{
    static int calls;
    char fatal[16];
    int number;
    const char *wish = getenv("DIE_AT");
    if (wish == NULL || sscanf(wish, "%15s %d", fatal, &number) != 2 || strcmp(fatal, name) != 0)
        return 0;
    return ++calls == number;
}

static void dieAt(const char *name)
{
    if (isFatal(name))
        raise(SIGKILL);
}

ssize_t write(int descriptor, const void *bytes, size_t length)
{
    if (length == CHUNK_SIZE && isFatal("write")) {
        syscall(SYS_write, descriptor, bytes, length / 2);
        raise(SIGKILL);
    }
    return syscall(SYS_write, descriptor, bytes, length);
}

int rename(const char *from, const char *to)
{
    dieAt("rename");
    return (int)syscall(SYS_rename, from, to);
}

off_t lseek(int descriptor, off_t offset, int whence)
{
    dieAt("lseek");
    return (off_t)syscall(SYS_lseek, descriptor, offset, whence);
}

int fsync(int descriptor)
{
    dieAt("fsync");
    return (int)syscall(SYS_fsync, descriptor);
}

int ftruncate(int descriptor, off_t length)
{
    dieAt("ftruncate");
    return (int)syscall(SYS_ftruncate, descriptor, length);
}
