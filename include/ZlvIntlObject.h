/* SPDX-License-Identifier: Apache-2.0 */
/* ZlvIntlObject.h - for authors of classes: objects and handlers; see ZlvIntl.h. */
#ifndef ZLV_INTL_OBJECT_H
#define ZLV_INTL_OBJECT_H

#include "ZlvHandler.h"
#include "ZlvObject.h"

CX_BEGIN_DECLS

/* Objects. */

/** @twin ZlvGetObject */
ZLV_API ZlvObject *zlvIntlGetObject(const char *name, const char *className);
/** @twin ZlvAcquireObject */
ZLV_API ZlvObject *zlvIntlAcquireObject(ZlvObject *object);
/** @twin ZlvReleaseObject */
ZLV_API void zlvIntlReleaseObject(ZlvObject *object);
/** @twin ZlvGetObjectName */
ZLV_API char *zlvIntlGetObjectName(ZlvObject *object);
/** @twin ZlvGetObjectDesc */
ZLV_API UChar *zlvIntlGetObjectDesc(ZlvObject *object);
/** @twin ZlvIsObjectEnabled */
ZLV_API ZlvBool zlvIntlIsObjectEnabled(ZlvObject *object);
/** @twin ZlvSetObjectEnabled */
ZLV_API void zlvIntlSetObjectEnabled(ZlvObject *object, ZlvBool enabled);
/** @twin ZlvIsLoggableByFilter */
ZLV_API ZlvBool zlvIntlIsLoggableByFilter(ZlvObject *filter, ZlvEvent *event, va_list args);
/** @twin ZlvGetObjProp */
ZLV_API char *zlvIntlGetObjProp(ZlvObject *object, const char *property, ZlvBool *found);
/** @twin ZlvGetObjPropBool */
ZLV_API ZlvBool zlvIntlGetObjPropBool(ZlvObject *object, const char *property, ZlvBool *found);
/** @twin ZlvGetObjPropInt */
ZLV_API int32_t zlvIntlGetObjPropInt(ZlvObject *object, const char *property, ZlvBool *found);
/** @twin ZlvGetObjPropLong */
ZLV_API int64_t zlvIntlGetObjPropLong(ZlvObject *object, const char *property, ZlvBool *found);
/** @twin ZlvGetObjPropFloat */
ZLV_API float zlvIntlGetObjPropFloat(ZlvObject *object, const char *property, ZlvBool *found);
/** @twin ZlvGetObjPropDouble */
ZLV_API double zlvIntlGetObjPropDouble(ZlvObject *object, const char *property, ZlvBool *found);
/** @twin ZlvSetObjProp */
ZLV_API void zlvIntlSetObjProp(ZlvObject *object, const char *property, const char *value);
/** @twin ZlvSetObjPropBool */
ZLV_API void zlvIntlSetObjPropBool(ZlvObject *object, const char *property, ZlvBool value);
/** @twin ZlvSetObjPropInt */
ZLV_API void zlvIntlSetObjPropInt(ZlvObject *object, const char *property, int32_t value);
/** @twin ZlvSetObjPropLong */
ZLV_API void zlvIntlSetObjPropLong(ZlvObject *object, const char *property, int64_t value);
/** @twin ZlvSetObjPropFloat */
ZLV_API void zlvIntlSetObjPropFloat(ZlvObject *object, const char *property, float value);
/** @twin ZlvSetObjPropDouble */
ZLV_API void zlvIntlSetObjPropDouble(ZlvObject *object, const char *property, double value);
/** @twin ZlvAddListener */
ZLV_API void zlvIntlAddListener(ZlvObject *object, ZlvObject *listener);
/** @twin ZlvRemListener */
ZLV_API void zlvIntlRemListener(ZlvObject *object, ZlvObject *listener);
/** @twin ZlvGetListeners */
ZLV_API ListenerGroupIterator zlvIntlGetListeners(ZlvObject *object);

/**
 * Gives an object's group of listeners.
 *
 * @param object  null or a formatter gives null
 * @param create  makes a missing group when it is not 0
 * @return the group, owned by the object; null when there is none
 * @lock the caller holds the API mutex
 */
ZLV_API ListenerGroup *zlvFetchListenerGroup(ZlvObject *object, ZlvBool create);

/**
 * Gives an object's property map, which is made on the first call.
 *
 * @param object  null gives null
 * @return the map, owned by the object; null when memory ran out
 * @lock the caller holds the API mutex
 */
ZLV_API StringToStringMap *zlvFetchObjPropMap(ZlvObject *object);

/**
 * Tells an object's class that a property of the object was set.
 *
 * @param object        null is ignored
 * @param propertyName  handed on as it is
 * @lock the caller holds the API mutex
 */
ZLV_API void zlvNotifyObjCfgChange(ZlvObject *object, const char *propertyName);

/* Handlers. */

/** @twin ZlvHandlerGetFormatter */
ZLV_API ZlvObject *zlvIntlHandlerGetFormatter(ZlvObject *handler);
/** @twin ZlvHandlerSetFormatter */
ZLV_API void zlvIntlHandlerSetFormatter(ZlvObject *handler, ZlvObject *formatter);
/** @twin ZlvHandlerGetFmtHeader */
ZLV_API char *zlvIntlHandlerGetFmtHeader(ZlvObject *handler);
/** @twin ZlvHandlerGetFmtTrailer */
ZLV_API char *zlvIntlHandlerGetFmtTrailer(ZlvObject *handler);
/** @twin ZlvUHandlerDoFmt */
ZLV_API UChar *zlvIntlUHandlerDoFmt(ZlvObject *handler, ZlvEvent *event, va_list args);

CX_END_DECLS

#endif
