// SPDX-License-Identifier: Apache-2.0
// Made by scripts/mkGroupTemplate; do not edit.
#include "ZlvListenerGroup.h"

#include "ZlvGroupImpl.h"
#include "ZlvIntl.h"
#include "ZlvOwned.h"

using zelvo::ApiLock;

namespace {

/// How elements come in, are handed out and go.
struct Traits {
    using Header = ListenerGroup;
    using Node = ListenerGroupNode;
    using Element = ZlvObject *;
    using Given = ZlvObject *;
    static constexpr bool deferred = true;

    static ZlvObject *takeIn(ZlvObject *element) { return zlvIntlAcquireObject(element); }
    static ZlvObject *handOut(ZlvObject *element) { return zlvIntlAcquireObject(element); }
    static void letGo(ZlvObject *element) { zlvIntlReleaseObject(element); }
    static bool same(ZlvObject *a, ZlvObject *b) { return ZlvAreObjectsEqual(a, b) == 1; }
};

using Impl = zelvo::GroupImpl<Traits>;

} // namespace

ListenerGroup *zlvIntlAllocListenerGroup(void)
{
    return zelvo::allocRecord<ListenerGroup>();
}

ListenerGroup *ZlvAllocListenerGroup(void)
{
    ApiLock lock;
    return lock ? zlvIntlAllocListenerGroup() : nullptr;
}

void zlvIntlFreeListenerGroup(ListenerGroup *group)
{
    Impl::free(group);
}

void ZlvFreeListenerGroup(ListenerGroup *group)
{
    ApiLock lock;
    if (lock)
        zlvIntlFreeListenerGroup(group);
}

ListenerGroupIterator zlvIntlListenerGroupIterator(const ListenerGroup *group)
{
    return zelvo::firstNode(group);
}

ListenerGroupIterator ZlvListenerGroupIterator(const ListenerGroup *group)
{
    ApiLock lock;
    return lock ? zlvIntlListenerGroupIterator(group) : nullptr;
}

ZlvBool zlvIntlListenerGroupIterHasNext(ListenerGroupIterator iterator)
{
    return iterator != nullptr;
}

ZlvBool ZlvListenerGroupIterHasNext(ListenerGroupIterator iterator)
{
    ApiLock lock;
    return lock && zlvIntlListenerGroupIterHasNext(iterator);
}

ListenerGroupIterator zlvIntlListenerGroupIterNext(ListenerGroupIterator iterator)
{
    return zelvo::nextNode(iterator);
}

ListenerGroupIterator ZlvListenerGroupIterNext(ListenerGroupIterator iterator)
{
    ApiLock lock;
    return lock ? zlvIntlListenerGroupIterNext(iterator) : nullptr;
}

ZlvObject *zlvIntlListenerGroupIterGet(ListenerGroupIterator iterator)
{
    return Impl::iterGet(iterator);
}

ZlvObject *ZlvListenerGroupIterGet(ListenerGroupIterator iterator)
{
    ApiLock lock;
    return lock ? zlvIntlListenerGroupIterGet(iterator) : nullptr;
}

ListenerGroupIterator zlvIntlListenerGroupIterRem(ListenerGroupIterator iterator)
{
    return Impl::iterRemove(iterator);
}

ListenerGroupIterator ZlvListenerGroupIterRem(ListenerGroupIterator iterator)
{
    ApiLock lock;
    return lock ? zlvIntlListenerGroupIterRem(iterator) : nullptr;
}

ListenerGroupNode *ZlvListenerGroupGetLink(const ListenerGroup *group, ZlvObject *element)
{
    return Impl::getLink(group, element);
}

ZlvBool zlvIntlListenerGroupAdd(ListenerGroup *group, ZlvObject *element)
{
    return Impl::add(group, element);
}

ZlvBool ZlvListenerGroupAdd(ListenerGroup *group, ZlvObject *element)
{
    ApiLock lock;
    return lock && zlvIntlListenerGroupAdd(group, element);
}

ZlvBool zlvIntlListenerGroupRem(ListenerGroup *group, ZlvObject *element)
{
    return Impl::removeElement(group, element);
}

ZlvBool ZlvListenerGroupRem(ListenerGroup *group, ZlvObject *element)
{
    ApiLock lock;
    return lock && zlvIntlListenerGroupRem(group, element);
}
