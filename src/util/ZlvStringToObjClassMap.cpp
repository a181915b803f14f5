// SPDX-License-Identifier: Apache-2.0
// Made by scripts/mkMapTemplate; do not edit.
#include "ZlvStringToObjClassMap.h"

#include "ZlvIntl.h"
#include "ZlvMapImpl.h"
#include "ZlvOwned.h"

using zelvo::ApiLock;

namespace {

/// How elements come in, are handed out and go.
struct Traits {
    using Header = StringToObjClassMap;
    using Node = StringToObjClassMapNode;
    using Element = ZlvObjClass *;
    using Given = ZlvObjClass *;
    static constexpr bool deferred = false;

    static ZlvObjClass *takeIn(ZlvObjClass *element) { return zlvReturnObjClass(element); }
    static ZlvObjClass *handOut(ZlvObjClass *element) { return zlvReturnObjClass(element); }
    static void letGo(ZlvObjClass *element) { zlvIgnoreObjClass(element); }
};

using Impl = zelvo::MapImpl<Traits>;

} // namespace

StringToObjClassMap *zlvIntlAllocStringToObjClassMap(void)
{
    return zelvo::allocRecord<StringToObjClassMap>();
}

StringToObjClassMap *ZlvAllocStringToObjClassMap(void)
{
    ApiLock lock;
    return lock ? zlvIntlAllocStringToObjClassMap() : nullptr;
}

void zlvIntlFreeStringToObjClassMap(StringToObjClassMap *map)
{
    Impl::free(map);
}

void ZlvFreeStringToObjClassMap(StringToObjClassMap *map)
{
    ApiLock lock;
    if (lock)
        zlvIntlFreeStringToObjClassMap(map);
}

StringToObjClassMapIterator zlvIntlStringToObjClassMapIterator(const StringToObjClassMap *map)
{
    return zelvo::firstNode(map);
}

StringToObjClassMapIterator ZlvStringToObjClassMapIterator(const StringToObjClassMap *map)
{
    ApiLock lock;
    return lock ? zlvIntlStringToObjClassMapIterator(map) : nullptr;
}

ZlvBool zlvIntlStringToObjClassMapIterHasNext(StringToObjClassMapIterator iterator)
{
    return iterator != nullptr;
}

ZlvBool ZlvStringToObjClassMapIterHasNext(StringToObjClassMapIterator iterator)
{
    ApiLock lock;
    return lock && zlvIntlStringToObjClassMapIterHasNext(iterator);
}

StringToObjClassMapIterator zlvIntlStringToObjClassMapIterNext(StringToObjClassMapIterator iterator)
{
    return zelvo::nextNode(iterator);
}

StringToObjClassMapIterator ZlvStringToObjClassMapIterNext(StringToObjClassMapIterator iterator)
{
    ApiLock lock;
    return lock ? zlvIntlStringToObjClassMapIterNext(iterator) : nullptr;
}

char *zlvIntlStringToObjClassMapIterGetKey(StringToObjClassMapIterator iterator)
{
    return Impl::iterGetKey(iterator);
}

char *ZlvStringToObjClassMapIterGetKey(StringToObjClassMapIterator iterator)
{
    ApiLock lock;
    return lock ? zlvIntlStringToObjClassMapIterGetKey(iterator) : nullptr;
}

ZlvObjClass *zlvIntlStringToObjClassMapIterGetVal(StringToObjClassMapIterator iterator)
{
    return Impl::iterGetVal(iterator);
}

ZlvObjClass *ZlvStringToObjClassMapIterGetVal(StringToObjClassMapIterator iterator)
{
    ApiLock lock;
    return lock ? zlvIntlStringToObjClassMapIterGetVal(iterator) : nullptr;
}

StringToObjClassMap *zlvIntlCopyStringToObjClassMap(const StringToObjClassMap *map)
{
    return Impl::copy(map);
}

StringToObjClassMap *ZlvCopyStringToObjClassMap(const StringToObjClassMap *map)
{
    ApiLock lock;
    return lock ? zlvIntlCopyStringToObjClassMap(map) : nullptr;
}

ZlvBool zlvIntlStringToObjClassMapPut(StringToObjClassMap *map, const char *key, ZlvObjClass *value)
{
    return Impl::put(map, key, value);
}

ZlvBool ZlvStringToObjClassMapPut(StringToObjClassMap *map, const char *key, ZlvObjClass *value)
{
    ApiLock lock;
    return lock && zlvIntlStringToObjClassMapPut(map, key, value);
}

ZlvObjClass *zlvIntlStringToObjClassMapGet(const StringToObjClassMap *map, const char *key)
{
    return Impl::get(map, key);
}

ZlvObjClass *ZlvStringToObjClassMapGet(const StringToObjClassMap *map, const char *key)
{
    ApiLock lock;
    return lock ? zlvIntlStringToObjClassMapGet(map, key) : nullptr;
}

void zlvIntlStringToObjClassMapRem(StringToObjClassMap *map, const char *key)
{
    Impl::remove(map, key);
}

void ZlvStringToObjClassMapRem(StringToObjClassMap *map, const char *key)
{
    ApiLock lock;
    if (lock)
        zlvIntlStringToObjClassMapRem(map, key);
}

ZlvBool zlvIntlStringToObjClassMapHasKey(const StringToObjClassMap *map, const char *key)
{
    return Impl::hasKey(map, key);
}

ZlvBool ZlvStringToObjClassMapHasKey(const StringToObjClassMap *map, const char *key)
{
    ApiLock lock;
    return lock && zlvIntlStringToObjClassMapHasKey(map, key);
}

StringToObjClassMapNode *zlvIntlStringToObjClassMapGetNode(const StringToObjClassMap *map,
                                                           const char *key)
{
    return Impl::getNode(map, key);
}

void zlvIntlStringToObjClassMapRemNode(StringToObjClassMap *map, StringToObjClassMapNode *node)
{
    Impl::removeNode(map, node);
}
