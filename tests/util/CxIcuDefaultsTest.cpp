// SPDX-License-Identifier: Apache-2.0
// The numbers of ICU's defaults.
#include "util/CxIcuDefaults.h"

#include <string>

#include <gtest/gtest.h>
#include <unicode/ucal.h>

#include "support/IcuDefaults.h"

namespace zelvo_test {
namespace {

uint64_t numberOf(zelvo::NumberedName<char, 8> &name, const std::string &text)
{
    return name.numberOf(text.data(), text.size());
}

TEST(CxNumberedName, KeepsItsNumberAsLongAsTheNameStays)
{
    zelvo::NumberedName<char, 8> name;
    const uint64_t first = numberOf(name, "abc");
    EXPECT_EQ(numberOf(name, "abc"), first);
}

TEST(CxNumberedName, HasANewNumberAfterEachChangeAlsoBackToAnEarlierName)
{
    zelvo::NumberedName<char, 8> name;
    const uint64_t first = numberOf(name, "abc");
    const uint64_t second = numberOf(name, "abd");
    EXPECT_NE(second, first);
    EXPECT_NE(numberOf(name, "abc"), first);
    EXPECT_NE(numberOf(name, "ab"), second);
}

TEST(CxNumberedName, EmptyIsANameToo)
{
    zelvo::NumberedName<char, 8> name;
    const uint64_t first = numberOf(name, "");
    EXPECT_NE(first, 0u);
    EXPECT_EQ(numberOf(name, ""), first);
}

TEST(CxNumberedName, TooLongCountsAsChangedEachTime)
{
    zelvo::NumberedName<char, 8> name;
    const uint64_t first = numberOf(name, "12345678");
    EXPECT_NE(numberOf(name, "12345678"), first);
    EXPECT_NE(numberOf(name, "1234567"), numberOf(name, "12345678"));
}

TEST(CxIcuDefaults, TheLocalesNumberFollowsTheLocale)
{
    zelvo::DefaultLocale followed;
    const DefaultLocale german("de");
    const uint64_t first = followed.number();
    EXPECT_EQ(followed.number(), first);
    const DefaultLocale austrian("de_AT");
    EXPECT_NE(followed.number(), first);
}

TEST(CxIcuDefaults, TheZonesNumberFollowsTheZone)
{
    zelvo::DefaultZone followed;
    UErrorCode status = U_ZERO_ERROR;
    ucal_setDefaultTimeZone(u"Europe/Berlin", &status);
    const uint64_t first = followed.number();
    EXPECT_EQ(followed.number(), first);
    ucal_setDefaultTimeZone(u"GMT+01:23", &status);
    EXPECT_NE(followed.number(), first);
    ASSERT_TRUE(U_SUCCESS(status));
}

} // namespace
} // namespace zelvo_test
