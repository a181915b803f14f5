// SPDX-License-Identifier: Apache-2.0
// The listeners of an object, and the dispatch of an event to them.
//
// Listeners are foreign code: while one of them is called, nodes of the group can be removed or
// appended, the whole group can be replaced and the object itself destroyed. Dispatch therefore
// walks the live list, whose removed nodes stay readable until the API mutex is released.
#include "ZlvApiMutex.h"
#include "ZlvObjectIntl.h"
#include "ZlvRelaxed.h"

namespace {

/// One dispatch under way, linked to the one that it was started from.
struct Dispatch {
    const ZlvObject *object;
    const ZlvEvent *event;
    const Dispatch *outer;
};

const Dispatch *innermost = nullptr; // guarded by the API mutex

/// Tells whether OBJECT is passing on EVENT right now. A handler easily becomes its own listener by
/// an inherited "listenerNames", and such a circle has to end.
bool isDispatching(const ZlvObject *object, const ZlvEvent *event)
{
    for (const Dispatch *dispatch = innermost; dispatch != nullptr; dispatch = dispatch->outer)
        if (dispatch->object == object && dispatch->event == event)
            return true;
    return false;
}

void handOver(ZlvObject *listener, ZlvEvent *event, va_list args)
{
    const ZlvObjClass *objClass = listener->objClass;
    if (objClass == nullptr)
        return;
    if (objClass->kind == ZLV_KIND_FILTER && objClass->filter.fProcess != nullptr)
        objClass->filter.fProcess(listener, event, args);
    else if (objClass->kind == ZLV_KIND_HANDLER && objClass->handler.fProcess != nullptr)
        objClass->handler.fProcess(listener, event, args);
}

bool isRemoved(const ListenerGroupNode *node)
{
    return node->element == nullptr;
}

/// Gives the node to go on with after NODE, where CALLED stood.
const ListenerGroupNode *nodeAfter(const ListenerGroup *group, const ListenerGroupNode *node,
                                   const ZlvObject *called)
{
    if (!isRemoved(node))
        return node->next;
    while (isRemoved(node) && node->next != nullptr)
        node = node->next;
    if (!isRemoved(node))
        return node;
    // Removed as the last one: what was appended since stands behind the last one still there. If
    // that is CALLED itself, which has added itself again, it has had this event.
    while (node != nullptr && isRemoved(node))
        node = node->prev;
    node = node != nullptr ? node->next : group->first;
    return node != nullptr && node->element == called ? node->next : node;
}

ListenerGroup **groupSlot(ZlvObject *object)
{
    if (object == nullptr || object->objClass == nullptr)
        return nullptr;
    switch (object->objClass->kind) {
    case ZLV_KIND_LOGGER:
        return &object->logger.listeners;
    case ZLV_KIND_FILTER:
        return &object->filter.listeners;
    case ZLV_KIND_HANDLER:
        return &object->handler.listeners;
    default:
        return nullptr;
    }
}

} // namespace

void ZlvBasicObjectFLog(ZlvObject *object, ZlvEvent *event, va_list args)
{
    if (object == nullptr || zelvo::loadRelaxed(object->enabled) == 0)
        return;
    const ListenerGroup *group = zlvFetchListenerGroup(object, 0);
    if (group == nullptr)
        return;
    const Dispatch dispatch{object, event, innermost};
    innermost = &dispatch;
    const ListenerGroupNode *node = group->first;
    while (node != nullptr) {
        zelvo::ObjectRef listener{zlvIntlAcquireObject(node->element)};
        if (!isDispatching(listener.get(), event))
            handOver(listener.get(), event, args);
        node = nodeAfter(group, node, listener.get());
    }
    innermost = dispatch.outer;
}

ListenerGroup *zlvFetchListenerGroup(ZlvObject *object, ZlvBool create)
{
    ListenerGroup **slot = groupSlot(object);
    if (slot == nullptr)
        return nullptr;
    if (*slot == nullptr && create != 0)
        *slot = zlvIntlAllocListenerGroup();
    return *slot;
}

void zelvo::dropListeners(ZlvObject *object)
{
    ListenerGroup **slot = groupSlot(object);
    if (slot == nullptr)
        return;
    ListenerGroup *group = *slot;
    *slot = nullptr;
    zlvIntlFreeListenerGroup(group);
}

void zlvIntlAddListener(ZlvObject *object, ZlvObject *listener)
{
    if (object != nullptr && listener != nullptr)
        zlvIntlListenerGroupAdd(zlvFetchListenerGroup(object, 1), listener);
}

void zlvIntlRemListener(ZlvObject *object, ZlvObject *listener)
{
    zlvIntlListenerGroupRem(zlvFetchListenerGroup(object, 0), listener);
}

ListenerGroupIterator zlvIntlGetListeners(ZlvObject *object)
{
    return zlvIntlListenerGroupIterator(zlvFetchListenerGroup(object, 0));
}

void ZlvAddListener(ZlvObject *object, ZlvObject *listener)
{
    zelvo::locked(zlvIntlAddListener, object, listener);
}

void ZlvRemListener(ZlvObject *object, ZlvObject *listener)
{
    zelvo::locked(zlvIntlRemListener, object, listener);
}

ListenerGroupIterator ZlvGetListeners(ZlvObject *object)
{
    return zelvo::locked(zlvIntlGetListeners, object);
}
