/* SPDX-License-Identifier: Apache-2.0 */
/*
 * ZlvIntl.h - for authors of classes: what a class function may call. Class functions run with the
 * API mutex held, which is not recursive, so they call these and never a call that takes the mutex.
 * A twin does what the public call of its name does, without the mutex.
 */
#ifndef ZLV_INTL_H
#define ZLV_INTL_H

#include <stdio.h>

#include "CxPropList.h"
#include "ZlvEvent.h"
#include "ZlvHandler.h"
#include "ZlvI18Msg.h"
#include "ZlvListenerGroup.h"
#include "ZlvLogManager.h"
#include "ZlvLogger.h"
#include "ZlvObjClass.h"
#include "ZlvObjConfig.h"
#include "ZlvObject.h"
#include "ZlvParmList.h"
#include "ZlvStringGroup.h"
#include "ZlvStringList.h"
#include "ZlvStringToObjCfgMap.h"
#include "ZlvStringToObjClassMap.h"
#include "ZlvStringToObjMap.h"
#include "ZlvStringToStringMap.h"
#include "ZlvToolkit.h"

CX_BEGIN_DECLS

/* The API mutex and the registries. */

/**
 * Takes the API mutex, creating it first if there is none. Not recursive: a thread that holds it
 * must not take it again. A failure is handed to ZlvReportPlatformErr().
 *
 * @return 1 when it is held on return, else 0
 * @lock takes the API mutex
 */
ZLV_API ZlvBool zlvAPIMutexLock(void);

/**
 * Frees what destroyed records left behind and releases the API mutex. Does nothing when there is
 * no mutex; a failure is handed to ZlvReportPlatformErr().
 *
 * @lock the caller holds the API mutex
 */
ZLV_API void zlvAPIMutexUnlock(void);

/**
 * Creates the registry of classes and registers the built-in ones, unless it exists.
 *
 * @lock the caller holds the API mutex
 */
ZLV_API void zlvToolkitInitObjClasses(void);

/**
 * Puts a class into the registry, which is made first if need be, and its name into the list of its
 * kind. A class that stands there under that name, other than this one, is displaced and freed.
 *
 * @param name      null is ignored
 * @param objClass  owned by the registry from now on; null is ignored
 * @lock the caller holds the API mutex
 */
ZLV_API void zlvToolkitAddClassDef(const char *name, ZlvObjClass *objClass);

/**
 * Looks a class up.
 *
 * @param name  compared exactly; null gives null
 * @return the class, owned by the registry; null when there is none of that name
 * @lock the caller holds the API mutex
 */
ZLV_API ZlvObjClass *zlvToolkitGetClassDef(const char *name);

/**
 * Lists the names of the classes of a kind, in the order of their registration.
 *
 * @param kind  ZLV_KIND_LOGGER to ZLV_KIND_FORMATTER; any other gives null
 * @return iterator, nothing to free; null when there are none
 * @lock the caller holds the API mutex
 */
ZLV_API StringGroupIterator zlvToolkitFetchClassnames(uint32_t kind);

/**
 * Puts an object into the registry of objects. One that stands there under that name is released
 * and replaced.
 *
 * @param name    null is ignored
 * @param object  gets one more reference, the registry's; null is ignored
 * @lock the caller holds the API mutex
 */
ZLV_API void zlvToolkitAddObjInstance(const char *name, ZlvObject *object);

/**
 * Looks an object up.
 *
 * @param name  compared exactly; null gives null
 * @return the object with a reference for the caller, given back with zlvIntlReleaseObject(); null
 *         when there is none of that name
 * @lock the caller holds the API mutex
 */
ZLV_API ZlvObject *zlvToolkitGetObjInstance(const char *name);

/**
 * Takes an object out of the registry, which releases its reference.
 *
 * @param name  null or an unknown name is ignored
 * @lock the caller holds the API mutex
 */
ZLV_API void zlvToolkitRemObjInstance(const char *name);

