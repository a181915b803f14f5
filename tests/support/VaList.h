// SPDX-License-Identifier: Apache-2.0
// Argument lists for calls that take a va_list.
#pragma once

#include <cstdarg>
#include <type_traits>

namespace zelvo_test {

/// What a va_list becomes as a function's parameter.
using VaListParm = std::decay_t<va_list>;
static_assert(std::is_pointer_v<VaListParm>, "only here can an argument list be absent");

/// No argument list at all.
inline VaListParm noArgs()
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
