// SPDX-License-Identifier: Apache-2.0
// Whole lines of the trace formatter.
#include "ZlvVyxTraceFormatter.h"

#include <ostream>

#include "CxString.h"
#include "support/Records.h"

#define START u"\x1e[" RECORD_DATE u"] - "

namespace zelvo_test {
namespace {

class ZlvVyxTrace : public RecordFixture {
protected:
    void SetUp() override
    {
        RecordFixture::SetUp();
        formatter_ = formatter("line", "zlv_vyxtraceformatter");
        text(u"text", ZLV_LEVEL_INFO);
    }

    template <class... Arguments>
    UText line(Arguments... arguments)
    {
        return recordBy(formatter_, arguments...);
    }

    ZlvObject *formatter_ = nullptr;
};

/* Whole lines. */

TEST_F(ZlvVyxTrace, OfAPlainEventKeepsTheSeparatorsOfEmptyFields)
{
    EXPECT_EQ(line(), u"\x1e[2006-08-16 08:48:55.123+00:00] - INFO  -  -  -  -  - text\n");
}

TEST_F(ZlvVyxTrace, OfAFullEventHasEveryField)
{
    text(u"KDY1234E The disk is full", ZLV_LEVEL_ERROR);
    set("server", "host.example.com");
    set("processId", 4711);
    set("threadId", 3);
    set("zlv_prop_srcfile", "a.c");
    set("zlv_prop_srcfunction", "f");
    set("zlv_prop_srcline", 7);
    EXPECT_EQ(line(), u"\x1e[2006-08-16 08:48:55.123+00:00] - ERROR - host - p4711:t3 - a.c:f(7)"
                      u" - KDY1234E - KDY1234E The disk is full\n");
}

TEST_F(ZlvVyxTrace, ShowsNoOtherProperties)
{
    for (const char *name : {"product", "component", "organization", "client", "user"})
        set(name, "x");
    EXPECT_EQ(line(), START u"INFO  -  -  -  -  - text\n");
}

TEST_F(ZlvVyxTrace, IsTheSameForAMessage)
{
    ZlvSetEventIsMessage(event_, 1);
    EXPECT_EQ(line(), START u"INFO  -  -  -  -  - text\n");
}

TEST_F(ZlvVyxTrace, BindsTheMessageWithTheArguments)
{
    key("both");
    EXPECT_EQ(line(u"disk", 3), START u"OTHER -  -  -  -  - disk: 3 entries\n");
}

TEST_F(ZlvVyxTrace, OfAnEventWithoutTextEndsBehindItsSeparators)
{
    text(nullptr);
    EXPECT_EQ(line(), START u"OTHER -  -  -  -  - \n");
}

TEST_F(ZlvVyxTrace, OfAMessageThatDoesNotBindHasNoText)
{
    key("no such key");
    EXPECT_EQ(line(), START u"OTHER -  -  -  -  - \n");
}

TEST_F(ZlvVyxTrace, OfAnEventWithoutMessageHasNoText)
{
    zlvIntlFreeI18Msg(event_->message);
    event_->message = nullptr;
    EXPECT_EQ(line(), START u"INFO  -  -  -  -  - \n");
}

TEST_F(ZlvVyxTrace, EscapesNothing)
{
    text(u"a - b\n\x1e"
         u"c");
    set("server", "x - y\x1e");
    EXPECT_EQ(line(), START u"OTHER - x - y\x1e -  -  -  - a - b\n\x1e"
                            u"c\n");
}

TEST_F(ZlvVyxTrace, GivesLongLinesWhole)
{
    const std::u16string message(65536, u'm');
    text(message.c_str());
    set("server", std::string(65536, 's').c_str());
    EXPECT_EQ(line(),
              START u"OTHER - " + std::u16string(65536, u's') + u" -  -  -  - " + message + u"\n");
}

TEST_F(ZlvVyxTrace, IsNothingWithoutFormatterOrEvent)
{
    HeldMutex held;
    EXPECT_EQ(ZlvVyxTraceUFormatterFFormat(nullptr, event_, noArgs()), nullptr);
    EXPECT_EQ(ZlvVyxTraceUFormatterFFormat(formatter_, nullptr, noArgs()), nullptr);
}

/* Levels. */

struct LevelRow {
    const char *label;
    ZlvLevel level;
    const char16_t *line;
};

void PrintTo(const LevelRow &row, std::ostream *out)
{
    *out << row.label;
}

class ZlvVyxTraceLevel : public ZlvVyxTrace, public testing::WithParamInterface<LevelRow> {};

TEST_P(ZlvVyxTraceLevel, TakesFiveCharacters)
{
    event_->level = GetParam().level;
    EXPECT_EQ(line(), GetParam().line);
}

const LevelRow levels[] = {
    {"Info", 4000, START u"INFO  -  -  -  -  - text\n"},
    {"Warn", 5000, START u"WARN  -  -  -  -  - text\n"},
    {"Error", 6000, START u"ERROR -  -  -  -  - text\n"},
    {"Fatal", 7000, START u"ERROR -  -  -  -  - text\n"},
    {"DebugMin", 3000, START u" MIN  -  -  -  -  - text\n"},
    {"DebugMid", 2000, START u" MID  -  -  -  -  - text\n"},
    {"DebugMax", 1000, START u" MAX  -  -  -  -  - text\n"},
    {"BetweenInfoAndWarn", 4500, START u"OTHER -  -  -  -  - text\n"},
    {"All", 0, START u"OTHER -  -  -  -  - text\n"},
    {"Off", 9999, START u"OTHER -  -  -  -  - text\n"},
    {"None", -9999, START u"OTHER -  -  -  -  - text\n"},
};

INSTANTIATE_TEST_SUITE_P(, ZlvVyxTraceLevel, testing::ValuesIn(levels),
                         [](const auto &row) { return std::string(row.param.label); });

/* Fields that come from properties. */

struct FieldRow {
    const char *label;
    std::pair<const char *, const char *> properties[3];
    const char16_t *line;
};

void PrintTo(const FieldRow &row, std::ostream *out)
{
    *out << row.label;
}

class ZlvVyxTraceField : public ZlvVyxTrace, public testing::WithParamInterface<FieldRow> {};

TEST_P(ZlvVyxTraceField, HoldsWhatTheEventHas)
{
    for (const auto &[name, value] : GetParam().properties)
        if (name != nullptr)
            set(name, value);
    EXPECT_EQ(line(), GetParam().line);
}

#define SOURCE_FILE "zlv_prop_srcfile"
#define SOURCE_FUNCTION "zlv_prop_srcfunction"
#define SOURCE_LINE "zlv_prop_srcline"

const FieldRow servers[] = {
    {"ThreeLabels", {{"server", "host.example.com"}}, START u"INFO  - host -  -  -  - text\n"},
    {"OneLabel", {{"server", "host"}}, START u"INFO  - host -  -  -  - text\n"},
    {"DotAtTheEnd", {{"server", "host."}}, START u"INFO  - host -  -  -  - text\n"},
    {"DotFirst", {{"server", ".example"}}, START u"INFO  -  -  -  -  - text\n"},
    {"OnlyADot", {{"server", "."}}, START u"INFO  -  -  -  -  - text\n"},
    {"Empty", {{"server", ""}}, START u"INFO  -  -  -  -  - text\n"},
    {"Address", {{"server", "192.0.2.7"}}, START u"INFO  - 192 -  -  -  - text\n"},
};
INSTANTIATE_TEST_SUITE_P(Server, ZlvVyxTraceField, testing::ValuesIn(servers),
                         [](const auto &row) { return std::string(row.param.label); });

const FieldRow runners[] = {
    {"Both",
     {{"processId", "4711"}, {"threadId", "3"}},
     START u"INFO  -  - p4711:t3 -  -  - text\n"},
    {"ThreadAlone", {{"threadId", "3"}}, START u"INFO  -  - t3 -  -  - text\n"},
    {"ProcessAlone", {{"processId", "4711"}}, START u"INFO  -  - p4711 -  -  - text\n"},
    {"Zeros", {{"processId", "0"}, {"threadId", "0"}}, START u"INFO  -  - p0:t0 -  -  - text\n"},
    {"ProcessBelowZero",
     {{"processId", "-1"}},
     START u"INFO  -  - p18446744073709551615 -  -  - text\n"},
    {"ThreadBelowZero",
     {{"threadId", "-2147483648"}},
     START u"INFO  -  - t18446744071562067968 -  -  - text\n"},
    {"Largest", {{"threadId", "2147483647"}}, START u"INFO  -  - t2147483647 -  -  - text\n"},
    {"NoNumbers",
     {{"processId", "init"}, {"threadId", "main"}},
     START u"INFO  -  -  -  -  - text\n"},
    {"ProcessThatIsNoNumber",
     {{"processId", "init"}, {"threadId", "3"}},
     START u"INFO  -  - t3 -  -  - text\n"},
};
INSTANTIATE_TEST_SUITE_P(Runner, ZlvVyxTraceField, testing::ValuesIn(runners),
                         [](const auto &row) { return std::string(row.param.label); });

const FieldRow sources[] = {
    {"File", {{SOURCE_FILE, "a.c"}}, START u"INFO  -  -  - a.c -  - text\n"},
    {"Function", {{SOURCE_FUNCTION, "f"}}, START u"INFO  -  -  - f -  - text\n"},
    {"FileFunction",
     {{SOURCE_FILE, "a.c"}, {SOURCE_FUNCTION, "f"}},
     START u"INFO  -  -  - a.c:f -  - text\n"},
    {"Line", {{SOURCE_LINE, "7"}}, START u"INFO  -  -  - (7) -  - text\n"},
    {"FileLine",
     {{SOURCE_FILE, "a.c"}, {SOURCE_LINE, "7"}},
     START u"INFO  -  -  - a.c(7) -  - text\n"},
    {"FunctionLine",
     {{SOURCE_FUNCTION, "f"}, {SOURCE_LINE, "7"}},
     START u"INFO  -  -  - f(7) -  - text\n"},
    {"All",
     {{SOURCE_LINE, "7"}, {SOURCE_FUNCTION, "f"}, {SOURCE_FILE, "a.c"}},
     START u"INFO  -  -  - a.c:f(7) -  - text\n"},
    {"LineZero",
     {{SOURCE_FILE, "a.c"}, {SOURCE_LINE, "0"}},
     START u"INFO  -  -  - a.c(0) -  - text\n"},
    {"LineBelowZero",
     {{SOURCE_FILE, "a.c"}, {SOURCE_LINE, "-5"}},
     START u"INFO  -  -  - a.c(-5) -  - text\n"},
    {"LineThatIsNoNumber",
     {{SOURCE_FILE, "a.c"}, {SOURCE_LINE, "x"}},
     START u"INFO  -  -  - a.c -  - text\n"},
    {"Empty", {{SOURCE_FILE, ""}, {SOURCE_FUNCTION, ""}}, START u"INFO  -  -  - : -  - text\n"},
};
INSTANTIATE_TEST_SUITE_P(Source, ZlvVyxTraceField, testing::ValuesIn(sources),
                         [](const auto &row) { return std::string(row.param.label); });

/* Identifiers. */

struct IdRow {
    const char *label;
    const char *own;
    const char16_t *text;
    const char16_t *line;
};

void PrintTo(const IdRow &row, std::ostream *out)
{
    *out << row.label;
}

class ZlvVyxTraceId : public ZlvVyxTrace, public testing::WithParamInterface<IdRow> {};

TEST_P(ZlvVyxTraceId, IsTheEventsOwnOrElseThatOfItsText)
{
    text(GetParam().text);
    ZlvSetEventMessageId(event_, GetParam().own);
    EXPECT_EQ(line(), GetParam().line);
}

const IdRow ids[] = {
    {"FromTheText", nullptr, u"ABC123I up", START u"OTHER -  -  -  - ABC123I - ABC123I up\n"},
    {"NoneInTheText", nullptr, u"up", START u"OTHER -  -  -  -  - up\n"},
    {"Own", "own", u"up", START u"OTHER -  -  -  - own - up\n"},
    {"OwnBeforeThatOfTheText", "own", u"ABC123I up", START u"OTHER -  -  -  - own - ABC123I up\n"},
    {"OwnEmpty", "", u"ABC123I up", START u"OTHER -  -  -  -  - ABC123I up\n"},
    {"OwnWithoutText", "own", nullptr, START u"OTHER -  -  -  - own - \n"},
};
INSTANTIATE_TEST_SUITE_P(, ZlvVyxTraceId, testing::ValuesIn(ids),
                         [](const auto &row) { return std::string(row.param.label); });

/* The class, and settings. */

TEST_F(ZlvVyxTrace, HasAClassWithoutVariablesAndWithoutConfigurationChange)
{
    const ZlvObjClass *its = formatter_->objClass;
    EXPECT_EQ(its->fCfgChange, nullptr);
    EXPECT_EQ(its->fAllocVars, nullptr);
    EXPECT_EQ(its->fFreeVars, nullptr);
    EXPECT_EQ(formatter_->vars, nullptr);
}

TEST_F(ZlvVyxTrace, HasNeitherHeaderNorTrailer)
{
    EXPECT_EQ(formatter_->objClass->formatter.fGetHeader(formatter_), nullptr);
    EXPECT_EQ(formatter_->objClass->formatter.fGetTrailer(formatter_), nullptr);
}

TEST_F(ZlvVyxTrace, TakesNoSettingsFromItsProperties)
{
    key("plain");
    setProp(formatter_, "dateTimeFormat", "HH:mm");
    setProp(formatter_, "separator", "|");
    setProp(formatter_, "locale", "de");
    EXPECT_EQ(line(), START u"OTHER -  -  -  -  - Service halted\n");
    EXPECT_EQ(taken(zlvGetEventLocale(event_)), std::nullopt);
}

TEST_F(ZlvVyxTrace, TakesNoSettingsFromItsConfiguration)
{
    ZlvFreeEvent(event_);
    event_ = nullptr;
    close();
    open("line.className=zlv_vyxtraceformatter\nline.dateTimeFormat=HH:mm\nline.locale=de\n");
    formatter_ = object("line");
    key("plain");
    EXPECT_EQ(line(), START u"OTHER -  -  -  -  - Service halted\n");
}

TEST_F(ZlvVyxTrace, LeavesTheEventsLocaleAlone)
{
    key("plain");
    zlvSetEventLocale(event_, "de");
    EXPECT_EQ(line(), START u"OTHER -  -  -  -  - Dienst beendet\n");
    EXPECT_EQ(taken(zlvGetEventLocale(event_)), "de");
}

TEST_F(ZlvVyxTrace, ShowsTheDateInAFormatThatWasFilledInByHand)
{
    formatter_->formatter.dateTimeFormat = RkoStringDup("HH:mm");
    EXPECT_EQ(line(), u"\x1e[08:48] - INFO  -  -  -  -  - text\n");
}

TEST_F(ZlvVyxTrace, ShowsEmptyBracketsForAnEmptyDate)
{
    formatter_->formatter.dateTimeFormat = RkoStringDup("");
    EXPECT_EQ(line(), u"\x1e[] - INFO  -  -  -  -  - text\n");
}

TEST_F(ZlvVyxTrace, BindsInALocaleThatWasFilledInByHand)
{
    key("plain");
    zlvSetEventLocale(event_, "ja");
    formatter_->formatter.locale = RkoStringDup("de");
    EXPECT_EQ(line(), START u"OTHER -  -  -  -  - Dienst beendet\n");
    EXPECT_EQ(taken(zlvGetEventLocale(event_)), "de");
}

TEST_F(ZlvVyxTrace, ShowsTheDateInTheDefaultZone)
{
    zone(u"GMT-03:30");
    EXPECT_EQ(line(), u"\x1e[2006-08-16 05:18:55.123-03:-30] - INFO  -  -  -  -  - text\n");
}

} // namespace
} // namespace zelvo_test