/**
 * Gives the toolkit's own logger.
 *
 * @return the error logger, without a reference for the caller; null while the toolkit is closed
 * @lock the caller holds the API mutex
 */
ZLV_API ZlvObject *zlvToolkitLogger(void);

/**
 * Frees the registry of objects: first the variables of every object and the formatters of the
 * handlers, then the objects. Part of closing the toolkit.
 *
 * @lock the caller holds the API mutex
 */
ZLV_API void zlvFreeInstancesMap(void);

/* Classes. */

/**
 * Makes a class record with no entries of its kind yet.
 *
 * @param name         copied; null gives null, as does the name of a registered class
 * @param kind         ZLV_KIND_LOGGER to ZLV_KIND_FORMATTER
 * @param description  copied; null for none
 * @param allocVars    stored as given
 * @param freeVars     stored as given
 * @param cfgChange    stored as given
 * @return the record, freed with zlvFreeObjClass() unless it is registered; null when memory ran
 * out
 * @lock the caller holds the API mutex
 */
ZLV_API ZlvObjClass *zlvInitObjectClass(const char *name, uint32_t kind,
                                        const ZlvI18Msg *description, ZlvFAllocVars allocVars,
                                        ZlvFFreeVars freeVars, ZlvFCfgChange cfgChange);

/**
 * Frees a class record with its name and its description.
 *
 * @param objClass  null is ignored
 * @lock the caller holds the API mutex
 */
ZLV_API void zlvFreeObjClass(ZlvObjClass *objClass);

/**
 * How a map takes a class in and hands it out: as it is, since classes are not counted.
 *
 * @param objClass  null gives null
 * @return the same class, still owned by the registry
 * @lock none
 */
ZLV_API ZlvObjClass *zlvReturnObjClass(ZlvObjClass *objClass);

/**
 * How a map lets go of a class: not at all, since classes are not counted.
 *
 * @param objClass  left alone
 * @lock none
 */
ZLV_API void zlvIgnoreObjClass(ZlvObjClass *objClass);

/** @twin ZlvAddLoggerClass */
ZLV_API void zlvIntlAddLoggerClass(const char *name, const ZlvI18Msg *description,
                                   ZlvFAllocVars allocVars, ZlvFFreeVars freeVars,
                                   ZlvFCfgChange cfgChange, ZlvFLog log);
/** @twin ZlvAddFilterClass */
ZLV_API void zlvIntlAddFilterClass(const char *name, const ZlvI18Msg *description,
                                   ZlvFAllocVars allocVars, ZlvFFreeVars freeVars,
                                   ZlvFCfgChange cfgChange, ZlvFProcess process,
                                   ZlvFIsLoggable isLoggable, ZlvFLog log);
/** @twin ZlvAddHandlerClass */
ZLV_API void zlvIntlAddHandlerClass(const char *name, const ZlvI18Msg *description,
                                    ZlvFAllocVars allocVars, ZlvFFreeVars freeVars,
                                    ZlvFCfgChange cfgChange, ZlvFProcess process, ZlvFOpen open,
                                    ZlvFClose close);
/** @twin ZlvAddUFormatterClass */
ZLV_API void zlvIntlAddUFormatterClass(const char *name, const ZlvI18Msg *description,
                                       ZlvFAllocVars allocVars, ZlvFFreeVars freeVars,
                                       ZlvFCfgChange cfgChange, ZlvFFormat format,
                                       ZlvFGetHeader getHeader, ZlvFGetTrailer getTrailer,
                                       ZlvFBindMsg bindMsg);
/** @twin ZlvGetLoggerClasses */
ZLV_API StringGroupIterator zlvIntlGetLoggerClasses(void);
/** @twin ZlvGetFilterClasses */
ZLV_API StringGroupIterator zlvIntlGetFilterClasses(void);
/** @twin ZlvGetHandlerClasses */
ZLV_API StringGroupIterator zlvIntlGetHandlerClasses(void);
/** @twin ZlvGetFormatterClasses */
ZLV_API StringGroupIterator zlvIntlGetFormatterClasses(void);

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

