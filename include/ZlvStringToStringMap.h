/* SPDX-License-Identifier: Apache-2.0 */
/* Made by scripts/mkMapTemplate; do not edit. */
/*
 * ZlvStringToStringMap.h - ordered maps from string to string.
 *
 * A map keeps its entries in the order in which their keys were first put. Keys are compared
 * exactly, upper and lower case distinct. Lookup in a large map takes hardly longer than in a small
 * one.
 *
 * Walk: take an iterator from ZlvStringToStringMapIterator(); while
 * ZlvStringToStringMapIterHasNext(), read with ZlvStringToStringMapIterGetKey() and
 * ZlvStringToStringMapIterGetVal() and move on with ZlvStringToStringMapIterNext(). A walk is valid
 * as long as no entry that it will reach is removed; to remove the entry it stands on, move on
 * first and then remove by key. A call that cannot take the API mutex does nothing and gives 0 or
 * null.
 */
#ifndef ZLV_STRING_TO_STRING_MAP_H
#define ZLV_STRING_TO_STRING_MAP_H

#include "ZlvTypes.h"

CX_BEGIN_DECLS

/** A place in a map that holds one element. */
typedef struct StringToStringMapNode StringToStringMapNode;
/** A walk over a map: the node it stands on, or null. */
typedef StringToStringMapNode *StringToStringMapIterator;

/** Header of a map. */
struct StringToStringMap {
    StringToStringMapNode *first; /**< the oldest entry; null when empty */
    StringToStringMapNode *last;  /**< the newest entry; null when empty */
    void *index; /**< finds the keys of a large map; null as long as there is none */
};

/** Node of a map. */
struct StringToStringMapNode {
    StringToStringMapNode *next; /**< the newer neighbour; null at the end */
    StringToStringMapNode *prev; /**< the older neighbour; null at the start */
    char *key;   /**< owned by the map; null if it could not be copied or the node is removed */
    char *value; /**< held by the map; may be null */
    StringToStringMap *map; /**< the map that holds the node */
};

/**
 * Makes an empty map.
 *
 * @return the map, which the caller frees with ZlvFreeStringToStringMap(); null when memory ran out
 * @lock takes the API mutex
 */
ZLV_API StringToStringMap *ZlvAllocStringToStringMap(void);
/** @twin ZlvAllocStringToStringMap */
ZLV_API StringToStringMap *zlvIntlAllocStringToStringMap(void);

/**
 * Removes what the map holds, oldest first, and frees the map.
 *
 * @param map  null is ignored
 * @lock takes the API mutex
 */
ZLV_API void ZlvFreeStringToStringMap(StringToStringMap *map);
/** @twin ZlvFreeStringToStringMap */
ZLV_API void zlvIntlFreeStringToStringMap(StringToStringMap *map);

/**
 * Starts a walk at the oldest node. There is nothing to free after it.
 *
 * @param map  null is walked like an empty map
 * @return the oldest node, owned by the map; null when there is none
 * @lock takes the API mutex
 */
ZLV_API StringToStringMapIterator ZlvStringToStringMapIterator(const StringToStringMap *map);
/** @twin ZlvStringToStringMapIterator */
ZLV_API StringToStringMapIterator zlvIntlStringToStringMapIterator(const StringToStringMap *map);

/**
 * Tells whether the walk stands on a node.
 *
 * @param iterator  where the walk stands
 * @return 1 when it does, 0 at the end of the map and for null
 * @lock takes the API mutex
 */
ZLV_API ZlvBool ZlvStringToStringMapIterHasNext(StringToStringMapIterator iterator);
/** @twin ZlvStringToStringMapIterHasNext */
ZLV_API ZlvBool zlvIntlStringToStringMapIterHasNext(StringToStringMapIterator iterator);

/**
 * Moves on by one node.
 *
 * @param iterator  where the walk stands
 * @return the following node, owned by the map; null at the end and for null
 * @lock takes the API mutex
 */
ZLV_API StringToStringMapIterator ZlvStringToStringMapIterNext(StringToStringMapIterator iterator);
/** @twin ZlvStringToStringMapIterNext */
ZLV_API StringToStringMapIterator
zlvIntlStringToStringMapIterNext(StringToStringMapIterator iterator);

/**
 * Copies the key of the entry that the walk stands on.
 *
 * @param iterator  where the walk stands
 * @return the copy, which the caller frees with RkoMemoryFree(); null for a null iterator, for an
 *         entry whose key could not be stored, or when memory ran out
 * @lock takes the API mutex
 */
