// SPDX-License-Identifier: Apache-2.0
#include "Twins.h"

#include <algorithm>
#include <cstring>
#include <fstream>
#include <set>

namespace zelvo_test {

namespace {

std::set<std::string> called; // guarded by the API mutex, like everything here
std::vector<std::string> wrong;
unsigned turns = 0;
int living = 0; ///< variables that have not been freed

void *allocTwin()
{
    ++living;
    useLists();
    return new int(0);
}

void freeTwin(void *vars)
{
    if (vars == nullptr)
        return;
    --living;
    delete static_cast<int *>(vars);
}

void changeTwin(ZlvObject *object, const char *property)
{
    useMaps();
    ZlvBasicObjectFCfgChange(object, property);
}

void logTwin(ZlvObject *logger, ZlvEvent *event, va_list args)
{
    ++turns;
    useObjects(turns);
    useListeners(turns);
    useClasses(turns);
    HOLDS(TWIN(zlvIntlLoggerGetFLog)(logger) != nullptr || !TWIN(zlvIntlIsObjectEnabled)(logger));
    HOLDS(TWIN(zlvIntlIsLoggable)() == 0);
    ZlvBasicObjectFLog(logger, event, args);
}

int32_t acceptTwin(ZlvObject *filter, ZlvEvent *event, va_list args)
{
    useFilters(filter, event, args);
    useMessages(args);
    return 1;
}

void processTwin(ZlvObject *handler, ZlvEvent *event, va_list args)
{
    useHandlers(handler, event, args);
    useConfigurations(turns);
    useLogManager(turns);
    ZlvBasicObjectFLog(handler, event, args);
}

UChar *formatTwin(ZlvObject *, ZlvEvent *event, va_list args)
{
    useLists();
    useMaps();
    return ZlvBindEventUMsg(event, TWIN(zlvIntlBindUI18Msg), args);
}

} // namespace

void noteTwin(const char *name)
{
    called.insert(name);
}

void noteAnswer(bool isRight, const char *claim)
{
    if (!isRight && std::find(wrong.begin(), wrong.end(), claim) == wrong.end())
        wrong.emplace_back(claim);
}

bool isText(char *text, const char *expected)
{
    const bool isSame = text != nullptr && std::strcmp(text, expected) == 0;
    RkoMemoryFree(text);
    return isSame;
}

const std::vector<std::string> &wrongAnswers()
{
    noteAnswer(living == 0, "all variables were freed");
    return wrong;
}

TwinCount countTwins(const char *exportsFile)
{
    TwinCount count;
    std::ifstream list(exportsFile);
    for (std::string name; std::getline(list, name);)
        if (name.rfind("zlvIntl", 0) == 0) {
            ++count.listed;
            if (called.count(name) == 0)
                count.missing.push_back(name);
        }
    return count;
}

ZlvObject *makeTwins()
{
    ZlvAddLoggerClass("twin_logger", nullptr, allocTwin, freeTwin, changeTwin, logTwin);
    ZlvAddFilterClass("twin_filter", nullptr, allocTwin, freeTwin, changeTwin, nullptr, acceptTwin,
                      nullptr);
    ZlvAddHandlerClass("twin_handler", nullptr, allocTwin, freeTwin, ZlvBasicHandlerFCfgChange,
                       processTwin, nullptr, nullptr);
    ZlvAddUFormatterClass("twin_formatter", nullptr, allocTwin, freeTwin, changeTwin, formatTwin,
                          nullptr, nullptr, nullptr);
    ZlvObject *logger = ZlvGetObject("twins.log", "twin_logger");
    ZlvObject *filter = ZlvGetObject("twins.filter", "twin_filter");
    ZlvObject *handler = ZlvGetObject("twins.handler", "twin_handler");
    ZlvObject *formatter = ZlvGetObject("twins.format", "twin_formatter");
    ZlvHandlerSetFormatter(handler, formatter);
    ZlvAddListener(filter, handler);
    ZlvAddListener(logger, filter);
    for (ZlvObject *object : {formatter, handler, filter})
        ZlvReleaseObject(object);
    return logger;
}

} // namespace zelvo_test
