// SPDX-License-Identifier: Apache-2.0
// One message and one trace text, each as a line, as an XML record and as a trace line. Runs in the
// directory of the compiled examples, where the messages of the demo are.
#include <locale.h>

#include "zelvo.h"

/// Adds a console with a formatter of a class to a logger, which keeps it.
static void addConsole(ZlvObject *logger, const char *console, const char *formatClass)
{
    ZlvObject *handler = ZlvGetObject(console, "zlv_consolehandler");
    ZlvObject *formatter = ZlvGetObject(formatClass, formatClass);
    ZlvHandlerSetFormatter(handler, formatter);
    ZlvAddListener(logger, handler);
    ZlvReleaseObject(formatter);
    ZlvReleaseObject(handler);
}

int main(void)
{
    setlocale(LC_ALL, "");
    if (!ZlvOpenToolkit(NULL, NULL))
        return 1;

    ZlvObject *log = ZlvGetObject("till.log", "zlv_pdlogger");
    ZlvSetObjProp(log, "organization", "Example Ltd");
    ZlvSetObjProp(log, "product", "Shop");
    ZlvSetObjProp(log, "component", "Till");
    ZlvSetObjProp(log, "client", "Anna");
    ZlvSetObjProp(log, "server", "till7.example.org");
    ZlvSetObjProp(log, "productInstance", "7");
    addConsole(log, "line", "zlv_basicformatter");
    addConsole(log, "xml", "zlv_xmlformatter");
    addConsole(log, "trace", "zlv_vyxtraceformatter");

    ZlvLogError(log, "./demo_bundle", "till_jammed", u"drawer", 3);
    ZlvLogDebugMin(log, "till.c", "open", 42, u"drawer <{0}> ]]> moved", u"A&B");

    ZlvReleaseObject(log);
    ZlvCloseToolkit();
    return 0;
}
