/* SPDX-License-Identifier: Apache-2.0 */
/*
 * ZlvLevelFilter.h - the entry that every filter class shares, and the class functions of
 * "zlv_levelfilter", which accepts events by their level. Class functions run with the API mutex
 * held.
 */
#ifndef ZLV_LEVEL_FILTER_H
#define ZLV_LEVEL_FILTER_H

#include "ZlvTypes.h"

CX_BEGIN_DECLS

/**
 * Hands an event to the filter's class: if its is-loggable entry accepts the event, its log entry
 * passes it on. Only a result of exactly 1 in the low eight bits accepts.
 *
 * @param filter  the filter; null, a disabled one, one without class or of another kind, or one
 *                whose class lacks either entry drops the event
 * @param event   the event, handed on as it is
 * @param args    the message's arguments, handed on as they are
 * @lock the caller holds the API mutex
 */
ZLV_API void ZlvBasicFilterFProcess(ZlvObject *filter, ZlvEvent *event, va_list args);

/**
 * Tells whether an event passes a filter's threshold: always if the threshold is ZLV_LEVEL_ALL or
 * the event has no level, else if its level is at least the threshold. The filter's enabled flag
 * does not count here.
 *
 * @param filter  the filter; null accepts nothing
 * @param event   the event; null is not accepted
 * @param args    not read
 * @return 1 if the event passes, else 0
 * @lock the caller holds the API mutex
 */
ZLV_API int32_t ZlvLevelFilterFIsLoggable(ZlvObject *filter, ZlvEvent *event, va_list args);

/**
 * Takes over a changed property: "level" becomes the threshold, as ZlvGetLevelFromString() reads it
 * (ZLV_LEVEL_NONE once removed); every other name goes to ZlvBasicObjectFCfgChange().
 *
 * @param filter        the filter; null does nothing
 * @param propertyName  the property that has changed; null does nothing
 * @lock the caller holds the API mutex
 */
ZLV_API void ZlvLevelFilterFCfgChange(ZlvObject *filter, const char *propertyName);

CX_END_DECLS

#endif
