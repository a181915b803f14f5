// SPDX-License-Identifier: Apache-2.0
// Objects: creation by name, references and destruction.
//
// References. The registry holds one and the creator another, so a live object has two or more; a
// release that leaves exactly one destroys it. Creation takes the caller's reference before any
// foreign code can release one, so that a live object never stands at the threshold by accident.
#include "ZlvObject.h"

#include <utility>

#include "CxMemory.h"
#include "CxString.h"
#include "ZlvApiMutex.h"
#include "ZlvDeferredFree.h"
#include "ZlvI18MsgIntl.h"
#include "ZlvObjectIntl.h"
#include "ZlvRelaxed.h"
#include "ZlvToolkitIntl.h"
#include "util/CxOwned.h"

namespace {

// A dying object's count, so large that what is acquired and released on its way out does not
// destroy it a second time.
constexpr uint32_t DYING = UINT32_C(1) << 30;

/// Frees what an object owns, in the order that its class can rely on, and then the object.
void dismantle(ZlvObject *object)
{
    const ZlvObjClass *objClass = object->objClass;
    zlvIntlFreeStringToStringMap(std::exchange(object->properties, nullptr));
    zelvo::dropListeners(object);
    RkoMemoryFree(std::exchange(object->name, nullptr));
    if (objClass->fFreeVars != nullptr)
        objClass->fFreeVars(std::exchange(object->vars, nullptr));
    if (objClass->kind == ZLV_KIND_HANDLER) {
        zlvIntlReleaseObject(std::exchange(object->handler.formatter, nullptr));
    } else if (objClass->kind == ZLV_KIND_FORMATTER) {
        RkoMemoryFree(object->formatter.separator);
        RkoMemoryFree(object->formatter.dateTimeFormat);
        RkoMemoryFree(object->formatter.locale);
    }
    object->objClass = nullptr;
    zelvo::defer(object);
}

/// Makes a record without variables, formatter or place in the registry.
ZlvObject *newRecord(const char *name, ZlvObjClass *objClass)
{
    auto *object = static_cast<ZlvObject *>(RkoMemoryCalloc(1, sizeof(ZlvObject)));
    if (object == nullptr)
        return nullptr;
    object->objClass = objClass;
    object->name = RkoStringDup(name);
    object->enabled = 1;
    if (objClass->kind == ZLV_KIND_LOGGER)
        object->logger.level = ZLV_LEVEL_DEBUG_MIN;
    if (object->name != nullptr)
        return object;
    RkoMemoryFree(object);
    return nullptr;
}

/// Gives EXISTING with its reference if its class fits, else releases it and gives null.
ZlvObject *ofClass(ZlvObject *existing, const char *className)
{
    const ZlvObjClass *objClass = existing->objClass;
    if (objClass != nullptr &&
        (className == nullptr || RkoStringCmp(objClass->name, className) == 0))
        return existing;
    zlvIntlReleaseObject(existing);
    return nullptr;
}

ZlvObjClass *configuredClass(const char *name)
{
    zelvo::CfgRef cfg{zlvIntlLogMgrGetCfg(name)};
    zelvo::OwnedStr className{zlvIntlGetInheritedObjCfgProp(cfg.get(), "className", nullptr)};
    return zlvToolkitGetClassDef(className.get());
}

/// Enters a complete object into the registry and configures it. Making it ran foreign code, which
/// may have taken the name meanwhile: then what stands there is the answer.
ZlvObject *enroll(ZlvObject *object, const char *className)
{
    zlvIntlAcquireObject(object);
    ZlvObject *existing = zlvToolkitGetObjInstance(object->name);
    if (existing == nullptr) {
        zlvToolkitAddObjInstance(object->name, object);
        existing = zlvToolkitGetObjInstance(object->name);
    }
    zelvo::ObjectRef registered{existing};
    if (existing == object) {
        zlvIntlLogMgrApplyCfg(object, object->name);
        return object;
    }
    dismantle(object);
    return existing != nullptr ? ofClass(registered.take(), className) : nullptr;
}

ZlvObject *create(const char *name, ZlvObjClass *objClass, const char *className)
{
    ZlvObject *object = newRecord(name, objClass);
    if (object == nullptr)
        return nullptr;
    if (objClass->kind == ZLV_KIND_HANDLER)
        object->handler.formatter =
            zlvIntlGetObject(ZLV_DEFAULT_FORMATTER_NAME, "zlv_basicformatter");
    if (objClass->fAllocVars != nullptr)
        object->vars = objClass->fAllocVars();
    return enroll(object, className);
}

} // namespace

