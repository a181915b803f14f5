// SPDX-License-Identifier: Apache-2.0
// Date formats that are kept between records. Formatters mostly share one or two forms.
#include "ZlvKeptDates.h"

#include "ZlvDateFormat.h"
#include "ZlvKept.h"
#include "ZlvSecondText.h"
#include "util/CxOwned.h"

namespace zelvo {
namespace {

/// The numbers of the defaults that a form is opened under; the converter reads its pattern.
struct Defaults {
    uint64_t locale;
    uint64_t zone;
    uint64_t converter;

    static Defaults present()
    {
        return {defaultLocaleNumber(), defaultZoneNumber(), defaultConverterNumber()};
    }

    bool operator==(const Defaults &) const = default;
};

/// A form that is kept.
struct KeptDate {
    char *pattern;
    Defaults defaults;
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
bool fill(KeptDate &date, const char *pattern, const Defaults &defaults)
{
    OwnedStr name{RkoStringDup(pattern)};
    drop(date);
    const bool isOpen = (pattern == nullptr || name) && date.format.open(pattern);
    if (!isOpen || !date.format.isWhole() || defaults != Defaults::present()) {
        drop(date);
        return false;
    }
    date.pattern = name.take();
    date.defaults = defaults;
    return true;
}

/// The kept form of a pattern; null when it cannot be kept.
KeptDate *keptDate(const char *pattern)
{
    const Defaults defaults = Defaults::present();
    KeptDate &date = placeFor(pattern);
    const bool isFresh =
        date.format.isWhole() && isSameOrAbsent(date.pattern, pattern) && date.defaults == defaults;
    return isFresh || fill(date, pattern, defaults) ? &date : nullptr;
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
