// SPDX-License-Identifier: Apache-2.0
// The ways of writing integers that are kept, each for one locale. They stay where they are until
// close, so that nobody's pointer dangles; locales beyond the capacity go without.
#include "ZlvIntegerText.h"
#include "ZlvKept.h"
#include "util/CxOwned.h"

namespace zelvo {
namespace {

struct KeptIntegers {
    char *locale;
    uint64_t defaultLocale;
    IntegerText forms;
    bool isUsed;
    bool isRegular; ///< the locale's integers have the forms in `forms`
};

constexpr size_t CAPACITY = 16;
constinit KeptIntegers kept[CAPACITY]{};

void drop(KeptIntegers &integers)
{
    RkoMemoryFree(integers.locale);
    integers.locale = nullptr;
    integers.isUsed = false;
}

KeptIntegers *find(const char *locale, uint64_t defaultLocale)
{
    for (KeptIntegers &integers : kept)
        if (integers.isUsed && integers.defaultLocale == defaultLocale &&
            isSameOrAbsent(integers.locale, locale))
            return &integers;
    return nullptr;
}

/// A place that is free, or whose default locale is no longer the default.
KeptIntegers *freePlace(uint64_t defaultLocale)
{
    for (KeptIntegers &integers : kept)
        if (!integers.isUsed || integers.defaultLocale != defaultLocale)
            return &integers;
    return nullptr;
}

KeptIntegers *learn(const char *locale, uint64_t defaultLocale)
{
    KeptIntegers *integers = freePlace(defaultLocale);
    OwnedStr name{RkoStringDup(locale)};
    if (integers == nullptr || (locale != nullptr && !name))
        return nullptr;
    drop(*integers);
    integers->isRegular = integers->forms.learn(locale);
    integers->locale = name.take();
    integers->defaultLocale = defaultLocale;
    integers->isUsed = defaultLocaleNumber() == defaultLocale;
    return integers->isUsed ? integers : nullptr;
}

} // namespace

const IntegerText *integerText(const char *locale)
{
    const uint64_t defaultLocale = defaultLocaleNumber();
    const KeptIntegers *integers = find(locale, defaultLocale);
    if (integers == nullptr)
        integers = learn(locale, defaultLocale);
    return integers != nullptr && integers->isRegular ? &integers->forms : nullptr;
}

void dropKeptIntegers()
{
    for (KeptIntegers &integers : kept)
        drop(integers);
}

} // namespace zelvo
