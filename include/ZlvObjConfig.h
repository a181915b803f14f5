/* SPDX-License-Identifier: Apache-2.0 */
/*
 * ZlvObjConfig.h - configurations: named bags of properties in a tree, from which objects of the
 * same names are configured.
 *
 * References. A new configuration and every configuration handed out carry a reference for the
 * caller, given back with ZlvReleaseObjCfg(). Setting a property of a configuration does not touch
 * objects that exist; see ZlvLogMgrApplyCfg().
 */
#ifndef ZLV_OBJ_CONFIG_H
#define ZLV_OBJ_CONFIG_H

#include "ZlvStringGroup.h"
#include "ZlvStringToStringMap.h"
#include "ZlvTypes.h"

CX_BEGIN_DECLS

/**
 * A configuration. Class authors read it under the API mutex. Parent and children are kept by name
 * and found through the log manager.
 */
struct ZlvObjCfg {
    uint32_t refCount;
    char *name;
    char *parentName;              /**< null when none is stored */
    StringGroup *children;         /**< null until the first child is added */
    StringToStringMap *properties; /**< null until the first property is set */
    ZlvBool fromFile;              /**< 1 when the properties file made it */
};

/**
 * Makes an empty configuration, which is not registered anywhere.
 *
 * @param name  copied; null gives null
 * @return the configuration with one reference, the caller's; null when memory ran out or the API
 *         mutex cannot be taken
 * @lock takes the API mutex
 */
ZLV_API ZlvObjCfg *ZlvAllocObjCfg(const char *name);

/**
 * Adds a reference to a configuration.
 *
 * @param cfg  null gives null
 * @return the same configuration, to be released once more; null when the API mutex cannot be taken
 * @lock takes the API mutex
 */
ZLV_API ZlvObjCfg *ZlvAcquireObjCfg(ZlvObjCfg *cfg);

/**
 * Gives a reference back and frees the configuration with the last one.
 *
 * @param cfg  null is ignored
 * @lock takes the API mutex
 */
ZLV_API void ZlvReleaseObjCfg(ZlvObjCfg *cfg);

/**
 * Copies a configuration's name.
 *
 * @param cfg  null gives null
 * @return new string, freed by the caller with RkoMemoryFree(); null when memory ran out or the API
 *         mutex cannot be taken
 * @lock takes the API mutex
 */
ZLV_API char *ZlvObjCfgGetName(ZlvObjCfg *cfg);

/**
 * Tells whether the properties file made a configuration.
 *
 * @param cfg  null gives 0
 * @return the flag; 0 when the API mutex cannot be taken
 * @lock takes the API mutex
 */
ZLV_API ZlvBool ZlvObjCfgIsFromFile(ZlvObjCfg *cfg);

/**
 * Sets the flag that ZlvObjCfgIsFromFile() reads.
 *
 * @param cfg       null is ignored
 * @param fromFile  stored as given
 * @lock takes the API mutex
 */
ZLV_API void ZlvObjCfgSetFromFile(ZlvObjCfg *cfg, ZlvBool fromFile);

/**
 * Gets a configuration's parent from the log manager, by the stored name; a parent that is not
 * registered is created, empty.
 *
 * @param cfg  null gives null
 * @return the parent with a reference for the caller; null when no name is stored, it is "/" or the
 *         API mutex cannot be taken
 * @lock takes the API mutex
 */
ZLV_API ZlvObjCfg *ZlvObjCfgGetParent(ZlvObjCfg *cfg);

/**
 * Stores the name of a configuration's parent.
 *
 * @param cfg     null is ignored
 * @param parent  null changes nothing
 * @lock takes the API mutex
 */
ZLV_API void ZlvObjCfgSetParent(ZlvObjCfg *cfg, ZlvObjCfg *parent);

/**
 * Adds a configuration to the children of another, and makes that its parent.
 *
 * @param parent  null is ignored
 * @param child   null is ignored
 * @lock takes the API mutex
 */
ZLV_API void ZlvObjCfgAddChild(ZlvObjCfg *parent, ZlvObjCfg *child);

/**
 * Takes a configuration out of the children of another. The child keeps its stored parent name, so
 * that its inherited lookups still reach the old parent.
 *
 * @param parent  null is ignored
 * @param child   null is ignored
 * @lock takes the API mutex
 */
ZLV_API void ZlvObjCfgRemChild(ZlvObjCfg *parent, ZlvObjCfg *child);

/**
 * Lists the names of a configuration's children, first added first.
 *
 * @param cfg  null gives null
 * @return iterator for the ZlvStringGroupIter calls, nothing to free; null when there are no
 *         children or the API mutex cannot be taken
 * @lock takes the API mutex
 */
ZLV_API StringGroupIterator ZlvObjCfgChildrenNames(ZlvObjCfg *cfg);

/**
 * Reads a property of a configuration or, where it has none, of the nearest ancestor that has. An
 * ancestor that is named but not registered is created, empty. A circle of parents ends at the
 * first configuration met again.
 *
 * @param cfg       null gives null
 * @param property  property name, compared exactly; null gives null
 * @param found     receives 1 when there is a value, else 0; may be null
 * @return new string, freed by the caller with RkoMemoryFree(); null when there is no value
 * @lock takes the API mutex
 */
ZLV_API char *ZlvGetInheritedObjCfgProp(ZlvObjCfg *cfg, const char *property, ZlvBool *found);

