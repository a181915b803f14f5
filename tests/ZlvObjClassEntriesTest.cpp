// SPDX-License-Identifier: Apache-2.0
// The function table of a class, entry by entry.
#include "support/ClassEntries.h"
#include "support/ToolkitFixture.h"

#include "ZlvBasicFormatter.h"
#include "ZlvHandler.h"
#include "ZlvIntl.h"
#include "ZlvLevelFilter.h"

namespace zelvo_test {
namespace {

using namespace entries;

/// One entry of a class's table: where it stands, its default and one that a registration gives.
struct Entry {
    const char *name;
    const char *kind;
    bool (*isDefault)(const ZlvObjClass *);
    bool (*isGiven)(const ZlvObjClass *);
};

class ZlvObjClassEntry : public ToolkitFixture, public testing::WithParamInterface<Entry> {};

TEST_P(ZlvObjClassEntry, DefaultsWhenTheRegistrationGivesNone)
{
    addAll("", false);
    EXPECT_TRUE(GetParam().isDefault(zlvToolkitGetClassDef(GetParam().kind)));
}

TEST_P(ZlvObjClassEntry, IsStoredAsGiven)
{
    addAll("", true);
    EXPECT_TRUE(GetParam().isGiven(zlvToolkitGetClassDef(GetParam().kind)));
}

#define ENTRY(name, kind, field, standard, given)                                                  \
    Entry                                                                                          \
    {                                                                                              \
        name, kind, [](const ZlvObjClass *c) -> bool { return c->field == (standard); },           \
            [](const ZlvObjClass *c) -> bool { return c->field == (given); }                       \
    }

INSTANTIATE_TEST_SUITE_P(
    , ZlvObjClassEntry,
    testing::Values(
        ENTRY("LoggerLog", "logger", logger.fLog, ZlvBasicObjectFLog, logEntry),
        ENTRY("FilterProcess", "filter", filter.fProcess, ZlvBasicFilterFProcess, process),
        ENTRY("FilterIsLoggable", "filter", filter.fIsLoggable, ZlvLevelFilterFIsLoggable,
              isLoggable),
        ENTRY("FilterLog", "filter", filter.fLog, ZlvBasicObjectFLog, logEntry),
        ENTRY("HandlerProcess", "handler", handler.fProcess, ZlvBasicHandlerFProcess, process),
        ENTRY("HandlerOpen", "handler", handler.fOpen, ZlvBasicHandlerFOpen, openEntry),
        ENTRY("HandlerClose", "handler", handler.fClose, ZlvBasicHandlerFClose, closeEntry),
        ENTRY("FormatterFormat", "formatter", formatter.fFormat, ZlvBasicUFormatterFFormat, format),
        ENTRY("FormatterGetHeader", "formatter", formatter.fGetHeader, ZlvBasicFormatterFGetHeader,
              header),
        ENTRY("FormatterGetTrailer", "formatter", formatter.fGetTrailer,
              ZlvBasicFormatterFGetTrailer, trailer),
        ENTRY("FormatterBindMsg", "formatter", formatter.fBindMsg, zlvIntlBindUI18Msg, bindMsg),
        ENTRY("LoggerAllocVars", "logger", fAllocVars, nullptr, allocVars),
        ENTRY("LoggerFreeVars", "logger", fFreeVars, nullptr, freeVars),
        ENTRY("LoggerCfgChange", "logger", fCfgChange, nullptr, cfgChange),
        ENTRY("FilterAllocVars", "filter", fAllocVars, nullptr, allocVars),
        ENTRY("FilterFreeVars", "filter", fFreeVars, nullptr, freeVars),
        ENTRY("FilterCfgChange", "filter", fCfgChange, nullptr, cfgChange),
        ENTRY("HandlerAllocVars", "handler", fAllocVars, nullptr, allocVars),
        ENTRY("HandlerFreeVars", "handler", fFreeVars, nullptr, freeVars),
        ENTRY("HandlerCfgChange", "handler", fCfgChange, nullptr, cfgChange),
        ENTRY("FormatterAllocVars", "formatter", fAllocVars, nullptr, allocVars),
        ENTRY("FormatterFreeVars", "formatter", fFreeVars, nullptr, freeVars),
        ENTRY("FormatterCfgChange", "formatter", fCfgChange, nullptr, cfgChange),
        ENTRY("LoggerKind", "logger", kind, 101u, 101u),
        ENTRY("FilterKind", "filter", kind, 102u, 102u),
        ENTRY("HandlerKind", "handler", kind, 103u, 103u),
        ENTRY("FormatterKind", "formatter", kind, 104u, 104u)),
    [](const auto &row) { return std::string(row.param.name); });

#undef ENTRY

} // namespace
} // namespace zelvo_test
