// SPDX-License-Identifier: Apache-2.0
// The defaults of the C library and of ICU that models count on.
#pragma once

#include <cstdlib>

#include <unicode/ucnv.h>
#include <unicode/uloc.h>

#include "support/Fuzz.h"

namespace zelvo_fuzz {

inline void setDefaults()
{
    setenv("TZ", "UTC", 1);
    ucnv_setDefaultName("UTF-8");
    UErrorCode status = U_ZERO_ERROR;
    uloc_setDefault("en_US", &status);
    check(U_SUCCESS(status), "ICU knows the locale of the United States");
}

} // namespace zelvo_fuzz
