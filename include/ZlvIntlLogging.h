/* SPDX-License-Identifier: Apache-2.0 */
/* ZlvIntlLogging.h - for authors of classes: messages, events and logging; see ZlvIntl.h. */
#ifndef ZLV_INTL_LOGGING_H
#define ZLV_INTL_LOGGING_H

#include <stdio.h>

#include "ZlvEvent.h"
#include "ZlvI18Msg.h"
#include "ZlvLogger.h"

CX_BEGIN_DECLS

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

CX_END_DECLS

#endif