/* Configurations. */

/** @twin ZlvAllocObjCfg */
ZLV_API ZlvObjCfg *zlvIntlAllocObjCfg(const char *name);
/** @twin ZlvAcquireObjCfg */
ZLV_API ZlvObjCfg *zlvIntlAcquireObjCfg(ZlvObjCfg *cfg);
/** @twin ZlvReleaseObjCfg */
ZLV_API void zlvIntlReleaseObjCfg(ZlvObjCfg *cfg);
/** @twin ZlvObjCfgGetName */
ZLV_API char *zlvIntlObjCfgGetName(ZlvObjCfg *cfg);
/** @twin ZlvObjCfgIsFromFile */
ZLV_API ZlvBool zlvIntlObjCfgIsFromFile(ZlvObjCfg *cfg);
/** @twin ZlvObjCfgSetFromFile */
ZLV_API void zlvIntlObjCfgSetFromFile(ZlvObjCfg *cfg, ZlvBool fromFile);
/** @twin ZlvObjCfgGetParent */
ZLV_API ZlvObjCfg *zlvIntlObjCfgGetParent(ZlvObjCfg *cfg);
/** @twin ZlvObjCfgSetParent */
ZLV_API void zlvIntlObjCfgSetParent(ZlvObjCfg *cfg, ZlvObjCfg *parent);
/** @twin ZlvObjCfgAddChild */
ZLV_API void zlvIntlObjCfgAddChild(ZlvObjCfg *parent, ZlvObjCfg *child);
/** @twin ZlvObjCfgRemChild */
ZLV_API void zlvIntlObjCfgRemChild(ZlvObjCfg *parent, ZlvObjCfg *child);
/** @twin ZlvObjCfgChildrenNames */
ZLV_API StringGroupIterator zlvIntlObjCfgChildrenNames(ZlvObjCfg *cfg);
/** @twin ZlvGetInheritedObjCfgProp */
ZLV_API char *zlvIntlGetInheritedObjCfgProp(ZlvObjCfg *cfg, const char *property, ZlvBool *found);
/** @twin ZlvGetObjCfgProp */
ZLV_API char *zlvIntlGetObjCfgProp(ZlvObjCfg *cfg, const char *property, ZlvBool *found);
/** @twin ZlvGetObjCfgPropBool */
ZLV_API ZlvBool zlvIntlGetObjCfgPropBool(ZlvObjCfg *cfg, const char *property, ZlvBool *found);
/** @twin ZlvGetObjCfgPropInt */
ZLV_API int32_t zlvIntlGetObjCfgPropInt(ZlvObjCfg *cfg, const char *property, ZlvBool *found);
/** @twin ZlvGetObjCfgPropLong */
ZLV_API int64_t zlvIntlGetObjCfgPropLong(ZlvObjCfg *cfg, const char *property, ZlvBool *found);
/** @twin ZlvGetObjCfgPropFloat */
ZLV_API float zlvIntlGetObjCfgPropFloat(ZlvObjCfg *cfg, const char *property, ZlvBool *found);
/** @twin ZlvGetObjCfgPropDouble */
ZLV_API double zlvIntlGetObjCfgPropDouble(ZlvObjCfg *cfg, const char *property, ZlvBool *found);
/** @twin ZlvSetObjCfgProp */
ZLV_API void zlvIntlSetObjCfgProp(ZlvObjCfg *cfg, const char *property, const char *value);
/** @twin ZlvSetObjCfgPropBool */
ZLV_API void zlvIntlSetObjCfgPropBool(ZlvObjCfg *cfg, const char *property, ZlvBool value);
/** @twin ZlvSetObjCfgPropInt */
ZLV_API void zlvIntlSetObjCfgPropInt(ZlvObjCfg *cfg, const char *property, int32_t value);
/** @twin ZlvSetObjCfgPropLong */
ZLV_API void zlvIntlSetObjCfgPropLong(ZlvObjCfg *cfg, const char *property, int64_t value);
/** @twin ZlvSetObjCfgPropFloat */
ZLV_API void zlvIntlSetObjCfgPropFloat(ZlvObjCfg *cfg, const char *property, float value);
/** @twin ZlvSetObjCfgPropDouble */
ZLV_API void zlvIntlSetObjCfgPropDouble(ZlvObjCfg *cfg, const char *property, double value);
/** @twin ZlvObjCfgProperties */
ZLV_API StringToStringMapIterator zlvIntlObjCfgProperties(ZlvObjCfg *cfg);

