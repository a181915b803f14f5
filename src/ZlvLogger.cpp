// SPDX-License-Identifier: Apache-2.0
// Loggers: the test whether one takes an event, the entries that make events and send them down the
// tree, and the configuration of the basic logger class. The public calls are in ZlvLogCalls.cpp.
#include "ZlvLogger.h"

#include "ZlvApiMutex.h"
#include "ZlvLoggable.h"
#include "ZlvLoggerIntl.h"

using namespace zelvo;

namespace {

/// Hands an event to the logger's log function, frees it and tells how it went. The logger is held
/// meanwhile, since the functions of its listeners may release it.
ZlvStatus dispatch(ZlvObject *logger, ZlvFLog log, ZlvEvent *event, va_list args)
{
    const ObjectRef held{zlvIntlAcquireObject(logger)};
    log(logger, event, args);
    const int32_t icuError = event->message != nullptr ? event->message->icuError : 0;
    const ZlvStatus status{event->status.type, event->status.code, icuError};
    ZlvFreeEvent(event);
    return status;
}

void addSource(ZlvEvent *event, const char *srcFile, const char *srcFunction, int32_t srcLine)
{
    if (srcFile != nullptr) {
        ZlvSetEventProp(event, "zlv_prop_srcfile", srcFile);
        ZlvSetEventPropInt(event, "zlv_prop_srcline", srcLine);
    }
    if (srcFunction != nullptr)
        ZlvSetEventProp(event, "zlv_prop_srcfunction", srcFunction);
}

} // namespace

int32_t ZlvIsLoggable(ZlvObject *logger, ZlvLevel level)
{
    return ZlvIsLoggableInline(logger, level);
}

int32_t zlvIntlIsLoggable(void)
{
    return 0;
}

ZlvFLog zlvIntlLoggerGetFLog(ZlvObject *logger)
{
    if (logger == nullptr || !loadRelaxed(logger->enabled))
        return nullptr;
    const ZlvObjClass *objClass = logger->objClass;
    const bool isLogger = objClass != nullptr && objClass->kind == ZLV_KIND_LOGGER;
    return isLogger ? objClass->logger.fLog : nullptr;
}

ZlvFLog ZlvLoggerGetFLog(ZlvObject *logger)
{
    return locked(zlvIntlLoggerGetFLog, logger);
}

ZlvStatus zlvLogUMessageEntry(ZlvObject *logger, ZlvLevel level, const char *bundle,
                              const char *key, va_list args)
{
    const ZlvFLog log = zlvIntlLoggerGetFLog(logger);
    ZlvEvent *event = log ? ZlvVaAllocUEvent(level, bundle, key, nullptr, args) : nullptr;
    if (event == nullptr)
        return NO_ERROR;
    ZlvSetEventIsMessage(event, 1);
    return dispatch(logger, log, event, args);
}

ZlvStatus zlvLogUDebugEntry(ZlvObject *logger, ZlvLevel level, const char *srcFile,
                            const char *srcFunction, int32_t srcLine, const UChar *text,
                            va_list args)
{
    const ZlvFLog log = zlvIntlLoggerGetFLog(logger);
    ZlvEvent *event = log ? ZlvVaAllocUEvent(level, nullptr, nullptr, text, args) : nullptr;
    if (event == nullptr)
        return NO_ERROR;
    ZlvSetEventIsMessage(event, 0);
    addSource(event, srcFile, srcFunction, srcLine);
    return dispatch(logger, log, event, args);
}

ZlvStatus zlvIntlLogVA(ZlvLevel level, const char *bundle, const char *key, ...)
{
    va_list args;
    va_start(args, key);
    const ZlvStatus status = zlvLogUMessageEntry(zlvToolkitLogger(), level, bundle, key, args);
    va_end(args);
    return status;
}

void ZlvBasicLoggerFCfgChange(ZlvObject *object, const char *propertyName)
{
    if (object != nullptr && propertyName != nullptr)
        followLevelChange(object, propertyName, object->logger.level);
}
