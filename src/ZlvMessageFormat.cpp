// SPDX-License-Identifier: Apache-2.0
#include "ZlvMessageFormat.h"

#include <unicode/ustring.h>

#include "CxUString.h"
#include "ZlvKept.h"
#include "ZlvKeptTable.h"
#include "util/CxOwned.h"

namespace zelvo {
namespace {

/// What the reading of a pattern depends on. Its dates, if there are any, are in the default zone.
struct PatternKey {
    const UChar *pattern;
    const char *locale;
    uint64_t defaultLocale;
    uint64_t defaultZone;

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
    const PatternKey key{pattern, locale, defaultLocaleNumber(), defaultZoneNumber()};
    const KeptFormat *found =
        kept.find(key.hash(), [&](const KeptFormat &entry) { return entry.is(key); });
    format_ = found != nullptr ? found->format : openFormat(pattern, locale);
    isKept_ = found != nullptr || (format_ != nullptr && keep(key, format_));
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
