// SPDX-License-Identifier: Apache-2.0
// Numbers as ICU writes them by a message pattern in the default locale.
#pragma once

#include <unicode/umachine.h>

namespace zelvo {

/// WHOLE has no fraction, FRACTION at most five digits of it; neither has grouping.
enum class NumberForm { WHOLE, FRACTION };

/// The text of a number.
struct NumberText {
    static constexpr int32_t SIZE = 32;
    UChar text[SIZE];
};

/// Writes a number. False when ICU cannot, or its text and terminator need more than the area.
bool writeNumber(NumberForm form, double value, NumberText &result);

/// Lets go of what is kept between numbers.
void dropKeptNumberFormats();

} // namespace zelvo
