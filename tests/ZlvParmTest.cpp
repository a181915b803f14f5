// SPDX-License-Identifier: Apache-2.0
#include "ZlvParm.h"

#include <gtest/gtest.h>

#include <cmath>
#include <cstring>

#include "CxMemory.h"
#include "CxString.h"
#include "support/FailAlloc.h"

namespace zelvo_test {
namespace {

ZlvParm byteParm(uint32_t tag, uint8_t value)
{
    return {tag, {.byteValue = value}};
}
ZlvParm intParm(uint32_t tag, int32_t value)
{
    return {tag, {.intValue = value}};
}
ZlvParm floatParm(float value)
{
    return {ZLV_PARM_FLOAT, {.floatValue = value}};
}
ZlvParm doubleParm(double value)
{
    return {ZLV_PARM_DOUBLE, {.doubleValue = value}};
}
/// The text stays the caller's; parameters of this kind are never freed as such.
ZlvParm stringParm(const char *text)
{
    return {ZLV_PARM_STRING, {.stringValue = const_cast<char *>(text)}};
}

/// Copies PARM, shows the copy to CHECK and frees it.
template <class Check>
void withCopy(const ZlvParm &parm, Check check)
{
    ZlvParm *copy = ZlvCopyParm(&parm);
    ASSERT_NE(copy, nullptr);
    EXPECT_EQ(copy->type, parm.type);
    check(*copy);
    ZlvFreeParm(copy);
}

TEST(ZlvParmTags, AreTheNumbersThatRecordsCarry)
{
    EXPECT_EQ(ZLV_PARM_BYTE, 501);
    EXPECT_EQ(ZLV_PARM_INT, 502);
    EXPECT_EQ(ZLV_PARM_LONG, 503);
    EXPECT_EQ(ZLV_PARM_FLOAT, 504);
    EXPECT_EQ(ZLV_PARM_DOUBLE, 505);
    EXPECT_EQ(ZLV_PARM_CHAR, 506);
    EXPECT_EQ(ZLV_PARM_STRING, 507);
}

TEST(ZlvCopyParm, CopyOfNullIsNull)
{
    EXPECT_EQ(ZlvCopyParm(nullptr), nullptr);
}

TEST(ZlvCopyParm, CopyWithoutMemoryIsNull)
{
    ZlvParm parm = intParm(ZLV_PARM_INT, 1);
    FailAlloc fail(0);
    EXPECT_EQ(ZlvCopyParm(&parm), nullptr);
}

TEST(ZlvCopyParm, CopiesTheByteOfAOneByteValue)
{
    withCopy(byteParm(ZLV_PARM_BYTE, 0xE9),
             [](const ZlvParm &copy) { EXPECT_EQ(copy.value.byteValue, 0xE9); });
}

TEST(ZlvCopyParm, CopiesTheByteOfACharacter)
{
    withCopy(byteParm(ZLV_PARM_CHAR, 'x'),
             [](const ZlvParm &copy) { EXPECT_EQ(copy.value.byteValue, 'x'); });
}

TEST(ZlvCopyParm, CopiesTheWordOfAnInteger)
{
    withCopy(intParm(ZLV_PARM_INT, INT32_MIN),
             [](const ZlvParm &copy) { EXPECT_EQ(copy.value.intValue, INT32_MIN); });
}

TEST(ZlvCopyParm, CopiesTheWordOfALong)
{
    withCopy(intParm(ZLV_PARM_LONG, -2),
             [](const ZlvParm &copy) { EXPECT_EQ(copy.value.intValue, -2); });
}

TEST(ZlvCopyParm, CopiesTheWordOfAFloatBitByBit)
{
    ZlvParm nan = floatParm(std::nanf("7"));
    withCopy(nan, [&](const ZlvParm &copy) {
        EXPECT_EQ(std::memcmp(&copy.value.floatValue, &nan.value.floatValue, sizeof(float)), 0);
    });
}

TEST(ZlvCopyParm, CopiesBothWordsOfADouble)
{
    withCopy(doubleParm(-1.0 / 3),
             [](const ZlvParm &copy) { EXPECT_EQ(copy.value.doubleValue, -1.0 / 3); });
}

TEST(ZlvCopyParm, CopiesAStringIntoOneOfItsOwn)
{
    ZlvParm parm = stringParm("text");
    withCopy(parm, [&](const ZlvParm &copy) {
        EXPECT_NE(copy.value.stringValue, parm.value.stringValue);
        EXPECT_STREQ(copy.value.stringValue, "text");
    });
}

TEST(ZlvCopyParm, AnAbsentStringStaysAbsent)
{
    withCopy(stringParm(nullptr),
             [](const ZlvParm &copy) { EXPECT_EQ(copy.value.stringValue, nullptr); });
}

TEST(ZlvCopyParm, CopyWithoutMemoryForTheStringIsNull)
{
    ZlvParm parm = stringParm("text");
    FailAlloc fail(1);
    EXPECT_EQ(ZlvCopyParm(&parm), nullptr);
    EXPECT_EQ(fail.failed(), 1U);
}

TEST(ZlvCopyParm, OfAnUnknownTagOnlyTheTagIsCopied)
{
    for (uint32_t tag : {0U, 500U, 508U})
        withCopy(intParm(tag, 0x5A3C7E11),
                 [](const ZlvParm &copy) { EXPECT_NE(copy.value.intValue, 0x5A3C7E11); });
}

TEST(ZlvFreeParm, IgnoresNull)
{
    ZlvFreeParm(nullptr);
    EXPECT_EQ(ZlvCmpParms(nullptr, nullptr), 1);
}

TEST(ZlvFreeParm, FreesARecordWhoseStringIsAbsent)
{
    auto *parm = static_cast<ZlvParm *>(RkoMemoryCalloc(1, sizeof(ZlvParm)));
    parm->type = ZLV_PARM_STRING;
    ZlvFreeParm(parm);
}

TEST(ZlvFreeParm, FreesTheStringOnlyUnderTheStringTag)
{
    char text[] = "not of the heap";
    auto *parm = static_cast<ZlvParm *>(RkoMemoryCalloc(1, sizeof(ZlvParm)));
    *parm = {999, {.stringValue = text}};
    ZlvFreeParm(parm);
    EXPECT_STREQ(text, "not of the heap");
}

TEST(ZlvCmpParms, TwoNullsAreEqual)
{
    EXPECT_EQ(ZlvCmpParms(nullptr, nullptr), 1);
}

TEST(ZlvCmpParms, NullEqualsNoRecord)
{
    ZlvParm parm = intParm(ZLV_PARM_INT, 0);
    EXPECT_EQ(ZlvCmpParms(&parm, nullptr), 0);
    EXPECT_EQ(ZlvCmpParms(nullptr, &parm), 0);
}

/// Two values and whether they are equal.
struct Pair {
    const char *name;
    ZlvParm a;
    ZlvParm b;
    ZlvBool equal;
};

class ZlvCmpParmsPairs : public testing::TestWithParam<Pair> {};

TEST_P(ZlvCmpParmsPairs, CompareAlikeInBothOrders)
{
    const Pair &pair = GetParam();
    EXPECT_EQ(ZlvCmpParms(&pair.a, &pair.b), pair.equal);
    EXPECT_EQ(ZlvCmpParms(&pair.b, &pair.a), pair.equal);
}

const char otherText[] = {'t', 'e', 'x', 't', '\0'};

const Pair pairs[] = {
    {"EqualBytes", byteParm(ZLV_PARM_BYTE, 200), byteParm(ZLV_PARM_BYTE, 200), 1},
    {"DifferentBytes", byteParm(ZLV_PARM_BYTE, 200), byteParm(ZLV_PARM_BYTE, 201), 0},
    {"EqualChars", byteParm(ZLV_PARM_CHAR, 'x'), byteParm(ZLV_PARM_CHAR, 'x'), 1},
    {"DifferentChars", byteParm(ZLV_PARM_CHAR, 'x'), byteParm(ZLV_PARM_CHAR, 'X'), 0},
    {"ByteAndChar", byteParm(ZLV_PARM_BYTE, 'x'), byteParm(ZLV_PARM_CHAR, 'x'), 0},
    {"EqualInts", intParm(ZLV_PARM_INT, -1), intParm(ZLV_PARM_INT, -1), 1},
    {"DifferentInts", intParm(ZLV_PARM_INT, 1), intParm(ZLV_PARM_INT, 257), 0},
    {"EqualLongs", intParm(ZLV_PARM_LONG, 7), intParm(ZLV_PARM_LONG, 7), 1},
    {"DifferentLongs", intParm(ZLV_PARM_LONG, 7), intParm(ZLV_PARM_LONG, 8), 0},
    {"IntAndLong", intParm(ZLV_PARM_INT, 7), intParm(ZLV_PARM_LONG, 7), 0},
    {"EqualFloats", floatParm(1.5F), floatParm(1.5F), 1},
    {"DifferentFloats", floatParm(1.5F), floatParm(1.25F), 0},
    {"FloatZeros", floatParm(0.0F), floatParm(-0.0F), 1},
    {"FloatNaNs", floatParm(NAN), floatParm(NAN), 0},
    {"EqualDoubles", doubleParm(0.1), doubleParm(0.1), 1},
    {"DifferentDoubles", doubleParm(0.1), doubleParm(0.2), 0},
    {"DoublesThatDifferInTheLastBit", doubleParm(1.0), doubleParm(std::nextafter(1.0, 2.0)), 0},
    {"DoubleZeros", doubleParm(0.0), doubleParm(-0.0), 1},
    {"DoubleNaNs", doubleParm(NAN), doubleParm(NAN), 0},
    {"EqualStrings", stringParm("text"), stringParm(otherText), 1},
    {"DifferentStrings", stringParm("text"), stringParm("Text"), 0},
    {"APrefix", stringParm("text"), stringParm("tex"), 0},
    {"NullStrings", stringParm(nullptr), stringParm(nullptr), 0},
    {"NullAndEmptyString", stringParm(nullptr), stringParm(""), 0},
    {"TagsBelow", intParm(500, 1), intParm(500, 1), 0},
    {"TagsAbove", intParm(508, 1), intParm(508, 1), 0},
    {"ZeroTags", intParm(0, 1), intParm(0, 1), 0},
};

INSTANTIATE_TEST_SUITE_P(Rows, ZlvCmpParmsPairs, testing::ValuesIn(pairs),
                         [](const auto &row) { return std::string(row.param.name); });

TEST(ZlvCmpParms, ANaNDoesNotEvenEqualItself)
{
    ZlvParm nan = doubleParm(NAN);
    EXPECT_EQ(ZlvCmpParms(&nan, &nan), 0);
}

} // namespace
} // namespace zelvo_test
