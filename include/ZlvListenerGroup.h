/* SPDX-License-Identifier: Apache-2.0 */
/* Made by scripts/mkGroupTemplate; do not edit. */
/*
 * ZlvListenerGroup.h - ordered sets of listeners.
 *
 * A group keeps its elements in the order of adding and holds no two equal ones. It owns its
 * elements, or a reference to each. Lookup takes time in proportion to its length.
 *
 * Walk: take an iterator from ZlvListenerGroupIterator(); while ZlvListenerGroupIterHasNext(), read
 * with ZlvListenerGroupIterGet() and move on with ZlvListenerGroupIterNext(). A walk is valid as
 * long as no node that it will reach is removed. A call that cannot take the API mutex does nothing
 * and gives 0 or null.
 *
 * Removing may run class functions, which may remove nodes in turn. So a removed node keeps its
 * neighbours and stays readable, and its memory is freed only when the API mutex is released.
 */
#ifndef ZLV_LISTENER_GROUP_H
#define ZLV_LISTENER_GROUP_H

#include "ZlvTypes.h"

CX_BEGIN_DECLS

/** A place in a group that holds one element. */
typedef struct ListenerGroupNode ListenerGroupNode;
/** A walk over a group: the node it stands on, or null. */
typedef ListenerGroupNode *ListenerGroupIterator;

/** Header of a group. */
struct ListenerGroup {
    ListenerGroupNode *first; /**< the oldest node; null when empty */
    ListenerGroupNode *last;  /**< the newest node; null when empty */
};

/** Node of a group. */
struct ListenerGroupNode {
    ListenerGroupNode *next; /**< the following node; null at the end */
    ListenerGroupNode *prev; /**< the preceding node; null at the start */
    ZlvObject *element;      /**< held by the group; null once the node is removed */
    ListenerGroup *owner;    /**< the group that holds the node */
};

/**
 * Makes an empty group.
 *
 * @return the group, which the caller frees with ZlvFreeListenerGroup(); null when memory ran out
 * @lock takes the API mutex
 */
ZLV_API ListenerGroup *ZlvAllocListenerGroup(void);
/** @twin ZlvAllocListenerGroup */
ZLV_API ListenerGroup *zlvIntlAllocListenerGroup(void);

/**
 * Removes what the group holds, oldest first, and frees the group.
 *
 * @param group  null is ignored
 * @lock takes the API mutex
 */
ZLV_API void ZlvFreeListenerGroup(ListenerGroup *group);
/** @twin ZlvFreeListenerGroup */
ZLV_API void zlvIntlFreeListenerGroup(ListenerGroup *group);

/**
 * Starts a walk at the oldest node. There is nothing to free after it.
 *
 * @param group  null is walked like an empty group
 * @return the oldest node, owned by the group; null when there is none
 * @lock takes the API mutex
 */
ZLV_API ListenerGroupIterator ZlvListenerGroupIterator(const ListenerGroup *group);
/** @twin ZlvListenerGroupIterator */
ZLV_API ListenerGroupIterator zlvIntlListenerGroupIterator(const ListenerGroup *group);

/**
 * Tells whether the walk stands on a node.
 *
 * @param iterator  where the walk stands
 * @return 1 when it does, 0 at the end of the group and for null
 * @lock takes the API mutex
 */
ZLV_API ZlvBool ZlvListenerGroupIterHasNext(ListenerGroupIterator iterator);
/** @twin ZlvListenerGroupIterHasNext */
ZLV_API ZlvBool zlvIntlListenerGroupIterHasNext(ListenerGroupIterator iterator);

/**
 * Moves on by one node.
 *
 * @param iterator  where the walk stands
 * @return the following node, owned by the group; null at the end and for null
 * @lock takes the API mutex
 */
ZLV_API ListenerGroupIterator ZlvListenerGroupIterNext(ListenerGroupIterator iterator);
/** @twin ZlvListenerGroupIterNext */
ZLV_API ListenerGroupIterator zlvIntlListenerGroupIterNext(ListenerGroupIterator iterator);

/**
 * Hands out the element that the walk stands on.
 *
 * @param iterator  where the walk stands
 * @return the object with a reference for the caller, given back with ZlvReleaseObject(); null for
 *         a null iterator
 * @lock takes the API mutex
 */
ZLV_API ZlvObject *ZlvListenerGroupIterGet(ListenerGroupIterator iterator);
/** @twin ZlvListenerGroupIterGet */
ZLV_API ZlvObject *zlvIntlListenerGroupIterGet(ListenerGroupIterator iterator);

/**
 * Removes the node that the walk stands on and lets its element go. The caller goes on from the
 * result and does not call ZlvListenerGroupIterNext() first.
 *
 * @param iterator  where the walk stands
 * @return the node that followed, owned by the group; null at the end and for null
 * @lock takes the API mutex
 */
ZLV_API ListenerGroupIterator ZlvListenerGroupIterRem(ListenerGroupIterator iterator);
/** @twin ZlvListenerGroupIterRem */
ZLV_API ListenerGroupIterator zlvIntlListenerGroupIterRem(ListenerGroupIterator iterator);

/**
 * Finds the oldest node that holds an element equal to the one given: what ZlvAreObjectsEqual()
 * says. Takes no lock, so a caller that shares the group holds the API mutex.
 *
 * @param group    null gives null
 * @param element  what to look for; null gives null
 * @return the node, owned by the group; null when there is none
 * @lock none
 */
ZLV_API ListenerGroupNode *ZlvListenerGroupGetLink(const ListenerGroup *group, ZlvObject *element);

/**
 * Adds an element at the end unless the group holds an equal one (what ZlvAreObjectsEqual() says).
 * When it does, or memory runs out, nothing changes.
 *
 * @param group    null gives 0
 * @param element  gets one more reference; null gives 0
 * @return 1 when it was added, else 0
 * @lock takes the API mutex
 */
ZLV_API ZlvBool ZlvListenerGroupAdd(ListenerGroup *group, ZlvObject *element);
/** @twin ZlvListenerGroupAdd */
ZLV_API ZlvBool zlvIntlListenerGroupAdd(ListenerGroup *group, ZlvObject *element);

/**
 * Removes the element equal to the one given and lets it go.
 *
 * @param group    null gives 0
 * @param element  what to look for; null gives 0
 * @return 1 when there was one, else 0
 * @lock takes the API mutex
 */
ZLV_API ZlvBool ZlvListenerGroupRem(ListenerGroup *group, ZlvObject *element);
/** @twin ZlvListenerGroupRem */
ZLV_API ZlvBool zlvIntlListenerGroupRem(ListenerGroup *group, ZlvObject *element);

CX_END_DECLS

#endif
