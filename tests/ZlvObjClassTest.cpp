// SPDX-License-Identifier: Apache-2.0
// Registration of classes.
#include "support/ClassEntries.h"
#include "support/FailAlloc.h"
#include "support/ToolkitFixture.h"

#include "ZlvBasicFormatter.h"
#include "ZlvHandler.h"
#include "ZlvIntl.h"
#include "ZlvLevelFilter.h"

namespace zelvo_test {
namespace {

using namespace entries;

class ZlvObjClassTest : public ToolkitFixture {
protected:
    static ZlvObjClass *get(const char *name = "mine") { return zlvToolkitGetClassDef(name); }
};

TEST_F(ZlvObjClassTest, TheNameIsTheClassesOwnCopy)
{
    std::string name = "mine";
    ZlvAddLoggerClass(name.c_str(), nullptr, nullptr, nullptr, nullptr, nullptr);
    name[0] = 'x';
    ASSERT_NE(get(), nullptr);
    EXPECT_STREQ(get()->name, "mine");
}

TEST_F(ZlvObjClassTest, TheDescriptionIsTheClassesOwnCopy)
{
    ZlvI18Msg *description = ZlvAllocUI18Msg("bundle", "key", u"text");
    ZlvAddLoggerClass("mine", description, nullptr, nullptr, nullptr, nullptr);
    ZlvFreeI18Msg(description);
    ASSERT_NE(get()->description, nullptr);
    EXPECT_STREQ(get()->description->bundle, "bundle");
    EXPECT_STREQ(get()->description->key, "key");
    EXPECT_EQ(peeked(get()->description->text), u"text");
}

TEST_F(ZlvObjClassTest, WithoutADescriptionThereIsNone)
{
    ZlvAddLoggerClass("mine", nullptr, nullptr, nullptr, nullptr, nullptr);
    EXPECT_EQ(get()->description, nullptr);
}

TEST_F(ZlvObjClassTest, TheFirstRegistrationOfANameWins)
{
    ZlvAddLoggerClass("mine", nullptr, nullptr, nullptr, nullptr, logEntry);
    ZlvObjClass *first = get();
    ZlvAddLoggerClass("mine", nullptr, nullptr, nullptr, nullptr, nullptr);
    EXPECT_EQ(get(), first);
    EXPECT_EQ(get()->logger.fLog, logEntry);
}

TEST_F(ZlvObjClassTest, ANameIsTakenForEveryKind)
{
    ZlvAddLoggerClass("mine", nullptr, nullptr, nullptr, nullptr, nullptr);
    ZlvAddFilterClass("mine", nullptr, nullptr, nullptr, nullptr, nullptr, nullptr, nullptr);
    EXPECT_EQ(get()->kind, uint32_t{ZLV_KIND_LOGGER});
    Names filters = namesFrom(ZlvGetFilterClasses());
    EXPECT_EQ(std::count(filters.begin(), filters.end(), "mine"), 0);
}

TEST_F(ZlvObjClassTest, NamesThatDifferInCaseAreDifferent)
{
    ZlvAddLoggerClass("mine", nullptr, nullptr, nullptr, nullptr, nullptr);
    ZlvAddLoggerClass("Mine", nullptr, nullptr, nullptr, nullptr, nullptr);
    EXPECT_NE(get("Mine"), nullptr);
    EXPECT_NE(get("Mine"), get("mine"));
}

TEST_F(ZlvObjClassTest, ABuiltinClassIsNotReplaced)
{
    open();
    ZlvObjClass *builtin = get("zlv_basiclogger");
    ZlvAddLoggerClass("zlv_basiclogger", nullptr, allocVars, freeVars, cfgChange, logEntry);
    EXPECT_EQ(get("zlv_basiclogger"), builtin);
    EXPECT_EQ(builtin->logger.fLog, ZlvBasicObjectFLog);
    EXPECT_EQ(builtin->fAllocVars, nullptr);
    EXPECT_EQ(builtin->fCfgChange, ZlvBasicLoggerFCfgChange);
}

TEST_F(ZlvObjClassTest, WithoutANameNothingIsRegistered)
{
    open();
    auto sizes = [] {
        return std::vector{namesFrom(ZlvGetLoggerClasses()), namesFrom(ZlvGetFilterClasses()),
                           namesFrom(ZlvGetHandlerClasses()), namesFrom(ZlvGetFormatterClasses())};
    };
    auto before = sizes();
    ZlvAddLoggerClass(nullptr, nullptr, nullptr, nullptr, nullptr, logEntry);
    ZlvAddFilterClass(nullptr, nullptr, nullptr, nullptr, nullptr, nullptr, nullptr, logEntry);
    ZlvAddHandlerClass(nullptr, nullptr, nullptr, nullptr, nullptr, process, nullptr, nullptr);
    ZlvAddUFormatterClass(nullptr, nullptr, nullptr, nullptr, nullptr, format, nullptr, nullptr,
                          nullptr);
    EXPECT_EQ(sizes(), before);
}

TEST_F(ZlvObjClassTest, WorksBeforeTheToolkitIsOpenedAndAfter)
{
    ZlvAddLoggerClass("before", nullptr, nullptr, nullptr, nullptr, nullptr);
    open();
    ZlvAddLoggerClass("after", nullptr, nullptr, nullptr, nullptr, nullptr);
    EXPECT_NE(logger("one", "before"), nullptr);
    EXPECT_NE(logger("two", "after"), nullptr);
}

TEST_F(ZlvObjClassTest, TheTwinsRegisterWithoutTheMutex)
{
    zlvIntlAddLoggerClass("logger", nullptr, nullptr, nullptr, nullptr, logEntry);
    zlvIntlAddFilterClass("filter", nullptr, nullptr, nullptr, nullptr, process, nullptr, nullptr);
    zlvIntlAddHandlerClass("handler", nullptr, nullptr, nullptr, nullptr, process, nullptr,
                           nullptr);
    zlvIntlAddUFormatterClass("formatter", nullptr, nullptr, nullptr, nullptr, format, nullptr,
                              nullptr, nullptr);
    EXPECT_EQ(get("logger")->logger.fLog, logEntry);
    EXPECT_EQ(get("filter")->filter.fProcess, process);
    EXPECT_EQ(get("handler")->handler.fProcess, process);
    EXPECT_EQ(get("formatter")->formatter.fFormat, format);
}

TEST_F(ZlvObjClassTest, WithoutMemoryNothingIsRegistered)
{
    open();
    for (uint32_t allowed = 0;; ++allowed) {
        uint32_t failed = 0;
        {
            FailAlloc fail(allowed);
            ZlvAddLoggerClass("mine", nullptr, nullptr, nullptr, nullptr, nullptr);
            failed = fail.failed();
        }
        if (failed == 0)
            break;
        EXPECT_EQ(get(), nullptr) << "after " << allowed << " allocations";
        Names names = namesFrom(ZlvGetLoggerClasses());
        EXPECT_EQ(std::count(names.begin(), names.end(), "mine"), 0);
    }
    EXPECT_NE(get(), nullptr);
}

TEST_F(ZlvObjClassTest, ARecordIsMadeWithWhatItIsGiven)
{
    ZlvObjClass *made =
        zlvInitObjectClass("mine", ZLV_KIND_FILTER, nullptr, allocVars, freeVars, cfgChange);
    EXPECT_EQ(made->kind, uint32_t{ZLV_KIND_FILTER});
    EXPECT_STREQ(made->name, "mine");
    EXPECT_EQ(made->fAllocVars, allocVars);
    EXPECT_EQ(made->fFreeVars, freeVars);
    EXPECT_EQ(made->fCfgChange, cfgChange);
    EXPECT_EQ(get(), nullptr) << "made, not registered";
    zlvFreeObjClass(made);
}

TEST_F(ZlvObjClassTest, NoRecordIsMadeForANullOrATakenName)
{
    open();
    EXPECT_EQ(zlvInitObjectClass(nullptr, 101, nullptr, nullptr, nullptr, nullptr), nullptr);
    EXPECT_EQ(zlvInitObjectClass("zlv_basiclogger", 101, nullptr, nullptr, nullptr, nullptr),
              nullptr);
}

TEST_F(ZlvObjClassTest, FreeingNoRecordIsIgnored)
{
    zlvFreeObjClass(nullptr);
    SUCCEED();
}

TEST_F(ZlvObjClassTest, AHandlerWithoutEntriesAcceptsEventsAndDoesNothing)
{
    open();
    ZlvAddHandlerClass("mine", nullptr, nullptr, nullptr, nullptr, nullptr, nullptr, nullptr);
    ZlvObject *app = logger("app");
    ZlvAddListener(app, handler("nothing", "mine"));
    ZlvStatus status{};
    EXPECT_EQ(console([&] { status = log(app, u"text"); }), "");
    EXPECT_EQ(status.type, CX_STATUS_OK);
}

TEST_F(ZlvObjClassTest, AFormatterWithOnlyAFormatEntryHasNoHeaderAndNoTrailer)
{
    open();
    ZlvAddUFormatterClass("mine", nullptr, nullptr, nullptr, nullptr, format, nullptr, nullptr,
                          nullptr);
    ZlvObject *bare = handler("bare");
    ZlvHandlerSetFormatter(bare, formatter("plain", "mine"));
    EXPECT_EQ(ZlvHandlerGetFmtHeader(bare), nullptr);
    EXPECT_EQ(ZlvHandlerGetFmtTrailer(bare), nullptr);
    EXPECT_EQ(get()->formatter.fGetHeader, ZlvBasicFormatterFGetHeader);
    EXPECT_EQ(get()->formatter.fGetTrailer, ZlvBasicFormatterFGetTrailer);
}

} // namespace
} // namespace zelvo_test
