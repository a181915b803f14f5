/* SPDX-License-Identifier: Apache-2.0 */
/* Made by scripts/mkMapTemplate; do not edit. */
/*
 * ZlvStringToObjCfgMap.h - ordered maps from name to configuration.
 *
 * A map keeps its entries in the order in which their keys were first put. Keys are compared
 * exactly, upper and lower case distinct. Lookup in a large map takes hardly longer than in a small
 * one.
 *
 * Walk: take an iterator from ZlvStringToObjCfgMapIterator(); while
 * ZlvStringToObjCfgMapIterHasNext(), read with ZlvStringToObjCfgMapIterGetKey() and
 * ZlvStringToObjCfgMapIterGetVal() and move on with ZlvStringToObjCfgMapIterNext(). A walk is valid
 * as long as no entry that it will reach is removed; to remove the entry it stands on, move on
 * first and then remove by key. A call that cannot take the API mutex does nothing and gives 0 or
 * null.
 *
 * Removing may run class functions, which may remove nodes in turn. So a removed node keeps its
 * neighbours and stays readable, and its memory is freed only when the API mutex is released.
 */
#ifndef ZLV_STRING_TO_OBJ_CFG_MAP_H
#define ZLV_STRING_TO_OBJ_CFG_MAP_H

#include "ZlvTypes.h"

CX_BEGIN_DECLS

/** A place in a map that holds one element. */
typedef struct StringToObjCfgMapNode StringToObjCfgMapNode;
/** A walk over a map: the node it stands on, or null. */
typedef StringToObjCfgMapNode *StringToObjCfgMapIterator;

/** Header of a map. */
struct StringToObjCfgMap {
    StringToObjCfgMapNode *first; /**< the oldest entry; null when empty */
    StringToObjCfgMapNode *last;  /**< the newest entry; null when empty */
    void *index; /**< finds the keys of a large map; null as long as there is none */
};

/** Node of a map. */
struct StringToObjCfgMapNode {
    StringToObjCfgMapNode *next; /**< the newer neighbour; null at the end */
    StringToObjCfgMapNode *prev; /**< the older neighbour; null at the start */
    char *key; /**< owned by the map; null if it could not be copied or the node is removed */
    ZlvObjCfg *value;       /**< held by the map; may be null */
    StringToObjCfgMap *map; /**< the map that holds the node */
};

/**
 * Makes an empty map.
 *
 * @return the map, which the caller frees with ZlvFreeStringToObjCfgMap(); null when memory ran out
 * @lock takes the API mutex
 */
ZLV_API StringToObjCfgMap *ZlvAllocStringToObjCfgMap(void);
/** @twin ZlvAllocStringToObjCfgMap */
ZLV_API StringToObjCfgMap *zlvIntlAllocStringToObjCfgMap(void);

/**
 * Removes what the map holds, oldest first, and frees the map.
 *
 * @param map  null is ignored
 * @lock takes the API mutex
 */
ZLV_API void ZlvFreeStringToObjCfgMap(StringToObjCfgMap *map);
/** @twin ZlvFreeStringToObjCfgMap */
ZLV_API void zlvIntlFreeStringToObjCfgMap(StringToObjCfgMap *map);

/**
 * Starts a walk at the oldest node. There is nothing to free after it.
 *
 * @param map  null is walked like an empty map
 * @return the oldest node, owned by the map; null when there is none
 * @lock takes the API mutex
 */
ZLV_API StringToObjCfgMapIterator ZlvStringToObjCfgMapIterator(const StringToObjCfgMap *map);
/** @twin ZlvStringToObjCfgMapIterator */
ZLV_API StringToObjCfgMapIterator zlvIntlStringToObjCfgMapIterator(const StringToObjCfgMap *map);

/**
 * Tells whether the walk stands on a node.
 *
 * @param iterator  where the walk stands
 * @return 1 when it does, 0 at the end of the map and for null
 * @lock takes the API mutex
 */
ZLV_API ZlvBool ZlvStringToObjCfgMapIterHasNext(StringToObjCfgMapIterator iterator);
/** @twin ZlvStringToObjCfgMapIterHasNext */
ZLV_API ZlvBool zlvIntlStringToObjCfgMapIterHasNext(StringToObjCfgMapIterator iterator);

/**
 * Moves on by one node.
 *
 * @param iterator  where the walk stands
 * @return the following node, owned by the map; null at the end and for null
 * @lock takes the API mutex
 */
ZLV_API StringToObjCfgMapIterator ZlvStringToObjCfgMapIterNext(StringToObjCfgMapIterator iterator);
/** @twin ZlvStringToObjCfgMapIterNext */
ZLV_API StringToObjCfgMapIterator
zlvIntlStringToObjCfgMapIterNext(StringToObjCfgMapIterator iterator);

