// SPDX-License-Identifier: Apache-2.0
// The identifiers that are recognised at the start of a text.
#include "CxKvtID.h"

#include <cctype>
#include <ostream>
#include <string>
#include <string_view>

#include <gtest/gtest.h>

#include "support/GuardedText.h"

namespace zelvo_test {
namespace {

bool isNothing(const CxKvtIDInfo &info)
{
    return std::string_view(info.format).empty() && info.code == 0 && info.length == 0 &&
           info.identifier[0] == '\0' && info.severity == '\0';
}

/* The formats. */

struct FormatRow {
    const char *label;
    const char *format;
    int32_t code;
    const char *identifier;
};

void PrintTo(const FormatRow &row, std::ostream *out)
{
    *out << row.format << ' ' << row.identifier;
}

class CxKvtIDFormat : public testing::TestWithParam<FormatRow> {
protected:
    static void expectFound(const std::string &text)
    {
        const CxKvtIDInfo info = CxParseKvtID(text.c_str());
        EXPECT_STREQ(info.format, GetParam().format) << text;
        EXPECT_EQ(info.code, GetParam().code) << text;
        EXPECT_EQ(info.length, static_cast<int32_t>(sample_.size())) << text;
        EXPECT_STREQ(info.identifier, GetParam().identifier) << text;
    }

    /// Puts each of WRONG in each position in turn, and finds nothing.
    static void expectNothingWith(std::string_view wrong)
    {
        for (size_t at = 0; at < sample_.size(); ++at)
            for (char each : wrong) {
                std::string text = sample_;
                text[at] = each;
                EXPECT_TRUE(isNothing(CxParseKvtID((text + " text").c_str()))) << text;
            }
    }

    inline static std::string sample_;

