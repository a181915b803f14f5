// SPDX-License-Identifier: Apache-2.0
// Escapes in values: quoted characters, continuation lines and code points.
#include "support/ReadProps.h"

namespace zelvo_test {
namespace {

struct Escaped {
    const char *label;
    std::string text;
    std::string value;
};

class ZlvReadPropsValue : public ReadProps, public testing::WithParamInterface<Escaped> {};

TEST_P(ZlvReadPropsValue, IsReadWithoutItsEscapes)
{
    EXPECT_TRUE(reads("a=" + GetParam().text + "\n"));
    EXPECT_EQ(list.all(), "a=" + GetParam().value);
}

INSTANTIATE_TEST_SUITE_P(
    Characters, ZlvReadPropsValue,
    testing::Values(Escaped{"Backslash", "x\\\\y", "x\\y"}, Escaped{"Quote", "\\\"x\\\"", "\"x\""},
                    Escaped{"Apostrophe", "\\'x", "'x"}, Escaped{"Blank", "\\ x", " x"},
                    Escaped{"Tab", "\\\tx", "\tx"}, Escaped{"VerticalTab", "\\\vx", "\vx"},
                    Escaped{"FormFeed", "\\\fx", "\fx"}, Escaped{"BlankAtTheEnd", "x\\ ", "x "}),
    [](const auto &row) { return row.param.label; });

INSTANTIATE_TEST_SUITE_P(
    Continuations, ZlvReadPropsValue,
    testing::Values(Escaped{"LeadingBlanksAreSkipped", "one\\\n   two", "onetwo"},
                    Escaped{"OfEveryKind", "one\\\n \t\v\f two", "onetwo"},
                    Escaped{"BlanksBeforeTheBackslashStay", "one \\\ntwo", "one two"},
                    Escaped{"CarriageReturn", "one\\\rtwo", "onetwo"},
                    Escaped{"CrLf", "one\\\r\n  two", "onetwo"},
                    Escaped{"SeveralLines", "one\\\n two\\\n three", "onetwothree"},
                    Escaped{"EmptyLineIsDropped", "one\\\n\n  two", "onetwo"},
                    Escaped{"EmptyLinesAreDropped", "one\\\r\n\r\n\r\ntwo", "onetwo"},
                    Escaped{"LineOfBlanksEndsTheValue", "one\\\n  ", "one"},
                    Escaped{"CommentSignIsText", "one\\\n #two", "one#two"},
                    Escaped{"EqualsIsText", "one\\\n=two", "one=two"},
                    Escaped{"EscapeAtItsStart", "one\\\n  \\ two", "one two"},
                    Escaped{"BackslashAtOnce", "one\\\n\\\n  two", "onetwo"},
                    Escaped{"RightAfterTheSeparator", "\\\n  two", "two"}),
    [](const auto &row) { return row.param.label; });

// The letters a to f and A to F count 0 to 5.
INSTANTIATE_TEST_SUITE_P(CodePoints, ZlvReadPropsValue,
                         testing::Values(Escaped{"LetterA", "\\u0041", "A"},
                                         Escaped{"CapitalU", "\\U0041", "A"},
                                         Escaped{"SmallECountsFour", "\\u00e9", "I"},
                                         Escaped{"CapitalECountsFour", "\\u00E9", "I"},
                                         Escaped{"SmallACountsNothing", "\\u004a", "@"},
                                         Escaped{"SmallFCountsFive", "\\u004f", "E"},
                                         Escaped{"CapitalFCountsFive", "\\u004F", "E"},
                                         Escaped{"FirstDigit", "\\u2049", "\xE2\x81\x89"},
                                         Escaped{"SecondDigit", "\\u0300", "\xCC\x80"},
                                         Escaped{"ThirdDigit", "\\u0070", "p"},
                                         Escaped{"TwoBytes", "\\u0095", "\xC2\x95"},
                                         Escaped{"MostOfOneEscape", "\\u9999", "\xE9\xA6\x99"},
                                         Escaped{"BetweenText", "x\\u0041y", "xAy"},
                                         Escaped{"ZeroEndsTheText", "x\\u0000y", "x"},
                                         Escaped{"OnAContinuationLine", "x\\\n \\u0041", "xA"}),
                         [](const auto &row) { return row.param.label; });

INSTANTIATE_TEST_SUITE_P(Sums, ZlvReadPropsValue,
                         testing::Values(Escaped{"AddsToTheFirst", "\\u0041\\u0001", "AB"},
                                         Escaped{"AddsNothing", "\\u0041\\u0000", "AA"},
                                         Escaped{"Doubles", "\\u0021\\u0021", "!B"},
                                         Escaped{"LeavesTheTwoByteForm", "\\u0700\\u0099\\u0066",
                                                 "\xDC\x80\xDE\x99\xE0\x9F\xBF"},
                                         Escaped{"LeavesTheBasicPlane", "\\u9000\\u9000",
                                                 "\xE9\x80\x80\xF0\x92\x80\x80"}),
                         [](const auto &row) { return row.param.label; });

using ZlvReadPropsEscapes = ReadProps;

TEST_F(ZlvReadPropsEscapes, ABackslashCanFollowTheBlanksAfterAKey)
{
    EXPECT_TRUE(reads("a \\u0041\n"));
    EXPECT_EQ(list.all(), "a=A");
}

TEST_F(ZlvReadPropsEscapes, CodePointsAddUpFromEntryToEntry)
{
    EXPECT_TRUE(reads("a=\\u0041\nb=\\u0001\n# c\nc=\\u0001\n"));
    EXPECT_EQ(list.all(), "a=A b=B c=C");
}

TEST_F(ZlvReadPropsEscapes, TheSumBeginsAtZeroForEachFile)
{
    EXPECT_TRUE(reads("a=\\u0041\n"));
    EXPECT_TRUE(reads("b=\\u0041\n"));
    EXPECT_EQ(list.all(), "a=A b=A");
}

// 60,000 times 0x9999 passes 2 to the power 31: the sum wraps into the negative numbers, whose code
// points leave their low seven bits, here 0x60.
TEST_F(ZlvReadPropsEscapes, TheSumWrapsLikeAnUnsignedNumber)
{
    std::string text;
    for (int i = 0; i < 60000; ++i)
        text += "a=\\u9999\n";
    EXPECT_TRUE(reads(text));
    EXPECT_EQ(list.all(), "a=`");
}

TEST_F(ZlvReadPropsEscapes, ManyEscapesOfOneValueAreAllKept)
{
    std::string text = "a=";
    Buff expected;
    for (int32_t i = 1; i <= 60000; ++i) {
        text += "\\u0021";
        CxStringBuffAppendUTF32Char(&expected, i * 0x21);
    }
    EXPECT_TRUE(reads(text + "\n"));
    EXPECT_EQ(list.value("a"), expected.text());
}

} // namespace
} // namespace zelvo_test
