// SPDX-License-Identifier: Apache-2.0
#include "ZlvEvent.h"

#include <gtest/gtest.h>

#include <cmath>
#include <memory>

#include "CxSystem.h"
#include "ZlvIntl.h"
#include "support/Bundles.h"
#include "support/FailAlloc.h"
#include "support/Text.h"
#include "support/VaList.h"

namespace zelvo_test {
namespace {

struct FreeEvent {
    void operator()(ZlvEvent *event) const { ZlvFreeEvent(event); }
};
using EventOwner = std::unique_ptr<ZlvEvent, FreeEvent>;

EventOwner textEvent(const char16_t *text = u"text")
{
    return EventOwner(ZlvVaAllocUEvent(ZLV_LEVEL_INFO, nullptr, nullptr, text, noArgs()));
}

EventOwner messageEvent(const char *key)
{
    return EventOwner(ZlvVaAllocUEvent(ZLV_LEVEL_INFO, bundlePath, key, nullptr, noArgs()));
}

UText bound(const EventOwner &event)
{
    return taken(ZlvBindEventUMsg(event.get(), zlvIntlBindUI18Msg, noArgs()));
}

/* Making and freeing. */

TEST(ZlvEventAlloc, KeepsTheLevel)
{
    EventOwner event(ZlvVaAllocUEvent(-17, nullptr, nullptr, nullptr, noArgs()));
    EXPECT_EQ(ZlvGetEventLevel(event.get()), -17);
    EXPECT_EQ(event->level, -17);
}

TEST(ZlvEventAlloc, OfABundleIsAMessage)
{
    EXPECT_EQ(ZlvGetEventIsMessage(messageEvent("plain").get()), 1);
}

TEST(ZlvEventAlloc, OfTextAloneIsNoMessage)
{
    EXPECT_EQ(ZlvGetEventIsMessage(textEvent().get()), 0);
}

TEST(ZlvEventAlloc, OfAKeyWithoutABundleIsNoMessage)
{
    EventOwner event(ZlvVaAllocUEvent(1, nullptr, "key", nullptr, noArgs()));
    EXPECT_EQ(ZlvGetEventIsMessage(event.get()), 0);
}

TEST(ZlvEventAlloc, IsStampedWithWholeMillisecondsOfNow)
{
    double before = std::floor(CxSystemGetTimestamp());
    double time = ZlvGetEventTime(textEvent().get());
    EXPECT_GE(time, before);
    EXPECT_LE(time, CxSystemGetTimestamp());
    EXPECT_EQ(time, std::floor(time));
}

TEST(ZlvEventAlloc, TakesCopiesOfBundleKeyAndText)
{
    std::string bundle = "bundle", key = "key";
    std::u16string text = u"text";
    EventOwner event(ZlvVaAllocUEvent(1, bundle.c_str(), key.c_str(), text.c_str(), noArgs()));
    bundle = key = "x";
    text = u"x";
    EXPECT_EQ(peeked(event->message->bundle), "bundle");
    EXPECT_EQ(peeked(event->message->key), "key");
    EXPECT_EQ(peeked(event->message->text), u"text");
}

TEST(ZlvEventAlloc, OfNothingHasAnEmptyMessage)
{
    EventOwner event(ZlvVaAllocUEvent(1, nullptr, nullptr, nullptr, noArgs()));
    ASSERT_NE(event->message, nullptr);
    EXPECT_EQ(event->message->bundle, nullptr);
    EXPECT_EQ(event->message->key, nullptr);
    EXPECT_EQ(event->message->text, nullptr);
}

TEST(ZlvEventAlloc, StartsWithoutIdLocaleAndProperties)
{
    EventOwner event = textEvent();
    EXPECT_EQ(event->messageId, nullptr);
    EXPECT_EQ(event->locale, nullptr);
    EXPECT_EQ(event->properties, nullptr);
}

TEST(ZlvEventAlloc, StartsWithAStatusOfSuccess)
{
    EventOwner event = textEvent();
    EXPECT_EQ(event->status.type, '-');
    EXPECT_EQ(event->status.code, 0);
}

TEST(ZlvEventAlloc, LeavesTheArgumentListUnread)
{
    withArgs(
        [](va_list args) {
            EventOwner event(ZlvVaAllocUEvent(1, nullptr, nullptr, u"{0,number,integer}", args));
            EXPECT_EQ(va_arg(args, int), 42);
        },
        42);
}

TEST(ZlvEventAlloc, GivesNullWhenTheRecordCannotBeMade)
{
    FailAlloc fail(0);
    EXPECT_EQ(textEvent(), nullptr);
    EXPECT_EQ(fail.failed(), 1u);
}

TEST(ZlvEventAlloc, CarriesNoMessageWhenThatCannotBeMade)
{
    EventOwner event;
    {
        FailAlloc fail(1, FailAlloc::Once);
        event = textEvent();
        EXPECT_EQ(fail.failed(), 1u);
    }
    ASSERT_NE(event, nullptr);
    EXPECT_EQ(event->message, nullptr);
    EXPECT_EQ(bound(event), UText{});
}

TEST(ZlvEventFree, IgnoresNull)
{
    EXPECT_NO_FATAL_FAILURE(ZlvFreeEvent(nullptr));
}

TEST(ZlvEventFree, LetsGoOfEverythingTheEventHolds)
{
    EventOwner event = messageEvent("plain");
    ZlvSetEventMessageId(event.get(), "id");
    ZlvSetEventProp(event.get(), "name", "value");
    zlvSetEventLocale(event.get(), "de");
    EXPECT_EQ(bound(event), u"Dienst beendet");
}

/* The null event. */

TEST(ZlvEventNull, HasTimeZero)
{
    EXPECT_EQ(ZlvGetEventTime(nullptr), 0.0);
}

TEST(ZlvEventNull, HasNoLevel)
{
    EXPECT_EQ(ZlvGetEventLevel(nullptr), -9999);
}

TEST(ZlvEventNull, IsNoMessageAndCannotBecomeOne)
{
    ZlvSetEventIsMessage(nullptr, 1);
    EXPECT_EQ(ZlvGetEventIsMessage(nullptr), 0);
}

TEST(ZlvEventNull, HasNoMessageId)
{
    ZlvSetEventMessageId(nullptr, "id");
    EXPECT_EQ(ZlvGetEventMessageId(nullptr), nullptr);
}

TEST(ZlvEventNull, HasNoLocale)
{
    zlvSetEventLocale(nullptr, "de");
    EXPECT_EQ(zlvGetEventLocale(nullptr), nullptr);
}

TEST(ZlvEventNull, BindsToNothing)
{
    EXPECT_EQ(ZlvBindEventUMsg(nullptr, zlvIntlBindUI18Msg, noArgs()), nullptr);
}

TEST(ZlvEventNull, HasNoPropertyMap)
{
    EXPECT_EQ(zlvFetchEventPropMap(nullptr), nullptr);
}

/* Flag, message id, locale. */

TEST(ZlvEventIsMessage, CanBeSetAndCleared)
{
    EventOwner event = textEvent();
    ZlvSetEventIsMessage(event.get(), 1);
    EXPECT_EQ(ZlvGetEventIsMessage(event.get()), 1);
    ZlvSetEventIsMessage(event.get(), 0);
    EXPECT_EQ(ZlvGetEventIsMessage(event.get()), 0);
}

TEST(ZlvEventMessageId, IsNullUntilSet)
{
    EXPECT_EQ(ZlvGetEventMessageId(textEvent().get()), nullptr);
}

TEST(ZlvEventMessageId, SetTwiceKeepsTheSecond)
{
    EventOwner event = textEvent();
    ZlvSetEventMessageId(event.get(), "first");
    ZlvSetEventMessageId(event.get(), "second");
    EXPECT_EQ(taken(ZlvGetEventMessageId(event.get())), "second");
}

TEST(ZlvEventMessageId, IsClearedByNull)
{
    EventOwner event = textEvent();
    ZlvSetEventMessageId(event.get(), "id");
    ZlvSetEventMessageId(event.get(), nullptr);
    EXPECT_EQ(ZlvGetEventMessageId(event.get()), nullptr);
}

TEST(ZlvEventMessageId, IsCopiedInAndOut)
{
    EventOwner event = textEvent();
    std::string id = "one";
    ZlvSetEventMessageId(event.get(), id.c_str());
    id = "two";
    char *copy = ZlvGetEventMessageId(event.get());
    EXPECT_NE(copy, event->messageId);
    EXPECT_EQ(taken(copy), "one");
}

TEST(ZlvEventMessageId, CanBeSetToItself)
{
    EventOwner event = textEvent();
    ZlvSetEventMessageId(event.get(), "id");
    ZlvSetEventMessageId(event.get(), event->messageId);
    EXPECT_EQ(taken(ZlvGetEventMessageId(event.get())), "id");
}

TEST(ZlvEventLocale, IsNullUntilSet)
{
    EXPECT_EQ(zlvGetEventLocale(textEvent().get()), nullptr);
}

TEST(ZlvEventLocale, SetTwiceKeepsTheSecond)
{
    EventOwner event = textEvent();
    zlvSetEventLocale(event.get(), "de");
    zlvSetEventLocale(event.get(), "ja");
    EXPECT_EQ(taken(zlvGetEventLocale(event.get())), "ja");
}

TEST(ZlvEventLocale, IsClearedByNull)
{
    EventOwner event = textEvent();
    zlvSetEventLocale(event.get(), "de");
    zlvSetEventLocale(event.get(), nullptr);
    EXPECT_EQ(zlvGetEventLocale(event.get()), nullptr);
}

TEST(ZlvEventLocale, IsCopiedInAndOut)
{
    EventOwner event = textEvent();
    std::string locale = "de";
    zlvSetEventLocale(event.get(), locale.c_str());
    locale = "ja";
    char *copy = zlvGetEventLocale(event.get());
    EXPECT_NE(copy, event->locale);
    EXPECT_EQ(taken(copy), "de");
}

TEST(ZlvEventLocale, CanBeSetToItself)
{
    EventOwner event = textEvent();
    zlvSetEventLocale(event.get(), "de");
    zlvSetEventLocale(event.get(), event->locale);
    EXPECT_EQ(taken(zlvGetEventLocale(event.get())), "de");
}

TEST(ZlvEventLocale, OutlivesTheEventThatNamedIt)
{
    EventOwner event = textEvent();
    zlvSetEventLocale(event.get(), "de_CH");
    const char *name = event->locale;
    event.reset();
    EXPECT_STREQ(name, "de_CH");
}

/* Binding. */

struct BindCall {
    ZlvI18Msg *message;
    std::string locale;
    int argument;
};
BindCall lastBind;

UChar *bindSeven(ZlvI18Msg *message, va_list args)
{
    lastBind = {message, message->locale ? message->locale : "", va_arg(args, int)};
    return static_cast<UChar *>(RkoMemoryCalloc(1, sizeof(UChar)));
}

TEST(ZlvEventBind, HandsMessageAndArgumentsToTheFunction)
{
    EventOwner event = textEvent();
    withArgs(
        [&](va_list args) {
            EXPECT_EQ(taken(ZlvBindEventUMsg(event.get(), bindSeven, args)), u"");
        },
        7);
    EXPECT_EQ(lastBind.message, event->message);
    EXPECT_EQ(lastBind.argument, 7);
}

TEST(ZlvEventBind, WithoutAFunctionGivesNull)
{
    EXPECT_EQ(ZlvBindEventUMsg(textEvent().get(), nullptr, noArgs()), nullptr);
}

TEST(ZlvEventBind, GivesTheMessageTheEventsLocaleBeforeTheCall)
{
    EventOwner event = textEvent();
    zlvSetI18MsgLocale(event->message, "ja");
    zlvSetEventLocale(event.get(), "de");
    withArgs([&](va_list args) { taken(ZlvBindEventUMsg(event.get(), bindSeven, args)); }, 7);
    EXPECT_EQ(lastBind.locale, "de");
}

TEST(ZlvEventBind, KeepsTheMessagesOwnLocaleWhenTheEventHasNone)
{
    EventOwner event = messageEvent("plain");
    zlvSetI18MsgLocale(event->message, "de");
    EXPECT_EQ(bound(event), u"Dienst beendet");
}

TEST(ZlvEventBind, LeavesTheLocaleWithTheMessageForLaterBinds)
{
    EventOwner event = messageEvent("plain");
    zlvSetEventLocale(event.get(), "de");
    EXPECT_EQ(bound(event), u"Dienst beendet");
    zlvSetEventLocale(event.get(), nullptr);
    EXPECT_EQ(bound(event), u"Dienst beendet");
}

TEST(ZlvEventBind, TakesANewLocaleOfTheEvent)
{
    EventOwner event = messageEvent("plain");
    zlvSetEventLocale(event.get(), "de");
    bound(event);
    zlvSetEventLocale(event.get(), "ja");
    EXPECT_EQ(bound(event), u"サービスは停止しました");
}

TEST(ZlvEventBind, CanBeRepeatedWithTheSameArguments)
{
    EventOwner event = textEvent(u"{0,number,integer}");
    withArgs(
        [&](va_list args) {
            EXPECT_EQ(taken(ZlvBindEventUMsg(event.get(), zlvIntlBindUI18Msg, args)), u"12");
            EXPECT_EQ(taken(ZlvBindEventUMsg(event.get(), zlvIntlBindUI18Msg, args)), u"12");
        },
        12);
}

TEST(ZlvEventBind, OfANullMessageStillCallsTheFunction)
{
    EventOwner event = textEvent();
    zlvIntlFreeI18Msg(event->message);
    event->message = nullptr;
    zlvSetEventLocale(event.get(), "de");
    EXPECT_EQ(bound(event), UText{});
}

} // namespace
} // namespace zelvo_test
