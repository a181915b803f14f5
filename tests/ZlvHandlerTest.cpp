// SPDX-License-Identifier: Apache-2.0
// What all handlers share: the bound formatter, its header, trailer and records, and the empty
// entries.
#include "ZlvHandler.h"

#include "CxString.h"
#include "CxUString.h"
#include "support/BrokenMutex.h"
#include "support/Recorder.h"
#include "support/VaList.h"

namespace zelvo_test {
namespace {

struct FormatCall {
    ZlvObject *formatter;
    ZlvEvent *event;
    int argument;
};
FormatCall lastFormat;
ZlvObject *headerOf;
ZlvObject *trailerOf;

UChar *formatSeven(ZlvObject *formatter, ZlvEvent *event, va_list args)
{
    lastFormat = {formatter, event, va_arg(args, int)};
    return CxUStringDup(u"record");
}

char *giveHeader(ZlvObject *formatter)
{
    headerOf = formatter;
    return RkoStringDup("header");
}

char *giveTrailer(ZlvObject *formatter)
{
    trailerOf = formatter;
    return RkoStringDup("trailer");
}

class ZlvHandler : public ToolkitFixture {
protected:
    void SetUp() override
    {
        open();
        ZlvAddUFormatterClass("test_formatter", nullptr, nullptr, nullptr, nullptr, formatSeven,
                              giveHeader, giveTrailer, nullptr);
        handler_ = handler("handler");
        formatter_ = formatter("formatter", "test_formatter");
    }

    /// The name of the formatter that HANDLER gives, whose reference is let go.
    static Text boundTo(ZlvObject *handler)
    {
        ZlvObject *formatter = ZlvHandlerGetFormatter(handler);
        Text name = taken(ZlvGetObjectName(formatter));
        ZlvReleaseObject(formatter);
        return name;
    }

