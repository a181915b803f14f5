// SPDX-License-Identifier: Apache-2.0
// Made by scripts/mkMapTemplate; do not edit.
#include "ZlvStringToStringMap.h"

#include "ZlvMapImpl.h"
#include "ZlvOwned.h"

using zelvo::ApiLock;

namespace {

/// How elements come in, are handed out and go.
struct Traits {
    using Header = StringToStringMap;
    using Node = StringToStringMapNode;
    using Element = char *;
    using Given = const char *;
    static constexpr bool deferred = false;

    static char *takeIn(const char *element) { return RkoStringDup(element); }
    static char *handOut(char *element) { return RkoStringDup(element); }
    static void letGo(char *element) { RkoMemoryFree(element); }
};

using Impl = zelvo::MapImpl<Traits>;

} // namespace

StringToStringMap *zlvIntlAllocStringToStringMap(void)
{
    return zelvo::allocRecord<StringToStringMap>();
}

StringToStringMap *ZlvAllocStringToStringMap(void)
{
    ApiLock lock;
    return lock ? zlvIntlAllocStringToStringMap() : nullptr;
}

void zlvIntlFreeStringToStringMap(StringToStringMap *map)
{
    Impl::free(map);
}

void ZlvFreeStringToStringMap(StringToStringMap *map)
{
    ApiLock lock;
    if (lock)
        zlvIntlFreeStringToStringMap(map);
}

StringToStringMapIterator zlvIntlStringToStringMapIterator(const StringToStringMap *map)
{
    return zelvo::firstNode(map);
}

StringToStringMapIterator ZlvStringToStringMapIterator(const StringToStringMap *map)
{
    ApiLock lock;
    return lock ? zlvIntlStringToStringMapIterator(map) : nullptr;
}

ZlvBool zlvIntlStringToStringMapIterHasNext(StringToStringMapIterator iterator)
{
    return iterator != nullptr;
}

ZlvBool ZlvStringToStringMapIterHasNext(StringToStringMapIterator iterator)
{
    ApiLock lock;
    return lock && zlvIntlStringToStringMapIterHasNext(iterator);
}

StringToStringMapIterator zlvIntlStringToStringMapIterNext(StringToStringMapIterator iterator)
{
    return zelvo::nextNode(iterator);
}

StringToStringMapIterator ZlvStringToStringMapIterNext(StringToStringMapIterator iterator)
{
    ApiLock lock;
    return lock ? zlvIntlStringToStringMapIterNext(iterator) : nullptr;
}

char *zlvIntlStringToStringMapIterGetKey(StringToStringMapIterator iterator)
{
    return Impl::iterGetKey(iterator);
}

char *ZlvStringToStringMapIterGetKey(StringToStringMapIterator iterator)
{
    ApiLock lock;
    return lock ? zlvIntlStringToStringMapIterGetKey(iterator) : nullptr;
}

char *zlvIntlStringToStringMapIterGetVal(StringToStringMapIterator iterator)
{
    return Impl::iterGetVal(iterator);
}

char *ZlvStringToStringMapIterGetVal(StringToStringMapIterator iterator)
{
    ApiLock lock;
    return lock ? zlvIntlStringToStringMapIterGetVal(iterator) : nullptr;
}

StringToStringMap *zlvIntlCopyStringToStringMap(const StringToStringMap *map)
{
    return Impl::copy(map);
}

StringToStringMap *ZlvCopyStringToStringMap(const StringToStringMap *map)
{
    ApiLock lock;
    return lock ? zlvIntlCopyStringToStringMap(map) : nullptr;
}

ZlvBool zlvIntlStringToStringMapPut(StringToStringMap *map, const char *key, const char *value)
{
    return Impl::put(map, key, value);
}

ZlvBool ZlvStringToStringMapPut(StringToStringMap *map, const char *key, const char *value)
{
    ApiLock lock;
    return lock && zlvIntlStringToStringMapPut(map, key, value);
}

char *zlvIntlStringToStringMapGet(const StringToStringMap *map, const char *key)
{
    return Impl::get(map, key);
}

char *ZlvStringToStringMapGet(const StringToStringMap *map, const char *key)
{
    ApiLock lock;
    return lock ? zlvIntlStringToStringMapGet(map, key) : nullptr;
}

void zlvIntlStringToStringMapRem(StringToStringMap *map, const char *key)
{
    Impl::remove(map, key);
}

void ZlvStringToStringMapRem(StringToStringMap *map, const char *key)
{
    ApiLock lock;
    if (lock)
        zlvIntlStringToStringMapRem(map, key);
}

ZlvBool zlvIntlStringToStringMapHasKey(const StringToStringMap *map, const char *key)
{
    return Impl::hasKey(map, key);
}

ZlvBool ZlvStringToStringMapHasKey(const StringToStringMap *map, const char *key)
{
    ApiLock lock;
    return lock && zlvIntlStringToStringMapHasKey(map, key);
}

StringToStringMapNode *zlvIntlStringToStringMapGetNode(const StringToStringMap *map,
                                                       const char *key)
{
    return Impl::getNode(map, key);
}

void zlvIntlStringToStringMapRemNode(StringToStringMap *map, StringToStringMapNode *node)
{
    Impl::removeNode(map, node);
}
