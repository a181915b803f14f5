// SPDX-License-Identifier: Apache-2.0
// The handler that prints to the standard output.
#include "ZlvConsoleHandler.h"

#include <cstdio>

#include "CxMemory.h"
#include "CxUString.h"
#include "ZlvIntl.h"
#include "util/CxOwned.h"

using namespace zelvo;

namespace {

/// Asked for again after each foreign function, which may have had the variables freed.
ConsoleHandlerVars *varsOf(const ZlvObject *handler)
{
    return handler != nullptr ? static_cast<ConsoleHandlerVars *>(handler->vars) : nullptr;
}

/// Prints a header or trailer, if there is one.
void printAndFree(char *text)
{
    const OwnedStr owned{text};
    const OwnedUStr wide{CxUStringDupStrToUChar(owned.get())};
    zlvI18PrintUCharAsLocal(stdout, wide.get());
}

void setOpened(const ZlvObject *handler, uint8_t opened)
{
    if (ConsoleHandlerVars *vars = varsOf(handler))
        vars->opened = opened;
}

} // namespace

void *ZlvConsoleHandlerFAllocVars(void)
{
    auto *vars = static_cast<ConsoleHandlerVars *>(RkoMemoryMalloc(sizeof(ConsoleHandlerVars)));
    if (vars != nullptr)
        vars->opened = 0;
    return vars;
}

void ZlvConsoleHandlerFFreeVars(void *vars)
{
    RkoMemoryFree(vars);
}

void ZlvConsoleUHandlerFProcess(ZlvObject *handler, ZlvEvent *event, va_list args)
{
    const ConsoleHandlerVars *vars = varsOf(handler);
    if (event == nullptr || vars == nullptr || !zlvIntlIsObjectEnabled(handler))
        return;
    if (vars->opened == 0)
        ZlvConsoleHandlerFOpen(handler);
    const OwnedUStr record{zlvIntlUHandlerDoFmt(handler, event, args)};
    zlvI18PrintUCharAsLocal(stdout, record.get());
    ZlvBasicObjectFLog(handler, event, args);
}

void ZlvConsoleHandlerFOpen(ZlvObject *handler)
{
    const ConsoleHandlerVars *vars = varsOf(handler);
    if (vars == nullptr || vars->opened == 1)
        return;
    printAndFree(zlvIntlHandlerGetFmtHeader(handler));
    setOpened(handler, 1);
}

void ZlvConsoleHandlerFClose(ZlvObject *handler)
{
    const ConsoleHandlerVars *vars = varsOf(handler);
    if (vars == nullptr || vars->opened == 0)
        return;
    printAndFree(zlvIntlHandlerGetFmtTrailer(handler));
    setOpened(handler, 0);
}
