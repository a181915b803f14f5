// SPDX-License-Identifier: Apache-2.0
// Registration of classes, their defaults and the queries for their names.
#include "support/FailAlloc.h"
#include "support/Recorder.h"
#include "support/VaList.h"

#include "CxString.h"
#include "ZlvBasicFormatter.h"
#include "ZlvHandler.h"
#include "ZlvLevelFilter.h"

namespace zelvo_test {
namespace {

class ZlvObjClassTest : public ToolkitFixture {
protected:
    static Names all(StringGroupIterator at)
    {
        Names names;
        for (; ZlvStringGroupIterHasNext(at); at = ZlvStringGroupIterNext(at))
            names.push_back(taken(ZlvStringGroupIterGet(at)).value_or("(none)"));
        return names;
    }

    static ZlvObjClass *get(const char *name = "mine") { return zlvToolkitGetClassDef(name); }
};

// Entries that a registration may give; never called.
void *allocVars()
{
    return nullptr;
}
void freeVars(void *) {}
void cfgChange(ZlvObject *, const char *) {}
void logEntry(ZlvObject *, ZlvEvent *, va_list) {}
void process(ZlvObject *, ZlvEvent *, va_list) {}
int32_t isLoggable(ZlvObject *, ZlvEvent *, va_list)
{
    return 1;
}
void openEntry(ZlvObject *) {}
void closeEntry(ZlvObject *) {}
UChar *format(ZlvObject *, ZlvEvent *, va_list)
{
    return nullptr;
}
char *header(ZlvObject *)
{
    return nullptr;
}
char *trailer(ZlvObject *)
{
    return nullptr;
}
UChar *bindMsg(ZlvI18Msg *, va_list)
{
    return nullptr;
}

void addAll(const char *prefix, bool given)
{
    std::string name = prefix;
    auto pick = [given](auto *entry) { return given ? entry : nullptr; };
    ZlvAddLoggerClass((name + "logger").c_str(), nullptr, pick(allocVars), pick(freeVars),
                      pick(cfgChange), pick(logEntry));
    ZlvAddFilterClass((name + "filter").c_str(), nullptr, pick(allocVars), pick(freeVars),
                      pick(cfgChange), pick(process), pick(isLoggable), pick(logEntry));
    ZlvAddHandlerClass((name + "handler").c_str(), nullptr, pick(allocVars), pick(freeVars),
                       pick(cfgChange), pick(process), pick(openEntry), pick(closeEntry));
    ZlvAddUFormatterClass((name + "formatter").c_str(), nullptr, pick(allocVars), pick(freeVars),
                          pick(cfgChange), pick(format), pick(header), pick(trailer),
                          pick(bindMsg));
}

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
    Names filters = all(ZlvGetFilterClasses());
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
        return std::vector{all(ZlvGetLoggerClasses()), all(ZlvGetFilterClasses()),
                           all(ZlvGetHandlerClasses()), all(ZlvGetFormatterClasses())};
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
        Names names = all(ZlvGetLoggerClasses());
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

struct Query {
    const char *name;
    StringGroupIterator (*ask)();
    StringGroupIterator (*twin)();
    std::vector<std::string> builtin;
};

class ZlvObjClassQuery : public ToolkitFixture, public testing::WithParamInterface<Query> {
protected:
    static Names all(StringGroupIterator at)
    {
        Names names;
        for (; ZlvStringGroupIterHasNext(at); at = ZlvStringGroupIterNext(at))
            names.push_back(taken(ZlvStringGroupIterGet(at)).value_or("(none)"));
        return names;
    }
};

TEST_P(ZlvObjClassQuery, ListsTheBuiltinClassesOfItsKindAfterOpen)
{
    open();
    EXPECT_EQ(all(GetParam().ask()), GetParam().builtin);
}

TEST_P(ZlvObjClassQuery, ListsTheApplicationsClassesInTheOrderOfTheirRegistration)
{
    open();
    addAll("b_", false);
    addAll("a_", false);
    Names expected = GetParam().builtin;
    expected.push_back(std::string("b_") + GetParam().name);
    expected.push_back(std::string("a_") + GetParam().name);
    EXPECT_EQ(all(GetParam().ask()), expected);
}

TEST_P(ZlvObjClassQuery, GivesNothingWhileThereIsNoRegistry)
{
    EXPECT_EQ(GetParam().ask(), nullptr);
}

TEST_P(ZlvObjClassQuery, ItsTwinGivesTheSame)
{
    open();
    EXPECT_EQ(GetParam().twin(), GetParam().ask());
}

INSTANTIATE_TEST_SUITE_P(
    , ZlvObjClassQuery,
    testing::Values(
        Query{"logger",
              ZlvGetLoggerClasses,
              zlvIntlGetLoggerClasses,
              {"zlv_basiclogger", "zlv_pdlogger"}},
        Query{"filter",
              ZlvGetFilterClasses,
              zlvIntlGetFilterClasses,
              {"zlv_levelfilter", "zlv_msgidfilter"}},
        Query{"handler", ZlvGetHandlerClasses, zlvIntlGetHandlerClasses, {"zlv_consolehandler"}},
        Query{"formatter",
              ZlvGetFormatterClasses,
              zlvIntlGetFormatterClasses,
              {"zlv_basicformatter", "zlv_xmlformatter", "zlv_vyxtraceformatter"}}),
    [](const auto &row) { return std::string(row.param.name); });

/// "app" with one listener, a filter of a class of the test's own, which has one recorder.
class ZlvObjClassFilter : public RecordedToolkit {
protected:
    void addFilter(const char *className)
    {
        ZlvRemListener(app_, recorder_);
        filter_ = filter("filter", className);
        ZlvAddListener(app_, filter_);
        ZlvAddListener(filter_, recorder_);
    }

