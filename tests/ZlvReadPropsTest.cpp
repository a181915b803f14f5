// SPDX-License-Identifier: Apache-2.0
// Whole properties files, read into a property list. Errors of the file stand in
// ZlvReadPropsFilesTest.cpp, escapes in ZlvReadPropsEscapesTest.cpp.
#include "support/ReadProps.h"

namespace zelvo_test {
namespace {

using ZlvReadProps = ReadProps;

TEST_F(ZlvReadProps, AnEmptyFileHoldsNothing)
{
    EXPECT_TRUE(reads(""));
    EXPECT_EQ(list.count, 0);
}

TEST_F(ZlvReadProps, CommentsAndBlankLinesHoldNothing)
{
    EXPECT_TRUE(reads("# one\n\n! two = 2\n   \n \t# three\n  ! four\n\n"));
    EXPECT_EQ(list.count, 0);
    EXPECT_TRUE(errorUntouched());
}

TEST_F(ZlvReadProps, ACommentMayEndTheFileWithoutALineEnd)
{
    EXPECT_TRUE(reads("a=1\n# the end"));
    EXPECT_EQ(list.all(), "a=1");
}

TEST_F(ZlvReadProps, EveryLineIsAnEntry)
{
    EXPECT_TRUE(reads("a=1\nb=2\nc=3\n"));
    EXPECT_EQ(list.all(), "a=1 b=2 c=3");
    EXPECT_TRUE(errorUntouched());
}

TEST_F(ZlvReadProps, TheLastLineNeedsNoLineEnd)
{
    EXPECT_TRUE(reads("a=1\nb=2"));
    EXPECT_EQ(list.all(), "a=1 b=2");
}

TEST_F(ZlvReadProps, ALaterEntryOfTheSameKeyWins)
{
    EXPECT_TRUE(reads("a=1\nb=2\na=3\n"));
    EXPECT_EQ(list.all(), "a=3 b=2");
}

struct Line {
    const char *label;
    std::string text;
    std::string key;
    std::string value;
};

class ZlvReadPropsLine : public ReadProps, public testing::WithParamInterface<Line> {};

TEST_P(ZlvReadPropsLine, GivesItsKeyAndValue)
{
    EXPECT_TRUE(reads(GetParam().text + "\n"));
    EXPECT_EQ(list.all(), GetParam().key + "=" + GetParam().value);
    EXPECT_TRUE(errorUntouched());
}

INSTANTIATE_TEST_SUITE_P(
    Separators, ZlvReadPropsLine,
    testing::Values(Line{"Equals", "a.b=c", "a.b", "c"}, Line{"Colon", "a.b:c", "a.b", "c"},
                    Line{"Blank", "a.b c", "a.b", "c"}, Line{"Tab", "a.b\tc", "a.b", "c"},
                    Line{"VerticalTab", "a.b\vc", "a.b", "c"},
                    Line{"FormFeed", "a.b\fc", "a.b", "c"},
                    Line{"EqualsBetweenBlanks", "a.b = c", "a.b", "c"},
                    Line{"ColonBetweenBlanks", "a.b : c", "a.b", "c"},
                    Line{"ManyBlanks", "a.b \t\v\f = \t\v\f c", "a.b", "c"},
                    Line{"SecondEqualsIsValue", "a==c", "a", "=c"},
                    Line{"SecondColonIsValue", "a=:c", "a", ":c"},
                    Line{"EqualsAfterColonIsValue", "a : = c", "a", "= c"},
                    Line{"EqualsInsideTheValue", "a=b=c:d", "a", "b=c:d"},
                    Line{"EqualsAfterABlankSeparatedValue", "a b=c", "a", "b=c"}),
    [](const auto &row) { return row.param.label; });

INSTANTIATE_TEST_SUITE_P(Keys, ZlvReadPropsLine,
                         testing::Values(Line{"AfterBlanks", " \t\v\fa=1", "a", "1"},
                                         Line{"EqualsInTheFirstColumn", "=a=1", "=a", "1"},
                                         Line{"ColonInTheFirstColumn", ":a=1", ":a", "1"},
                                         Line{"BackslashInTheFirstColumn", "\\a=1", "\\a", "1"},
                                         Line{"BackslashAfterBlanks", "  \\a=1", "\\a", "1"},
                                         Line{"CommentSignInside", "a#b!c=1", "a#b!c", "1"},
                                         Line{"EscapedBackslash", "a\\\\b=1", "a\\b", "1"},
                                         Line{"EscapedBlank", "a\\ b=1", "a b", "1"},
                                         Line{"EscapedTab", "a\\\tb=1", "a\tb", "1"},
                                         Line{"EscapedVerticalTab", "a\\\vb=1", "a\vb", "1"},
                                         Line{"EscapedFormFeed", "a\\\fb=1", "a\fb", "1"},
                                         Line{"EscapedEquals", "a\\=b=1", "a=b", "1"},
                                         Line{"EscapedColon", "a\\:b=1", "a:b", "1"},
                                         Line{"HighBytes", "\xC3\xA9=1", "\xC3\xA9", "1"},
                                         Line{"EverySign", "a\"'{}()[]$%&/?*+~;,<>|@-_b=1",
                                              "a\"'{}()[]$%&/?*+~;,<>|@-_b", "1"}),
                         [](const auto &row) { return row.param.label; });

INSTANTIATE_TEST_SUITE_P(Values, ZlvReadPropsLine,
                         testing::Values(Line{"TrailingBlanksStay", "a.b=c  ", "a.b", "c  "},
                                         Line{"InnerBlanksStay", "a=one  two\tthree", "a",
                                              "one  two\tthree"},
                                         Line{"CommentSigns", "a=#b!", "a", "#b!"},
                                         Line{"CommentSignAfterABlankSeparator", "a #b", "a", "#b"},
                                         Line{"HighBytes", "a=\xE2\x82\xAC", "a", "\xE2\x82\xAC"},
                                         Line{"OneByte", "a=b", "a", "b"}),
                         [](const auto &row) { return row.param.label; });

struct Bad {
    const char *label;
    std::string text;
};

class ZlvReadPropsBad : public ReadProps, public testing::WithParamInterface<Bad> {};

TEST_P(ZlvReadPropsBad, FailsTheReadAndLeavesTheErrorRecord)
{
    EXPECT_FALSE(reads("first=1\n" + GetParam().text + "\nlast=2\n"));
    EXPECT_EQ(list.all(), "first=1");
    EXPECT_TRUE(errorUntouched());
}

INSTANTIATE_TEST_SUITE_P(
    Syntax, ZlvReadPropsBad,
    testing::Values(Bad{"KeyWithoutSeparator", "a.b"}, Bad{"KeyThenBlanks", "a.b  "},
                    Bad{"EqualsAfterBlanks", " =a=1"}, Bad{"ColonAfterBlanks", "\t:a=1"},
                    Bad{"LetterEscapedInAKey", "a\\n=1"}, Bad{"QuoteEscapedInAKey", "a\\\"=1"},
                    Bad{"UnicodeEscapeInAKey", "a\\u0041=1"}, Bad{"LineEndEscapedInAKey", "a\\"},
                    Bad{"EscapedN", "a=b\\nc"}, Bad{"EscapedT", "a=b\\tc"},
                    Bad{"EscapedEquals", "a=\\="}, Bad{"EscapedColon", "a=\\:"},
                    Bad{"EscapedDigit", "a=\\0"}, Bad{"EscapedHash", "a=\\#"},
                    Bad{"ShortUnicode", "a=\\u004"}, Bad{"NoHexDigits", "a=\\u"},
                    Bad{"FirstNoHexDigit", "a=\\ug041"}, Bad{"SecondNoHexDigit", "a=\\u0g41"},
                    Bad{"ThirdNoHexDigit", "a=\\u00g1"}, Bad{"FourthNoHexDigit", "a=\\u004g"},
                    Bad{"PlusInUnicode", "a=\\u+0041"}),
    [](const auto &row) { return row.param.label; });

TEST_F(ZlvReadProps, CarriageReturnsEndLines)
{
    EXPECT_TRUE(reads("a=1\rb=2\r"));
    EXPECT_EQ(list.all(), "a=1 b=2");
}

TEST_F(ZlvReadProps, CrLfAndLfCrAreOneLineEnd)
{
    EXPECT_TRUE(reads("a=1\r\nb=2\n\rc=3\r\n"));
    EXPECT_EQ(list.all(), "a=1 b=2 c=3");
}

TEST_F(ZlvReadProps, RunsOfEmptyLinesAreOneLineEnd)
{
    EXPECT_TRUE(reads("\n\n\na=1\n\n\r\n\r\r\nb=2\n\n"));
    EXPECT_EQ(list.all(), "a=1 b=2");
}

TEST_F(ZlvReadProps, ALineEndRightAfterTheSeparatorEndsTheEntry)
{
    EXPECT_TRUE(reads("a=1\nb=\nc:\nd = \n"));
    EXPECT_EQ(list.all(), "a=1 b= c= d=");
}

TEST_F(ZlvReadProps, AnEmptyValueFailsBeforeAnyValueOfTheFileHadACharacter)
{
    EXPECT_FALSE(reads("a.b=\n"));
    EXPECT_EQ(list.count, 0);
    EXPECT_TRUE(errorUntouched());
}

TEST_F(ZlvReadProps, AnEmptyValueIsGoodOnceAnyValueOfTheFileHadACharacter)
{
    EXPECT_TRUE(reads("x=1\na.b=\n"));
    EXPECT_EQ(list.value("a.b"), "");
}

TEST_F(ZlvReadProps, WhatEarlierFilesHeldDoesNotMakeAnEmptyValueGood)
{
    EXPECT_TRUE(reads("x=1\n"));
    EXPECT_FALSE(reads("a.b=\n"));
}

TEST_F(ZlvReadProps, ALastLineWithoutSeparatorAndLineEndHasAnEmptyValue)
{
    EXPECT_TRUE(reads("x=1\na.b"));
    EXPECT_EQ(list.all(), "x=1 a.b=");
}

TEST_F(ZlvReadProps, ALastLineWithoutSeparatorFailsWhenNoValueHadACharacter)
{
    EXPECT_FALSE(reads("a.b"));
    EXPECT_EQ(list.count, 0);
    EXPECT_TRUE(errorUntouched());
}

TEST_F(ZlvReadProps, TheSameLineWithALineEndFails)
{
    EXPECT_FALSE(reads("x=1\na.b\n"));
    EXPECT_EQ(list.all(), "x=1");
}

TEST_F(ZlvReadProps, TheEndOfInputInsideAnEscapeEmitsWhatThereIs)
{
    EXPECT_TRUE(reads("x=1\na\\"));
    EXPECT_EQ(list.value("a"), "");
    EXPECT_TRUE(reads("b=one\\"));
    EXPECT_EQ(list.value("b"), "one");
    EXPECT_TRUE(reads("c=two\\u004"));
    EXPECT_EQ(list.value("c"), "two");
}

TEST_F(ZlvReadProps, TheEndOfInputAfterBlanksOfAFreshLineEmitsNothing)
{
    EXPECT_TRUE(reads("a=1\n  "));
    EXPECT_EQ(list.all(), "a=1");
}

TEST_F(ZlvReadProps, TheLastEntryIsEmittedAgainWhenTheFileEndsAfterItsLineEnd)
{
    CxPropListPutStr(&list, "a", "0");
    FailAlloc counted(UINT32_MAX);
    EXPECT_TRUE(reads("a=1\n"));
    uint32_t withLineEnd = counted.asked();
    EXPECT_TRUE(reads("a=1"));
    // Each emit into a known key copies the value once.
    EXPECT_EQ(withLineEnd, counted.asked() - withLineEnd + 1);
    EXPECT_EQ(list.all(), "a=1");
}

TEST_F(ZlvReadProps, TheSecondEmitFollowsEmptyLinesToo)
{
    FailAlloc counted(UINT32_MAX);
    EXPECT_TRUE(reads("a=1\n\n\r\n"));
    uint32_t first = counted.asked();
    EXPECT_TRUE(reads("a=1\n"));
    EXPECT_EQ(list.all(), "a=1");
    EXPECT_EQ(counted.asked() - first, first - 2); // the list and the key exist by then
}

TEST_F(ZlvReadProps, AZeroByteIsAnOrdinaryCharacterThatEndsTheText)
{
    EXPECT_TRUE(reads(std::string("a=x\0y\nb=2\n", 10)));
    EXPECT_EQ(list.all(), "a=x b=2");
}

TEST_F(ZlvReadProps, LongKeysAndValuesAreKeptWhole)
{
    const std::string key(5000, 'k'), value(70000, 'v');
    EXPECT_TRUE(reads(key + "=" + value + "\n"));
    EXPECT_EQ(list.value(key.c_str()), value);
}

TEST_F(ZlvReadProps, ManyEntriesAreKeptInOrder)
{
    std::string text;
    for (int i = 0; i < 500; ++i)
        text += "key" + std::to_string(i) + "=" + std::to_string(i * 2) + "\n";
    EXPECT_TRUE(reads(text));
    EXPECT_EQ(list.count, 500);
    EXPECT_STREQ(list.entries[499].key, "key499");
    EXPECT_STREQ(list.entries[499].value, "998");
}

} // namespace
} // namespace zelvo_test
