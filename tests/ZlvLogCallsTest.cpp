// SPDX-License-Identifier: Apache-2.0
// The logging calls side by side: each call, in both its forms, at each threshold.
#include <ostream>

#include "ZlvLogger.h"
#include "support/Bundles.h"
#include "support/Recorder.h"
#include "support/VaList.h"

namespace zelvo_test {
namespace {

using MessageCall = ZlvStatus (*)(ZlvObject *, const char *, const char *, ...);
using MessageVaCall = ZlvStatus (*)(ZlvObject *, const char *, const char *, va_list);
using DebugCall = ZlvStatus (*)(ZlvObject *, const char *, const char *, int32_t, const UChar *,
                                ...);
using DebugVaCall = ZlvStatus (*)(ZlvObject *, const char *, const char *, int32_t, const UChar *,
                                  va_list);
using TextCall = ZlvStatus (*)(ZlvObject *, const UChar *, ...);
using TextVaCall = ZlvStatus (*)(ZlvObject *, const UChar *, va_list);

constexpr const char16_t *pattern = u"{0}: {1,number,integer} entries";

/// Each logs the name "disk" and the number 3 under one pattern.
template <MessageCall call>
ZlvStatus message(ZlvObject *logger)
{
    return call(logger, bundlePath, "both", u"disk", 3);
}

template <MessageVaCall call>
ZlvStatus messageVa(ZlvObject *logger)
{
    ZlvStatus status{};
    withArgs([&](va_list args) { status = call(logger, bundlePath, "both", args); }, u"disk", 3);
    return status;
}

template <DebugCall call>
ZlvStatus debug(ZlvObject *logger)
{
    return call(logger, "a.c", "main", 12, pattern, u"disk", 3);
}

template <DebugVaCall call>
ZlvStatus debugVa(ZlvObject *logger)
{
    ZlvStatus status{};
    withArgs([&](va_list args) { status = call(logger, "a.c", "main", 12, pattern, args); },
             u"disk", 3);
    return status;
}

template <TextCall call>
ZlvStatus text(ZlvObject *logger)
{
    return call(logger, pattern, u"disk", 3);
}

template <TextVaCall call>
ZlvStatus textVa(ZlvObject *logger)
{
    ZlvStatus status{};
    withArgs([&](va_list args) { status = call(logger, pattern, args); }, u"disk", 3);
    return status;
}

enum class Family { Message, Debug, PlainText };

struct CallRow {
    const char *name;
    Family family;
    ZlvLevel level;
    ZlvStatus (*log)(ZlvObject *logger);
};

void PrintTo(const CallRow &row, std::ostream *out)
{
    *out << row.name;
}

constexpr CallRow calls[] = {
    {"UMsg", Family::Message, -9999, message<ZlvLogUMsg>},
    {"UMsgVA", Family::Message, -9999, messageVa<ZlvLogUMsgVA>},
    {"Fatal", Family::Message, 7000, message<ZlvLogFatal>},
    {"FatalVA", Family::Message, 7000, messageVa<ZlvLogFatalVA>},
    {"Error", Family::Message, 6000, message<ZlvLogError>},
    {"ErrorVA", Family::Message, 6000, messageVa<ZlvLogErrorVA>},
    {"Warn", Family::Message, 5000, message<ZlvLogWarn>},
    {"WarnVA", Family::Message, 5000, messageVa<ZlvLogWarnVA>},
    {"Info", Family::Message, 4000, message<ZlvLogInfo>},
    {"InfoVA", Family::Message, 4000, messageVa<ZlvLogInfoVA>},
    {"DebugMin", Family::Debug, 3000, debug<ZlvLogDebugMin>},
    {"DebugMinVA", Family::Debug, 3000, debugVa<ZlvLogDebugMinVA>},
    {"DebugMid", Family::Debug, 2000, debug<ZlvLogDebugMid>},
    {"DebugMidVA", Family::Debug, 2000, debugVa<ZlvLogDebugMidVA>},
    {"DebugMax", Family::Debug, 1000, debug<ZlvLogDebugMax>},
    {"DebugMaxVA", Family::Debug, 1000, debugVa<ZlvLogDebugMaxVA>},
    {"UText", Family::PlainText, -9999, text<ZlvLogUText>},
    {"UTextVA", Family::PlainText, -9999, textVa<ZlvLogUTextVA>},
};

class ZlvLogCall : public RecordedToolkit, public testing::WithParamInterface<CallRow> {
protected:
    ZlvStatus log(ZlvObject *logger) { return GetParam().log(logger); }
};

std::string callName(const testing::TestParamInfo<CallRow> &info)
{
    return info.param.name;
}

TEST_P(ZlvLogCall, MakesOneEventOfItsLevel)
{
    setProp(app_, "level", "ALL");
    log(app_);
    ASSERT_EQ(records().size(), 1u);
    EXPECT_EQ(records()[0].level, GetParam().level);
}

TEST_P(ZlvLogCall, HandsItsArgumentsToTheMessage)
{
    setProp(app_, "level", "ALL");
    log(app_);
    ASSERT_EQ(records().size(), 1u);
    EXPECT_EQ(records()[0].text, u"disk: 3 entries");
}

TEST_P(ZlvLogCall, MarksMessageEventsAndNoOthers)
{
    setProp(app_, "level", "ALL");
    log(app_);
    ASSERT_EQ(records().size(), 1u);
    EXPECT_EQ(records()[0].isMessage, GetParam().family == Family::Message);
}

TEST_P(ZlvLogCall, RecordsTheSourceOfDebugEventsAndOfNoOthers)
{
    setProp(app_, "level", "ALL");
    log(app_);
    std::map<std::string, std::string> source{
        {"zlv_prop_srcfile", "a.c"}, {"zlv_prop_srcline", "12"}, {"zlv_prop_srcfunction", "main"}};
    if (GetParam().family != Family::Debug)
        source.clear();
    ASSERT_EQ(records().size(), 1u);
    EXPECT_EQ(records()[0].properties, source);
}

TEST_P(ZlvLogCall, OnANullLoggerReturnsNoError)
{
    ZlvStatus status = log(nullptr);
    EXPECT_EQ(status.type, '-');
    EXPECT_EQ(status.code, 0);
    EXPECT_EQ(status.icuError, 0);
}

TEST_P(ZlvLogCall, OnADisabledLoggerIsRefused)
{
    setProp(app_, "level", "ALL");
    setProp(app_, "logging", "off");
    Recorder::leave({'p', 28});
    EXPECT_EQ(log(app_).type, '-');
    EXPECT_TRUE(records().empty());
}

TEST_P(ZlvLogCall, GivesTheStatusThatTheHandlerLeft)
{
    setProp(app_, "level", "ALL");
    Recorder::leave({'p', 28});
    ZlvStatus status = log(app_);
    EXPECT_EQ(status.type, 'p');
    EXPECT_EQ(status.code, 28);
    EXPECT_EQ(status.icuError, 0);
}

TEST_P(ZlvLogCall, ReleasesTheMutex)
{
    log(app_);
    ASSERT_EQ(zlvAPIMutexLock(), 1);
    zlvAPIMutexUnlock();
}

INSTANTIATE_TEST_SUITE_P(Each, ZlvLogCall, testing::ValuesIn(calls), callName);

/* Each call against each threshold. */

struct ThresholdRow {
    const char *name;
    const char *property;
    ZlvLevel lowest; ///< the lowest named level that passes
};

void PrintTo(const ThresholdRow &row, std::ostream *out)
{
    *out << row.name;
}

constexpr ThresholdRow thresholds[] = {
    {"Fatal", "FATAL", 7000},
    {"Error", "ERROR", 6000},
    {"Warn", "WARN", 5000},
    {"Info", "INFO", 4000},
    {"DebugMin", "DEBUG_MIN", 3000},
    {"DebugMid", "DEBUG_MID", 2000},
    {"DebugMax", "DEBUG_MAX", 1000},
    {"All", "ALL", 1000},
    {"Off", "OFF", 8000},
    {"Unparsable", "?", 1000},
};

class ZlvLogCallAtThreshold
    : public RecordedToolkit,
      public testing::WithParamInterface<std::tuple<CallRow, ThresholdRow>> {};

TEST_P(ZlvLogCallAtThreshold, PassesWithoutALevelOrWithOneHighEnough)
{
    const auto &[call, threshold] = GetParam();
    bool passes = call.level == -9999 || call.level >= threshold.lowest;
    setProp(app_, "level", threshold.property);
    call.log(app_);
    EXPECT_EQ(records().size(), passes ? 1u : 0u);
}

INSTANTIATE_TEST_SUITE_P(Each, ZlvLogCallAtThreshold,
                         testing::Combine(testing::ValuesIn(calls), testing::ValuesIn(thresholds)),
                         [](const auto &test) {
                             return std::string(std::get<0>(test.param).name) + "At" +
                                    std::get<1>(test.param).name;
                         });

/* The VA forms without a list. */

template <MessageVaCall call>
ZlvStatus messageWithoutList(ZlvObject *logger)
{
    return call(logger, bundlePath, "plain", noArgs());
}

template <DebugVaCall call>
ZlvStatus debugWithoutList(ZlvObject *logger)
{
    return call(logger, nullptr, nullptr, 0, u"Service halted", noArgs());
}

template <TextVaCall call>
ZlvStatus textWithoutList(ZlvObject *logger)
{
    return call(logger, u"Service halted", noArgs());
}

constexpr CallRow callsWithoutList[] = {
    {"UMsgVA", Family::Message, -9999, messageWithoutList<ZlvLogUMsgVA>},
    {"FatalVA", Family::Message, 7000, messageWithoutList<ZlvLogFatalVA>},
    {"ErrorVA", Family::Message, 6000, messageWithoutList<ZlvLogErrorVA>},
    {"WarnVA", Family::Message, 5000, messageWithoutList<ZlvLogWarnVA>},
    {"InfoVA", Family::Message, 4000, messageWithoutList<ZlvLogInfoVA>},
    {"DebugMinVA", Family::Debug, 3000, debugWithoutList<ZlvLogDebugMinVA>},
    {"DebugMidVA", Family::Debug, 2000, debugWithoutList<ZlvLogDebugMidVA>},
    {"DebugMaxVA", Family::Debug, 1000, debugWithoutList<ZlvLogDebugMaxVA>},
    {"UTextVA", Family::PlainText, -9999, textWithoutList<ZlvLogUTextVA>},
};

class ZlvLogCallWithoutList : public RecordedToolkit,
                              public testing::WithParamInterface<CallRow> {};

TEST_P(ZlvLogCallWithoutList, LogsAPatternWithoutArguments)
{
    setProp(app_, "level", "ALL");
    EXPECT_EQ(GetParam().log(app_).icuError, 0);
    ASSERT_EQ(records().size(), 1u);
    EXPECT_EQ(records()[0].text, u"Service halted");
}

INSTANTIATE_TEST_SUITE_P(Each, ZlvLogCallWithoutList, testing::ValuesIn(callsWithoutList),
                         callName);

} // namespace
} // namespace zelvo_test
