// SPDX-License-Identifier: Apache-2.0
// A table of things that are kept, bounded however many there are: a newcomer takes a free place of
// its row, or one of those that stand there, in turn.
#pragma once

#include <cstddef>
#include <cstdint>
#include <cstring>

namespace zelvo {

/// Mixes the bytes of a text into a hash.
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

/// ENTRY has the members `isUsed` and `hash`, and drop(), which makes it unused.
template <class Entry>
class KeptTable {
public:
    /// The entry of a hash for which IS_IT holds; null if there is none.
    template <class IsIt>
    Entry *find(uint64_t hash, IsIt isIt)
    {
        for (Entry &entry : rowOf(hash).places)
            if (entry.isUsed && entry.hash == hash && isIt(entry))
                return &entry;
        return nullptr;
    }

    /// An unused place for a hash.
    Entry &makeRoom(uint64_t hash)
    {
        Row &row = rowOf(hash);
        for (Entry &entry : row.places)
            if (!entry.isUsed)
                return entry;
        Entry &leaving = row.places[row.nextToGo++ % PLACES];
        leaving.drop();
        return leaving;
    }

    void dropAll()
    {
        for (Row &row : rows_)
            for (Entry &entry : row.places)
                entry.drop();
    }

private:
    static constexpr size_t ROWS = 64;
    static constexpr size_t PLACES = 4;

    struct Row {
        Entry places[PLACES];
        uint32_t nextToGo;
    };

    Row &rowOf(uint64_t hash) { return rows_[hash % ROWS]; }

    Row rows_[ROWS]{};
};

} // namespace zelvo
