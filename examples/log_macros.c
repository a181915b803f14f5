// SPDX-License-Identifier: Apache-2.0
// Logging calls as macros: those that are refused evaluate none of their arguments.
#include <stdio.h>

#include "zelvo.h"

/// Something costly that only a record of the lowest level shows.
static int32_t countStock(void)
{
    printf("counting\n");
    return 19;
}

static void takeOrder(ZlvObject *logger, const UChar *who)
{
    ZLV_DEBUG_MIN(logger, u"{0} has ordered", who);
    ZLV_DEBUG_MAX(logger, u"{0,number,integer} left", countStock());
}

int main(void)
{
    if (!ZlvOpenToolkit(NULL, NULL))
        return 1;
    ZlvObject *logger = ZlvGetObject("app.log", "zlv_basiclogger");
    ZlvObject *console = ZlvGetObject("app.console", "zlv_consolehandler");
    ZlvAddListener(logger, console);

    takeOrder(logger, u"Anna");
    ZlvSetObjProp(logger, "level", "DEBUG_MAX");
    takeOrder(logger, u"Otto");

    ZlvReleaseObject(console);
    ZlvReleaseObject(logger);
    ZlvCloseToolkit();
    return 0;
}
