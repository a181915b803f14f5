// SPDX-License-Identifier: Apache-2.0
// Hashes of texts, for tables in memory.
#pragma once

#include <cstddef>
#include <cstdint>
#include <cstring>

namespace zelvo {

/// Mixes bytes into a hash.
inline uint64_t mixed(uint64_t hash, const void *bytes, size_t size)
{
    constexpr uint64_t factor = 0x9E3779B97F4A7C15; // odd, with bits all over
    const char *from = static_cast<const char *>(bytes);
    for (size_t done = 0; done < size; done += sizeof(uint64_t)) {
        uint64_t chunk = 0;
        std::memcpy(&chunk, from + done, size - done < sizeof chunk ? size - done : sizeof chunk);
        hash = (hash ^ chunk) * factor;
        hash ^= hash >> 32;
    }
    return hash;
}

/// The same for a zero-terminated text, which may be absent.
inline uint64_t mixed(uint64_t hash, const char *text)
{
    return text != nullptr ? mixed(hash + 1, text, std::strlen(text)) : hash;
}

} // namespace zelvo
