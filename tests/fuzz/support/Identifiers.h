// SPDX-License-Identifier: Apache-2.0
// Message identifiers, found by trying each form in turn.
#pragma once

#include <string>
#include <string_view>

#include "support/Fuzz.h"

namespace zelvo_fuzz {

struct IdentifierForm {
    size_t letters;
    size_t digits;
    const char *name;
};

inline constexpr IdentifierForm identifierForms[] = {
    {3, 3, "Ozk3.3.1"}, {3, 4, "Ozk3.4.1"},  {3, 5, "Ozk3.5.1"}, {3, 6, "Ozk3.6.1"},
    {4, 3, "Ozk4.3.1"}, {4, 4, "Ozk4.4.1"},  {4, 5, "Ozk4.5.1"}, {5, 2, "Ozk5.2.1"},
    {5, 3, "Ozk5.3.1"}, {5, 4, "Ozk45.4.1"}, {6, 3, "Ozk6.3.1"},
};

/// Whether a text of bytes or of UTF-16 units begins with an identifier of a form.
template <class Text>
bool hasForm(const Text &text, const IdentifierForm &form)
{
    const size_t severity = form.letters + form.digits;
    if (text.size() <= severity)
        return false;
    for (size_t i = 0; i < severity; ++i) {
        const auto c = static_cast<uint32_t>(text[i]);
        const bool isLetter = (c >= 'A' && c <= 'Z') || (c >= 'a' && c <= 'z');
        const bool isDigit = c >= '0' && c <= '9';
        if (i < form.letters ? !isLetter : !isDigit)
            return false;
    }
    return text[severity] == 'I' || text[severity] == 'W' || text[severity] == 'E';
}

/// The form of the identifier that a text begins with; null when there is none. No text has two:
/// the severity ends the digits, and the first digit ends the letters.
template <class Text>
const IdentifierForm *identifierFormOf(const Text &text)
{
    for (const IdentifierForm &form : identifierForms)
        if (hasForm(text, form))
            return &form;
    return nullptr;
}

} // namespace zelvo_fuzz
