// SPDX-License-Identifier: Apache-2.0
#include "ZlvDateFormat.h"

#include <cstdio>

#include <unicode/ustring.h>

#include "CxUString.h"
#include "ZlvIcuText.h"
#include "util/CxOwned.h"

namespace zelvo {
namespace {

constexpr int32_t MILLISECONDS_PER_MINUTE = 60 * 1000;
constexpr int32_t MILLISECONDS_PER_HOUR = 60 * MILLISECONDS_PER_MINUTE;

UDateFormat *openFormat(const UChar *pattern, UErrorCode *status)
{
    return udat_open(UDAT_PATTERN, UDAT_PATTERN, nullptr, nullptr, -1, pattern, -1, status);
}

UChar *rendered(const UDateFormat *format, UDate time)
{
    UErrorCode status = U_ZERO_ERROR;
    return icuText(
        [&](UChar *area, int32_t capacity, UErrorCode *error) {
            return udat_format(format, time, area, capacity, nullptr, error);
        },
        &status);
}

/// The distance of the calendar's zone from UTC at a time, in milliseconds, east counting up.
int32_t zoneOffset(UCalendar *calendar, UDate time)
{
    UErrorCode status = U_ZERO_ERROR;
    ucal_setMillis(calendar, time, &status);
    const int32_t offset = ucal_get(calendar, UCAL_ZONE_OFFSET, &status) +
                           ucal_get(calendar, UCAL_DST_OFFSET, &status);
    return U_SUCCESS(status) ? offset : 0;
}

void addZoneSuffix(CxUStringBuff *out, int32_t offset)
{
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

} // namespace

bool DateFormat::open(const char *pattern)
{
    if (pattern == nullptr)
        return openDefaultForm();
    UErrorCode status = U_ZERO_ERROR;
    const OwnedUStr wide{CxUStringDupStrToUChar(pattern)};
    format_ = wide ? openFormat(wide.get(), &status) : nullptr;
    return format_ != nullptr;
}

bool DateFormat::openDefaultForm()
{
    UErrorCode status = U_ZERO_ERROR;
    showsZone_ = true;
    format_ = openFormat(u"yyyy-MM-dd HH:mm:ss.SSS", &status);
    // Not a calendar of the default zone: another thread may have changed that meanwhile.
    if (format_ != nullptr)
        calendar_ = ucal_clone(udat_getCalendar(format_), &status);
    return format_ != nullptr;
}

void DateFormat::close()
{
    udat_close(format_);
    ucal_close(calendar_);
    *this = DateFormat{};
}

bool DateFormat::isWhole() const
{
    return format_ != nullptr && (calendar_ != nullptr || !showsZone_);
}

void DateFormat::append(CxUStringBuff *out, UDate time) const
{
    const OwnedUStr date{rendered(format_, time)};
    if (CxUStringBuffAppendUStr(out, date.get()) != 0 && showsZone_)
        addZoneSuffix(out, calendar_ != nullptr ? zoneOffset(calendar_, time) : 0);
}

} // namespace zelvo
