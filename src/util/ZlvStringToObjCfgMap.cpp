// SPDX-License-Identifier: Apache-2.0
// Made by scripts/mkMapTemplate; do not edit.
#include "ZlvStringToObjCfgMap.h"

#include "ZlvIntl.h"
#include "ZlvMapImpl.h"
#include "ZlvOwned.h"

using zelvo::ApiLock;

namespace {

/// How elements come in, are handed out and go.
struct Traits {
    using Header = StringToObjCfgMap;
    using Node = StringToObjCfgMapNode;
    using Element = ZlvObjCfg *;
    using Given = ZlvObjCfg *;
    static constexpr bool deferred = true;

    static ZlvObjCfg *takeIn(ZlvObjCfg *element) { return zlvIntlAcquireObjCfg(element); }
    static ZlvObjCfg *handOut(ZlvObjCfg *element) { return zlvIntlAcquireObjCfg(element); }
    static void letGo(ZlvObjCfg *element) { zlvIntlReleaseObjCfg(element); }
};

using Impl = zelvo::MapImpl<Traits>;

} // namespace

StringToObjCfgMap *zlvIntlAllocStringToObjCfgMap(void)
{
    return zelvo::allocRecord<StringToObjCfgMap>();
}

StringToObjCfgMap *ZlvAllocStringToObjCfgMap(void)
{
    ApiLock lock;
    return lock ? zlvIntlAllocStringToObjCfgMap() : nullptr;
}

void zlvIntlFreeStringToObjCfgMap(StringToObjCfgMap *map)
{
    Impl::free(map);
}

void ZlvFreeStringToObjCfgMap(StringToObjCfgMap *map)
{
    ApiLock lock;
    if (lock)
        zlvIntlFreeStringToObjCfgMap(map);
}

StringToObjCfgMapIterator zlvIntlStringToObjCfgMapIterator(const StringToObjCfgMap *map)
{
    return zelvo::firstNode(map);
}

StringToObjCfgMapIterator ZlvStringToObjCfgMapIterator(const StringToObjCfgMap *map)
{
    ApiLock lock;
    return lock ? zlvIntlStringToObjCfgMapIterator(map) : nullptr;
}

ZlvBool zlvIntlStringToObjCfgMapIterHasNext(StringToObjCfgMapIterator iterator)
{
    return iterator != nullptr;
}

ZlvBool ZlvStringToObjCfgMapIterHasNext(StringToObjCfgMapIterator iterator)
{
    ApiLock lock;
    return lock && zlvIntlStringToObjCfgMapIterHasNext(iterator);
}

StringToObjCfgMapIterator zlvIntlStringToObjCfgMapIterNext(StringToObjCfgMapIterator iterator)
{
    return zelvo::nextNode(iterator);
}

StringToObjCfgMapIterator ZlvStringToObjCfgMapIterNext(StringToObjCfgMapIterator iterator)
{
    ApiLock lock;
    return lock ? zlvIntlStringToObjCfgMapIterNext(iterator) : nullptr;
}

char *zlvIntlStringToObjCfgMapIterGetKey(StringToObjCfgMapIterator iterator)
{
    return Impl::iterGetKey(iterator);
}

char *ZlvStringToObjCfgMapIterGetKey(StringToObjCfgMapIterator iterator)
{
    ApiLock lock;
    return lock ? zlvIntlStringToObjCfgMapIterGetKey(iterator) : nullptr;
}

ZlvObjCfg *zlvIntlStringToObjCfgMapIterGetVal(StringToObjCfgMapIterator iterator)
{
    return Impl::iterGetVal(iterator);
}

ZlvObjCfg *ZlvStringToObjCfgMapIterGetVal(StringToObjCfgMapIterator iterator)
{
    ApiLock lock;
    return lock ? zlvIntlStringToObjCfgMapIterGetVal(iterator) : nullptr;
}

StringToObjCfgMap *zlvIntlCopyStringToObjCfgMap(const StringToObjCfgMap *map)
{
    return Impl::copy(map);
}

StringToObjCfgMap *ZlvCopyStringToObjCfgMap(const StringToObjCfgMap *map)
{
    ApiLock lock;
    return lock ? zlvIntlCopyStringToObjCfgMap(map) : nullptr;
}

ZlvBool zlvIntlStringToObjCfgMapPut(StringToObjCfgMap *map, const char *key, ZlvObjCfg *value)
{
    return Impl::put(map, key, value);
}

ZlvBool ZlvStringToObjCfgMapPut(StringToObjCfgMap *map, const char *key, ZlvObjCfg *value)
{
    ApiLock lock;
    return lock && zlvIntlStringToObjCfgMapPut(map, key, value);
}

ZlvObjCfg *zlvIntlStringToObjCfgMapGet(const StringToObjCfgMap *map, const char *key)
{
    return Impl::get(map, key);
}

ZlvObjCfg *ZlvStringToObjCfgMapGet(const StringToObjCfgMap *map, const char *key)
{
    ApiLock lock;
    return lock ? zlvIntlStringToObjCfgMapGet(map, key) : nullptr;
}

void zlvIntlStringToObjCfgMapRem(StringToObjCfgMap *map, const char *key)
{
    Impl::remove(map, key);
}

void ZlvStringToObjCfgMapRem(StringToObjCfgMap *map, const char *key)
{
    ApiLock lock;
    if (lock)
        zlvIntlStringToObjCfgMapRem(map, key);
}

ZlvBool zlvIntlStringToObjCfgMapHasKey(const StringToObjCfgMap *map, const char *key)
{
    return Impl::hasKey(map, key);
}

ZlvBool ZlvStringToObjCfgMapHasKey(const StringToObjCfgMap *map, const char *key)
{
    ApiLock lock;
    return lock && zlvIntlStringToObjCfgMapHasKey(map, key);
}

StringToObjCfgMapNode *zlvIntlStringToObjCfgMapGetNode(const StringToObjCfgMap *map,
                                                       const char *key)
{
    return Impl::getNode(map, key);
}

void zlvIntlStringToObjCfgMapRemNode(StringToObjCfgMap *map, StringToObjCfgMapNode *node)
{
    Impl::removeNode(map, node);
}
