// SPDX-License-Identifier: Apache-2.0
// Argument lists for calls that take a va_list.
#pragma once

#include <cstdarg>
#include <cstddef>

namespace zelvo_test {

/// No argument list at all: where a va_list parameter is a pointer, as on x86-64, it can be null.
inline std::nullptr_t noArgs()
{
    return nullptr;
}

/// Calls ACTION, which captures by reference, with an argument list that holds what follows it.
template <class Action>
void withArgs(Action action, ...)
{
    va_list args;
    va_start(args, action);
    action(args);
    va_end(args);
}

} // namespace zelvo_test
