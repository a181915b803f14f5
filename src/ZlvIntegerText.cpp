// SPDX-License-Identifier: Apache-2.0
#include "ZlvIntegerText.h"

#include <cstring>
#include <string_view>

#include <unicode/umsg.h>

namespace zelvo {
namespace {

/// A number as ICU writes it; empty when it fails.
struct Written {
    UChar text[IntegerText::SIZE];
    int32_t length;

    std::u16string_view view() const { return {text, static_cast<size_t>(length)}; }
};

Written writtenByIcu(const char *locale, int32_t value)
{
    constexpr std::u16string_view pattern = u"{0,number,integer}";
    Written result{};
    UErrorCode status = U_ZERO_ERROR;
    const int32_t length =
        u_formatMessage(locale, pattern.data(), static_cast<int32_t>(pattern.size()), result.text,
                        IntegerText::SIZE, &status, value);
    result.length = U_SUCCESS(status) && length < IntegerText::SIZE ? length : 0;
    return result;
}

/// So many ones, as far as a 32-bit number has digits.
int32_t ones(int32_t digits)
{
    int32_t number = 0;
    for (int32_t i = 0; i < digits; ++i)
        number = number * 10 + 1;
    return number;
}

/// Numbers in which each digit stands at many places, and the ends of the range.
constexpr int32_t SAMPLES[] = {0,         7,          40,         305,       -9,         -60,
                               9999,      10000,      123456,     -987654,   2468013,    -1357902,
                               100000000, -123456789, 2147483647, 908070605, INT32_MIN,  -1000,
                               1000,      12345,      98765432,   -20304050, 1029384756, -1};

} // namespace

bool IntegerText::learnDigits(const char *locale)
{
    for (int32_t digit = 0; digit < 10; ++digit) {
        const Written written = writtenByIcu(locale, digit);
        if (written.length != 1)
            return false;
        digits_[digit] = written.text[0];
    }
    return true;
}

bool IntegerText::learnForm(const char *locale, bool isNegative, int32_t digits)
{
    const Written written = writtenByIcu(locale, isNegative ? -ones(digits) : ones(digits));
    Form &form = forms_[isNegative ? 1 : 0][digits - 1];
    form.length = static_cast<uint8_t>(written.length);
    std::memcpy(form.text, written.text, sizeof form.text);
    int32_t found = 0;
    for (int32_t i = 0; i < written.length; ++i) {
        if (written.text[i] != digits_[1])
            continue;
        if (found == digits)
            return false;
        form.places[found++] = static_cast<uint8_t>(i);
    }
    return found == digits;
}

bool IntegerText::isProved(const char *locale) const
{
    for (const int32_t sample : SAMPLES) {
        UChar area[SIZE];
        const auto length = static_cast<size_t>(write(sample, area));
        if (std::u16string_view{area, length} != writtenByIcu(locale, sample).view())
            return false;
    }
    return true;
}

bool IntegerText::learn(const char *locale)
{
    if (!learnDigits(locale))
        return false;
    for (int32_t digits = 1; digits <= MOST_DIGITS; ++digits)
        if (!learnForm(locale, false, digits) || !learnForm(locale, true, digits))
            return false;
    return isProved(locale);
}

int32_t IntegerText::write(int32_t value, UChar *area) const
{
    uint8_t decimal[MOST_DIGITS];
    int32_t count = 0;
    uint32_t rest = value < 0 ? 0 - static_cast<uint32_t>(value) : static_cast<uint32_t>(value);
    do {
        decimal[count++] = static_cast<uint8_t>(rest % 10);
        rest /= 10;
    } while (rest != 0);
    const Form &form = forms_[value < 0 ? 1 : 0][count - 1];
    std::memcpy(area, form.text, sizeof form.text);
    for (int32_t i = 0; i < count; ++i)
        area[form.places[i]] = digits_[decimal[count - 1 - i]];
    return form.length;
}

} // namespace zelvo
