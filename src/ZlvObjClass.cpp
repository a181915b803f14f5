// SPDX-License-Identifier: Apache-2.0
// Class records and their registration, with the defaults that stand in for entries left out.
#include "ZlvObjClass.h"

#include "CxMemory.h"
#include "CxString.h"
#include "ZlvApiMutex.h"
#include "ZlvBasicFormatter.h"
#include "ZlvLevelFilter.h"

namespace {

template <class Entry>
Entry orDefault(Entry entry, Entry standard)
{
    return entry != nullptr ? entry : standard;
}

} // namespace

ZlvObjClass *zlvInitObjectClass(const char *name, uint32_t kind, const ZlvI18Msg *description,
                                ZlvFAllocVars allocVars, ZlvFFreeVars freeVars,
                                ZlvFCfgChange cfgChange)
{
    if (name == nullptr || zlvToolkitGetClassDef(name) != nullptr)
        return nullptr;
    auto *objClass = static_cast<ZlvObjClass *>(RkoMemoryCalloc(1, sizeof(ZlvObjClass)));
    if (objClass == nullptr)
        return nullptr;
    objClass->kind = kind;
    objClass->name = RkoStringDup(name);
    objClass->description = zlvIntlCopyI18Msg(description);
    objClass->fAllocVars = allocVars;
    objClass->fFreeVars = freeVars;
    objClass->fCfgChange = cfgChange;
    if (objClass->name != nullptr && (objClass->description != nullptr) == (description != nullptr))
        return objClass;
    zlvFreeObjClass(objClass);
    return nullptr;
}

void zlvFreeObjClass(ZlvObjClass *objClass)
{
    if (objClass == nullptr)
        return;
    RkoMemoryFree(objClass->name);
    zlvIntlFreeI18Msg(objClass->description);
    RkoMemoryFree(objClass);
}

ZlvObjClass *zlvReturnObjClass(ZlvObjClass *objClass)
{
    return objClass;
}

void zlvIgnoreObjClass(ZlvObjClass * /*objClass*/) {}

void zlvIntlAddLoggerClass(const char *name, const ZlvI18Msg *description, ZlvFAllocVars allocVars,
                           ZlvFFreeVars freeVars, ZlvFCfgChange cfgChange, ZlvFLog log)
{
    ZlvObjClass *objClass =
        zlvInitObjectClass(name, ZLV_KIND_LOGGER, description, allocVars, freeVars, cfgChange);
    if (objClass == nullptr)
        return;
    objClass->logger = {orDefault(log, ZlvBasicObjectFLog)};
    zlvToolkitAddClassDef(name, objClass);
}

void zlvIntlAddFilterClass(const char *name, const ZlvI18Msg *description, ZlvFAllocVars allocVars,
                           ZlvFFreeVars freeVars, ZlvFCfgChange cfgChange, ZlvFProcess process,
                           ZlvFIsLoggable isLoggable, ZlvFLog log)
{
    ZlvObjClass *objClass =
        zlvInitObjectClass(name, ZLV_KIND_FILTER, description, allocVars, freeVars, cfgChange);
    if (objClass == nullptr)
        return;
    objClass->filter = {orDefault(process, ZlvBasicFilterFProcess),
                        orDefault(isLoggable, ZlvLevelFilterFIsLoggable),
                        orDefault(log, ZlvBasicObjectFLog)};
    zlvToolkitAddClassDef(name, objClass);
}

void zlvIntlAddHandlerClass(const char *name, const ZlvI18Msg *description, ZlvFAllocVars allocVars,
                            ZlvFFreeVars freeVars, ZlvFCfgChange cfgChange, ZlvFProcess process,
                            ZlvFOpen open, ZlvFClose close)
{
    ZlvObjClass *objClass =
        zlvInitObjectClass(name, ZLV_KIND_HANDLER, description, allocVars, freeVars, cfgChange);
    if (objClass == nullptr)
        return;
    objClass->handler = {orDefault(process, ZlvBasicHandlerFProcess),
                         orDefault(open, ZlvBasicHandlerFOpen),
                         orDefault(close, ZlvBasicHandlerFClose)};
    zlvToolkitAddClassDef(name, objClass);
}

