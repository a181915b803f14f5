// SPDX-License-Identifier: Apache-2.0
// The classes that are built in.
#include "support/ToolkitFixture.h"

#include "zelvo.h"

namespace zelvo_test {
namespace {

/// A built-in class and what must stand in its table.
struct Builtin {
    const char *name;
    uint32_t kind;
    ZlvFAllocVars allocVars;
    ZlvFFreeVars freeVars;
    ZlvFCfgChange cfgChange;
    bool (*hasItsEntries)(const ZlvObjClass *objClass);
};

class ZlvBuiltin : public ToolkitFixture, public testing::WithParamInterface<Builtin> {
protected:
    void SetUp() override
    {
        open();
        class_ = zlvToolkitGetClassDef(GetParam().name);
        ASSERT_NE(class_, nullptr);
    }

    ZlvObjClass *class_ = nullptr;
};

TEST_P(ZlvBuiltin, HasItsNameItsKindAndNoDescription)
{
    EXPECT_STREQ(class_->name, GetParam().name);
    EXPECT_EQ(class_->kind, GetParam().kind);
    EXPECT_EQ(class_->description, nullptr);
}

TEST_P(ZlvBuiltin, HasItsVariablesAndItsConfigurationChange)
{
    EXPECT_EQ(class_->fAllocVars, GetParam().allocVars);
    EXPECT_EQ(class_->fFreeVars, GetParam().freeVars);
    EXPECT_EQ(class_->fCfgChange, GetParam().cfgChange);
}

TEST_P(ZlvBuiltin, HasTheEntriesOfItsKind)
{
    EXPECT_TRUE(GetParam().hasItsEntries(class_));
}

const Builtin builtins[] = {
    {"zlv_basiclogger", ZLV_KIND_LOGGER, nullptr, nullptr, ZlvBasicLoggerFCfgChange,
     [](const ZlvObjClass *c) { return c->logger.fLog == ZlvBasicObjectFLog; }},
    {"zlv_pdlogger", ZLV_KIND_LOGGER, ZlvPDLoggerFAllocVars, ZlvPDLoggerFFreeVars,
     ZlvPDLoggerFCfgChange, [](const ZlvObjClass *c) { return c->logger.fLog == ZlvPDLoggerFLog; }},
    {"zlv_levelfilter", ZLV_KIND_FILTER, nullptr, nullptr, ZlvLevelFilterFCfgChange,
     [](const ZlvObjClass *c) {
         return c->filter.fProcess == ZlvBasicFilterFProcess &&
                c->filter.fIsLoggable == ZlvLevelFilterFIsLoggable &&
                c->filter.fLog == ZlvBasicObjectFLog;
     }},
    {"zlv_msgidfilter", ZLV_KIND_FILTER, ZlvMsgIdFilterFAllocVars, ZlvMsgIdFilterFFreeVars,
     ZlvMsgIdFilterFCfgChange,
     [](const ZlvObjClass *c) {
         return c->filter.fProcess == ZlvBasicFilterFProcess &&
                c->filter.fIsLoggable == ZlvMsgIdFilterFIsLoggable &&
                c->filter.fLog == ZlvBasicObjectFLog;
     }},
    {"zlv_consolehandler", ZLV_KIND_HANDLER, ZlvConsoleHandlerFAllocVars,
     ZlvConsoleHandlerFFreeVars, ZlvBasicHandlerFCfgChange,
     [](const ZlvObjClass *c) {
         return c->handler.fProcess == ZlvConsoleUHandlerFProcess &&
                c->handler.fOpen == ZlvConsoleHandlerFOpen &&
                c->handler.fClose == ZlvConsoleHandlerFClose;
     }},
    {"zlv_filehandler", ZLV_KIND_HANDLER, ZlvFileHandlerFAllocVars, ZlvFileHandlerFFreeVars,
     ZlvFileHandlerFCfgChange,
     [](const ZlvObjClass *c) {
         return c->handler.fProcess == ZlvFileUHandlerFProcess &&
                c->handler.fOpen == ZlvFileHandlerFOpen &&
                c->handler.fClose == ZlvFileHandlerFClose;
     }},
    {"zlv_multiproc_filehandler", ZLV_KIND_HANDLER, ZlvFileHandlerFAllocVars,
     ZlvFileHandlerFFreeVars, ZlvFileHandlerFCfgChange,
     [](const ZlvObjClass *c) {
         return c->handler.fProcess == ZlvMultiProcFileUHandlerFProcess &&
                c->handler.fOpen == ZlvMultiProcFileHandlerFOpen &&
                c->handler.fClose == ZlvMultiProcFileHandlerFClose;
     }},
    {"zlv_basicformatter", ZLV_KIND_FORMATTER, nullptr, nullptr, ZlvBasicFormatterFCfgChange,
     [](const ZlvObjClass *c) {
         return c->formatter.fFormat == ZlvBasicUFormatterFFormat &&
                c->formatter.fGetHeader == ZlvBasicFormatterFGetHeader &&
                c->formatter.fGetTrailer == ZlvBasicFormatterFGetTrailer &&
                c->formatter.fBindMsg == zlvIntlBindUI18Msg;
     }},
    {"zlv_xmlformatter", ZLV_KIND_FORMATTER, ZlvPDXMLFormatterFAllocVars,
     ZlvPDXMLFormatterFFreeVars, ZlvPDXMLFormatterFCfgChange,
     [](const ZlvObjClass *c) {
         return c->formatter.fFormat == ZlvPDXMLUFormatterFFormat &&
                c->formatter.fGetHeader == ZlvPDXMLFormatterFGetHeader &&
                c->formatter.fGetTrailer == ZlvPDXMLFormatterFGetTrailer &&
                c->formatter.fBindMsg == zlvIntlBindUI18Msg;
     }},
    {"zlv_vyxtraceformatter", ZLV_KIND_FORMATTER, nullptr, nullptr, nullptr,
     [](const ZlvObjClass *c) {
         return c->formatter.fFormat == ZlvVyxTraceUFormatterFFormat &&
                c->formatter.fGetHeader == ZlvBasicFormatterFGetHeader &&
                c->formatter.fGetTrailer == ZlvBasicFormatterFGetTrailer &&
                c->formatter.fBindMsg == zlvIntlBindUI18Msg;
     }},
};

INSTANTIATE_TEST_SUITE_P(, ZlvBuiltin, testing::ValuesIn(builtins),
                         [](const auto &row) { return std::string(row.param.name); });

class ZlvBuiltins : public ToolkitFixture {};

TEST_F(ZlvBuiltins, AreRegisteredInTheirOrder)
{
    zlvToolkitInitObjClasses();
    Names names;
    for (auto *node = ZLV_TK_CLASSES->first; node != nullptr; node = node->next)
        names.emplace_back(node->key);
    Names expected;
    for (const Builtin &builtin : builtins)
        expected.emplace_back(builtin.name);
    EXPECT_EQ(names, expected);
}

} // namespace
} // namespace zelvo_test
