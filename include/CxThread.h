/* SPDX-License-Identifier: Apache-2.0 */
/* CxThread.h - threads, for applications: the library starts none of its own. */
#ifndef CX_THREAD_H
#define CX_THREAD_H

#include "CxTypes.h"

CX_BEGIN_DECLS

/**
 * Tells whether threads are supported.
 *
 * @return 1, always
 * @lock none
 */
ZLV_API ZlvBool CxHasThreadSupport(void);

/**
 * Gives the identifier of the calling thread.
 *
 * @return the POSIX thread id
 * @lock none
 */
ZLV_API uint64_t CxThreadGetCurrentID(void);

/**
 * Starts a thread, to be joined with CxThreadJoin().
 *
 * @param thread  receives the thread's id, left alone on failure; null gives 'p'/22
 * @param stackSize  bytes of its stack; 0 takes the platform's default
 * @param start  the function that the thread runs; null gives 'p'/22
 * @param argument  handed to the function as it is, may be null
 * @return '-', or 'p' with 22 or the thread library's number
 * @lock none
 */
ZLV_API CxStatus CxThreadCreate(uint64_t *thread, size_t stackSize, void *(*start)(void *),
                                void *argument);

/**
 * Waits for a thread to end. Its result is dropped.
 *
 * @param thread  id of a thread that nobody joined yet; 0 gives 'p'/22
 * @return '-', or 'p' with 22 or the thread library's number
 * @lock none
 */
ZLV_API CxStatus CxThreadJoin(uint64_t thread);

/**
 * Does nothing: the scheduler is left to its own judgement.
 *
 * @lock none
 */
ZLV_API void CxThreadYield(void);

/**
 * Sleeps for the nearest whole number of seconds: less than 500 ms do not sleep, 1499 ms sleep one
 * second. A signal ends the sleep.
 *
 * @param milliseconds  how long
 * @return seconds left when a signal came, else 0
 * @lock none
 */
ZLV_API uint32_t CxThreadSleep(uint32_t milliseconds);

CX_END_DECLS

#endif
