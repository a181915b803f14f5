// SPDX-License-Identifier: Apache-2.0
#include "ZlvConsoleHandler.h"

#include <unicode/ustring.h>

#include <cstring>

#include "CxString.h"
#include "support/Bundles.h"
#include "support/Console.h"
#include "support/FailAlloc.h"
#include "support/Recorder.h"
#include "support/VaList.h"

namespace zelvo_test {
namespace {

/// A record is the bound message alone, with neither date nor line feed.
UChar *formatMessage(ZlvObject *, ZlvEvent *event, va_list args)
{
    return zlvIntlBindUI18Msg(event->message, args);
}

char *giveHeader(ZlvObject *)
{
    return RkoStringDup("<log>");
}

char *giveTrailer(ZlvObject *)
{
    return RkoStringDup("</log>");
}

/// The logger "app" sends to the console "screen", whose formatter has a header and a trailer.
class ZlvConsoleHandler : public RecordedToolkit {
protected:
    void SetUp() override
    {
        RecordedToolkit::SetUp();
        ZlvAddUFormatterClass("test_formatter", nullptr, nullptr, nullptr, nullptr, formatMessage,
                              giveHeader, giveTrailer, nullptr);
        setProp(app_, "listenerNames", "");
        screen_ = handler("screen");
        ZlvHandlerSetFormatter(screen_, formatter("formatter", "test_formatter"));
        ZlvAddListener(app_, screen_);
    }

    /// TEXT in the code page that the Unicode library takes for the process's.
    static std::string inDefaultCodePage(const UChar *text)
    {
        std::string bytes(100, '\0');
        bytes.resize(std::strlen(u_austrncpy(bytes.data(), text, 100)));
        return bytes;
    }

    uint8_t opened() const { return static_cast<ConsoleHandlerVars *>(screen_->vars)->opened; }

    void process(const char16_t *text)
    {
        ZlvEvent *event = ZlvVaAllocUEvent(1, nullptr, nullptr, text, noArgs());
        ZlvConsoleUHandlerFProcess(screen_, event, noArgs());
        ZlvFreeEvent(event);
    }

