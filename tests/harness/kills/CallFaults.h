/* SPDX-License-Identifier: Apache-2.0 */
/*
 * CallFaults.h - a fault at one of the system calls of a process, which stand between the shared
 * library and the system: the linker takes the program's functions. Calls are numbered from 1, from
 * the moment that the process asks for it.
 */
#ifndef CALL_FAULTS_H
#define CALL_FAULTS_H

#include <stdint.h>

#ifdef __cplusplus
extern "C" {
#endif

/** The calls that are numbered. */
enum FaultyCall {
    CALL_STAT,
    CALL_OPEN,
    CALL_FSTAT,
    CALL_READ,
    CALL_WRITE,
    CALL_LSEEK,
    CALL_FTRUNCATE,
    CALL_FSYNC,
    CALL_CLOSE,
    CALL_REMOVE,
    CALL_RENAME,
    CALL_MKDIR,
    CALL_CHMOD,
    CALL_SEMGET,
    CALL_SEMCTL,
    CALL_SEMOP,
    CALL_KINDS
};

/** What becomes of the chosen call. */
enum CallFault {
    FAULT_NONE,
    FAULT_KILL_BEFORE,
    FAULT_KILL_WITHIN, /**< a write is cut in half; any other call is made, and then the kill */
    FAULT_KILL_AFTER,
    FAULT_FAIL, /**< the call is not made; a semaphore set is removed, which is how those fail */
    FAULT_KINDS
};

enum { MOST_CALLS = 256 };

/** The calls that a process has made, in memory that outlives it. */
struct CallTrace {
    uint32_t count;
    uint8_t calls[MOST_CALLS];
};

/** Counts calls from now on, and lets the fault befall the one of that number. */
void plotCallFault(struct CallTrace *trace, uint32_t number, enum CallFault fault);

#ifdef __cplusplus
}
#endif

#endif
