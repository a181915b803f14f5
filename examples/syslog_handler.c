// SPDX-License-Identifier: Apache-2.0
// A handler class of one's own that sends records to syslog(3), for journald or any syslog daemon.
// Its objects have the keys "ident", "facility" and "copyToStderr", and each level becomes one of
// syslog's priorities. syslog_handler.properties describes two of them.
//
// Run it as build/release/examples/syslog_handler: the copies appear on the standard error stream,
// the records themselves where the daemon puts them (journalctl -t shop -t tills).
#include <locale.h>
#include <string.h>
#include <syslog.h>

#include "zelvo.h"

static const char BUNDLE[] = EXAMPLE_BUNDLE;

/// The variables of one handler.
typedef struct SyslogVars {
    char *ident; // null stands for the name of the object
    int facility;
    int options;
} SyslogVars;

static void *allocVars(void)
{
    SyslogVars *vars = RkoMemoryMalloc(sizeof *vars);
    if (vars != NULL)
        *vars = (SyslogVars){.ident = NULL, .facility = LOG_USER, .options = 0};
    return vars;
}

/// The C library keeps the pointer that openlog() is given; closelog() makes it let go.
static void setIdent(SyslogVars *vars, char *ident)
{
    closelog();
    RkoMemoryFree(vars->ident);
    vars->ident = ident;
}

static void freeVars(void *vars)
{
    if (vars != NULL)
        setIdent(vars, NULL);
    RkoMemoryFree(vars);
}

/// The facility of a name; LOG_USER for a name that there is not, and for none.
static int facilityOf(const char *name)
{
    static const struct {
        const char *name;
        int facility;
    } table[] = {
        {"daemon", LOG_DAEMON}, {"local0", LOG_LOCAL0}, {"local1", LOG_LOCAL1},
        {"local2", LOG_LOCAL2}, {"local3", LOG_LOCAL3}, {"local4", LOG_LOCAL4},
        {"local5", LOG_LOCAL5}, {"local6", LOG_LOCAL6}, {"local7", LOG_LOCAL7},
    };
    for (size_t i = 0; i < sizeof table / sizeof table[0]; ++i)
        if (RkoStringCmp(name, table[i].name) == 0)
            return table[i].facility;
    return LOG_USER;
}

/// Takes over the properties of this class; the others are those of every handler.
static void cfgChange(ZlvObject *handler, const char *property)
{
    SyslogVars *vars = handler->vars;
    if (vars != NULL && strcmp(property, "ident") == 0) {
        setIdent(vars, zlvIntlGetObjProp(handler, property, NULL));
    } else if (vars != NULL && strcmp(property, "facility") == 0) {
        char *name = zlvIntlGetObjProp(handler, property, NULL);
        vars->facility = facilityOf(name);
        RkoMemoryFree(name);
    } else if (vars != NULL && strcmp(property, "copyToStderr") == 0) {
        vars->options = zlvIntlGetObjPropBool(handler, property, NULL) == 1 ? LOG_PERROR : 0;
    } else {
        ZlvBasicHandlerFCfgChange(handler, property);
    }
}

/// A level may be any number: each priority goes up to the next named level.
static int priorityOf(ZlvLevel level)
{
    if (level == ZLV_LEVEL_NONE)
        return LOG_NOTICE;
    if (level >= ZLV_LEVEL_FATAL)
        return LOG_CRIT;
    if (level >= ZLV_LEVEL_ERROR)
        return LOG_ERR;
    if (level >= ZLV_LEVEL_WARN)
        return LOG_WARNING;
    return level >= ZLV_LEVEL_INFO ? LOG_INFO : LOG_DEBUG;
}

/// The record of the handler's formatter as bytes, without the line feed at its end; null if none.
static char *recordOf(ZlvObject *handler, ZlvEvent *event, va_list args)
{
    UChar *record = zlvIntlUHandlerDoFmt(handler, event, args);
    char *bytes = CxUStringDupUCharToStr(record);
    RkoMemoryFree(record);
    const size_t length = RkoStringLen(bytes);
    if (length > 0 && bytes[length - 1] == '\n')
        bytes[length - 1] = '\0';
    return bytes;
}

/// Sends one record. A process has one connection to the daemon and handlers share it, so each
/// names itself before it writes. Events come one at a time, however many threads log.
static void process(ZlvObject *handler, ZlvEvent *event, va_list args)
{
    const SyslogVars *vars = handler->vars;
    if (vars == NULL || !zlvIntlIsObjectEnabled(handler))
        return;
    char *record = recordOf(handler, event, args);
    if (record != NULL) {
        openlog(vars->ident != NULL ? vars->ident : handler->name, vars->options, vars->facility);
        syslog(priorityOf(event->level), "%s", record); // a text is never a format
    }
    RkoMemoryFree(record);
    ZlvBasicObjectFLog(handler, event, args);
}

int main(void)
{
    setlocale(LC_ALL, "");
    if (!ZlvOpenToolkit(EXAMPLE_PROPERTIES, NULL))
        return 1;
    ZlvAddHandlerClass("example_syslog", NULL, allocVars, freeVars, cfgChange, process, NULL, NULL);

    ZlvObject *log = ZlvGetObject("shop.log", NULL);
    ZlvLogInfo(log, BUNDLE, "till_opened", u"Zoë");
    ZlvLogWarn(log, BUNDLE, "low_stock", u"Tee", 1250, 2500.5);
    ZlvLogError(log, BUNDLE, "till_offline", u"db.example.org");
    ZlvLogFatal(log, BUNDLE, "no_database", u"db.example.org", 3);
    ZlvLogDebugMin(log, "syslog_handler.c", __func__, __LINE__, u"{0} done", u"100 %s");
    ZlvLogUText(log, u"no level at all");

    ZlvReleaseObject(log);
    ZlvCloseToolkit();
    return 0;
}
