// SPDX-License-Identifier: Apache-2.0
// A table of things that are kept, bounded however many there are: a newcomer takes a free place of
// its row, or one of those that stand there, in turn.
#pragma once

#include <cstddef>
#include <cstdint>

#include "util/CxHash.h"

namespace zelvo {

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
