// SPDX-License-Identifier: Apache-2.0
// Records: formatting them, passing them on, writing them, and the logging calls as a whole.
#include "Case.h"
#include "ZlvToolkitIntl.h"

namespace zelvo_test {
namespace {

constexpr const char *BUNDLE = ZELVO_TEST_BUNDLES "/zelvomsg";

/// An event with everything that a formatter shows.
ZlvEvent *richEvent()
{
    ZlvEvent *event = ZlvVaAllocUEvent(ZLV_LEVEL_ERROR, BUNDLE, "count", nullptr, noArgs());
    ZlvSetEventProp(event, "zlv_prop_srcfile", "main.c");
    ZlvSetEventProp(event, "zlv_prop_srcfunction", "main");
    ZlvSetEventPropInt(event, "zlv_prop_srcline", 12);
    for (const char *property : {"organization", "product", "component", "client", "server",
                                 "serverFormat", "productInstance", "correlationId", "own"})
        ZlvSetEventProp(event, property, property);
    ZlvSetEventPropLong(event, "processId", 4711);
    ZlvSetEventPropLong(event, "threadId", 815);
    return event;
}

/// CALL(object, event, args) with an event of its own, whose message takes one argument; what the
/// call left on the event is its answer.
template <class Call>
Case eventCase(const char *name, Kind kind, Call call)
{
    Case made{.name = name, .kind = kind, .mayCut = true};
    made.run = [call](World *world, Fault &fault) {
        ZlvEvent *event = richEvent();
        withArgs([&](va_list args) { fault.during([&] { call(world->object(), event, args); }); },
                 5);
        const std::string answer = textOf(event->status);
        ZlvFreeEvent(event);
        return answer;
    };
    made.nothing = textOf(CxStatus{CX_STATUS_OK, 0});
    return made;
}

#define FORMAT(kind, call)                                                                         \
    eventCase(#call, Kind::kind, [](ZlvObject *formatter, ZlvEvent *event, va_list args) {         \
        UChar *record = call(formatter, event, args);                                              \
        FailAlloc spared(UINT32_MAX);                                                              \
        zlvI18PrintUCharAsLocal(stdout, record);                                                   \
        RkoMemoryFree(record);                                                                     \
    })

void addFormatters(Cases &cases)
{
    append(cases, {FORMAT(Formatter, ZlvBasicUFormatterFFormat),
                   FORMAT(XmlFormatter, ZlvPDXMLUFormatterFFormat),
                   FORMAT(TraceFormatter, ZlvVyxTraceUFormatterFFormat),
                   FORMAT(Handler, zlvIntlUHandlerDoFmt), FORMAT(Handler, ZlvUHandlerDoFmt)});
    append(cases, {specialCase("ZlvBasicUFormatterFormatDate", Kind::Formatter, [](World &world) {
               return ZlvBasicUFormatterFormatDate(world.object(), 0.0);
           })});
}

/// Gives the world's event what the pieces of a record show.
void enrichEvent(World *world)
{
    ZlvEvent *event = world->event();
    ZlvSetEventProp(event, "server", "server");
    ZlvSetEventProp(event, "zlv_prop_srcfile", "main.c");
    ZlvFreeI18Msg(event->message);
    event->message = ZlvAllocUI18Msg(BUNDLE, "count", nullptr);
}

#define EMIT(call, ...)                                                                            \
    specialCase(                                                                                   \
        #call, Kind::XmlFormatter,                                                                 \
        [](World &world) { return call(world.sample<CxUStringBuff *>(), __VA_ARGS__); },           \
        enrichEvent)

void addPieces(Cases &cases)
{
    append(cases, {EMIT(zlvPDXMLEmitULevel, ZLV_LEVEL_INFO),
                   EMIT(zlvPDXMLEmitUProductInfo, world.event(), 1, 1, 1, 1),
                   EMIT(zlvPDXMLEmitUSource, world.event()),
                   EMIT(zlvPDXMLEmitUTranslationInfo, world.event(), world.args)});
}

#define PROCESS(kind, entry) eventCase(#entry, Kind::kind, entry)

void addHandlers(Cases &cases)
{
    Cases calls{PROCESS(Handler, ZlvConsoleUHandlerFProcess),
                PROCESS(FileHandler, ZlvFileUHandlerFProcess),
                PROCESS(SharedFileHandler, ZlvMultiProcFileUHandlerFProcess),
                PROCESS(PDLogger, ZlvPDLoggerFLog),
                eventCase("ZlvMsgIdFilterFIsLoggable", Kind::MsgIdFilter,
                          [](ZlvObject *filter, ZlvEvent *event, va_list args) {
                              ZlvMsgIdFilterFIsLoggable(filter, event, args);
                          })};
    append(cases, calls);
}

/// A logger with a console, and a logging call of its own.
template <class Call>
Case logCase(const char *name, Call call)
{
    Case made{.name = name, .mayCut = true};
    made.run = [call](World *world, Fault &fault) {
        return answerOf(fault, [&] { return call(world->object()); });
    };
    made.prepare = [](World *world) {
        ZlvAddListener(world->object(), world->hold("console", "zlv_consolehandler"));
        ZlvSetObjProp(world->object(), "level", "ALL");
    };
    made.nothing = nothingOf<ZlvStatus>();
    return made;
}

ZlvStatus listed(ZlvStatus (*call)(ZlvObject *, const char *, const char *, va_list),
                 ZlvObject *logger)
{
    ZlvStatus status{};
    withArgs([&](va_list args) { status = call(logger, BUNDLE, "count", args); }, 5);
    return status;
}

ZlvStatus listed(ZlvStatus (*call)(ZlvObject *, const char *, const char *, int32_t, const UChar *,
                                   va_list),
                 ZlvObject *logger)
{
    ZlvStatus status{};
    withArgs(
        [&](va_list args) {
            status = call(logger, "main.c", "main", 12, u"{0,number,integer}", args);
        },
        5);
    return status;
}

#define MESSAGE(call)                                                                              \
    logCase(#call, [](ZlvObject *logger) { return call(logger, BUNDLE, "count", 5); }),            \
        logCase(#call "VA", [](ZlvObject *logger) { return listed(call##VA, logger); })
#define DEBUG(call)                                                                                \
    logCase(#call,                                                                                 \
            [](ZlvObject *logger) {                                                                \
                return call(logger, "main.c", "main", 12, u"{0,number,integer}", 5);               \
            }),                                                                                    \
        logCase(#call "VA", [](ZlvObject *logger) { return listed(call##VA, logger); })

void addLogCalls(Cases &cases)
{
    append(cases, {MESSAGE(ZlvLogUMsg), MESSAGE(ZlvLogFatal), MESSAGE(ZlvLogError),
                   MESSAGE(ZlvLogWarn), MESSAGE(ZlvLogInfo), DEBUG(ZlvLogDebugMin),
                   DEBUG(ZlvLogDebugMid), DEBUG(ZlvLogDebugMax)});
    append(
        cases,
        {logCase("ZlvLogUText",
                 [](ZlvObject *logger) { return ZlvLogUText(logger, u"text {0}", u"of"); }),
         logCase("ZlvLogUTextVA",
                 [](ZlvObject *logger) {
                     ZlvStatus status{};
                     withArgs([&](va_list args) { status = ZlvLogUTextVA(logger, u"{0}", args); },
                              u"of");
                     return status;
                 }),
         logCase("zlvLogUMessageEntry",
                 [](ZlvObject *logger) {
                     return zlvLogUMessageEntry(logger, ZLV_LEVEL_INFO, BUNDLE, "plain", noArgs());
                 }),
         logCase("zlvLogUDebugEntry",
                 [](ZlvObject *logger) {
                     return zlvLogUDebugEntry(logger, ZLV_LEVEL_INFO, nullptr, "main", 0, u"text",
                                              noArgs());
                 }),
         logCase("zlvIntlLogVA",
                 [](ZlvObject *) { return zlvIntlLogVA(ZLV_LEVEL_ERROR, BUNDLE, "plain"); })});
}

} // namespace

void addRecordCases(Cases &cases)
{
    addFormatters(cases);
    addPieces(cases);
    addHandlers(cases);
    addLogCalls(cases);
}

} // namespace zelvo_test
