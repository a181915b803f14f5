// SPDX-License-Identifier: Apache-2.0
// How a locale writes 32-bit integers in messages, those of {n,number,integer}.
#pragma once

#include <cstdint>

#include <unicode/umachine.h>

namespace zelvo {

/// The forms of a locale: for each sign and number of digits the text in which the digits have
/// fixed places, between separators and signs that do not depend on them. They are read off what
/// ICU writes, and proved on further samples.
class IntegerText {
public:
    /// Room for the text of any integer, which is not terminated.
    static constexpr int32_t SIZE = 32;

    /// Reads the forms of a locale, null for the default one. False when ICU fails, or when the
    /// locale writes integers in another way than this.
    bool learn(const char *locale);

    /// Writes an integer into an area of SIZE units; gives its length.
    int32_t write(int32_t value, UChar *area) const;

private:
    static constexpr int32_t MOST_DIGITS = 10;

    struct Form {
        UChar text[SIZE];
        uint8_t length;
        uint8_t places[MOST_DIGITS]; ///< of the digits, from the first on
    };

    bool learnDigits(const char *locale);
    bool learnForm(const char *locale, bool isNegative, int32_t digits);
    bool isProved(const char *locale) const;

    UChar digits_[10];
    Form forms_[2][MOST_DIGITS];
};

/// The forms of a locale, kept until close or another default locale; null when they cannot be
/// had. The API mutex is held.
const IntegerText *integerText(const char *locale);

} // namespace zelvo
