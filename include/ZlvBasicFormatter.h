/* SPDX-License-Identifier: Apache-2.0 */
/*
 * ZlvBasicFormatter.h - the class functions of "zlv_basicformatter", which renders an event as one
 * line. Class functions run with the API mutex held.
 */
#ifndef ZLV_BASIC_FORMATTER_H
#define ZLV_BASIC_FORMATTER_H

#include "ZlvTypes.h"

CX_BEGIN_DECLS

/**
 * Takes over a changed property. "separator", "dateTimeFormat" and "locale" become the formatter's
 * settings, and a property that has been removed brings its default back; every other name goes to
 * ZlvBasicObjectFCfgChange().
 *
 * @param formatter     the formatter; null does nothing
 * @param propertyName  the property that has changed; null does nothing
 * @lock the caller holds the API mutex
 */
ZLV_API void ZlvBasicFormatterFCfgChange(ZlvObject *formatter, const char *propertyName);

/**
 * Renders an event as date, source file, function and line, organization, product, component,
 * client, server (those that the event has as properties), each followed by the separator, then the
 * message's text and a line feed. If the formatter has a locale, it becomes the event's first.
 *
 * @param formatter  the formatter; null, one without class, of another kind or without a bind entry
 *                   gives null
 * @param event      the event; null gives null
 * @param args       the message's arguments, handed on to the bind entry
 * @return the record, which the caller frees with RkoMemoryFree(); null when there is none
 * @lock the caller holds the API mutex
 */
ZLV_API UChar *ZlvBasicUFormatterFFormat(ZlvObject *formatter, ZlvEvent *event, va_list args);

/**
 * Gives the header of a formatter that has none.
 *
 * @param formatter  ignored; may be null
 * @return always null
 * @lock the caller holds the API mutex
 */
ZLV_API char *ZlvBasicFormatterFGetHeader(ZlvObject *formatter);

/**
 * Gives the trailer of a formatter that has none.
 *
 * @param formatter  ignored; may be null
 * @return always null
 * @lock the caller holds the API mutex
 */
ZLV_API char *ZlvBasicFormatterFGetTrailer(ZlvObject *formatter);

/**
 * Renders a time in the default locale and the default time zone: with the formatter's
 * "dateTimeFormat", an ICU date pattern, or without one as "yyyy-MM-dd HH:mm:ss.SSS" followed by
 * the zone's offset as +hh:mm or -hh:mm. West of UTC the minutes keep their own sign, which readers
 * of the records rely on: minus 3 h 30 min is "-03:-30", minus 30 min is "+00:-30".
 *
 * @param formatter  the formatter; null gives null
 * @param time       milliseconds since 1970-01-01 00:00 UTC
 * @return the text, empty if ICU cannot render it, which the caller frees with RkoMemoryFree();
 *         null when memory ran out
 * @lock the caller holds the API mutex
 */
ZLV_API UChar *ZlvBasicUFormatterFormatDate(ZlvObject *formatter, double time);

CX_END_DECLS

#endif
