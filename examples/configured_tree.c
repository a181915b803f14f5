// SPDX-License-Identifier: Apache-2.0
// A whole tree from a file: configured_tree.properties says which loggers, filters, handlers and
// formatters there are, and the program asks for its loggers by name. The same four calls on three
// loggers show which records go to the console, which to the log file, and how that rolls over.
//
// Run it as build/release/examples/configured_tree; it takes no arguments.
#define _XOPEN_SOURCE 700
#include <locale.h>
#include <stdio.h>
#include <stdlib.h>
#include <unistd.h>

#include "zelvo.h"

static const char BUNDLE[] = EXAMPLE_BUNDLE;

enum { LOGGERS = 3 };

/// A record of each of four levels. What becomes of them is not for the program to say.
static void work(ZlvObject *log)
{
    ZlvLogDebugMin(log, "configured_tree.c", __func__, __LINE__, u"looking around");
    ZlvLogInfo(log, BUNDLE, "till_opened", u"Zoë");
    ZlvLogWarn(log, BUNDLE, "low_stock", u"Tee", 1250, 2500.5);
    ZlvLogError(log, BUNDLE, "till_offline", u"db.example.org");
}

/// A logger lives while somebody holds it, so the program keeps its loggers for as long as it logs.
static void workWithAll(void)
{
    const char *const names[LOGGERS] = {"log.till", "log.stock", "log.stock.cellar"};
    ZlvObject *loggers[LOGGERS];
    for (int i = 0; i < LOGGERS; ++i)
        loggers[i] = ZlvGetObject(names[i], NULL);
    for (int i = 0; i < LOGGERS; ++i) {
        printf("-- %s\n", names[i]);
        work(loggers[i]);
    }
    for (int i = 0; i < LOGGERS; ++i)
        ZlvReleaseObject(loggers[i]);
}

/// Prints what a log file holds, if it is there, and removes it.
static void show(const char *name)
{
    FILE *file = fopen(name, "r");
    if (file == NULL)
        return;
    printf("-- %s\n", name);
    char line[256];
    while (fgets(line, sizeof line, file) != NULL)
        fputs(line, stdout);
    fclose(file);
    remove(name);
}

int main(void)
{
    setlocale(LC_ALL, "");
    char directory[] = "/tmp/configured_tree_XXXXXX"; // where the log files will be
    if (mkdtemp(directory) == NULL || chdir(directory) != 0)
        return 1;

    CxStatus error = {CX_STATUS_OK, 0};
    if (!ZlvOpenToolkit(EXAMPLE_PROPERTIES, &error))
        return 1;
    workWithAll();
    ZlvCloseToolkit();

    show("worries2.log");
    show("worries1.log");
    show("worries.log");
    rmdir(directory);
    return 0;
}
