// SPDX-License-Identifier: Apache-2.0
// How the pattern of a message is read for the arguments that a record shows.
#include "ZlvPatternScan.h"

#include <ostream>
#include <string>

#include <gtest/gtest.h>

namespace zelvo_test {
namespace {

using zelvo::ArgKind;
using zelvo::ArgKinds;

/* The plain reading of a pattern. */

/// The kinds of the arguments up to the last one there is: T, I, D, ? for unknown, - for absent.
std::string letters(const ArgKinds &kinds)
{
    std::string text;
    for (ArgKind kind : kinds.of)
        text.push_back("-TID?"[static_cast<size_t>(kind)]);
    text.erase(text.find_last_not_of('-') + 1);
    return text;
}

struct PatternRow {
    const char *label;
    const char16_t *pattern;
    const char *kinds;
};

void PrintTo(const PatternRow &row, std::ostream *out)
{
    *out << row.label;
}

class ZlvPatternScan : public testing::TestWithParam<PatternRow> {};

TEST_P(ZlvPatternScan, TellsTheKindsOfItsArguments)
{
    EXPECT_EQ(letters(zelvo::kindsInPlainReading(GetParam().pattern)), GetParam().kinds);
}

const PatternRow types[] = {
    {"Empty", u"", ""},
    {"NoArgument", u"text", ""},
    {"NoType", u"{0}", "T"},
    {"NumberInteger", u"{0,number,integer}", "I"},
    {"Number", u"{0,number}", "D"},
    {"NumberOfAnotherStyle", u"{0,number,#.##}", "D"},
    {"NumberPercent", u"{0,number,percent}", "D"},
    {"NumberIntegers", u"{0,number,integers}", "D"},
    {"NumberIntegerInCapitals", u"{0,number,Integer}", "D"},
    {"NumberIntegerAndComma", u"{0,number,integer,x}", "D"},
    {"Choice", u"{0,choice,0#none|1#one}", "D"},
    {"ChoiceWithoutStyle", u"{0,choice}", "D"},
    {"ChoiceInteger", u"{0,choice,integer}", "D"},
    {"Date", u"{0,date}", "?"},
    {"Time", u"{0,time,short}", "?"},
    {"NumberInCapitals", u"{0,Number}", "?"},
    {"PartOfNumber", u"{0,numbe}", "?"},
    {"MoreThanNumber", u"{0,numbers,integer}", "?"},
    {"Integer", u"{0,integer}", "?"},
    {"LongType", u"{0,numbernumbernumbernumber,integer}", "?"},
};
INSTANTIATE_TEST_SUITE_P(Type, ZlvPatternScan, testing::ValuesIn(types),
                         [](const auto &row) { return std::string(row.param.label); });

const PatternRow places[] = {
    {"Several", u"{0} {1,number,integer} {2,number}", "TID"},
    {"AnyOrder", u"{2,number}{0}{1,number,integer}", "TID"},
    {"Gap", u"{0} {2}", "T-T"},
    {"OnlyTheLast", u"{9}", "---------T"},
    {"AllTen", u"{9}{8}{7}{6}{5}{4}{3}{2}{1}{0}", "TTTTTTTTTT"},
    {"TheLastOfTwoTypesCounts", u"{0} {0,number,integer}", "I"},
    {"Adjacent", u"{0}{1}", "TT"},
    {"ClosingBraceOutside", u"} {0} }", "T"},
};
INSTANTIATE_TEST_SUITE_P(Place, ZlvPatternScan, testing::ValuesIn(places),
                         [](const auto &row) { return std::string(row.param.label); });

const PatternRow structure[] = {
    {"BlanksAroundTheNumber", u"{ 0 }", "T"},
    {"BlanksAroundAllParts", u"{ 0 , number , integer }", "I"},
    {"CommasInTheStyle", u"{0,choice,0#a,b,c} {1}", "DT"},
    {"BracesInTheStyle", u"{0,choice,0#{1}|1#{2,number}} {3}", "D--T"},
    {"DeepBracesInTheStyle", u"{0,choice,{{}{}}} {1}", "DT"},
    {"QuotedClosingBraceInTheStyle", u"{0,choice,0#'}'} {1}", "DT"},
    {"QuotedOpeningBraceInTheStyle", u"{0,choice,0#'{'} {1}", "DT"},
    {"OpenAtTheEnd", u"{0} {1", "T"},
    {"OpenInTheTypeAtTheEnd", u"{0} {1,number", "T"},
    {"OpenInTheStyleAtTheEnd", u"{0} {1,number,{}", "T"},
    {"BraceAtTheEnd", u"{0} {", "T"},
};
INSTANTIATE_TEST_SUITE_P(Structure, ZlvPatternScan, testing::ValuesIn(structure),
                         [](const auto &row) { return std::string(row.param.label); });

const PatternRow quotes[] = {
    {"QuotedArgument", u"'{0}' {1}", "-T"},
    {"QuotedBrace", u"'{'0} {1}", "-T"},
    {"QuotedText", u"'text' {0}", "T"},
    {"DoubledQuote", u"it''s {0}", "T"},
    {"TwoDoubledQuotes", u"''it''s {0}", "T"},
    {"DoubledQuoteInQuotes", u"'it''s {0}' {1}", "-T"},
    {"SingleQuoteQuotesTheRest", u"it's {0}", ""},
    {"TwoSingleQuotesCancelOut", u"it's Ann's {0}", "T"},
    {"SecondQuoteEndsQuotingBeforeABrace", u"it's '{0}'", "T"},
    {"QuoteAtTheEnd", u"{0}'", "T"},
};
INSTANTIATE_TEST_SUITE_P(Quote, ZlvPatternScan, testing::ValuesIn(quotes),
                         [](const auto &row) { return std::string(row.param.label); });

const PatternRow numbers[] = {
    {"Ten", u"{0} {10} {1}", "TT"},
    {"NinetyNine", u"{99} {0}", "T"},
    {"LeadingZeros", u"{0000000001}", "-T"},
    {"TenDigits", u"{1234567890} {0}", "T"},
    {"LargestOfTenDigits", u"{9999999999} {0}", "T"},
    {"WrapsToZeroIn32Bits", u"{4294967296}", ""},
    {"WrapsToOneIn32Bits", u"{4294967297} {0}", "T"},
    {"LargestSigned32Bits", u"{2147483647} {0}", "T"},
    {"NegativeIn32Bits", u"{2147483648} {0}", "T"},
};
INSTANTIATE_TEST_SUITE_P(Number, ZlvPatternScan, testing::ValuesIn(numbers),
                         [](const auto &row) { return std::string(row.param.label); });

const PatternRow abandoned[] = {
    {"EmptyNumber", u"{0} {} {1}", ""},
    {"BlankNumber", u"{0} { } {1}", ""},
    {"EmptyNumberWithType", u"{0} {,number} {1}", ""},
    {"ElevenDigits", u"{0} {00000000000} {1}", ""},
    {"Name", u"{0} {name} {1}", ""},
    {"LetterBehindTheDigits", u"{0} {1x}", ""},
    {"Sign", u"{0} {-1}", ""},
    {"Plus", u"{0} {+1}", ""},
    {"Fraction", u"{0} {1.0}", ""},
    {"DigitOfAnotherScript", u"{0} {\u0661}", ""},
    {"BraceInTheNumber", u"{0} {{1}}", ""},
    {"BraceBehindTheNumber", u"{0} {1{}}", ""},
    {"BraceInTheType", u"{0} {1,{number}}", ""},
    {"BraceBehindTheType", u"{0} {1,number{}}", ""},
};
INSTANTIATE_TEST_SUITE_P(Abandoned, ZlvPatternScan, testing::ValuesIn(abandoned),
                         [](const auto &row) { return std::string(row.param.label); });

/* What is fetched: what the Unicode library, too, reads with the same kind. */

class ZlvPatternScanFetch : public testing::TestWithParam<PatternRow> {};

TEST_P(ZlvPatternScanFetch, StopsAtTheFirstArgumentThatCannotBeFetched)
{
    EXPECT_EQ(letters(zelvo::fetchableKinds(GetParam().pattern)), GetParam().kinds);
}

const PatternRow fetched[] = {
    {"All", u"{0} {1,number,integer} {2,number} {3,choice,0#none|1#some}", "TIDD"},
    {"UpToAGap", u"{0} {2}", "T"},
    {"UpToAnUnknownType", u"{0} {1,date} {2}", "T"},
    {"NothingBehindAnUnknownFirst", u"{0,date} {1}", ""},
    {"NothingWithoutTheFirst", u"{1}", ""},
    {"NothingThatOnlyToggledQuotesUncover", u"it's '{0}'", ""},
    {"NothingThatToggledQuotesCover", u"it's {0}", ""},
    {"QuotedBraces", u"'{0}' {0,number,integer}", "I"},
    {"DoubledQuotes", u"it''s {0}", "T"},
    {"UpToTheFirstDifference", u"{0} it's '{1}' {2}", "T"},
    {"NothingAbandoned", u"{0} {name}", ""},
    {"NumbersAboveNine", u"{0} {10}", "T"},
};
INSTANTIATE_TEST_SUITE_P(, ZlvPatternScanFetch, testing::ValuesIn(fetched),
                         [](const auto &row) { return std::string(row.param.label); });

} // namespace
} // namespace zelvo_test
