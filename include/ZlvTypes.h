/* SPDX-License-Identifier: Apache-2.0 */
/*
 * ZlvTypes.h - the names of the toolkit's records and containers, so that each family's header can
 * speak of the others without including them. The records themselves stand in their own headers.
 */
#ifndef ZLV_TYPES_H
#define ZLV_TYPES_H

#include "CxTypes.h"

/** One UTF-16 code unit; the same type as the Unicode library's. */
#include <unicode/umachine.h>

/** An instance of a registered class: a logger, filter, handler or formatter (ZlvObject.h). */
typedef struct ZlvObject ZlvObject;
/** A registered class with its table of functions (ZlvObjClass.h). */
typedef struct ZlvObjClass ZlvObjClass;
/** A named bag of properties in the configuration tree (ZlvObjConfig.h). */
typedef struct ZlvObjCfg ZlvObjCfg;
/** The record of one logging call (ZlvEvent.h). */
typedef struct ZlvEvent ZlvEvent;
/** A message that is bound to text late (ZlvI18Msg.h). */
typedef struct ZlvI18Msg ZlvI18Msg;
/** A typed value (ZlvParm.h). */
typedef struct ZlvParm ZlvParm;

/** Ordered list of strings (ZlvStringList.h). */
typedef struct StringList StringList;
/** Ordered list of typed values (ZlvParmList.h). */
typedef struct ParmList ParmList;
/** Ordered set of strings (ZlvStringGroup.h). */
typedef struct StringGroup StringGroup;
/** Ordered set of listeners (ZlvListenerGroup.h). */
typedef struct ListenerGroup ListenerGroup;
/** Insertion-ordered map from string to string (ZlvStringToStringMap.h). */
typedef struct StringToStringMap StringToStringMap;
/** Insertion-ordered map from name to object (ZlvStringToObjMap.h). */
typedef struct StringToObjMap StringToObjMap;
/** Insertion-ordered map from name to configuration (ZlvStringToObjCfgMap.h). */
typedef struct StringToObjCfgMap StringToObjCfgMap;
/** Insertion-ordered map from name to class (ZlvStringToObjClassMap.h). */
typedef struct StringToObjClassMap StringToObjClassMap;

#endif
