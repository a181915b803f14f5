// SPDX-License-Identifier: Apache-2.0
// The growth rule that the buffers and arrays of this folder share.
#pragma once

#include <cstdint>

namespace zelvo {

/// The first number among start, 2 * start, 4 * start ... that exceeds a need. Neither is above
/// 2^34, so that nothing overflows here; the caller checks whether the result fits its own field.
inline uint64_t doubledPast(uint64_t start, uint64_t need)
{
    while (start <= need)
        start *= 2;
    return start;
}

/// The capacity a container must have for a need: its present one (0 before the first allocation)
/// if that is enough, else its present or first one, doubled until it exceeds the need.
inline uint64_t capacityFor(uint64_t present, uint64_t first, uint64_t need)
{
    const uint64_t start = present == 0 ? first : present;
    return start >= need ? start : doubledPast(start, need);
}

} // namespace zelvo