void zlvIntlAddUFormatterClass(const char *name, const ZlvI18Msg *description,
                               ZlvFAllocVars allocVars, ZlvFFreeVars freeVars,
                               ZlvFCfgChange cfgChange, ZlvFFormat format, ZlvFGetHeader getHeader,
                               ZlvFGetTrailer getTrailer, ZlvFBindMsg bindMsg)
{
    ZlvObjClass *objClass =
        zlvInitObjectClass(name, ZLV_KIND_FORMATTER, description, allocVars, freeVars, cfgChange);
    if (objClass == nullptr)
        return;
    objClass->formatter = {orDefault(format, ZlvBasicUFormatterFFormat),
                           orDefault(getHeader, ZlvBasicFormatterFGetHeader),
                           orDefault(getTrailer, ZlvBasicFormatterFGetTrailer),
                           orDefault(bindMsg, zlvIntlBindUI18Msg)};
    zlvToolkitAddClassDef(name, objClass);
}

StringGroupIterator zlvIntlGetLoggerClasses(void)
{
    return zlvToolkitFetchClassnames(ZLV_KIND_LOGGER);
}

StringGroupIterator zlvIntlGetFilterClasses(void)
{
    return zlvToolkitFetchClassnames(ZLV_KIND_FILTER);
}

StringGroupIterator zlvIntlGetHandlerClasses(void)
{
    return zlvToolkitFetchClassnames(ZLV_KIND_HANDLER);
}

StringGroupIterator zlvIntlGetFormatterClasses(void)
{
    return zlvToolkitFetchClassnames(ZLV_KIND_FORMATTER);
}

void ZlvAddLoggerClass(const char *name, const ZlvI18Msg *description, ZlvFAllocVars allocVars,
                       ZlvFFreeVars freeVars, ZlvFCfgChange cfgChange, ZlvFLog log)
{
    zelvo::locked(zlvIntlAddLoggerClass, name, description, allocVars, freeVars, cfgChange, log);
}

void ZlvAddFilterClass(const char *name, const ZlvI18Msg *description, ZlvFAllocVars allocVars,
                       ZlvFFreeVars freeVars, ZlvFCfgChange cfgChange, ZlvFProcess process,
                       ZlvFIsLoggable isLoggable, ZlvFLog log)
{
    zelvo::locked(zlvIntlAddFilterClass, name, description, allocVars, freeVars, cfgChange, process,
                  isLoggable, log);
}

void ZlvAddHandlerClass(const char *name, const ZlvI18Msg *description, ZlvFAllocVars allocVars,
                        ZlvFFreeVars freeVars, ZlvFCfgChange cfgChange, ZlvFProcess process,
                        ZlvFOpen open, ZlvFClose close)
{
    zelvo::locked(zlvIntlAddHandlerClass, name, description, allocVars, freeVars, cfgChange,
                  process, open, close);
}

void ZlvAddUFormatterClass(const char *name, const ZlvI18Msg *description, ZlvFAllocVars allocVars,
                           ZlvFFreeVars freeVars, ZlvFCfgChange cfgChange, ZlvFFormat format,
                           ZlvFGetHeader getHeader, ZlvFGetTrailer getTrailer, ZlvFBindMsg bindMsg)
{
    zelvo::locked(zlvIntlAddUFormatterClass, name, description, allocVars, freeVars, cfgChange,
                  format, getHeader, getTrailer, bindMsg);
}

StringGroupIterator ZlvGetLoggerClasses(void)
{
    return zelvo::locked(zlvIntlGetLoggerClasses);
}

StringGroupIterator ZlvGetFilterClasses(void)
{
    return zelvo::locked(zlvIntlGetFilterClasses);
}

StringGroupIterator ZlvGetHandlerClasses(void)
{
    return zelvo::locked(zlvIntlGetHandlerClasses);
}

StringGroupIterator ZlvGetFormatterClasses(void)
{
    return zelvo::locked(zlvIntlGetFormatterClasses);
}
