// SPDX-License-Identifier: Apache-2.0
// Plays an act with each of its allocations failing. Argument: the name of the act; or "faulty", to
// play acts with faults in them, all of which have to be found.
#include <cstring>

#include "LifeSweep.h"
#include "World.h"

using namespace zelvo_test;

namespace {

int tryActs(FILE *report, const char *name)
{
    for (const Act &act : everyAct()) {
        if (std::strcmp(act.name, name) != 0)
            continue;
        LifeSweep sweep(report, act);
        const uint32_t faults = sweep.run();
        printFigures(report, name, sweep.figures(), faults);
        return faults == 0 ? 0 : 1;
    }
    return 2;
}

int tryFaulty(FILE *report)
{
    size_t found = 0;
    for (const Act &act : faultyActs())
        found += LifeSweep(report, act).run() > 0 ? 1 : 0;
    std::fprintf(report, "figures: %zu of %zu faulty acts found\n", found, faultyActs().size());
    return found == faultyActs().size() ? 0 : 1;
}

} // namespace

int main(int argc, char **argv)
{
    const char *name = argc == 2 ? argv[1] : "";
    const OwnDirectory directory;
    FILE *report = captureOutput();
    const int result = std::strcmp(name, "faulty") == 0 ? tryFaulty(report) : tryActs(report, name);
    removeSemaphore();
    return result;
}
