/* SPDX-License-Identifier: Apache-2.0 */
/* Made by scripts/mkMapTemplate; do not edit. */
/*
 * ZlvStringToObjClassMap.h - ordered maps from name to class.
 *
 * A map keeps its entries in the order in which their keys were first put. Keys are compared
 * exactly, upper and lower case distinct. Lookup in a large map takes hardly longer than in a small
 * one.
 *
 * Walk: take an iterator from ZlvStringToObjClassMapIterator(); while
 * ZlvStringToObjClassMapIterHasNext(), read with ZlvStringToObjClassMapIterGetKey() and
 * ZlvStringToObjClassMapIterGetVal() and move on with ZlvStringToObjClassMapIterNext(). A walk is
 * valid as long as no entry that it will reach is removed; to remove the entry it stands on, move
 * on first and then remove by key. A call that cannot take the API mutex does nothing and gives 0
 * or null.
 */
#ifndef ZLV_STRING_TO_OBJ_CLASS_MAP_H
#define ZLV_STRING_TO_OBJ_CLASS_MAP_H

#include "ZlvTypes.h"

CX_BEGIN_DECLS

/** A place in a map that holds one element. */
typedef struct StringToObjClassMapNode StringToObjClassMapNode;
/** A walk over a map: the node it stands on, or null. */
typedef StringToObjClassMapNode *StringToObjClassMapIterator;

/** Header of a map. */
struct StringToObjClassMap {
    StringToObjClassMapNode *first; /**< the oldest entry; null when empty */
    StringToObjClassMapNode *last;  /**< the newest entry; null when empty */
    void *index; /**< finds the keys of a large map; null as long as there is none */
};

/** Node of a map. */
struct StringToObjClassMapNode {
    StringToObjClassMapNode *next; /**< the newer neighbour; null at the end */
    StringToObjClassMapNode *prev; /**< the older neighbour; null at the start */
    char *key; /**< owned by the map; null if it could not be copied or the node is removed */
    ZlvObjClass *value;       /**< held by the map; may be null */
    StringToObjClassMap *map; /**< the map that holds the node */
};

/**
 * Makes an empty map.
 *
 * @return the map, which the caller frees with ZlvFreeStringToObjClassMap(); null when memory ran
 *         out
 * @lock takes the API mutex
 */
ZLV_API StringToObjClassMap *ZlvAllocStringToObjClassMap(void);
/** @twin ZlvAllocStringToObjClassMap */
ZLV_API StringToObjClassMap *zlvIntlAllocStringToObjClassMap(void);

/**
 * Removes what the map holds, oldest first, and frees the map.
 *
 * @param map  null is ignored
 * @lock takes the API mutex
 */
ZLV_API void ZlvFreeStringToObjClassMap(StringToObjClassMap *map);
/** @twin ZlvFreeStringToObjClassMap */
ZLV_API void zlvIntlFreeStringToObjClassMap(StringToObjClassMap *map);

/**
 * Starts a walk at the oldest node. There is nothing to free after it.
 *
 * @param map  null is walked like an empty map
 * @return the oldest node, owned by the map; null when there is none
 * @lock takes the API mutex
 */
ZLV_API StringToObjClassMapIterator ZlvStringToObjClassMapIterator(const StringToObjClassMap *map);
/** @twin ZlvStringToObjClassMapIterator */
ZLV_API StringToObjClassMapIterator
zlvIntlStringToObjClassMapIterator(const StringToObjClassMap *map);

/**
 * Tells whether the walk stands on a node.
 *
 * @param iterator  where the walk stands
 * @return 1 when it does, 0 at the end of the map and for null
 * @lock takes the API mutex
 */
ZLV_API ZlvBool ZlvStringToObjClassMapIterHasNext(StringToObjClassMapIterator iterator);
/** @twin ZlvStringToObjClassMapIterHasNext */
ZLV_API ZlvBool zlvIntlStringToObjClassMapIterHasNext(StringToObjClassMapIterator iterator);

/**
 * Moves on by one node.
 *
 * @param iterator  where the walk stands
 * @return the following node, owned by the map; null at the end and for null
 * @lock takes the API mutex
 */
ZLV_API StringToObjClassMapIterator
ZlvStringToObjClassMapIterNext(StringToObjClassMapIterator iterator);
/** @twin ZlvStringToObjClassMapIterNext */
ZLV_API StringToObjClassMapIterator
zlvIntlStringToObjClassMapIterNext(StringToObjClassMapIterator iterator);

/**
 * Copies the key of the entry that the walk stands on.
 *
 * @param iterator  where the walk stands
 * @return the copy, which the caller frees with RkoMemoryFree(); null for a null iterator, for an
 *         entry whose key could not be stored, or when memory ran out
 * @lock takes the API mutex
 */
