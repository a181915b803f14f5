// SPDX-License-Identifier: Apache-2.0
// Plays an act with ICU's allocations failing. ICU does not survive all of that: what it does by
// itself was noted by IcuAlone.cpp and is taken for its own fault here; everything else is a fault
// of the library.
//
// ICU has played the act before. What it makes once in a process and then keeps, it may remember
// for good as a thing that cannot be made, and then not even return.
//
// Usage: zelvo_oom_icu_lives ACT NOTES STRIDE, where STRIDE is the distance of the allocations
// that are tried. For the act "faulty", acts with faults in them, which have to be found.
#include <cstdlib>
#include <cstring>

#include "IcuSweep.h"
#include "LifeSweep.h"
#include "World.h"

using namespace zelvo_test;

namespace {

int tryAct(FILE *report, const Act &act, IcuFaults &known, uint64_t stride)
{
    IcuSweep sweep(report, act, known);
    const uint32_t faults = sweep.run(stride);
    printFigures(report, act.name, sweep.figures(), faults);
    known.print(report);
    return faults == 0 ? 0 : 1;
}

int tryFaulty(FILE *report, IcuFaults &known)
{
    size_t found = 0;
    for (const Act &act : icuFaultyActs())
        found += IcuSweep(report, act, known).run(1) > 0 ? 1 : 0;
    std::fprintf(report, "figures: %zu of %zu faulty acts found\n", found, icuFaultyActs().size());
    return found == icuFaultyActs().size() ? 0 : 1;
}

int run(FILE *report, const char *name, IcuFaults &known, uint64_t stride)
{
    if (std::strcmp(name, "faulty") == 0)
        return tryFaulty(report, known);
    for (const Act &act : everyAct())
        if (std::strcmp(act.name, name) == 0)
            return tryAct(report, act, known, stride);
    return 2;
}

} // namespace

int main(int argc, char **argv)
{
    if (argc != 4 || !takeIcuHeap())
        return 2;
    IcuFaults known(argv[2]);
    const OwnDirectory directory;
    FILE *report = captureOutput();
    const int result = run(report, argv[1], known, std::strtoull(argv[3], nullptr, 10));
    removeSemaphore();
    return result;
}
