// SPDX-License-Identifier: Apache-2.0
// Maps from an exact string key to a value, iterated in the order in which the keys were first put.
#pragma once

#include "ZlvKeyIndex.h"
#include "ZlvLinksImpl.h"

namespace zelvo {

/// The operations of a map; the traits T say how a value is taken in, handed out and let go.
template <class T>
struct MapImpl {
    using Map = typename T::Header;
    using Node = typename T::Node;
    using Value = typename T::Element;
    using Given = typename T::Given;

    static Node *getNode(const Map *map, const char *key)
    {
        if (map == nullptr || key == nullptr)
            return nullptr;
        return map->index != nullptr ? indexOf(map)->find(key) : walkTo(map, key);
    }

    static bool put(Map *map, const char *key, Given value)
    {
        if (map == nullptr || key == nullptr)
            return false;
        Node *node = getNode(map, key);
        if (node == nullptr)
            return append(map, key, value);
        replace(node, value);
        return true;
    }

    static Map *copy(const Map *map)
    {
        Map *copied = map == nullptr ? nullptr : allocRecord<Map>();
        if (copied == nullptr)
            return nullptr;
        for (Node *node = map->first; node != nullptr; node = node->next)
            put(copied, node->key, node->value);
        return copied;
    }

    static Value get(const Map *map, const char *key) { return iterGetVal(getNode(map, key)); }
    static bool hasKey(const Map *map, const char *key) { return getNode(map, key) != nullptr; }
    static void remove(Map *map, const char *key) { removeNode(map, getNode(map, key)); }

    static char *iterGetKey(const Node *node)
    {
        return node == nullptr ? nullptr : RkoStringDup(node->key);
    }

    static Value iterGetVal(const Node *node)
    {
        return node == nullptr ? nullptr : T::handOut(node->value);
    }

    /// A removed node names no map any more, so that removing it once more does nothing. It keeps
    /// its value, uncounted, for a walk that stands on it.
    static void removeNode(Map *map, Node *node)
    {
        if (map == nullptr || node == nullptr || node->map != map)
            return;
        Value value = node->value;
        if (map->index != nullptr && node->key != nullptr)
            indexOf(map)->remove(node);
        unlinkNode(map, node);
        RkoMemoryFree(node->key);
        node->key = nullptr;
        node->map = nullptr;
        dispose<T::deferred>(node);
        T::letGo(value);
    }

    static void free(Map *map)
    {
        if (map == nullptr)
            return;
        while (map->first != nullptr)
            removeNode(map, map->first);
        RkoMemoryFree(map->index);
        RkoMemoryFree(map);
    }

private:
    using Index = KeyIndex<Node>;

    static Index *indexOf(const Map *map) { return static_cast<Index *>(map->index); }

    /// Walks, and makes an index after a long way. It does not change what the map holds.
    static Node *walkTo(const Map *map, const char *key)
    {
        size_t steps = 0;
        Node *node = map->first;
        for (; node != nullptr && !sameText(node->key, key); ++steps)
            node = node->next;
        if (steps > Index::WORTHWHILE)
            const_cast<Map *>(map)->index = Index::make(map->first);
        return node;
    }

    /// An index without room is given up; the next long walk makes a larger one.
    static void addToIndex(Map *map, Node *node)
    {
        if (map->index == nullptr || node->key == nullptr || indexOf(map)->add(node))
            return;
        RkoMemoryFree(map->index);
        map->index = nullptr;
    }

    /// A key or value that could not be copied is linked as null.
    static bool append(Map *map, const char *key, Given value)
    {
        Node *node = allocRecord<Node>();
        if (node == nullptr)
            return false;
        node->key = RkoStringDup(key);
        node->value = T::takeIn(value);
        node->map = map;
        linkLast(map, node);
        addToIndex(map, node);
        return true;
    }

    /// The new value comes in before the old one goes: it may be part of the old one, or live
    /// only as long as that does. Putting the stored value itself changes nothing.
    static void replace(Node *node, Given value)
    {
        if (node->value == value)
            return;
        Value old = node->value;
        node->value = T::takeIn(value);
        T::letGo(old);
    }
};

} // namespace zelvo
