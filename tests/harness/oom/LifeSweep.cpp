// SPDX-License-Identifier: Apache-2.0
#include "LifeSweep.h"

#include "Heap.h"

namespace zelvo_test {
namespace {

/// How many acts are played between two that are checked to be what they were.
constexpr uint64_t REPETITIONS = 16;

Stage playUndisturbed(const Act &act)
{
    Stage stage([] { return uint64_t{0}; });
    act.play(stage);
    return stage;
}

} // namespace

uint32_t LifeSweep::run()
{
    playUndisturbed(act_); // what is made once in a process is made now
    judge_.expect(playUndisturbed(act_));
    for (const FailAlloc::Span span : {FailAlloc::Once, FailAlloc::FromThereOn})
        for (uint32_t allowed = 0; tryOne(allowed, span) > 0; ++allowed)
            if (allowed % REPETITIONS == 0)
                repeat();
    repeat();
    return faults_;
}

uint32_t LifeSweep::tryOne(uint32_t allowed, FailAlloc::Span span)
{
    fault_ = Fault(allowed, span).text();
    const int64_t before = liveBlocks();
    FailAlloc fail(allowed, span);
    Stage stage([&] { return fail.failed(); });
    act_.play(stage);
    ++figures_.lives;
    figures_.failures += fail.failed();
    if (liveBlocks() != before)
        complain("leaves " + std::to_string(liveBlocks() - before) + " blocks");
    for (const std::string &what : judge_.judge(stage))
        complain(what);
    return fail.failed();
}

void LifeSweep::repeat()
{
    const int64_t before = liveBlocks();
    if (!judge_.isAsExpected(playUndisturbed(act_)) || liveBlocks() != before)
        complain("the next life is another one");
}

void LifeSweep::complain(const std::string &what)
{
    ++faults_;
    std::fprintf(report_, "%s: %s: %s\n", act_.name, fault_.c_str(), what.c_str());
}

void printFigures(FILE *report, const char *what, const LifeFigures &figures, uint32_t faults)
{
    std::fprintf(report,
                 "figures: %s: %lu allocations failed in %lu lives; %lu records, %lu reported, %lu "
                 "cut or missing, %lu passed by a filter without memory, %lu lost in rollovers "
                 "without memory, %u faults\n",
                 what, figures.failures, figures.lives, figures.records, figures.reported,
                 figures.cut, figures.passed, figures.lost, faults);
}

} // namespace zelvo_test
