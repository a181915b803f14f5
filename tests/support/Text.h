// SPDX-License-Identifier: Apache-2.0
// Turns strings that the library hands out into values that a test can compare, and frees them.
#pragma once

#include <optional>
#include <string>

#include <unicode/umachine.h>

#include "CxMemory.h"

namespace zelvo_test {

/// Text that may be absent.
using Text = std::optional<std::string>;
/// UTF-16 text that may be absent.
using UText = std::optional<std::u16string>;

/// The text TEXT; nothing when there is none.
inline Text peeked(const char *text)
{
    return text ? Text(text) : std::nullopt;
}
inline UText peeked(const UChar *text)
{
    return text ? UText(text) : std::nullopt;
}

/// The text of a string that belongs to the test now, which frees it; nothing when there is none.
template <class Unit>
auto taken(Unit *owned)
{
    auto text = peeked(static_cast<const Unit *>(owned));
    RkoMemoryFree(owned);
    return text;
}

} // namespace zelvo_test
