// SPDX-License-Identifier: Apache-2.0
// A scenario: steps that depend on a seed alone, and a transcript of all that they gave.
//     zelvo_kept_scenario SEED STEPS TRANSCRIPT
#include <cstdlib>
#include <numeric>

#include "Openings.h"
#include "Steps.h"

using namespace zelvo_equivalence;

namespace {

struct Kind {
    const char *name;
    void (*run)(World &);
    uint32_t weight; ///< how often it is taken, compared with the others
};

constexpr Kind KINDS[] = {
    {"logMessage", logMessage, 160},
    {"logText", logText, 200},
    {"formatEvent", formatEvent, 160},
    {"bindMessage", bindMessage, 200},
    {"formatDate", formatDate, 120},
    {"appendNumber", appendNumber, 60},
    {"convertText", convertText, 50},
    {"convertBytes", convertBytes, 50},
    {"describe", describe, 10},
    {"callTogether", callTogether, 4},
    {"changeLocale", changeLocale, 20},
    {"changeZone", changeZone, 25},
    {"changeZoneVariable", changeZoneVariable, 5},
    {"meetZoneLate", meetZoneLate, 5},
    {"changeConverter", changeConverter, 15},
    {"changeDataDirectory", changeDataDirectory, 5},
    {"changeBundle", changeBundle, 5},
    {"changeProperty", changeProperty, 60},
    {"replaceFormatter", replaceFormatter, 10},
    {"reopen", reopen, 4},
    {"reopenWithoutIcu", reopenWithoutIcu, 4},
};

const Kind &anyKind(Random &random)
{
    static const uint32_t all =
        std::accumulate(std::begin(KINDS), std::end(KINDS), 0U,
                        [](uint32_t sum, const Kind &kind) { return sum + kind.weight; });
    uint32_t ticket = random.below(all);
    const Kind *kind = KINDS;
    for (; ticket >= kind->weight; ++kind)
        ticket -= kind->weight;
    return *kind;
}

int play(uint64_t seed, uint64_t steps, const char *transcriptPath)
{
    World world{seed, transcriptPath};
    if (!world.transcript.isOpen())
        return 1;
    world.transcript.beginStep(0, "begin");
    setDefaults(world);
    world.openToolkit();
    for (uint64_t i = 1; i <= steps; ++i) {
        const Kind &kind = anyKind(world.random);
        world.transcript.beginStep(i, kind.name);
        kind.run(world);
    }
    world.transcript.finish();
    return 0;
}

} // namespace

int main(int argc, char **argv)
{
    if (argc != 4)
        return 2;
    const int result =
        play(std::strtoull(argv[1], nullptr, 10), std::strtoull(argv[2], nullptr, 10), argv[3]);
    printOpenings();
    return result;
}
