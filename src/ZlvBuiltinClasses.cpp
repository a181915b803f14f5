// SPDX-License-Identifier: Apache-2.0
#include "ZlvBuiltinClasses.h"

#include "ZlvBasicFormatter.h"
#include "ZlvConsoleHandler.h"
#include "ZlvFileHandler.h"
#include "ZlvIntl.h"
#include "ZlvLevelFilter.h"
#include "ZlvMsgIdFilter.h"
#include "ZlvMultiProcFileHandler.h"
#include "ZlvPDLogger.h"
#include "ZlvPDXMLFormatter.h"
#include "ZlvVyxTraceFormatter.h"

namespace {

struct BuiltinClass {
    const char *name;
    ZlvObjClass entries; ///< all but the name
};

constexpr BuiltinClass builtins[] = {
    {"zlv_basiclogger",
     {.kind = ZLV_KIND_LOGGER,
      .name = nullptr,
      .description = nullptr,
      .logger = {.fLog = ZlvBasicObjectFLog},
      .fAllocVars = nullptr,
      .fFreeVars = nullptr,
      .fCfgChange = ZlvBasicLoggerFCfgChange}},
    {"zlv_pdlogger",
     {.kind = ZLV_KIND_LOGGER,
      .name = nullptr,
      .description = nullptr,
      .logger = {.fLog = ZlvPDLoggerFLog},
      .fAllocVars = ZlvPDLoggerFAllocVars,
      .fFreeVars = ZlvPDLoggerFFreeVars,
      .fCfgChange = ZlvPDLoggerFCfgChange}},
    {"zlv_levelfilter",
     {.kind = ZLV_KIND_FILTER,
      .name = nullptr,
      .description = nullptr,
      .filter = {.fProcess = ZlvBasicFilterFProcess,
                 .fIsLoggable = ZlvLevelFilterFIsLoggable,
                 .fLog = ZlvBasicObjectFLog},
      .fAllocVars = nullptr,
      .fFreeVars = nullptr,
      .fCfgChange = ZlvLevelFilterFCfgChange}},
    {"zlv_msgidfilter",
     {.kind = ZLV_KIND_FILTER,
      .name = nullptr,
      .description = nullptr,
      .filter = {.fProcess = ZlvBasicFilterFProcess,
                 .fIsLoggable = ZlvMsgIdFilterFIsLoggable,
                 .fLog = ZlvBasicObjectFLog},
      .fAllocVars = ZlvMsgIdFilterFAllocVars,
      .fFreeVars = ZlvMsgIdFilterFFreeVars,
      .fCfgChange = ZlvMsgIdFilterFCfgChange}},
    {"zlv_consolehandler",
     {.kind = ZLV_KIND_HANDLER,
      .name = nullptr,
      .description = nullptr,
      .handler = {.fProcess = ZlvConsoleUHandlerFProcess,
                  .fOpen = ZlvConsoleHandlerFOpen,
                  .fClose = ZlvConsoleHandlerFClose},
      .fAllocVars = ZlvConsoleHandlerFAllocVars,
      .fFreeVars = ZlvConsoleHandlerFFreeVars,
      .fCfgChange = ZlvBasicHandlerFCfgChange}},
    {"zlv_filehandler",
     {.kind = ZLV_KIND_HANDLER,
      .name = nullptr,
      .description = nullptr,
      .handler = {.fProcess = ZlvFileUHandlerFProcess,
                  .fOpen = ZlvFileHandlerFOpen,
                  .fClose = ZlvFileHandlerFClose},
      .fAllocVars = ZlvFileHandlerFAllocVars,
      .fFreeVars = ZlvFileHandlerFFreeVars,
      .fCfgChange = ZlvFileHandlerFCfgChange}},
    {"zlv_multiproc_filehandler",
     {.kind = ZLV_KIND_HANDLER,
      .name = nullptr,
      .description = nullptr,
      .handler = {.fProcess = ZlvMultiProcFileUHandlerFProcess,
                  .fOpen = ZlvMultiProcFileHandlerFOpen,
                  .fClose = ZlvMultiProcFileHandlerFClose},
      .fAllocVars = ZlvFileHandlerFAllocVars,
      .fFreeVars = ZlvFileHandlerFFreeVars,
      .fCfgChange = ZlvFileHandlerFCfgChange}},
    {"zlv_basicformatter",
     {.kind = ZLV_KIND_FORMATTER,
      .name = nullptr,
      .description = nullptr,
      .formatter = {.fFormat = ZlvBasicUFormatterFFormat,
                    .fGetHeader = ZlvBasicFormatterFGetHeader,
                    .fGetTrailer = ZlvBasicFormatterFGetTrailer,
                    .fBindMsg = zlvIntlBindUI18Msg},
      .fAllocVars = nullptr,
      .fFreeVars = nullptr,
      .fCfgChange = ZlvBasicFormatterFCfgChange}},
    {"zlv_xmlformatter",
     {.kind = ZLV_KIND_FORMATTER,
      .name = nullptr,
      .description = nullptr,
      .formatter = {.fFormat = ZlvPDXMLUFormatterFFormat,
                    .fGetHeader = ZlvPDXMLFormatterFGetHeader,
                    .fGetTrailer = ZlvPDXMLFormatterFGetTrailer,
                    .fBindMsg = zlvIntlBindUI18Msg},
      .fAllocVars = ZlvPDXMLFormatterFAllocVars,
      .fFreeVars = ZlvPDXMLFormatterFFreeVars,
      .fCfgChange = ZlvPDXMLFormatterFCfgChange}},
    {"zlv_vyxtraceformatter",
     {.kind = ZLV_KIND_FORMATTER,
      .name = nullptr,
      .description = nullptr,
      .formatter = {.fFormat = ZlvVyxTraceUFormatterFFormat,
                    .fGetHeader = ZlvBasicFormatterFGetHeader,
                    .fGetTrailer = ZlvBasicFormatterFGetTrailer,
                    .fBindMsg = zlvIntlBindUI18Msg},
      .fAllocVars = nullptr,
      .fFreeVars = nullptr,
      .fCfgChange = nullptr}},
};

} // namespace

void zelvo::forEachBuiltinClass(void (*take)(const char *name, ZlvObjClass *objClass))
{
    for (const BuiltinClass &builtin : builtins) {
        ZlvObjClass *record = zlvInitObjectClass(builtin.name, builtin.entries.kind, nullptr,
                                                 nullptr, nullptr, nullptr);
        if (record == nullptr)
            continue;
        char *name = record->name;
        *record = builtin.entries;
        record->name = name;
        take(name, record);
    }
}
