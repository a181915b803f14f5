// SPDX-License-Identifier: Apache-2.0
// Where the pattern of a message comes from that has a bundle and a key.
#pragma once

#include <unicode/ures.h>

#include "ZlvI18Msg.h"

namespace zelvo {

/// The pattern of a key in a resource bundle, for as long as this stands and no other pattern is
/// asked for. The API mutex is held.
class BundlePattern {
public:
    BundlePattern(const ZlvI18Msg *message, UErrorCode *status);
    BundlePattern(const BundlePattern &) = delete;
    BundlePattern &operator=(const BundlePattern &) = delete;
    ~BundlePattern();

    const UChar *get() const { return pattern_; }

private:
    UResourceBundle *temporary_ = nullptr; ///< a bundle that is not kept, open for the pattern
    const UChar *pattern_ = nullptr;
};

} // namespace zelvo
