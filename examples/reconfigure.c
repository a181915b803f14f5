// SPDX-License-Identifier: Apache-2.0
// Changing things while the program runs: properties of objects, configurations, listeners.
#include <locale.h>
#include <stdio.h>

#include "zelvo.h"

/// Logs one record of each of two levels; what arrives depends on the configuration.
static void work(const char *when, ZlvObject *logger)
{
    printf("-- %s\n", when);
    ZlvLogUText(logger, u"working");
    ZlvLogDebugMax(logger, NULL, NULL, 0, u"in detail");
}

/// Sets a property in the configuration of that name and applies it to an object that exists.
static void configure(ZlvObject *object, const char *name, const char *property, const char *value)
{
    ZlvObjCfg *cfg = ZlvLogMgrGetCfg(name);
    ZlvSetObjCfgProp(cfg, property, value);
    ZlvLogMgrApplyCfg(object, name);
    ZlvReleaseObjCfg(cfg);
}

static void changeObjects(ZlvObject *logger, ZlvObject *format)
{
    work("a new logger takes DEBUG_MIN and above", logger);

    ZlvSetObjProp(logger, "level", "DEBUG_MAX");
    ZlvSetObjProp(format, "separator", " | ");
    work("more detail, another separator", logger);

    ZlvSetObjProp(format, "separator", NULL);
    work("the default separator again", logger);

    ZlvSetObjectEnabled(logger, 0);
    work("the logger is disabled", logger);
    ZlvSetObjectEnabled(logger, 1);
}

static void changeTree(ZlvObject *logger)
{
    configure(logger, "app.log", "level", "OFF");
    work("OFF stops every level; a text has none", logger);

    ZlvObject *console = ZlvGetObject("app.console", NULL);
    ZlvRemListener(logger, console);
    work("nobody listens", logger);
    ZlvAddListener(logger, console);
    ZlvReleaseObject(console);
}

int main(void)
{
    setlocale(LC_ALL, "");
    if (!ZlvOpenToolkit(NULL, NULL))
        return 1;
    ZlvObject *logger = ZlvGetObject("app.log", "zlv_basiclogger");
    ZlvObject *console = ZlvGetObject("app.console", "zlv_consolehandler");
    ZlvObject *format = ZlvHandlerGetFormatter(console);
    ZlvAddListener(logger, console);

    changeObjects(logger, format);
    changeTree(logger);

    ZlvReleaseObject(format);
    ZlvReleaseObject(console);
    ZlvReleaseObject(logger);
    ZlvCloseToolkit();
    return 0;
}
