/* SPDX-License-Identifier: Apache-2.0 */
/*
 * soak_faults.h - what stands between the shared library and the system in a process that logs: the
 * linker takes the program's functions. It sees writes that the system cuts short, and keeps the
 * files that a rollover removes, so that every record can be counted.
 */
#ifndef SOAK_FAULTS_H
#define SOAK_FAULTS_H

#include <stdint.h>

#ifdef __cplusplus
extern "C" {
#endif

/** What a process has met. */
struct SoakFaults {
    uint32_t cutShort; /**< writes of which the system took a part only */
    uint32_t removed;  /**< files that a rollover removed */
};

/**
 * Begins to keep files and to note writes, in memory that outlives the process. What is removed
 * from a directory goes into its subdirectory "removed".
 */
void startSoakFaults(struct SoakFaults *met);

/** From now on this thread's writes find no space, or find it again. */
void refuseWrites(int refused);

/** Has this thread's next write succeed without being made. */
void swallowNextWrite(void);

/** Tells whether a write of this thread was cut short since the last such question. */
int wasCutShort(void);

#ifdef __cplusplus
}
#endif

#endif
