// SPDX-License-Identifier: Apache-2.0
// Numbers written by kept formats, against formats opened for each.
#include "util/CxNumberText.h"

#include <cmath>
#include <limits>
#include <string>

#include <gtest/gtest.h>
#include <unicode/umsg.h>
#include <unicode/ustring.h>

#include "support/IcuDefaults.h"

namespace zelvo_test {
namespace {

using zelvo::NumberForm;

std::u16string written(NumberForm form, double value)
{
    zelvo::NumberText number;
    return zelvo::writeNumber(form, value, number) ? number.text : u"too long";
}

std::u16string byIcu(const UChar *pattern, double value)
{
    UChar text[64];
    UErrorCode status = U_ZERO_ERROR;
    const int32_t length =
        u_formatMessage(nullptr, pattern, u_strlen(pattern), text, 64, &status, value);
    return length < zelvo::NumberText::SIZE ? text : u"too long";
}

class CxNumberText : public ::testing::TestWithParam<const char *> {};

TEST_P(CxNumberText, IsThatOfAFormatOpenedForIt)
{
    const DefaultLocale locale(GetParam());
    constexpr double infinity = std::numeric_limits<double>::infinity();
    for (const double value : {0.0,         -0.0,
                               1.0,         -1.0,
                               0.5,         1.5,
                               2.5,         1234567.891234,
                               -9.999999,   1155718135123.0,
                               1e14,        999999999999999.0,
                               1e15,        1e18,
                               1e29,        1e30,
                               1e31,        1e300,
                               infinity,    -infinity,
                               std::nan("")}) {
        EXPECT_EQ(written(NumberForm::WHOLE, value), byIcu(u"{0,number,#}", value)) << value;
        EXPECT_EQ(written(NumberForm::FRACTION, value), byIcu(u"{0,number,#.#####}", value))
            << value;
    }
    zelvo::dropKeptNumberFormats();
}

INSTANTIATE_TEST_SUITE_P(Locales, CxNumberText,
                         ::testing::Values("en", "de", "sv", "ar_EG", "fa_IR", "hi_IN", "bn", "my",
                                           "th_TH_TH", "en_US_POSIX"));

TEST(CxNumberTextDefaults, FollowTheDefaultLocale)
{
    const DefaultLocale english("en");
    EXPECT_EQ(written(NumberForm::FRACTION, 1.5), u"1.5");
    const DefaultLocale german("de");
    EXPECT_EQ(written(NumberForm::FRACTION, 1.5), u"1,5");
    const DefaultLocale egyptian("ar_EG");
    EXPECT_EQ(written(NumberForm::WHOLE, 12), u"\u0661\u0662");
    zelvo::dropKeptNumberFormats();
}

} // namespace
} // namespace zelvo_test
