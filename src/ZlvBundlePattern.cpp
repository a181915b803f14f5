// SPDX-License-Identifier: Apache-2.0
// Patterns are kept as copies: a bundle can be closed without asking whose text it holds.
#include "ZlvBundlePattern.h"

#include "CxString.h"
#include "CxUString.h"
#include "ZlvKept.h"
#include "ZlvKeptBundles.h"
#include "ZlvKeptTable.h"
#include "util/CxOwned.h"

namespace zelvo {
namespace {

/// What the pattern of a message depends on: a bundle without the locale asked for answers in the
/// default one.
struct TextKey {
    const ZlvI18Msg *message;
    uint64_t defaultLocale;

    uint64_t hash() const
    {
        return mixed(mixed(mixed(0, message->bundle), message->key), message->locale);
    }
};

struct KeptText {
    bool isUsed;
    uint64_t hash;
    char *bundle;
    char *key;
    char *locale;
    uint64_t defaultLocale;
    UChar *pattern;

    bool is(const TextKey &wanted) const
    {
        return defaultLocale == wanted.defaultLocale &&
               RkoStringCmp(key, wanted.message->key) == 0 &&
               RkoStringCmp(bundle, wanted.message->bundle) == 0 &&
               isSameOrAbsent(locale, wanted.message->locale);
    }

    bool isWhole(const ZlvI18Msg *message) const
    {
        return bundle != nullptr && key != nullptr && pattern != nullptr &&
               (locale != nullptr || message->locale == nullptr);
    }

    void drop()
    {
        RkoMemoryFree(bundle);
        RkoMemoryFree(key);
        RkoMemoryFree(locale);
        RkoMemoryFree(pattern);
        *this = {};
    }
};

constinit KeptTable<KeptText> kept;

void keep(const TextKey &key, const UChar *pattern)
{
    const ZlvI18Msg *message = key.message;
    const uint64_t hash = key.hash();
    KeptText &text = kept.makeRoom(hash);
    text = {true,
            hash,
            RkoStringDup(message->bundle),
            RkoStringDup(message->key),
            RkoStringDup(message->locale),
            key.defaultLocale,
            CxUStringDup(pattern)};
    if (!text.isWhole(message))
        text.drop();
}

} // namespace

BundlePattern::BundlePattern(const ZlvI18Msg *message, UErrorCode *status)
{
    const bool keeps = ZELVO_KEEP != 0 && message->key != nullptr;
    const TextKey key{message, keeps ? defaultLocaleNumber() : 0};
    const KeptText *found =
        keeps ? kept.find(key.hash(), [&](const KeptText &text) { return text.is(key); }) : nullptr;
    if (found != nullptr) {
        pattern_ = found->pattern;
        return;
    }
    UResourceBundle *bundle = keptBundle(message->bundle, message->locale, status);
    if (bundle == nullptr && U_SUCCESS(*status))
        bundle = temporary_ = openBundle(message->bundle, message->locale, status);
    int32_t length = 0;
    pattern_ = ures_getStringByKey(bundle, message->key, &length, status);
    if (keeps && U_SUCCESS(*status) && key.defaultLocale == defaultLocaleNumber())
        keep(key, pattern_);
}

BundlePattern::~BundlePattern()
{
    ures_close(temporary_);
}

void dropKeptTexts()
{
    kept.dropAll();
}

} // namespace zelvo