    ZlvObject *handler_ = nullptr;
    ZlvObject *formatter_ = nullptr;
};

/* Binding. */

TEST_F(ZlvHandler, StartsWithTheDefaultFormatter)
{
    EXPECT_EQ(boundTo(handler_), "zelvo.defaultFormatter");
}

TEST_F(ZlvHandler, GivesItsFormatterWithAReference)
{
    ZlvHandlerSetFormatter(handler_, formatter_);
    uint32_t before = formatter_->refCount;
    EXPECT_EQ(ZlvHandlerGetFormatter(handler_), formatter_);
    EXPECT_EQ(formatter_->refCount, before + 1);
    ZlvReleaseObject(formatter_);
}

TEST_F(ZlvHandler, HoldsAReferenceToItsFormatter)
{
    uint32_t before = formatter_->refCount;
    ZlvHandlerSetFormatter(handler_, formatter_);
    EXPECT_EQ(formatter_->refCount, before + 1);
    ZlvHandlerSetFormatter(handler_, nullptr);
    EXPECT_EQ(formatter_->refCount, before);
}

TEST_F(ZlvHandler, LetsTheFormerFormatterGo)
{
    ZlvHandlerSetFormatter(handler_, formatter_);
    uint32_t before = formatter_->refCount;
    ZlvHandlerSetFormatter(handler_, formatter("other"));
    EXPECT_EQ(formatter_->refCount, before - 1);
    EXPECT_EQ(boundTo(handler_), "other");
}

TEST_F(ZlvHandler, BoundAgainToItsFormatterKeepsOneReference)
{
    ZlvHandlerSetFormatter(handler_, formatter_);
    uint32_t before = formatter_->refCount;
    ZlvHandlerSetFormatter(handler_, formatter_);
    EXPECT_EQ(formatter_->refCount, before);
    EXPECT_EQ(boundTo(handler_), "formatter");
}

TEST_F(ZlvHandler, BoundAgainToAFormatterThatItAloneHoldsKeepsIt)
{
    ZlvObject *own = ZlvGetObject("own", "zlv_basicformatter");
    ZlvHandlerSetFormatter(handler_, own);
    ZlvReleaseObject(own);
    ZlvHandlerSetFormatter(handler_, own);
    EXPECT_EQ(boundTo(handler_), "own");
}

TEST_F(ZlvHandler, IsUnboundByNull)
{
    ZlvHandlerSetFormatter(handler_, nullptr);
    EXPECT_EQ(ZlvHandlerGetFormatter(handler_), nullptr);
    ZlvHandlerSetFormatter(handler_, nullptr);
    EXPECT_EQ(ZlvHandlerGetFormatter(handler_), nullptr);
}

TEST_F(ZlvHandler, KeepsAFormatterAliveThatNobodyElseHolds)
{
    ZlvObject *own = ZlvGetObject("own", "test_formatter");
    ZlvHandlerSetFormatter(handler_, own);
    ZlvReleaseObject(own);
    EXPECT_EQ(taken(ZlvHandlerGetFmtHeader(handler_)), "header");
}

TEST_F(ZlvHandler, OfAnotherKindHasNoFormatterAndTakesNone)
{
    for (ZlvObject *other : {logger("logger"), filter("filter"), formatter_}) {
        uint32_t before = formatter_->refCount;
        ZlvHandlerSetFormatter(other, formatter_);
        EXPECT_EQ(formatter_->refCount, before);
        EXPECT_EQ(ZlvHandlerGetFormatter(other), nullptr);
        EXPECT_EQ(ZlvHandlerGetFmtHeader(other), nullptr);
        EXPECT_EQ(ZlvHandlerGetFmtTrailer(other), nullptr);
        EXPECT_EQ(ZlvUHandlerDoFmt(other, nullptr, noArgs()), nullptr);
    }
}

TEST_F(ZlvHandler, OfNullGivesNothing)
{
    ZlvHandlerSetFormatter(nullptr, formatter_);
    EXPECT_EQ(ZlvHandlerGetFormatter(nullptr), nullptr);
    EXPECT_EQ(ZlvHandlerGetFmtHeader(nullptr), nullptr);
    EXPECT_EQ(ZlvHandlerGetFmtTrailer(nullptr), nullptr);
    EXPECT_EQ(ZlvUHandlerDoFmt(nullptr, nullptr, noArgs()), nullptr);
}

TEST_F(ZlvHandler, WithoutAClassGivesNothing)
{
    ZlvObject bare{};
    bare.handler.formatter = formatter_;
    ZlvHandlerSetFormatter(&bare, nullptr);
    EXPECT_EQ(bare.handler.formatter, formatter_);
    EXPECT_EQ(ZlvHandlerGetFormatter(&bare), nullptr);
    EXPECT_EQ(ZlvHandlerGetFmtHeader(&bare), nullptr);
    EXPECT_EQ(ZlvHandlerGetFmtTrailer(&bare), nullptr);
    EXPECT_EQ(ZlvUHandlerDoFmt(&bare, nullptr, noArgs()), nullptr);
}

TEST_F(ZlvHandler, GivesNothingWhenTheMutexCannotBeTaken)
{
    ZlvHandlerSetFormatter(handler_, formatter_);
    BrokenMutex broken;
    ZlvHandlerSetFormatter(handler_, nullptr);
    EXPECT_EQ(handler_->handler.formatter, formatter_);
    EXPECT_EQ(ZlvHandlerGetFormatter(handler_), nullptr);
    EXPECT_EQ(ZlvHandlerGetFmtHeader(handler_), nullptr);
    EXPECT_EQ(ZlvHandlerGetFmtTrailer(handler_), nullptr);
    EXPECT_EQ(ZlvUHandlerDoFmt(handler_, nullptr, noArgs()), nullptr);
}

TEST_F(ZlvHandler, TheInternalFormsTakeNoLock)
{
    ASSERT_EQ(zlvAPIMutexLock(), 1);
    zlvIntlHandlerSetFormatter(handler_, formatter_);
    ZlvObject *given = zlvIntlHandlerGetFormatter(handler_);
    EXPECT_EQ(given, formatter_);
    zlvIntlReleaseObject(given);
    EXPECT_EQ(taken(zlvIntlHandlerGetFmtHeader(handler_)), "header");
    EXPECT_EQ(taken(zlvIntlHandlerGetFmtTrailer(handler_)), "trailer");
    withArgs(
        [&](va_list args) {
            EXPECT_EQ(taken(zlvIntlUHandlerDoFmt(handler_, nullptr, args)), u"record");
        },
        7);
    zlvAPIMutexUnlock();
}

/* Header, trailer, record. */

TEST_F(ZlvHandler, FetchesTheHeaderFromItsFormatter)
{
    ZlvHandlerSetFormatter(handler_, formatter_);
    EXPECT_EQ(taken(ZlvHandlerGetFmtHeader(handler_)), "header");
    EXPECT_EQ(headerOf, formatter_);
}

TEST_F(ZlvHandler, FetchesTheTrailerFromItsFormatter)
{
    ZlvHandlerSetFormatter(handler_, formatter_);
    EXPECT_EQ(taken(ZlvHandlerGetFmtTrailer(handler_)), "trailer");
    EXPECT_EQ(trailerOf, formatter_);
}

TEST_F(ZlvHandler, HandsEventAndArgumentsToItsFormatter)
{
    ZlvHandlerSetFormatter(handler_, formatter_);
    ZlvEvent event{};
    withArgs(
        [&](va_list args) {
            EXPECT_EQ(taken(ZlvUHandlerDoFmt(handler_, &event, args)), u"record");
        },
        7);
    EXPECT_EQ(lastFormat.formatter, formatter_);
    EXPECT_EQ(lastFormat.event, &event);
    EXPECT_EQ(lastFormat.argument, 7);
}

TEST_F(ZlvHandler, WithoutAFormatterHasNoTexts)
{
    ZlvHandlerSetFormatter(handler_, nullptr);
    ZlvEvent event{};
    EXPECT_EQ(ZlvHandlerGetFmtHeader(handler_), nullptr);
    EXPECT_EQ(ZlvHandlerGetFmtTrailer(handler_), nullptr);
    EXPECT_EQ(ZlvUHandlerDoFmt(handler_, &event, noArgs()), nullptr);
}

TEST_F(ZlvHandler, BoundToAnotherKindHasNoTexts)
{
    ZlvHandlerSetFormatter(handler_, logger("logger"));
    ZlvEvent event{};
    EXPECT_EQ(boundTo(handler_), "logger");
    EXPECT_EQ(ZlvHandlerGetFmtHeader(handler_), nullptr);
    EXPECT_EQ(ZlvHandlerGetFmtTrailer(handler_), nullptr);
    EXPECT_EQ(ZlvUHandlerDoFmt(handler_, &event, noArgs()), nullptr);
}

TEST_F(ZlvHandler, HasNoTextWhoseEntryIsMissing)
{
    ZlvHandlerSetFormatter(handler_, formatter_);
    formatter_->objClass->formatter.fGetHeader = nullptr;
    formatter_->objClass->formatter.fGetTrailer = nullptr;
    formatter_->objClass->formatter.fFormat = nullptr;
    ZlvEvent event{};
    EXPECT_EQ(ZlvHandlerGetFmtHeader(handler_), nullptr);
    EXPECT_EQ(ZlvHandlerGetFmtTrailer(handler_), nullptr);
    EXPECT_EQ(ZlvUHandlerDoFmt(handler_, &event, noArgs()), nullptr);
}

/* Configuration. */

TEST_F(ZlvHandler, BindsTheFormatterThatIsNamed)
{
    uint32_t before = formatter_->refCount;
    setProp(handler_, "formatterName", "formatter");
    EXPECT_EQ(boundTo(handler_), "formatter");
    EXPECT_EQ(formatter_->refCount, before + 1);
}

TEST_F(ZlvHandler, HasNoFormatterAfterAnUnknownName)
{
    setProp(handler_, "formatterName", "nobody");
    EXPECT_EQ(ZlvHandlerGetFormatter(handler_), nullptr);
}

TEST_F(ZlvHandler, KeepsItsFormatterWhenTheNameIsRemoved)
{
    setProp(handler_, "formatterName", "formatter");
    setProp(handler_, "formatterName", nullptr);
    EXPECT_EQ(boundTo(handler_), "formatter");
}

TEST_F(ZlvHandler, KeepsItsFormatterWhenTheNameWasNeverSet)
{
    ZlvBasicHandlerFCfgChange(handler_, "formatterName");
    EXPECT_EQ(boundTo(handler_), "zelvo.defaultFormatter");
}

TEST_F(ZlvHandler, ThePropertyNameIsComparedWithCase)
{
    setProp(handler_, "formattername", "formatter");
    EXPECT_EQ(boundTo(handler_), "zelvo.defaultFormatter");
}

TEST_F(ZlvHandler, MakesTheNamedFormatterFromItsConfiguration)
{
    close();
    open("made.className=zlv_basicformatter\nhandler.className=zlv_consolehandler\n"
         "handler.formatterName=made\n");
    EXPECT_EQ(boundTo(handler("handler")), "made");
}

TEST_F(ZlvHandler, OtherPropertiesReachTheBasicObject)
{
    setProp(handler_, "logging", "off");
    EXPECT_EQ(ZlvIsObjectEnabled(handler_), 0);
}

TEST_F(ZlvHandler, AConfigurationChangeWithANullArgumentDoesNothing)
{
    setProp(handler_, "formatterName", "formatter");
    ZlvBasicHandlerFCfgChange(nullptr, "formatterName");
    ZlvBasicHandlerFCfgChange(handler_, nullptr);
    EXPECT_EQ(boundTo(handler_), "formatter");
}

/* The empty entries. */

TEST_F(ZlvHandler, TheEmptyEntriesDoNothing)
{
    ZlvEvent event{};
    std::string printed = console([&] {
        for (ZlvObject *object : {handler_, static_cast<ZlvObject *>(nullptr)}) {
            ZlvBasicHandlerFProcess(object, &event, noArgs());
            ZlvBasicHandlerFProcess(object, nullptr, noArgs());
            ZlvBasicHandlerFOpen(object);
            ZlvBasicHandlerFClose(object);
        }
    });
    EXPECT_EQ(printed, "");
    EXPECT_EQ(event.status.code, 0);
}

TEST_F(ZlvHandler, RegisteredWithNothingTakesEventsAndDoesNothing)
{
    ZlvAddHandlerClass("test_bare", nullptr, nullptr, nullptr, nullptr, nullptr, nullptr, nullptr);
    ZlvObject *app = logger("app");
    ZlvAddListener(app, handler("bare", "test_bare"));
    EXPECT_EQ(console([&] { EXPECT_EQ(log(app, u"text").type, '-'); }), "");
}

} // namespace
} // namespace zelvo_test
