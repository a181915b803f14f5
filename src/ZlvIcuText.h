// SPDX-License-Identifier: Apache-2.0
// Text out of ICU calls that write into an area and tell how much they would need.
#pragma once

#include <cstddef>
#include <cstdint>

#include <unicode/utypes.h>

#include "CxUString.h"
#include "util/CxOwned.h"

namespace zelvo {

/// Runs WRITE(area, capacity, status) -> length needed, and gives what it wrote as a new string. A
/// text that fits into the first area, as nearly all do, is made in one run; else it is made again
/// in an area of the right size, and `status` tells how that run went. Null when the text is empty,
/// a run failed or memory ran out; a failure of the first run leaves `status` alone.
template <class Write>
UChar *icuText(Write write, UErrorCode *status)
{
    constexpr int32_t firstCapacity = 256;
    UChar first[firstCapacity];
    UErrorCode measured = U_ZERO_ERROR;
    const int32_t length = write(first, firstCapacity, &measured);
    const bool tooLong = length >= firstCapacity && length < INT32_MAX &&
                         (U_SUCCESS(measured) || measured == U_BUFFER_OVERFLOW_ERROR);
    if (!tooLong)
        return U_SUCCESS(measured) && length > 0 ? CxUStringDup(first) : nullptr;

    const size_t units = static_cast<size_t>(length) + 1;
    OwnedUStr area{static_cast<UChar *>(RkoMemoryMalloc(units * sizeof(UChar)))};
    if (!area)
        return nullptr;
    write(area.get(), length + 1, status);
    return U_SUCCESS(*status) ? area.take() : nullptr;
}

} // namespace zelvo
