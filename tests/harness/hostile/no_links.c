/* SPDX-License-Identifier: Apache-2.0 */
/* With ZELVO_NO_LINKS in the environment, no file is opened through a symbolic link. */
#define _POSIX_C_SOURCE 200809L
#include <fcntl.h>
#include <stdarg.h>
#include <stdlib.h>

int __real_open(const char *name, int flags, ...);
int __wrap_open(const char *name, int flags, ...);

int __wrap_open(const char *name, int flags, ...)
{
    va_list args;
    va_start(args, flags);
    const unsigned mode = flags & O_CREAT ? va_arg(args, unsigned) : 0;
    va_end(args);
    return __real_open(name, getenv("ZELVO_NO_LINKS") ? flags | O_NOFOLLOW : flags, mode);
}
