// SPDX-License-Identifier: Apache-2.0
// Where the pattern of a message comes from that has a bundle and a key.
#pragma once

#include <unicode/ures.h>

#include "CxString.h"
#include "ZlvI18Msg.h"

namespace zelvo {

/// The pattern of a key in a resource bundle, for as long as the bundle is open.
class BundlePattern {
public:
    BundlePattern(const ZlvI18Msg *message, UErrorCode *status)
        : bundle_(open(message->bundle, message->locale, status)),
          pattern_(find(bundle_, message->key, status))
    {
    }
    BundlePattern(const BundlePattern &) = delete;
    BundlePattern &operator=(const BundlePattern &) = delete;
    ~BundlePattern() { ures_close(bundle_); }

    const UChar *get() const { return pattern_; }

private:
    static UResourceBundle *open(const char *name, const char *locale, UErrorCode *status)
    {
        UResourceBundle *bundle = ures_open(name, locale, status);
        const char *slash = U_FAILURE(*status) ? RkoStringRChr(name, '/') : nullptr;
        if (slash == nullptr)
            return bundle;
        *status = U_ZERO_ERROR;
        return ures_open(slash + 1, locale, status);
    }

    static const UChar *find(UResourceBundle *bundle, const char *key, UErrorCode *status)
    {
        int32_t length = 0;
        return ures_getStringByKey(bundle, key, &length, status);
    }

    UResourceBundle *bundle_;
    const UChar *pattern_;
};

} // namespace zelvo
