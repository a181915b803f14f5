// SPDX-License-Identifier: Apache-2.0
#include "ZlvMessageFormat.h"

#include <unicode/ustring.h>

#include "CxUString.h"
#include "ZlvKept.h"
#include "ZlvKeptTable.h"
#include "util/CxOwned.h"

namespace zelvo {
namespace {

/// What the reading of a pattern depends on. The zone matters to its dates, if there are any.
struct PatternKey {
    const UChar *pattern;
    const char *locale;
    uint64_t defaultLocale;
    uint64_t defaultZone;

    /// Tells whether another key of the same pattern names the same defaults.
    bool isAs(const PatternKey &other) const
    {
        return defaultLocale == other.defaultLocale && defaultZone == other.defaultZone;
    }

    uint64_t hash() const
    {
        const auto length = static_cast<size_t>(u_strlen(pattern));
        return mixed(mixed(0, locale), pattern, length * sizeof(UChar));
    }
};

struct KeptFormat {
    bool isUsed;
    uint64_t hash;
    UChar *pattern;
    char *locale;
    uint64_t defaultLocale;
    uint64_t defaultZone;
    UMessageFormat *format;

    bool is(const PatternKey &key) const
    {
        return defaultLocale == key.defaultLocale && defaultZone == key.defaultZone &&
               isSameOrAbsent(locale, key.locale) && u_strcmp(pattern, key.pattern) == 0;
    }

    void drop()
    {
        umsg_close(format);
        RkoMemoryFree(pattern);
        RkoMemoryFree(locale);
        *this = {};
    }
};

constinit KeptTable<KeptFormat> kept;

/// Tells whether a text begins with a word, in ASCII letters of either case.
bool beginsWith(const UChar *text, const char *word)
{
    for (; *word != '\0'; ++text, ++word)
        if ((*text | 0x20) != *word)
            return false;
    return true;
}

/// Tells whether a pattern may ask for dates; text that reads like it counts too. The others do
/// without the default zone. ICU finds the zone out, from the environment, when it is asked for the
/// first time, and that must not be earlier than without keeping.
bool mayShowDates(const UChar *pattern)
{
    for (const UChar *c = u_strchr(pattern, u','); c != nullptr && *c != 0; ++c)
        if (beginsWith(c, "date") || beginsWith(c, "time"))
            return true;
    return false;
}

PatternKey keyOf(const UChar *pattern, const char *locale)
{
    const uint64_t zone = mayShowDates(pattern) ? defaultZoneNumber() : 0;
    return {pattern, locale, defaultLocaleNumber(), zone};
}

UMessageFormat *openFormat(const UChar *pattern, const char *locale)
{
    UErrorCode status = U_ZERO_ERROR;
    UMessageFormat *format = umsg_open(pattern, -1, locale, nullptr, &status);
    if (U_SUCCESS(status))
        return format;
    umsg_close(format); // ICU may give one that it has refused
    return nullptr;
}

/// Tells whether the format is kept from now on.
bool keep(const PatternKey &key, UMessageFormat *format)
{
    OwnedUStr pattern{CxUStringDup(key.pattern)};
    OwnedStr locale{RkoStringDup(key.locale)};
    if (!pattern || (!locale && key.locale != nullptr))
        return false;
    const uint64_t hash = key.hash();
    kept.makeRoom(hash) = {
        true, hash, pattern.take(), locale.take(), key.defaultLocale, key.defaultZone, format};
    return true;
}

} // namespace

MessageFormat::MessageFormat(const UChar *pattern, const char *locale)
{
    if (ZELVO_KEEP == 0) {
        format_ = openFormat(pattern, locale);
        return;
    }
    const PatternKey key = keyOf(pattern, locale);
    const KeptFormat *found =
        kept.find(key.hash(), [&](const KeptFormat &entry) { return entry.is(key); });
    format_ = found != nullptr ? found->format : openFormat(pattern, locale);
    isKept_ = found != nullptr ||
              (format_ != nullptr && key.isAs(keyOf(pattern, locale)) && keep(key, format_));
}

MessageFormat::~MessageFormat()
{
    if (!isKept_)
        umsg_close(format_);
}

void dropKeptPatterns()
{
    kept.dropAll();
}

} // namespace zelvo
