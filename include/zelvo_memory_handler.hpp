// SPDX-License-Identifier: Apache-2.0
/*
 * zelvo_memory_handler.hpp - a handler that keeps its events in memory, for the tests of
 * applications. Part of the C++ layer; see zelvo.hpp.
 */
#ifndef ZELVO_MEMORY_HANDLER_HPP
#define ZELVO_MEMORY_HANDLER_HPP

#include <cstddef>
#include <optional>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

#include "zelvo_class.hpp"
#include "zelvo_object.hpp"

namespace zelvo {
inline namespace v1 {

/** What a MemoryHandler keeps of one event; a copy of its own. */
struct KeptEvent {
    double time = 0;                 /**< whole milliseconds since 1970-01-01 00:00 UTC */
    ZlvLevel level = ZLV_LEVEL_NONE; /**< ZLV_LEVEL_NONE for an event without level */
    bool isMessage = false;          /**< true for a message of a bundle */
    std::u16string text;             /**< the message, bound; empty when it could not be */
    int32_t icuError = 0;            /**< UErrorCode that binding left */
    std::string bundle;              /**< name of the bundle; empty for debug and text calls */
    std::string key;                 /**< key in the bundle; empty for debug and text calls */
    std::string messageId;           /**< identifier of the message; empty while none is set */
    std::vector<std::pair<std::string, std::string>>
        properties; /**< in the order of their setting */

    /**
     * Looks a property up.
     *
     * @param name  property name, such as "zlv_prop_srcfile"
     * @return the value, lent; null when there is none
     * @lock none
     */
    const std::string *property(std::string_view name) const noexcept
    {
        for (const auto &property : properties)
            if (property.first == name)
                return &property.second;
        return nullptr;
    }
};

namespace detail {

inline std::string textOrEmpty(const char *text)
{
    return text != nullptr ? text : "";
}

inline std::vector<std::pair<std::string, std::string>> propertiesOf(const ZlvEvent *event)
{
    std::vector<std::pair<std::string, std::string>> all;
    if (event->properties == nullptr)
        return all;
    for (const auto *node = event->properties->first; node != nullptr; node = node->next)
        if (node->value != nullptr)
            all.emplace_back(textOrEmpty(node->key), node->value);
    return all;
}

inline KeptEvent keptEvent(const Event &event)
{
    KeptEvent kept;
    kept.time = event.time();
    kept.level = event.level();
    kept.isMessage = event.isMessage();
    kept.text = event.text().view();
    if (const ZlvI18Msg *message = event.message()) {
        kept.icuError = message->icuError;
        kept.bundle = textOrEmpty(message->bundle);
        kept.key = textOrEmpty(message->key);
    }
    kept.messageId = event.messageId().view();
    kept.properties = propertiesOf(event.get());
    return kept;
}

/// The state of a handler that keeps events.
struct EventMemory {
    std::vector<KeptEvent> events;

    void process(Self self, Event event) noexcept
    {
        events.push_back(keptEvent(event));
        self.passOn(event);
    }
};

} // namespace detail

/**
 * Holds a handler that keeps each event it gets, with its message bound in the locale of the event
 * or ICU's default one, and hands it on. Any thread may log and read at any time: reading takes the
 * API mutex, hence no entry of a class may do it. Memory grows until clear(), and a lack of it ends
 * the program.
 *
 * The events belong to the handler object: every handle of the same name reads the same ones, and
 * they go with the object.
 *
 * @lock takes the API mutex, unless the handle is empty
 */
class MemoryHandler : public Handler {
public:
    /** The name that the class is registered under, for properties files. */
    static constexpr const char *className = "zelvo_memoryhandler";

    /**
     * Registers the class. The constructor does so; a properties file that names the class for the
     * listeners of zelvo.errorLogger wants it before the toolkit is opened.
     */
    static void addClass() noexcept { addHandlerClass<detail::EventMemory>(className); }

    /**
     * Gets the handler of that name, or creates it.
     *
     * @param name  object name; the handle is empty if an object of another class has it
     */
    explicit MemoryHandler(const char *name) noexcept : Handler(registered(name)) {}

    /**
     * Copies the events.
     *
     * @return all events since the last clear(), oldest first
     */
    std::vector<KeptEvent> events() const
    {
        std::vector<KeptEvent> copy;
        withState<detail::EventMemory>(
            *this, [&copy](const detail::EventMemory &memory) { copy = memory.events; });
        return copy;
    }

    /**
     * Copies the newest event.
     *
     * @return the event; nothing when there is none
     */
    std::optional<KeptEvent> last() const
    {
        std::optional<KeptEvent> copy;
        withState<detail::EventMemory>(*this, [&copy](const detail::EventMemory &memory) {
            if (!memory.events.empty())
                copy = memory.events.back();
        });
        return copy;
    }

    /**
     * Counts the events.
     *
     * @return how many there have been since the last clear()
     */
    std::size_t count() const noexcept
    {
        std::size_t number = 0;
        withState<detail::EventMemory>(
            *this, [&number](const detail::EventMemory &memory) { number = memory.events.size(); });
        return number;
    }

    /** Forgets the events. */
    void clear() const noexcept
    {
        withState<detail::EventMemory>(*this,
                                       [](detail::EventMemory &memory) { memory.events.clear(); });
    }

private:
    static Handler registered(const char *name) noexcept
    {
        addClass();
        return Handler(name, className);
    }
};

} // namespace v1
} // namespace zelvo

#endif
