/* SPDX-License-Identifier: Apache-2.0 */
/*
 * ZlvLogger.h - the logging calls. Each call first tests, without the API mutex, whether the logger
 * would take the event, and refuses in a few loads; else it takes the mutex, makes an event, runs
 * the logger's log function down the tree of listeners and frees the event. A refusal of any kind
 * (null or disabled logger, level below the threshold, no lock, no memory) is not an error: the
 * call returns {'-', 0, 0}.
 *
 * The message of a call is a key into a resource bundle, or a UTF-16 pattern. Either is formatted
 * with ICU's message syntax, and the arguments after the last named one are the pattern's, with the
 * types that ZlvBindUI18Msg() tells.
 */
#ifndef ZLV_LOGGER_H
#define ZLV_LOGGER_H

#include "ZlvLevel.h"
#include "ZlvObjClass.h"
#include "ZlvTypes.h"

CX_BEGIN_DECLS

/** Outcome of a logging call. */
typedef struct ZlvStatus {
    char type;        /**< CX_STATUS_OK, or CX_STATUS_PLATFORM when a handler could not write */
    int32_t code;     /**< platform error number of that failure, else 0 */
    int32_t icuError; /**< UErrorCode that binding the message left, else 0 */
} ZlvStatus;

/**
 * Tells whether a logger would take an event of a level: it must be enabled, and the level reach
 * its threshold. ZLV_LEVEL_NONE, as level or as threshold, always passes. A change that another
 * thread makes at the same time may be seen late.
 *
 * @param logger  the logger; null takes nothing
 * @param level   the event's level
 * @return 1 if it would, else 0
 * @lock none
 */
ZLV_API int32_t ZlvIsLoggable(ZlvObject *logger, ZlvLevel level);

/**
 * Gives the function that carries a logger's events on.
 *
 * @param logger  the logger; null, a disabled one, one without class or of another kind gives null
 * @return the log entry of its class; null when there is none or the lock failed
 * @lock takes the API mutex
 */
ZLV_API ZlvFLog ZlvLoggerGetFLog(ZlvObject *logger);

/**
 * Logs a message from a resource bundle without level, which passes every threshold.
 *
 * @param logger  the logger; null refuses
 * @param bundle  name or path of the resource bundle; null leaves the event without text
 * @param key     the message's key in the bundle; may be null
 * @param ...     the arguments of the message
 * @return the status that handling the event left; the no-error status for a refusal
 * @lock takes the API mutex
 */
ZLV_API ZlvStatus ZlvLogUMsg(ZlvObject *logger, const char *bundle, const char *key, ...);

/**
 * Logs a message from a resource bundle without level, which passes every threshold.
 *
 * @param logger  the logger; null refuses
 * @param bundle  name or path of the resource bundle; null leaves the event without text
 * @param key     the message's key in the bundle; may be null
 * @param args    the arguments of the message; copied by each reader, never advanced
 * @return the status that handling the event left; the no-error status for a refusal
 * @lock takes the API mutex
 */
ZLV_API ZlvStatus ZlvLogUMsgVA(ZlvObject *logger, const char *bundle, const char *key,
                               va_list args);

/**
 * Logs a message from a resource bundle at ZLV_LEVEL_FATAL.
 *
 * @param logger  the logger; null refuses
 * @param bundle  name or path of the resource bundle; null leaves the event without text
 * @param key     the message's key in the bundle; may be null
 * @param ...     the arguments of the message
 * @return the status that handling the event left; the no-error status for a refusal
 * @lock takes the API mutex
 */
ZLV_API ZlvStatus ZlvLogFatal(ZlvObject *logger, const char *bundle, const char *key, ...);

/**
 * Logs a message from a resource bundle at ZLV_LEVEL_FATAL.
 *
 * @param logger  the logger; null refuses
 * @param bundle  name or path of the resource bundle; null leaves the event without text
 * @param key     the message's key in the bundle; may be null
 * @param args    the arguments of the message; copied by each reader, never advanced
 * @return the status that handling the event left; the no-error status for a refusal
 * @lock takes the API mutex
 */
ZLV_API ZlvStatus ZlvLogFatalVA(ZlvObject *logger, const char *bundle, const char *key,
                                va_list args);

/**
 * Logs a message from a resource bundle at ZLV_LEVEL_ERROR.
 *
 * @param logger  the logger; null refuses
 * @param bundle  name or path of the resource bundle; null leaves the event without text
 * @param key     the message's key in the bundle; may be null
 * @param ...     the arguments of the message
 * @return the status that handling the event left; the no-error status for a refusal
 * @lock takes the API mutex
 */
