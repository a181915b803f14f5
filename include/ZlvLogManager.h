/* SPDX-License-Identifier: Apache-2.0 */
/*
 * ZlvLogManager.h - the registry of configurations: by name, in a tree that follows the dots of
 * their names. A configuration's parent is the registered one whose name is its longest dotted
 * prefix; gaps are skipped. The root is called "/" and has no configuration.
 */
#ifndef ZLV_LOG_MANAGER_H
#define ZLV_LOG_MANAGER_H

#include "ZlvStringGroup.h"
#include "ZlvTypes.h"

CX_BEGIN_DECLS

/**
 * Registers a configuration under its name and links it into the tree.
 *
 * @param cfg  gets one more reference, which the registry holds; null or one whose name is
 *             registered is ignored
 * @lock takes the API mutex
 */
ZLV_API void ZlvLogMgrAddCfg(ZlvObjCfg *cfg);

/**
 * Takes a configuration out of the registry and gives its children to its parent.
 *
 * @param cfg  null or one whose name is not registered is ignored
 * @lock takes the API mutex
 */
ZLV_API void ZlvLogMgrRemCfg(ZlvObjCfg *cfg);

/**
 * Removes a configuration and adds it again, which links it anew.
 *
 * @param cfg  null or one whose name is not registered is ignored
 * @lock takes the API mutex
 */
ZLV_API void ZlvLogMgrUpdateCfg(ZlvObjCfg *cfg);

/**
 * Lists the names of the registered configurations, in the order of their registration.
 *
 * @return iterator for the ZlvStringGroupIter calls, nothing to free; null when there are none or
 *         the API mutex cannot be taken
 * @lock takes the API mutex
 */
ZLV_API StringGroupIterator ZlvLogMgrConfigNames(void);

/**
 * Gets the configuration of that name, or creates and registers an empty one. While the toolkit is
 * closed nothing is registered and each call makes a new one.
 *
 * @param name  null or "/" gives null
 * @return the configuration with a reference for the caller, who gives it back with
 *         ZlvReleaseObjCfg(); null when memory ran out or the API mutex cannot be taken
 * @lock takes the API mutex
 */
ZLV_API ZlvObjCfg *ZlvLogMgrGetCfg(const char *name);

/**
 * Tells whether a configuration of that name is registered. Creates nothing.
 *
 * @param name  null gives 0
 * @return 1 when registered; 0 when not or when the API mutex cannot be taken
 * @lock takes the API mutex
 */
ZLV_API ZlvBool ZlvLogMgrHasCfg(const char *name);

/**
 * Sets every property of the configuration of that name and of its ancestors on an object, farthest
 * ancestor first, so that the nearest value wins. The configuration is created, empty, where there
 * is none.
 *
 * @param object  null gives 0
 * @param name    null or "/" gives 0
 * @return 1 when applied; 0 also when memory ran out or the API mutex cannot be taken
 * @lock takes the API mutex
 */
ZLV_API ZlvBool ZlvLogMgrApplyCfg(ZlvObject *object, const char *name);

CX_END_DECLS

#endif
