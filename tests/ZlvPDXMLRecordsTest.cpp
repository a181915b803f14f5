// SPDX-License-Identifier: Apache-2.0
// Whole XML records, compared as whole texts.
#include <unicode/putil.h>

#include "ZlvPDXMLFormatter.h"
#include "support/Records.h"

#define TEXT u" <LogText><![CDATA[text]]></LogText>\n"
#define NO_SOURCE u" <Source FileName=\"None\" Method=\"None\"/>\n"
#define OPEN u"<Trace>\n" RECORD_TIME
#define CLOSE NO_SOURCE u"</Trace>\n"
#define BUNDLE u"" ZELVO_TEST_BUNDLES "/zelvomsg"

namespace zelvo_test {
namespace {

class ZlvPDXMLRecord : public XMLRecordFixture {
protected:
    void message(const char16_t *pattern, ZlvLevel level = ZLV_LEVEL_NONE)
    {
        text(pattern, level);
        ZlvSetEventIsMessage(event_, 1);
    }

    /// Everything that a record can show.
    void setAll()
    {
        set("server", "host.example.com");
        set("serverFormat", "IP");
        set("product", "Store");
        set("component", "Disk");
        set("productInstance", "store-1");
        set("user", "ann");
        set("zlv_prop_srcfile", "a.c");
        set("zlv_prop_srcfunction", "f");
        set("zlv_prop_srcline", 12);
        set("threadId", 3);
        set("processId", 4711);
        set("correlationId", "c-7");
        set("client", "bob");
        set("organization", "Org");
    }
};

/* The least that a record holds. */

TEST_F(ZlvPDXMLRecord, OfATraceWithoutLevel)
{
    EXPECT_EQ(record(), u"<Trace>\n" RECORD_TIME TEXT NO_SOURCE u"</Trace>\n");
}

TEST_F(ZlvPDXMLRecord, OfATraceWithLevel)
{
    text(u"text", ZLV_LEVEL_INFO);
    EXPECT_EQ(record(), u"<Trace Level=\"INFO\">\n" RECORD_TIME TEXT NO_SOURCE u"</Trace>\n");
}

TEST_F(ZlvPDXMLRecord, OfAMessageWithoutLevel)
{
    message(u"text");
    EXPECT_EQ(record(), u"<Message Id=\"None\">\n" RECORD_TIME TEXT u"</Message>\n");
}

TEST_F(ZlvPDXMLRecord, OfAMessageWithLevel)
{
    message(u"text", ZLV_LEVEL_FATAL);
    EXPECT_EQ(record(),
              u"<Message Id=\"None\" Severity=\"ERROR\">\n" RECORD_TIME TEXT u"</Message>\n");
}

TEST_F(ZlvPDXMLRecord, ShowsThresholdsAsOtherLevels)
{
    text(u"text", ZLV_LEVEL_ALL);
    EXPECT_EQ(record(), u"<Trace Level=\"OTHER\">\n" RECORD_TIME TEXT NO_SOURCE u"</Trace>\n");
    message(u"text", ZLV_LEVEL_OFF);
    EXPECT_EQ(record(),
              u"<Message Id=\"None\" Severity=\"OTHER\">\n" RECORD_TIME TEXT u"</Message>\n");
}

TEST_F(ZlvPDXMLRecord, OfATraceWithASourceAndNothingElse)
{
    text(u"text", ZLV_LEVEL_INFO);
    set("zlv_prop_srcfile", "a.c");
    set("zlv_prop_srcfunction", "f");
    set("zlv_prop_srcline", 12);
    EXPECT_EQ(record(),
              u"<Trace Level=\"INFO\">\n" RECORD_TIME
                  TEXT u" <Source FileName=\"a.c\" Method=\"f\" Line=\"12\"/>\n</Trace>\n");
}

/* Everything. */

TEST_F(ZlvPDXMLRecord, OfATraceWithEverything)
{
    text(u"text", ZLV_LEVEL_DEBUG_MIN);
    setAll();
    EXPECT_EQ(record(), u"<Trace Level=\"MIN\">\n"
                        u" <Time Millis=\"1155718135123\">2006-08-16 08:48:55.123+00:00</Time>\n"
                        u" <Server Format=\"IP\">host.example.com</Server>\n"
                        u" <ProductId>Store</ProductId>\n"
                        u" <Component>Disk</Component>\n"
                        u" <ProductInstance>store-1</ProductInstance>\n"
                        u" <LogText><![CDATA[text]]></LogText>\n"
                        u" <LogAttribs><Key>user</Key><Value>ann</Value>"
                        u"<Key>organization</Key><Value>Org</Value></LogAttribs>\n"
                        u" <Source FileName=\"a.c\" Method=\"f\" Line=\"12\"/>\n"
                        u" <Thread>3</Thread>\n"
                        u" <Process>4711</Process>\n"
                        u" <CorrelationId>c-7</CorrelationId>\n"
                        u" <Principal>bob</Principal>\n"
                        u"</Trace>\n");
}

TEST_F(ZlvPDXMLRecord, OfAMessageWithEverything)
{
    key("four");
    event_->level = ZLV_LEVEL_WARN;
    ZlvSetEventMessageId(event_, "KDY1234W");
    setAll();
    EXPECT_EQ(record(u"disk", 3, 2.5, 1.0),
              u"<Message Id=\"KDY1234W\" Severity=\"WARN\">\n"
              u" <Time Millis=\"1155718135123\">2006-08-16 08:48:55.123+00:00</Time>\n"
              u" <Server Format=\"IP\">host.example.com</Server>\n"
              u" <ProductId>Store</ProductId>\n"
              u" <Component>Disk</Component>\n"
              u" <ProductInstance>store-1</ProductInstance>\n"
              u" <LogText><![CDATA[disk 3 2.5 some]]></LogText>\n"
              u" <LogAttribs><Key>user</Key><Value>ann</Value>"
              u"<Key>organization</Key><Value>Org</Value></LogAttribs>\n"
              u" <Source FileName=\"a.c\" Method=\"f\" Line=\"12\"/>\n"
              u" <TranslationInfo Resource Bundle=\"" BUNDLE u"\" MsgKey=\"four\">"
              u"<Param><![CDATA[disk]]></Param><Param><![CDATA[3]]></Param>"
              u"<Param><![CDATA[2.5]]></Param><Param><![CDATA[1]]></Param></TranslationInfo>\n"
              u" <CorrelationId>c-7</CorrelationId>\n"
              u" <Principal>bob</Principal>\n"
              u"</Message>\n");
}

TEST_F(ZlvPDXMLRecord, OfATraceHasNoTranslation)
{
    key("plain");
    ZlvSetEventIsMessage(event_, 0);
    EXPECT_EQ(record(), u"<Trace>"
                        u"\n" RECORD_TIME u" <LogText><![CDATA[Service "
                        u"halted]]></LogText>\n" NO_SOURCE u"</Trace>\n");
}

TEST_F(ZlvPDXMLRecord, OfAMessageHasNeitherThreadNorProcess)
{
    message(u"text");
    set("threadId", 3);
    set("processId", 4711);
    EXPECT_EQ(record(), u"<Message Id=\"None\">\n" RECORD_TIME TEXT u"</Message>\n");
}

/* Attributes. */

TEST_F(ZlvPDXMLRecord, ListsAttributesAsTheyWereSetWithoutThoseThatHaveTheirOwnElement)
{
    set("zebra", "1");
    setAll();
    set("aunt", "2");
    set("zebra", "3");
    EXPECT_EQ(record(),
              OPEN u" <Server Format=\"IP\">host.example.com</Server>\n"
                   u" <ProductId>Store</ProductId>\n <Component>Disk</Component>\n"
                   u" <ProductInstance>store-1</"
                   u"ProductInstance>\n" TEXT u" <LogAttribs><Key>zebra</Key><Value>3</Value>"
                   u"<Key>user</Key><Value>ann</Value>"
                   u"<Key>organization</Key><Value>Org</Value>"
                   u"<Key>aunt</Key><Value>2</Value></LogAttribs>\n"
                   u" <Source FileName=\"a.c\" Method=\"f\" Line=\"12\"/>\n"
                   u" <Thread>3</Thread>\n <Process>4711</Process>\n"
                   u" <CorrelationId>c-7</CorrelationId>\n"
                   u" <Principal>bob</Principal>\n</Trace>\n");
}

TEST_F(ZlvPDXMLRecord, ListsAttributesOfMessagesToo)
{
    message(u"text");
    set("b", "");
    set("a", "1");
    EXPECT_EQ(record(),
              u"<Message Id=\"None\">\n" RECORD_TIME
                  TEXT u" <LogAttribs><Key>b</Key><Value></Value><Key>a</Key><Value>1</Value>"
              u"</LogAttribs>\n</Message>\n");
}

TEST_F(ZlvPDXMLRecord, ListsAnAttributeThatWasRemovedWithoutItsValue)
{
    set("user", "ann");
    set("user", nullptr);
    EXPECT_EQ(record(),
              OPEN TEXT u" <LogAttribs><Key>user</Key><Value></Value></LogAttribs>\n" CLOSE);
}

/* The message. */

TEST_F(ZlvPDXMLRecord, OfAMessageThatDoesNotBindHasAnEmptyText)
{
    key("no such key");
    EXPECT_EQ(record(),
              u"<Message Id=\"None\">\n" RECORD_TIME u" <LogText><![CDATA[]]></LogText>\n"
              u" <TranslationInfo Resource "
              u"Bundle=\"" BUNDLE u"\" MsgKey=\"no such key\"></TranslationInfo>\n</Message>\n");
}

TEST_F(ZlvPDXMLRecord, OfAnEventWithoutMessage)
{
    zlvIntlFreeI18Msg(event_->message);
    event_->message = nullptr;
    ZlvSetEventIsMessage(event_, 1);
    EXPECT_EQ(
        record(),
        u"<Message Id=\"None\">\n" RECORD_TIME u" <LogText><![CDATA[]]></LogText>\n</Message>\n");
}

TEST_F(ZlvPDXMLRecord, OfABundleThatIsFound)
{
    key("plain");
    EXPECT_EQ(
        record(),
        u"<Message Id=\"None\">\n" RECORD_TIME u" <LogText><![CDATA[Service halted]]></LogText>\n"
        u" <TranslationInfo Resource "
        u"Bundle=\"" BUNDLE u"\" MsgKey=\"plain\"></TranslationInfo>\n</Message>\n");
}

TEST_F(ZlvPDXMLRecord, OfABundleThatIsFoundByItsLastName)
{
    u_setDataDirectory(bundleDirectory);
    key("both", "no/such/zelvomsg");
    EXPECT_EQ(
        record(u"disk", 3),
        u"<Message Id=\"None\">\n" RECORD_TIME u" <LogText><![CDATA[disk: 3 entries]]></LogText>\n"
        u" <TranslationInfo Resource Bundle=\"no/such/zelvomsg\" "
        u"MsgKey=\"both\"><Param><![CDATA[disk]]></Param>"
        u"<Param><![CDATA[3]]></Param></TranslationInfo>\n"
        u"</Message>\n");
}

TEST_F(ZlvPDXMLRecord, OfABundleThatIsMissing)
{
    key("both", "no/such/bundle");
    EXPECT_EQ(record(u"disk", 3),
              u"<Message Id=\"None\">\n" RECORD_TIME u" <LogText><![CDATA[]]></LogText>\n"
              u" <TranslationInfo Resource Bundle=\"no/such/bundle\" "
              u"MsgKey=\"both\"></TranslationInfo>\n</Message>\n");
}

TEST_F(ZlvPDXMLRecord, OfABundleThatIsMissingAndHasNoPath)
{
    key("both", "nosuchbundle");
    EXPECT_EQ(record(u"disk", 3),
              u"<Message Id=\"None\">\n" RECORD_TIME u" <LogText><![CDATA[]]></LogText>\n"
              u" <TranslationInfo Resource Bundle=\"nosuchbundle\" "
              u"MsgKey=\"both\"></TranslationInfo>\n</Message>\n");
}

/* The formatter's settings. */

TEST_F(ZlvPDXMLRecord, BindsInTheFormattersLocaleAndLeavesItWithTheEvent)
{
    key("plain");
    zlvSetEventLocale(event_, "ja");
    setProp(formatter_, "locale", "de");
    EXPECT_EQ(
        record(),
        u"<Message Id=\"None\">\n" RECORD_TIME u" <LogText><![CDATA[Dienst beendet]]></LogText>\n"
        u" <TranslationInfo Resource "
        u"Bundle=\"" BUNDLE u"\" MsgKey=\"plain\"></TranslationInfo>\n</Message>\n");
    EXPECT_EQ(taken(zlvGetEventLocale(event_)), "de");
}

TEST_F(ZlvPDXMLRecord, ShowsTheDateInTheFormattersFormat)
{
    setProp(formatter_, "dateTimeFormat", "HH:mm");
    EXPECT_EQ(
        record(),
        u"<Trace>\n <Time Millis=\"1155718135123\">08:48</Time>\n" TEXT NO_SOURCE u"</Trace>\n");
}

TEST_F(ZlvPDXMLRecord, ShowsTheDateInTheDefaultZone)
{
    zone(u"Europe/Berlin");
    EXPECT_EQ(record(), u"<Trace>\n <Time Millis=\"1155718135123\">"
                        u"2006-08-16 10:48:55.123+02:00</Time>\n" TEXT NO_SOURCE u"</Trace>\n");
}

TEST_F(ZlvPDXMLRecord, DoesNotSeparate)
{
    setProp(formatter_, "separator", "|");
    EXPECT_EQ(record(), OPEN TEXT CLOSE);
}

TEST_F(ZlvPDXMLRecord, IsTheSameTheSecondTime)
{
    text(u"text", ZLV_LEVEL_DEBUG_MAX);
    setAll();
    const UText first = record();
    EXPECT_EQ(record(), first);
}

} // namespace
} // namespace zelvo_test
