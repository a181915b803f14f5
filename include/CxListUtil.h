/* SPDX-License-Identifier: Apache-2.0 */
/*
 * CxListUtil.h - growth of an array whose pointer, capacity and length its user keeps in three
 * variables of his own.
 */
#ifndef CX_LIST_UTIL_H
#define CX_LIST_UTIL_H

#include "CxTypes.h"

CX_BEGIN_DECLS

/**
 * Makes sure that an array has room for a number of elements. A null array is allocated with room
 * for exactly that many and gets length 0. A too small one is reallocated to the smallest of 16,
 * 32, 64, ... elements that exceeds the number; its length stays. When that many elements cannot
 * be had, nothing changes.
 *
 * @param arraySlot    address of the array pointer (a T **); null gives 0
 * @param capacity     the array's capacity in elements, updated; null gives 0
 * @param length       the array's length in elements, set to 0 with a new array; null gives 0
 * @param needed       elements there must be room for; 0 fails for a null array
 * @param elementSize  bytes of one element; 0 makes every allocation fail
 * @return 1 when the room is there, 0 when an argument is missing or memory ran out
 * @lock none
 */
ZLV_API ZlvBool CxListEnsureCapacity(void *arraySlot, uint32_t *capacity, uint32_t *length,
                                     uint32_t needed, uint32_t elementSize);

/**
 * Frees an array and sets its three variables to null and zero. The elements are the caller's to
 * clean up before. Does nothing unless all three arguments are given.
 *
 * @param arraySlot  address of the array pointer (a T **); null makes the call do nothing
 * @param capacity   the array's capacity; null makes the call do nothing
 * @param length     the array's length; null makes the call do nothing
 * @lock none
 */
ZLV_API void CxListDiscard(void *arraySlot, uint32_t *capacity, uint32_t *length);

CX_END_DECLS

#endif
