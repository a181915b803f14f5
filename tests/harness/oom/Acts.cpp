// SPDX-License-Identifier: Apache-2.0
// What the demo does, in acts of their own, and what it does not show: a file that rolls over, and
// classes of the program's own.
#include <fstream>
#include <sstream>

#include "Act.h"
#include "World.h"
#include "support/LineFormatter.h"

namespace zelvo_test {
namespace {

constexpr const char *BUNDLE = ZELVO_TEST_BUNDLES "/zelvomsg";

constexpr const char *TREE = "shop.log.className = zlv_basiclogger\n"
                             "shop.log.level = ALL\n"
                             "shop.log.listenerNames = console.english filter.worries\n"
                             "filter.worries.className = zlv_levelfilter\n"
                             "filter.worries.level = WARN\n"
                             "filter.worries.listenerNames = console.german\n"
                             "console.english.className = zlv_consolehandler\n"
                             "console.english.formatterName = format.english\n"
                             "console.german.className = zlv_consolehandler\n"
                             "console.german.formatterName = format.german\n"
                             "format.className = zlv_basicformatter\n"
                             "format.english.separator = \\ |\\u0020\n"
                             "format.english.locale = en\n"
                             "format.german.dateTimeFormat = dd.MM.yyyy HH:mm\n"
                             "format.german.locale = de_DE\n";

/// All levels, with each kind of argument.
void logLevels(Stage &stage, ZlvObject *log)
{
    stage.log([&] { return ZlvLogInfo(log, BUNDLE, "count", 12500); });
    stage.log([&] { return ZlvLogWarn(log, BUNDLE, "plain"); });
    stage.log([&] { return ZlvLogError(log, "missing", "key"); });
    stage.log([&] { return ZlvLogFatal(log, BUNDLE, "plain"); });
    stage.log([&] { return ZlvLogDebugMin(log, "tree.c", __func__, 1, u"the door was opened"); });
    stage.log([&] { return ZlvLogDebugMid(log, "tree.c", __func__, 2, u"{0,number}", 98765.4); });
    stage.log([&] { return ZlvLogUText(log, u"{0}", u"M\u00fcller"); });
}

void showTree(Stage &stage)
{
    stage.open(TREE);
    ZlvObject *log = stage.get("shop.log");
    stage.get("filter.worries");
    logLevels(stage, log);
    ZlvSetObjProp(log, "level", "INFO");
    ZlvSetObjProp(stage.get("format.german"), "locale", "ja_JP");
    ZlvSetObjProp(log, "listenerNames", "filter.worries");
    stage.log([&] { return ZlvLogError(log, BUNDLE, "count", 3); });
    stage.log([&] { return ZlvLogDebugMin(log, "tree.c", __func__, 3, u"not shown"); });
    stage.close();
}

constexpr const char *DESK = "desk.log.className = zlv_pdlogger\n"
                             "desk.log.product = Shop\n"
                             "desk.log.server = till7.example.org\n"
                             "desk.log.listenerNames = desk.line desk.xml desk.trace\n"
                             "desk.line.className = zlv_consolehandler\n"
                             "desk.xml.className = zlv_consolehandler\n"
                             "desk.xml.formatterName = format.xml\n"
                             "desk.trace.className = zlv_consolehandler\n"
                             "desk.trace.formatterName = format.trace\n"
                             "format.xml.className = zlv_xmlformatter\n"
                             "format.trace.className = zlv_vyxtraceformatter\n"
                             "filter.ids.className = zlv_msgidfilter\n"
                             "filter.ids.msgIds = TIL*I\n"
                             "filter.ids.msgIdRepeatTime = 60000\n"
                             "filter.ids.listenerNames = desk.line\n";

void showDesk(Stage &stage)
{
    stage.open(DESK);
    ZlvObject *log = stage.get("desk.log");
    for (ZlvObject *listener : {stage.get("desk.line"), stage.get("desk.xml"),
                                stage.get("desk.trace"), stage.get("filter.ids")})
        ZlvSetObjProp(listener, "logging", "on");
    stage.log([&] { return ZlvLogUText(log, u"TIL0007E The {0} is jammed", u"drawer"); });
    stage.log([&] { return ZlvLogError(log, BUNDLE, "count", 7); });
    ZlvSetObjProp(log, "listenerNames", "filter.ids");
    stage.log([&] { return ZlvLogUText(log, u"TIL0001I opened"); });
    stage.log([&] { return ZlvLogUText(log, u"TIL0008E offline"); });
    stage.log([&] { return ZlvLogUText(log, u"TIL0008E offline"); });
    stage.close();
}

ZlvStatus logNumber(ZlvObject *log, int32_t number)
{
    return ZlvLogUText(log, u"record {0,number,integer} of many", number);
}

/// A handler of a class, which rolls over from 60 bytes on, and then gets another file.
template <const char *CLASS>
void showFile(Stage &stage)
{
    stage.open("");
    LineFormatter::addClasses();
    ZlvObject *log = stage.get("app.log", "zlv_basiclogger");
    ZlvObject *file = stage.get("app.file", CLASS);
    ZlvHandlerSetFormatter(file, stage.get("app.line", LineFormatter::framed));
    ZlvSetObjProp(file, "fileName", "logs/app.log");
    ZlvSetObjPropInt(file, "maxFileBytes", 60);
    ZlvSetObjPropInt(file, "MPFileSemKey", ownSemaphoreKey());
    ZlvAddListener(log, file);
    for (int32_t number = 1; number <= 9; ++number)
        stage.log([&] { return logNumber(log, number); });
    ZlvSetObjProp(file, "fileName", "logs/other.log");
    for (int32_t number = 10; number <= 12; ++number)
        stage.log([&] { return logNumber(log, number); });
    stage.close();
}

constexpr char ROLLING[] = "zlv_filehandler";
constexpr char SHARED[] = "zlv_multiproc_filehandler";

/// Prints a record, and remembers how many.
void ring(ZlvObject *handler, ZlvEvent *event, va_list args)
{
    UChar *record = zlvIntlUHandlerDoFmt(handler, event, args);
    zlvI18PrintUCharAsLocal(stdout, record);
    RkoMemoryFree(record);
    if (handler->vars != nullptr)
        ++*static_cast<int32_t *>(handler->vars);
}

void showOwnClass(Stage &stage)
{
    stage.open("plant.log.level = ALL\n");
    ZlvAddHandlerClass(
        "alarm", nullptr, [] { return RkoMemoryCalloc(1, sizeof(int32_t)); }, RkoMemoryFree,
        ZlvBasicHandlerFCfgChange, ring, nullptr, nullptr);
    ZlvObject *log = stage.get("plant.log", "zlv_basiclogger");
    ZlvAddListener(log, stage.get("plant.alarm", "alarm"));
    for (int32_t pump = 1; pump <= 3; ++pump)
        stage.log([&] { return ZlvLogUText(log, u"pump {0,number,integer} is dry", pump); });
    ZlvObjCfg *cfg = ZlvLogMgrGetCfg("plant.log");
    ZlvSetObjCfgProp(cfg, "level", "OFF");
    ZlvLogMgrApplyCfg(log, "plant.log");
    ZlvReleaseObjCfg(cfg);
    stage.log([&] { return ZlvLogDebugMin(log, nullptr, nullptr, 0, u"not shown"); });
    stage.close();
}

std::string contentOf(const char *file)
{
    std::ostringstream content;
    content << std::ifstream(file).rdbuf();
    return content.str();
}

/// The objects of the demo itself, all three acts of it in one life.
void showDemo(Stage &stage)
{
    stage.open(contentOf(DEMO_PROPERTIES) +
               "\nfile.shared.MPFileSemKey = " + std::to_string(ownSemaphoreKey()) + "\n");
    ZlvObject *shop = stage.get("shop.log");
    logLevels(stage, shop);
    ZlvSetObjProp(shop, "level", "INFO");
    ZlvSetObjProp(stage.get("format.german"), "locale", "ja_JP");
    stage.log([&] { return ZlvLogWarn(shop, BUNDLE, "count", 3); });
    ZlvObject *till = stage.get("till.log");
    for (int32_t number = 1; number <= 2; ++number)
        stage.log([&] { return logNumber(till, number); });
    ZlvObject *desk = stage.get("desk.log");
    stage.log([&] { return ZlvLogUText(desk, u"TIL0007E The {0} is jammed", u"drawer"); });
    ZlvSetObjProp(desk, "listenerNames", "filter.ids");
    stage.log([&] { return ZlvLogUText(desk, u"TIL0001I opened"); });
    stage.close();
}

} // namespace

std::string fileRecord(size_t number)
{
    return "record " + std::to_string(number) + " of many\n";
}

const std::vector<Act> &everyAct()
{
    static const std::vector<Act> acts{
        {.name = "tree", .play = showTree},
        {.name = "desk", .play = showDesk, .isFiltered = true},
        {.name = "rolling_file", .play = showFile<ROLLING>, .isOfFiles = true},
        {.name = "shared_file", .play = showFile<SHARED>, .isOfFiles = true},
        {.name = "own_class", .play = showOwnClass},
        {.name = "demo", .play = showDemo, .isFiltered = true},
    };
    return acts;
}

} // namespace zelvo_test
