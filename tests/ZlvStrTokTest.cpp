// SPDX-License-Identifier: Apache-2.0
#include "ZlvStrTok.h"

#include <gtest/gtest.h>

#include <ostream>
#include <vector>

#include "support/FailAlloc.h"
#include "support/Text.h"

namespace zelvo_test {
namespace {

using Tokens = std::vector<std::string>;

ZlvStrTokIter start(const char *string, const char *delimiters)
{
    ZlvStrTokIter at{};
    ZlvStrTokIterator(&at, string, delimiters);
    return at;
}

Tokens split(const char *string, const char *delimiters)
{
    Tokens tokens;
    ZlvStrTokIter at = start(string, delimiters);
    while (ZlvStrTokIterHasNext(at) && tokens.size() < 100) {
        tokens.push_back(taken(ZlvStrTokIterGet(at)).value_or("(null)"));
        ZlvStrTokIterNext(&at, at);
    }
    return tokens;
}

struct SplitRow {
    const char *label;
    const char *string;
    const char *delimiters;
    Tokens tokens;
};

void PrintTo(const SplitRow &row, std::ostream *out)
{
    *out << row.label;
}

class ZlvStrTok : public testing::TestWithParam<SplitRow> {};

TEST_P(ZlvStrTok, Splits)
{
    EXPECT_EQ(split(GetParam().string, GetParam().delimiters), GetParam().tokens);
}

const SplitRow rows[] = {
    {"Words", "one two three", " ", {"one", "two", "three"}},
    {"OneWord", "one", " ", {"one"}},
    {"RunsOfDelimiters", "one  \t two", " \t", {"one", "two"}},
    {"LeadingDelimiters", "  one", " ", {"one"}},
    {"TrailingDelimiters", "one  ", " ", {"one"}},
    {"DelimitersAlone", "   ", " ", {}},
    {"Empty", "", " ", {}},
    {"Null", nullptr, " ", {}},
    {"EachDelimiterOfTheSet",
     "a\tb\nc\rd\fe\vf g",
     " \t\r\n\f\v",
     {"a", "b", "c", "d", "e", "f", "g"}},
    {"NoDelimiterInTheString", "one two", ";", {"one two"}},
    {"StarPieces", "*ab**c*", "*", {"ab", "c"}},
    {"BytesAboveAscii", "\xC3\xA9;\xFF", ";", {"\xC3\xA9", "\xFF"}},
    {"DelimiterAboveAscii",
     "a\xFF"
     "b",
     "\xFF",
     {"a", "b"}},
    {"NullDelimiters", "a b", nullptr, {"a", " ", "b"}},
    {"EmptyDelimiters", "a b", "", {"a", " ", "b"}},
    {"NullDelimitersOfEmpty", "", nullptr, {}},
    {"EmptyDelimitersOfNull", nullptr, "", {}},
    {"BothNull", nullptr, nullptr, {}},
};

INSTANTIATE_TEST_SUITE_P(Each, ZlvStrTok, testing::ValuesIn(rows),
                         [](const auto &test) { return std::string(test.param.label); });

TEST(ZlvStrTokIterator, StartsAtTheStringItself)
{
    const char *string = "  one";
    const char *delimiters = " ";
    ZlvStrTokIter at = start(string, delimiters);
    EXPECT_EQ(at.position, string);
    EXPECT_EQ(at.delimiters, delimiters);
}

TEST(ZlvStrTokIterator, IgnoresANullPlace)
{
    ZlvStrTokIterator(nullptr, "one", " ");
}

TEST(ZlvStrTokIterator, MovesTheIteratorOnlyThroughNext)
{
    ZlvStrTokIter at = start(" one two", " ");
    EXPECT_EQ(ZlvStrTokIterHasNext(at), 1);
    EXPECT_EQ(taken(ZlvStrTokIterGet(at)), "one");
    EXPECT_EQ(taken(ZlvStrTokIterGet(at)), "one");
}

TEST(ZlvStrTokIterator, NextStopsRightBehindTheToken)
{
    const char *string = " one two";
    ZlvStrTokIter at = start(string, " ");
    ZlvStrTokIter next = ZlvStrTokIterNext(nullptr, at);
    EXPECT_EQ(next.position, string + 4);
    EXPECT_EQ(next.delimiters, at.delimiters);
}

TEST(ZlvStrTokIterator, NextGivesTheSamePlaceTwice)
{
    ZlvStrTokIter at = start("one two", " ");
    ZlvStrTokIter out{};
    ZlvStrTokIter next = ZlvStrTokIterNext(&out, at);
    EXPECT_EQ(out.position, next.position);
    EXPECT_EQ(out.delimiters, next.delimiters);
    EXPECT_EQ(taken(ZlvStrTokIterGet(out)), "two");
}

TEST(ZlvStrTokIterator, NextAdvancesOneByteWithoutDelimiters)
{
    const char *string = "ab";
    EXPECT_EQ(ZlvStrTokIterNext(nullptr, start(string, nullptr)).position, string + 1);
    EXPECT_EQ(ZlvStrTokIterNext(nullptr, start(string, "")).position, string + 1);
}

TEST(ZlvStrTokIterator, NextStaysAtTheEnd)
{
    const char *string = "";
    EXPECT_EQ(ZlvStrTokIterNext(nullptr, start(string, " ")).position, string);
    EXPECT_EQ(ZlvStrTokIterNext(nullptr, start(string, nullptr)).position, string);
}

TEST(ZlvStrTokIterator, NextStaysOnNull)
{
    EXPECT_EQ(ZlvStrTokIterNext(nullptr, start(nullptr, " ")).position, nullptr);
}

TEST(ZlvStrTokIterator, GetAtTheEndIsNull)
{
    EXPECT_EQ(ZlvStrTokIterGet(start("", " ")), nullptr);
    EXPECT_EQ(ZlvStrTokIterGet(start(nullptr, " ")), nullptr);
    EXPECT_EQ(ZlvStrTokIterGet(start("", nullptr)), nullptr);
}

TEST(ZlvStrTokIterator, GetOnDelimitersAloneIsNull)
{
    EXPECT_EQ(ZlvStrTokIterGet(start("   ", " ")), nullptr);
}

TEST(ZlvStrTokIterator, GetWithoutMemoryIsNull)
{
    FailAlloc fail(0);
    EXPECT_EQ(ZlvStrTokIterGet(start("one", " ")), nullptr);
    EXPECT_EQ(fail.failed(), 1u);
}

} // namespace
} // namespace zelvo_test