    /// How many events reach the recorder through a class whose accept entry gives RESULT.
    size_t passedWhenAcceptGives(int32_t (*entry)(ZlvObject *, ZlvEvent *, va_list))
    {
        ZlvAddFilterClass("mine", nullptr, nullptr, nullptr, nullptr, nullptr, entry, nullptr);
        addFilter("mine");
        log(app_, u"text");
        return records().size();
    }

    ZlvObject *filter_ = nullptr;
};

TEST_F(ZlvObjClassFilter, WithoutEntriesFiltersByLevel)
{
    ZlvAddFilterClass("mine", nullptr, nullptr, nullptr, nullptr, nullptr, nullptr, nullptr);
    addFilter("mine");
    filter_->filter.level = ZLV_LEVEL_WARN;
    ZlvLogInfo(app_, "bundle", "key");
    EXPECT_EQ(records().size(), 0u);
    ZlvLogWarn(app_, "bundle", "key");
    EXPECT_EQ(records().size(), 1u);
}

TEST_F(ZlvObjClassFilter, WithoutEntriesIsTransparentAtFirst)
{
    ZlvAddFilterClass("mine", nullptr, nullptr, nullptr, nullptr, nullptr, nullptr, nullptr);
    addFilter("mine");
    ZlvLogInfo(app_, "bundle", "key");
    EXPECT_EQ(records().size(), 1u);
}

TEST_F(ZlvObjClassFilter, PassesWhatItsAcceptEntryAnswersWithOne)
{
    EXPECT_EQ(passedWhenAcceptGives([](ZlvObject *, ZlvEvent *, va_list) { return 1; }), 1u);
}

TEST_F(ZlvObjClassFilter, PassesWhatItsAcceptEntryAnswersWithOneInTheLowEightBits)
{
    EXPECT_EQ(passedWhenAcceptGives([](ZlvObject *, ZlvEvent *, va_list) { return 0x101; }), 1u);
}

TEST_F(ZlvObjClassFilter, RefusesWhatItsAcceptEntryAnswersWithTwo)
{
    EXPECT_EQ(passedWhenAcceptGives([](ZlvObject *, ZlvEvent *, va_list) { return 2; }), 0u);
}

TEST_F(ZlvObjClassFilter, RefusesWhatItsAcceptEntryAnswersWithZero)
{
    EXPECT_EQ(passedWhenAcceptGives([](ZlvObject *, ZlvEvent *, va_list) { return 0; }), 0u);
}

TEST_F(ZlvObjClassFilter, PassesNothingWithoutALogEntry)
{
    ZlvAddFilterClass("mine", nullptr, nullptr, nullptr, nullptr, nullptr, nullptr, nullptr);
    zlvToolkitGetClassDef("mine")->filter.fLog = nullptr;
    addFilter("mine");
    log(app_, u"text");
    EXPECT_EQ(records().size(), 0u);
}

TEST_F(ZlvObjClassFilter, PassesNothingWithoutAnAcceptEntry)
{
    ZlvAddFilterClass("mine", nullptr, nullptr, nullptr, nullptr, nullptr, nullptr, nullptr);
    zlvToolkitGetClassDef("mine")->filter.fIsLoggable = nullptr;
    addFilter("mine");
    log(app_, u"text");
    EXPECT_EQ(records().size(), 0u);
}

TEST_F(ZlvObjClassFilter, TheProcessEntryIgnoresANullFilterAndOtherKinds)
{
    ZlvBasicFilterFProcess(nullptr, nullptr, noArgs());
    ZlvBasicFilterFProcess(app_, nullptr, noArgs());
    EXPECT_EQ(records().size(), 0u);
}

TEST_F(ZlvObjClassFilter, TheArgumentsOfTheCallReachTheListeners)
{
    addFilter("zlv_levelfilter");
    ZlvLogUText(app_, u"{0} and {1}", u"one", u"two");
    ASSERT_EQ(records().size(), 1u);
    EXPECT_EQ(records()[0].text, u"one and two");
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
