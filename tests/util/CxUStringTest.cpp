// SPDX-License-Identifier: Apache-2.0
#include "CxUString.h"

#include <algorithm>
#include <cfloat>
#include <cstdio>
#include <cstdlib>
#include <string>

#include <gtest/gtest.h>

#include "ZlvParm.h"
#include "support/Buffers.h"
#include "support/FailAlloc.h"
#include "support/IcuDefaults.h"

namespace zelvo_test {
namespace {

TEST(CxUString, BytesBecomeUnits)
{
    EXPECT_EQ(taken(CxUStringDupStrToUChar("abc")), u"abc");
    EXPECT_EQ(taken(CxUStringDupStrToUChar("")), u"");
}

TEST(CxUString, UnitsBecomeBytes)
{
    EXPECT_EQ(taken(CxUStringDupUCharToStr(u"abc")), "abc");
    EXPECT_EQ(taken(CxUStringDupUCharToStr(u"")), "");
}

TEST(CxUString, DupGivesUnitsOfItsOwn)
{
    const UChar text[] = u"a\u20ACc";
    UChar *copy = CxUStringDup(text);
    EXPECT_NE(copy, text);
    EXPECT_EQ(taken(copy), u"a\u20ACc");
    EXPECT_EQ(taken(CxUStringDup(u"")), u"");
}

TEST(CxUString, NullGivesNull)
{
    EXPECT_EQ(CxUStringDupStrToUChar(nullptr), nullptr);
    EXPECT_EQ(CxUStringDupUCharToStr(nullptr), nullptr);
    EXPECT_EQ(CxUStringDup(nullptr), nullptr);
    EXPECT_EQ(CxUStringParmToStr(nullptr), nullptr);
}

TEST(CxUString, ConversionIsThatOfTheDefaultConverter)
{
    DefaultConverter utf8("UTF-8");
    EXPECT_EQ(taken(CxUStringDupStrToUChar("\xC3\xA9\xE2\x82\xAC")), u"\u00E9\u20AC");
    EXPECT_EQ(taken(CxUStringDupUCharToStr(u"\u00E9\u20AC")), "\xC3\xA9\xE2\x82\xAC");
}

TEST(CxUString, ThereIsRoomForEveryUnitsBytes)
{
    DefaultConverter utf8("UTF-8");
    std::u16string euros(1000, u'\u20AC');
    std::string bytes = taken(CxUStringDupUCharToStr(euros.c_str())).value_or("");
    EXPECT_EQ(bytes.size(), 3000U);
    EXPECT_EQ(taken(CxUStringDupStrToUChar(bytes.c_str())), euros);
}

TEST(CxUString, AFailedAllocationGivesNull)
{
    FailAlloc fail(0);
    EXPECT_EQ(CxUStringDupStrToUChar("a"), nullptr);
    EXPECT_EQ(CxUStringDupUCharToStr(u"a"), nullptr);
    EXPECT_EQ(CxUStringDup(u"a"), nullptr);
    EXPECT_EQ(fail.failed(), 3U);
}

/// What CxUStringToStdout writes for TEXT.
std::string printed(const UChar *text)
{
    testing::internal::CaptureStdout();
    CxStatus status = CxUStringToStdout(text);
    std::fflush(stdout);
    std::string output = testing::internal::GetCapturedStdout();
    EXPECT_EQ(status.type, '-');
    EXPECT_EQ(status.code, 0);
    return output;
}

TEST(CxUStringToStdout, WritesTheTextAndALineFeed)
{
    EXPECT_EQ(printed(u"hello"), "hello\n");
    EXPECT_EQ(printed(u""), "\n");
}

TEST(CxUStringToStdout, WritesTextsOfAnyLength)
{
    EXPECT_EQ(printed(std::u16string(5000, u'x').c_str()), std::string(5000, 'x').append("\n"));
}

TEST(CxUStringToStdout, LeavesStandardOutputOpen)
{
    EXPECT_EQ(printed(u"one"), "one\n");
    EXPECT_EQ(printed(u"two"), "two\n");
    EXPECT_EQ(std::ferror(stdout), 0);
}

TEST(CxUStringToStdout, UsesTheDefaultCodePage)
{
    DefaultConverter utf8("UTF-8");
    EXPECT_EQ(printed(u"\u20AC"), "\xE2\x82\xAC\n");
}

TEST(CxUStringToStdout, KeepsTheOrderWithOtherOutput)
{
    testing::internal::CaptureStdout();
    std::fputs("before ", stdout);
    CxUStringToStdout(u"text");
    std::fputs("after", stdout);
    std::fflush(stdout);
    EXPECT_EQ(testing::internal::GetCapturedStdout(), "before text\nafter");
}

TEST(CxUStringToStdout, OfANullStringSucceeds)
{
    testing::internal::CaptureStdout();
    CxStatus status = CxUStringToStdout(nullptr);
    testing::internal::GetCapturedStdout();
    EXPECT_EQ(status.type, '-');
    EXPECT_EQ(status.code, 0);
}

ZlvParm byteParm(uint32_t type, char value)
{
    ZlvParm parm{};
    parm.type = type;
    parm.value.byteValue = static_cast<uint8_t>(value);
    return parm;
}

ZlvParm intParm(uint32_t type, int32_t value)
{
    ZlvParm parm{};
    parm.type = type;
    parm.value.intValue = value;
    return parm;
}

ZlvParm doubleParm(double value)
{
    ZlvParm parm{};
    parm.type = 505;
    parm.value.doubleValue = value;
    return parm;
}

/// The text of a typed value.
std::string rendered(const ZlvParm &parm)
{
    return taken(CxUStringParmToStr(&parm)).value_or("(null)");
}

TEST(CxUStringParmToStr, AByteIsOneCharacter)
{
    EXPECT_EQ(rendered(byteParm(501, 'A')), "A");
}

TEST(CxUStringParmToStr, ACharacterIsOneCharacter)
{
    EXPECT_EQ(rendered(byteParm(506, 'z')), "z");
}

TEST(CxUStringParmToStr, AZeroByteIsTheEmptyText)
{
    EXPECT_EQ(rendered(byteParm(501, '\0')), "");
}

TEST(CxUStringParmToStr, AnIntegerIsSignedDecimal)
{
    EXPECT_EQ(rendered(intParm(502, 0)), "0");
    EXPECT_EQ(rendered(intParm(502, -5)), "-5");
    EXPECT_EQ(rendered(intParm(502, INT32_MAX)), "2147483647");
    EXPECT_EQ(rendered(intParm(502, INT32_MIN)), "-2147483648");
}

TEST(CxUStringParmToStr, ALongIsTheSameThirtyTwoBits)
{
    EXPECT_EQ(rendered(intParm(503, 1)), "1");
    EXPECT_EQ(rendered(intParm(503, -2147483647)), "-2147483647");
}

TEST(CxUStringParmToStr, AFloatHasSixFractionDigits)
{
    ZlvParm parm{};
    parm.type = 504;
    parm.value.floatValue = 2.5F;
    EXPECT_EQ(rendered(parm), "2.500000");
    parm.value.floatValue = -0.125F;
    EXPECT_EQ(rendered(parm), "-0.125000");
}

TEST(CxUStringParmToStr, ADoubleHasSixFractionDigits)
{
    EXPECT_EQ(rendered(doubleParm(2.5)), "2.500000");
    EXPECT_EQ(rendered(doubleParm(0.0)), "0.000000");
    EXPECT_EQ(rendered(doubleParm(-1234567.25)), "-1234567.250000");
}

TEST(CxUStringParmToStr, AGreatDoubleIsWrittenWhole)
{
    std::string text = rendered(doubleParm(1e300));
    EXPECT_EQ(text.size(), 308U);
    EXPECT_EQ(std::strtod(text.c_str(), nullptr), 1e300);
    EXPECT_EQ(rendered(doubleParm(-DBL_MAX)).size(), 317U);
}

TEST(CxUStringParmToStr, NumbersAreTheSameInEveryDefaultLocale)
{
    DefaultLocale german("de_DE");
    EXPECT_EQ(rendered(doubleParm(1234.5)), "1234.500000");
    EXPECT_EQ(rendered(intParm(502, 1234567)), "1234567");
}

TEST(CxUStringParmToStr, AStringIsWrittenAsItIs)
{
    char text[] = "a {0} 100% text";
    ZlvParm parm{};
    parm.type = 507;
    parm.value.stringValue = text;
    EXPECT_EQ(rendered(parm), text);
    text[0] = 0;
    EXPECT_EQ(rendered(parm), "");
}

TEST(CxUStringParmToStr, AStringIsCutAt255Units)
{
    for (size_t length : {254U, 255U, 256U, 257U, 1000U}) {
        std::string text(length, 'x');
        ZlvParm parm{};
        parm.type = 507;
        parm.value.stringValue = text.data();
        EXPECT_EQ(rendered(parm).size(), std::min<size_t>(length, 255)) << length;
    }
}

TEST(CxUStringParmToStr, AnyOtherTagGivesTheEmptyText)
{
    for (uint32_t type : {0U, 500U, 508U, UINT32_MAX})
        EXPECT_EQ(rendered(intParm(type, 65)), "") << type;
}

TEST(CxUStringParmToStr, WithoutMemoryGivesNull)
{
    ZlvParm parm = intParm(502, 1);
    FailAlloc fail(0);
    EXPECT_EQ(CxUStringParmToStr(&parm), nullptr);
    EXPECT_EQ(fail.failed(), 1U);
}

} // namespace
} // namespace zelvo_test
