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
    FAULT_CUT,     /**< a write takes half of its bytes; any other call is made */
    FAULT_SWALLOW, /**< a write takes nothing and says it took all; any other call is made */
    FAULT_FAIL,    /**< the call is not made; a semaphore set is removed, which is how those fail */
    FAULT_KINDS
};

enum { MOST_CALLS = 256 };

/** The calls that a process has made, in memory that outlives it. */
struct CallTrace {
    uint32_t count;
    uint8_t calls[MOST_CALLS];
};

/** What befalls so many calls in a row, from one on; none for the number 0. */
struct CallPlot {
    uint32_t number;
    enum CallFault fault;
    uint32_t count;
    int code; /**< with which calls fail; 0 for EIO, and for a semaphore set that is removed. With a
                   code the calls that give a semaphore its value or give it back are made: they
                 fail with the set alone. */
};

/** Counts calls from now on, and lets the plot befall them; without a trace they are left alone. */
void plotCallFault(struct CallTrace *trace, struct CallPlot plot);

#ifdef __cplusplus
}
#endif

#endif
