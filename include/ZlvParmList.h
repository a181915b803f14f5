/* SPDX-License-Identifier: Apache-2.0 */
/* Made by scripts/mkListTemplate; do not edit. */
/*
 * ZlvParmList.h - ordered lists of typed values.
 *
 * A list keeps its elements in the order of appending, duplicates too, counts them, can be sorted
 * and is addressed by position. It owns its elements. Lookup takes time in proportion to its
 * length.
 *
 * Walk: take an iterator from ZlvParmListIterator(); while ZlvParmListIterHasNext(), read with
 * ZlvParmListIterGet() and move on with ZlvParmListIterNext(). A walk is valid as long as no node
 * that it will reach is removed. A call that cannot take the API mutex does nothing and gives 0 or
 * null.
 */
#ifndef ZLV_PARM_LIST_H
#define ZLV_PARM_LIST_H

#include "ZlvParm.h"
#include "ZlvTypes.h"

CX_BEGIN_DECLS

/** A place in a list that holds one element. */
typedef struct ParmListNode ParmListNode;
/** A walk over a list: the node it stands on, or null. */
typedef ParmListNode *ParmListIterator;

/** Header of a list. */
struct ParmList {
    ParmListNode *first; /**< the oldest node; null when empty */
    ParmListNode *last;  /**< the newest node; null when empty */
    uint32_t count;      /**< number of nodes */
};

/** Node of a list. */
struct ParmListNode {
    ParmListNode *next; /**< the following node; null at the end */
    ParmListNode *prev; /**< the preceding node; null at the start */
    ZlvParm *element;   /**< owned by the list, never null */
    ParmList *owner;    /**< the list that holds the node */
};

/**
 * Makes an empty list.
 *
 * @return the list, which the caller frees with ZlvFreeParmList(); null when memory ran out
 * @lock takes the API mutex
 */
ZLV_API ParmList *ZlvAllocParmList(void);
/** @twin ZlvAllocParmList */
ZLV_API ParmList *zlvIntlAllocParmList(void);

/**
 * Removes what the list holds, oldest first, and frees the list.
 *
 * @param list  null is ignored
 * @lock takes the API mutex
 */
ZLV_API void ZlvFreeParmList(ParmList *list);
/** @twin ZlvFreeParmList */
ZLV_API void zlvIntlFreeParmList(ParmList *list);

/**
 * Starts a walk at the oldest node. There is nothing to free after it.
 *
 * @param list  null is walked like an empty list
 * @return the oldest node, owned by the list; null when there is none
 * @lock takes the API mutex
 */
ZLV_API ParmListIterator ZlvParmListIterator(const ParmList *list);
/** @twin ZlvParmListIterator */
ZLV_API ParmListIterator zlvIntlParmListIterator(const ParmList *list);

/**
 * Tells whether the walk stands on a node.
 *
 * @param iterator  where the walk stands
 * @return 1 when it does, 0 at the end of the list and for null
 * @lock takes the API mutex
 */
ZLV_API ZlvBool ZlvParmListIterHasNext(ParmListIterator iterator);
/** @twin ZlvParmListIterHasNext */
ZLV_API ZlvBool zlvIntlParmListIterHasNext(ParmListIterator iterator);

/**
 * Moves on by one node.
 *
 * @param iterator  where the walk stands
 * @return the following node, owned by the list; null at the end and for null
 * @lock takes the API mutex
 */
ZLV_API ParmListIterator ZlvParmListIterNext(ParmListIterator iterator);
/** @twin ZlvParmListIterNext */
ZLV_API ParmListIterator zlvIntlParmListIterNext(ParmListIterator iterator);

/**
 * Hands out the element that the walk stands on.
 *
 * @param iterator  where the walk stands
 * @return a copy, freed by the caller with ZlvFreeParm(), if there is memory for it; null for a
 *         null iterator
 * @lock takes the API mutex
 */
ZLV_API ZlvParm *ZlvParmListIterGet(ParmListIterator iterator);
/** @twin ZlvParmListIterGet */
ZLV_API ZlvParm *zlvIntlParmListIterGet(ParmListIterator iterator);

/**
 * Removes the node that the walk stands on and lets its element go. The caller goes on from the
 * result and does not call ZlvParmListIterNext() first.
 *
 * @param iterator  where the walk stands
 * @return the node that followed, owned by the list; null at the end and for null
 * @lock takes the API mutex
 */
ZLV_API ParmListIterator ZlvParmListIterRem(ParmListIterator iterator);
/** @twin ZlvParmListIterRem */
ZLV_API ParmListIterator zlvIntlParmListIterRem(ParmListIterator iterator);

/**
 * Finds the oldest node that holds an element equal to the one given: what ZlvCmpParms() says.
 * Takes no lock, so a caller that shares the list holds the API mutex.
 *
 * @param list     null gives null
 * @param element  what to look for; null gives null
 * @return the node, owned by the list; null when there is none
 * @lock none
 */
ZLV_API ParmListNode *ZlvParmListGetLink(const ParmList *list, const ZlvParm *element);

/**
 * Makes a list with the same elements in the same order, each taken in anew as ZlvParmListAppend()
 * does. An element that finds no memory is skipped.
 *
 * @param list  null gives null
 * @return the new list, which the caller frees with ZlvFreeParmList(); null when memory ran out
 * @lock takes the API mutex
 */
ZLV_API ParmList *ZlvCopyParmList(const ParmList *list);
/** @twin ZlvCopyParmList */
ZLV_API ParmList *zlvIntlCopyParmList(const ParmList *list);

/**
 * Adds an element at the end, whether or not an equal one is there. When memory runs out nothing
 * changes.
 *
 * @param list     null gives 0
 * @param element  copied with ZlvCopyParm(); null gives 0
 * @return 1 when it was added, else 0
 * @lock takes the API mutex
 */
ZLV_API ZlvBool ZlvParmListAppend(ParmList *list, const ZlvParm *element);
/** @twin ZlvParmListAppend */
ZLV_API ZlvBool zlvIntlParmListAppend(ParmList *list, const ZlvParm *element);

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
ZLV_API ZlvParm *ZlvParmListGetIndex(const ParmList *list, int32_t position);

/**
 * Removes a node and lets its element go. Takes no lock, so a caller that shares the list holds the
 * API mutex.
 *
 * @param list  null is ignored
 * @param node  a node of this list, freed by the call; null is ignored
 * @lock none
 */
ZLV_API void ZlvParmListRemLink(ParmList *list, ParmListNode *node);

/**
 * Sorts the elements with qsort(), so equal ones may come out in any order. The nodes stay where
 * they are and exchange their elements. Without memory nothing changes. Each successful sort leaves
 * one array of count pointers allocated.
 *
 * @param list     null is ignored
 * @param compare  negative, zero or positive, as for qsort(); gets two pointers to values, that is
 *                 to `ZlvParm *`; null is ignored
 * @lock takes the API mutex
 */
ZLV_API void ZlvSortParmList(ParmList *list, int (*compare)(const void *, const void *));

CX_END_DECLS

#endif
