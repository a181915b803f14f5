/* SPDX-License-Identifier: Apache-2.0 */
/*
 * CxMemory.h - the allocation calls that all library code goes through. They add no header to a
 * block, so a block may cross freely between them and malloc() and free().
 */
#ifndef CX_MEMORY_H
#define CX_MEMORY_H

#include "CxTypes.h"

CX_BEGIN_DECLS

/**
 * Allocates a block of uninitialised bytes. A size of zero allocates nothing.
 *
 * @param size  bytes wanted; 0 gives null
 * @return the block, which the caller frees with RkoMemoryFree(); null when size is 0 or memory ran
 *     out
 * @lock none
 */
ZLV_API void *RkoMemoryMalloc(size_t size);

/**
 * Allocates a zeroed array. An empty array allocates nothing.
 *
 * @param count  number of elements; 0 gives null
 * @param size  bytes of one element; 0 gives null
 * @return the block, which the caller frees with RkoMemoryFree(); null when count or size is 0,
 *     their product overflows or memory ran out
 * @lock none
 */
ZLV_API void *RkoMemoryCalloc(size_t count, size_t size);

/**
 * Resizes a block, which may move; its bytes are kept up to the smaller size. Unlike C's realloc(),
 * a size of zero leaves the old block alone: the caller still owns it. So it does on failure.
 *
 * @param block  the block to resize; null allocates afresh
 * @param size  bytes wanted; 0 gives null and does not touch the block
 * @return the resized block, which replaces the old one and which the caller frees with
 *     RkoMemoryFree(); null when size is 0 or memory ran out
 * @lock none
 */
ZLV_API void *RkoMemoryRealloc(void *block, size_t size);

/**
 * Frees a block.
 *
 * @param block  a block from these calls or from malloc(); null is ignored
 * @lock none
 */
ZLV_API void RkoMemoryFree(void *block);

CX_END_DECLS

#endif
