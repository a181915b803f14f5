// SPDX-License-Identifier: Apache-2.0
// Properties of objects: stored as text, and each change told to the object's class.
#include "CxString.h"
#include "ZlvApiMutex.h"
#include "ZlvObjectIntl.h"
#include "ZlvProps.h"
#include "ZlvRelaxed.h"
#include "ZlvStrTok.h"
#include "util/CxOwned.h"

namespace {

/// Stores a value with the setter of its type and tells the class.
template <class Setter, class Value>
void setAndNotify(ZlvObject *object, const char *property, Setter set, Value value)
{
    if (object == nullptr || property == nullptr)
        return;
    set(zlvFetchObjPropMap(object), property, value);
    zlvNotifyObjCfgChange(object, property);
}

/// Reads a value with the getter of its type.
template <class Value>
Value get(ZlvObject *object, const char *property, ZlvBool *found,
          Value (*getter)(StringToStringMap *, const char *, ZlvBool *))
{
    return getter(object != nullptr ? object->properties : nullptr, property, found);
}

void applyLogging(ZlvObject *object)
{
    zelvo::OwnedStr value{zlvIntlGetObjProp(object, "logging", nullptr)};
    const auto is = [&value](const char *word) { return RkoStringICmp(value.get(), word) == 0; };
    if (is("on") || is("true"))
        zelvo::storeRelaxed(object->enabled, 1);
    else if (is("off") || is("false"))
        zelvo::storeRelaxed(object->enabled, 0);
}

void applyListenerNames(ZlvObject *object)
{
    ZlvBool found = 0;
    zelvo::OwnedStr names{zlvIntlGetObjProp(object, "listenerNames", &found)};
    zelvo::dropListeners(object);
    if (found == 0)
        return;
    ZlvStrTokIter it;
    ZlvStrTokIterator(&it, names.get(), " \t\r\n\f\v");
    for (; ZlvStrTokIterHasNext(it) != 0; ZlvStrTokIterNext(&it, it)) {
        zelvo::OwnedStr name{ZlvStrTokIterGet(it)};
        zelvo::ObjectRef listener{zlvIntlGetObject(name.get(), nullptr)};
        zlvIntlAddListener(object, listener.get());
    }
}

} // namespace

StringToStringMap *zlvFetchObjPropMap(ZlvObject *object)
{
    if (object == nullptr)
        return nullptr;
    if (object->properties == nullptr)
        object->properties = zlvIntlAllocStringToStringMap();
    return object->properties;
}

void zlvNotifyObjCfgChange(ZlvObject *object, const char *propertyName)
{
    if (object == nullptr || object->objClass == nullptr || object->objClass->fCfgChange == nullptr)
        return;
    zelvo::ObjectRef keep{zlvIntlAcquireObject(object)};
    object->objClass->fCfgChange(object, propertyName);
}

// The description properties ("description", "descriptionFile", "descriptionSet" and
// "descriptionKey") are accepted like any other name and change nothing: an object is described by
// its class.
void ZlvBasicObjectFCfgChange(ZlvObject *object, const char *propertyName)
{
    if (object == nullptr || object->objClass == nullptr || propertyName == nullptr)
        return;
    if (RkoStringCmp(propertyName, "logging") == 0)
        applyLogging(object);
    else if (RkoStringCmp(propertyName, "listenerNames") == 0)
        applyListenerNames(object);
}

char *zlvIntlGetObjProp(ZlvObject *object, const char *property, ZlvBool *found)
{
    return get(object, property, found, ZlvGetMapProp);
}

ZlvBool zlvIntlGetObjPropBool(ZlvObject *object, const char *property, ZlvBool *found)
{
    return get(object, property, found, ZlvGetMapPropBool);
}

int32_t zlvIntlGetObjPropInt(ZlvObject *object, const char *property, ZlvBool *found)
{
    return get(object, property, found, ZlvGetMapPropInt);
}

int64_t zlvIntlGetObjPropLong(ZlvObject *object, const char *property, ZlvBool *found)
{
    return get(object, property, found, ZlvGetMapPropLong);
}

float zlvIntlGetObjPropFloat(ZlvObject *object, const char *property, ZlvBool *found)
{
    return get(object, property, found, ZlvGetMapPropFloat);
}

double zlvIntlGetObjPropDouble(ZlvObject *object, const char *property, ZlvBool *found)
{
    return get(object, property, found, ZlvGetMapPropDouble);
}

void zlvIntlSetObjProp(ZlvObject *object, const char *property, const char *value)
{
    setAndNotify(object, property, ZlvSetMapProp, value);
}

void zlvIntlSetObjPropBool(ZlvObject *object, const char *property, ZlvBool value)
{
    setAndNotify(object, property, ZlvSetMapPropBool, value);
}

void zlvIntlSetObjPropInt(ZlvObject *object, const char *property, int32_t value)
{
    setAndNotify(object, property, ZlvSetMapPropInt, value);
}

void zlvIntlSetObjPropLong(ZlvObject *object, const char *property, int64_t value)
{
    setAndNotify(object, property, ZlvSetMapPropLong, value);
}

void zlvIntlSetObjPropFloat(ZlvObject *object, const char *property, float value)
{
    setAndNotify(object, property, ZlvSetMapPropFloat, value);
}

void zlvIntlSetObjPropDouble(ZlvObject *object, const char *property, double value)
{
    setAndNotify(object, property, ZlvSetMapPropDouble, value);
}

char *ZlvGetObjProp(ZlvObject *object, const char *property, ZlvBool *found)
{
    return zelvo::locked(zlvIntlGetObjProp, object, property, found);
}

ZlvBool ZlvGetObjPropBool(ZlvObject *object, const char *property, ZlvBool *found)
{
    return zelvo::locked(zlvIntlGetObjPropBool, object, property, found);
}

int32_t ZlvGetObjPropInt(ZlvObject *object, const char *property, ZlvBool *found)
{
    return zelvo::locked(zlvIntlGetObjPropInt, object, property, found);
}

int64_t ZlvGetObjPropLong(ZlvObject *object, const char *property, ZlvBool *found)
{
    return zelvo::locked(zlvIntlGetObjPropLong, object, property, found);
}

float ZlvGetObjPropFloat(ZlvObject *object, const char *property, ZlvBool *found)
{
    return zelvo::locked(zlvIntlGetObjPropFloat, object, property, found);
}

double ZlvGetObjPropDouble(ZlvObject *object, const char *property, ZlvBool *found)
{
    return zelvo::locked(zlvIntlGetObjPropDouble, object, property, found);
}

void ZlvSetObjProp(ZlvObject *object, const char *property, const char *value)
{
    zelvo::locked(zlvIntlSetObjProp, object, property, value);
}

void ZlvSetObjPropBool(ZlvObject *object, const char *property, ZlvBool value)
{
    zelvo::locked(zlvIntlSetObjPropBool, object, property, value);
}

void ZlvSetObjPropInt(ZlvObject *object, const char *property, int32_t value)
{
    zelvo::locked(zlvIntlSetObjPropInt, object, property, value);
}

void ZlvSetObjPropLong(ZlvObject *object, const char *property, int64_t value)
{
    zelvo::locked(zlvIntlSetObjPropLong, object, property, value);
}

void ZlvSetObjPropFloat(ZlvObject *object, const char *property, float value)
{
    zelvo::locked(zlvIntlSetObjPropFloat, object, property, value);
}

void ZlvSetObjPropDouble(ZlvObject *object, const char *property, double value)
{
    zelvo::locked(zlvIntlSetObjPropDouble, object, property, value);
}
