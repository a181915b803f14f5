// SPDX-License-Identifier: Apache-2.0
// Events. Nothing here takes the API mutex: the logging call that owns the event holds it.
#include "ZlvEvent.h"

#include "CxMemory.h"
#include "CxString.h"
#include "CxSystem.h"
#include "ZlvIntl.h"
#include "ZlvLocaleName.h"
#include "ZlvProps.h"

using namespace zelvo;

namespace {

/// The properties as they stand; the map getters take null for an empty map.
StringToStringMap *propsOf(const ZlvEvent *event)
{
    return event != nullptr ? event->properties : nullptr;
}

} // namespace

ZlvEvent *ZlvVaAllocUEvent(ZlvLevel level, const char *bundle, const char *key, const UChar *text,
                           va_list /*args*/)
{
    auto *event = static_cast<ZlvEvent *>(RkoMemoryCalloc(1, sizeof(ZlvEvent)));
    if (event == nullptr)
        return nullptr;
    event->isMessage = bundle != nullptr ? 1 : 0;
    event->time = CxSystemGetTimestamp();
    event->level = level;
    event->message = zlvIntlAllocUI18Msg(bundle, key, text);
    event->status = {CX_STATUS_OK, 0};
    return event;
}

void ZlvFreeEvent(ZlvEvent *event)
{
    if (event == nullptr)
        return;
    zlvIntlFreeI18Msg(event->message);
    zlvIntlFreeStringToStringMap(event->properties);
    RkoMemoryFree(event->messageId);
    RkoMemoryFree(event);
}

double ZlvGetEventTime(const ZlvEvent *event)
{
    return event != nullptr ? event->time : 0.0;
}

ZlvLevel ZlvGetEventLevel(const ZlvEvent *event)
{
    return event != nullptr ? event->level : ZLV_LEVEL_NONE;
}

UChar *ZlvBindEventUMsg(ZlvEvent *event, ZlvFBindMsg bind, va_list args)
{
    if (event == nullptr || bind == nullptr)
        return nullptr;
    if (event->locale != nullptr)
        zlvSetI18MsgLocale(event->message, event->locale);
    return bind(event->message, args);
}

char *ZlvGetEventMessageId(const ZlvEvent *event)
{
    return event != nullptr ? RkoStringDup(event->messageId) : nullptr;
}

void ZlvSetEventMessageId(ZlvEvent *event, const char *id)
{
    if (event == nullptr)
        return;
    char *copy = RkoStringDup(id); // made first: the identifier may be the stored one itself
    RkoMemoryFree(event->messageId);
    event->messageId = copy;
}

char *zlvGetEventLocale(const ZlvEvent *event)
{
    return event != nullptr ? RkoStringDup(event->locale) : nullptr;
}

void zlvSetEventLocale(ZlvEvent *event, const char *locale)
{
    if (event != nullptr)
        event->locale = internLocaleName(locale);
}

ZlvBool ZlvGetEventIsMessage(const ZlvEvent *event)
{
    return event != nullptr ? event->isMessage : 0;
}

void ZlvSetEventIsMessage(ZlvEvent *event, ZlvBool isMessage)
{
    if (event != nullptr)
        event->isMessage = isMessage;
}

StringToStringMap *zlvFetchEventPropMap(ZlvEvent *event)
{
    if (event == nullptr)
        return nullptr;
    if (event->properties == nullptr)
        event->properties = zlvIntlAllocStringToStringMap();
    return event->properties;
}

char *ZlvGetEventProp(const ZlvEvent *event, const char *property, ZlvBool *found)
{
    return ZlvGetMapProp(propsOf(event), property, found);
}

ZlvBool ZlvSetEventProp(ZlvEvent *event, const char *property, const char *value)
{
    return ZlvSetMapProp(zlvFetchEventPropMap(event), property, value);
}

// The typed pair of one KIND. A value of IN widens to what the map's setter takes.
#define ZLV_EVENT_PROP(KIND, OUT, IN)                                                              \
    OUT ZlvGetEventProp##KIND(const ZlvEvent *event, const char *property, ZlvBool *found)         \
    {                                                                                              \
        return ZlvGetMapProp##KIND(propsOf(event), property, found);                               \
    }                                                                                              \
    void ZlvSetEventProp##KIND(ZlvEvent *event, const char *property, IN value)                    \
    {                                                                                              \
        ZlvSetMapProp##KIND(zlvFetchEventPropMap(event), property, value);                         \
    }

ZLV_EVENT_PROP(Bool, ZlvBool, ZlvBool)
ZLV_EVENT_PROP(Int, int32_t, int32_t)
ZLV_EVENT_PROP(Long, int64_t, int32_t)
ZLV_EVENT_PROP(Float, float, float)
ZLV_EVENT_PROP(Double, double, double)
