// SPDX-License-Identifier: Apache-2.0
// What is kept between records instead of being opened for each again: date formats, patterns of
// messages and bundles. All of it is used and dropped under the API mutex, bounded in number, and
// found again by everything that its results depend on, so that a record reads the same with and
// without. What could not be opened is not kept, nor what another thread changed a default under.
// The build option ZELVO_KEEP turns it off.
#pragma once

#include <cstdint>

#include "CxString.h"

namespace zelvo {

/// The numbers of ICU's present defaults; what was kept under other numbers does not hold.
uint64_t defaultLocaleNumber();
uint64_t defaultZoneNumber();
uint64_t defaultConverterNumber();

/// Lets go of all that is kept. Runs at the end of close.
void dropKept();

void dropKeptDates();
void dropKeptIntegers();
void dropKeptPatterns();
void dropKeptTexts();
void dropKeptBundles();

/// Tells whether two texts, either of which may be absent, are the same.
inline bool isSameOrAbsent(const char *a, const char *b)
{
    return a == nullptr || b == nullptr ? a == b : RkoStringCmp(a, b) == 0;
}

} // namespace zelvo
