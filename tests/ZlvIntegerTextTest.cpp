// SPDX-License-Identifier: Apache-2.0
// Integers as locales write them, against ICU's message formatter.
#include "ZlvIntegerText.h"

#include <random>
#include <string>

#include <gtest/gtest.h>
#include <unicode/umsg.h>
#include <unicode/ustring.h>

#include "ZlvKept.h"
#include "support/IcuDefaults.h"

namespace zelvo_test {
namespace {

std::u16string byIcu(const char *locale, int32_t value)
{
    UChar area[64];
    UErrorCode status = U_ZERO_ERROR;
    const UChar *pattern = u"{0,number,integer}";
    const int32_t length =
        u_formatMessage(locale, pattern, u_strlen(pattern), area, 64, &status, value);
    EXPECT_TRUE(U_SUCCESS(status));
    return {area, static_cast<size_t>(length)};
}

std::u16string written(const zelvo::IntegerText &forms, int32_t value)
{
    UChar area[zelvo::IntegerText::SIZE];
    const int32_t length = forms.write(value, area);
    return {area, static_cast<size_t>(length)};
}

class ZlvIntegerText : public ::testing::TestWithParam<const char *> {};

TEST_P(ZlvIntegerText, IsThatOfTheMessageFormatter)
{
    zelvo::IntegerText forms;
    ASSERT_TRUE(forms.learn(GetParam()));
    std::mt19937 random(7);
    for (int step = 0; step < 2000; ++step) {
        const auto value = static_cast<int32_t>(random()) >> (random() % 31);
        ASSERT_EQ(written(forms, value), byIcu(GetParam(), value)) << value;
    }
    for (const int32_t value : {0, -1, 999, 1000, -1000, 99999, 100000, INT32_MAX, INT32_MIN})
        ASSERT_EQ(written(forms, value), byIcu(GetParam(), value)) << value;
}

INSTANTIATE_TEST_SUITE_P(Locales, ZlvIntegerText,
                         ::testing::Values("en", "de", "de_CH", "fr", "es", "pl", "sv", "hi",
                                           "en_IN", "ar_EG", "ar", "fa_IR", "he", "bn", "my", "th",
                                           "ja", "en@numbers=hanidec", "", "nonsense"));

TEST(ZlvIntegerForms, OfALocaleThatWritesNumbersInWordsAreNotLearnt)
{
    zelvo::IntegerText forms;
    EXPECT_FALSE(forms.learn("en@numbers=roman"));
}

TEST(ZlvIntegerForms, OfTheDefaultLocaleFollowIt)
{
    const DefaultLocale english("en");
    ASSERT_NE(zelvo::integerText(nullptr), nullptr);
    EXPECT_EQ(written(*zelvo::integerText(nullptr), 1234567), u"1,234,567");
    const DefaultLocale german("de");
    EXPECT_EQ(written(*zelvo::integerText(nullptr), 1234567), u"1.234.567");
    zelvo::dropKept();
}

TEST(ZlvIntegerForms, BeyondTheCapacityAreNotKeptAndThoseKeptStay)
{
    const zelvo::IntegerText *first = zelvo::integerText("en");
    ASSERT_NE(first, nullptr);
    int missing = 0;
    for (const char *locale : {"de", "fr", "es", "pl", "sv", "hi", "it", "nl", "da", "fi", "cs",
                               "hu", "ro", "tr", "el", "uk", "bg", "hr"})
        missing += zelvo::integerText(locale) == nullptr;
    EXPECT_EQ(missing, 3);
    EXPECT_EQ(zelvo::integerText("en"), first);
    zelvo::dropKept();
}

} // namespace
} // namespace zelvo_test
