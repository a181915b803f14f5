// SPDX-License-Identifier: Apache-2.0
#include "CxChars.h"

#include <array>
#include <numeric>
#include <string>

#include <gtest/gtest.h>
#include <unicode/ucnv.h>

namespace zelvo_test {
namespace {

// One instance for each of the 256 bytes.
class CxChars : public testing::TestWithParam<int> {
protected:
    int code() const { return GetParam(); }
    char byte() const { return static_cast<char>(GetParam()); }
    static bool within(int code, int first, int last) { return code >= first && code <= last; }
};

TEST_P(CxChars, AnASCIIDigitIs0x30To0x39)
{
    EXPECT_EQ(CxIsASCIIDigit(byte()), within(code(), 0x30, 0x39) ? 1 : 0);
}

TEST_P(CxChars, AnASCIILetterIs0x41To0x5AOr0x61To0x7A)
{
    bool letter = within(code(), 0x41, 0x5A) || within(code(), 0x61, 0x7A);
    EXPECT_EQ(CxIsASCIIAlpha(byte()), letter ? 1 : 0);
}

TEST_P(CxChars, ALocalDigitIsOneOfTheTenDigitCharacters)
{
    bool digit = std::string("0123456789").find(byte()) != std::string::npos;
    EXPECT_EQ(CxIsLocalDigit(byte()), digit ? 1 : 0);
}

INSTANTIATE_TEST_SUITE_P(EveryByte, CxChars, testing::Range(0, 256));

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
    SUCCEED() << "returned";
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