ZLV_API ZlvStatus ZlvLogError(ZlvObject *logger, const char *bundle, const char *key, ...);

/**
 * Logs a message from a resource bundle at ZLV_LEVEL_ERROR.
 *
 * @param logger  the logger; null refuses
 * @param bundle  name or path of the resource bundle; null leaves the event without text
 * @param key     the message's key in the bundle; may be null
 * @param args    the arguments of the message; copied by each reader, never advanced
 * @return the status that handling the event left; the no-error status for a refusal
 * @lock takes the API mutex
 */
ZLV_API ZlvStatus ZlvLogErrorVA(ZlvObject *logger, const char *bundle, const char *key,
                                va_list args);

/**
 * Logs a message from a resource bundle at ZLV_LEVEL_WARN.
 *
 * @param logger  the logger; null refuses
 * @param bundle  name or path of the resource bundle; null leaves the event without text
 * @param key     the message's key in the bundle; may be null
 * @param ...     the arguments of the message
 * @return the status that handling the event left; the no-error status for a refusal
 * @lock takes the API mutex
 */
ZLV_API ZlvStatus ZlvLogWarn(ZlvObject *logger, const char *bundle, const char *key, ...);

/**
 * Logs a message from a resource bundle at ZLV_LEVEL_WARN.
 *
 * @param logger  the logger; null refuses
 * @param bundle  name or path of the resource bundle; null leaves the event without text
 * @param key     the message's key in the bundle; may be null
 * @param args    the arguments of the message; copied by each reader, never advanced
 * @return the status that handling the event left; the no-error status for a refusal
 * @lock takes the API mutex
 */
ZLV_API ZlvStatus ZlvLogWarnVA(ZlvObject *logger, const char *bundle, const char *key,
                               va_list args);

/**
 * Logs a message from a resource bundle at ZLV_LEVEL_INFO.
 *
 * @param logger  the logger; null refuses
 * @param bundle  name or path of the resource bundle; null leaves the event without text
 * @param key     the message's key in the bundle; may be null
 * @param ...     the arguments of the message
 * @return the status that handling the event left; the no-error status for a refusal
 * @lock takes the API mutex
 */
ZLV_API ZlvStatus ZlvLogInfo(ZlvObject *logger, const char *bundle, const char *key, ...);

/**
 * Logs a message from a resource bundle at ZLV_LEVEL_INFO.
 *
 * @param logger  the logger; null refuses
 * @param bundle  name or path of the resource bundle; null leaves the event without text
 * @param key     the message's key in the bundle; may be null
 * @param args    the arguments of the message; copied by each reader, never advanced
 * @return the status that handling the event left; the no-error status for a refusal
 * @lock takes the API mutex
 */
ZLV_API ZlvStatus ZlvLogInfoVA(ZlvObject *logger, const char *bundle, const char *key,
                               va_list args);

/**
 * Logs a text at ZLV_LEVEL_DEBUG_MIN, with the place in the source that it comes from.
 *
 * @param logger       the logger; null refuses
 * @param srcFile      source file, for the property "zlv_prop_srcfile"; null leaves file and line
 * out
 * @param srcFunction  source function, for "zlv_prop_srcfunction"; null leaves it out
 * @param srcLine      source line, for "zlv_prop_srcline"
 * @param text         message pattern; null leaves the event without text
 * @param ...          the arguments of the pattern
 * @return the status that handling the event left; the no-error status for a refusal
 * @lock takes the API mutex
 */
ZLV_API ZlvStatus ZlvLogDebugMin(ZlvObject *logger, const char *srcFile, const char *srcFunction,
                                 int32_t srcLine, const UChar *text, ...);

/**
 * Logs a text at ZLV_LEVEL_DEBUG_MIN, with the place in the source that it comes from.
 *
 * @param logger       the logger; null refuses
 * @param srcFile      source file, for the property "zlv_prop_srcfile"; null leaves file and line
 * out
 * @param srcFunction  source function, for "zlv_prop_srcfunction"; null leaves it out
 * @param srcLine      source line, for "zlv_prop_srcline"
 * @param text         message pattern; null leaves the event without text
 * @param args         the arguments of the pattern; copied by each reader, never advanced
 * @return the status that handling the event left; the no-error status for a refusal
 * @lock takes the API mutex
 */
ZLV_API ZlvStatus ZlvLogDebugMinVA(ZlvObject *logger, const char *srcFile, const char *srcFunction,
                                   int32_t srcLine, const UChar *text, va_list args);

