// SPDX-License-Identifier: Apache-2.0
// What all handlers share: the formatter that each is bound to.
#include "ZlvHandler.h"

#include <type_traits>

#include "CxString.h"
#include "ZlvApiMutex.h"
#include "util/CxOwned.h"

using namespace zelvo;

namespace {

using FormatterEntries = decltype(ZlvObjClass::formatter);

bool isOfKind(const ZlvObject *object, uint32_t kind)
{
    return object != nullptr && object->objClass != nullptr && object->objClass->kind == kind;
}

/// Calls an entry of the formatter that a handler is bound to; null when there is no such entry.
/// The formatter is held meanwhile, since the entry may bind the handler to another one.
template <class Text, class... Args>
Text *callFormatter(ZlvObject *handler, Text *(*FormatterEntries::*entry)(ZlvObject *, Args...),
                    std::type_identity_t<Args>... args)
{
    const ObjectRef formatter{zlvIntlHandlerGetFormatter(handler)};
    if (!isOfKind(formatter.get(), ZLV_KIND_FORMATTER))
        return nullptr;
    const auto function = formatter->objClass->formatter.*entry;
    return function != nullptr ? function(formatter.get(), args...) : nullptr;
}

} // namespace

ZlvObject *zlvIntlHandlerGetFormatter(ZlvObject *handler)
{
    return isOfKind(handler, ZLV_KIND_HANDLER) ? zlvIntlAcquireObject(handler->handler.formatter)
                                               : nullptr;
}

ZlvObject *ZlvHandlerGetFormatter(ZlvObject *handler)
{
    return locked(zlvIntlHandlerGetFormatter, handler);
}

void zlvIntlHandlerSetFormatter(ZlvObject *handler, ZlvObject *formatter)
{
    if (!isOfKind(handler, ZLV_KIND_HANDLER))
        return;
    // In this order, so that binding the same formatter again cannot destroy it in passing, and a
    // formatter that is destroyed is no longer seen by anybody.
    ZlvObject *former = handler->handler.formatter;
    handler->handler.formatter = zlvIntlAcquireObject(formatter);
    zlvIntlReleaseObject(former);
}

void ZlvHandlerSetFormatter(ZlvObject *handler, ZlvObject *formatter)
{
    locked(zlvIntlHandlerSetFormatter, handler, formatter);
}

char *zlvIntlHandlerGetFmtHeader(ZlvObject *handler)
{
    return callFormatter(handler, &FormatterEntries::fGetHeader);
}

char *ZlvHandlerGetFmtHeader(ZlvObject *handler)
{
    return locked(zlvIntlHandlerGetFmtHeader, handler);
}

char *zlvIntlHandlerGetFmtTrailer(ZlvObject *handler)
{
    return callFormatter(handler, &FormatterEntries::fGetTrailer);
}

char *ZlvHandlerGetFmtTrailer(ZlvObject *handler)
{
    return locked(zlvIntlHandlerGetFmtTrailer, handler);
}

UChar *zlvIntlUHandlerDoFmt(ZlvObject *handler, ZlvEvent *event, va_list args)
{
    return callFormatter(handler, &FormatterEntries::fFormat, event, args);
}

UChar *ZlvUHandlerDoFmt(ZlvObject *handler, ZlvEvent *event, va_list args)
{
    return locked(zlvIntlUHandlerDoFmt, handler, event, args);
}

void ZlvBasicHandlerFCfgChange(ZlvObject *handler, const char *propertyName)
{
    if (handler == nullptr || propertyName == nullptr)
        return;
    if (RkoStringCmp(propertyName, "formatterName") != 0)
        return ZlvBasicObjectFCfgChange(handler, propertyName);
    ZlvBool found = 0;
    const OwnedStr name{zlvIntlGetObjProp(handler, propertyName, &found)};
    if (found == 0)
        return;
    const ObjectRef formatter{zlvIntlGetObject(name.get(), nullptr)};
    zlvIntlHandlerSetFormatter(handler, formatter.get());
}

void ZlvBasicHandlerFProcess(ZlvObject * /*handler*/, ZlvEvent * /*event*/, va_list /*args*/) {}

void ZlvBasicHandlerFOpen(ZlvObject * /*handler*/) {}

void ZlvBasicHandlerFClose(ZlvObject * /*handler*/) {}
