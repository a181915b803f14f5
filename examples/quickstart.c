// SPDX-License-Identifier: Apache-2.0
// The smallest program that logs: a logger, a console, two records.
#include <locale.h>

#include "zelvo.h"

int main(void)
{
    setlocale(LC_ALL, "");
    if (!ZlvOpenToolkit(NULL, NULL))
        return 1;

    ZlvObject *logger = ZlvGetObject("app.log", "zlv_basiclogger");
    ZlvObject *console = ZlvGetObject("app.console", "zlv_consolehandler");
    ZlvAddListener(logger, console);

    ZlvLogUText(logger, u"Good morning, {0}: {1,number,integer} new orders", u"Zoë", 3);
    ZlvLogDebugMin(logger, "quickstart.c", __func__, __LINE__, u"nothing more to do");

    ZlvReleaseObject(console);
    ZlvReleaseObject(logger);
    ZlvCloseToolkit();
    return 0;
}
