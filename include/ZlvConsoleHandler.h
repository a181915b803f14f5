/* SPDX-License-Identifier: Apache-2.0 */
/*
 * ZlvConsoleHandler.h - the class functions of "zlv_consolehandler", which prints each record to
 * the standard output. Class functions run with the API mutex held.
 */
#ifndef ZLV_CONSOLE_HANDLER_H
#define ZLV_CONSOLE_HANDLER_H

#include "ZlvTypes.h"

CX_BEGIN_DECLS

/** The variables of a console handler; read and written with the API mutex held. */
typedef struct ConsoleHandlerVars {
    uint8_t opened; /**< 1 once the header has been printed, 0 while closed */
} ConsoleHandlerVars;

/**
 * Makes the variables of a console handler, closed.
 *
 * @return ConsoleHandlerVars, which the toolkit frees with ZlvConsoleHandlerFFreeVars(); null when
 *         memory ran out
 * @lock the caller holds the API mutex
 */
ZLV_API void *ZlvConsoleHandlerFAllocVars(void);

/**
 * Frees the variables of a console handler. The trailer is not printed: that is the close entry's.
 *
 * @param vars  what ZlvConsoleHandlerFAllocVars() gave; null is ignored
 * @lock the caller holds the API mutex
 */
ZLV_API void ZlvConsoleHandlerFFreeVars(void *vars);

/**
 * Prints an event as the handler's formatter renders it, then a line feed, after opening the
 * handler if it is closed; then passes the event on to the handler's own listeners, also when the
 * formatter gave no text. A disabled handler does neither.
 *
 * @param handler  the console handler; null or one without variables does nothing
 * @param event    the event; null does nothing
 * @param args     the message's arguments; copied by each reader, never advanced
 * @lock the caller holds the API mutex
 */
ZLV_API void ZlvConsoleUHandlerFProcess(ZlvObject *handler, ZlvEvent *event, va_list args);

/**
 * Opens a closed console handler: prints the formatter's header, if it has one, and a line feed.
 *
 * @param handler  the console handler; null, one without variables or an open one does nothing
 * @lock the caller holds the API mutex
 */
ZLV_API void ZlvConsoleHandlerFOpen(ZlvObject *handler);

/**
 * Closes an open console handler: prints the formatter's trailer, if it has one, and a line feed.
 * The next record opens it again.
 *
 * @param handler  the console handler; null, one without variables or a closed one does nothing
 * @lock the caller holds the API mutex
 */
ZLV_API void ZlvConsoleHandlerFClose(ZlvObject *handler);

CX_END_DECLS

#endif
