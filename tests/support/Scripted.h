// SPDX-License-Identifier: Apache-2.0
// Classes whose entries do what a test tells them: foreign code in the middle of the library's own
// walks. Entries run with the API mutex held, so scripts call the zlvIntl twins.
#pragma once

#include <functional>
#include <string>
#include <vector>

#include "ZlvIntl.h"

namespace zelvo_test {

/// What the entries do, all of them for every class below; an empty one does nothing.
struct Script {
    std::function<void *()> alloc;
    std::function<void(void *)> free;
    std::function<void(ZlvObject *, const std::string &)> change;
    std::function<void(ZlvObject *, ZlvEvent *)> process;
    std::function<void(ZlvObject *)> open;
    std::function<void(ZlvObject *)> close;
};

/// Four classes, one of each kind, that note each event or close entry before they run the script.
class Scripted {
public:
    static constexpr const char *logger = "test_scripted_logger";
    static constexpr const char *filter = "test_scripted_filter";
    static constexpr const char *handler = "test_scripted_handler";
    static constexpr const char *formatter = "test_scripted_formatter";

    /// Registers the classes, with an empty script and nothing noted.
    static void addClasses()
    {
        script = Script{};
        clear();
        ZlvAddLoggerClass(logger, nullptr, alloc, release, change, nullptr);
        ZlvAddFilterClass(filter, nullptr, alloc, release, change, nullptr, nullptr, nullptr);
        ZlvAddHandlerClass(handler, nullptr, alloc, release, change, process, open, close);
        ZlvAddUFormatterClass(formatter, nullptr, alloc, release, change, nullptr, nullptr, nullptr,
                              nullptr);
    }

    static void clear()
    {
        processed.clear();
        closed.clear();
        changed.clear();
    }

    inline static Script script;
    inline static std::vector<std::string> processed; ///< handlers in the order of their events
    inline static std::vector<std::string> closed;    ///< handlers in the order of their closing
    inline static std::vector<std::string> changed;   ///< "object.property" of each notification

private:
    template <class Step, class... Arguments>
    static void run(const Step &step, Arguments... arguments)
    {
        // A copy: the script may replace itself while it runs.
        if (Step copy = step)
            copy(arguments...);
    }

    static void *alloc()
    {
        auto copy = script.alloc;
        return copy ? copy() : nullptr;
    }
    static void release(void *vars) { run(script.free, vars); }
    static void change(ZlvObject *object, const char *property)
    {
        changed.push_back(std::string(object->name) + "." + property);
        ZlvBasicHandlerFCfgChange(object, property);
        run(script.change, object, std::string(property));
    }
    static void process(ZlvObject *object, ZlvEvent *event, va_list)
    {
        processed.emplace_back(object->name);
        run(script.process, object, event);
    }
    static void open(ZlvObject *object) { run(script.open, object); }
    static void close(ZlvObject *object)
    {
        closed.emplace_back(object->name);
        run(script.close, object);
    }
};

} // namespace zelvo_test
