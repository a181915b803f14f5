// SPDX-License-Identifier: Apache-2.0
// What an XML record tells translators.
#include <unicode/putil.h>

#include "ZlvPDXMLFormatter.h"
#include "support/Buffers.h"
#include "support/Records.h"

namespace zelvo_test {
namespace {

class ZlvPDXMLTranslation : public XMLRecordFixture {
protected:
    /// The element that the event gets with ARGUMENTS.
    template <class... Arguments>
    std::u16string element(Arguments... arguments)
    {
        UBuff buff;
        HeldMutex held;
        withArgs([&](va_list args) { zlvPDXMLEmitUTranslationInfo(&buff, event_, args); },
                 arguments...);
        return buff.text();
    }

    /// What an element of the tests' bundle looks like.
    static std::u16string of(const std::u16string &key, const std::u16string &parameters)
    {
        return u" <TranslationInfo Resource Bundle=\"" ZELVO_TEST_BUNDLES "/zelvomsg\" MsgKey=\"" +
               key + u"\">" + parameters + u"</TranslationInfo>\n";
    }

    static std::u16string param(const std::u16string &value)
    {
        return u"<Param><![CDATA[" + value + u"]]></Param>";
    }
};

TEST_F(ZlvPDXMLTranslation, NamesBundleAndKey)
{
    key("plain");
    EXPECT_EQ(element(), of(u"plain", u""));
}

TEST_F(ZlvPDXMLTranslation, HoldsATextThenAnInteger)
{
    key("both");
    EXPECT_EQ(element(u"disk", 3), of(u"both", param(u"disk") + param(u"3")));
}

TEST_F(ZlvPDXMLTranslation, HoldsAllFourKindsOfArguments)
{
    key("four");
    EXPECT_EQ(element(u"disk", -3, 0.1234567, 1.0),
              of(u"four", param(u"disk") + param(u"-3") + param(u"0.12346") + param(u"1")));
}

TEST_F(ZlvPDXMLTranslation, HoldsTheExtremesOfIntegers)
{
    key("count");
    EXPECT_EQ(element(INT32_MIN), of(u"count", param(u"-2147483648")));
    EXPECT_EQ(element(INT32_MAX), of(u"count", param(u"2147483647")));
}

TEST_F(ZlvPDXMLTranslation, HoldsNothingForADoubleThatIsTooLong)
{
    key("four");
    EXPECT_EQ(element(u"", 0, 1e300, -2.5),
              of(u"four", param(u"") + param(u"0") + param(u"") + param(u"-2.5")));
}

TEST_F(ZlvPDXMLTranslation, HoldsArgumentsByNumberNotByPlace)
{
    key("reversed");
    EXPECT_EQ(element(3, u"disk"), of(u"reversed", param(u"3") + param(u"disk")));
}

TEST_F(ZlvPDXMLTranslation, HoldsTenArguments)
{
    key("allTen");
    std::u16string all;
    for (const char16_t *each : {u"a", u"b", u"c", u"d", u"e", u"f", u"g", u"h", u"i", u"j"})
        all += param(each);
    EXPECT_EQ(element(u"a", u"b", u"c", u"d", u"e", u"f", u"g", u"h", u"i", u"j"),
              of(u"allTen", all));
}

TEST_F(ZlvPDXMLTranslation, StopsAtAnAbsentArgument)
{
    key("gap");
    EXPECT_EQ(element(u"a", u"b", u"c"), of(u"gap", param(u"a")));
}

TEST_F(ZlvPDXMLTranslation, StopsAtAnUnknownArgument)
{
    key("dated");
    EXPECT_EQ(element(u"a", 0.0, u"c"), of(u"dated", param(u"a")));
    key("onlyDate");
    EXPECT_EQ(element(0.0), of(u"onlyDate", u""));
}

TEST_F(ZlvPDXMLTranslation, StopsAtTheEleventhArgument)
{
    key("tens");
    EXPECT_EQ(element(u"a", u"b"), of(u"tens", param(u"a")));
}

TEST_F(ZlvPDXMLTranslation, ReadsNothingForAnArgumentThatQuotesTurnOnlyHere)
{
    key("toggled");
    EXPECT_EQ(element(), of(u"toggled", u""));
    key("unquoted");
    EXPECT_EQ(element(u"a"), of(u"unquoted", u""));
}

TEST_F(ZlvPDXMLTranslation, IsEmptyForAPatternThatIsAbandoned)
{
    key("abandoned");
    EXPECT_EQ(element(u"a"), of(u"abandoned", u""));
}

TEST_F(ZlvPDXMLTranslation, WritesNothingForANullText)
{
    key("both");
    EXPECT_EQ(element(static_cast<const UChar *>(nullptr), 3),
              of(u"both", param(u"") + param(u"3")));
}

TEST_F(ZlvPDXMLTranslation, ReadsZerosFromAnAbsentList)
{
    key("four");
    UBuff buff;
    HeldMutex held;
    zlvPDXMLEmitUTranslationInfo(&buff, event_, noArgs());
    EXPECT_EQ(buff.text(), of(u"four", param(u"") + param(u"0") + param(u"0") + param(u"0")));
}

TEST_F(ZlvPDXMLTranslation, NeedsNoListForAPatternWithoutArguments)
{
    key("plain");
    UBuff buff;
    HeldMutex held;
    zlvPDXMLEmitUTranslationInfo(&buff, event_, noArgs());
    EXPECT_EQ(buff.text(), of(u"plain", u""));
}

TEST_F(ZlvPDXMLTranslation, LeavesTheListToOtherReaders)
{
    key("named");
    withArgs(
        [&](va_list args) {
            UBuff first, second;
            HeldMutex held;
            zlvPDXMLEmitUTranslationInfo(&first, event_, args);
            zlvPDXMLEmitUTranslationInfo(&second, event_, args);
            EXPECT_EQ(first.text(), of(u"named", param(u"disk")));
            EXPECT_EQ(second.text(), first.text());
        },
        u"disk", u"wrong");
}

TEST_F(ZlvPDXMLTranslation, ReadsThePatternInTheMessagesLocale)
{
    key("typed");
    EXPECT_EQ(element(u"disk"), of(u"typed", param(u"disk")));
    zlvSetI18MsgLocale(event_->message, "de");
    EXPECT_EQ(element(7), of(u"typed", param(u"7")));
}

TEST_F(ZlvPDXMLTranslation, IsEmptyWhenTheKeyIsMissing)
{
    key("no such key");
    EXPECT_EQ(element(u"a"), of(u"no such key", u""));
}

TEST_F(ZlvPDXMLTranslation, IsEmptyWhenTheKeyIsNoText)
{
    key("several");
    EXPECT_EQ(element(u"a"), of(u"several", u""));
}

TEST_F(ZlvPDXMLTranslation, IsEmptyWhenThePatternIsEmpty)
{
    key("empty");
    EXPECT_EQ(element(u"a"), of(u"empty", u""));
}

TEST_F(ZlvPDXMLTranslation, IsEmptyWhenTheBundleIsMissing)
{
    key("named", "nosuchbundle");
    EXPECT_EQ(element(u"a"), u" <TranslationInfo Resource Bundle=\"nosuchbundle\" "
                             u"MsgKey=\"named\"></TranslationInfo>\n");
}

TEST_F(ZlvPDXMLTranslation, IsEmptyWhenTheBundleIsMissingUnderItsLastNameToo)
{
    key("named", "no/such/bundle");
    EXPECT_EQ(element(u"a"), u" <TranslationInfo Resource Bundle=\"no/such/bundle\" "
                             u"MsgKey=\"named\"></TranslationInfo>\n");
}

TEST_F(ZlvPDXMLTranslation, FindsTheBundleByItsLastName)
{
    u_setDataDirectory(bundleDirectory);
    key("named", "no/such/zelvomsg");
    EXPECT_EQ(element(u"a"), u" <TranslationInfo Resource Bundle=\"no/such/zelvomsg\" "
                             u"MsgKey=\"named\"><Param><![CDATA[a]]></Param></TranslationInfo>\n");
}

TEST_F(ZlvPDXMLTranslation, LacksForAnInlineText)
{
    text(u"{0}");
    EXPECT_EQ(element(u"a"), u"");
}

TEST_F(ZlvPDXMLTranslation, LacksWithoutKey)
{
    key(nullptr);
    EXPECT_EQ(element(u"a"), u"");
}

TEST_F(ZlvPDXMLTranslation, LacksWithoutMessage)
{
    zlvIntlFreeI18Msg(event_->message);
    event_->message = nullptr;
    EXPECT_EQ(element(), u"");
}

} // namespace
} // namespace zelvo_test
