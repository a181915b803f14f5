/* SPDX-License-Identifier: Apache-2.0 */
/* ZlvIntlToolkit.h - for authors of classes: the API mutex, the registries and classes; see
 * ZlvIntl.h. */
#ifndef ZLV_INTL_TOOLKIT_H
#define ZLV_INTL_TOOLKIT_H

#include "ZlvObjClass.h"
#include "ZlvTypes.h"

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

CX_END_DECLS

#endif
