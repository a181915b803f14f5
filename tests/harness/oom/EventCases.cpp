// SPDX-License-Identifier: Apache-2.0
// Messages and events.
#include <utility>

#include "PlainCase.h"
#include "ZlvLocaleName.h"

namespace zelvo_test {
namespace {

/// A text that is longer than the area in which texts are first made.
constexpr const UChar *LONG_PATTERN =
    u"0123456789012345678901234567890123456789012345678901234567890123456789012345678901234567890"
    u"0123456789012345678901234567890123456789012345678901234567890123456789012345678901234567890"
    u"0123456789012345678901234567890123456789012345678901234567890123456789012345678901234567890";

Case bind(const char *name, UChar *(*call)(ZlvI18Msg *, va_list), const char *bundle,
          const UChar *text)
{
    Case bound{.name = name, .nothing = "null"};
    bound.run = [=](World *world, Fault &fault) {
        ZlvI18Msg *message = ZlvAllocUI18Msg(bundle, bundle != nullptr ? "plain" : nullptr, text);
        const std::string answer =
            answerOf(fault, [&] { return call(message, world->args); }) + textOf(message);
        ZlvFreeI18Msg(message);
        return answer;
    };
    bound.nothing = "null" + [&] {
        ZlvI18Msg *message = ZlvAllocUI18Msg(bundle, bundle != nullptr ? "plain" : nullptr, text);
        const std::string unchanged = textOf(message);
        ZlvFreeI18Msg(message);
        return unchanged;
    }();
    return bound;
}

void addMessages(Cases &cases)
{
    append(
        cases,
        {PAIR(AllocUI18Msg), PAIR(CopyI18Msg),
         plainCase<Owner::CALLEE>("zlvGetI18MsgParmList", Kind::Logger, zlvGetI18MsgParmList),
         specialCase(
             "ZlvCopyI18Msg parameters", Kind::Logger,
             [](World &world) { return ZlvCopyI18Msg(world.event()->message); },
             [](World *world) {
                 ZlvParmListAppend(zlvGetI18MsgParmList(world->event()->message),
                                   world->sample<ZlvParm *>());
             }),
         bind("ZlvBindUI18Msg", ZlvBindUI18Msg, nullptr, u"text"),
         bind("zlvIntlBindUI18Msg", zlvIntlBindUI18Msg, nullptr, LONG_PATTERN),
         bind("ZlvBindUI18Msg bundle", ZlvBindUI18Msg, ZELVO_TEST_BUNDLES "/zelvomsg", nullptr)});
}

/// A locale that no one has named before: a name that is known needs no memory any more.
const char *freshLocale()
{
    static std::string name;
    static int number = 0;
    name = "x" + std::to_string(++number);
    return name.c_str();
}

void addLocales(Cases &cases)
{
    Cases calls{
        specialCase("internLocaleName", Kind::Logger,
                    [](World &) { return zelvo::internLocaleName(freshLocale()) != nullptr; }),
        specialCase("zlvSetI18MsgLocale", Kind::Logger,
                    [](World &world) {
                        zlvSetI18MsgLocale(world.event()->message, freshLocale());
                        return std::exchange(world.event()->message->locale, nullptr) != nullptr;
                    }),
        specialCase("zlvSetEventLocale", Kind::Logger, [](World &world) {
            zlvSetEventLocale(world.event(), freshLocale());
            return std::exchange(world.event()->locale, nullptr) != nullptr;
        })};
    for (Case &call : calls)
        call.keeps = 1;
    append(cases, calls);
}

/// An event without an identifier gets the one that its text begins with, or else an empty one.
Case identifierCase()
{
    Case made{.name = "zlvPDXMLUFormatterCacheMessageID", .nothing = "''"};
    made.run = [](World *world, Fault &fault) {
        ZlvEvent *event = ZlvVaAllocUEvent(ZLV_LEVEL_ERROR, nullptr, nullptr,
                                           u"TIL0007E The drawer is jammed", world->args);
        fault.during([&] { zlvPDXMLUFormatterCacheMessageID(nullptr, event, world->args); });
        const std::string answer = textOf(event->messageId);
        ZlvFreeEvent(event);
        return answer;
    };
    return made;
}

void addEvents(Cases &cases)
{
    append(cases, {PLAIN(ZlvVaAllocUEvent),
                   specialCase("ZlvBindEventUMsg", Kind::Logger,
                               [](World &world) {
                                   return ZlvBindEventUMsg(world.event(), zlvIntlBindUI18Msg,
                                                           world.args);
                               }),
                   PLAIN(ZlvSetEventMessageId), identifierCase(), PLAIN(ZlvGetEventMessageId),
                   PLAIN(zlvGetEventLocale)});
    for (Case &call : cases)
        if (call.name.starts_with("ZlvGetEventMessageId") || call.name == "zlvGetEventLocale")
            call.prepare = [](World *world) {
                ZlvSetEventMessageId(world->event(), "ABC0001E");
                zlvSetEventLocale(world->event(), "de");
            };
}

} // namespace

void addEventCases(Cases &cases)
{
    addMessages(cases);
    addLocales(cases);
    addEvents(cases);
}

} // namespace zelvo_test