ZlvObject *zlvIntlGetObject(const char *name, const char *className)
{
    if (name == nullptr)
        return nullptr;
    if (ZlvObject *existing = zlvToolkitGetObjInstance(name))
        return ofClass(existing, className);
    if (zelvo::isClosing())
        return nullptr;
    ZlvObjClass *objClass =
        className != nullptr ? zlvToolkitGetClassDef(className) : configuredClass(name);
    return objClass != nullptr ? create(name, objClass, className) : nullptr;
}

ZlvObject *zlvIntlAcquireObject(ZlvObject *object)
{
    if (object != nullptr)
        ++object->refCount;
    return object;
}

void zlvIntlReleaseObject(ZlvObject *object)
{
    if (object == nullptr || object->objClass == nullptr)
        return;
    if (--object->refCount == 1)
        zelvo::destroyObject(object);
}

void zelvo::destroyObject(ZlvObject *object)
{
    if (object->objClass == nullptr || object->refCount >= DYING / 2)
        return;
    object->refCount = DYING;
    leaveRegistry(object);
    if (object->objClass->kind == ZLV_KIND_HANDLER && object->objClass->handler.fClose != nullptr)
        object->objClass->handler.fClose(object);
    dismantle(object);
}

char *zlvIntlGetObjectName(ZlvObject *object)
{
    return object != nullptr ? RkoStringDup(object->name) : nullptr;
}

UChar *zlvIntlGetObjectDesc(ZlvObject *object)
{
    if (object == nullptr || object->objClass == nullptr)
        return nullptr;
    return zelvo::zlvBindMsgWithZeros(object->objClass->description);
}

ZlvBool ZlvAreObjectsEqual(const ZlvObject *a, const ZlvObject *b)
{
    return a == b;
}

ZlvBool zlvIntlIsObjectEnabled(ZlvObject *object)
{
    return object != nullptr && zelvo::loadRelaxed(object->enabled) != 0;
}

void zlvIntlSetObjectEnabled(ZlvObject *object, ZlvBool enabled)
{
    if (object != nullptr)
        zelvo::storeRelaxed(object->enabled, enabled != 0);
}

ZlvBool zlvIntlIsLoggableByFilter(ZlvObject *filter, ZlvEvent *event, va_list args)
{
    if (filter == nullptr || event == nullptr || filter->objClass == nullptr)
        return 0;
    const ZlvObjClass *objClass = filter->objClass;
    if (objClass->kind != ZLV_KIND_FILTER || objClass->filter.fIsLoggable == nullptr)
        return 0;
    return static_cast<ZlvBool>(objClass->filter.fIsLoggable(filter, event, args));
}

ZlvObject *ZlvGetObject(const char *name, const char *className)
{
    return zelvo::locked(zlvIntlGetObject, name, className);
}

ZlvObject *ZlvAcquireObject(ZlvObject *object)
{
    return zelvo::locked(zlvIntlAcquireObject, object);
}

void ZlvReleaseObject(ZlvObject *object)
{
    zelvo::locked(zlvIntlReleaseObject, object);
}

char *ZlvGetObjectName(ZlvObject *object)
{
    return zelvo::locked(zlvIntlGetObjectName, object);
}

UChar *ZlvGetObjectDesc(ZlvObject *object)
{
    return zelvo::locked(zlvIntlGetObjectDesc, object);
}

ZlvBool ZlvIsObjectEnabled(ZlvObject *object)
{
    return zelvo::locked(zlvIntlIsObjectEnabled, object);
}

void ZlvSetObjectEnabled(ZlvObject *object, ZlvBool enabled)
{
    zelvo::locked(zlvIntlSetObjectEnabled, object, enabled);
}

ZlvBool ZlvIsLoggableByFilter(ZlvObject *filter, ZlvEvent *event, va_list args)
{
    return zelvo::locked(zlvIntlIsLoggableByFilter, filter, event, args);
}
