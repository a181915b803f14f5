// SPDX-License-Identifier: Apache-2.0
// The classes of this program: a handler that keeps records, and a formatter that treats its
// settings as its own.
#include <cstring>
#include <utility>

#include "World.h"

using zelvo_test::taken;

namespace zelvo_equivalence {
namespace {

double eventTime;
std::vector<UText> records;

/// Makes an event the same in each process.
void fix(ZlvEvent *event)
{
    event->time = eventTime;
    for (const char *varying : {"processId", "threadId"}) {
        ZlvBool isThere = 0;
        ZlvGetEventPropInt(event, varying, &isThere);
        if (isThere != 0)
            ZlvSetEventPropInt(event, varying, 4711);
    }
}

void process(ZlvObject *handler, ZlvEvent *event, va_list args)
{
    fix(event);
    records.push_back(taken(zlvIntlUHandlerDoFmt(handler, event, args)));
}

/// Writes a setting over the former one where that is long enough.
void replace(char *&setting, const char *value)
{
    const size_t size = value != nullptr ? std::strlen(value) + 1 : 0;
    if (setting != nullptr && value != nullptr && std::strlen(setting) + 1 >= size)
        std::memcpy(setting, value, size);
    else
        RkoMemoryFree(std::exchange(setting, RkoStringDup(value)));
}

void changeOwn(ZlvObject *formatter, const char *property)
{
    if (std::strcmp(property, "dateTimeFormat") != 0)
        return ZlvBasicFormatterFCfgChange(formatter, property);
    char *value = zlvIntlGetObjProp(formatter, property, nullptr);
    replace(formatter->formatter.dateTimeFormat, value);
    RkoMemoryFree(value);
}

/// A date, the message, and once more the date, of a second later.
UChar *formatOwn(ZlvObject *formatter, ZlvEvent *event, va_list args)
{
    CxUStringBuff out{};
    UChar *date = ZlvBasicUFormatterFormatDate(formatter, event->time);
    CxUStringBuffAppendUStr(&out, date);
    RkoMemoryFree(date);
    if (formatter->formatter.locale != nullptr)
        zlvSetEventLocale(event, formatter->formatter.locale);
    UChar *text = ZlvBindEventUMsg(event, formatter->objClass->formatter.fBindMsg, args);
    CxUStringBuffAppendUStr(&out, text);
    RkoMemoryFree(text);
    date = ZlvBasicUFormatterFormatDate(formatter, event->time + 1000);
    CxUStringBuffAppendUStr(&out, date);
    RkoMemoryFree(date);
    return CxUStringBuffTakeUStr(&out);
}

} // namespace

void setEventTime(double time)
{
    eventTime = time;
}

std::vector<UText> takeRecords()
{
    return std::exchange(records, {});
}

void addClasses()
{
    ZlvAddHandlerClass("memory", nullptr, nullptr, nullptr, ZlvBasicHandlerFCfgChange, process,
                       nullptr, nullptr);
    ZlvI18Msg *description = ZlvAllocUI18Msg(MESSAGES "/eqmsg", "ints", nullptr);
    ZlvAddUFormatterClass("own", description, nullptr, nullptr, changeOwn, formatOwn, nullptr,
                          nullptr, nullptr);
    ZlvFreeI18Msg(description);
}

} // namespace zelvo_equivalence
