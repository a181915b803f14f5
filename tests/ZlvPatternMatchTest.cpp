// SPDX-License-Identifier: Apache-2.0
// The wildcard match of identifiers, which never goes back.
#include <gtest/gtest.h>

#include <ostream>
#include <string>

#include "ZlvMsgIdFilter.h"

namespace zelvo_test {
namespace {

struct MatchRow {
    const char *label;
    const char *pattern;
    const char *text;
    ZlvBool matches;
};

void PrintTo(const MatchRow &row, std::ostream *out)
{
    *out << row.label;
}

class ZlvPatternMatches : public testing::TestWithParam<MatchRow> {};

TEST_P(ZlvPatternMatches, OrNot)
{
    EXPECT_EQ(ZlvPatternMatch(GetParam().pattern, GetParam().text), GetParam().matches);
}

const MatchRow rows[] = {
    // Patterns without a piece match everything.
    {"StarMatchesAText", "*", "ABC0001E", 1},
    {"StarMatchesTheEmptyText", "*", "", 1},
    {"StarMatchesAStar", "*", "*", 1},
    {"StarsMatchAText", "***", "ABC0001E", 1},
    {"StarsMatchTheEmptyText", "***", "", 1},
    {"EmptyMatchesAText", "", "ABC0001E", 1},
    {"EmptyMatchesTheEmptyText", "", "", 1},

    // A pattern without a star matches itself alone.
    {"ItselfMatches", "ABC0001E", "ABC0001E", 1},
    {"ItselfIsNotTheBeginning", "ABC", "ABC0001E", 0},
    {"ItselfIsNotTheEnd", "01E", "ABC0001E", 0},
    {"ItselfIsNotWithin", "000", "ABC0001E", 0},
    {"ItselfIsNotLonger", "ABC0001EX", "ABC0001E", 0},
    {"ItselfIsNotEmpty", "A", "", 0},
    {"CaseCounts", "abc0001e", "ABC0001E", 0},
    {"BytesAboveAsciiCount", "\xC3\xA9", "\xC3\xA9", 1},
    {"BytesAboveAsciiDiffer", "\xC3\xA9", "\xC3\xA8", 0},
    {"QuestionMarkIsAnOrdinaryByte", "AB?", "ABC", 0},
    {"BracketsAreOrdinaryBytes", "[A]", "[A]", 1},
    {"BlankIsAnOrdinaryByte", "A B*", "A BC", 1},

    // A star at the end counts directly behind the first piece.
    {"PrefixMatchesALongerText", "AB*", "ABC", 1},
    {"PrefixMatchesItself", "AB*", "AB", 1},
    {"PrefixMatchesWithSeveralStars", "AB***", "ABC", 1},
    {"PrefixMustBeginTheText", "AB*", "CAB", 0},
    {"PrefixIsNotLongerThanTheText", "AB*", "A", 0},
    {"PrefixOfTheEmptyText", "AB*", "", 0},
    {"PrefixCaseCounts", "ab*", "ABC", 0},
    {"PrefixMayComeAgain", "AB*", "ABAB", 1},

    // Elsewhere a star at the end does not count: the last piece must end the text.
    {"TrailingStarBehindALeadingOne", "*B*", "ABC", 0},
    {"TrailingStarBehindTheSecondPiece", "A*B*", "AxBC", 0},
    {"TrailingStarBehindTheSecondPieceAtTheEnd", "A*B*", "AxB", 1},
    {"TrailingStarBehindALeadingOneAtTheEnd", "*B*", "AB", 1},

    // The last piece is taken where it is found first, and must end the text there.
    {"SuffixMatches", "*W", "ABC001W", 1},
    {"SuffixThatComesEarlier", "*W", "AWC001W", 0},
    {"SuffixMatchesItself", "*W", "W", 1},
    {"SuffixTwiceInARow", "*AB", "ABAB", 0},
    {"SuffixOverlapsItself", "*AA", "AAA", 0},
    {"SuffixIsMissing", "*W", "ABC001E", 0},
    {"SuffixIsInTheMiddle", "*W", "ABW1", 0},
    {"SuffixOfTheEmptyText", "*W", "", 0},
    {"SuffixCaseCounts", "*w", "ABC001W", 0},
    {"SuffixBehindSeveralStars", "***W", "ABC001W", 1},

    // Pieces are found one behind the other.
    {"TwoPieces", "AB*E", "AB0001E", 1},
    {"TwoPiecesNothingBetween", "AB*E", "ABE", 1},
    {"TwoPiecesWithSeveralStars", "AB**E", "AB0001E", 1},
    {"TwoPiecesFirstMissing", "AB*E", "XB0001E", 0},
    {"TwoPiecesFirstNotAtTheBeginning", "AB*E", "XAB0001E", 0},
    {"TwoPiecesLastMissing", "AB*E", "AB0001W", 0},
    {"TwoPiecesLastNotAtTheEnd", "AB*E", "AB0001EX", 0},
    {"TwoPiecesLastComesEarlier", "AB*E", "ABE001E", 0},
    {"TwoPiecesShareNoByte", "AB*BC", "ABC", 0},
    {"TwoPiecesOfWhichTheFirstIsAll", "AB*E", "AB", 0},
    {"ThreePieces", "A*B*C", "A1B2C", 1},
    {"ThreePiecesInAnotherOrder", "A*B*C", "A1C2B", 0},
    {"ThreePiecesMiddleMissing", "A*B*C", "A1C", 0},
    {"ThreePiecesMiddleTakenFirst", "A*B*C", "ABxBC", 1},
    {"ThreePiecesLastBehindTheMiddle", "A*C*C", "ACxC", 1},
    {"LeadingStarTwoPieces", "*A*B", "xAyB", 1},
    {"LeadingStarTwoPiecesAtTheBeginning", "*A*B", "AB", 1},
    {"LeadingStarTwoPiecesInAnotherOrder", "*A*B", "xByA", 0},
    {"PieceWithinAPiece", "*AB*B", "ABB", 1},

    {"NullPattern", nullptr, "ABC", 0},
    {"NullText", "*", nullptr, 0},
    {"BothNull", nullptr, nullptr, 0},
};

INSTANTIATE_TEST_SUITE_P(, ZlvPatternMatches, testing::ValuesIn(rows),
                         [](const auto &row) { return std::string(row.param.label); });

TEST(ZlvPatternMatch, TakesPiecesAndTextsOfAnyLength)
{
    const std::string piece(70000, 'A');
    EXPECT_EQ(ZlvPatternMatch((piece + "*E").c_str(), (piece + "0001E").c_str()), 1);
    EXPECT_EQ(ZlvPatternMatch((piece + "*E").c_str(), piece.c_str()), 0);
}

} // namespace
} // namespace zelvo_test
