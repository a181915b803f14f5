// SPDX-License-Identifier: Apache-2.0
// Texts from outside in records.
#include "Hostile.h"

namespace zelvo_test {
namespace {

class HostileText : public FileHandlerFixture {
protected:
    /// The record of an argument in the layout of a formatter class.
    std::string recordOf(const char *formatterClass, const char16_t *argument)
    {
        handler("fileName", "app.log");
        ZlvHandlerSetFormatter(handler_, formatter("format", formatterClass));
        EXPECT_TRUE(ok(ZlvLogUText(app_, u"user {0}", argument)));
        return read("app.log");
    }

    static bool holds(const std::string &text, const std::string &part)
    {
        return text.find(part) != std::string::npos;
    }
};

TEST_F(HostileText, ALineFeedInAnArgumentBeginsALineThatLooksLikeARecord)
{
    EXPECT_TRUE(holds(recordOf("zlv_basicformatter", u"x\n2024-03-01 12:00:00.000+00:00 forged"),
                      "user x\n2024-03-01 12:00:00.000+00:00 forged\n"));
}

TEST_F(HostileText, AnArgumentCanEndTheTextOfAnXmlRecord)
{
    EXPECT_TRUE(holds(recordOf("zlv_xmlformatter", u"]]></LogText></Trace><Message Id=\"X\">"),
                      "<![CDATA[user ]]></LogText></Trace><Message Id=\"X\">]]></LogText>"));
}

TEST_F(HostileText, AnArgumentCanHoldTheSeparatorOfTraceRecords)
{
    EXPECT_TRUE(holds(recordOf("zlv_vyxtraceformatter", u"x\n\u001e[forged"), "x\n\x1e[forged\n"));
}

TEST_F(HostileText, AnEscapeSequenceReachesTheConsole)
{
    ZlvAddListener(app_, ToolkitFixture::handler("screen"));
    EXPECT_TRUE(holds(console([&] { ZlvLogUText(app_, u"{0}", u"\u001b[2J"); }), "\x1b[2J"));
}

TEST_F(HostileText, BracesInAnArgumentAreNoPattern)
{
    EXPECT_TRUE(
        holds(recordOf("zlv_basicformatter", u"{0} {1,number} '"), "user {0} {1,number} '"));
}

TEST_F(HostileText, APatternDecidesWhatAnArgumentIsReadAs)
{
    handler("fileName", "app.log");
    EXPECT_TRUE(ok(ZlvLogUText(app_, u"{0,number,integer}", u"text")));
    const std::string record = read("app.log"); // half an address
    EXPECT_EQ(record.find_first_not_of("-0123456789,\n"), std::string::npos) << record;
}

TEST_F(HostileText, BracesInTheIdentityOfALoggerAreNoPattern)
{
    ZlvObject *identified = logger("identified", "zlv_pdlogger");
    setProp(identified, "product", "{0}</ProductId>");
    handler("fileName", "app.log");
    ZlvHandlerSetFormatter(handler_, formatter("format", "zlv_xmlformatter"));
    ZlvAddListener(identified, handler_);
    EXPECT_TRUE(ok(ZlvLogUText(identified, u"a")));
    EXPECT_TRUE(holds(read("app.log"), "<ProductId>{0}</ProductId></ProductId>"));
}

} // namespace
} // namespace zelvo_test
