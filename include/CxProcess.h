/* SPDX-License-Identifier: Apache-2.0 */
/* CxProcess.h - facts of the running process, and child processes. */
#ifndef CX_PROCESS_H
#define CX_PROCESS_H

#include "CxTypes.h"

CX_BEGIN_DECLS

/**
 * Looks up an environment variable. The library itself reads none.
 *
 * @param name  the variable; null gives null
 * @return its value, owned by the environment and not to be freed; null when unset
 * @lock none
 */
ZLV_API char *CxProcessGetEnv(const char *name);

/**
 * Gives the identifier of this process.
 *
 * @return the process id
 * @lock none
 */
ZLV_API int64_t CxProcessGetCurrentID(void);

/**
 * Gives the working directory. On any failure a given buffer holds the empty string.
 *
 * @param buffer  receives the path, room for at least one byte; null gives 'p'/22
 * @param size  bytes of the buffer; 0 gives 'p'/22
 * @return '-', or 'p' with 22 or errno (34, ERANGE, for a buffer that is too small)
 * @lock none
 */
ZLV_API CxStatus CxProcessGetCwd(char *buffer, size_t size);

/**
 * Starts a program in a child process. When the program cannot be started the CHILD returns from
 * this call too, with '-' and -1 in the slot: a caller that finds -1 there after '-' is that child
 * and must end itself with _exit().
 *
 * @param process  receives the child's id, -1 when none was made; null gives 'p'/22
 * @param path  the program, not searched for in PATH; null or "" gives 'p'/22
 * @param argv  its arguments, the program's name first and a null pointer last; null is an empty
 *     vector
 * @return '-', or 'p' with 22 or errno
 * @lock none
 */
ZLV_API CxStatus CxProcessCreate(int64_t *process, const char *path, char *const argv[]);

/**
 * Lets go of a child process. The child is neither waited for nor signalled; reaping it is left to
 * the application.
 *
 * @param process  the child's id; 0 gives 'p'/22
 * @return '-' or 'p'/22
 * @lock none
 */
ZLV_API CxStatus CxProcessRelease(int64_t process);

CX_END_DECLS

#endif
