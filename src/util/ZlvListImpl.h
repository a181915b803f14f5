// SPDX-License-Identifier: Apache-2.0
// Lists: elements in the order of appending, duplicates allowed, counted, sortable, by position.
#pragma once

#include <cstdlib>
#include <type_traits>

#include "ZlvLinksImpl.h"

namespace zelvo {

/// The elements of LIST in an array, which each sort leaves allocated. A function of its own, so
/// that leak checks can name it.
template <class Element, class List>
[[gnu::noinline]] Element *zlvSortScratch(const List *list)
{
    static_assert(std::is_pointer_v<Element>);
    auto *array = static_cast<Element *>(RkoMemoryMalloc(list->count * sizeof(void *)));
    if (array == nullptr)
        return nullptr;
    Element *slot = array;
    for (auto *node = list->first; node != nullptr; node = node->next)
        *slot++ = node->element;
    return array;
}

/// The operations of a list; the traits T say how an element is taken in, handed out, let go and
/// compared.
template <class T>
struct ListImpl : Elements<T> {
    using List = typename T::Header;
    using Node = typename T::Node;
    using Element = typename T::Element;
    using Given = typename T::Given;
    using Compare = int (*)(const void *, const void *);

    static bool append(List *list, Given element)
    {
        if (list == nullptr || element == nullptr || !Elements<T>::append(list, element))
            return false;
        ++list->count;
        return true;
    }

    static List *copy(const List *list)
    {
        List *copied = list == nullptr ? nullptr : allocRecord<List>();
        if (copied == nullptr)
            return nullptr;
        for (Node *node = list->first; node != nullptr; node = node->next)
            append(copied, node->element);
        return copied;
    }

    static void removeLink(List *list, Node *node)
    {
        if (list == nullptr || node == nullptr)
            return;
        --list->count;
        Elements<T>::remove(list, node);
    }

    static void free(List *list)
    {
        if (list == nullptr)
            return;
        while (list->first != nullptr)
            removeLink(list, list->first);
        dispose<T::deferred>(list);
    }

    /// Gives the next node, from which the caller goes on.
    static Node *iterRemove(Node *node)
    {
        if (node == nullptr)
            return nullptr;
        Node *next = node->next;
        removeLink(node->owner, node);
        return next;
    }

    static Element getIndex(const List *list, int32_t position)
    {
        if (position < 0)
            return nullptr;
        Node *node = firstNode(list);
        while (node != nullptr && position-- > 0)
            node = node->next;
        return node == nullptr ? nullptr : node->element;
    }

    /// The nodes stay where they are and exchange their elements, so nodes that callers hold stay
    /// valid.
    static void sort(List *list, Compare compare)
    {
        if (list == nullptr || compare == nullptr)
            return;
        Element *sorted = zlvSortScratch<Element>(list);
        if (sorted == nullptr)
            return;
        std::qsort(sorted, list->count, sizeof(Element), compare);
        for (Node *node = list->first; node != nullptr; node = node->next)
            node->element = *sorted++;
    }
};

} // namespace zelvo
