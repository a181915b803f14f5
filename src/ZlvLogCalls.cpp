// SPDX-License-Identifier: Apache-2.0
// The public logging calls. Each tests the logger before anything else, even before it starts its
// argument list, so that a refused call costs a few loads.
#include "ZlvLogger.h"

#include "ZlvLoggable.h"
#include "ZlvLoggerIntl.h"
#include "ZlvOwned.h"

using namespace zelvo;

namespace {

ZlvStatus logMessage(ZlvObject *logger, ZlvLevel level, const char *bundle, const char *key,
                     va_list args)
{
    const ApiLock lock;
    return lock ? zlvLogUMessageEntry(logger, level, bundle, key, args) : NO_ERROR;
}

ZlvStatus logDebug(ZlvObject *logger, ZlvLevel level, const char *srcFile, const char *srcFunction,
                   int32_t srcLine, const UChar *text, va_list args)
{
    const ApiLock lock;
    return lock ? zlvLogUDebugEntry(logger, level, srcFile, srcFunction, srcLine, text, args)
                : NO_ERROR;
}

} // namespace

// The body of a variadic call: LAST is its last named parameter, CALL the call that uses `args`.
#define ZLV_LOG_VARIADIC(LEVEL, LAST, CALL)                                                        \
    if (!ZlvIsLoggableInline(logger, LEVEL))                                                       \
        return NO_ERROR;                                                                           \
    va_list args;                                                                                  \
    va_start(args, LAST);                                                                          \
    const ZlvStatus status = CALL;                                                                 \
    va_end(args);                                                                                  \
    return status

// Both forms of a call that logs a message from a bundle.
#define ZLV_MESSAGE_CALLS(NAME, LEVEL)                                                             \
    ZlvStatus NAME(ZlvObject *logger, const char *bundle, const char *key, ...)                    \
    {                                                                                              \
        ZLV_LOG_VARIADIC(LEVEL, key, logMessage(logger, LEVEL, bundle, key, args));                \
    }                                                                                              \
    ZlvStatus NAME##VA(ZlvObject *logger, const char *bundle, const char *key, va_list args)       \
    {                                                                                              \
        return ZlvIsLoggableInline(logger, LEVEL) ? logMessage(logger, LEVEL, bundle, key, args)   \
                                                  : NO_ERROR;                                      \
    }

// Both forms of a call that logs a text with its place in the source.
#define ZLV_DEBUG_CALLS(NAME, LEVEL)                                                               \
    ZlvStatus NAME(ZlvObject *logger, const char *srcFile, const char *srcFunction,                \
                   int32_t srcLine, const UChar *text, ...)                                        \
    {                                                                                              \
        ZLV_LOG_VARIADIC(LEVEL, text,                                                              \
                         logDebug(logger, LEVEL, srcFile, srcFunction, srcLine, text, args));      \
    }                                                                                              \
    ZlvStatus NAME##VA(ZlvObject *logger, const char *srcFile, const char *srcFunction,            \
                       int32_t srcLine, const UChar *text, va_list args)                           \
    {                                                                                              \
        return ZlvIsLoggableInline(logger, LEVEL)                                                  \
                   ? logDebug(logger, LEVEL, srcFile, srcFunction, srcLine, text, args)            \
                   : NO_ERROR;                                                                     \
    }

ZLV_MESSAGE_CALLS(ZlvLogUMsg, ZLV_LEVEL_NONE)
ZLV_MESSAGE_CALLS(ZlvLogFatal, ZLV_LEVEL_FATAL)
ZLV_MESSAGE_CALLS(ZlvLogError, ZLV_LEVEL_ERROR)
ZLV_MESSAGE_CALLS(ZlvLogWarn, ZLV_LEVEL_WARN)
ZLV_MESSAGE_CALLS(ZlvLogInfo, ZLV_LEVEL_INFO)

ZLV_DEBUG_CALLS(ZlvLogDebugMin, ZLV_LEVEL_DEBUG_MIN)
ZLV_DEBUG_CALLS(ZlvLogDebugMid, ZLV_LEVEL_DEBUG_MID)
ZLV_DEBUG_CALLS(ZlvLogDebugMax, ZLV_LEVEL_DEBUG_MAX)

ZlvStatus ZlvLogUText(ZlvObject *logger, const UChar *text, ...)
{
    ZLV_LOG_VARIADIC(ZLV_LEVEL_NONE, text, ZlvLogUTextVA(logger, text, args));
}

ZlvStatus ZlvLogUTextVA(ZlvObject *logger, const UChar *text, va_list args)
{
    return ZlvIsLoggableInline(logger, ZLV_LEVEL_NONE)
               ? logDebug(logger, ZLV_LEVEL_NONE, nullptr, nullptr, 0, text, args)
               : NO_ERROR;
}
