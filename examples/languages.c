// SPDX-License-Identifier: Apache-2.0
// One event in three languages at once: a logger with three consoles, and a formatter of another
// locale for each. A message is bound when a formatter writes it, so plurals, numbers, dates and
// the order of the arguments are those of its locale. The texts are in languages/.
//
// Run it as build/release/examples/languages; it takes no arguments.
#include <locale.h>

#include "zelvo.h"

static const char BUNDLE[] = EXAMPLE_BUNDLE;

/// Adds a console with a formatter of a locale to a logger, which keeps it.
static void addConsole(ZlvObject *log, const char *console, const char *format, const char *locale)
{
    ZlvObject *handler = ZlvGetObject(console, "zlv_consolehandler");
    ZlvObject *formatter = ZlvGetObject(format, "zlv_basicformatter");
    ZlvSetObjProp(formatter, "locale", locale);
    ZlvHandlerSetFormatter(handler, formatter);
    ZlvAddListener(log, handler);
    ZlvReleaseObject(formatter);
    ZlvReleaseObject(handler);
}

/// One call, three records. The number of a plural, a {3,number} and a date are doubles.
static void ship(ZlvObject *log, double parcels, const UChar *to, double worth)
{
    const double day = 1709294400000.0; // 2024-03-01, in milliseconds since 1970
    ZlvLogInfo(log, BUNDLE, "shipped", parcels, to, day, worth);
}

int main(void)
{
    setlocale(LC_ALL, "");
    if (!ZlvOpenToolkit(NULL, NULL))
        return 1;

    ZlvObject *log = ZlvGetObject("shop.log", "zlv_basiclogger");
    addConsole(log, "console.english", "format.english", "en_GB");
    addConsole(log, "console.polish", "format.polish", "pl_PL");
    addConsole(log, "console.japanese", "format.japanese", "ja_JP");

    const double numbers[] = {0, 1, 3, 12500};
    for (int i = 0; i < 4; ++i)
        ship(log, numbers[i], u"Zoë", numbers[i] * 19.99);
    ZlvLogInfo(log, BUNDLE, "thanks", u"Zoë");

    ZlvReleaseObject(log);
    ZlvCloseToolkit();
    return 0;
}
