// SPDX-License-Identifier: Apache-2.0
// Date formats that are kept between records. Formatters mostly share one or two forms.
#include "ZlvKeptDates.h"

#include "ZlvDateFormat.h"
#include "ZlvKept.h"
#include "ZlvSecondText.h"
#include "util/CxOwned.h"

namespace zelvo {
namespace {

/// A form that is kept, with its pattern and the numbers of the defaults it was opened under.
struct KeptDate {
    char *pattern;
    uint64_t locale;
    uint64_t zone;
    DateFormat format;
    SecondText second;
};

constexpr size_t CAPACITY = 8;
constinit KeptDate kept[CAPACITY]{};
constinit size_t nextToGo = 0;

void drop(KeptDate &date)
{
    date.format.close();
    RkoMemoryFree(date.pattern);
    date = KeptDate{};
}

/// The place of a pattern; else a free one, or the one whose turn it is to go.
KeptDate &placeFor(const char *pattern)
{
    KeptDate *free = nullptr;
    for (KeptDate &date : kept) {
        if (!date.format.isWhole())
            free = &date;
        else if (isSameOrAbsent(date.pattern, pattern))
            return date;
    }
    return free != nullptr ? *free : kept[nextToGo++ % CAPACITY];
}

/// Opens a form in a place; false when it cannot be kept.
bool fill(KeptDate &date, const char *pattern, uint64_t locale, uint64_t zone)
{
    OwnedStr name{RkoStringDup(pattern)};
    drop(date);
    if ((pattern != nullptr && !name) || !date.format.open(pattern) || !date.format.isWhole()) {
        drop(date);
        return false;
    }
    date.pattern = name.take();
    date.locale = locale;
    date.zone = zone;
    return true;
}

/// The kept form of a pattern; null when it cannot be kept.
KeptDate *keptDate(const char *pattern)
{
    const uint64_t locale = defaultLocaleNumber();
    const uint64_t zone = defaultZoneNumber();
    KeptDate &date = placeFor(pattern);
    const bool isFresh = date.format.isWhole() && isSameOrAbsent(date.pattern, pattern) &&
                         date.locale == locale && date.zone == zone;
    return isFresh || fill(date, pattern, locale, zone) ? &date : nullptr;
}

void appendFromScratch(CxUStringBuff *out, const char *pattern, UDate time)
{
    DateFormat format;
    if (format.open(pattern))
        format.append(out, time);
    format.close();
}

} // namespace

void appendDate(CxUStringBuff *out, const char *pattern, UDate time)
{
    if (KeptDate *date = ZELVO_KEEP != 0 ? keptDate(pattern) : nullptr)
        date->second.append(out, date->format, time);
    else
        appendFromScratch(out, pattern, time);
}

void dropKeptDates()
{
    for (KeptDate &date : kept)
        drop(date);
}

} // namespace zelvo
