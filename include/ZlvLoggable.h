/* SPDX-License-Identifier: Apache-2.0 */
/*
 * ZlvLoggable.h - the test that every logging call begins with, for callers who want to pay for it
 * alone: arguments that are costly to make need not be made for a call that would be refused.
 */
#ifndef ZLV_LOGGABLE_H
#define ZLV_LOGGABLE_H

#include "ZlvLevel.h"
#include "ZlvObject.h"
#include "ZlvTypes.h"

CX_BEGIN_DECLS

/**
 * Answers as ZlvIsLoggable() does, in a few loads at the place of the call. The loads are relaxed
 * atomic ones, since both fields change under the API mutex, which this test does not take.
 *
 * @param logger  the logger; null takes nothing
 * @param level   the event's level
 * @return 1 if the logger would take the event, else 0
 * @lock none
 */
static inline int32_t ZlvIsLoggableInline(const ZlvObject *logger, ZlvLevel level)
{
    ZlvLevel threshold;
    if (!logger || !__atomic_load_n(&logger->enabled, __ATOMIC_RELAXED))
        return 0;
    if (level == ZLV_LEVEL_NONE)
        return 1;
    threshold = __atomic_load_n(&logger->logger.level, __ATOMIC_RELAXED);
    return threshold == ZLV_LEVEL_NONE || level >= threshold;
}

CX_END_DECLS

#endif
