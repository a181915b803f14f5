// SPDX-License-Identifier: Apache-2.0
// Resource bundles, opened and kept.
#pragma once

#include <unicode/ures.h>

namespace zelvo {

/// Opens a bundle by its name or path, and if that fails, by what follows the last '/'.
UResourceBundle *openBundle(const char *name, const char *locale, UErrorCode *status);

/// The kept bundle of a name for a locale, opened if need be. Null when it cannot be opened, which
/// the status tells, or cannot be kept. The API mutex is held.
UResourceBundle *keptBundle(const char *name, const char *locale, UErrorCode *status);

} // namespace zelvo