/**
 * Another name of ZlvGetInheritedObjCfgProp().
 *
 * @param cfg       null gives null
 * @param property  property name, compared exactly; null gives null
 * @param found     receives 1 when there is a value, else 0; may be null
 * @return new string, freed by the caller with RkoMemoryFree(); null when there is no value
 * @lock takes the API mutex
 */
ZLV_API char *ZlvGetObjCfgProp(ZlvObjCfg *cfg, const char *property, ZlvBool *found);

/**
 * Reads an inherited property as a truth value: "true" or "false", ignoring case.
 *
 * @param cfg       null gives 0
 * @param property  property name, compared exactly; null gives 0
 * @param found     receives 1 when there is a value and it converts, else 0; may be null
 * @return the value; 0 when not found
 * @lock takes the API mutex
 */
ZLV_API ZlvBool ZlvGetObjCfgPropBool(ZlvObjCfg *cfg, const char *property, ZlvBool *found);

/**
 * Reads an inherited property as a 32-bit number, as sscanf's "%d" does.
 *
 * @param cfg       null gives 0
 * @param property  property name, compared exactly; null gives 0
 * @param found     receives 1 when there is a value and it converts, else 0; may be null
 * @return the value; 0 when not found
 * @lock takes the API mutex
 */
ZLV_API int32_t ZlvGetObjCfgPropInt(ZlvObjCfg *cfg, const char *property, ZlvBool *found);

/**
 * Reads an inherited property as a 64-bit number, as sscanf's "%lld" does.
 *
 * @param cfg       null gives 0
 * @param property  property name, compared exactly; null gives 0
 * @param found     receives 1 when there is a value and it converts, else 0; may be null
 * @return the value; 0 when not found
 * @lock takes the API mutex
 */
ZLV_API int64_t ZlvGetObjCfgPropLong(ZlvObjCfg *cfg, const char *property, ZlvBool *found);

/**
 * Reads an inherited property as a float, as sscanf's "%f" does.
 *
 * @param cfg       null gives 0
 * @param property  property name, compared exactly; null gives 0
 * @param found     receives 1 when there is a value and it converts, else 0; may be null
 * @return the value; 0 when not found
 * @lock takes the API mutex
 */
ZLV_API float ZlvGetObjCfgPropFloat(ZlvObjCfg *cfg, const char *property, ZlvBool *found);

/**
 * Reads an inherited property as a double, as sscanf's "%lf" does.
 *
 * @param cfg       null gives 0
 * @param property  property name, compared exactly; null gives 0
 * @param found     receives 1 when there is a value and it converts, else 0; may be null
 * @return the value; 0 when not found
 * @lock takes the API mutex
 */
ZLV_API double ZlvGetObjCfgPropDouble(ZlvObjCfg *cfg, const char *property, ZlvBool *found);

/**
 * Sets a configuration's own property.
 *
 * @param cfg       null is ignored
 * @param property  property name, copied; null is ignored
 * @param value     text, copied; null stores no value: lookups then go on to the parent
 * @lock takes the API mutex
 */
ZLV_API void ZlvSetObjCfgProp(ZlvObjCfg *cfg, const char *property, const char *value);

/**
 * Sets a configuration's own property to a truth value.
 *
 * @param cfg       null is ignored
 * @param property  property name, copied; null is ignored
 * @param value     1 is stored as "true", anything else as "false"
 * @lock takes the API mutex
 */
ZLV_API void ZlvSetObjCfgPropBool(ZlvObjCfg *cfg, const char *property, ZlvBool value);

/**
 * Sets a configuration's own property to a number.
 *
 * @param cfg       null is ignored
 * @param property  property name, copied; null is ignored
 * @param value     stored in decimal
 * @lock takes the API mutex
 */
ZLV_API void ZlvSetObjCfgPropInt(ZlvObjCfg *cfg, const char *property, int32_t value);

/**
 * Sets a configuration's own property to a number.
 *
 * @param cfg       null is ignored
 * @param property  property name, copied; null is ignored
 * @param value     its low 32 bits are stored, as a signed decimal
 * @lock takes the API mutex
 */
ZLV_API void ZlvSetObjCfgPropLong(ZlvObjCfg *cfg, const char *property, int64_t value);

/**
 * Sets a configuration's own property to a float.
 *
 * @param cfg       null is ignored
 * @param property  property name, copied; null is ignored
 * @param value     stored with six fraction digits
 * @lock takes the API mutex
 */
ZLV_API void ZlvSetObjCfgPropFloat(ZlvObjCfg *cfg, const char *property, float value);

/**
 * Sets a configuration's own property to a double.
 *
 * @param cfg       null is ignored
 * @param property  property name, copied; null is ignored
 * @param value     stored with six fraction digits
 * @lock takes the API mutex
 */
ZLV_API void ZlvSetObjCfgPropDouble(ZlvObjCfg *cfg, const char *property, double value);

/**
 * Lists a configuration's own properties, first set first; inherited ones are not among them.
 *
 * @param cfg  null gives null
 * @return iterator for the ZlvStringToStringMapIter calls, nothing to free; null when there are
 *         none or the API mutex cannot be taken
 * @lock takes the API mutex
 */
ZLV_API StringToStringMapIterator ZlvObjCfgProperties(ZlvObjCfg *cfg);

CX_END_DECLS

#endif