/* The log manager. */

/** @twin ZlvLogMgrAddCfg */
ZLV_API void zlvIntlLogMgrAddCfg(ZlvObjCfg *cfg);
/** @twin ZlvLogMgrRemCfg */
ZLV_API void zlvIntlLogMgrRemCfg(ZlvObjCfg *cfg);
/** @twin ZlvLogMgrUpdateCfg */
ZLV_API void zlvIntlLogMgrUpdateCfg(ZlvObjCfg *cfg);
/** @twin ZlvLogMgrConfigNames */
ZLV_API StringGroupIterator zlvIntlLogMgrConfigNames(void);
/** @twin ZlvLogMgrGetCfg */
ZLV_API ZlvObjCfg *zlvIntlLogMgrGetCfg(const char *name);
/** @twin ZlvLogMgrHasCfg */
ZLV_API ZlvBool zlvIntlLogMgrHasCfg(const char *name);
/** @twin ZlvLogMgrApplyCfg */
ZLV_API ZlvBool zlvIntlLogMgrApplyCfg(ZlvObject *object, const char *name);

/**
 * Makes the log manager's containers, unless it is initialised. When memory runs out there are none
 * and it stays uninitialised.
 *
 * @lock the caller holds the API mutex
 */
ZLV_API void zlvInitLogMgr(void);

/**
 * Frees the log manager's containers and so releases every configuration.
 *
 * @lock the caller holds the API mutex
 */
ZLV_API void zlvCloseLogMgr(void);

/**
 * Finds the name of a configuration's parent: the stored one, else the longest dotted prefix of its
 * name that is registered, which is stored from then on.
 *
 * @param cfg  null gives null
 * @return new string, freed by the caller with RkoMemoryFree(); "/" when there is no parent; null
 *         when memory ran out
 * @lock the caller holds the API mutex
 */
ZLV_API char *zlvLogMgrGetParentConfigName(ZlvObjCfg *cfg);

/**
 * Sets a property that was read from a file. A configuration made for it is marked as from file.
 *
 * @param configName  null or empty gives 0
 * @param key         property name; null or empty gives 0
 * @param value       null gives 0
 * @return 1 when set, else 0
 * @lock the caller holds the API mutex
 */
ZLV_API ZlvBool zlvLogMgrAddCfgFromFile(const char *configName, const char *key, const char *value);

/**
 * Reads a properties file, into a list or into configurations. A key is split at its last dot into
 * the configuration's name and the property's.
 *
 * @param path    file name
 * @param target  receives the entries; null sends them to the log manager
 * @param error   receives the status of a failing open, read or close and is left alone otherwise,
 *                by a malformed line too; may be null
 * @return 1 when the whole file was read and every entry taken, else 0
 * @lock the caller holds the API mutex when target is null, else none
 */
ZLV_API ZlvBool zlvDoReadProps(const char *path, CxPropList *target, CxStatus *error);

/* Messages and events. */

/** @twin ZlvAllocUI18Msg */
ZLV_API ZlvI18Msg *zlvIntlAllocUI18Msg(const char *bundle, const char *key, const UChar *text);
/** @twin ZlvCopyI18Msg */
ZLV_API ZlvI18Msg *zlvIntlCopyI18Msg(const ZlvI18Msg *message);
/** @twin ZlvFreeI18Msg */
ZLV_API void zlvIntlFreeI18Msg(ZlvI18Msg *message);
/** @twin ZlvBindUI18Msg */
ZLV_API UChar *zlvIntlBindUI18Msg(ZlvI18Msg *message, va_list args);

