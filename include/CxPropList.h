/* SPDX-License-Identifier: Apache-2.0 */
/*
 * CxPropList.h - a small array of keys with values, both strings of the list's own.
 *
 * Keys are unique, compared byte by byte, and stand in the order in which they came until one is
 * removed. The record is the caller's and belongs to one thread at a time.
 */
#ifndef CX_PROP_LIST_H
#define CX_PROP_LIST_H

#include "CxTypes.h"

CX_BEGIN_DECLS

/** One entry of a property list. Both strings are null where memory ran out while it was put. */
typedef struct CxPropListEntry {
    char *key;   /**< owned by the list */
    char *value; /**< owned by the list */
} CxPropListEntry;

/**
 * A property list. A record of zeros is a valid empty list; CxPropListDiscard() makes it one again.
 * Fields may be read at any time and changed only through the calls.
 */
typedef struct CxPropList {
    int32_t count;            /**< entries in use */
    int32_t capacity;         /**< entries allocated */
    CxPropListEntry *entries; /**< the entries; null until the first one is put */
} CxPropList;

/**
 * A place in a property list. It needs no freeing; putting or removing entries while one is in use
 * may make it skip or repeat entries.
 */
typedef struct CxPropListIter {
    CxPropList *list; /**< the list; null once the walk is over */
    int32_t index;    /**< the current entry */
} CxPropListIter;

/**
 * Makes room for a number of further entries. The first allocation is 32 entries; a list that is
 * too small is doubled until its capacity exceeds count + extra + 1. On failure it is as before.
 *
 * @param list   the list; null gives 0
 * @param extra  entries that are to be added
 * @return 1 when the room is there, else 0
 * @lock none
 */
ZLV_API ZlvBool cxPropListHasCapacity(CxPropList *list, int32_t extra);

/**
 * Reads a properties file into a list. Entries read before an error stay in the list.
 *
 * @param fileName  path of the file; null gives 0 with 'p'/22
 * @param list      the list that takes the entries; null gives 0
 * @param error     receives the status of a failing open, read or close and is left alone
 *                  otherwise, by a syntax error too; may be null
 * @return 1 when the whole file was read and every entry put, else 0
 * @lock none
 */
ZLV_API ZlvBool CxPropListRead(const char *fileName, CxPropList *list, CxStatus *error);

/**
 * Puts a copy of a key and a value; the value of a key that is present is replaced in its place.
 * When the copies of a new entry cannot be made, an entry without key and value stays behind:
 * nothing finds it, and it is freed with the list.
 *
 * @param list   the list; null gives 0
 * @param key    the key; null gives 0
 * @param value  the value; null gives 0
 * @return 1 when put, 0 when an argument is missing or memory ran out
 * @lock none
 */
ZLV_API ZlvBool CxPropListPutStr(CxPropList *list, const char *key, const char *value);

/**
 * Lends the value of a key.
 *
 * @param list   the list; null finds nothing
 * @param key    the key; null finds nothing
 * @param found  receives whether the key is present; may be null
 * @return the value, owned by the list and good until it is replaced or removed; null when absent
 * @lock none
 */
ZLV_API char *CxPropListPeekStr(const CxPropList *list, const char *key, ZlvBool *found);

/**
 * Copies the value of a key.
 *
 * @param list   the list; null finds nothing
 * @param key    the key; null finds nothing
 * @param found  receives whether the key is present; may be null
 * @return a new string that the caller frees with RkoMemoryFree(); null when the key is absent or
 *         memory ran out
 * @lock none
 */
ZLV_API char *CxPropListCopyStr(const CxPropList *list, const char *key, ZlvBool *found);

/**
 * Tells whether a key is present.
 *
 * @param list  the list; null finds nothing
 * @param key   the key; null finds nothing
 * @return 1 when present, else 0
 * @lock none
 */
ZLV_API ZlvBool CxPropListHasKey(const CxPropList *list, const char *key);

/**
 * Removes a key with its value. The last entry takes the free place, so the order changes.
 *
 * @param list  the list; null gives 0
 * @param key   the key; null gives 0
 * @return 1 when removed, 0 when absent
 * @lock none
 */
ZLV_API ZlvBool CxPropListRemove(CxPropList *list, const char *key);

/**
 * Frees every entry and the storage and leaves an empty list.
 *
 * @param list  the list; null is ignored
 * @lock none
 */
ZLV_API void CxPropListDiscard(CxPropList *list);

/**
 * Starts a walk on the first entry, which need not exist: read the current entry first, then
 * advance while CxPropListIterHasNext() says so.
 *
 * @param list  the list; null gives an iterator without entries
 * @return the iterator; nothing is to be freed
 * @lock none
 */
ZLV_API CxPropListIter CxPropListIterator(CxPropList *list);

/**
 * Tells whether an entry stands after the current one.
 *
 * @param iterator  the iterator; null, or one with a negative index, gives 0
 * @return 1 when there is a next entry, else 0
 * @lock none
 */
ZLV_API ZlvBool CxPropListIterHasNext(const CxPropListIter *iterator);

/**
 * Goes to the next entry; when there is none the iterator loses its list. An iterator with a
 * negative index stays as it is.
 *
 * @param iterator  the iterator; null is ignored
 * @lock none
 */
ZLV_API void CxPropListIterNext(CxPropListIter *iterator);

/**
 * Lends the key of the current entry.
 *
 * @param iterator  the iterator; null gives null
 * @return the key, owned by the list; null when there is no current entry
 * @lock none
 */
ZLV_API char *CxPropListIterPeekKey(const CxPropListIter *iterator);

/**
 * Lends the value of the current entry.
 *
 * @param iterator  the iterator; null gives null
 * @return the value, owned by the list; null when there is no current entry
 * @lock none
 */
ZLV_API char *CxPropListIterPeekVal(const CxPropListIter *iterator);

/**
 * Copies the key of the current entry.
 *
 * @param iterator  the iterator; null gives null
 * @return a new string that the caller frees with RkoMemoryFree(); null when there is no current
 *         entry or memory ran out
 * @lock none
 */
ZLV_API char *CxPropListIterCopyKey(const CxPropListIter *iterator);

/**
 * Copies the value of the current entry.
 *
 * @param iterator  the iterator; null gives null
 * @return a new string that the caller frees with RkoMemoryFree(); null when there is no current
 *         entry or memory ran out
 * @lock none
 */
ZLV_API char *CxPropListIterCopyVal(const CxPropListIter *iterator);

CX_END_DECLS

#endif
