// SPDX-License-Identifier: Apache-2.0
#include <gtest/gtest.h>

#include <cstring>
#include <string>

#include "CxMemory.h"
#include "CxString.h"
#include "support/FailAlloc.h"

namespace zelvo_test {
namespace {

/// The four comparisons, each over the whole of short strings.
struct Comparison {
    const char *name;
    int (*compare)(const char *, const char *);
};

class CxStringComparison : public testing::TestWithParam<Comparison> {};

TEST_P(CxStringComparison, AnswersOneWhenTheFirstIsNull)
{
    EXPECT_EQ(GetParam().compare(nullptr, "a"), 1);
}

TEST_P(CxStringComparison, AnswersMinusOneWhenTheSecondIsNull)
{
    EXPECT_EQ(GetParam().compare("a", nullptr), -1);
}

TEST_P(CxStringComparison, AnswersOneWhenBothAreNull)
{
    EXPECT_EQ(GetParam().compare(nullptr, nullptr), 1);
}

TEST_P(CxStringComparison, AnswersZeroForEqualStrings)
{
    EXPECT_EQ(GetParam().compare("same", "same"), 0);
}

TEST_P(CxStringComparison, IsNegativeWhenTheFirstComesBefore)
{
    EXPECT_LT(GetParam().compare("abc", "abd"), 0);
}

TEST_P(CxStringComparison, IsPositiveWhenTheFirstComesAfter)
{
    EXPECT_GT(GetParam().compare("abd", "abc"), 0);
}

TEST_P(CxStringComparison, PutsAPrefixBeforeTheLongerString)
{
    EXPECT_LT(GetParam().compare("ab", "abc"), 0);
}

TEST_P(CxStringComparison, PutsTheEmptyStringAfterNull)
{
    EXPECT_EQ(GetParam().compare("", nullptr), -1);
}

int compareNine(const char *a, const char *b)
{
    return RkoStringNCmp(a, b, 9);
}

int compareNineIgnoringCase(const char *a, const char *b)
{
    return RkoStringNICmp(a, b, 9);
}

INSTANTIATE_TEST_SUITE_P(All, CxStringComparison,
                         testing::Values(Comparison{"Cmp", RkoStringCmp},
                                         Comparison{"NCmp", compareNine},
                                         Comparison{"ICmp", RkoStringICmp},
                                         Comparison{"NICmp", compareNineIgnoringCase}),
                         [](const auto &row) { return std::string(row.param.name); });

TEST(CxString, CmpDistinguishesCase)
{
    EXPECT_NE(RkoStringCmp("Level", "level"), 0);
}

TEST(CxString, NCmpDistinguishesCase)
{
    EXPECT_NE(RkoStringNCmp("Level", "level", 5), 0);
}

TEST(CxString, NCmpComparesOnlyTheFirstBytes)
{
    EXPECT_EQ(RkoStringNCmp("abcX", "abcY", 3), 0);
    EXPECT_LT(RkoStringNCmp("abcX", "abcY", 4), 0);
}

TEST(CxString, NCmpOfNullAnswersTheSameForNoBytes)
{
    EXPECT_EQ(RkoStringNCmp(nullptr, "a", 0), 1);
    EXPECT_EQ(RkoStringNCmp("a", nullptr, 0), -1);
}

TEST(CxString, ICmpIgnoresCase)
{
    EXPECT_EQ(RkoStringICmp("LeVeL", "lEvEl"), 0);
}

TEST(CxString, NICmpIgnoresCaseInTheFirstBytes)
{
    EXPECT_EQ(RkoStringNICmp("ABCx", "abcY", 3), 0);
    EXPECT_LT(RkoStringNICmp("ABCx", "abcY", 4), 0);
}

TEST(CxString, CpyCopiesTheStringAndGivesTheDestination)
{
    char dst[8] = "xxxxxxx";
    EXPECT_EQ(RkoStringCpy(dst, "abc"), dst);
    EXPECT_STREQ(dst, "abc");
    EXPECT_EQ(dst[4], 'x');
}

TEST(CxString, CpyOfNullEmptiesTheDestination)
{
    char dst[8] = "xxxxxxx";
    EXPECT_EQ(RkoStringCpy(dst, nullptr), dst);
    EXPECT_STREQ(dst, "");
    EXPECT_EQ(dst[1], 'x');
}

TEST(CxString, CpyToNullGivesNull)
{
    EXPECT_EQ(RkoStringCpy(nullptr, "x"), nullptr);
    EXPECT_EQ(RkoStringCpy(nullptr, nullptr), nullptr);
}

TEST(CxString, NCpyCopiesAtMostNBytesWithoutATerminator)
{
    char dst[8] = "xxxxxxx";
    EXPECT_EQ(RkoStringNCpy(dst, "abcdef", 3), dst);
    EXPECT_STREQ(dst, "abcxxxx");
}

TEST(CxString, NCpyAddsNoTerminatorWhenTheStringIsExactlyNBytes)
{
    char dst[8] = "xxxxxxx";
    RkoStringNCpy(dst, "abc", 3);
    EXPECT_STREQ(dst, "abcxxxx");
}

TEST(CxString, NCpyFillsTheRestOfNBytesWithZeros)
{
    char dst[8] = "xxxxxxx";
    RkoStringNCpy(dst, "ab", 5);
    EXPECT_EQ(std::memcmp(dst, "ab\0\0\0xx", 8), 0);
}

TEST(CxString, NCpyOfNullEmptiesTheDestination)
{
    char dst[8] = "xxxxxxx";
    EXPECT_EQ(RkoStringNCpy(dst, nullptr, 4), dst);
    EXPECT_STREQ(dst, "");
}

TEST(CxString, NCpyToNullGivesNull)
{
    EXPECT_EQ(RkoStringNCpy(nullptr, "x", 1), nullptr);
    EXPECT_EQ(RkoStringNCpy(nullptr, nullptr, 1), nullptr);
}

TEST(CxString, CatAppendsTheString)
{
    char dst[8] = "ab";
    EXPECT_EQ(RkoStringCat(dst, "cd"), dst);
    EXPECT_STREQ(dst, "abcd");
}

TEST(CxString, CatOfNullLeavesTheDestination)
{
    char dst[8] = "ab";
    EXPECT_EQ(RkoStringCat(dst, nullptr), dst);
    EXPECT_STREQ(dst, "ab");
}

TEST(CxString, CatToNullGivesNull)
{
    EXPECT_EQ(RkoStringCat(nullptr, "x"), nullptr);
    EXPECT_EQ(RkoStringCat(nullptr, nullptr), nullptr);
}

TEST(CxString, NCatAppendsAShorterStringWhole)
{
    char dst[16] = "x";
    EXPECT_EQ(RkoStringNCat(dst, "abc", 10), dst);
    EXPECT_STREQ(dst, "xabc");
}

TEST(CxString, NCatAppendsOnlyNBytesAndTerminates)
{
    char dst[16] = "x\0yyyyyyy";
    RkoStringNCat(dst, "abc", 2);
    EXPECT_STREQ(dst, "xab");
}

TEST(CxString, NCatOfAShorterStringWritesNothingBehindItsTerminator)
{
    char dst[8] = {'x', 0, 'y', 'y', 'y', 'y', 'y', 0};
    RkoStringNCat(dst, "ab", 6);
    EXPECT_EQ(std::memcmp(dst, "xab\0yyy", 8), 0);
}

TEST(CxString, NCatOfNoBytesLeavesTheDestination)
{
    char dst[8] = "ab";
    RkoStringNCat(dst, "cd", 0);
    EXPECT_STREQ(dst, "ab");
}

TEST(CxString, NCatOfNullLeavesTheDestination)
{
    char dst[8] = "ab";
    EXPECT_EQ(RkoStringNCat(dst, nullptr, 3), dst);
    EXPECT_STREQ(dst, "ab");
}

TEST(CxString, NCatToNullGivesNull)
{
    EXPECT_EQ(RkoStringNCat(nullptr, "x", 1), nullptr);
    EXPECT_EQ(RkoStringNCat(nullptr, nullptr, 1), nullptr);
}

TEST(CxString, DupGivesANewEqualString)
{
    const char *source = "abc";
    char *copy = RkoStringDup(source);
    EXPECT_STREQ(copy, "abc");
    EXPECT_NE(copy, source);
    RkoMemoryFree(copy);
}

TEST(CxString, DupOfTheEmptyStringIsANewString)
{
    const char *source = "";
    char *copy = RkoStringDup(source);
    EXPECT_STREQ(copy, "");
    EXPECT_NE(copy, source);
    RkoMemoryFree(copy);
}

TEST(CxString, DupOfNullIsNull)
{
    EXPECT_EQ(RkoStringDup(nullptr), nullptr);
}

TEST(CxString, DupGivesNullWhenMemoryRanOut)
{
    FailAlloc fail(0);
    EXPECT_EQ(RkoStringDup("abc"), nullptr);
    EXPECT_EQ(fail.failed(), 1U);
}

TEST(CxString, LenCountsTheBytesBeforeTheTerminator)
{
    EXPECT_EQ(RkoStringLen("abc"), 3U);
    EXPECT_EQ(RkoStringLen(""), 0U);
}

TEST(CxString, LenOfNullIsZero)
{
    EXPECT_EQ(RkoStringLen(nullptr), 0U);
}

TEST(CxString, ChrFindsTheFirstOccurrence)
{
    const char *text = "a.b.c";
    EXPECT_EQ(RkoStringChr(text, '.'), text + 1);
    EXPECT_EQ(RkoStringChr(text, 'x'), nullptr);
}

TEST(CxString, ChrFindsTheTerminator)
{
    const char *text = "abc";
    EXPECT_EQ(RkoStringChr(text, 0), text + 3);
}

TEST(CxString, ChrInNullIsNull)
{
    EXPECT_EQ(RkoStringChr(nullptr, 'a'), nullptr);
}

TEST(CxString, RChrFindsTheLastOccurrence)
{
    const char *text = "a.b.c";
    EXPECT_EQ(RkoStringRChr(text, '.'), text + 3);
    EXPECT_EQ(RkoStringRChr(text, 'x'), nullptr);
}

TEST(CxString, RChrInNullIsNull)
{
    EXPECT_EQ(RkoStringRChr(nullptr, 'a'), nullptr);
}

TEST(CxString, StrFindsTheFirstPart)
{
    const char *text = "one two two";
    EXPECT_EQ(RkoStringStr(text, "two"), text + 4);
    EXPECT_EQ(RkoStringStr(text, "three"), nullptr);
    EXPECT_EQ(RkoStringStr(text, ""), text);
}

TEST(CxString, StrWithANullArgumentIsNull)
{
    EXPECT_EQ(RkoStringStr(nullptr, "a"), nullptr);
    EXPECT_EQ(RkoStringStr("a", nullptr), nullptr);
    EXPECT_EQ(RkoStringStr(nullptr, nullptr), nullptr);
}

TEST(CxString, StrpbrkFindsTheFirstByteOfTheSet)
{
    const char *text = "key = value";
    EXPECT_EQ(RkoStringStrpbrk(text, "=: "), text + 3);
    EXPECT_EQ(RkoStringStrpbrk(text, "?!"), nullptr);
}

TEST(CxString, StrpbrkWithANullArgumentIsNull)
{
    EXPECT_EQ(RkoStringStrpbrk(nullptr, "a"), nullptr);
    EXPECT_EQ(RkoStringStrpbrk("a", nullptr), nullptr);
    EXPECT_EQ(RkoStringStrpbrk(nullptr, nullptr), nullptr);
}

TEST(CxString, StrcspnCountsTheBytesBeforeARejectedOne)
{
    EXPECT_EQ(RkoStringStrcspn("abc,def", ",;"), 3);
    EXPECT_EQ(RkoStringStrcspn("abc", ",;"), 3);
    EXPECT_EQ(RkoStringStrcspn(",abc", ",;"), 0);
}

TEST(CxString, StrcspnOfNullIsMinusOne)
{
    EXPECT_EQ(RkoStringStrcspn(nullptr, "x"), -1);
    EXPECT_EQ(RkoStringStrcspn(nullptr, nullptr), -1);
}

TEST(CxString, StrcspnWithoutASetIsTheLength)
{
    EXPECT_EQ(RkoStringStrcspn("abc", nullptr), 3);
}

TEST(CxString, StrspnCountsTheAcceptedBytesAtTheStart)
{
    EXPECT_EQ(RkoStringStrspn("aab,b", "ab"), 3);
    EXPECT_EQ(RkoStringStrspn("xab", "ab"), 0);
    EXPECT_EQ(RkoStringStrspn("abab", "ab"), 4);
}

TEST(CxString, StrspnOfNullIsMinusOne)
{
    EXPECT_EQ(RkoStringStrspn(nullptr, "x"), -1);
    EXPECT_EQ(RkoStringStrspn(nullptr, nullptr), -1);
}

TEST(CxString, StrspnWithoutASetIsZero)
{
    EXPECT_EQ(RkoStringStrspn("abc", nullptr), 0);
}

TEST(CxString, SprintfWritesTheFormattedTextAndCountsIt)
{
    char dst[32];
    EXPECT_EQ(RkoStringSprintf(dst, "%s=%d", "level", 42), 8);
    EXPECT_STREQ(dst, "level=42");
}

} // namespace
} // namespace zelvo_test
