// SPDX-License-Identifier: Apache-2.0
// The registry of objects by name, and how it ends.
#include "ZlvDeferredFree.h"
#include "ZlvObjectIntl.h"
#include "ZlvOwned.h"
#include "ZlvToolkitIntl.h"

StringToObjMap *ZLV_TK_INSTANCES = nullptr;

namespace {

// Counts changes of the registry, so that a walk knows when to begin again.
uint64_t generation = 0;

/// Frees an object's variables if its class can; tells whether foreign code has run.
bool freeVariables(ZlvObject *object)
{
    const ZlvObjClass *objClass = object->objClass;
    if (objClass == nullptr || object->vars == nullptr || objClass->fFreeVars == nullptr)
        return false;
    void *vars = object->vars;
    object->vars = nullptr;
    objClass->fFreeVars(vars);
    return true;
}

void detachFormatter(ZlvObject *object)
{
    if (object->objClass == nullptr || object->objClass->kind != ZLV_KIND_HANDLER)
        return;
    ZlvObject *formatter = object->handler.formatter;
    object->handler.formatter = nullptr;
    zlvIntlReleaseObject(formatter);
}

/// Takes the entry of OBJECT away again when its name could not be copied: no lookup would ever
/// find it, and it would outlive an object that its maker gives up. Not by a release, which would
/// destroy an object that nobody else holds yet.
void removeNameless(ZlvObject *object)
{
    StringToObjMapNode *newest = ZLV_TK_INSTANCES->last;
    if (newest == nullptr || newest->key != nullptr)
        return;
    zlvIntlAcquireObject(object);
    zlvIntlStringToObjMapRemNode(ZLV_TK_INSTANCES, newest);
    --object->refCount;
}

/// First pass: variables go and handlers lose their formatters. Either can run foreign code that
/// changes the registry, and then the walk begins again. It ends, since nothing is created while
/// the toolkit closes and variables are freed once.
void dismantleObjects()
{
    StringToObjMapNode *node = ZLV_TK_INSTANCES->first;
    while (node != nullptr) {
        const uint64_t before = generation;
        bool restart = false;
        {
            zelvo::ObjectRef object{zlvIntlAcquireObject(node->value)};
            restart = freeVariables(object.get());
            detachFormatter(object.get());
        }
        node = restart || generation != before ? ZLV_TK_INSTANCES->first : node->next;
    }
}

/// Second pass: the registry gives its references back. An object that the application holds more
/// than once survives that; it is destroyed all the same, because its class is about to go. Removed
/// nodes stay readable, so the chain from the first one still leads to every survivor.
void destroyObjects()
{
    StringToObjMapNode *const oldest = ZLV_TK_INSTANCES->first;
    while (ZLV_TK_INSTANCES->first != nullptr)
        zlvIntlStringToObjMapRemNode(ZLV_TK_INSTANCES, ZLV_TK_INSTANCES->first);
    for (StringToObjMapNode *node = oldest; node != nullptr; node = node->next)
        zelvo::destroyObject(node->value);
}

} // namespace

void zlvToolkitAddObjInstance(const char *name, ZlvObject *object)
{
    if (name == nullptr || object == nullptr || zelvo::isClosing())
        return;
    if (ZLV_TK_INSTANCES == nullptr)
        ZLV_TK_INSTANCES = zlvIntlAllocStringToObjMap();
    ++generation;
    if (zlvIntlStringToObjMapPut(ZLV_TK_INSTANCES, name, object) == 1)
        removeNameless(object);
}

ZlvObject *zlvToolkitGetObjInstance(const char *name)
{
    return zlvIntlStringToObjMapGet(ZLV_TK_INSTANCES, name);
}

void zlvToolkitRemObjInstance(const char *name)
{
    ++generation;
    zlvIntlStringToObjMapRem(ZLV_TK_INSTANCES, name);
}

void zelvo::leaveRegistry(const ZlvObject *object)
{
    StringToObjMapNode *node = zlvIntlStringToObjMapGetNode(ZLV_TK_INSTANCES, object->name);
    if (node == nullptr || node->value != object)
        return;
    ++generation;
    zlvIntlStringToObjMapRemNode(ZLV_TK_INSTANCES, node);
}

void zlvFreeInstancesMap(void)
{
    if (ZLV_TK_INSTANCES == nullptr)
        return;
    dismantleObjects();
    destroyObjects();
    zlvIntlFreeStringToObjMap(ZLV_TK_INSTANCES);
    ZLV_TK_INSTANCES = nullptr;
}
