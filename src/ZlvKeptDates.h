// SPDX-License-Identifier: Apache-2.0
// The dates of records, written by kept forms.
#pragma once

#include <unicode/udat.h>

namespace zelvo {

/// The text of a time by an ICU date pattern or, without one, in the default form; null when there
/// is none. The caller frees it. The API mutex is held.
UChar *dateText(const char *pattern, UDate time);

} // namespace zelvo
