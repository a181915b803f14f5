// SPDX-License-Identifier: Apache-2.0
// Made by scripts/mkListTemplate; do not edit.
#include "ZlvStringList.h"

#include "ZlvListImpl.h"
#include "ZlvOwned.h"

using zelvo::ApiLock;

namespace {

/// How elements come in, are handed out and go.
struct Traits {
    using Header = StringList;
    using Node = StringListNode;
    using Element = char *;
    using Given = const char *;
    static constexpr bool deferred = false;

    static char *takeIn(const char *element) { return RkoStringDup(element); }
    static char *handOut(char *element) { return RkoStringDup(element); }
    static void letGo(char *element) { RkoMemoryFree(element); }
    static bool same(const char *a, const char *b) { return zelvo::sameText(a, b); }
};

using Impl = zelvo::ListImpl<Traits>;

} // namespace

StringList *zlvIntlAllocStringList(void)
{
    return zelvo::allocRecord<StringList>();
}

StringList *ZlvAllocStringList(void)
{
    ApiLock lock;
    return lock ? zlvIntlAllocStringList() : nullptr;
}

void zlvIntlFreeStringList(StringList *list)
{
    Impl::free(list);
}

void ZlvFreeStringList(StringList *list)
{
    ApiLock lock;
    if (lock)
        zlvIntlFreeStringList(list);
}

StringListIterator zlvIntlStringListIterator(const StringList *list)
{
    return zelvo::firstNode(list);
}

StringListIterator ZlvStringListIterator(const StringList *list)
{
    ApiLock lock;
    return lock ? zlvIntlStringListIterator(list) : nullptr;
}

ZlvBool zlvIntlStringListIterHasNext(StringListIterator iterator)
{
    return iterator != nullptr;
}

ZlvBool ZlvStringListIterHasNext(StringListIterator iterator)
{
    ApiLock lock;
    return lock && zlvIntlStringListIterHasNext(iterator);
}

StringListIterator zlvIntlStringListIterNext(StringListIterator iterator)
{
    return zelvo::nextNode(iterator);
}

StringListIterator ZlvStringListIterNext(StringListIterator iterator)
{
    ApiLock lock;
    return lock ? zlvIntlStringListIterNext(iterator) : nullptr;
}

char *zlvIntlStringListIterGet(StringListIterator iterator)
{
    return Impl::iterGet(iterator);
}

char *ZlvStringListIterGet(StringListIterator iterator)
{
    ApiLock lock;
    return lock ? zlvIntlStringListIterGet(iterator) : nullptr;
}

StringListIterator zlvIntlStringListIterRem(StringListIterator iterator)
{
    return Impl::iterRemove(iterator);
}

StringListIterator ZlvStringListIterRem(StringListIterator iterator)
{
    ApiLock lock;
    return lock ? zlvIntlStringListIterRem(iterator) : nullptr;
}

StringListNode *ZlvStringListGetLink(const StringList *list, const char *element)
{
    return Impl::getLink(list, element);
}

StringList *zlvIntlCopyStringList(const StringList *list)
{
    return Impl::copy(list);
}

StringList *ZlvCopyStringList(const StringList *list)
{
    ApiLock lock;
    return lock ? zlvIntlCopyStringList(list) : nullptr;
}

ZlvBool zlvIntlStringListAppend(StringList *list, const char *element)
{
    return Impl::append(list, element);
}

ZlvBool ZlvStringListAppend(StringList *list, const char *element)
{
    ApiLock lock;
    return lock && zlvIntlStringListAppend(list, element);
}

char *ZlvStringListGetIndex(const StringList *list, int32_t position)
{
    return Impl::getIndex(list, position);
}

void ZlvStringListRemLink(StringList *list, StringListNode *node)
{
    Impl::removeLink(list, node);
}

void ZlvSortStringList(StringList *list, int (*compare)(const void *, const void *))
{
    ApiLock lock;
    if (lock)
        Impl::sort(list, compare);
}
