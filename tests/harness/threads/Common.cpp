// SPDX-License-Identifier: Apache-2.0
#include "Activities.h"
#include "Twins.h"
#include "process/RecordLogger.h"

namespace zelvo_test {

namespace {

constexpr const char *CONFIGURATION[][2] = {
    {"busy.log.listenerNames", "busy.file busy.filter busy.msgid"},
    {"busy.filter.listenerNames", "busy.shared"},
    {"busy.msgid.listenerNames", "busy.xml"},
    {"report.log.listenerNames", "busy.xml busy.trace"},
};

/// Sets a property of an object, both named by a dotted key.
void configure(const char *key, const char *value)
{
    const std::string name(key);
    const size_t dot = name.rfind('.');
    ZlvObject *object = ZlvGetObject(name.substr(0, dot).c_str(), nullptr);
    ZlvSetObjProp(object, name.substr(dot + 1).c_str(), value);
    ZlvReleaseObject(object);
}

/// A handler on a small file that rolls over all the time.
ZlvObject *makeHandler(const char *name, const char *className, const char *formatterClass,
                       const Job &records)
{
    ZlvObject *handler = ZlvGetObject(name, className);
    ZlvObject *formatter = ZlvGetObject((std::string(name) + ".format").c_str(), formatterClass);
    ZlvHandlerSetFormatter(handler, formatter);
    ZlvSetObjProp(handler, "fileName", (std::string(name) + ".txt").c_str());
    ZlvSetObjPropInt(handler, "maxFileBytes", 4096);
    ZlvSetObjPropInt(handler, "MPFileSemKey", records.key);
    ZlvReleaseObject(formatter);
    return handler;
}

/// Nothing of the toolkit's own error logger belongs on the console of a test.
void silenceConsole()
{
    ZlvObject *console = ZlvGetObject(ZLV_DEFAULT_CONSOLE_NAME, nullptr);
    ZlvSetObjectEnabled(console, 0);
    ZlvReleaseObject(console);
}

} // namespace

Common makeCommon(const Job &records)
{
    silenceConsole();
    ZlvAddHandlerClass("quiet_handler", nullptr, nullptr, nullptr, nullptr, nullptr, nullptr,
                       nullptr);
    Job own = records;
    own.file = "own/shared.log";
    ZlvObject *const made[] = {
        makeHandler("busy.shared", "zlv_multiproc_filehandler", "zlv_basicformatter", records),
        makeHandler("busy.xml", "zlv_filehandler", "zlv_xmlformatter", records),
        makeHandler("busy.trace", "zlv_filehandler", "zlv_vyxtraceformatter", records),
        ZlvGetObject("busy.filter", "zlv_levelfilter"),
        ZlvGetObject("busy.msgid", "zlv_msgidfilter"),
    };
    const Common common = {
        .sharedLog = makeRecordLogger("zlv_multiproc_filehandler", records, "records.shared"),
        .ownLog = makeRecordLogger("zlv_filehandler", own, "records.own"),
        .busyLog = ZlvGetObject("busy.log", "zlv_basiclogger"),
        .busyFile = makeHandler("busy.file", "zlv_filehandler", "zlv_basicformatter", records),
        .reportLog = ZlvGetObject("report.log", "zlv_pdlogger"),
        .twinsLog = makeTwins(),
        .texts = ZlvAllocStringList(),
    };
    for (const auto &[key, value] : CONFIGURATION)
        configure(key, value);
    for (ZlvObject *object : made)
        ZlvReleaseObject(object);
    return common;
}

void releaseCommon(const Common &common)
{
    for (ZlvObject *object : {common.sharedLog, common.ownLog, common.busyLog, common.busyFile,
                              common.reportLog, common.twinsLog})
        ZlvReleaseObject(object);
    ZlvFreeStringList(common.texts);
}

} // namespace zelvo_test
