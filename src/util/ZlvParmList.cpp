// SPDX-License-Identifier: Apache-2.0
// Made by scripts/mkListTemplate; do not edit.
#include "ZlvParmList.h"

#include "ZlvListImpl.h"
#include "ZlvOwned.h"

using zelvo::ApiLock;

namespace {

/// How elements come in, are handed out and go.
struct Traits {
    using Header = ParmList;
    using Node = ParmListNode;
    using Element = ZlvParm *;
    using Given = const ZlvParm *;
    static constexpr bool deferred = false;

    static ZlvParm *takeIn(const ZlvParm *element) { return ZlvCopyParm(element); }
    static ZlvParm *handOut(ZlvParm *element) { return ZlvCopyParm(element); }
    static void letGo(ZlvParm *element) { ZlvFreeParm(element); }
    static bool same(const ZlvParm *a, const ZlvParm *b) { return ZlvCmpParms(a, b) == 1; }
};

using Impl = zelvo::ListImpl<Traits>;

} // namespace

ParmList *zlvIntlAllocParmList(void)
{
    return zelvo::allocRecord<ParmList>();
}

ParmList *ZlvAllocParmList(void)
{
    ApiLock lock;
    return lock ? zlvIntlAllocParmList() : nullptr;
}

void zlvIntlFreeParmList(ParmList *list)
{
    Impl::free(list);
}

void ZlvFreeParmList(ParmList *list)
{
    ApiLock lock;
    if (lock)
        zlvIntlFreeParmList(list);
}

ParmListIterator zlvIntlParmListIterator(const ParmList *list)
{
    return zelvo::firstNode(list);
}

ParmListIterator ZlvParmListIterator(const ParmList *list)
{
    ApiLock lock;
    return lock ? zlvIntlParmListIterator(list) : nullptr;
}

ZlvBool zlvIntlParmListIterHasNext(ParmListIterator iterator)
{
    return iterator != nullptr;
}

ZlvBool ZlvParmListIterHasNext(ParmListIterator iterator)
{
    ApiLock lock;
    return lock && zlvIntlParmListIterHasNext(iterator);
}

ParmListIterator zlvIntlParmListIterNext(ParmListIterator iterator)
{
    return zelvo::nextNode(iterator);
}

ParmListIterator ZlvParmListIterNext(ParmListIterator iterator)
{
    ApiLock lock;
    return lock ? zlvIntlParmListIterNext(iterator) : nullptr;
}

ZlvParm *zlvIntlParmListIterGet(ParmListIterator iterator)
{
    return Impl::iterGet(iterator);
}

ZlvParm *ZlvParmListIterGet(ParmListIterator iterator)
{
    ApiLock lock;
    return lock ? zlvIntlParmListIterGet(iterator) : nullptr;
}

ParmListIterator zlvIntlParmListIterRem(ParmListIterator iterator)
{
    return Impl::iterRemove(iterator);
}

ParmListIterator ZlvParmListIterRem(ParmListIterator iterator)
{
    ApiLock lock;
    return lock ? zlvIntlParmListIterRem(iterator) : nullptr;
}

ParmListNode *ZlvParmListGetLink(const ParmList *list, const ZlvParm *element)
{
    return Impl::getLink(list, element);
}

ParmList *zlvIntlCopyParmList(const ParmList *list)
{
    return Impl::copy(list);
}

ParmList *ZlvCopyParmList(const ParmList *list)
{
    ApiLock lock;
    return lock ? zlvIntlCopyParmList(list) : nullptr;
}

ZlvBool zlvIntlParmListAppend(ParmList *list, const ZlvParm *element)
{
    return Impl::append(list, element);
}

ZlvBool ZlvParmListAppend(ParmList *list, const ZlvParm *element)
{
    ApiLock lock;
    return lock && zlvIntlParmListAppend(list, element);
}

ZlvParm *ZlvParmListGetIndex(const ParmList *list, int32_t position)
{
    return Impl::getIndex(list, position);
}

void ZlvParmListRemLink(ParmList *list, ParmListNode *node)
{
    Impl::removeLink(list, node);
}

void ZlvSortParmList(ParmList *list, int (*compare)(const void *, const void *))
{
    ApiLock lock;
    if (lock)
        Impl::sort(list, compare);
}
