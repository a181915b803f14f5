// SPDX-License-Identifier: Apache-2.0
// The line that the basic formatter makes of an event, and its settings.
#include "ZlvBasicFormatter.h"

#include <ostream>

#include "support/Bundles.h"
#include "support/FailAlloc.h"
#include "support/Recorder.h"
#include "support/VaList.h"

namespace zelvo_test {
namespace {

/// The date of the fixture's event is "T": the pattern holds nothing else.
class ZlvBasicFormatter : public ToolkitFixture {
protected:
    void SetUp() override
    {
        open();
        formatter_ = formatter("line");
        setProp(formatter_, "dateTimeFormat", "'T'");
        text(u"message");
    }

    void TearDown() override
    {
        ZlvFreeEvent(event_);
        ToolkitFixture::TearDown();
    }

    /// The event of the next lines: with an inline text, or with a key of the tests' bundle.
    void text(const char16_t *pattern)
    {
        ZlvFreeEvent(event_);
        event_ = ZlvVaAllocUEvent(1, nullptr, nullptr, pattern, noArgs());
    }
    void key(const char *key)
    {
        ZlvFreeEvent(event_);
        event_ = ZlvVaAllocUEvent(1, bundlePath, key, nullptr, noArgs());
    }

    UText line() { return taken(ZlvBasicUFormatterFFormat(formatter_, event_, noArgs())); }

