/* SPDX-License-Identifier: Apache-2.0 */
/* Made by scripts/mkMapTemplate; do not edit. */
/*
 * ZlvStringToObjMap.h - ordered maps from name to object.
 *
 * A map keeps its entries in the order in which their keys were first put. Keys are compared
 * exactly, upper and lower case distinct. Lookup in a large map takes hardly longer than in a small
 * one.
 *
 * Walk: take an iterator from ZlvStringToObjMapIterator(); while ZlvStringToObjMapIterHasNext(),
 * read with ZlvStringToObjMapIterGetKey() and ZlvStringToObjMapIterGetVal() and move on with
 * ZlvStringToObjMapIterNext(). A walk is valid as long as no entry that it will reach is removed;
 * to remove the entry it stands on, move on first and then remove by key. A call that cannot take
 * the API mutex does nothing and gives 0 or null.
 *
 * Removing may run class functions, which may remove nodes in turn. So a removed node keeps its
 * neighbours and stays readable, and its memory is freed only when the API mutex is released.
 */
#ifndef ZLV_STRING_TO_OBJ_MAP_H
#define ZLV_STRING_TO_OBJ_MAP_H

#include "ZlvTypes.h"

CX_BEGIN_DECLS

/** A place in a map that holds one element. */
typedef struct StringToObjMapNode StringToObjMapNode;
/** A walk over a map: the node it stands on, or null. */
typedef StringToObjMapNode *StringToObjMapIterator;

/** Header of a map. */
struct StringToObjMap {
    StringToObjMapNode *first; /**< the oldest entry; null when empty */
    StringToObjMapNode *last;  /**< the newest entry; null when empty */
    void *index;               /**< finds the keys of a large map; null as long as there is none */
};

/** Node of a map. */
struct StringToObjMapNode {
    StringToObjMapNode *next; /**< the newer neighbour; null at the end */
    StringToObjMapNode *prev; /**< the older neighbour; null at the start */
    char *key; /**< owned by the map; null if it could not be copied or the node is removed */
    ZlvObject *value;    /**< held by the map; may be null */
    StringToObjMap *map; /**< the map that holds the node */
};

/**
 * Makes an empty map.
 *
 * @return the map, which the caller frees with ZlvFreeStringToObjMap(); null when memory ran out
 * @lock takes the API mutex
 */
ZLV_API StringToObjMap *ZlvAllocStringToObjMap(void);
/** @twin ZlvAllocStringToObjMap */
ZLV_API StringToObjMap *zlvIntlAllocStringToObjMap(void);

/**
 * Removes what the map holds, oldest first, and frees the map.
 *
 * @param map  null is ignored
 * @lock takes the API mutex
 */
ZLV_API void ZlvFreeStringToObjMap(StringToObjMap *map);
/** @twin ZlvFreeStringToObjMap */
ZLV_API void zlvIntlFreeStringToObjMap(StringToObjMap *map);

/**
 * Starts a walk at the oldest node. There is nothing to free after it.
 *
 * @param map  null is walked like an empty map
 * @return the oldest node, owned by the map; null when there is none
 * @lock takes the API mutex
 */
ZLV_API StringToObjMapIterator ZlvStringToObjMapIterator(const StringToObjMap *map);
/** @twin ZlvStringToObjMapIterator */
ZLV_API StringToObjMapIterator zlvIntlStringToObjMapIterator(const StringToObjMap *map);

/**
 * Tells whether the walk stands on a node.
 *
 * @param iterator  where the walk stands
 * @return 1 when it does, 0 at the end of the map and for null
 * @lock takes the API mutex
 */
ZLV_API ZlvBool ZlvStringToObjMapIterHasNext(StringToObjMapIterator iterator);
/** @twin ZlvStringToObjMapIterHasNext */
ZLV_API ZlvBool zlvIntlStringToObjMapIterHasNext(StringToObjMapIterator iterator);

/**
 * Moves on by one node.
 *
 * @param iterator  where the walk stands
 * @return the following node, owned by the map; null at the end and for null
 * @lock takes the API mutex
 */
ZLV_API StringToObjMapIterator ZlvStringToObjMapIterNext(StringToObjMapIterator iterator);
/** @twin ZlvStringToObjMapIterNext */
ZLV_API StringToObjMapIterator zlvIntlStringToObjMapIterNext(StringToObjMapIterator iterator);

/**
 * Copies the key of the entry that the walk stands on.
 *
 * @param iterator  where the walk stands
 * @return the copy, which the caller frees with RkoMemoryFree(); null for a null iterator, for an
 *         entry whose key could not be stored, or when memory ran out
 * @lock takes the API mutex
 */
