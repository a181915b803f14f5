// SPDX-License-Identifier: Apache-2.0
// Nothing in an XML record is escaped, cut or repaired, whatever it holds.
#include <ostream>
#include <string>
#include <tuple>
#include <utility>
#include <vector>

#include "support/Records.h"

namespace zelvo_test {
namespace {

/// A value that would do harm in a careless XML file, as bytes and as UTF-16.
struct Content {
    const char *label;
    std::string bytes;
    std::u16string text;
};

void PrintTo(const Content &content, std::ostream *out)
{
    *out << content.label;
}

Content ascii(const char *label, const std::string &bytes)
{
    return {label, bytes, std::u16string(bytes.begin(), bytes.end())};
}

std::string controls()
{
    std::string all;
    for (char c = 1; c < 0x20; ++c)
        all.push_back(c);
    return all + '\x7f';
}

std::vector<Content> contents()
{
    return {ascii("EndOfCdata", "a]]>b"),     ascii("Less", "<Trace>"),
            ascii("Greater", "</Trace>>"),    ascii("Ampersand", "a&b&amp;&#1;"),
            ascii("DoubleQuote", "a\"b\"/>"), ascii("Quote", "it's"),
            ascii("Controls", controls()),    ascii("Pattern", "{0} {"),
            ascii("Blanks", "  a  "),         ascii("SixtyFourKiB", std::string(65536, 'x'))};
}

/// UTF-16 that is no text, which bytes cannot carry.
std::vector<Content> surrogates()
{
    return {{"HighAlone", "",
             u"a\xD800"
             u"b"},
            {"LowAlone", "",
             u"a\xDC00"
             u"b"},
            {"LowBeforeHigh", "", u"\xDC00\xD800"},
            {"HighAtTheEnd", "", u"a\xDBFF"},
            {"NoCharacter", "", u"\xFFFF\xFFFE"},
            {"Pair", "", u"\U0001F600"}};
}

/// Where a property's value stands: the whole record around it.
struct Place {
    const char *property;
    std::u16string before, behind;
    std::vector<std::pair<const char *, const char *>> others = {}; ///< that the record needs too
};

void PrintTo(const Place &place, std::ostream *out)
{
    *out << place.property;
}

#define TRACE u"<Trace>\n" RECORD_TIME
#define TEXT u" <LogText><![CDATA[text]]></LogText>\n"
#define NO_SOURCE u" <Source FileName=\"None\" Method=\"None\"/>\n"

std::vector<Place> places()
{
    return {
        {"server",
         TRACE u" <Server Format=\"IP\">",
         u"</Server>\n" TEXT NO_SOURCE u"</Trace>\n",
         {{"serverFormat", "IP"}}},
        {"serverFormat",
         TRACE u" <Server Format=\"",
         u"\">host</Server>\n" TEXT NO_SOURCE u"</Trace>\n",
         {{"server", "host"}}},
        {"product", TRACE u" <ProductId>", u"</ProductId>\n" TEXT NO_SOURCE u"</Trace>\n"},
        {"component", TRACE u" <Component>", u"</Component>\n" TEXT NO_SOURCE u"</Trace>\n"},
        {"productInstance", TRACE u" <ProductInstance>",
         u"</ProductInstance>\n" TEXT NO_SOURCE u"</Trace>\n"},
        {"user", TRACE TEXT u" <LogAttribs><Key>user</Key><Value>",
         u"</Value></LogAttribs>\n" NO_SOURCE u"</Trace>\n"},
        {"zlv_prop_srcfile", TRACE TEXT u" <Source FileName=\"", u"\"/>\n</Trace>\n"},
        {"correlationId", TRACE TEXT NO_SOURCE u" <CorrelationId>",
         u"</CorrelationId>\n</Trace>\n"},
        {"client", TRACE TEXT NO_SOURCE u" <Principal>", u"</Principal>\n</Trace>\n"},
    };
}

class ZlvPDXMLUnescaped : public XMLRecordFixture {};

class ZlvPDXMLUnescapedProperty : public ZlvPDXMLUnescaped,
                                  public testing::WithParamInterface<std::tuple<Place, Content>> {};

TEST_P(ZlvPDXMLUnescapedProperty, StandsInTheRecordAsItIs)
{
    const auto &[place, content] = GetParam();
    for (const auto &[name, value] : place.others)
        set(name, value);
    set(place.property, content.bytes.c_str());
    EXPECT_EQ(record(), place.before + content.text + place.behind);
}

INSTANTIATE_TEST_SUITE_P(, ZlvPDXMLUnescapedProperty,
                         testing::Combine(testing::ValuesIn(places()),
                                          testing::ValuesIn(contents())),
                         [](const auto &row) {
                             return std::string(std::get<0>(row.param).property) +
                                    std::get<1>(row.param).label;
                         });

class ZlvPDXMLUnescapedBytes : public ZlvPDXMLUnescaped,
                               public testing::WithParamInterface<Content> {};

TEST_P(ZlvPDXMLUnescapedBytes, StandInAnIdentifier)
{
    ZlvSetEventIsMessage(event_, 1);
    ZlvSetEventMessageId(event_, GetParam().bytes.c_str());
    EXPECT_EQ(record(),
              u"<Message Id=\"" + GetParam().text + u"\">\n" RECORD_TIME TEXT u"</Message>\n");
}

TEST_P(ZlvPDXMLUnescapedBytes, StandInAMethod)
{
    set("zlv_prop_srcfile", "a.c");
    set("zlv_prop_srcfunction", GetParam().bytes.c_str());
    EXPECT_EQ(record(), TRACE TEXT u" <Source FileName=\"a.c\" Method=\"" + GetParam().text +
                            u"\"/>\n</Trace>\n");
}

TEST_P(ZlvPDXMLUnescapedBytes, StandInAKey)
{
    set(GetParam().bytes.c_str(), "value");
    EXPECT_EQ(record(), TRACE TEXT u" <LogAttribs><Key>" + GetParam().text +
                            u"</Key><Value>value</Value></LogAttribs>\n" NO_SOURCE u"</Trace>\n");
}

TEST_P(ZlvPDXMLUnescapedBytes, StandInTheNameOfABundle)
{
    key("plain", GetParam().bytes.c_str());
    EXPECT_EQ(record(), u"<Message "
                        u"Id=\"None\">"
                        u"\n" RECORD_TIME u" <LogText><![CDATA[]]></LogText>\n <TranslationInfo "
                        u"Resource Bundle=\"" +
                            GetParam().text +
                            u"\" MsgKey=\"plain\"></TranslationInfo>\n</Message>\n");
}

TEST_P(ZlvPDXMLUnescapedBytes, StandInTheNameOfAMessage)
{
    key(GetParam().bytes.c_str(), "nosuchbundle");
    EXPECT_EQ(record(),
              u"<Message "
              u"Id=\"None\">"
              u"\n" RECORD_TIME u" <LogText><![CDATA[]]></LogText>\n <TranslationInfo Resource "
              u"Bundle=\"nosuchbundle\" MsgKey=\"" +
                  GetParam().text + u"\"></TranslationInfo>\n</Message>\n");
}

INSTANTIATE_TEST_SUITE_P(, ZlvPDXMLUnescapedBytes, testing::ValuesIn(contents()),
                         [](const auto &row) { return std::string(row.param.label); });

class ZlvPDXMLUnescapedText : public ZlvPDXMLUnescaped,
                              public testing::WithParamInterface<Content> {
protected:
    /// A pattern that binds to the text: quotes doubled, braces quoted.
    static std::u16string patternOf(const std::u16string &text)
    {
        std::u16string pattern;
        for (char16_t c : text) {
            if (c == u'{' || c == u'}')
                pattern += std::u16string(u"'") + c + u"'";
            else
                pattern += std::u16string(c == u'\'' ? 2 : 1, c);
        }
        return pattern;
    }
};

TEST_P(ZlvPDXMLUnescapedText, StandsInAMessage)
{
    text(patternOf(GetParam().text).c_str());
    EXPECT_EQ(record(), TRACE u" <LogText><![CDATA[" + GetParam().text + u"]]></LogText>\n" +
                            NO_SOURCE u"</Trace>\n");
}

TEST_P(ZlvPDXMLUnescapedText, StandsInAParameter)
{
    key("typed");
    EXPECT_EQ(record(GetParam().text.c_str()),
              u"<Message Id=\"None\">\n" RECORD_TIME u" <LogText><![CDATA[" + GetParam().text +
                  u"]]></LogText>\n <TranslationInfo Resource "
                  u"Bundle=\"" ZELVO_TEST_BUNDLES u"/zelvomsg\" MsgKey=\"typed\"><Param><![CDATA[" +
                  GetParam().text + u"]]></Param></TranslationInfo>\n</Message>\n");
}

INSTANTIATE_TEST_SUITE_P(Harmful, ZlvPDXMLUnescapedText, testing::ValuesIn(contents()),
                         [](const auto &row) { return std::string(row.param.label); });
INSTANTIATE_TEST_SUITE_P(NoText, ZlvPDXMLUnescapedText, testing::ValuesIn(surrogates()),
                         [](const auto &row) { return std::string(row.param.label); });

} // namespace
} // namespace zelvo_test
