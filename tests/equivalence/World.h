// SPDX-License-Identifier: Apache-2.0
// What a scenario acts upon: a clock of its own, and a toolkit with a few loggers, handlers and
// formatters.
#pragma once

#include <array>
#include <fstream>
#include <string>

#include "Patterns.h"
#include "Random.h"
#include "Transcript.h"
#include "zelvo.h"

namespace zelvo_equivalence {

/// The time that events have. It mostly stays within a second, or goes on a little.
class Clock {
public:
    double now() const { return now_; }
    void move(Random &random, Transcript &transcript);

    /// The zone whose changes of offset are interesting.
    void watch(const char16_t *zone) { zone_ = zone; }

private:
    double within(Random &random) const;

    double nearTransition(Random &random) const;

    double now_ = 1709294400000.0;
    const char16_t *zone_ = u"UTC";
};

/// The objects of the toolkit, from an open to a close. Handlers of a class of this program keep
/// the records that their formatters make; the last listener of a logger writes a file.
class Tree {
public:
    static constexpr size_t FORMATTERS = 6;
    static constexpr size_t LOGGERS = 3;

    Tree(Random &random, Transcript &transcript);
    Tree(const Tree &) = delete;
    Tree &operator=(const Tree &) = delete;
    ~Tree();

    ZlvObject *logger(size_t number) const { return loggers_[number]; }
    ZlvObject *handler(size_t number) const { return handlers_[number]; }
    ZlvObject *formatter(size_t number) const { return formatters_[number]; }

    /// Sets a property of a formatter to something else, or removes it.
    void changeProperty(Random &random, Transcript &transcript);
    /// Destroys a formatter and makes another one in its place, be it at the same address.
    void replaceFormatter(Random &random, Transcript &transcript);

private:
    void change(size_t formatter, Random &random, Transcript &transcript);

    std::array<ZlvObject *, FORMATTERS> formatters_{};
    std::array<ZlvObject *, FORMATTERS> handlers_{};
    std::array<ZlvObject *, LOGGERS> loggers_{};
    ZlvObject *file_ = nullptr;
};

/// Everything that a step acts upon.
struct World {
    World(uint64_t seed, const char *transcriptPath);
    ~World();

    void openToolkit();
    void closeToolkit();

    /// Notes what has been added to the log file.
    void readLog();

    /// ICU can be brought to its end and used again only if no message has asked it for a date, so
    /// scenarios do one or the other.
    const bool endsIcu;
    /// ICU writes a locale that it does not know like the default one, and remembers that for a
    /// while when the default has changed. So the default stays in scenarios that have unknown
    /// locales.
    const bool hasUnknownLocales;

    Random random;
    Transcript transcript;
    Clock clock;
    Patterns patterns;
    Tree *tree = nullptr;
    std::ifstream log;
};

/// The time that the handlers of this program give to events.
void setEventTime(double time);
/// The records that they have made since the last call, one per handler that got the event.
std::vector<UText> takeRecords();
/// Registers the classes of this program.
void addClasses();

} // namespace zelvo_equivalence