    ZlvObject *screen_ = nullptr;
};

/* Records. */

TEST_F(ZlvConsoleHandler, PrintsTheHeaderBeforeTheFirstRecordOnly)
{
    Console console;
    log(app_, u"one");
    EXPECT_EQ(console.seen(), "<log>\none\n");
    log(app_, u"two");
    EXPECT_EQ(console.seen(), "<log>\none\ntwo\n");
}

TEST_F(ZlvConsoleHandler, EachRecordIsVisibleAtOnce)
{
    Console console;
    for (const char16_t *text : {u"a", u"b", u"c"}) {
        size_t before = console.seen().size();
        log(app_, text);
        EXPECT_GT(console.seen().size(), before);
    }
}

TEST_F(ZlvConsoleHandler, KeepsTheOrderWithWhatTheProgramPrints)
{
    Console console;
    std::fputs("before ", stdout);
    log(app_, u"one");
    std::fputs("after\n", stdout);
    log(app_, u"two");
    EXPECT_EQ(console.seen(), "before <log>\none\nafter\ntwo\n");
}

TEST_F(ZlvConsoleHandler, BindsTheMessageWithTheCallsArguments)
{
    Console console;
    ZlvLogError(app_, bundlePath, "both", u"disk", 3);
    EXPECT_EQ(console.seen(), "<log>\ndisk: 3 entries\n");
}

TEST_F(ZlvConsoleHandler, AddsALineFeedToARecordThatEndsInOne)
{
    setProp(screen_, "formatterName", "zelvo.defaultFormatter");
    setProp(formatter("zelvo.defaultFormatter"), "dateTimeFormat", "yyyy");
    Console console;
    log(app_, u"text");
    std::string printed = console.seen();
    ASSERT_GT(printed.size(), 4u);
    EXPECT_EQ(printed.substr(4), " text\n\n");
}

TEST_F(ZlvConsoleHandler, ConvertsToTheDefaultCodePage)
{
    Console console;
    log(app_, u"停止");
    EXPECT_EQ(console.seen(), "<log>\n" + inDefaultCodePage(u"停止") + "\n");
}

TEST_F(ZlvConsoleHandler, PrintsNothingForAnEventWithoutText)
{
    Console console;
    log(app_, nullptr);
    EXPECT_EQ(console.seen(), "<log>\n");
}

TEST_F(ZlvConsoleHandler, LeavesTheEventsStatusAlone)
{
    Console console;
    ZlvStatus status = log(app_, u"text");
    EXPECT_EQ(status.type, '-');
    EXPECT_EQ(status.code, 0);
}

/* Passing on. */

TEST_F(ZlvConsoleHandler, PassesEventsOnToItsListeners)
{
    ZlvAddListener(screen_, recorder_);
    Console console;
    log(app_, u"text");
    EXPECT_EQ(console.seen(), "<log>\ntext\n");
    ASSERT_EQ(records().size(), 1u);
    EXPECT_EQ(records()[0].text, u"text");
}

TEST_F(ZlvConsoleHandler, PassesEventsWithoutTextOnToo)
{
    ZlvAddListener(screen_, recorder_);
    Console console;
    log(app_, nullptr);
    EXPECT_EQ(records().size(), 1u);
}

TEST_F(ZlvConsoleHandler, WithAnUnknownFormatterPrintsNothingButPassesOn)
{
    setProp(screen_, "formatterName", "nobody");
    ZlvAddListener(screen_, recorder_);
    Console console;
    log(app_, u"text");
    EXPECT_EQ(console.seen(), "");
    EXPECT_EQ(records().size(), 1u);
    EXPECT_EQ(opened(), 1);
}

TEST_F(ZlvConsoleHandler, ThatIsDisabledNeitherPrintsNorPassesOn)
{
    setProp(screen_, "logging", "off");
    ZlvAddListener(screen_, recorder_);
    Console console;
    log(app_, u"text");
    EXPECT_EQ(console.seen(), "");
    EXPECT_TRUE(records().empty());
    EXPECT_EQ(opened(), 0);
}

/* Opening and closing. */

TEST_F(ZlvConsoleHandler, OpensOnceWithTheHeader)
{
    Console console;
    ZlvConsoleHandlerFOpen(screen_);
    EXPECT_EQ(opened(), 1);
    ZlvConsoleHandlerFOpen(screen_);
    process(u"one");
    EXPECT_EQ(console.seen(), "<log>\none\n");
}

TEST_F(ZlvConsoleHandler, ClosesOnceWithTheTrailer)
{
    Console console;
    process(u"one");
    ZlvConsoleHandlerFClose(screen_);
    EXPECT_EQ(opened(), 0);
    ZlvConsoleHandlerFClose(screen_);
    EXPECT_EQ(console.seen(), "<log>\none\n</log>\n");
}

TEST_F(ZlvConsoleHandler, OpenedAgainPrintsTheHeaderAgain)
{
    Console console;
    process(u"one");
    ZlvConsoleHandlerFClose(screen_);
    process(u"two");
    EXPECT_EQ(console.seen(), "<log>\none\n</log>\n<log>\ntwo\n");
}

TEST_F(ZlvConsoleHandler, ClosedBeforeItWasOpenPrintsNothing)
{
    Console console;
    ZlvConsoleHandlerFClose(screen_);
    EXPECT_EQ(console.seen(), "");
}

TEST_F(ZlvConsoleHandler, WithAFormatterWithoutHeaderOpensAndClosesSilently)
{
    setProp(screen_, "formatterName", "zelvo.defaultFormatter");
    Console console;
    ZlvConsoleHandlerFOpen(screen_);
    EXPECT_EQ(opened(), 1);
    ZlvConsoleHandlerFClose(screen_);
    EXPECT_EQ(opened(), 0);
    EXPECT_EQ(console.seen(), "");
}

TEST_F(ZlvConsoleHandler, WithoutAFormatterOpensAndClosesSilently)
{
    ZlvHandlerSetFormatter(screen_, nullptr);
    Console console;
    ZlvConsoleHandlerFOpen(screen_);
    EXPECT_EQ(opened(), 1);
    ZlvConsoleHandlerFClose(screen_);
    EXPECT_EQ(opened(), 0);
    EXPECT_EQ(console.seen(), "");
}

TEST_F(ZlvConsoleHandler, PrintsTheTrailerWhenItIsReleased)
{
    Console console;
    ZlvObject *last = ZlvGetObject("last", "zlv_consolehandler");
    ZlvHandlerSetFormatter(last, screen_->handler.formatter);
    ZlvAddListener(app_, last);
    setProp(screen_, "logging", "off");
    log(app_, u"one");
    ZlvRemListener(app_, last);
    EXPECT_EQ(console.seen(), "<log>\none\n");
    ZlvReleaseObject(last);
    EXPECT_EQ(console.seen(), "<log>\none\n</log>\n");
}

TEST_F(ZlvConsoleHandler, StillAliveWhenTheToolkitClosesPrintsNoTrailer)
{
    ZlvObject *last = ZlvGetObject("last", "zlv_consolehandler");
    ZlvHandlerSetFormatter(last, screen_->handler.formatter);
    ZlvAddListener(logger("zelvo.errorLogger"), last);
    Console console;
    ZlvConsoleHandlerFOpen(last);
    ZlvReleaseObject(last);
    close();
    EXPECT_EQ(console.seen(), "<log>\n");
}

/* Variables and null arguments. */

TEST(ZlvConsoleHandlerVars, StartClosed)
{
    void *vars = ZlvConsoleHandlerFAllocVars();
    ASSERT_NE(vars, nullptr);
    EXPECT_EQ(static_cast<ConsoleHandlerVars *>(vars)->opened, 0);
    ZlvConsoleHandlerFFreeVars(vars);
}

TEST(ZlvConsoleHandlerVars, AreOneByte)
{
    EXPECT_EQ(sizeof(ConsoleHandlerVars), 1u);
}

TEST(ZlvConsoleHandlerVars, AreNullWithoutMemory)
{
    FailAlloc fail(0);
    EXPECT_EQ(ZlvConsoleHandlerFAllocVars(), nullptr);
    EXPECT_EQ(fail.failed(), 1u);
}

TEST(ZlvConsoleHandlerVars, FreedOpenPrintNoTrailer)
{
    Console console;
    void *vars = ZlvConsoleHandlerFAllocVars();
    static_cast<ConsoleHandlerVars *>(vars)->opened = 1;
    ZlvConsoleHandlerFFreeVars(vars);
    ZlvConsoleHandlerFFreeVars(nullptr);
    EXPECT_EQ(console.seen(), "");
}

TEST_F(ZlvConsoleHandler, EntriesWithANullArgumentDoNothing)
{
    Console console;
    ZlvEvent event{};
    ZlvConsoleUHandlerFProcess(nullptr, &event, noArgs());
    ZlvConsoleUHandlerFProcess(screen_, nullptr, noArgs());
    ZlvConsoleHandlerFOpen(nullptr);
    ZlvConsoleHandlerFClose(nullptr);
    EXPECT_EQ(console.seen(), "");
    EXPECT_EQ(opened(), 0);
}

TEST_F(ZlvConsoleHandler, WithoutVariablesNeitherPrintsNorPassesOn)
{
    ZlvAddListener(screen_, recorder_);
    void *vars = std::exchange(screen_->vars, nullptr);
    Console console;
    log(app_, u"text");
    ZlvConsoleHandlerFOpen(screen_);
    ZlvConsoleHandlerFClose(screen_);
    EXPECT_EQ(console.seen(), "");
    EXPECT_TRUE(records().empty());
    screen_->vars = vars;
}

} // namespace
} // namespace zelvo_test
