// SPDX-License-Identifier: Apache-2.0
// The formatter that renders an event as one line.
#include "ZlvBasicFormatter.h"

#include <cstdio>

#include <unicode/ucal.h>
#include <unicode/udat.h>
#include <unicode/ustring.h>

#include "CxString.h"
#include "CxUString.h"
#include "ZlvIcuText.h"
#include "ZlvRecord.h"
#include "util/CxOwned.h"

using namespace zelvo;

namespace {

constexpr int32_t MILLISECONDS_PER_MINUTE = 60 * 1000;
constexpr int32_t MILLISECONDS_PER_HOUR = 60 * MILLISECONDS_PER_MINUTE;

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

/// A time as ICU writes it by a pattern; null if it cannot, or if nothing comes out.
UChar *rendered(const UChar *pattern, UDate time)
{
    UErrorCode status = U_ZERO_ERROR;
    UDateFormat *format =
        udat_open(UDAT_PATTERN, UDAT_PATTERN, nullptr, nullptr, -1, pattern, -1, &status);
    if (U_FAILURE(status))
        return nullptr;
    UChar *text = icuText(
        [&](UChar *area, int32_t capacity, UErrorCode *error) {
            return udat_format(format, time, area, capacity, nullptr, error);
        },
        &status);
    udat_close(format);
    return text;
}

/// The distance of the default zone from UTC at a time, in milliseconds, east counting up.
int32_t zoneOffset(UDate time)
{
    UErrorCode status = U_ZERO_ERROR;
    UCalendar *calendar = ucal_open(nullptr, -1, nullptr, UCAL_DEFAULT, &status);
    ucal_setMillis(calendar, time, &status);
    const int32_t offset = ucal_get(calendar, UCAL_ZONE_OFFSET, &status) +
                           ucal_get(calendar, UCAL_DST_OFFSET, &status);
    ucal_close(calendar);
    return U_SUCCESS(status) ? offset : 0;
}

void addZoneSuffix(CxUStringBuff *out, UDate time)
{
    const int32_t offset = zoneOffset(time);
    const int32_t hours = offset / MILLISECONDS_PER_HOUR;
    const int32_t minutes = (offset / MILLISECONDS_PER_MINUTE) % 60; // keeps the offset's sign
    char suffix[32];
    const int length = hours < 0
                           ? std::snprintf(suffix, sizeof suffix, "-%02d:%02d", -hours, minutes)
                           : std::snprintf(suffix, sizeof suffix, "+%02d:%02d", hours, minutes);
    UChar wide[sizeof suffix];
    u_charsToUChars(suffix, wide, length + 1);
    CxUStringBuffAppendUStr(out, wide);
}

UChar *defaultDate(UDate time)
{
    const OwnedUStr date{rendered(u"yyyy-MM-dd HH:mm:ss.SSS", time)};
    if (!date)
        return nullptr;
    Record whole;
    CxUStringBuffAppendUStr(whole.text(), date.get());
    addZoneSuffix(whole.text(), time);
    return whole.take();
}

UChar *configuredDate(const char *setting, UDate time)
{
    const OwnedUStr pattern{CxUStringDupStrToUChar(setting)};
    return pattern ? rendered(pattern.get(), time) : nullptr;
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
    const OwnedUStr date{ZlvBasicUFormatterFormatDate(formatter, ZlvGetEventTime(event))};
    CxUStringBuffAppendUStr(out, date.get());
    separate(out, formatter);
    for (const char *property : PROPERTIES_BEFORE_LINE)
        addField(out, formatter, event, property);
    if (appendNumber(out, event, "zlv_prop_srcline", appendSigned))
        separate(out, formatter);
    for (const char *property : PROPERTIES_AFTER_LINE)
        addField(out, formatter, event, property);
    const OwnedUStr message{boundMessage(formatter, event, bind, args)};
    CxUStringBuffAppendUStr(out, message.get());
    CxUStringBuffAppendUStr(out, u"\n");
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
    const char *setting = formatter->formatter.dateTimeFormat;
    UChar *date = setting != nullptr ? configuredDate(setting, time) : defaultDate(time);
    return date != nullptr ? date : CxUStringDup(u"");
}
