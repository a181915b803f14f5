// SPDX-License-Identifier: Apache-2.0
// The arguments of logging calls arrive in the record as they were given.
#include <cstdint>
#include <limits>

#include "CppTest.h"

namespace zelvo_test {

using CppArguments = CppTest;

TEST_F(CppArguments, TextArrivesFromEachOfItsTypes)
{
    const std::u16string string = u"string";
    const char16_t *pointer = u"pointer";
    app_.text(u"{0} {1} {2} {3}", u"literal", pointer, string, zelvo::utf16("bytes"));
    EXPECT_EQ(text(), u"literal pointer string bytes");
}

TEST_F(CppArguments, AViewArrivesWithoutWhatFollowsIt)
{
    const std::u16string_view whole = u"one two three";
    app_.text(u"<{0}>", whole.substr(4, 3));
    EXPECT_EQ(text(), u"<two>");
    app_.text(u"<{0}>", std::u16string_view());
    EXPECT_EQ(text(), u"<>");
}

TEST_F(CppArguments, ALongViewArrivesWhole)
{
    const std::u16string whole(100000, u'x');
    app_.text(u"{0}", std::u16string_view(whole));
    EXPECT_EQ(text(), whole);
}

TEST_F(CppArguments, ATextEndsAtItsFirstZero)
{
    app_.text(u"<{0}>", std::u16string(u"a\0b", 3));
    EXPECT_EQ(text(), u"<a>");
}

TEST_F(CppArguments, AMissingTextIsTheEmptyText)
{
    const char16_t *none = nullptr;
    app_.text(u"<{0}> <{1}>", none, zelvo::UString());
    EXPECT_EQ(text(), u"<> <>");
}

TEST_F(CppArguments, ATemporaryStringLivesUntilTheCallReturns)
{
    app_.text(u"{0} {1}", std::u16string(50, u'a'), std::u16string(u"b") + u"c");
    EXPECT_EQ(text(), std::u16string(50, u'a') + u" bc");
}

TEST_F(CppArguments, IntegersArriveFromEachOfTheirTypes)
{
    const short small = -7;
    const unsigned short large = 65535;
    app_.text(u"{0,number,integer} {1,number,integer} {2,number,integer} {3,number,integer}", small,
              large, std::numeric_limits<int32_t>::min(), std::numeric_limits<int32_t>::max());
    EXPECT_EQ(text(), u"-7 65,535 -2,147,483,648 2,147,483,647");
}

TEST_F(CppArguments, FloatingNumbersArriveFromEachOfTheirTypes)
{
    app_.text(u"{0,number} {1,number}", 2.5F, -1234.5);
    EXPECT_EQ(text(), u"2.5 -1,234.5");
}

TEST_F(CppArguments, ADateIsADouble)
{
    const UDate start = 0;
    app_.text(u"{0,date,yyyy}", start);
    EXPECT_EQ(text(), u"1970");
}

TEST_F(CppArguments, ArgumentsOfDifferentTypesKeepTheirOrder)
{
    app_.text(u"{0} {1,number,integer} {2,number} {3} {4,number,integer} {5,number} {6}", u"a", 1,
              1.5, std::u16string(u"b"), 2, 2.5, std::u16string_view(u"c"));
    EXPECT_EQ(text(), u"a 1 1.5 b 2 2.5 c");
}

TEST_F(CppArguments, MoreArgumentsThanRegistersArrive)
{
    app_.text(u"{0,number,integer} {1,number,integer} {2,number,integer} {3,number,integer} "
              u"{4,number,integer} {5,number} {6,number} {7,number} {8,number} {9,number} "
              u"{10,number} {11,number} {12,number} {13,number} {14}",
              0, 1, 2, 3, 4, 5.5, 6.5, 7.5, 8.5, 9.5, 10.5, 11.5, 12.5, 13.5, u"end");
    EXPECT_EQ(text(), u"0 1 2 3 4 5.5 6.5 7.5 8.5 9.5 10.5 11.5 12.5 13.5 end");
}

TEST_F(CppArguments, ACallableIsAskedForItsArgument)
{
    app_.text(
        u"{0} {1} {2,number,integer} {3,number}", [] { return std::u16string(50, u's'); },
        [] { return std::u16string_view(u"view"); }, [] { return 3; }, [] { return 0.5F; });
    EXPECT_EQ(text(), std::u16string(50, u's') + u" view 3 0.5");
}

TEST_F(CppArguments, ACallableMayGiveACallable)
{
    app_.text(u"{0}", [] { return [] { return u"inner"; }; });
    EXPECT_EQ(text(), u"inner");
}

TEST_F(CppArguments, ACallableMayLogItself)
{
    app_.text(u"outer {0}", [this] {
        app_.text(u"inner");
        return text();
    });
    EXPECT_EQ(text(), u"outer inner");
    EXPECT_EQ(memory_.count(), 2U);
}

TEST_F(CppArguments, ACallableIsNotAskedForARefusedCall)
{
    int asked = 0;
    app_.setProperty("level", "OFF");
    app_.debugMin(u"{0,number,integer}", [&asked] { return ++asked; });
    app_.info("bundle", "key", [&asked] { return ++asked; });
    app_.setEnabled(false);
    app_.text(u"{0,number,integer}", [&asked] { return ++asked; });
    zelvo::Logger().text(u"{0,number,integer}", [&asked] { return ++asked; });
    EXPECT_EQ(asked, 0);
    EXPECT_EQ(memory_.count(), 0U);
}

TEST_F(CppArguments, APatternMayBeAString)
{
    const std::u16string pattern = u"from a string: {0}";
    app_.text(pattern, u"yes");
    EXPECT_EQ(text(), u"from a string: yes");
    app_.debugMin(pattern, u"too");
    EXPECT_EQ(text(), u"from a string: too");
}

TEST_F(CppArguments, ANullPatternLeavesTheEventWithoutText)
{
    app_.text(nullptr);
    EXPECT_EQ(text(), u"");
    EXPECT_EQ(memory_.count(), 1U);
}

} // namespace zelvo_test
