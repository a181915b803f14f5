// SPDX-License-Identifier: Apache-2.0
// A handler class of one's own: an alarm that prints the first few records and then only counts.
#include <locale.h>
#include <stdio.h>
#include <string.h>

#include "zelvo.h"

/// The variables of one alarm.
typedef struct AlarmVars {
    int32_t limit;
    int32_t count;
} AlarmVars;

static void *allocVars(void)
{
    AlarmVars *vars = RkoMemoryMalloc(sizeof *vars);
    if (vars != NULL)
        *vars = (AlarmVars){.limit = 3, .count = 0};
    return vars;
}

static void freeVars(void *vars)
{
    RkoMemoryFree(vars);
}

/// Takes over the property "limit"; the others are those of every handler.
static void cfgChange(ZlvObject *handler, const char *property)
{
    AlarmVars *vars = handler->vars;
    if (vars != NULL && strcmp(property, "limit") == 0)
        vars->limit = zlvIntlGetObjPropInt(handler, property, NULL);
    else
        ZlvBasicHandlerFCfgChange(handler, property);
}

/// Prints a record unless the limit is reached, then passes the event on to listeners.
static void process(ZlvObject *handler, ZlvEvent *event, va_list args)
{
    AlarmVars *vars = handler->vars;
    if (vars == NULL || !zlvIntlIsObjectEnabled(handler))
        return;
    if (vars->count++ < vars->limit) {
        UChar *record = zlvIntlUHandlerDoFmt(handler, event, args);
        zlvI18PrintUCharAsLocal(stdout, record);
        RkoMemoryFree(record);
    }
    ZlvBasicObjectFLog(handler, event, args);
}

/// Runs when the toolkit lets go of the handler.
static void closeAlarm(ZlvObject *handler)
{
    const AlarmVars *vars = handler->vars;
    if (vars != NULL)
        printf("%d alarms\n", vars->count);
}

int main(void)
{
    setlocale(LC_ALL, "");
    if (!ZlvOpenToolkit(NULL, NULL))
        return 1;
    ZlvAddHandlerClass("example_alarm", NULL, allocVars, freeVars, cfgChange, process, NULL,
                       closeAlarm);

    ZlvObject *logger = ZlvGetObject("plant.log", "zlv_basiclogger");
    ZlvObject *alarm = ZlvGetObject("plant.alarm", "example_alarm");
    ZlvSetObjPropInt(alarm, "limit", 2);
    ZlvAddListener(logger, alarm);

    for (int32_t pump = 1; pump <= 4; ++pump)
        ZlvLogUText(logger, u"pump {0,number,integer} is dry", pump);

    ZlvReleaseObject(logger); // the last reference: the logger goes, and lets go of the alarm
    ZlvReleaseObject(alarm);
    ZlvCloseToolkit();
    return 0;
}
