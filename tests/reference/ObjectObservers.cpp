// SPDX-License-Identifier: Apache-2.0
// What the properties of all objects, of loggers and of filters do.
#include <map>

#include "Observers.h"

namespace zelvo_test {
namespace {

struct LevelName {
    ZlvLevel level;
    const char *name;
};

/// Each level, from the highest down, and a number below them all.
constexpr LevelName LEVELS[] = {
    {ZLV_LEVEL_FATAL, "FATAL"},         {ZLV_LEVEL_ERROR, "ERROR"},
    {ZLV_LEVEL_WARN, "WARN"},           {ZLV_LEVEL_INFO, "INFO"},
    {ZLV_LEVEL_DEBUG_MIN, "DEBUG_MIN"}, {ZLV_LEVEL_DEBUG_MID, "DEBUG_MID"},
    {ZLV_LEVEL_DEBUG_MAX, "DEBUG_MAX"}, {1, "everything"},
};

template <class Test>
std::string leastLevel(Test takes)
{
    std::string least = "nothing";
    for (const LevelName &entry : LEVELS)
        if (takes(entry.level))
            least = entry.name;
    return least;
}

bool passes(Subject &subject, const Event &event)
{
    bool passed = false;
    withArgs([&](va_list args) {
        passed = ZlvIsLoggableByFilter(subject.object(), event.get(), args) == 1;
    });
    return passed;
}

bool passes(Subject &subject, const char *id, double time = 0)
{
    const Event event(u"text");
    event.get()->time += time;
    ZlvSetEventMessageId(event.get(), id);
    return passes(subject, event);
}

/// What a listener saw in the event that reached it last.
std::map<std::string, std::string> seen;

void see(ZlvObject * /*handler*/, ZlvEvent *event, va_list /*args*/)
{
    seen.clear();
    for (auto *node = event->properties->first; node != nullptr; node = node->next)
        seen[node->key] = node->value;
}

std::string hostName()
{
    char name[256] = "";
    const CxStatus status = CxSystemGetFQHostname(name, sizeof name);
    return status.type == CX_STATUS_OK ? name : "NO_HOSTNAME";
}

} // namespace

std::string classOfNewObject(Subject & /*subject*/, const char * /*key*/)
{
    ZlvObject *fresh = ZlvGetObject("subject.fresh", nullptr); // inherits from the subject
    if (fresh == nullptr)
        return "no object";
    const std::string name = fresh->objClass->name;
    ZlvReleaseObject(fresh);
    return name;
}

std::string isEnabled(Subject &subject, const char * /*key*/)
{
    return ZlvIsObjectEnabled(subject.object()) ? "on" : "off";
}

std::string listenersOf(Subject &subject, const char * /*key*/)
{
    std::string names;
    for (ListenerGroupIterator at = ZlvGetListeners(subject.object());
         ZlvListenerGroupIterHasNext(at); at = ZlvListenerGroupIterNext(at)) {
        ZlvObject *listener = ZlvListenerGroupIterGet(at);
        names += (names.empty() ? "" : " ") + textOf(ZlvGetObjectName(listener));
        ZlvReleaseObject(listener);
    }
    return names.empty() ? "none" : names;
}

std::string leastLevelLogged(Subject &subject, const char * /*key*/)
{
    return leastLevel([&](ZlvLevel level) { return ZlvIsLoggable(subject.object(), level) == 1; });
}

std::string leastLevelPassed(Subject &subject, const char * /*key*/)
{
    return leastLevel([&](ZlvLevel level) { return passes(subject, Event(u"text", level)); });
}

std::string stampOf(Subject &subject, const char *key)
{
    ZlvAddHandlerClass("reference_probe", nullptr, nullptr, nullptr, ZlvBasicHandlerFCfgChange, see,
                       nullptr, nullptr);
    ZlvObject *probe = ZlvGetObject("probe", "reference_probe");
    ZlvAddListener(subject.object(), probe);
    ZlvLogUText(subject.object(), u"text");
    ZlvRemListener(subject.object(), probe);
    ZlvReleaseObject(probe);
    if (seen.count(key) == 0)
        return "none";
    return seen[key] == hostName() ? "host name" : seen[key];
}

std::string modeOf(Subject &subject, const char * /*key*/)
{
    return passes(subject, "ABC0001W") ? "PASSTHRU" : "BLOCK";
}

std::string identifiersBlocked(Subject &subject, const char * /*key*/)
{
    std::string blocked;
    for (const char kind : {'W', 'I', 'E'})
        if (!passes(subject, (std::string("ABC0001") + kind).c_str()))
            blocked += (blocked.empty() ? "*" : " *") + std::string(1, kind);
    return blocked;
}

std::string quietTime(Subject &subject, const char * /*key*/)
{
    // A passing identifier begins a time of its own, so each try takes a new one.
    static int tries = 0;
    for (const int distance : {0, 1, 4999, 5000}) {
        const std::string id = "ABC" + std::to_string(1000 + ++tries) + "E";
        if (passes(subject, id.c_str()) && passes(subject, id.c_str(), distance))
            return std::to_string(distance);
    }
    return "longer";
}

} // namespace zelvo_test
