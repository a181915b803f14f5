// SPDX-License-Identifier: Apache-2.0
// The direct path for patterns: what it takes on, and that ICU would have said the same.
#include "ZlvPlainPattern.h"

#include <ostream>
#include <string>

#include <gtest/gtest.h>
#include <unicode/umsg.h>
#include <unicode/ustring.h>

#include "CxMemory.h"
#include "ZlvKept.h"
#include "support/FailAlloc.h"
#include "support/Rows.h"
#include "support/Text.h"
#include "support/VaList.h"

namespace zelvo_test {
namespace {

struct PatternRow {
    const char *row;
    const char16_t *pattern;
};

void PrintTo(const PatternRow &row, std::ostream *out)
{
    *out << row.row;
}

/* What is plain; each of these binds as ICU binds it. */

class ZlvPlainPattern : public ::testing::TestWithParam<PatternRow> {};

TEST_P(ZlvPlainPattern, BindsAsIcuDoes)
{
    const UChar *pattern = GetParam().pattern;
    const zelvo::PlainPattern plain{pattern};
    ASSERT_TRUE(plain.isPlain());
    UChar expected[512];
    UErrorCode status = U_ZERO_ERROR;
    withArgs(
        [&](va_list args) {
            u_vformatMessage("de", pattern, u_strlen(pattern), expected, 512, args, &status);
        },
        u"one", 1234567, u"", -8, u"five");
    ASSERT_TRUE(U_SUCCESS(status));
    withArgs(
        [&](va_list args) {
            UChar *text = plain.bind(zelvo::integerText("de"), args);
            EXPECT_EQ(std::u16string(text != nullptr ? text : u""), expected);
            RkoMemoryFree(text);
        },
        u"one", 1234567, u"", -8, u"five");
    zelvo::dropKept();
}

// The arguments are a text, an integer, an empty text, an integer and a text.
const PatternRow plainRows[] = {
    {"Empty", u""},
    {"Text", u"text"},
    {"OneText", u"{0}"},
    {"TextAround", u"a {0} b"},
    {"TextTwice", u"{0}{0}"},
    {"Integer", u"{0}{1,number,integer}"},
    {"EmptyArgument", u"{0}{1,number,integer}{2}"},
    {"All", u"{0}, {1,number,integer}, {2}, {3,number,integer} and {4}"},
    {"BackToFront", u"{2} {1,number,integer} {0}"},
    {"LoneApostrophe", u"it's {0}"},
    {"ApostropheAtTheEnd", u"{0}'"},
    {"ApostropheBehindAnArgument", u"{0}'s"},
    {"TwoApostrophes", u"it''s {0}"},
    {"ThreeApostrophes", u"'''"},
    {"FourApostrophes", u"''''{0}"},
    {"TwoApostrophesBeforeABrace", u"''{0}"},
    {"PipeAndHash", u"a|b#c {0}"},
    {"Surrogates", u"\xD83D\xDE00 \xDC00 {0}"},
    {"Control", u"\x01\t\n{0}"},
};
INSTANTIATE_TEST_SUITE_P(Rows, ZlvPlainPattern, ::testing::ValuesIn(plainRows), byRow);

/* What is left to ICU. */

class ZlvPatternThatIsNotPlain : public ::testing::TestWithParam<PatternRow> {};

TEST_P(ZlvPatternThatIsNotPlain, IsLeftToIcu)
{
    EXPECT_FALSE(zelvo::PlainPattern{GetParam().pattern}.isPlain());
}

const PatternRow otherRows[] = {
    {"QuotedBrace", u"'{0}'"},
    {"QuotedClosingBrace", u"'}'"},
    {"ThreeApostrophesBeforeABrace", u"'''{0}'"},
    {"UnclosedBrace", u"{0"},
    {"ClosingBrace", u"}"},
    {"Nothing", u"{}"},
    {"Word", u"{a}"},
    {"Blank", u"{ 0}"},
    {"BlankBehind", u"{0 }"},
    {"TwoDigits", u"{00}"},
    {"TenthArgument", u"{10}"},
    {"Number", u"{0,number}"},
    {"NumberPattern", u"{0,number,#.#}"},
    {"IntegerInCapitals", u"{0,NUMBER,integer}"},
    {"IntegerWithBlanks", u"{0, number, integer}"},
    {"CutInteger", u"{0,number,integer"},
    {"Date", u"{0,date}"},
    {"Choice", u"{0,choice,0#none|1#some}"},
    {"Plural", u"{0,plural,other{#}}"},
    {"TwoKinds", u"{0}{0,number,integer}"},
    {"Gap", u"{1}"},
    {"GapInTheMiddle", u"{0}{2}"},
    {"NegativeNumber", u"{-1}"},
};
INSTANTIATE_TEST_SUITE_P(Rows, ZlvPatternThatIsNotPlain, ::testing::ValuesIn(otherRows), byRow);

TEST(ZlvPlainPatternLimits, MorePiecesThanThereIsRoomForAreLeftToIcu)
{
    std::u16string pattern;
    for (int i = 0; i < 10; ++i)
        pattern += u"a{0}";
    EXPECT_TRUE(zelvo::PlainPattern{(pattern + u"b").c_str()}.isPlain());
    EXPECT_FALSE(zelvo::PlainPattern{(pattern + u"b{0}").c_str()}.isPlain());
}

TEST(ZlvPlainPatternLimits, AMissingTextGivesNothing)
{
    const zelvo::PlainPattern plain{u"{0} {1}"};
    withArgs([&](va_list args) { EXPECT_EQ(plain.bind(nullptr, args), nullptr); },
             static_cast<const UChar *>(nullptr), u"b");
    withArgs([&](va_list args) { EXPECT_EQ(plain.bind(nullptr, args), nullptr); }, u"a",
             static_cast<const UChar *>(nullptr));
}

TEST(ZlvPlainPatternLimits, WithoutArgumentsTheListIsNotTouched)
{
    const zelvo::PlainPattern plain{u"text"};
    UChar *text = plain.bind(nullptr, noArgs());
    EXPECT_EQ(std::u16string(text), u"text");
    RkoMemoryFree(text);
}

TEST(ZlvPlainPatternLimits, WithoutMemoryGivesNothing)
{
    const zelvo::PlainPattern plain{u"text"};
    const FailAlloc fail(0);
    EXPECT_EQ(plain.bind(nullptr, noArgs()), nullptr);
}

} // namespace
} // namespace zelvo_test
