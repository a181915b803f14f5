// SPDX-License-Identifier: Apache-2.0
#include "CxChars.h"

#include <array>
#include <numeric>
#include <string>

#include <gtest/gtest.h>
#include <unicode/ucnv.h>

namespace zelvo_test {
namespace {

/// The bytes, out of all 256, for which a test holds.
std::string bytesOf(ZlvBool (*test)(char))
{
    std::string bytes;
    for (int code = 0; code < 256; ++code)
        if (test(static_cast<char>(code)) != 0)
            bytes += static_cast<char>(code);
    return bytes;
}

TEST(CxChars, AnASCIIDigitIs0x30To0x39)
{
    EXPECT_EQ(bytesOf(CxIsASCIIDigit), "\x30\x31\x32\x33\x34\x35\x36\x37\x38\x39");
}

TEST(CxChars, AnASCIILetterIs0x41To0x5AOr0x61To0x7A)
{
    EXPECT_EQ(bytesOf(CxIsASCIIAlpha), "ABCDEFGHIJKLMNOPQRSTUVWXYZabcdefghijklmnopqrstuvwxyz");
}

TEST(CxChars, ALocalDigitIsOneOfTheTenDigitCharacters)
{
    EXPECT_EQ(bytesOf(CxIsLocalDigit), "0123456789");
}

TEST(CxChars, ATestAnswersWithZeroOrOne)
{
    EXPECT_EQ(CxIsASCIIDigit('7'), 1);
    EXPECT_EQ(CxIsASCIIAlpha('x'), 1);
    EXPECT_EQ(CxIsLocalDigit('0'), 1);
    EXPECT_EQ(CxIsASCIIDigit('x'), 0);
}

TEST(CxETOA, LeavesEveryByteAsItIs)
{
    std::array<char, 256> bytes;
    std::iota(bytes.begin(), bytes.end(), '\0');
    const std::array<char, 256> before = bytes;
    CxETOA(bytes.data(), bytes.size());
    EXPECT_EQ(bytes, before);
}

TEST(CxETOA, OfNoBytesTouchesNothing)
{
    char bytes[] = "ab";
    CxETOA(bytes, 0);
    EXPECT_STREQ(bytes, "ab");
}

TEST(CxETOA, IgnoresANullBuffer)
{
    CxETOA(nullptr, 0);
    CxETOA(nullptr, 8);
}

struct CodePage {
    const char *label;
    const char *converter;
    const char *table;
};

// The published code pages, as the Unicode library knows them, are the measure.
class EbcdicTable : public testing::TestWithParam<CodePage> {};

TEST_P(EbcdicTable, MapsEveryByteAsThePublishedCodePageDoes)
{
    UErrorCode error = U_ZERO_ERROR;
    UConverter *page = ucnv_open(GetParam().converter, &error);
    ASSERT_TRUE(U_SUCCESS(error)) << u_errorName(error);
    for (int code = 0; code < 256; ++code) {
        const char ebcdic = static_cast<char>(code);
        UChar unit[4] = {};
        int32_t units = ucnv_toUChars(page, unit, 4, &ebcdic, 1, &error);
        ASSERT_TRUE(U_SUCCESS(error)) << u_errorName(error);
        ASSERT_EQ(units, 1) << code;
        EXPECT_EQ(static_cast<unsigned char>(GetParam().table[code]), unit[0]) << "byte " << code;
    }
    ucnv_close(page);
}

TEST_P(EbcdicTable, EndsWithAZeroByte)
{
    EXPECT_EQ(GetParam().table[256], 0);
}

INSTANTIATE_TEST_SUITE_P(BothPages, EbcdicTable,
                         testing::Values(CodePage{"CP037", "ibm-37", ASCII_FROM_CP037},
                                         CodePage{"CP1047", "ibm-1047", ASCII_FROM_CP1047}),
                         [](const auto &row) { return row.param.label; });

TEST(EbcdicTables, DifferFromEachOther)
{
    EXPECT_NE(std::string(ASCII_FROM_CP037, 256), std::string(ASCII_FROM_CP1047, 256));
}

} // namespace
} // namespace zelvo_test