ZLV_API char *ZlvStringToObjMapIterGetKey(StringToObjMapIterator iterator);
/** @twin ZlvStringToObjMapIterGetKey */
ZLV_API char *zlvIntlStringToObjMapIterGetKey(StringToObjMapIterator iterator);

/**
 * Hands out the value of the entry that the walk stands on.
 *
 * @param iterator  where the walk stands
 * @return the object with a reference for the caller, given back with ZlvReleaseObject(); null for
 *         a null iterator or a null value
 * @lock takes the API mutex
 */
ZLV_API ZlvObject *ZlvStringToObjMapIterGetVal(StringToObjMapIterator iterator);
/** @twin ZlvStringToObjMapIterGetVal */
ZLV_API ZlvObject *zlvIntlStringToObjMapIterGetVal(StringToObjMapIterator iterator);

/**
 * Makes a map with the same entries in the same order, each put anew. An entry that finds no memory
 * is skipped.
 *
 * @param map  null gives null
 * @return the new map, which the caller frees with ZlvFreeStringToObjMap(); null when memory ran
 *         out
 * @lock takes the API mutex
 */
ZLV_API StringToObjMap *ZlvCopyStringToObjMap(const StringToObjMap *map);
/** @twin ZlvCopyStringToObjMap */
ZLV_API StringToObjMap *zlvIntlCopyStringToObjMap(const StringToObjMap *map);

/**
 * Sets the value of a key. An entry that has the key keeps its place, and its old value is let go
 * after the new one came in; else an entry is added at the end. Without memory for the entry
 * nothing changes; a key or value that cannot be copied is stored as null.
 *
 * @param map    null gives 0
 * @param key    copied; null gives 0
 * @param value  gets one more reference; null is stored as null
 * @return 1 when there is an entry with the value, else 0
 * @lock takes the API mutex
 */
ZLV_API ZlvBool ZlvStringToObjMapPut(StringToObjMap *map, const char *key, ZlvObject *value);
/** @twin ZlvStringToObjMapPut */
ZLV_API ZlvBool zlvIntlStringToObjMapPut(StringToObjMap *map, const char *key, ZlvObject *value);

/**
 * Looks a value up.
 *
 * @param map  null is searched like an empty map
 * @param key  compared exactly; null matches nothing
 * @return the object with a reference for the caller, given back with ZlvReleaseObject(); null when
 *         there is no such key or the value is null
 * @lock takes the API mutex
 */
ZLV_API ZlvObject *ZlvStringToObjMapGet(const StringToObjMap *map, const char *key);
/** @twin ZlvStringToObjMapGet */
ZLV_API ZlvObject *zlvIntlStringToObjMapGet(const StringToObjMap *map, const char *key);

/**
 * Removes the entry of a key and lets its value go. An unknown key is ignored.
 *
 * @param map  null is ignored
 * @param key  compared exactly; null matches nothing
 * @lock takes the API mutex
 */
ZLV_API void ZlvStringToObjMapRem(StringToObjMap *map, const char *key);
/** @twin ZlvStringToObjMapRem */
ZLV_API void zlvIntlStringToObjMapRem(StringToObjMap *map, const char *key);

/**
 * Tells whether there is an entry with the key, be its value null or not.
 *
 * @param map  null is searched like an empty map
 * @param key  compared exactly; null matches nothing
 * @return 1 when there is, else 0
 * @lock takes the API mutex
 */
ZLV_API ZlvBool ZlvStringToObjMapHasKey(const StringToObjMap *map, const char *key);
/** @twin ZlvStringToObjMapHasKey */
ZLV_API ZlvBool zlvIntlStringToObjMapHasKey(const StringToObjMap *map, const char *key);

/**
 * Finds the entry of a key.
 *
 * @param map  null is searched like an empty map
 * @param key  compared exactly; null matches nothing
 * @return the node, owned by the map; null when there is none
 * @lock the caller holds the API mutex
 */
ZLV_API StringToObjMapNode *zlvIntlStringToObjMapGetNode(const StringToObjMap *map,
                                                         const char *key);

/**
 * Removes an entry: frees its key and lets its value go.
 *
 * @param map   null is ignored
 * @param node  null, and a node that the map does not hold, are ignored
 * @lock the caller holds the API mutex
 */
ZLV_API void zlvIntlStringToObjMapRemNode(StringToObjMap *map, StringToObjMapNode *node);

CX_END_DECLS

#endif
