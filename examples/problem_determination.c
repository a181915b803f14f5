// SPDX-License-Identifier: Apache-2.0
// A failure, from the call that reports it to the person who looks for its cause. The operator of a
// pump station sees an identifier on the console; support finds it in the XML file, with the trace.
//
// Start it as `problem_determination station.properties` in the directory of the compiled examples,
// where the messages are. It writes station.xml there, reads it and removes it.
#include <locale.h>
#include <stdio.h>
#include <string.h>

#include "zelvo.h"

static const char BUNDLE[] = "./problem_determination_bundle";
static const char SUPPORT_FILE[] = "station.xml";

/// What a record may take here; with a longer one the search ends.
enum { MOST_BYTES = 4096 };

/// One morning: the tank runs empty, and so the pump.
static void run(ZlvObject *pump, ZlvObject *tank)
{
    ZlvLogInfo(pump, BUNDLE, "started", u"P1");
    ZlvLogDebugMin(tank, "tank.c", "measure", 17, u"float of {0} at 12 %", u"T3");
    ZlvLogWarn(tank, BUNDLE, "level_low", u"T3", 480);
    ZlvLogDebugMin(pump, "pump.c", "draw", 52, u"inlet of {0} open, pressure falls", u"P1");
    ZlvLogError(pump, BUNDLE, "dry", u"P1", 35, 400);
    ZlvLogDebugMin(pump, "pump.c", "draw", 52, u"inlet of {0} open, no pressure", u"P1");
    ZlvLogError(pump, BUNDLE, "dry", u"P1", 0, 400);
}

/// Logs with the two components, and lets go of them so that the file is closed.
static void operate(void)
{
    ZlvObject *pump = ZlvGetObject("component.pump", NULL);
    ZlvObject *tank = ZlvGetObject("component.tank", NULL);
    run(pump, tank);
    ZlvReleaseObject(tank);
    ZlvReleaseObject(pump);
}

static int beginsWith(const char *line, const char *text)
{
    return strncmp(line, text, strlen(text)) == 0;
}

/// Reads the next record. It goes by lines, since nothing in a record is escaped: an XML parser
/// would stumble over the first text that holds a '<'.
static int readRecord(FILE *file, char record[MOST_BYTES])
{
    char *line = record;
    const char *end = record + MOST_BYTES - 1;
    while (line < end && fgets(line, (int)(end - line) + 1, file) != NULL) {
        const int isFirst = beginsWith(line, "<Message") || beginsWith(line, "<Trace");
        if (line == record && !isFirst)
            continue; // not within a record
        if (beginsWith(line, "</Message>") || beginsWith(line, "</Trace>"))
            return 1;
        line += strlen(line);
    }
    return 0;
}

/// Prints the records of one identifier, each behind the trace record that came last before it.
static void find(const char *identifier)
{
    FILE *file = fopen(SUPPORT_FILE, "r");
    if (file == NULL)
        return;
    char wanted[64];
    snprintf(wanted, sizeof wanted, "<Message Id=\"%s\"", identifier);
    char record[MOST_BYTES];
    char trace[MOST_BYTES] = "";
    while (readRecord(file, record)) {
        if (beginsWith(record, "<Trace"))
            snprintf(trace, sizeof trace, "%s", record);
        else if (beginsWith(record, wanted))
            printf("%s%s", trace, record);
    }
    fclose(file);
}

int main(int argc, char **argv)
{
    setlocale(LC_ALL, "");
    remove(SUPPORT_FILE);
    if (argc != 2 || !ZlvOpenToolkit(argv[1], NULL))
        return 1;
    printf("-- what the operator sees\n");
    fflush(stdout);
    operate();
    ZlvCloseToolkit();

    printf("-- what support finds about PMP0002E\n");
    find("PMP0002E");
    remove(SUPPORT_FILE);
    return 0;
}
