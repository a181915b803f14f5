// SPDX-License-Identifier: Apache-2.0
#include "Activities.h"

#include <cstdio>
#include <iterator>

#include "Twins.h"
#include "process/RecordLogger.h"

namespace zelvo_test {

namespace {

/// A name of several that threads meet at.
std::string oneOf(Worker &worker, const char *name)
{
    return name + std::to_string(worker.below(3));
}

void expect(Worker &worker, bool holds)
{
    worker.failed += holds ? 0 : 1;
}

bool isOk(ZlvStatus status)
{
    return status.type == CX_STATUS_OK;
}

void logRecords(Worker &worker)
{
    ++worker.written;
    expect(worker, logRecord(worker.common.sharedLog, worker.records, worker.written));
    expect(worker, logRecord(worker.common.ownLog, worker.records, worker.written));
}

void logMessages(Worker &worker)
{
    ZlvObject *log = worker.below(2) == 0 ? worker.common.busyLog : worker.common.reportLog;
    expect(worker, isOk(ZlvLogFatal(log, BUNDLE, "named", u"Fatal")));
    expect(worker, isOk(ZlvLogError(log, BUNDLE, "both", u"Error", 6000)));
    expect(worker, isOk(ZlvLogWarn(log, BUNDLE, "count", 5000)));
    expect(worker, isOk(ZlvLogInfo(log, BUNDLE, "identified", u"Info")));
    expect(worker, isOk(ZlvLogUMsg(log, BUNDLE, "plain")));
}

void logTexts(Worker &worker)
{
    ZlvObject *log = worker.below(2) == 0 ? worker.common.busyLog : worker.common.reportLog;
    expect(worker, isOk(ZlvLogDebugMin(log, __FILE__, __func__, __LINE__, u"least")));
    expect(worker, isOk(ZlvLogDebugMid(log, __FILE__, __func__, __LINE__, u"{0,number}", 0.5)));
    expect(worker, isOk(ZlvLogDebugMax(log, __FILE__, __func__, __LINE__, u"{0}", u"größer")));
    expect(worker, isOk(ZlvLogUText(log, u"{0,number,integer} of all", 7)));
}

void logToTwins(Worker &worker)
{
    expect(worker, isOk(ZlvLogUText(worker.common.twinsLog, u"{0} twins", u"all")));
}

void setProperties(Worker &worker)
{
    constexpr const char *LEVELS[] = {"ALL", "DEBUG_MIN", "WARN", "OFF"};
    ZlvObject *log = worker.common.busyLog;
    ZlvSetObjProp(log, "level", LEVELS[worker.below(4)]);
    ZlvSetObjPropBool(log, "truth", 1);
    ZlvSetObjPropInt(log, "number", 7);
    ZlvSetObjPropLong(log, "number", 7);
    ZlvSetObjPropFloat(log, "fraction", 7.0F);
    ZlvSetObjPropDouble(log, "fraction", 7.0);
    ZlvBool found = 0;
    expect(worker, ZlvGetObjPropInt(log, "number", &found) == 7 && found == 1);
    expect(worker, ZlvGetObjPropLong(log, "number", &found) == 7);
    expect(worker, ZlvGetObjPropDouble(log, "fraction", &found) == 7.0);
    expect(worker, ZlvGetObjPropFloat(log, "fraction", &found) == 7.0F);
    expect(worker, ZlvGetObjPropBool(log, "truth", &found) == 1);
    RkoMemoryFree(ZlvGetObjProp(log, "level", nullptr));
}

void configureAndApply(Worker &worker)
{
    const std::string name = oneOf(worker, "busy.part");
    ZlvObjCfg *cfg = ZlvLogMgrGetCfg(name.c_str());
    ZlvSetObjCfgPropInt(cfg, "number", 7);
    ZlvSetObjCfgProp(cfg, "logging", worker.below(2) == 0 ? "on" : "off");
    RkoMemoryFree(ZlvGetInheritedObjCfgProp(cfg, "number", nullptr));
    ZlvObject *object = ZlvGetObject("busy.filter", "zlv_levelfilter");
    expect(worker, ZlvLogMgrApplyCfg(object, name.c_str()) == 1);
    ZlvReleaseObject(object);
    if (worker.below(2) == 0)
        ZlvLogMgrUpdateCfg(cfg);
    else
        ZlvLogMgrRemCfg(cfg);
    ZlvReleaseObjCfg(cfg);
}

void registerClasses(Worker &worker)
{
    const std::string name = "busy.class" + std::to_string(worker.below(50));
    ZlvAddLoggerClass(name.c_str(), nullptr, nullptr, nullptr, nullptr, nullptr);
    ZlvObject *object = ZlvGetObject((name + ".log").c_str(), name.c_str());
    expect(worker, object != nullptr);
    ZlvReleaseObject(object);
}

void makeAndRelease(Worker &worker)
{
    ZlvObject *object = ZlvGetObject(oneOf(worker, "busy.object").c_str(), "zlv_levelfilter");
    expect(worker, object != nullptr);
    ZlvReleaseObject(ZlvAcquireObject(object));
    RkoMemoryFree(ZlvGetObjectName(object));
    RkoMemoryFree(ZlvGetObjectDesc(object));
    ZlvReleaseObject(object);
}

void changeListeners(Worker &worker)
{
    ZlvObject *listener = ZlvGetObject(oneOf(worker, "busy.listener").c_str(), "quiet_handler");
    expect(worker, listener != nullptr);
    ZlvAddListener(worker.common.busyLog, listener);
    ZlvLogUText(worker.common.busyLog, u"listened to");
    ZlvRemListener(worker.common.busyLog, listener);
    ZlvReleaseObject(listener);
}

void enableAndDisable(Worker &worker)
{
    ZlvSetObjectEnabled(worker.common.busyLog, static_cast<ZlvBool>(worker.below(2)));
    ZlvIsObjectEnabled(worker.common.busyLog);
    ZlvIsLoggable(worker.common.busyLog, ZLV_LEVEL_INFO);
    ZlvSetObjectEnabled(worker.common.busyLog, 1);
}

void rollOver(Worker &worker)
{
    ZlvSetObjPropInt(worker.common.busyFile, "maxFileBytes", static_cast<int32_t>(worker.below(9)));
    ZlvLogUText(worker.common.busyLog, u"rolled over");
    ZlvSetObjPropInt(worker.common.busyFile, "maxFileBytes", 4096);
}

/// Walks what others may append to meanwhile.
void walk(Worker &worker)
{
    ZlvStringListAppend(worker.common.texts, "text");
    size_t left = 100;
    for (auto at = ZlvStringListIterator(worker.common.texts);
         left > 0 && ZlvStringListIterHasNext(at) == 1; at = ZlvStringListIterNext(at), --left)
        RkoMemoryFree(ZlvStringListIterGet(at));
    size_t classes = 0;
    for (auto at = ZlvGetLoggerClasses(); ZlvStringGroupIterHasNext(at) == 1;
         at = ZlvStringGroupIterNext(at), ++classes)
        RkoMemoryFree(ZlvStringGroupIterGet(at));
    expect(worker, classes > 2);
    for (auto at = ZlvGetListeners(worker.common.sharedLog); ZlvListenerGroupIterHasNext(at) == 1;
         at = ZlvListenerGroupIterNext(at))
        ZlvReleaseObject(ZlvListenerGroupIterGet(at));
}

void bindMessages(Worker &worker)
{
    ZlvI18Msg *message = ZlvAllocUI18Msg(BUNDLE, "plain", nullptr);
    ZlvI18Msg *copy = ZlvCopyI18Msg(message);
    ZlvFreeI18Msg(message);
    va_list none{};
    UChar *text = ZlvBindUI18Msg(copy, none);
    expect(worker, text != nullptr);
    RkoMemoryFree(text);
    ZlvFreeI18Msg(copy);
}

constexpr void (*ACTIVITIES[])(Worker &) = {
    logRecords,      logRecords,       logRecords,      logMessages,    logTexts,
    logToTwins,      setProperties,    registerClasses, makeAndRelease, configureAndApply,
    changeListeners, enableAndDisable, rollOver,        walk,           bindMessages,
};

} // namespace

void actOnce(Worker &worker)
{
    ACTIVITIES[worker.below(std::size(ACTIVITIES))](worker);
}

} // namespace zelvo_test
