// SPDX-License-Identifier: Apache-2.0
// What lists, groups and maps share: doubly linked nodes below a header with `first` and `last`.
//
// Letting an element go may run class functions, which may come back and change the same container.
// So a node is first unlinked and disposed of, and its element goes last; where class functions can
// run, memory is not freed but deferred, and an unlinked node keeps its neighbours, so that a walk
// that stands on it goes on.
#pragma once

#include <cstring>

#include "CxMemory.h"
#include "CxString.h"
#include "ZlvDeferredFree.h"

namespace zelvo {

/// A record with every field zero; null when memory ran out.
template <class Record>
Record *allocRecord()
{
    return static_cast<Record *>(RkoMemoryCalloc(1, sizeof(Record)));
}

/// Gives back the memory of a header or node: at once, or when nobody can stand on it any more.
template <bool deferred, class Record>
void dispose(Record *record)
{
    if constexpr (deferred)
        defer(record);
    else
        RkoMemoryFree(record);
}

/// Exact equality; null equals nothing. The first byte settles most steps of a lookup.
inline bool sameText(const char *a, const char *b)
{
    return a != nullptr && b != nullptr && *a == *b && std::strcmp(a, b) == 0;
}

template <class Header>
auto firstNode(const Header *header) -> decltype(header->first)
{
    return header == nullptr ? nullptr : header->first;
}

template <class Node>
Node *nextNode(Node *node)
{
    return node == nullptr ? nullptr : node->next;
}

template <class Header, class Node>
void linkLast(Header *header, Node *node)
{
    node->prev = header->last;
    if (header->last != nullptr)
        header->last->next = node;
    else
        header->first = node;
    header->last = node;
}

/// Joins the neighbours of NODE and repairs the header; NODE itself keeps its neighbours.
template <class Header, class Node>
void unlinkNode(Header *header, Node *node)
{
    if (node->prev != nullptr)
        node->prev->next = node->next;
    if (node->next != nullptr)
        node->next->prev = node->prev;
    if (header->first == node)
        header->first = node->next;
    if (header->last == node)
        header->last = node->prev;
}

/// What lists and groups do alike with their elements; the traits T say how one element is taken
/// in, handed out, let go and compared.
template <class T>
struct Elements {
    using Header = typename T::Header;
    using Node = typename T::Node;
    using Element = typename T::Element;
    using Given = typename T::Given;

    /// The oldest node whose element equals ELEMENT.
    static Node *getLink(const Header *header, Given element)
    {
        if (element == nullptr)
            return nullptr;
        Node *node = firstNode(header);
        while (node != nullptr && !T::same(node->element, element))
            node = node->next;
        return node;
    }

    static Element iterGet(const Node *node)
    {
        return node == nullptr ? nullptr : T::handOut(node->element);
    }

    /// Links ELEMENT, which is not null, at the end; without memory for it nothing changes.
    static bool append(Header *header, Given element)
    {
        Node *node = allocRecord<Node>();
        if (node == nullptr)
            return false;
        node->element = T::takeIn(element);
        if (node->element == nullptr) {
            RkoMemoryFree(node);
            return false;
        }
        node->owner = header;
        linkLast(header, node);
        return true;
    }

    /// A node without an element is one that was removed already.
    static void remove(Header *header, Node *node)
    {
        Element element = node->element;
        unlinkNode(header, node);
        node->element = nullptr;
        dispose<T::deferred>(node);
        T::letGo(element);
    }
};

} // namespace zelvo
