// SPDX-License-Identifier: Apache-2.0
#include "CxIcuDefaults.h"

#include <unicode/ucal.h>
#include <unicode/ucnv.h>
#include <unicode/uloc.h>

namespace zelvo {

uint64_t DefaultLocale::number()
{
    const char *name = uloc_getDefault();
    return name_.numberOf(name, std::strlen(name));
}

uint64_t DefaultZone::number()
{
    UChar name[CAPACITY];
    UErrorCode status = U_ZERO_ERROR;
    const int32_t length = ucal_getDefaultTimeZone(name, CAPACITY, &status);
    const bool isKnown = U_SUCCESS(status) && length < CAPACITY;
    return name_.numberOf(name, isKnown ? static_cast<size_t>(length) : size_t{CAPACITY});
}

uint64_t DefaultConverter::number()
{
    const char *name = ucnv_getDefaultName();
    return name_.numberOf(name, name != nullptr ? std::strlen(name) : SIZE_MAX);
}

} // namespace zelvo