    void SetUp() override { sample_ = GetParam().identifier; }
};

TEST_P(CxKvtIDFormat, IsFoundAtTheStartOfALongerText)
{
    expectFound(sample_ + " disk full");
    expectFound(sample_ + ": disk full");
}

TEST_P(CxKvtIDFormat, IsFoundWithMoreOfItsLikeBehindIt)
{
    expectFound(sample_ + "IWE");
    expectFound(sample_ + "123");
}

TEST_P(CxKvtIDFormat, IsFoundInATextOfExactlyItsLength)
{
    expectFound(sample_);
}

TEST_P(CxKvtIDFormat, IsNotFoundWithOneCharacterLess)
{
    EXPECT_TRUE(isNothing(CxParseKvtID(sample_.substr(0, sample_.size() - 1).c_str())));
    EXPECT_TRUE(isNothing(CxParseKvtID(sample_.c_str() + sample_.size() - 3)));
}

TEST_P(CxKvtIDFormat, IsNotFoundWithAWrongCharacterInAnyPosition)
{
    expectNothingWith("#- _{[@/:.\x01\x7f");
}

TEST_P(CxKvtIDFormat, IsNotFoundWithABytePastAsciiInAnyPosition)
{
    std::string bytes;
    for (int byte = 0x80; byte <= 0xFF; ++byte)
        bytes.push_back(static_cast<char>(byte));
    expectNothingWith(bytes);
}

TEST_P(CxKvtIDFormat, IsNotFoundWithADigitInPlaceOfALeadingLetter)
{
    for (size_t at : {0U, 1U, 2U}) {
        std::string text = sample_;
        text[at] = '7';
        EXPECT_TRUE(isNothing(CxParseKvtID(text.c_str()))) << text;
    }
}

TEST_P(CxKvtIDFormat, TakesEachOfTheThreeSeveritiesAndNoOtherLetter)
{
    for (char letter : std::string_view("ABCDEFGHIJKLMNOPQRSTUVWXYZabcdefghijklmnopqrstuvwxyz")) {
        std::string text = sample_;
        text.back() = letter;
        const bool isSeverity = letter == 'I' || letter == 'W' || letter == 'E';
        EXPECT_EQ(CxParseKvtID(text.c_str()).code, isSeverity ? GetParam().code : 0) << text;
    }
}

TEST_P(CxKvtIDFormat, TakesLettersOfEitherCase)
{
    std::string text = sample_;
    for (size_t at = 0; at + 1 < text.size(); ++at)
        text[at] = static_cast<char>(std::tolower(text[at]));
    EXPECT_EQ(CxParseKvtID(text.c_str()).code, GetParam().code);
    EXPECT_EQ(CxParseKvtID(text.c_str()).identifier, text);
}

TEST_P(CxKvtIDFormat, KeepsTheSeverityUnlessTheTerminatorTakesItsPlace)
{
    const CxKvtIDInfo info = CxParseKvtID(GetParam().identifier);
    EXPECT_EQ(info.severity, sample_.size() == 10 ? '\0' : sample_.back());
}

TEST_P(CxKvtIDFormat, IsNeverReadPastTheEndOfItsText)
{
    for (size_t length = 0; length <= sample_.size(); ++length) {
        const GuardedText text(std::string(sample_, 0, length) + '\0');
        const bool whole = length == sample_.size();
        EXPECT_EQ(CxParseKvtID(text.get()).code, whole ? GetParam().code : 0) << length;
    }
}

TEST_P(CxKvtIDFormat, IsReadOverTenCharactersAndNoMore)
{
    const GuardedText text((sample_ + "...").substr(0, 10));
    EXPECT_STREQ(CxParseKvtID(text.get()).identifier, GetParam().identifier);
}

constexpr FormatRow formats[] = {
    {"SixLettersThreeDigits", "Ozk6.3.1", 631, "ABCDEF123W"},
    {"FiveLettersFourDigits", "Ozk45.4.1", 541, "ABCDE1234I"},
    {"FiveLettersThreeDigits", "Ozk5.3.1", 531, "ABCDE123E"},
    {"FiveLettersTwoDigits", "Ozk5.2.1", 521, "ABCDE12W"},
    {"FourLettersFourDigits", "Ozk4.4.1", 441, "ABCD1234E"},
    {"FourLettersThreeDigits", "Ozk4.3.1", 431, "ABCD123I"},
    {"FourLettersFiveDigits", "Ozk4.5.1", 451, "ABCD12345W"},
    {"ThreeLettersFourDigits", "Ozk3.4.1", 341, "KDY1234E"},
    {"ThreeLettersThreeDigits", "Ozk3.3.1", 331, "ABC123I"},
    {"ThreeLettersFiveDigits", "Ozk3.5.1", 351, "ABC12345W"},
    {"ThreeLettersSixDigits", "Ozk3.6.1", 361, "ABC123456E"},
};

INSTANTIATE_TEST_SUITE_P(, CxKvtIDFormat, testing::ValuesIn(formats),
                         [](const auto &row) { return std::string(row.param.label); });

/* Which format a text has. */

struct ChoiceRow {
    const char *label;
    const char *text;
    int32_t code;
};

class CxKvtIDChoice : public testing::TestWithParam<ChoiceRow> {};

TEST_P(CxKvtIDChoice, IsMadeByTheLettersThenByTheDigits)
{
    EXPECT_EQ(CxParseKvtID(GetParam().text).code, GetParam().code);
}

INSTANTIATE_TEST_SUITE_P(
    , CxKvtIDChoice,
    testing::Values(
        ChoiceRow{"FourDigitsBeforeThree", "ABC1234I", 341},
        ChoiceRow{"ThreeDigits", "ABC123I", 331},
        ChoiceRow{"ThreeDigitsBeforeASecondSeverity", "ABC123II", 331},
        ChoiceRow{"FourDigitsBeforeASecondSeverity", "ABC1234IE", 341},
        ChoiceRow{"TwoDigitsOfThreeLetters", "ABC12I", 0},
        ChoiceRow{"SevenDigitsOfThreeLetters", "ABC1234567I", 0},
        ChoiceRow{"FourLettersTakeThreeDigits", "ABCD123IW", 431},
        ChoiceRow{"FourLettersTakeNoTwo", "ABCD12I", 0},
        ChoiceRow{"FourLettersTakeNoSix", "ABCD123456I", 0},
        ChoiceRow{"FiveLettersTakeTwoDigits", "ABCDE12EE", 521},
        ChoiceRow{"FiveLettersTakeThreeDigits", "ABCDE123EE", 531},
        ChoiceRow{"FiveLettersTakeNoOne", "ABCDE1I", 0},
        ChoiceRow{"FiveLettersTakeNoFive", "ABCDE12345I", 0},
        ChoiceRow{"SixLettersTakeNoTwoDigits", "ABCDEF12I", 0},
        ChoiceRow{"SixLettersTakeNoFourDigits", "ABCDEF1234I", 0},
        ChoiceRow{"SevenLetters", "ABCDEFG12I", 0}, ChoiceRow{"LettersOnly", "ABCDEFGHIE", 0},
        ChoiceRow{"SeverityLettersOnly", "IWEIWEIWEI", 0},
        ChoiceRow{"SeverityLettersAsLetters", "IWE123E", 331},
        ChoiceRow{"NoLetters", "1234567E", 0}, ChoiceRow{"OneLetter", "A12345I", 0},
        ChoiceRow{"TwoLetters", "AB1234I", 0}, ChoiceRow{"LowerCaseSeverity", "abc123x", 0},
        ChoiceRow{"LowerCaseOfASeverity", "abc123i", 0},
        ChoiceRow{"LowerCaseLetters", "abc123I", 331}, ChoiceRow{"BlankBefore", " ABC123I", 0},
        ChoiceRow{"BlankWithin", "ABC 123I", 0}),
    [](const auto &row) { return std::string(row.param.label); });

/// What the rules come to: as many letters, then as many digits as there are, then a severity.
int32_t codeByCounting(std::string_view text)
{
    size_t at = 0;
    while (at < text.size() && std::isalpha(static_cast<unsigned char>(text[at])) != 0)
        ++at;
    const auto letters = static_cast<int32_t>(at);
    while (at < text.size() && std::isdigit(static_cast<unsigned char>(text[at])) != 0)
        ++at;
    const int32_t digits = static_cast<int32_t>(at) - letters;
    if (at == text.size() || std::string_view("IWE").find(text[at]) == std::string_view::npos)
        return 0;
    const int32_t code = letters * 100 + digits * 10 + 1;
    for (const FormatRow &row : formats)
        if (row.code == code)
            return code;
    return 0;
}

TEST(CxKvtID, IsChosenAsCountingLettersAndDigitsSaysForEveryTextOfTenCharacters)
{
    constexpr std::string_view kinds = "AE1#";
    std::string text(10, kinds[0]);
    for (uint32_t number = 0; number < 1U << 20; ++number) {
        for (size_t at = 0; at < text.size(); ++at)
            text[at] = kinds[(number >> (2 * at)) & 3];
        ASSERT_EQ(CxParseKvtID(text.c_str()).code, codeByCounting(text)) << text;
    }
}

/* The record. */

TEST(CxKvtID, OfAFullMessageIsFilledWhole)
{
    const CxKvtIDInfo info = CxParseKvtID("KDY1234E The disk is full");
    EXPECT_STREQ(info.format, "Ozk3.4.1");
    EXPECT_EQ(info.code, 341);
    EXPECT_EQ(info.length, 8);
    EXPECT_STREQ(info.identifier, "KDY1234E");
    EXPECT_EQ(info.severity, 'E');
}

TEST(CxKvtID, OfTenCharactersHasNoSeverity)
{
    const CxKvtIDInfo info = CxParseKvtID("ABCDEF123W");
    EXPECT_STREQ(info.format, "Ozk6.3.1");
    EXPECT_EQ(info.length, 10);
    EXPECT_STREQ(info.identifier, "ABCDEF123W");
    EXPECT_EQ(info.severity, '\0');
}

TEST(CxKvtID, OfNineCharactersKeepsItsSeverityBehindTheTerminator)
{
    const CxKvtIDInfo info = CxParseKvtID("ABCDE123E");
    EXPECT_EQ(info.identifier[9], '\0');
    EXPECT_EQ(info.severity, 'E');
}

TEST(CxKvtID, SharesTheSeverityWithTheLastByteOfTheIdentifier)
{
    const CxKvtIDInfo info = CxParseKvtID("ABC123I");
    EXPECT_EQ(static_cast<const void *>(&info.severity),
              static_cast<const void *>(info.identifier + 10));
}

TEST(CxKvtID, OfANullTextIsNothing)
{
    EXPECT_TRUE(isNothing(CxParseKvtID(nullptr)));
}

TEST(CxKvtID, OfAnEmptyTextIsNothing)
{
    EXPECT_TRUE(isNothing(CxParseKvtID("")));
}

TEST(CxKvtID, IsNotLookedForBehindTheStart)
{
    EXPECT_TRUE(isNothing(CxParseKvtID("Error KDY1234E")));
}

} // namespace
} // namespace zelvo_test
