/* SPDX-License-Identifier: Apache-2.0 */
/* ZlvLevel.h - the scale of severities that events carry and thresholds compare with. */
#ifndef ZLV_LEVEL_H
#define ZLV_LEVEL_H

#include "CxTypes.h"

CX_BEGIN_DECLS

/**
 * A severity; larger is more severe. An event passes a threshold when its level is at least the
 * threshold. Any number is allowed, not only the named ones.
 */
typedef int32_t ZlvLevel;

/** The named levels and thresholds. */
enum {
    ZLV_LEVEL_FATAL = 7000,
    ZLV_LEVEL_ERROR = 6000,
    ZLV_LEVEL_WARN = 5000,
    ZLV_LEVEL_INFO = 4000,
    ZLV_LEVEL_DEBUG_MIN = 3000, /**< the threshold of a new logger */
    ZLV_LEVEL_DEBUG_MID = 2000,
    ZLV_LEVEL_DEBUG_MAX = 1000,
    ZLV_LEVEL_ALL = 0,    /**< threshold that accepts every named level */
    ZLV_LEVEL_OFF = 9999, /**< threshold above every named level; events without level still pass */
    ZLV_LEVEL_NONE = -9999 /**< an event that passes every threshold; a threshold that is not set */
};

/**
 * Reads a level from text: a decimal number, else a level's name. The number is read as scanf's
 * "%d" does, so leading blanks and trailing text are accepted, and text that ends before a number
 * begins (empty or all blank) gives 0. Names are FATAL, ERROR, WARN, INFO, DEBUG_MIN or MIN,
 * DEBUG_MID or MID, DEBUG_MAX or MAX, ALL and OFF; case does not count, nor does what follows the
 * name ("Warning" is WARN).
 *
 * @param str  the text; null gives ZLV_LEVEL_NONE
 * @return the level; ZLV_LEVEL_NONE for text that is neither number nor name
 * @lock none
 */
ZLV_API ZlvLevel ZlvGetLevelFromString(const char *str);

CX_END_DECLS

#endif
