// SPDX-License-Identifier: Apache-2.0
// Date formats that are kept between records. Formatters mostly share one or two forms.
#include "ZlvKeptDates.h"

#include <unicode/ustring.h>

#include "ZlvDateFormat.h"
#include "ZlvKept.h"
#include "ZlvRecord.h"
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

/// Tells whether a form lacks nothing. ICU reports no failure for a part that it had no memory for,
/// and makes some parts no earlier than at the third use. So another form, opened after the first
/// has been used, has to write the same each time.
bool isSound(const DateFormat &format, const char *pattern)
{
    constexpr int USES = 4;
    constexpr UDate SAMPLE = 1234567890123;
    Record written;
    for (int use = 0; use < USES; ++use)
        format.append(written.text(), SAMPLE);
    Record expected;
    DateFormat other;
    for (int use = 0; use < USES && (use > 0 || other.open(pattern)); ++use)
        other.append(expected.text(), SAMPLE);
    other.close();
    const OwnedUStr first{written.take()};
    const OwnedUStr second{expected.take()};
    return first && second && u_strcmp(first.get(), second.get()) == 0;
}

/// Opens a form in a place; false when it cannot be kept.
bool fill(KeptDate &date, const char *pattern, const Defaults &defaults)
{
    OwnedStr name{RkoStringDup(pattern)};
    drop(date);
    const bool isOpen = (pattern == nullptr || name) && date.format.open(pattern);
    if (!isOpen || !date.format.isWhole() || !isSound(date.format, pattern) ||
        defaults != Defaults::present()) {
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
