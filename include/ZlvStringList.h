/* SPDX-License-Identifier: Apache-2.0 */
/* Made by scripts/mkListTemplate; do not edit. */
/*
 * ZlvStringList.h - ordered lists of strings.
 *
 * A list keeps its elements in the order of appending, duplicates too, counts them, can be sorted
 * and is addressed by position. It owns its elements. Lookup takes time in proportion to its
 * length.
 *
 * Walk: take an iterator from ZlvStringListIterator(); while ZlvStringListIterHasNext(), read with
 * ZlvStringListIterGet() and move on with ZlvStringListIterNext(). A walk is valid as long as no
 * node that it will reach is removed. A call that cannot take the API mutex does nothing and gives
 * 0 or null.
 */
#ifndef ZLV_STRING_LIST_H
#define ZLV_STRING_LIST_H

#include "ZlvTypes.h"

CX_BEGIN_DECLS

/** A place in a list that holds one element. */
typedef struct StringListNode StringListNode;
/** A walk over a list: the node it stands on, or null. */
typedef StringListNode *StringListIterator;

/** Header of a list. */
struct StringList {
    StringListNode *first; /**< the oldest node; null when empty */
    StringListNode *last;  /**< the newest node; null when empty */
    uint32_t count;        /**< number of nodes */
};

/** Node of a list. */
struct StringListNode {
    StringListNode *next; /**< the following node; null at the end */
    StringListNode *prev; /**< the preceding node; null at the start */
    char *element;        /**< owned by the list, never null */
    StringList *owner;    /**< the list that holds the node */
};

/**
 * Makes an empty list.
 *
 * @return the list, which the caller frees with ZlvFreeStringList(); null when memory ran out
 * @lock takes the API mutex
 */
ZLV_API StringList *ZlvAllocStringList(void);
/** @twin ZlvAllocStringList */
ZLV_API StringList *zlvIntlAllocStringList(void);

/**
 * Removes what the list holds, oldest first, and frees the list.
 *
 * @param list  null is ignored
 * @lock takes the API mutex
 */
ZLV_API void ZlvFreeStringList(StringList *list);
/** @twin ZlvFreeStringList */
ZLV_API void zlvIntlFreeStringList(StringList *list);

/**
 * Starts a walk at the oldest node. There is nothing to free after it.
 *
 * @param list  null is walked like an empty list
 * @return the oldest node, owned by the list; null when there is none
 * @lock takes the API mutex
 */
ZLV_API StringListIterator ZlvStringListIterator(const StringList *list);
/** @twin ZlvStringListIterator */
ZLV_API StringListIterator zlvIntlStringListIterator(const StringList *list);

/**
 * Tells whether the walk stands on a node.
 *
 * @param iterator  where the walk stands
 * @return 1 when it does, 0 at the end of the list and for null
 * @lock takes the API mutex
 */
ZLV_API ZlvBool ZlvStringListIterHasNext(StringListIterator iterator);
/** @twin ZlvStringListIterHasNext */
ZLV_API ZlvBool zlvIntlStringListIterHasNext(StringListIterator iterator);

/**
 * Moves on by one node.
 *
 * @param iterator  where the walk stands
 * @return the following node, owned by the list; null at the end and for null
 * @lock takes the API mutex
 */
ZLV_API StringListIterator ZlvStringListIterNext(StringListIterator iterator);
/** @twin ZlvStringListIterNext */
ZLV_API StringListIterator zlvIntlStringListIterNext(StringListIterator iterator);

/**
 * Hands out the element that the walk stands on.
 *
 * @param iterator  where the walk stands
 * @return a copy, freed by the caller with RkoMemoryFree(), if there is memory for it; null for a
 *         null iterator
 * @lock takes the API mutex
 */
ZLV_API char *ZlvStringListIterGet(StringListIterator iterator);
/** @twin ZlvStringListIterGet */
ZLV_API char *zlvIntlStringListIterGet(StringListIterator iterator);

/**
 * Removes the node that the walk stands on and lets its element go. The caller goes on from the
 * result and does not call ZlvStringListIterNext() first.
 *
 * @param iterator  where the walk stands
 * @return the node that followed, owned by the list; null at the end and for null
 * @lock takes the API mutex
 */
ZLV_API StringListIterator ZlvStringListIterRem(StringListIterator iterator);
/** @twin ZlvStringListIterRem */
ZLV_API StringListIterator zlvIntlStringListIterRem(StringListIterator iterator);

/**
 * Finds the oldest node that holds an element equal to the one given: exactly the same bytes. Takes
 * no lock, so a caller that shares the list holds the API mutex.
 *
 * @param list     null gives null
 * @param element  what to look for; null gives null
 * @return the node, owned by the list; null when there is none
 * @lock none
 */
ZLV_API StringListNode *ZlvStringListGetLink(const StringList *list, const char *element);

/**
 * Makes a list with the same elements in the same order, each taken in anew as
 * ZlvStringListAppend() does. An element that finds no memory is skipped.
 *
 * @param list  null gives null
 * @return the new list, which the caller frees with ZlvFreeStringList(); null when memory ran out
 * @lock takes the API mutex
 */
ZLV_API StringList *ZlvCopyStringList(const StringList *list);
/** @twin ZlvCopyStringList */
ZLV_API StringList *zlvIntlCopyStringList(const StringList *list);

/**
 * Adds an element at the end, whether or not an equal one is there. When memory runs out nothing
 * changes.
 *
 * @param list     null gives 0
 * @param element  copied; null gives 0
 * @return 1 when it was added, else 0
 * @lock takes the API mutex
 */
ZLV_API ZlvBool ZlvStringListAppend(StringList *list, const char *element);
/** @twin ZlvStringListAppend */
ZLV_API ZlvBool zlvIntlStringListAppend(StringList *list, const char *element);

/**
 * Lends the element at a position. Takes no lock, so a caller that shares the list holds the API
 * mutex.
 *
 * @param list      null gives null
 * @param position  counted from 0; a negative one gives null
 * @return the stored element itself, owned by the list and valid until it is removed; null past the
 *         end
 * @lock none
 */
ZLV_API char *ZlvStringListGetIndex(const StringList *list, int32_t position);

/**
 * Removes a node and lets its element go. Takes no lock, so a caller that shares the list holds the
 * API mutex.
 *
 * @param list  null is ignored
 * @param node  a node of this list, freed by the call; null is ignored
 * @lock none
 */
ZLV_API void ZlvStringListRemLink(StringList *list, StringListNode *node);

/**
 * Sorts the elements with qsort(), so equal ones may come out in any order. The nodes stay where
 * they are and exchange their elements. Without memory nothing changes. Each successful sort leaves
 * one array of count pointers allocated.
 *
 * @param list     null is ignored
 * @param compare  negative, zero or positive, as for qsort(); gets two pointers to strings, that is
 *                 to `char *`; null is ignored
 * @lock takes the API mutex
 */
ZLV_API void ZlvSortStringList(StringList *list, int (*compare)(const void *, const void *));

CX_END_DECLS

#endif
