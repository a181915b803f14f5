// SPDX-License-Identifier: Apache-2.0
// What many configured objects cost: opening a properties file with so many of them, making them
// all, and looking one of them up. Meant to run in the order given here, without interleaving.
#include <array>
#include <deque>
#include <fstream>
#include <optional>

#include "support/Records.h"

using namespace zelvo_bench;

namespace {

constexpr int REPETITIONS = 3; // thousands of objects differ clearly enough

/// A part of a program has a logger, a filter, a handler and a formatter.
constexpr std::array<const char *, 4> ENDINGS{".log", ".filter", ".file", ".format"};

std::string partOf(int object)
{
    return "part" + std::to_string(object / static_cast<int>(ENDINGS.size()));
}

std::string nameOf(int object)
{
    return partOf(object) + ENDINGS[static_cast<size_t>(object) % ENDINGS.size()];
}

void writePart(std::ofstream &file, const std::string &part)
{
    file << part << ".log.className = zlv_basiclogger\n"
         << part << ".log.level = INFO\n"
         << part << ".log.listenerNames = " << part << ".filter\n"
         << part << ".filter.className = zlv_levelfilter\n"
         << part << ".filter.level = WARN\n"
         << part << ".filter.listenerNames = " << part << ".file\n"
         << part << ".file.className = zlv_filehandler\n"
         << part << ".file.fileName = " << part << ".log\n"
         << part << ".file.formatterName = " << part << ".format\n"
         << part << ".format.className = zlv_basicformatter\n"
         << part << ".format.separator = ;\n"
         << part << ".format.locale = de\n";
}

std::string properties(const Place &place, int objects)
{
    const std::string name = place.file(std::to_string(objects) + ".properties");
    std::ofstream file(name);
    for (int i = 0; i < objects; i += static_cast<int>(ENDINGS.size()))
        writePart(file, partOf(i));
    return name;
}

/// Loggers first: each makes the others of its part.
std::deque<Held> allObjects(int objects)
{
    std::deque<Held> held;
    for (int i = 0; i < objects; ++i)
        held.emplace_back(nameOf(i), nullptr);
    return held;
}

void measureOpening(const std::string &file, int objects)
{
    measureItself("open " + std::to_string(objects), [=] {
        std::optional<OpenToolkit> toolkit;
        return secondsOf([&] { toolkit.emplace(file.c_str()); });
    })->Repetitions(REPETITIONS);
}

void measureMaking(const std::string &file, int objects)
{
    measureItself("make " + std::to_string(objects), [=] {
        const OpenToolkit toolkit(file.c_str());
        std::deque<Held> held;
        return secondsOf([&] { held = allObjects(objects); });
    })->Repetitions(REPETITIONS);
}

/// All objects of a properties file, while they are looked up.
struct World {
    OpenToolkit toolkit;
    std::deque<Held> objects;

    World(const std::string &file, int count) : toolkit(file.c_str()), objects(allObjects(count)) {}
};

/// All names in turn, neighbours far apart.
std::vector<std::string> scatteredNames(int objects)
{
    constexpr int64_t PRIME = 7919;
    std::vector<std::string> names;
    for (int i = 0; i < objects; ++i)
        names.push_back(nameOf(static_cast<int>(i * PRIME % objects)));
    return names;
}

void measureLookup(std::optional<World> &world, const std::string &file, int objects)
{
    const auto lookUpAll = [=, &world](benchmark::State &state) {
        if (!world || world->objects.size() != static_cast<size_t>(objects)) {
            world.reset();
            world.emplace(file, objects);
        }
        const std::vector<std::string> names = scatteredNames(objects);
        size_t next = 0;
        for ([[maybe_unused]] auto run : state) {
            ZlvReleaseObject(ZlvGetObject(names[next].c_str(), nullptr));
            next = next + 1 == names.size() ? 0 : next + 1;
        }
    };
    benchmark::RegisterBenchmark(("look up " + std::to_string(objects)).c_str(), lookUpAll)
        ->UseRealTime()
        ->Repetitions(REPETITIONS);
}

} // namespace

int main(int argc, char **argv)
{
    const Place place;
    std::optional<World> world;
    const std::array sizes{100, 1000, 10000};
    for (const int objects : sizes)
        measureOpening(properties(place, objects), objects);
    for (const int objects : sizes)
        measureMaking(properties(place, objects), objects);
    for (const int objects : sizes)
        measureLookup(world, properties(place, objects), objects);
    return runBenchmarks(argc, argv);
}
