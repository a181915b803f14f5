/* SPDX-License-Identifier: Apache-2.0 */
/* ZlvParm.h - a typed value: the element of parameter lists, and how typed settings become text. */
#ifndef ZLV_PARM_H
#define ZLV_PARM_H

#include "ZlvTypes.h"

CX_BEGIN_DECLS

/** Type tags of a ZlvParm. A record with any other tag equals nothing and renders as "". */
enum {
    ZLV_PARM_BYTE = 501,
    ZLV_PARM_INT = 502,
    ZLV_PARM_LONG = 503, /**< holds the low 32 bits of a 64-bit value */
    ZLV_PARM_FLOAT = 504,
    ZLV_PARM_DOUBLE = 505,
    ZLV_PARM_CHAR = 506,
    ZLV_PARM_STRING = 507
};

/**
 * A typed value. `type` is one of the tags and says which member of `value` holds it; a string is
 * owned by the record and freed with it.
 */
struct ZlvParm {
    uint32_t type;
    union {
        uint8_t byteValue;  /**< ZLV_PARM_BYTE, ZLV_PARM_CHAR */
        int32_t intValue;   /**< ZLV_PARM_INT, ZLV_PARM_LONG */
        float floatValue;   /**< ZLV_PARM_FLOAT */
        double doubleValue; /**< ZLV_PARM_DOUBLE */
        char *stringValue;  /**< ZLV_PARM_STRING */
    } value;
};

/**
 * Makes a copy of a typed value, with a string of its own. A tag outside 501 to 507 is copied
 * alone.
 *
 * @param parm  the value to copy; null gives null
 * @return the copy, which the caller frees with ZlvFreeParm(); null when memory ran out
 * @lock none
 */
ZLV_API ZlvParm *ZlvCopyParm(const ZlvParm *parm);

/**
 * Frees a typed value, and its string if the tag is ZLV_PARM_STRING.
 *
 * @param parm  a value from ZlvCopyParm() or a ParmList iterator; null is ignored
 * @lock none
 */
ZLV_API void ZlvFreeParm(ZlvParm *parm);

/**
 * Tells whether two typed values are equal: same tag within 501 to 507 and equal values. Floats and
 * doubles compare as numbers (NaN equals nothing, +0 equals -0), strings byte by byte; two null
 * strings are not equal.
 *
 * @param a  one value; null equals only null
 * @param b  the other
 * @return 1 when equal, else 0
 * @lock none
 */
ZLV_API ZlvBool ZlvCmpParms(const ZlvParm *a, const ZlvParm *b);

CX_END_DECLS

#endif
