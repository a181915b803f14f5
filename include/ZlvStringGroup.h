/* SPDX-License-Identifier: Apache-2.0 */
/* Made by scripts/mkGroupTemplate; do not edit. */
/*
 * ZlvStringGroup.h - ordered sets of strings.
 *
 * A group keeps its elements in the order of adding and holds no two equal ones. It owns its
 * elements, or a reference to each. Lookup takes time in proportion to its length.
 *
 * Walk: take an iterator from ZlvStringGroupIterator(); while ZlvStringGroupIterHasNext(), read
 * with ZlvStringGroupIterGet() and move on with ZlvStringGroupIterNext(). A walk is valid as long
 * as no node that it will reach is removed. A call that cannot take the API mutex does nothing and
 * gives 0 or null.
 */
#ifndef ZLV_STRING_GROUP_H
#define ZLV_STRING_GROUP_H

#include "ZlvTypes.h"

CX_BEGIN_DECLS

/** A place in a group that holds one element. */
typedef struct StringGroupNode StringGroupNode;
/** A walk over a group: the node it stands on, or null. */
typedef StringGroupNode *StringGroupIterator;

/** Header of a group. */
struct StringGroup {
    StringGroupNode *first; /**< the oldest node; null when empty */
    StringGroupNode *last;  /**< the newest node; null when empty */
};

/** Node of a group. */
struct StringGroupNode {
    StringGroupNode *next; /**< the following node; null at the end */
    StringGroupNode *prev; /**< the preceding node; null at the start */
    char *element;         /**< held by the group; null once the node is removed */
    StringGroup *owner;    /**< the group that holds the node */
};

/**
 * Makes an empty group.
 *
 * @return the group, which the caller frees with ZlvFreeStringGroup(); null when memory ran out
 * @lock takes the API mutex
 */
ZLV_API StringGroup *ZlvAllocStringGroup(void);
/** @twin ZlvAllocStringGroup */
ZLV_API StringGroup *zlvIntlAllocStringGroup(void);

/**
 * Removes what the group holds, oldest first, and frees the group.
 *
 * @param group  null is ignored
 * @lock takes the API mutex
 */
ZLV_API void ZlvFreeStringGroup(StringGroup *group);
/** @twin ZlvFreeStringGroup */
ZLV_API void zlvIntlFreeStringGroup(StringGroup *group);

/**
 * Starts a walk at the oldest node. There is nothing to free after it.
 *
 * @param group  null is walked like an empty group
 * @return the oldest node, owned by the group; null when there is none
 * @lock takes the API mutex
 */
ZLV_API StringGroupIterator ZlvStringGroupIterator(const StringGroup *group);
/** @twin ZlvStringGroupIterator */
ZLV_API StringGroupIterator zlvIntlStringGroupIterator(const StringGroup *group);

/**
 * Tells whether the walk stands on a node.
 *
 * @param iterator  where the walk stands
 * @return 1 when it does, 0 at the end of the group and for null
 * @lock takes the API mutex
 */
ZLV_API ZlvBool ZlvStringGroupIterHasNext(StringGroupIterator iterator);
/** @twin ZlvStringGroupIterHasNext */
ZLV_API ZlvBool zlvIntlStringGroupIterHasNext(StringGroupIterator iterator);

/**
 * Moves on by one node.
 *
 * @param iterator  where the walk stands
 * @return the following node, owned by the group; null at the end and for null
 * @lock takes the API mutex
 */
ZLV_API StringGroupIterator ZlvStringGroupIterNext(StringGroupIterator iterator);
/** @twin ZlvStringGroupIterNext */
ZLV_API StringGroupIterator zlvIntlStringGroupIterNext(StringGroupIterator iterator);

/**
 * Hands out the element that the walk stands on.
 *
 * @param iterator  where the walk stands
 * @return a copy, freed by the caller with RkoMemoryFree(), if there is memory for it; null for a
 *         null iterator
 * @lock takes the API mutex
 */
ZLV_API char *ZlvStringGroupIterGet(StringGroupIterator iterator);
/** @twin ZlvStringGroupIterGet */
ZLV_API char *zlvIntlStringGroupIterGet(StringGroupIterator iterator);

/**
 * Removes the node that the walk stands on and lets its element go. The caller goes on from the
 * result and does not call ZlvStringGroupIterNext() first.
 *
 * @param iterator  where the walk stands
 * @return the node that followed, owned by the group; null at the end and for null
 * @lock takes the API mutex
 */
ZLV_API StringGroupIterator ZlvStringGroupIterRem(StringGroupIterator iterator);
/** @twin ZlvStringGroupIterRem */
ZLV_API StringGroupIterator zlvIntlStringGroupIterRem(StringGroupIterator iterator);

/**
 * Finds the oldest node that holds an element equal to the one given: exactly the same bytes. Takes
 * no lock, so a caller that shares the group holds the API mutex.
 *
 * @param group    null gives null
 * @param element  what to look for; null gives null
 * @return the node, owned by the group; null when there is none
 * @lock none
 */
ZLV_API StringGroupNode *ZlvStringGroupGetLink(const StringGroup *group, const char *element);

/**
 * Adds an element at the end unless the group holds an equal one (exactly the same bytes). When it
 * does, or memory runs out, nothing changes.
 *
 * @param group    null gives 0
 * @param element  copied; null gives 0
 * @return 1 when it was added, else 0
 * @lock takes the API mutex
 */
ZLV_API ZlvBool ZlvStringGroupAdd(StringGroup *group, const char *element);
/** @twin ZlvStringGroupAdd */
ZLV_API ZlvBool zlvIntlStringGroupAdd(StringGroup *group, const char *element);

/**
 * Removes the element equal to the one given and lets it go.
 *
 * @param group    null gives 0
 * @param element  what to look for; null gives 0
 * @return 1 when there was one, else 0
 * @lock takes the API mutex
 */
ZLV_API ZlvBool ZlvStringGroupRem(StringGroup *group, const char *element);
/** @twin ZlvStringGroupRem */
ZLV_API ZlvBool zlvIntlStringGroupRem(StringGroup *group, const char *element);

CX_END_DECLS

#endif
