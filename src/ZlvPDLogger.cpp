// SPDX-License-Identifier: Apache-2.0
// The logger that stamps events with the identity of the software and the system that report them.
#include "ZlvPDLogger.h"

#include "CxMemory.h"
#include "CxProcess.h"
#include "CxString.h"
#include "CxSystem.h"
#include "CxThread.h"
#include "ZlvIntl.h"
#include "ZlvPDXMLFormatter.h"
#include "util/CxOwned.h"

using namespace zelvo;

namespace {

/// One of the strings: the property that sets it is also the property that it stamps.
struct Stamp {
    const char *property;
    char *PDLoggerVars::*text;
};

constexpr Stamp stamps[] = {
    {"organization", &PDLoggerVars::organization},
    {"product", &PDLoggerVars::product},
    {"component", &PDLoggerVars::component},
    {"client", &PDLoggerVars::client},
    {"server", &PDLoggerVars::server},
    {"serverFormat", &PDLoggerVars::serverFormat},
    {"productInstance", &PDLoggerVars::productInstance},
};

PDLoggerVars *varsOf(const ZlvObject *logger)
{
    return logger != nullptr ? static_cast<PDLoggerVars *>(logger->vars) : nullptr;
}

char *newHostName()
{
    char name[256];
    const CxStatus status = CxSystemGetFQHostname(name, sizeof name);
    name[sizeof name - 1] = '\0'; // a name that had to be cut has no terminator
    return RkoStringDup(status.type == CX_STATUS_OK ? name : "NO_HOSTNAME");
}

void stampStrings(ZlvEvent *event, const PDLoggerVars &vars)
{
    for (const Stamp &stamp : stamps)
        if (vars.*stamp.text != nullptr)
            ZlvSetEventProp(event, stamp.property, vars.*stamp.text);
}

void stampNumbers(ZlvEvent *event)
{
    ZlvSetEventPropLong(event, "processId", static_cast<int32_t>(CxProcessGetCurrentID()));
    ZlvSetEventPropLong(event, "threadId", static_cast<int32_t>(CxThreadGetCurrentID()));
}

} // namespace

void *ZlvPDLoggerFAllocVars(void)
{
    auto *vars = static_cast<PDLoggerVars *>(RkoMemoryCalloc(1, sizeof(PDLoggerVars)));
    if (vars == nullptr)
        return nullptr;
    vars->server = newHostName();
    vars->serverFormat = RkoStringDup("IP");
    if (vars->server == nullptr || vars->serverFormat == nullptr) {
        ZlvPDLoggerFFreeVars(vars);
        return nullptr;
    }
    vars->idFormatter = zlvIntlGetObject("zelvo.pdMsgIdFormatter", "zlv_xmlformatter");
    return vars;
}

void ZlvPDLoggerFFreeVars(void *vars)
{
    auto *loggerVars = static_cast<PDLoggerVars *>(vars);
    if (loggerVars == nullptr)
        return;
    zlvIntlReleaseObject(loggerVars->idFormatter);
    for (const Stamp &stamp : stamps)
        RkoMemoryFree(loggerVars->*stamp.text);
    RkoMemoryFree(loggerVars);
}

void ZlvPDLoggerFCfgChange(ZlvObject *logger, const char *propertyName)
{
    PDLoggerVars *vars = varsOf(logger);
    if (vars == nullptr || propertyName == nullptr)
        return;
    for (const Stamp &stamp : stamps) {
        if (RkoStringCmp(propertyName, stamp.property) != 0)
            continue;
        const OwnedStr former{vars->*stamp.text};
        vars->*stamp.text = zlvIntlGetObjProp(logger, propertyName, nullptr);
        return;
    }
    ZlvBasicLoggerFCfgChange(logger, propertyName);
}

void ZlvPDLoggerFLog(ZlvObject *logger, ZlvEvent *event, va_list args)
{
    if (logger == nullptr || event == nullptr)
        return;
    const PDLoggerVars *vars = varsOf(logger);
    if (vars != nullptr)
        stampStrings(event, *vars);
    stampNumbers(event);
    zlvPDXMLUFormatterCacheMessageID(vars != nullptr ? vars->idFormatter : nullptr, event, args);
    ZlvBasicObjectFLog(logger, event, args);
}
