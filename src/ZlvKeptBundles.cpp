// SPDX-License-Identifier: Apache-2.0
#include "ZlvKeptBundles.h"

#include "CxString.h"
#include "ZlvKept.h"
#include "util/CxOwned.h"

namespace zelvo {
namespace {

struct KeptBundle {
    char *name;
    char *locale;
    uint64_t defaultLocale;
    UResourceBundle *bundle; ///< null if the place is free

    void drop()
    {
        ures_close(bundle);
        RkoMemoryFree(name);
        RkoMemoryFree(locale);
        *this = {};
    }
};

constexpr size_t CAPACITY = 8;
constinit KeptBundle kept[CAPACITY]{};
constinit size_t nextToGo = 0;

KeptBundle *find(const char *name, const char *locale, uint64_t defaultLocale)
{
    for (KeptBundle &place : kept)
        if (place.bundle != nullptr && place.defaultLocale == defaultLocale &&
            RkoStringCmp(place.name, name) == 0 && isSameOrAbsent(place.locale, locale))
            return &place;
    return nullptr;
}

KeptBundle &makeRoom()
{
    for (KeptBundle &place : kept)
        if (place.bundle == nullptr)
            return place;
    KeptBundle &leaving = kept[nextToGo++ % CAPACITY];
    leaving.drop();
    return leaving;
}

} // namespace

UResourceBundle *openBundle(const char *name, const char *locale, UErrorCode *status)
{
    UResourceBundle *bundle = ures_open(name, locale, status);
    const char *slash = U_FAILURE(*status) ? RkoStringRChr(name, '/') : nullptr;
    if (slash == nullptr)
        return bundle;
    *status = U_ZERO_ERROR;
    return ures_open(slash + 1, locale, status);
}

UResourceBundle *keptBundle(const char *name, const char *locale, UErrorCode *status)
{
    if (ZELVO_KEEP == 0)
        return nullptr;
    const uint64_t defaultLocale = defaultLocaleNumber();
    if (const KeptBundle *found = find(name, locale, defaultLocale))
        return found->bundle;
    OwnedStr nameCopy{RkoStringDup(name)};
    OwnedStr localeCopy{RkoStringDup(locale)};
    if (!nameCopy || (!localeCopy && locale != nullptr))
        return nullptr;
    UResourceBundle *bundle = openBundle(name, locale, status);
    if (bundle == nullptr || U_FAILURE(*status) || defaultLocaleNumber() != defaultLocale) {
        ures_close(bundle);
        return nullptr;
    }
    makeRoom() = {nameCopy.take(), localeCopy.take(), defaultLocale, bundle};
    return bundle;
}

void dropKeptBundles()
{
    for (KeptBundle &place : kept)
        place.drop();
}

} // namespace zelvo
