// SPDX-License-Identifier: Apache-2.0
// Groups: sets in the order of adding.
#pragma once

#include "ZlvLinksImpl.h"

namespace zelvo {

/// The operations of a group; the traits T say how an element is taken in, handed out, let go and
/// compared.
template <class T>
struct GroupImpl : Elements<T> {
    using Group = typename T::Header;
    using Node = typename T::Node;
    using Given = typename T::Given;
    using Elements<T>::getLink;
    using Elements<T>::remove;

    static bool add(Group *group, Given element)
    {
        if (group == nullptr || element == nullptr || getLink(group, element) != nullptr)
            return false;
        return Elements<T>::append(group, element);
    }

    static bool removeElement(Group *group, Given element)
    {
        Node *node = getLink(group, element);
        if (node == nullptr)
            return false;
        remove(group, node);
        return true;
    }

    /// Goes by node, not by element: an element may equal nothing any more, and the walk must end.
    static void free(Group *group)
    {
        if (group == nullptr)
            return;
        while (group->first != nullptr)
            remove(group, group->first);
        dispose<T::deferred>(group);
    }

    /// Gives the next node, from which the caller goes on. A node that class functions removed in
    /// the meantime has no owner any more, only its neighbours.
    static Node *iterRemove(Node *node)
    {
        if (node == nullptr)
            return nullptr;
        Node *next = node->next;
        if (node->element != nullptr)
            remove(node->owner, node);
        return next;
    }
};

} // namespace zelvo