/**
 * Logs a text at ZLV_LEVEL_DEBUG_MID, with the place in the source that it comes from.
 *
 * @param logger       the logger; null refuses
 * @param srcFile      source file, for the property "zlv_prop_srcfile"; null leaves file and line
 * out
 * @param srcFunction  source function, for "zlv_prop_srcfunction"; null leaves it out
 * @param srcLine      source line, for "zlv_prop_srcline"
 * @param text         message pattern; null leaves the event without text
 * @param ...          the arguments of the pattern
 * @return the status that handling the event left; the no-error status for a refusal
 * @lock takes the API mutex
 */
ZLV_API ZlvStatus ZlvLogDebugMid(ZlvObject *logger, const char *srcFile, const char *srcFunction,
                                 int32_t srcLine, const UChar *text, ...);

/**
 * Logs a text at ZLV_LEVEL_DEBUG_MID, with the place in the source that it comes from.
 *
 * @param logger       the logger; null refuses
 * @param srcFile      source file, for the property "zlv_prop_srcfile"; null leaves file and line
 * out
 * @param srcFunction  source function, for "zlv_prop_srcfunction"; null leaves it out
 * @param srcLine      source line, for "zlv_prop_srcline"
 * @param text         message pattern; null leaves the event without text
 * @param args         the arguments of the pattern; copied by each reader, never advanced
 * @return the status that handling the event left; the no-error status for a refusal
 * @lock takes the API mutex
 */
ZLV_API ZlvStatus ZlvLogDebugMidVA(ZlvObject *logger, const char *srcFile, const char *srcFunction,
                                   int32_t srcLine, const UChar *text, va_list args);

/**
 * Logs a text at ZLV_LEVEL_DEBUG_MAX, with the place in the source that it comes from.
 *
 * @param logger       the logger; null refuses
 * @param srcFile      source file, for the property "zlv_prop_srcfile"; null leaves file and line
 * out
 * @param srcFunction  source function, for "zlv_prop_srcfunction"; null leaves it out
 * @param srcLine      source line, for "zlv_prop_srcline"
 * @param text         message pattern; null leaves the event without text
 * @param ...          the arguments of the pattern
 * @return the status that handling the event left; the no-error status for a refusal
 * @lock takes the API mutex
 */
ZLV_API ZlvStatus ZlvLogDebugMax(ZlvObject *logger, const char *srcFile, const char *srcFunction,
                                 int32_t srcLine, const UChar *text, ...);

/**
 * Logs a text at ZLV_LEVEL_DEBUG_MAX, with the place in the source that it comes from.
 *
 * @param logger       the logger; null refuses
 * @param srcFile      source file, for the property "zlv_prop_srcfile"; null leaves file and line
 * out
 * @param srcFunction  source function, for "zlv_prop_srcfunction"; null leaves it out
 * @param srcLine      source line, for "zlv_prop_srcline"
 * @param text         message pattern; null leaves the event without text
 * @param args         the arguments of the pattern; copied by each reader, never advanced
 * @return the status that handling the event left; the no-error status for a refusal
 * @lock takes the API mutex
 */
ZLV_API ZlvStatus ZlvLogDebugMaxVA(ZlvObject *logger, const char *srcFile, const char *srcFunction,
                                   int32_t srcLine, const UChar *text, va_list args);

/**
 * Logs a text without level, which passes every threshold.
 *
 * @param logger  the logger; null refuses
 * @param text    message pattern; null leaves the event without text
 * @param ...     the arguments of the pattern
 * @return the status that handling the event left; the no-error status for a refusal
 * @lock takes the API mutex
 */
ZLV_API ZlvStatus ZlvLogUText(ZlvObject *logger, const UChar *text, ...);

/**
 * Logs a text without level, which passes every threshold.
 *
 * @param logger  the logger; null refuses
 * @param text    message pattern; null leaves the event without text
 * @param args    the arguments of the pattern; copied by each reader, never advanced
 * @return the status that handling the event left; the no-error status for a refusal
 * @lock takes the API mutex
 */
ZLV_API ZlvStatus ZlvLogUTextVA(ZlvObject *logger, const UChar *text, va_list args);

/**
 * Takes over a changed property of a basic logger: "level" becomes the threshold, as
 * ZlvGetLevelFromString() reads it (ZLV_LEVEL_NONE once removed); every other name goes to
 * ZlvBasicObjectFCfgChange().
 *
 * @param object        the logger; null does nothing
 * @param propertyName  the property that has changed; null does nothing
 * @lock the caller holds the API mutex
 */
ZLV_API void ZlvBasicLoggerFCfgChange(ZlvObject *object, const char *propertyName);

CX_END_DECLS

#endif
