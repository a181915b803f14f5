// SPDX-License-Identifier: Apache-2.0
// The identifier that an event carries before it is filtered or written.
#include "ZlvPDXMLFormatter.h"
#include "support/Records.h"

namespace zelvo_test {
namespace {

class ZlvPDXMLMessageId : public XMLRecordFixture {
protected:
    template <class... Arguments>
    Text cached(Arguments... arguments)
    {
        HeldMutex held;
        withArgs([&](va_list args) { zlvPDXMLUFormatterCacheMessageID(formatter_, event_, args); },
                 arguments...);
        return peeked(event_->messageId);
    }
};

TEST_F(ZlvPDXMLMessageId, IsTheOneAtTheStartOfTheText)
{
    text(u"KDY1234E The disk is full");
    EXPECT_EQ(cached(), "KDY1234E");
}

TEST_F(ZlvPDXMLMessageId, IsEmptyWhenTheTextBeginsWithNone)
{
    text(u"the disk is full");
    EXPECT_EQ(cached(), "");
}

TEST_F(ZlvPDXMLMessageId, IsLookedForInTheBoundText)
{
    text(u"{0} is full");
    EXPECT_EQ(cached(u"KDY1234E The disk"), "KDY1234E");
}

TEST_F(ZlvPDXMLMessageId, IsLookedForInTheTextOfABundle)
{
    key("identified");
    EXPECT_EQ(cached(u"disk"), "KDY1234E");
}

TEST_F(ZlvPDXMLMessageId, IsLookedForInTheEventsOwnLocaleNotTheFormatters)
{
    setProp(formatter_, "locale", "de");
    key("identified");
    EXPECT_EQ(cached(u"disk"), "KDY1234E");
    key("identified");
    zlvSetEventLocale(event_, "de");
    EXPECT_EQ(cached(u"disk"), "KDY1234I");
}

TEST_F(ZlvPDXMLMessageId, IsEmptyWhenTheMessageDoesNotBind)
{
    key("no such key");
    EXPECT_EQ(cached(), "");
    EXPECT_EQ(event_->message->icuError, 2);
}

TEST_F(ZlvPDXMLMessageId, IsEmptyWithoutMessage)
{
    zlvIntlFreeI18Msg(event_->message);
    event_->message = nullptr;
    EXPECT_EQ(cached(), "");
}

TEST_F(ZlvPDXMLMessageId, OfTheEventIsKept)
{
    text(u"KDY1234E The disk is full");
    ZlvSetEventMessageId(event_, "own");
    EXPECT_EQ(cached(), "own");
}

TEST_F(ZlvPDXMLMessageId, OfTheEventIsKeptEvenWhenEmpty)
{
    text(u"KDY1234E The disk is full");
    ZlvSetEventMessageId(event_, "");
    EXPECT_EQ(cached(), "");
}

TEST_F(ZlvPDXMLMessageId, ThatIsThereSavesTheBind)
{
    key("no such key");
    ZlvSetEventMessageId(event_, "own");
    cached();
    EXPECT_EQ(event_->message->icuError, 0);
}

TEST_F(ZlvPDXMLMessageId, LeavesTheArgumentsToOtherReaders)
{
    text(u"KDY1234E {0}");
    withArgs(
        [&](va_list args) {
            HeldMutex held;
            zlvPDXMLUFormatterCacheMessageID(formatter_, event_, args);
            EXPECT_EQ(taken(zlvIntlBindUI18Msg(event_->message, args)), u"KDY1234E disk");
        },
        u"disk", u"wrong");
}

TEST_F(ZlvPDXMLMessageId, IsWhatTheRecordShows)
{
    text(u"KDY1234E");
    ZlvSetEventIsMessage(event_, 1);
    cached();
    EXPECT_EQ(
        record(),
        u"<Message Id=\"KDY1234E\">\n" RECORD_TIME u" <LogText><![CDATA[KDY1234E]]></LogText>\n"
        u"</Message>\n");
}

TEST_F(ZlvPDXMLMessageId, NeedsNoFormatter)
{
    text(u"KDY1234E The disk is full");
    HeldMutex held;
    zlvPDXMLUFormatterCacheMessageID(nullptr, event_, noArgs());
    EXPECT_STREQ(event_->messageId, "KDY1234E");
}

TEST_F(ZlvPDXMLMessageId, OfNoEventIsIgnored)
{
    HeldMutex held;
    zlvPDXMLUFormatterCacheMessageID(formatter_, nullptr, noArgs());
    EXPECT_EQ(event_->messageId, nullptr);
}

TEST_F(ZlvPDXMLMessageId, NeedsNoArgumentsForAPatternWithoutThem)
{
    text(u"ABC123I");
    HeldMutex held;
    zlvPDXMLUFormatterCacheMessageID(formatter_, event_, noArgs());
    EXPECT_STREQ(event_->messageId, "ABC123I");
}

} // namespace
} // namespace zelvo_test
