/* SPDX-License-Identifier: Apache-2.0 */
/*
 * ZlvLogMacros.h - logging calls as macros, which test the logger at the place of the call. A call
 * that would be refused costs ZlvIsLoggableInline() alone: none of its arguments but the logger is
 * evaluated. The debug macros fill in file, function and line.
 *
 * Each macro is a statement and evaluates its logger once. Whoever wants the ZlvStatus of a record
 * writes the call itself. The arguments follow the rules of the call that a macro stands for; the
 * text or the bundle is part of the variable list, since C99 wants that to have one argument at
 * least.
 *
 *     ZLV_DEBUG_MIN(logger, u"the door was opened");
 *     ZLV_DEBUG_MID(logger, u"counted {0,number,integer} of {1}", count(), name);
 *     ZLV_INFO(logger, BUNDLE, "opened", name);
 *
 * Texts such as u"opened" are C11 and C++. In C99 a text is an array of code units,
 *
 *     static const UChar opened[] = {'o', 'p', 'e', 'n', 'e', 'd', 0};
 *
 * or is made from bytes with CxUStringDupStrToUChar().
 */
#ifndef ZLV_LOG_MACROS_H
#define ZLV_LOG_MACROS_H

#include "ZlvLoggable.h"
#include "ZlvLogger.h"

/* Makes a call from a logger and what stands between the parentheses after it, if it is taken. */
#define ZLV_IF_LOGGABLE_(LOGGER, LEVEL, CALL, ...)                                                 \
    do {                                                                                           \
        ZlvObject *zlvLogger_ = (LOGGER);                                                          \
        if (ZlvIsLoggableInline(zlvLogger_, (LEVEL)))                                              \
            (void)CALL(zlvLogger_, __VA_ARGS__);                                                   \
    } while (0)

/**
 * Logs a text at ZLV_LEVEL_DEBUG_MIN as ZlvLogDebugMin() does, with the place of the macro.
 *
 * @param LOGGER  the logger, evaluated once; null refuses
 * @param ...     the message pattern and its arguments, evaluated if the logger takes the level
 * @lock takes the API mutex, if the logger takes the level
 */
#define ZLV_DEBUG_MIN(LOGGER, ...)                                                                 \
    ZLV_IF_LOGGABLE_(LOGGER, ZLV_LEVEL_DEBUG_MIN, ZlvLogDebugMin, __FILE__, __func__, __LINE__,    \
                     __VA_ARGS__)

/**
 * Logs a text at ZLV_LEVEL_DEBUG_MID as ZlvLogDebugMid() does, with the place of the macro.
 *
 * @param LOGGER  the logger, evaluated once; null refuses
 * @param ...     the message pattern and its arguments, evaluated if the logger takes the level
 * @lock takes the API mutex, if the logger takes the level
 */
#define ZLV_DEBUG_MID(LOGGER, ...)                                                                 \
    ZLV_IF_LOGGABLE_(LOGGER, ZLV_LEVEL_DEBUG_MID, ZlvLogDebugMid, __FILE__, __func__, __LINE__,    \
                     __VA_ARGS__)

/**
 * Logs a text at ZLV_LEVEL_DEBUG_MAX as ZlvLogDebugMax() does, with the place of the macro.
 *
 * @param LOGGER  the logger, evaluated once; null refuses
 * @param ...     the message pattern and its arguments, evaluated if the logger takes the level
 * @lock takes the API mutex, if the logger takes the level
 */
#define ZLV_DEBUG_MAX(LOGGER, ...)                                                                 \
    ZLV_IF_LOGGABLE_(LOGGER, ZLV_LEVEL_DEBUG_MAX, ZlvLogDebugMax, __FILE__, __func__, __LINE__,    \
                     __VA_ARGS__)

/**
 * Logs a message from a resource bundle at ZLV_LEVEL_FATAL as ZlvLogFatal() does.
 *
 * @param LOGGER  the logger, evaluated once; null refuses
 * @param ...     bundle, key and the message's arguments, evaluated if the logger takes the level
 * @lock takes the API mutex, if the logger takes the level
 */
#define ZLV_FATAL(LOGGER, ...) ZLV_IF_LOGGABLE_(LOGGER, ZLV_LEVEL_FATAL, ZlvLogFatal, __VA_ARGS__)

/**
 * Logs a message from a resource bundle at ZLV_LEVEL_ERROR as ZlvLogError() does.
 *
 * @param LOGGER  the logger, evaluated once; null refuses
 * @param ...     bundle, key and the message's arguments, evaluated if the logger takes the level
 * @lock takes the API mutex, if the logger takes the level
 */
#define ZLV_ERROR(LOGGER, ...) ZLV_IF_LOGGABLE_(LOGGER, ZLV_LEVEL_ERROR, ZlvLogError, __VA_ARGS__)

/**
 * Logs a message from a resource bundle at ZLV_LEVEL_WARN as ZlvLogWarn() does.
 *
 * @param LOGGER  the logger, evaluated once; null refuses
 * @param ...     bundle, key and the message's arguments, evaluated if the logger takes the level
 * @lock takes the API mutex, if the logger takes the level
 */
#define ZLV_WARN(LOGGER, ...) ZLV_IF_LOGGABLE_(LOGGER, ZLV_LEVEL_WARN, ZlvLogWarn, __VA_ARGS__)

/**
 * Logs a message from a resource bundle at ZLV_LEVEL_INFO as ZlvLogInfo() does.
 *
 * @param LOGGER  the logger, evaluated once; null refuses
 * @param ...     bundle, key and the message's arguments, evaluated if the logger takes the level
 * @lock takes the API mutex, if the logger takes the level
 */
#define ZLV_INFO(LOGGER, ...) ZLV_IF_LOGGABLE_(LOGGER, ZLV_LEVEL_INFO, ZlvLogInfo, __VA_ARGS__)

#endif
