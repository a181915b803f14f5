// SPDX-License-Identifier: Apache-2.0
// All that the toolkit keeps between two calls, as lines of text.
#pragma once

#include <string>
#include <vector>

#include "Text.h"

namespace zelvo_test {

using Lines = std::vector<std::string>;

/// Adds a line for each element of a container, or one that says that there is no container.
template <class Container>
void addElements(Lines &lines, const std::string &name, const Container *container)
{
    lines.push_back(name + (container != nullptr ? " has" : " absent"));
    for (auto *node = container != nullptr ? container->first : nullptr; node != nullptr;
         node = node->next)
        lines.push_back(name + " has " + textOf(node));
}

/// Adds the registries of classes, objects and configurations with all that hangs on them.
void addToolkitState(Lines &lines);

/// What is wrong with the registries; nothing when they agree with each other.
Lines registryFlaws();

} // namespace zelvo_test
