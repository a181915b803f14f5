// SPDX-License-Identifier: Apache-2.0
// A list that only grows at its front: readers walk it without a lock, and a writer tries again
// when another one was faster.
#include "ZlvLocaleName.h"

#include <atomic>
#include <cstring>
#include <new>

#include "CxMemory.h"

namespace zelvo {
namespace {

/// A node; the characters of the name follow it in the same block.
struct LocaleName {
    const LocaleName *next;

    const char *name() const { return reinterpret_cast<const char *>(this + 1); }
};

constinit std::atomic<const LocaleName *> newestName{nullptr};

const LocaleName *find(const LocaleName *newest, const char *name)
{
    const LocaleName *node = newest;
    while (node != nullptr && std::strcmp(node->name(), name) != 0)
        node = node->next;
    return node;
}

LocaleName *makeNode(const char *name)
{
    const size_t size = std::strlen(name) + 1;
    void *block = RkoMemoryMalloc(sizeof(LocaleName) + size);
    if (block == nullptr)
        return nullptr;
    std::memcpy(static_cast<char *>(block) + sizeof(LocaleName), name, size);
    return new (block) LocaleName{nullptr};
}

/// Puts a node in front unless another thread has brought in the same name; gives the one listed.
const LocaleName *publish(LocaleName *node)
{
    node->next = newestName.load(std::memory_order_acquire);
    do {
        if (const LocaleName *other = find(node->next, node->name())) {
            RkoMemoryFree(node);
            return other;
        }
    } while (!newestName.compare_exchange_weak(node->next, node, std::memory_order_acq_rel));
    return node;
}

} // namespace

const char *internLocaleName(const char *name)
{
    if (name == nullptr)
        return nullptr;
    if (const LocaleName *known = find(newestName.load(std::memory_order_acquire), name))
        return known->name();
    LocaleName *node = makeNode(name);
    return node != nullptr ? publish(node)->name() : nullptr;
}

} // namespace zelvo
