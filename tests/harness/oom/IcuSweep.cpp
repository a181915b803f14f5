// SPDX-License-Identifier: Apache-2.0
#include "IcuSweep.h"

#include <fstream>
#include <new>

#include <sys/mman.h>

namespace zelvo_test {
namespace {

/// "crash PLACE" or "leak PLACE", without the places that it was reached from.
std::string innermost(const std::string &site)
{
    return site.substr(0, site.find(' ', site.find('+')));
}

/// Figures that children add to.
LifeFigures &sharedFigures()
{
    void *area = mmap(nullptr, sizeof(LifeFigures), PROT_READ | PROT_WRITE,
                      MAP_SHARED | MAP_ANONYMOUS, -1, 0);
    return *new (area) LifeFigures{};
}

} // namespace

IcuFaults::IcuFaults(const char *notes)
{
    std::ifstream lines(notes);
    for (std::string line; std::getline(lines, line);) {
        const size_t name = line.find(" in ");
        const size_t call = line.find(" by ");
        const std::string where = name < call ? line.substr(name, call - name) : "";
        faults_.try_emplace(innermost(line), Fault{where, 0});
    }
}

bool IcuFaults::excuses(const std::string &site)
{
    const auto found = faults_.find(innermost(site));
    if (found == faults_.end())
        return false;
    ++found->second.times;
    return true;
}

void IcuFaults::print(FILE *report) const
{
    for (const auto &[place, fault] : faults_)
        std::fprintf(report, "figures: ICU's own %s%s: %lu\n", place.c_str(), fault.where.c_str(),
                     fault.times);
}

IcuSweep::IcuSweep(FILE *report, const Act &act, IcuFaults &known)
    : report_(report), act_(act), figures_(sharedFigures()), judge_(act, figures_), known_(known)
{
}

uint32_t IcuSweep::run(uint64_t stride)
{
    play(); // what is made once in a process is made now
    judge_.expect(play());
    for (const bool once : {true, false}) {
        bool goesOn = true;
        for (uint64_t allowed = 0; goesOn; allowed += stride)
            goesOn = tryOne({allowed, once});
    }
    return faults_;
}

bool IcuSweep::tryOne(IcuFault fault)
{
    fault_ = fault.text();
    const Ending ending = tryWithout(
        fault, [&] { return judged(); }, [&] { return judgedAgain(); });
    ++figures_.lives;
    figures_.failures += ending.failed;
    if (ending.isBad && !known_.excuses("crash " + ending.crash))
        complain("crash " + ending.crash);
    for (const std::string &site : ending.leaks)
        if (!known_.excuses("leak " + site))
            complain("leak " + site);
    if (!ending.complaint.empty())
        complain(ending.complaint);
    return ending.isBad || ending.failed > 0;
}

Stage IcuSweep::play() const
{
    Stage stage(icuFailed);
    act_.play(stage);
    return stage;
}

std::string IcuSweep::judged()
{
    std::string complaints;
    for (const std::string &complaint : judge_.judge(play()))
        complaints += complaint + "\n";
    return complaints;
}

std::string IcuSweep::judgedAgain() const
{
    return judge_.isAsExpected(play()) ? "" : "the next life is another one";
}

void IcuSweep::complain(const std::string &what)
{
    ++faults_;
    std::fprintf(report_, "%s: %s: %s\n", act_.name, fault_.c_str(), what.c_str());
}

} // namespace zelvo_test
