/* SPDX-License-Identifier: Apache-2.0 */
/*
 * CxMutex.h - mutexes. They are not recursive: a thread that locks one twice waits for itself for
 * ever. Creating and destroying a mutex must not race with its use.
 */
#ifndef CX_MUTEX_H
#define CX_MUTEX_H

#include "CxTypes.h"

CX_BEGIN_DECLS

/** Handle of a mutex; null is the empty handle. Its creator owns it until CxMutexDestroy(). */
typedef struct CxMutexRec *CxMutex;

/**
 * Creates an unlocked mutex.
 *
 * @param slot  receives the handle, which the caller destroys with CxMutexDestroy(), or null on
 *     failure; null gives 'p'/22
 * @return '-' or 'p' with 22, with 12 when memory ran out, or with the thread library's number
 * @lock none
 */
ZLV_API CxStatus CxMutexCreate(CxMutex *slot);

/**
 * Waits for a mutex and takes it.
 *
 * @param mutex  the mutex, not held by this thread; null gives 'p'/22 at once
 * @return '-' when taken, or 'p' with 22 or the thread library's number
 * @lock none
 */
ZLV_API CxStatus CxMutexLock(CxMutex mutex);

/**
 * Gives a mutex back.
 *
 * @param mutex  the mutex, held by this thread; null gives 'p'/22
 * @return '-' when given back, or 'p' with 22 or the thread library's number
 * @lock none
 */
ZLV_API CxStatus CxMutexUnlock(CxMutex mutex);

/**
 * Destroys a mutex and empties its slot. The memory goes even when the thread library refuses (as
 * for a locked mutex); the refusal is still reported. Destroying an emptied slot again is harmless.
 *
 * @param slot  holds the handle, receives null; a null slot or an empty handle gives 'p'/22
 * @return '-', or 'p' with 22 or the thread library's number
 * @lock none
 */
ZLV_API CxStatus CxMutexDestroy(CxMutex *slot);

CX_END_DECLS

#endif
