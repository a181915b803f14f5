// SPDX-License-Identifier: Apache-2.0
// Made by scripts/mkMapTemplate; do not edit.
#include "ZlvStringToObjMap.h"

#include "ZlvIntl.h"
#include "ZlvMapImpl.h"
#include "ZlvOwned.h"

using zelvo::ApiLock;

namespace {

/// How elements come in, are handed out and go.
struct Traits {
    using Header = StringToObjMap;
    using Node = StringToObjMapNode;
    using Element = ZlvObject *;
    using Given = ZlvObject *;
    static constexpr bool deferred = true;

    static ZlvObject *takeIn(ZlvObject *element) { return zlvIntlAcquireObject(element); }
    static ZlvObject *handOut(ZlvObject *element) { return zlvIntlAcquireObject(element); }
    static void letGo(ZlvObject *element) { zlvIntlReleaseObject(element); }
};

using Impl = zelvo::MapImpl<Traits>;

} // namespace

StringToObjMap *zlvIntlAllocStringToObjMap(void)
{
    return zelvo::allocRecord<StringToObjMap>();
}

StringToObjMap *ZlvAllocStringToObjMap(void)
{
    ApiLock lock;
    return lock ? zlvIntlAllocStringToObjMap() : nullptr;
}

void zlvIntlFreeStringToObjMap(StringToObjMap *map)
{
    Impl::free(map);
}

void ZlvFreeStringToObjMap(StringToObjMap *map)
{
    ApiLock lock;
    if (lock)
        zlvIntlFreeStringToObjMap(map);
}

StringToObjMapIterator zlvIntlStringToObjMapIterator(const StringToObjMap *map)
{
    return zelvo::firstNode(map);
}

StringToObjMapIterator ZlvStringToObjMapIterator(const StringToObjMap *map)
{
    ApiLock lock;
    return lock ? zlvIntlStringToObjMapIterator(map) : nullptr;
}

ZlvBool zlvIntlStringToObjMapIterHasNext(StringToObjMapIterator iterator)
{
    return iterator != nullptr;
}

ZlvBool ZlvStringToObjMapIterHasNext(StringToObjMapIterator iterator)
{
    ApiLock lock;
    return lock && zlvIntlStringToObjMapIterHasNext(iterator);
}

StringToObjMapIterator zlvIntlStringToObjMapIterNext(StringToObjMapIterator iterator)
{
    return zelvo::nextNode(iterator);
}

StringToObjMapIterator ZlvStringToObjMapIterNext(StringToObjMapIterator iterator)
{
    ApiLock lock;
    return lock ? zlvIntlStringToObjMapIterNext(iterator) : nullptr;
}

char *zlvIntlStringToObjMapIterGetKey(StringToObjMapIterator iterator)
{
    return Impl::iterGetKey(iterator);
}

char *ZlvStringToObjMapIterGetKey(StringToObjMapIterator iterator)
{
    ApiLock lock;
    return lock ? zlvIntlStringToObjMapIterGetKey(iterator) : nullptr;
}

ZlvObject *zlvIntlStringToObjMapIterGetVal(StringToObjMapIterator iterator)
{
    return Impl::iterGetVal(iterator);
}

ZlvObject *ZlvStringToObjMapIterGetVal(StringToObjMapIterator iterator)
{
    ApiLock lock;
    return lock ? zlvIntlStringToObjMapIterGetVal(iterator) : nullptr;
}

StringToObjMap *zlvIntlCopyStringToObjMap(const StringToObjMap *map)
{
    return Impl::copy(map);
}

StringToObjMap *ZlvCopyStringToObjMap(const StringToObjMap *map)
{
    ApiLock lock;
    return lock ? zlvIntlCopyStringToObjMap(map) : nullptr;
}

ZlvBool zlvIntlStringToObjMapPut(StringToObjMap *map, const char *key, ZlvObject *value)
{
    return Impl::put(map, key, value);
}

ZlvBool ZlvStringToObjMapPut(StringToObjMap *map, const char *key, ZlvObject *value)
{
    ApiLock lock;
    return lock && zlvIntlStringToObjMapPut(map, key, value);
}

ZlvObject *zlvIntlStringToObjMapGet(const StringToObjMap *map, const char *key)
{
    return Impl::get(map, key);
}

ZlvObject *ZlvStringToObjMapGet(const StringToObjMap *map, const char *key)
{
    ApiLock lock;
    return lock ? zlvIntlStringToObjMapGet(map, key) : nullptr;
}

void zlvIntlStringToObjMapRem(StringToObjMap *map, const char *key)
{
    Impl::remove(map, key);
}

void ZlvStringToObjMapRem(StringToObjMap *map, const char *key)
{
    ApiLock lock;
    if (lock)
        zlvIntlStringToObjMapRem(map, key);
}

ZlvBool zlvIntlStringToObjMapHasKey(const StringToObjMap *map, const char *key)
{
    return Impl::hasKey(map, key);
}

ZlvBool ZlvStringToObjMapHasKey(const StringToObjMap *map, const char *key)
{
    ApiLock lock;
    return lock && zlvIntlStringToObjMapHasKey(map, key);
}

StringToObjMapNode *zlvIntlStringToObjMapGetNode(const StringToObjMap *map, const char *key)
{
    return Impl::getNode(map, key);
}

void zlvIntlStringToObjMapRemNode(StringToObjMap *map, StringToObjMapNode *node)
{
    Impl::removeNode(map, node);
}
