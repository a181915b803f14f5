// SPDX-License-Identifier: Apache-2.0
// The dates of records, written by kept forms.
#pragma once

#include <unicode/udat.h>

#include "CxUStringBuff.h"

namespace zelvo {

/// Appends a time by an ICU date pattern or, without one, in the default form; nothing when ICU
/// writes nothing or memory ran out. The API mutex is held.
void appendDate(CxUStringBuff *out, const char *pattern, UDate time);

} // namespace zelvo
