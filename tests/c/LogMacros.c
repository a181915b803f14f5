/* SPDX-License-Identifier: Apache-2.0 */
/* A C99 program that logs through the macros: a refused one evaluates nothing but its logger. */
#include <stdio.h>
#include <string.h>

#include "zelvo.h"

static int events;
static int32_t line_seen;
static char file_seen[256];
static char function_seen[64];
static char text_seen[64];

static int loggers_asked;
static int arguments_made;

static void copy(char *target, size_t size, const char *text)
{
    snprintf(target, size, "%s", text == NULL ? "(none)" : text);
}

static void keep(ZlvObject *handler, ZlvEvent *event, va_list args)
{
    UChar *text = ZlvBindEventUMsg(event, zlvIntlBindUI18Msg, args);
    char *bytes = CxUStringDupUCharToStr(text);
    char *file = ZlvGetEventProp(event, "zlv_prop_srcfile", NULL);
    char *function = ZlvGetEventProp(event, "zlv_prop_srcfunction", NULL);
    (void)handler;
    ++events;
    line_seen = ZlvGetEventPropInt(event, "zlv_prop_srcline", NULL);
    copy(file_seen, sizeof file_seen, file);
    copy(function_seen, sizeof function_seen, function);
    copy(text_seen, sizeof text_seen, bytes);
    RkoMemoryFree(function);
    RkoMemoryFree(file);
    RkoMemoryFree(bytes);
    RkoMemoryFree(text);
}

static ZlvObject *asked(ZlvObject *logger)
{
    ++loggers_asked;
    return logger;
}

static int32_t made(int32_t number)
{
    ++arguments_made;
    return number;
}

static int differs(const char *what, int ok)
{
    if (!ok)
        printf("%s: %d events, %d loggers, %d arguments, %s %s %d %s\n", what, events,
               loggers_asked, arguments_made, file_seen, function_seen, (int)line_seen, text_seen);
    return !ok;
}

static int taken(ZlvObject *logger)
{
    static const UChar count[] = {'{', '0', ',', 'n', 'u', 'm', 'b', 'e', 'r', ',',
                                  'i', 'n', 't', 'e', 'g', 'e', 'r', '}', '!', 0};
    int32_t line = __LINE__ + 1;
    ZLV_DEBUG_MIN(asked(logger), count, made(42));
    return differs("taken", events == 1 && loggers_asked == 1 && arguments_made == 1 &&
                                line_seen == line && strcmp(file_seen, __FILE__) == 0 &&
                                strcmp(function_seen, __func__) == 0 &&
                                strcmp(text_seen, "42!") == 0);
}

static int refused(ZlvObject *logger)
{
    static const UChar text[] = {'n', 'o', 0};
    if (logger != NULL) /* the macro is one statement, before an else too */
        ZLV_DEBUG_MID(asked(logger), text, made(1));
    else
        ZLV_DEBUG_MAX(asked(logger), text);
    ZLV_INFO(asked(NULL), "bundle", "key", made(2));
    return differs("refused", events == 1 && loggers_asked == 3 && arguments_made == 1);
}

static int without_arguments(ZlvObject *logger)
{
    static const UChar text[] = {'y', 'e', 's', 0};
    ZLV_DEBUG_MIN(logger, text);
    return differs("without arguments", events == 2 && strcmp(text_seen, "yes") == 0);
}

static int messages(ZlvObject *logger)
{
    ZLV_FATAL(logger, "no bundle", "key", made(1));
    ZLV_ERROR(logger, "no bundle", "key");
    ZLV_WARN(logger, "no bundle", "key");
    ZLV_INFO(logger, "no bundle", "key");
    return differs("messages", events == 6 && arguments_made == 2);
}

int main(void)
{
    ZlvObject *logger;
    ZlvObject *handler;
    int failures;

    if (!ZlvOpenToolkit(NULL, NULL))
        return 1;
    ZlvAddHandlerClass("keeper", NULL, NULL, NULL, NULL, keep, NULL, NULL);
    logger = ZlvGetObject("c.logger", "zlv_basiclogger");
    handler = ZlvGetObject("c.handler", "keeper");
    ZlvAddListener(logger, handler);
    failures = taken(logger);
    failures += refused(logger);
    failures += without_arguments(logger);
    failures += messages(logger);
    ZlvReleaseObject(handler);
    ZlvReleaseObject(logger);
    ZlvCloseToolkit();
    return failures;
}
