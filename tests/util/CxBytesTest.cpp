// SPDX-License-Identifier: Apache-2.0
// The bytes of texts, against the conversion that allocates.
#include "util/CxBytes.h"

#include <string>

#include <gtest/gtest.h>

#include "CxUString.h"
#include "support/FailAlloc.h"
#include "support/Text.h"

namespace zelvo_test {
namespace {

void expectSame(const std::u16string &text)
{
    const zelvo::Bytes bytes{text.c_str()};
    const Text expected = taken(CxUStringDupUCharToStr(text.c_str()));
    ASSERT_TRUE(expected.has_value());
    EXPECT_EQ(std::string(bytes.get(), bytes.length()), *expected);
}

TEST(CxBytes, AreThoseOfTheConversion)
{
    expectSame(u"");
    expectSame(u"plain");
    expectSame(u"\x7F\x01");
    expectSame(u"\x80");
    expectSame(u"gr\u00FC\u00DFe \U0001F600");
    expectSame(std::u16string(1, char16_t{0xD83D}));
}

TEST(CxBytes, OfTextsAroundTheSizeOfTheAreaAreThoseOfTheConversion)
{
    for (const size_t length : {1022u, 1023u, 1024u, 1025u, 5000u}) {
        expectSame(std::u16string(length, u'x'));
        expectSame(std::u16string(length, u'x') + u'\u00E4');
    }
}

TEST(CxBytes, OfNoTextAreNone)
{
    EXPECT_EQ(zelvo::Bytes{nullptr}.get(), nullptr);
}

TEST(CxBytes, OfShortPlainTextsNeedNoMemory)
{
    const FailAlloc fail(0);
    EXPECT_EQ(zelvo::Bytes{u"plain"}.length(), 5u);
    EXPECT_EQ(zelvo::Bytes{u"\u00E4"}.get(), nullptr);
    EXPECT_EQ(fail.failed(), 1u);
}

} // namespace
} // namespace zelvo_test
