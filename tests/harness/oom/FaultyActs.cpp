// SPDX-License-Identifier: Apache-2.0
// Acts with a class in them that does not bear it when memory runs out. They have to be found.
#include <cstdio>

#include <unicode/ucal.h>
#include <unicode/udat.h>

#include "Act.h"

namespace zelvo_test {
namespace {

/// A note of each record, which is forgotten when there is no memory for the second one.
void leak(ZlvObject *, ZlvEvent *, va_list)
{
    void *first = RkoMemoryMalloc(8);
    void *second = RkoMemoryMalloc(8);
    if (second == nullptr)
        return;
    RkoMemoryFree(first);
    RkoMemoryFree(second);
}

/// Prints records until memory runs out, and then never again.
void fallSilent(ZlvObject *handler, ZlvEvent *event, va_list args)
{
    UChar *record = zlvIntlUHandlerDoFmt(handler, event, args);
    void *note = RkoMemoryMalloc(8);
    handler->handler.reserved = note == nullptr ? handler : handler->handler.reserved;
    if (handler->handler.reserved == nullptr)
        zlvI18PrintUCharAsLocal(stdout, record);
    RkoMemoryFree(note);
    RkoMemoryFree(record);
}

/// Does not close its date format when it cannot have a calendar.
void leakFormat(ZlvObject *, ZlvEvent *, va_list)
{
    UErrorCode status = U_ZERO_ERROR;
    UDateFormat *format =
        udat_open(UDAT_PATTERN, UDAT_PATTERN, nullptr, nullptr, -1, u"HH", -1, &status);
    UCalendar *calendar = ucal_open(nullptr, -1, nullptr, UCAL_DEFAULT, &status);
    if (calendar == nullptr)
        return;
    ucal_close(calendar);
    udat_close(format);
}

/// Uses the calendar that it has not got.
void crash(ZlvObject *, ZlvEvent *, va_list)
{
    UErrorCode status = U_ZERO_ERROR;
    UCalendar *calendar = ucal_open(nullptr, -1, nullptr, UCAL_DEFAULT, &status);
    volatile char *bytes = static_cast<char *>(static_cast<void *>(calendar));
    bytes[0] = bytes[0];
    ucal_close(calendar);
}

template <ZlvFProcess PROCESS>
void show(Stage &stage)
{
    stage.open("");
    ZlvAddHandlerClass("faulty", nullptr, nullptr, nullptr, nullptr, PROCESS, nullptr, nullptr);
    ZlvObject *log = stage.get("plant.log", "zlv_basiclogger");
    ZlvAddListener(log, stage.get("plant.faulty", "faulty"));
    for (int32_t pump = 1; pump <= 3; ++pump)
        stage.log([&] { return ZlvLogUText(log, u"pump {0,number,integer} is dry", pump); });
    stage.close();
}

} // namespace

const std::vector<Act> &faultyActs()
{
    static const std::vector<Act> acts{
        {.name = "leak", .play = show<leak>},
        {.name = "fall_silent", .play = show<fallSilent>},
    };
    return acts;
}

const std::vector<Act> &icuFaultyActs()
{
    static const std::vector<Act> acts{
        {.name = "leak_format", .play = show<leakFormat>},
        {.name = "crash", .play = show<crash>},
    };
    return acts;
}

} // namespace zelvo_test
