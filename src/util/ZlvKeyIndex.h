// SPDX-License-Identifier: Apache-2.0
// Finds the nodes of a large map by their keys: a hash table with linear probing, beside the linked
// nodes. A map does without one as long as it is small, and when there is no memory for one; it is
// an aid, and never says anything that a walk would not.
#pragma once

#include "CxHash.h"
#include "CxMemory.h"
#include "CxString.h"

namespace zelvo {

/// NODE has a `key`, which does not change while the node is in the index, and is not null.
template <class Node>
class KeyIndex {
public:
    /// A map of so many entries is walked faster than it is looked up.
    static constexpr size_t WORTHWHILE = 32;

    /// An index of a chain of nodes; null when memory ran out.
    static KeyIndex *make(Node *first)
    {
        size_t count = 0;
        for (const Node *node = first; node != nullptr; node = node->next)
            ++count;
        KeyIndex *index = makeEmpty(2 * WORTHWHILE, count);
        for (Node *node = first; index != nullptr && node != nullptr; node = node->next)
            if (node->key != nullptr)
                index->place(hashOf(node->key), node);
        return index;
    }

    Node *find(const char *key) const
    {
        const uint64_t hash = hashOf(key);
        for (size_t i = hash & mask_; slots()[i].node != nullptr; i = (i + 1) & mask_)
            if (slots()[i].hash == hash && RkoStringCmp(slots()[i].node->key, key) == 0)
                return slots()[i].node;
        return nullptr;
    }

    /// False, and nothing added, when the index is full and the map needs a new one.
    bool add(Node *node)
    {
        if (2 * (count_ + 1) > mask_ + 1)
            return false;
        place(hashOf(node->key), node);
        return true;
    }

    /// Takes a node out, and moves up those that were kept from its place by it.
    void remove(const Node *node)
    {
        size_t gap = hashOf(node->key) & mask_;
        while (slots()[gap].node != node)
            gap = (gap + 1) & mask_;
        for (size_t i = (gap + 1) & mask_; slots()[i].node != nullptr; i = (i + 1) & mask_) {
            const size_t home = slots()[i].hash & mask_;
            if (((i - home) & mask_) < ((i - gap) & mask_))
                continue;
            slots()[gap] = slots()[i];
            gap = i;
        }
        slots()[gap] = {};
        --count_;
    }

private:
    struct Slot {
        uint64_t hash;
        Node *node;
    };

    static uint64_t hashOf(const char *key) { return mixed(0, key); }

    /// Room for twice the entries, so that half of the slots stay empty for long.
    static KeyIndex *makeEmpty(size_t capacity, size_t entries)
    {
        while (capacity < 4 * entries)
            capacity *= 2;
        void *block = RkoMemoryCalloc(1, sizeof(KeyIndex) + capacity * sizeof(Slot));
        auto *index = static_cast<KeyIndex *>(block);
        if (index != nullptr)
            index->mask_ = capacity - 1;
        return index;
    }

    void place(uint64_t hash, Node *node)
    {
        size_t i = hash & mask_;
        while (slots()[i].node != nullptr)
            i = (i + 1) & mask_;
        slots()[i] = {hash, node};
        ++count_;
    }

    // The slots follow in the same block.
    Slot *slots() { return reinterpret_cast<Slot *>(this + 1); }
    const Slot *slots() const { return reinterpret_cast<const Slot *>(this + 1); }

    size_t mask_;
    size_t count_;
};

} // namespace zelvo
