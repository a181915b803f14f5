/* SPDX-License-Identifier: Apache-2.0 */
/*
 * ZlvMsgIdFilter.h - the class functions of "zlv_msgidfilter", which accepts events by their
 * message identifier and damps repeats, and the wildcard match that it uses. Class functions run
 * with the API mutex held.
 */
#ifndef ZLV_MSG_ID_FILTER_H
#define ZLV_MSG_ID_FILTER_H

#include "ZlvTypes.h"

CX_BEGIN_DECLS

/** What a message-ID filter does with an identifier that matches one of its patterns. */
enum {
    ZLV_MSG_ID_BLOCK = 1,   /**< drops it, and passes all others */
    ZLV_MSG_ID_PASSTHRU = 2 /**< passes it, and drops all others */
};

/** The variables of a message-ID filter; read and written with the API mutex held. */
typedef struct MsgIdFilterVars {
    int32_t mode;                  /**< ZLV_MSG_ID_BLOCK at first, or ZLV_MSG_ID_PASSTHRU */
    StringList *patterns;          /**< owned; at first "*W" and "*I" */
    ZlvObject *formatter;          /**< holds a reference to "msgFormatter"; null when that name
                                        belongs to an object of another class */
    int64_t repeatTime;            /**< least distance in milliseconds of two passed events of one
                                        identifier; 0 at first, and below 1 there is no limit */
    StringToStringMap *lastPassed; /**< owned; the decimal time in milliseconds at which each
                                        identifier passed last. It only grows */
} MsgIdFilterVars;

/**
 * Makes the variables of a message-ID filter. The object "msgFormatter" of class "zlv_xmlformatter"
 * is found, or made from its configuration.
 *
 * @return MsgIdFilterVars, which the toolkit frees with ZlvMsgIdFilterFFreeVars(); null when memory
 *         ran out
 * @lock the caller holds the API mutex
 */
ZLV_API void *ZlvMsgIdFilterFAllocVars(void);

/**
 * Frees the variables of a message-ID filter and releases its formatter.
 *
 * @param vars  what ZlvMsgIdFilterFAllocVars() gave; null is ignored
 * @lock the caller holds the API mutex
 */
ZLV_API void ZlvMsgIdFilterFFreeVars(void *vars);

/**
 * Takes over a changed property: "mode" ("BLOCK" or "PASSTHRU" in any case of letters; any other
 * value blocks), "msgIds" (patterns, separated as ZlvMsgIdFilterGetStringList() says) or
 * "msgIdRepeatTime" (milliseconds; a value that is no number is ignored). One of these that is not
 * found changes nothing. Every other name goes to ZlvBasicObjectFCfgChange().
 *
 * @param filter        the filter; null or one without variables does nothing
 * @param propertyName  the property that has changed; null does nothing
 * @lock the caller holds the API mutex
 */
ZLV_API void ZlvMsgIdFilterFCfgChange(ZlvObject *filter, const char *propertyName);

/**
 * Tells whether an event passes. An event without an identifier is given one first, as
 * zlvPDXMLUFormatterCacheMessageID() does. The mode decides, and then, for an identifier that is
 * not empty, the repeat time, which runs from the event that passed last: what is dropped does not
 * extend it.
 *
 * @param filter  the filter; null accepts nothing, one without variables everything
 * @param event   the event; null is not accepted
 * @param args    the message's arguments; copied by each reader, never advanced
 * @return 1 if the event passes, else 0
 * @lock the caller holds the API mutex
 */
ZLV_API int32_t ZlvMsgIdFilterFIsLoggable(ZlvObject *filter, ZlvEvent *event, va_list args);

/**
 * Splits a text at blanks, tabs, line feeds and carriage returns.
 *
 * @param text  the text; null gives an empty list
 * @return the parts in order, which the caller frees with zlvIntlFreeStringList(); null when memory
 *         ran out
 * @lock none
 */
ZLV_API StringList *ZlvMsgIdFilterGetStringList(const char *text);

/**
 * Tells whether an identifier matches one of the patterns.
 *
 * @param patterns  tried in order with ZlvPatternMatch(); null gives 0
 * @param id        the identifier; null gives 0
 * @return 1 if one matches, else 0
 * @lock the caller holds the API mutex
 */
ZLV_API ZlvBool ZlvMsgIdFilterMatchMsgId(StringList *patterns, const char *id);

/**
 * Tells whether a text matches a pattern, in which "*" stands for any bytes. Bytes are compared
 * exactly. There is no backtracking: each piece between stars is looked for from where the one
 * before it ended, and taken where it is found first. Hence:
 *
 *   - "*" and "" match every text;
 *   - a star at the end counts only directly behind the pattern's first piece: "AB*" matches "ABC",
 *     but "*B*" does not, since a last piece must end the text;
 *   - a last piece must end the text where it is found first: "*W" matches "ABC001W" but not
 *     "AWC001W", and "*AB" does not match "ABAB";
 *   - a pattern without a star matches itself alone.
 *
 * @param pattern  the pattern; null gives 0
 * @param text     the text; null gives 0
 * @return 1 if it matches, else 0
 * @lock none
 */
ZLV_API ZlvBool ZlvPatternMatch(const char *pattern, const char *text);

CX_END_DECLS

#endif
