// SPDX-License-Identifier: Apache-2.0
// Whole records.
#include "Arguments.h"
#include "Choices.h"
#include "Messages.h"
#include "Steps.h"
#include "support/VaList.h"

using zelvo_test::taken;

namespace zelvo_equivalence {
namespace {

void noteStatus(Transcript &transcript, const ZlvStatus &status)
{
    transcript.result("type", int64_t{status.type});
    transcript.result("code", int64_t{status.code});
    transcript.result("icu", int64_t{status.icuError});
    transcript.count(status.icuError == U_ZERO_ERROR ? "records bound" : "records not bound");
}

/// Logs by CALL(logger, list), and notes what has come out of it.
template <class Call>
void logBy(World &world, const Pattern &pattern, Call call)
{
    const size_t number = world.random.below(Tree::LOGGERS);
    const Arguments arguments{world.random, pattern, world.transcript};
    setEventTime(world.clock.now());
    world.transcript.note("logger", static_cast<int64_t>(number));
    arguments.with([&](va_list args) {
        noteStatus(world.transcript, call(world.tree->logger(number), args));
    });
    for (const UText &record : takeRecords()) {
        world.transcript.result("is", record);
        world.transcript.count("records");
    }
    if (number == 0)
        world.readLog();
}

void moveClock(World &world)
{
    if (!world.random.oneIn(4))
        world.clock.move(world.random, world.transcript);
}

/// Gives an event some of the properties that formatters look for.
void decorate(World &world, ZlvEvent *event)
{
    static constexpr const char *names[] = {"zlv_prop_srcfile", "zlv_prop_srcfunction",
                                            "zlv_prop_srcline", "organization",
                                            "product",          "component",
                                            "client",           "server",
                                            "serverFormat",     "threadId",
                                            "processId",        "correlationId",
                                            "anything else"};
    static constexpr const char *values[] = {"17",        "-5", "2147483648",   "main.c",
                                             "host.test", "",   "\xC3\xA4\xFF", "<&>"};
    for (uint32_t i = world.random.below(6); i > 0; --i)
        ZlvSetEventProp(event, world.random.of(names), world.random.of(values));
    if (world.random.oneIn(4))
        ZlvSetEventMessageId(event, world.random.oneIn(2) ? "ABC0001E" : "");
    if (world.random.oneIn(3))
        zlvSetEventLocale(event, anyLocale(world.random));
}

} // namespace

void logMessage(World &world)
{
    moveClock(world);
    const Message message = anyBundleMessage(world);
    using Call = ZlvStatus (*)(ZlvObject *, const char *, const char *, va_list);
    static constexpr Call calls[] = {ZlvLogUMsgVA, ZlvLogInfoVA, ZlvLogErrorVA, ZlvLogFatalVA};
    const Call call = world.random.of(calls);
    logBy(world, message.pattern, [&](ZlvObject *logger, va_list args) {
        return call(logger, message.bundle, message.key, args);
    });
}

void logText(World &world)
{
    moveClock(world);
    const Pattern pattern = world.patterns.next(world.random);
    world.transcript.note("pattern", UText{pattern.text});
    const bool hasPlace = world.random.oneIn(2);
    logBy(world, pattern, [&](ZlvObject *logger, va_list args) {
        return hasPlace ? ZlvLogDebugMinVA(logger, "shop.c", "sell", 42, pattern.text.c_str(), args)
                        : ZlvLogUTextVA(logger, pattern.text.c_str(), args);
    });
}

/// One event goes through several formatters, as it does behind a logger.
void formatEvent(World &world)
{
    moveClock(world);
    const Message message = anyMessage(world);
    const Arguments arguments{world.random, message.pattern, world.transcript};
    ZlvEvent *event = ZlvVaAllocUEvent(ZLV_LEVEL_WARN, message.bundle, message.key, message.text(),
                                       zelvo_test::noArgs());
    event->time = world.clock.now();
    decorate(world, event);
    for (uint32_t i = 1 + world.random.below(3); i > 0; --i)
        arguments.with([&](va_list args) {
            ZlvObject *handler = world.tree->handler(world.random.below(Tree::FORMATTERS));
            world.transcript.result("is", taken(ZlvUHandlerDoFmt(handler, event, args)));
            world.transcript.result("icu", int64_t{event->message->icuError});
            world.transcript.count("records");
        });
    ZlvFreeEvent(event);
}

} // namespace zelvo_equivalence