ZLV_API char *ZlvStringToStringMapIterGetKey(StringToStringMapIterator iterator);
/** @twin ZlvStringToStringMapIterGetKey */
ZLV_API char *zlvIntlStringToStringMapIterGetKey(StringToStringMapIterator iterator);

/**
 * Hands out the value of the entry that the walk stands on.
 *
 * @param iterator  where the walk stands
 * @return a copy, freed by the caller with RkoMemoryFree(), if there is memory for it; null for a
 *         null iterator or a null value
 * @lock takes the API mutex
 */
ZLV_API char *ZlvStringToStringMapIterGetVal(StringToStringMapIterator iterator);
/** @twin ZlvStringToStringMapIterGetVal */
ZLV_API char *zlvIntlStringToStringMapIterGetVal(StringToStringMapIterator iterator);

/**
 * Makes a map with the same entries in the same order, each put anew. An entry that finds no memory
 * is skipped.
 *
 * @param map  null gives null
 * @return the new map, which the caller frees with ZlvFreeStringToStringMap(); null when memory ran
 *         out
 * @lock takes the API mutex
 */
ZLV_API StringToStringMap *ZlvCopyStringToStringMap(const StringToStringMap *map);
/** @twin ZlvCopyStringToStringMap */
ZLV_API StringToStringMap *zlvIntlCopyStringToStringMap(const StringToStringMap *map);

/**
 * Sets the value of a key. An entry that has the key keeps its place, and its old value is let go
 * after the new one came in; else an entry is added at the end. Without memory for the entry
 * nothing changes; a key or value that cannot be copied is stored as null.
 *
 * @param map    null gives 0
 * @param key    copied; null gives 0
 * @param value  copied; null is stored as null
 * @return 1 when there is an entry with the value, else 0
 * @lock takes the API mutex
 */
ZLV_API ZlvBool ZlvStringToStringMapPut(StringToStringMap *map, const char *key, const char *value);
/** @twin ZlvStringToStringMapPut */
ZLV_API ZlvBool zlvIntlStringToStringMapPut(StringToStringMap *map, const char *key,
                                            const char *value);

/**
 * Looks a value up.
 *
 * @param map  null is searched like an empty map
 * @param key  compared exactly; null matches nothing
 * @return a copy, freed by the caller with RkoMemoryFree(), if there is memory for it; null when
 *         there is no such key or the value is null
 * @lock takes the API mutex
 */
ZLV_API char *ZlvStringToStringMapGet(const StringToStringMap *map, const char *key);
/** @twin ZlvStringToStringMapGet */
ZLV_API char *zlvIntlStringToStringMapGet(const StringToStringMap *map, const char *key);

/**
 * Removes the entry of a key and lets its value go. An unknown key is ignored.
 *
 * @param map  null is ignored
 * @param key  compared exactly; null matches nothing
 * @lock takes the API mutex
 */
ZLV_API void ZlvStringToStringMapRem(StringToStringMap *map, const char *key);
/** @twin ZlvStringToStringMapRem */
ZLV_API void zlvIntlStringToStringMapRem(StringToStringMap *map, const char *key);

/**
 * Tells whether there is an entry with the key, be its value null or not.
 *
 * @param map  null is searched like an empty map
 * @param key  compared exactly; null matches nothing
 * @return 1 when there is, else 0
 * @lock takes the API mutex
 */
ZLV_API ZlvBool ZlvStringToStringMapHasKey(const StringToStringMap *map, const char *key);
/** @twin ZlvStringToStringMapHasKey */
ZLV_API ZlvBool zlvIntlStringToStringMapHasKey(const StringToStringMap *map, const char *key);

/**
 * Finds the entry of a key.
 *
 * @param map  null is searched like an empty map
 * @param key  compared exactly; null matches nothing
 * @return the node, owned by the map; null when there is none
 * @lock the caller holds the API mutex
 */
ZLV_API StringToStringMapNode *zlvIntlStringToStringMapGetNode(const StringToStringMap *map,
                                                               const char *key);

/**
 * Removes an entry: frees its key and lets its value go.
 *
 * @param map   null is ignored
 * @param node  null, and a node that the map does not hold, are ignored
 * @lock the caller holds the API mutex
 */
ZLV_API void zlvIntlStringToStringMapRemNode(StringToStringMap *map, StringToStringMapNode *node);

CX_END_DECLS

#endif
