/* SPDX-License-Identifier: Apache-2.0 */
/* ZlvIntlConfig.h - for authors of classes: configurations and the log manager; see ZlvIntl.h. */
#ifndef ZLV_INTL_CONFIG_H
#define ZLV_INTL_CONFIG_H

#include "CxPropList.h"
#include "ZlvLogManager.h"
#include "ZlvObjConfig.h"

CX_BEGIN_DECLS

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

CX_END_DECLS

#endif