/**
 * Gives a message's parameter list, which is made empty on the first call. Binding does not use it.
 *
 * @param message  null gives null
 * @return the list, owned by the message; null when memory ran out
 * @lock none
 */
ZLV_API ParmList *zlvGetI18MsgParmList(ZlvI18Msg *message);

/**
 * Sets the locale that a message is bound in.
 *
 * @param message  null is ignored
 * @param locale   locale name, kept as an interned name; null for the default locale
 * @return the locale argument
 * @lock none
 */
ZLV_API const char *zlvSetI18MsgLocale(ZlvI18Msg *message, const char *locale);

/**
 * Prints text and a line feed in the default code page of the process, and flushes.
 *
 * @param stream  C stream, left open; null prints nothing
 * @param text    null prints nothing
 * @return 0
 * @lock none
 */
ZLV_API int32_t zlvI18PrintUCharAsLocal(FILE *stream, const UChar *text);

/**
 * Copies the name of the locale that an event's message is bound in.
 *
 * @param event  null gives null
 * @return new string, freed by the caller with RkoMemoryFree(); null when none is set
 * @lock none
 */
ZLV_API char *zlvGetEventLocale(const ZlvEvent *event);

/**
 * Sets the locale that an event's message is bound in.
 *
 * @param event   null is ignored
 * @param locale  locale name, kept as an interned name; null leaves the message's own
 * @lock none
 */
ZLV_API void zlvSetEventLocale(ZlvEvent *event, const char *locale);

/**
 * Gives an event's property map, which is made on the first call.
 *
 * @param event  null gives null
 * @return the map, owned by the event; null when memory ran out
 * @lock none
 */
ZLV_API StringToStringMap *zlvFetchEventPropMap(ZlvEvent *event);

/* Logging. */

/** @twin ZlvLoggerGetFLog */
ZLV_API ZlvFLog zlvIntlLoggerGetFLog(ZlvObject *logger);

/**
 * Refuses, whatever is asked: a fixed answer for callers that link it.
 *
 * @return 0
 * @lock none
 */
ZLV_API int32_t zlvIntlIsLoggable(void);

/**
 * Logs a message: builds its event, hands it to the logger's log function and frees it.
 *
 * @param logger  null, a disabled logger or another kind does nothing
 * @param level   given to the event; not tested
 * @param bundle  resource bundle
 * @param key     key in the bundle
 * @param args    arguments of the message
 * @return what the handlers and the bind reported; the no-error status when nothing was logged
 * @lock the caller holds the API mutex
 */
ZLV_API ZlvStatus zlvLogUMessageEntry(ZlvObject *logger, ZlvLevel level, const char *bundle,
                                      const char *key, va_list args);

/**
 * Logs a text with its place in the source: builds its event, hands it to the logger's log function
 * and frees it.
 *
 * @param logger       null, a disabled logger or another kind does nothing
 * @param level        given to the event; not tested
 * @param srcFile      recorded with the line; null records neither
 * @param srcFunction  recorded; null is not
 * @param srcLine      line number
 * @param text         message pattern
 * @param args         arguments of the pattern
 * @return what the handlers and the bind reported; the no-error status when nothing was logged
 * @lock the caller holds the API mutex
 */
ZLV_API ZlvStatus zlvLogUDebugEntry(ZlvObject *logger, ZlvLevel level, const char *srcFile,
                                    const char *srcFunction, int32_t srcLine, const UChar *text,
                                    va_list args);

/**
 * Logs a message to the toolkit's own error logger, which there is while the toolkit is open.
 *
 * @param level   given to the event; not tested
 * @param bundle  resource bundle
 * @param key     key in the bundle
 * @return as zlvLogUMessageEntry()
 * @lock the caller holds the API mutex
 */
ZLV_API ZlvStatus zlvIntlLogVA(ZlvLevel level, const char *bundle, const char *key, ...);

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