    ZlvObject *formatter_ = nullptr;
    ZlvEvent *event_ = nullptr;
};

/* The line. */

TEST_F(ZlvBasicFormatter, OfAPlainEventIsDateMessageAndLineFeed)
{
    EXPECT_EQ(line(), u"T message\n");
}

TEST_F(ZlvBasicFormatter, OfAnEventWithoutTextIsDateSeparatorAndLineFeed)
{
    text(nullptr);
    EXPECT_EQ(line(), u"T \n");
}

TEST_F(ZlvBasicFormatter, OfAnEventWhoseMessageDoesNotBindHasNoText)
{
    key("no such key");
    EXPECT_EQ(line(), u"T \n");
    EXPECT_EQ(event_->message->icuError, 2);
}

TEST_F(ZlvBasicFormatter, OfAnEventWithoutMessageHasNoText)
{
    zlvIntlFreeI18Msg(event_->message);
    event_->message = nullptr;
    EXPECT_EQ(line(), u"T \n");
}

TEST_F(ZlvBasicFormatter, BindsTheMessageWithTheArguments)
{
    key("both");
    withArgs(
        [&](va_list args) {
            EXPECT_EQ(taken(ZlvBasicUFormatterFFormat(formatter_, event_, args)),
                      u"T disk: 3 entries\n");
        },
        u"disk", 3);
}

TEST_F(ZlvBasicFormatter, PutsTheSourceInTheOrderFileFunctionLine)
{
    ZlvSetEventPropInt(event_, "zlv_prop_srcline", 12);
    ZlvSetEventProp(event_, "zlv_prop_srcfunction", "main");
    ZlvSetEventProp(event_, "zlv_prop_srcfile", "a.c");
    EXPECT_EQ(line(), u"T a.c main 12 message\n");
}

TEST_F(ZlvBasicFormatter, PutsTheProductFieldsInTheirOrder)
{
    for (const char *name : {"server", "client", "component", "product", "organization"})
        ZlvSetEventProp(event_, name, name);
    EXPECT_EQ(line(), u"T organization product component client server message\n");
}

TEST_F(ZlvBasicFormatter, PutsTheSourceBeforeTheProductFields)
{
    ZlvSetEventProp(event_, "organization", "org");
    ZlvSetEventPropInt(event_, "zlv_prop_srcline", 12);
    EXPECT_EQ(line(), u"T 12 org message\n");
}

TEST_F(ZlvBasicFormatter, PutsALineThatIsZero)
{
    ZlvSetEventPropInt(event_, "zlv_prop_srcline", 0);
    EXPECT_EQ(line(), u"T 0 message\n");
}

TEST_F(ZlvBasicFormatter, PutsALineBelowZeroWithItsSign)
{
    ZlvSetEventPropInt(event_, "zlv_prop_srcline", -7);
    EXPECT_EQ(line(), u"T -7 message\n");
}

TEST_F(ZlvBasicFormatter, LeavesOutALineThatIsNoNumber)
{
    ZlvSetEventProp(event_, "zlv_prop_srcline", "twelve");
    EXPECT_EQ(line(), u"T message\n");
}

TEST_F(ZlvBasicFormatter, PutsEmptyFieldsWithTheirSeparator)
{
    ZlvSetEventProp(event_, "zlv_prop_srcfile", "");
    ZlvSetEventProp(event_, "server", "");
    EXPECT_EQ(line(), u"T   message\n");
}

TEST_F(ZlvBasicFormatter, LeavesOutOtherProperties)
{
    ZlvSetEventProp(event_, "Server", "x");
    ZlvSetEventProp(event_, "user", "x");
    EXPECT_EQ(line(), u"T message\n");
}

TEST_F(ZlvBasicFormatter, QuotesNothing)
{
    text(u"a|\"b\"\nc");
    ZlvSetEventProp(event_, "product", "x y\n<z>");
    EXPECT_EQ(line(), u"T x y\n<z> a|\"b\"\nc\n");
}

TEST_F(ZlvBasicFormatter, GivesLongLinesWhole)
{
    std::u16string message(50000, u'm');
    text(message.c_str());
    ZlvSetEventProp(event_, "product", std::string(50000, 'p').c_str());
    EXPECT_EQ(line(), u"T " + std::u16string(50000, u'p') + u" " + message + u"\n");
}

struct FieldRow {
    const char *label;
    const char *property;
    const char *value;
    const char16_t *line;
};

void PrintTo(const FieldRow &row, std::ostream *out)
{
    *out << row.property;
}

class ZlvBasicFormatterField : public ZlvBasicFormatter,
                               public testing::WithParamInterface<FieldRow> {};

TEST_P(ZlvBasicFormatterField, StandsAloneBetweenDateAndMessage)
{
    ZlvSetEventProp(event_, GetParam().property, GetParam().value);
    EXPECT_EQ(line(), GetParam().line);
}

constexpr FieldRow fields[] = {
    {"File", "zlv_prop_srcfile", "a.c", u"T a.c message\n"},
    {"Function", "zlv_prop_srcfunction", "main", u"T main message\n"},
    {"Line", "zlv_prop_srcline", "12", u"T 12 message\n"},
    {"Organization", "organization", "org", u"T org message\n"},
    {"Product", "product", "prod", u"T prod message\n"},
    {"Component", "component", "comp", u"T comp message\n"},
    {"Client", "client", "cli", u"T cli message\n"},
    {"Server", "server", "srv", u"T srv message\n"},
};

INSTANTIATE_TEST_SUITE_P(Each, ZlvBasicFormatterField, testing::ValuesIn(fields),
                         [](const auto &test) { return std::string(test.param.label); });

/* Separator. */

TEST_F(ZlvBasicFormatter, SeparatesWithWhatIsSet)
{
    setProp(formatter_, "separator", "|");
    ZlvSetEventProp(event_, "zlv_prop_srcfile", "a.c");
    ZlvSetEventProp(event_, "zlv_prop_srcfunction", "main");
    ZlvSetEventPropInt(event_, "zlv_prop_srcline", 12);
    ZlvSetEventProp(event_, "server", "srv");
    EXPECT_EQ(line(), u"T|a.c|main|12|srv|message\n");
}

TEST_F(ZlvBasicFormatter, TakesALongAndAnEmptySeparator)
{
    setProp(formatter_, "separator", " -> ");
    EXPECT_EQ(line(), u"T -> message\n");
    setProp(formatter_, "separator", "");
    EXPECT_EQ(line(), u"Tmessage\n");
}

TEST_F(ZlvBasicFormatter, SeparatesWithASpaceAgainWhenTheSeparatorIsRemoved)
{
    setProp(formatter_, "separator", "|");
    setProp(formatter_, "separator", nullptr);
    EXPECT_EQ(line(), u"T message\n");
    EXPECT_EQ(formatter_->formatter.separator, nullptr);
}

/* Locale. */

TEST_F(ZlvBasicFormatter, BindsInItsLocaleAndLeavesItWithTheEvent)
{
    key("plain");
    setProp(formatter_, "locale", "de");
    EXPECT_EQ(line(), u"T Dienst beendet\n");
    EXPECT_EQ(taken(zlvGetEventLocale(event_)), "de");
}

TEST_F(ZlvBasicFormatter, OverridesTheEventsLocale)
{
    key("plain");
    zlvSetEventLocale(event_, "ja");
    setProp(formatter_, "locale", "de");
    EXPECT_EQ(line(), u"T Dienst beendet\n");
}

TEST_F(ZlvBasicFormatter, WithoutALocaleKeepsTheEventsOwn)
{
    key("plain");
    zlvSetEventLocale(event_, "ja");
    EXPECT_EQ(line(), u"T サービスは停止しました\n");
    EXPECT_EQ(taken(zlvGetEventLocale(event_)), "ja");
}

TEST_F(ZlvBasicFormatter, StopsOverridingWhenTheLocaleIsRemoved)
{
    key("plain");
    setProp(formatter_, "locale", "de");
    setProp(formatter_, "locale", nullptr);
    zlvSetEventLocale(event_, "ja");
    EXPECT_EQ(line(), u"T サービスは停止しました\n");
}

TEST_F(ZlvBasicFormatter, DoesNotUseItsLocaleForTheDate)
{
    event_->time = 0;
    setProp(formatter_, "dateTimeFormat", "MMMM");
    setProp(formatter_, "locale", "de");
    EXPECT_EQ(line(), u"January message\n");
}

/* Settings. */

TEST_F(ZlvBasicFormatter, StartsWithoutSettings)
{
    ZlvObject *fresh = formatter("fresh");
    EXPECT_EQ(fresh->formatter.separator, nullptr);
    EXPECT_EQ(fresh->formatter.dateTimeFormat, nullptr);
    EXPECT_EQ(fresh->formatter.locale, nullptr);
}

TEST_F(ZlvBasicFormatter, KeepsCopiesOfItsSettings)
{
    setProp(formatter_, "separator", "|");
    setProp(formatter_, "locale", "de");
    EXPECT_EQ(peeked(formatter_->formatter.separator), "|");
    EXPECT_EQ(peeked(formatter_->formatter.dateTimeFormat), "'T'");
    EXPECT_EQ(peeked(formatter_->formatter.locale), "de");
}

TEST_F(ZlvBasicFormatter, PropertyNamesAreComparedWithCase)
{
    setProp(formatter_, "Separator", "|");
    setProp(formatter_, "datetimeformat", "yyyy");
    setProp(formatter_, "LOCALE", "de");
    key("plain");
    EXPECT_EQ(line(), u"T Service halted\n");
}

TEST_F(ZlvBasicFormatter, OtherPropertiesReachTheBasicObject)
{
    setProp(formatter_, "logging", "off");
    EXPECT_EQ(ZlvIsObjectEnabled(formatter_), 0);
}

TEST_F(ZlvBasicFormatter, FormatsAlsoWhileDisabled)
{
    ZlvSetObjectEnabled(formatter_, 0);
    EXPECT_EQ(line(), u"T message\n");
}

TEST_F(ZlvBasicFormatter, AConfigurationChangeWithANullArgumentDoesNothing)
{
    ZlvBasicFormatterFCfgChange(nullptr, "separator");
    ZlvBasicFormatterFCfgChange(formatter_, nullptr);
    EXPECT_EQ(line(), u"T message\n");
}

/* What gives nothing. */

TEST_F(ZlvBasicFormatter, HasNeitherHeaderNorTrailer)
{
    EXPECT_EQ(ZlvBasicFormatterFGetHeader(formatter_), nullptr);
    EXPECT_EQ(ZlvBasicFormatterFGetTrailer(formatter_), nullptr);
    EXPECT_EQ(ZlvBasicFormatterFGetHeader(nullptr), nullptr);
    EXPECT_EQ(ZlvBasicFormatterFGetTrailer(nullptr), nullptr);
}

TEST_F(ZlvBasicFormatter, OfNullArgumentsGivesNothing)
{
    EXPECT_EQ(ZlvBasicUFormatterFFormat(nullptr, event_, noArgs()), nullptr);
    EXPECT_EQ(ZlvBasicUFormatterFFormat(formatter_, nullptr, noArgs()), nullptr);
}

TEST_F(ZlvBasicFormatter, WithoutAClassGivesNothing)
{
    ZlvObject bare{};
    EXPECT_EQ(ZlvBasicUFormatterFFormat(&bare, event_, noArgs()), nullptr);
}

TEST_F(ZlvBasicFormatter, OfAnotherKindGivesNothing)
{
    EXPECT_EQ(ZlvBasicUFormatterFFormat(logger("app"), event_, noArgs()), nullptr);
    EXPECT_EQ(ZlvBasicUFormatterFFormat(handler("screen"), event_, noArgs()), nullptr);
}

TEST_F(ZlvBasicFormatter, WithoutABindEntryGivesNothing)
{
    formatter_->objClass->formatter.fBindMsg = nullptr;
    EXPECT_EQ(line(), UText{});
}

UChar *bindToBound(ZlvI18Msg *, va_list)
{
    auto *text = static_cast<UChar *>(RkoMemoryCalloc(2, sizeof(UChar)));
    text[0] = u'B';
    return text;
}

TEST_F(ZlvBasicFormatter, BindsThroughTheClassOfTheFormatter)
{
    ZlvAddUFormatterClass("test_bound", nullptr, nullptr, nullptr, ZlvBasicFormatterFCfgChange,
                          nullptr, nullptr, nullptr, bindToBound);
    ZlvObject *own = formatter("own", "test_bound");
    setProp(own, "dateTimeFormat", "'T'");
    EXPECT_EQ(taken(ZlvBasicUFormatterFFormat(own, event_, noArgs())), u"T B\n");
}

TEST_F(ZlvBasicFormatter, SurvivesEveryFailingAllocation)
{
    ZlvSetEventProp(event_, "zlv_prop_srcfile", "a.c");
    ZlvSetEventPropInt(event_, "zlv_prop_srcline", 12);
    setProp(formatter_, "locale", "de");
    uint32_t struck = 1;
    UText last;
    for (uint32_t allowed = 0; struck != 0; ++allowed) {
        FailAlloc fail(allowed, FailAlloc::Once);
        last = line();
        struck = fail.failed();
        ASSERT_LT(allowed, 200u);
    }
    EXPECT_EQ(last, u"T a.c 12 message\n");
}

/* Whole records. */

TEST_F(ZlvBasicFormatter, TheConsolePrintsARecordAndAnEmptyLine)
{
    ZlvObject *app = logger("app");
    ZlvObject *screen = handler("screen");
    ZlvHandlerSetFormatter(screen, formatter_);
    ZlvAddListener(app, screen);
    EXPECT_EQ(console([&] { ZlvLogDebugMin(app, "a.c", "main", 12, u"{0}!", u"text"); }),
              "T a.c main 12 text!\n\n");
}

} // namespace
} // namespace zelvo_test
