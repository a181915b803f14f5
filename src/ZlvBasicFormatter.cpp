// SPDX-License-Identifier: Apache-2.0
// The formatter that renders an event as one line.
#include "ZlvBasicFormatter.h"

#include "CxString.h"
#include "CxUString.h"
#include "ZlvKeptDates.h"
#include "ZlvRecord.h"
#include "util/CxOwned.h"

using namespace zelvo;

namespace {

constexpr const char *PROPERTIES_BEFORE_LINE[] = {"zlv_prop_srcfile", "zlv_prop_srcfunction"};
constexpr const char *PROPERTIES_AFTER_LINE[] = {"organization", "product", "component", "client",
                                                 "server"};

/// The setting that a property configures; null for any other property.
char **settingOf(ZlvObject *formatter, const char *propertyName)
{
    auto &settings = formatter->formatter;
    if (RkoStringCmp(propertyName, "separator") == 0)
        return &settings.separator;
    if (RkoStringCmp(propertyName, "dateTimeFormat") == 0)
        return &settings.dateTimeFormat;
    if (RkoStringCmp(propertyName, "locale") == 0)
        return &settings.locale;
    return nullptr;
}

ZlvFBindMsg bindEntryOf(const ZlvObject *formatter)
{
    const ZlvObjClass *objClass = formatter != nullptr ? formatter->objClass : nullptr;
    const bool isFormatter = objClass != nullptr && objClass->kind == ZLV_KIND_FORMATTER;
    return isFormatter ? objClass->formatter.fBindMsg : nullptr;
}

/// Ends a field.
void separate(CxUStringBuff *out, const ZlvObject *formatter)
{
    const char *separator = formatter->formatter.separator;
    CxUStringBuffAppendStr(out, separator != nullptr ? separator : " ");
}

void addField(CxUStringBuff *out, const ZlvObject *formatter, const ZlvEvent *event,
              const char *property)
{
    if (appendProperty(out, event, property))
        separate(out, formatter);
}

void addFields(CxUStringBuff *out, const ZlvObject *formatter, const ZlvEvent *event)
{
    for (const char *property : PROPERTIES_BEFORE_LINE)
        addField(out, formatter, event, property);
    if (appendNumber(out, event, "zlv_prop_srcline", appendSigned))
        separate(out, formatter);
    for (const char *property : PROPERTIES_AFTER_LINE)
        addField(out, formatter, event, property);
}

} // namespace

void ZlvBasicFormatterFCfgChange(ZlvObject *formatter, const char *propertyName)
{
    if (formatter == nullptr || propertyName == nullptr)
        return;
    char **setting = settingOf(formatter, propertyName);
    if (setting == nullptr)
        return ZlvBasicObjectFCfgChange(formatter, propertyName);
    const OwnedStr former{*setting};
    *setting = zlvIntlGetObjProp(formatter, propertyName, nullptr);
}

UChar *ZlvBasicUFormatterFFormat(ZlvObject *formatter, ZlvEvent *event, va_list args)
{
    const ZlvFBindMsg bind = bindEntryOf(formatter);
    if (event == nullptr || bind == nullptr)
        return nullptr;
    Record record;
    CxUStringBuff *out = record.text();
    appendDate(out, formatter->formatter.dateTimeFormat, ZlvGetEventTime(event));
    separate(out, formatter);
    if (event->properties != nullptr)
        addFields(out, formatter, event);
    const OwnedUStr message{boundMessage(formatter, event, bind, args)};
    CxUStringBuffAppendUStr(out, message.get());
    append(out, u"\n");
    return record.take();
}

char *ZlvBasicFormatterFGetHeader(ZlvObject * /*formatter*/)
{
    return nullptr;
}

char *ZlvBasicFormatterFGetTrailer(ZlvObject * /*formatter*/)
{
    return nullptr;
}

UChar *ZlvBasicUFormatterFormatDate(ZlvObject *formatter, double time)
{
    if (formatter == nullptr)
        return nullptr;
    Record date;
    appendDate(date.text(), formatter->formatter.dateTimeFormat, time);
    UChar *text = date.take();
    return text != nullptr ? text : CxUStringDup(u"");
}
