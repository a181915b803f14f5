// SPDX-License-Identifier: Apache-2.0
// Tries every call of the library that allocates. Arguments: none; "names", to print the names of
// these calls; or "faulty", to try calls with faults in them, all of which have to be found.
#include <cstring>

#include <sys/wait.h>
#include <unistd.h>

#include "Sweep.h"

using namespace zelvo_test;

namespace {

Cases everyCase()
{
    Cases cases;
    addPortabilityCases(cases);
    addContainerCases(cases);
    addPropertyCases(cases);
    addObjectCases(cases);
    addConfigurationCases(cases);
    addEventCases(cases);
    addRecordCases(cases);
    addFileCases(cases);
    addCrowdCases(cases);
    addClosedCases(cases);
    return cases;
}

int printNames()
{
    for (const Case &call : everyCase())
        std::puts(call.call().c_str());
    return 0;
}

int tryAll(FILE *report)
{
    Sweep sweep(report);
    uint32_t faults = 0;
    for (const Case &call : everyCase())
        faults += sweep.run(call);
    const Figures &figures = sweep.figures();
    std::fprintf(report,
                 "figures: %zu calls, %lu allocations failed in %lu worlds: %lu calls done, %lu "
                 "refused, %lu done in part, %lu records cut, %u faults\n",
                 figures.calls.size(), figures.failures, figures.worlds, figures.done,
                 figures.refused, figures.partly, figures.cut, faults);
    for (const auto &[name, times] : figures.known)
        std::fprintf(report, "figures: %s: %lu\n", name.c_str(), times);
    return faults == 0 ? 0 : 1;
}

/// Whether the sweep of a call, in a process of its own, does not end well.
bool isFound(FILE *report, const Case &call)
{
    std::fflush(report);
    const pid_t child = fork();
    if (child == 0) {
        const uint32_t faults = Sweep(report).run(call);
        std::fflush(report);
        _exit(faults == 0 ? 0 : 1);
    }
    int status = 0;
    waitpid(child, &status, 0);
    return status != 0;
}

int tryFaulty(FILE *report)
{
    Cases cases;
    addFaultyCases(cases);
    size_t found = 0;
    for (const Case &call : cases)
        found += isFound(report, call) ? 1 : 0;
    std::fprintf(report, "figures: %zu of %zu faulty calls found\n", found, cases.size());
    return found == cases.size() ? 0 : 1;
}

bool isAsked(int argc, char **argv, const char *what)
{
    return argc == 2 && std::strcmp(argv[1], what) == 0;
}

} // namespace

int main(int argc, char **argv)
{
    if (isAsked(argc, argv, "names"))
        return printNames();
    const OwnDirectory directory;
    FILE *report = captureOutput();
    const int result = isAsked(argc, argv, "faulty") ? tryFaulty(report) : tryAll(report);
    removeSemaphore();
    return result;
}