/**
 * Copies the key of the entry that the walk stands on.
 *
 * @param iterator  where the walk stands
 * @return the copy, which the caller frees with RkoMemoryFree(); null for a null iterator, for an
 *         entry whose key could not be stored, or when memory ran out
 * @lock takes the API mutex
 */
ZLV_API char *ZlvStringToObjCfgMapIterGetKey(StringToObjCfgMapIterator iterator);
/** @twin ZlvStringToObjCfgMapIterGetKey */
ZLV_API char *zlvIntlStringToObjCfgMapIterGetKey(StringToObjCfgMapIterator iterator);

/**
 * Hands out the value of the entry that the walk stands on.
 *
 * @param iterator  where the walk stands
 * @return the configuration with a reference for the caller, given back with ZlvReleaseObjCfg();
 *         null for a null iterator or a null value
 * @lock takes the API mutex
 */
ZLV_API ZlvObjCfg *ZlvStringToObjCfgMapIterGetVal(StringToObjCfgMapIterator iterator);
/** @twin ZlvStringToObjCfgMapIterGetVal */
ZLV_API ZlvObjCfg *zlvIntlStringToObjCfgMapIterGetVal(StringToObjCfgMapIterator iterator);

/**
 * Makes a map with the same entries in the same order, each put anew. An entry that finds no memory
 * is skipped.
 *
 * @param map  null gives null
 * @return the new map, which the caller frees with ZlvFreeStringToObjCfgMap(); null when memory ran
 *         out
 * @lock takes the API mutex
 */
ZLV_API StringToObjCfgMap *ZlvCopyStringToObjCfgMap(const StringToObjCfgMap *map);
/** @twin ZlvCopyStringToObjCfgMap */
ZLV_API StringToObjCfgMap *zlvIntlCopyStringToObjCfgMap(const StringToObjCfgMap *map);

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
ZLV_API ZlvBool ZlvStringToObjCfgMapPut(StringToObjCfgMap *map, const char *key, ZlvObjCfg *value);
/** @twin ZlvStringToObjCfgMapPut */
ZLV_API ZlvBool zlvIntlStringToObjCfgMapPut(StringToObjCfgMap *map, const char *key,
                                            ZlvObjCfg *value);

/**
 * Looks a value up.
 *
 * @param map  null is searched like an empty map
 * @param key  compared exactly; null matches nothing
 * @return the configuration with a reference for the caller, given back with ZlvReleaseObjCfg();
 *         null when there is no such key or the value is null
 * @lock takes the API mutex
 */
ZLV_API ZlvObjCfg *ZlvStringToObjCfgMapGet(const StringToObjCfgMap *map, const char *key);
/** @twin ZlvStringToObjCfgMapGet */
ZLV_API ZlvObjCfg *zlvIntlStringToObjCfgMapGet(const StringToObjCfgMap *map, const char *key);

/**
 * Removes the entry of a key and lets its value go. An unknown key is ignored.
 *
 * @param map  null is ignored
 * @param key  compared exactly; null matches nothing
 * @lock takes the API mutex
 */
ZLV_API void ZlvStringToObjCfgMapRem(StringToObjCfgMap *map, const char *key);
/** @twin ZlvStringToObjCfgMapRem */
ZLV_API void zlvIntlStringToObjCfgMapRem(StringToObjCfgMap *map, const char *key);

/**
 * Tells whether there is an entry with the key, be its value null or not.
 *
 * @param map  null is searched like an empty map
 * @param key  compared exactly; null matches nothing
 * @return 1 when there is, else 0
 * @lock takes the API mutex
 */
ZLV_API ZlvBool ZlvStringToObjCfgMapHasKey(const StringToObjCfgMap *map, const char *key);
/** @twin ZlvStringToObjCfgMapHasKey */
ZLV_API ZlvBool zlvIntlStringToObjCfgMapHasKey(const StringToObjCfgMap *map, const char *key);

/**
 * Finds the entry of a key.
 *
 * @param map  null is searched like an empty map
 * @param key  compared exactly; null matches nothing
 * @return the node, owned by the map; null when there is none
 * @lock the caller holds the API mutex
 */
ZLV_API StringToObjCfgMapNode *zlvIntlStringToObjCfgMapGetNode(const StringToObjCfgMap *map,
                                                               const char *key);

/**
 * Removes an entry: frees its key and lets its value go.
 *
 * @param map   null is ignored
 * @param node  null, and a node that the map does not hold, are ignored
 * @lock the caller holds the API mutex
 */
ZLV_API void zlvIntlStringToObjCfgMapRemNode(StringToObjCfgMap *map, StringToObjCfgMapNode *node);

CX_END_DECLS

#endif
