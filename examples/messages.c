// SPDX-License-Identifier: Apache-2.0
// The messages of a bundle in several locales. Runs in the directory of the compiled examples,
// where the bundle is.
#include <locale.h>
#include <stdio.h>

#include "zelvo.h"

static const char BUNDLE[] = "./messages_bundle";

/// Each message, with arguments of the types that its pattern asks for.
static void sayAll(ZlvObject *log)
{
    const double orders = 1250;
    const double delivery = 1709294400000.0; // 2024-03-01, in milliseconds since 1970

    ZlvLogInfo(log, BUNDLE, "greeting", u"Zoë");
    ZlvLogInfo(log, BUNDLE, "orders", orders, 98765.432);
    ZlvLogInfo(log, BUNDLE, "delivery", delivery, u"Zoë");
    ZlvLogInfo(log, BUNDLE, "braces");
}

/// A mistake shows in the status of the call; the record has no text.
static void tellMistake(ZlvObject *log)
{
    const ZlvStatus status = ZlvLogInfo(log, BUNDLE, "no_such_key");
    printf("ICU error %d\n", (int)status.icuError);
}

int main(void)
{
    setlocale(LC_ALL, "");
    if (!ZlvOpenToolkit(NULL, NULL))
        return 1;

    ZlvObject *log = ZlvGetObject("shop.log", "zlv_basiclogger");
    ZlvObject *console = ZlvGetObject("console", "zlv_consolehandler");
    ZlvObject *format = ZlvHandlerGetFormatter(console);
    ZlvAddListener(log, console);

    const char *locales[] = {"en", "de", "de_AT", "fr"};
    for (int i = 0; i < 4; ++i) {
        printf("%s\n", locales[i]);
        ZlvSetObjProp(format, "locale", locales[i]);
        sayAll(log);
    }
    tellMistake(log);

    ZlvReleaseObject(format);
    ZlvReleaseObject(console);
    ZlvReleaseObject(log);
    ZlvCloseToolkit();
    return 0;
}
