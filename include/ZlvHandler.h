/* SPDX-License-Identifier: Apache-2.0 */
/*
 * ZlvHandler.h - what all handlers share: the formatter that each is bound to, and the class
 * functions to fall back to, which run with the API mutex held.
 */
#ifndef ZLV_HANDLER_H
#define ZLV_HANDLER_H

#include "ZlvTypes.h"

CX_BEGIN_DECLS

/**
 * Gives the formatter that a handler is bound to.
 *
 * @param handler  the handler; null, one without class or of another kind gives null
 * @return the formatter with one more reference, which the caller releases with ZlvReleaseObject();
 *         null when there is none or the lock failed
 * @lock takes the API mutex
 */
ZLV_API ZlvObject *ZlvHandlerGetFormatter(ZlvObject *handler);

/**
 * Binds a handler to a formatter, with a reference of its own, and lets the former one go.
 *
 * @param handler    the handler; null, one without class or of another kind is ignored
 * @param formatter  the formatter; null unbinds
 * @lock takes the API mutex
 */
ZLV_API void ZlvHandlerSetFormatter(ZlvObject *handler, ZlvObject *formatter);

/**
 * Asks a handler's formatter for the text that opens an output.
 *
 * @param handler  the handler; null, one without class or of another kind gives null
 * @return the header, which the caller frees with RkoMemoryFree(); null when the handler has no
 *         formatter, the formatter no header, or the lock failed
 * @lock takes the API mutex
 */
ZLV_API char *ZlvHandlerGetFmtHeader(ZlvObject *handler);

/**
 * Asks a handler's formatter for the text that closes an output.
 *
 * @param handler  the handler; null, one without class or of another kind gives null
 * @return the trailer, which the caller frees with RkoMemoryFree(); null when the handler has no
 *         formatter, the formatter no trailer, or the lock failed
 * @lock takes the API mutex
 */
ZLV_API char *ZlvHandlerGetFmtTrailer(ZlvObject *handler);

/**
 * Has a handler's formatter render an event.
 *
 * @param handler  the handler; null, one without class or of another kind gives null
 * @param event    the event, handed to the formatter as it is
 * @param args     the message's arguments, handed on as they are
 * @return the record, which the caller frees with RkoMemoryFree(); null when the handler has no
 *         formatter, the formatter gave no text, or the lock failed
 * @lock takes the API mutex
 */
ZLV_API UChar *ZlvUHandlerDoFmt(ZlvObject *handler, ZlvEvent *event, va_list args);

/**
 * Takes over a changed property: "formatterName", if it is set, binds the handler to the object of
 * that name, or to nothing if there is no such object; every other name goes to
 * ZlvBasicObjectFCfgChange().
 *
 * @param handler       the handler; null does nothing
 * @param propertyName  the property that has changed; null does nothing
 * @lock the caller holds the API mutex
 */
ZLV_API void ZlvBasicHandlerFCfgChange(ZlvObject *handler, const char *propertyName);

/**
 * Process entry of a handler class that gives none: does nothing.
 *
 * @param handler  ignored; may be null
 * @param event    ignored; may be null
 * @param args     not read
 * @lock the caller holds the API mutex
 */
ZLV_API void ZlvBasicHandlerFProcess(ZlvObject *handler, ZlvEvent *event, va_list args);

/**
 * Open entry of a handler class that gives none: does nothing.
 *
 * @param handler  ignored; may be null
 * @lock the caller holds the API mutex
 */
ZLV_API void ZlvBasicHandlerFOpen(ZlvObject *handler);

/**
 * Close entry of a handler class that gives none: does nothing.
 *
 * @param handler  ignored; may be null
 * @lock the caller holds the API mutex
 */
ZLV_API void ZlvBasicHandlerFClose(ZlvObject *handler);

CX_END_DECLS

#endif