ZLV_API char *ZlvStringToObjClassMapIterGetKey(StringToObjClassMapIterator iterator);
/** @twin ZlvStringToObjClassMapIterGetKey */
ZLV_API char *zlvIntlStringToObjClassMapIterGetKey(StringToObjClassMapIterator iterator);

/**
 * Hands out the value of the entry that the walk stands on.
 *
 * @param iterator  where the walk stands
 * @return the stored class itself, owned by whoever put it; null for a null iterator or a null
 *         value
 * @lock takes the API mutex
 */
ZLV_API ZlvObjClass *ZlvStringToObjClassMapIterGetVal(StringToObjClassMapIterator iterator);
/** @twin ZlvStringToObjClassMapIterGetVal */
ZLV_API ZlvObjClass *zlvIntlStringToObjClassMapIterGetVal(StringToObjClassMapIterator iterator);

/**
 * Makes a map with the same entries in the same order, each put anew. An entry that finds no memory
 * is skipped.
 *
 * @param map  null gives null
 * @return the new map, which the caller frees with ZlvFreeStringToObjClassMap(); null when memory
 *         ran out
 * @lock takes the API mutex
 */
ZLV_API StringToObjClassMap *ZlvCopyStringToObjClassMap(const StringToObjClassMap *map);
/** @twin ZlvCopyStringToObjClassMap */
ZLV_API StringToObjClassMap *zlvIntlCopyStringToObjClassMap(const StringToObjClassMap *map);

/**
 * Sets the value of a key. An entry that has the key keeps its place, and its old value is let go
 * after the new one came in; else an entry is added at the end. Without memory for the entry
 * nothing changes; a key or value that cannot be copied is stored as null.
 *
 * @param map    null gives 0
 * @param key    copied; null gives 0
 * @param value  stored as it is, since classes are not counted; it stays the caller's
 * @return 1 when there is an entry with the value, else 0
 * @lock takes the API mutex
 */
ZLV_API ZlvBool ZlvStringToObjClassMapPut(StringToObjClassMap *map, const char *key,
                                          ZlvObjClass *value);
/** @twin ZlvStringToObjClassMapPut */
ZLV_API ZlvBool zlvIntlStringToObjClassMapPut(StringToObjClassMap *map, const char *key,
                                              ZlvObjClass *value);

/**
 * Looks a value up.
 *
 * @param map  null is searched like an empty map
 * @param key  compared exactly; null matches nothing
 * @return the stored class itself, owned by whoever put it; null when there is no such key or the
 *         value is null
 * @lock takes the API mutex
 */
ZLV_API ZlvObjClass *ZlvStringToObjClassMapGet(const StringToObjClassMap *map, const char *key);
/** @twin ZlvStringToObjClassMapGet */
ZLV_API ZlvObjClass *zlvIntlStringToObjClassMapGet(const StringToObjClassMap *map, const char *key);

/**
 * Removes the entry of a key and lets its value go. An unknown key is ignored.
 *
 * @param map  null is ignored
 * @param key  compared exactly; null matches nothing
 * @lock takes the API mutex
 */
ZLV_API void ZlvStringToObjClassMapRem(StringToObjClassMap *map, const char *key);
/** @twin ZlvStringToObjClassMapRem */
ZLV_API void zlvIntlStringToObjClassMapRem(StringToObjClassMap *map, const char *key);

/**
 * Tells whether there is an entry with the key, be its value null or not.
 *
 * @param map  null is searched like an empty map
 * @param key  compared exactly; null matches nothing
 * @return 1 when there is, else 0
 * @lock takes the API mutex
 */
ZLV_API ZlvBool ZlvStringToObjClassMapHasKey(const StringToObjClassMap *map, const char *key);
/** @twin ZlvStringToObjClassMapHasKey */
ZLV_API ZlvBool zlvIntlStringToObjClassMapHasKey(const StringToObjClassMap *map, const char *key);

/**
 * Finds the entry of a key.
 *
 * @param map  null is searched like an empty map
 * @param key  compared exactly; null matches nothing
 * @return the node, owned by the map; null when there is none
 * @lock the caller holds the API mutex
 */
ZLV_API StringToObjClassMapNode *zlvIntlStringToObjClassMapGetNode(const StringToObjClassMap *map,
                                                                   const char *key);

/**
 * Removes an entry: frees its key and lets its value go.
 *
 * @param map   null is ignored
 * @param node  null, and a node that the map does not hold, are ignored
 * @lock the caller holds the API mutex
 */
ZLV_API void zlvIntlStringToObjClassMapRemNode(StringToObjClassMap *map,
                                               StringToObjClassMapNode *node);

CX_END_DECLS

#endif
