/* SPDX-License-Identifier: Apache-2.0 */
/*
 * ZlvPDLogger.h - the class functions of "zlv_pdlogger", a logger that stamps each event with the
 * identity of the software and the system that report it. Class functions run with the API mutex
 * held.
 */
#ifndef ZLV_PD_LOGGER_H
#define ZLV_PD_LOGGER_H

#include "ZlvTypes.h"

CX_BEGIN_DECLS

/**
 * The variables of a problem-determination logger; read and written with the API mutex held. Each
 * string is owned, bears the name of the property that sets it and that it stamps on events, and is
 * null when it stamps nothing.
 */
typedef struct PDLoggerVars {
    char *organization;
    char *product;
    char *component;
    char *client;
    char *server;       /**< at first the host's qualified name, or "NO_HOSTNAME" */
    char *serverFormat; /**< at first "IP" */
    char *productInstance;
    ZlvObject *idFormatter; /**< holds a reference to "zelvo.pdMsgIdFormatter"; null when that name
                                 belongs to an object of another class */
} PDLoggerVars;

/**
 * Makes the variables of a problem-determination logger. The host's name is looked up here, once.
 * The object "zelvo.pdMsgIdFormatter" of class "zlv_xmlformatter" is found, or made from its
 * configuration.
 *
 * @return PDLoggerVars, which the toolkit frees with ZlvPDLoggerFFreeVars(); null when memory ran
 *         out
 * @lock the caller holds the API mutex
 */
ZLV_API void *ZlvPDLoggerFAllocVars(void);

/**
 * Releases the identifier formatter and frees the variables.
 *
 * @param vars  what ZlvPDLoggerFAllocVars() gave; null is ignored
 * @lock the caller holds the API mutex
 */
ZLV_API void ZlvPDLoggerFFreeVars(void *vars);

/**
 * Takes over a changed property: "organization", "product", "component", "client", "server",
 * "serverFormat" or "productInstance". One that was removed stamps nothing any more, the defaults
 * of "server" and "serverFormat" included. Every other name goes to ZlvBasicLoggerFCfgChange().
 *
 * @param logger        the logger; null or one without variables does nothing
 * @param propertyName  the property that has changed; null does nothing
 * @lock the caller holds the API mutex
 */
ZLV_API void ZlvPDLoggerFCfgChange(ZlvObject *logger, const char *propertyName);

/**
 * Stamps an event and hands it to the logger's listeners: sets the strings that are not null as
 * properties, then "processId" and "threadId" (their low 32 bits), each in place of what the event
 * had; then sees to it that the event carries its message's identifier, as
 * zlvPDXMLUFormatterCacheMessageID() does.
 *
 * @param logger  the logger; null does nothing. One without variables sets no strings
 * @param event   the event; null does nothing
 * @param args    the message's arguments; copied by each reader, never advanced
 * @lock the caller holds the API mutex
 */
ZLV_API void ZlvPDLoggerFLog(ZlvObject *logger, ZlvEvent *event, va_list args);

CX_END_DECLS

#endif
