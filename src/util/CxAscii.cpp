// SPDX-License-Identifier: Apache-2.0
#include "CxAscii.h"

#include <cstring>
#include <type_traits>

#include <unicode/ucnv.h>

namespace zelvo {
namespace {

/// Of all default converters only the common one is known by its name; the others do the work.
bool leavesAsciiAlone()
{
    const char *name = ZELVO_KEEP != 0 ? ucnv_getDefaultName() : nullptr;
    return name != nullptr && std::strcmp(name, "UTF-8") == 0;
}

/// Looks at every unit rather than stop at the first, so that it looks at many at a time.
template <class Unit>
bool isAscii(const Unit *text, size_t length)
{
    Unit bits = 0;
    for (size_t i = 0; i < length; ++i)
        bits = static_cast<Unit>(bits | text[i]);
    return static_cast<std::make_unsigned_t<Unit>>(bits) < 0x80;
}

} // namespace

bool isCopiedPlainly(const char *text, size_t length)
{
    return isAscii(text, length) && leavesAsciiAlone();
}

bool isCopiedPlainly(const UChar *text, size_t length)
{
    return isAscii(text, length) && leavesAsciiAlone();
}

} // namespace zelvo
