// SPDX-License-Identifier: Apache-2.0
#include "Sweep.h"

#include <algorithm>
#include <memory>

#include "Outcomes.h"
#include "ZlvApiMutex.h"

namespace zelvo_test {
namespace {

Lines stateOf(World *world)
{
    Lines lines;
    if (world != nullptr)
        return world->state();
    addToolkitState(lines);
    return lines;
}

} // namespace

Sweep::Trial Sweep::attempt(const Case &call, Buffers buffers, Fault fault)
{
    const int64_t before = liveBlocks();
    Trial trial{};
    {
        const auto world = call.inWorld ? std::make_unique<World>(call.kind, buffers) : nullptr;
        if (call.prepare)
            call.prepare(world.get());
        newOutput();
        trial.before = stateOf(world.get());
        if (withoutMutex_)
            zelvo::destroyApiMutex();
        for (Outcome *outcome : {&trial.first, &trial.second}) {
            outcome->answer = call.run(world.get(), fault);
            outcome->output = newOutput();
            outcome->state = stateOf(world.get());
        }
        trial.flaws = registryFlaws();
    }
    if (!call.inWorld)
        ZlvCloseToolkit();
    removeFiles();
    trial.asked = fault.asked();
    trial.failed = fault.failed();
    trial.left = liveBlocks() - before;
    ++figures_.worlds;
    figures_.failures += trial.failed;
    return trial;
}

uint32_t Sweep::run(const Case &call)
{
    faults_ = 0;
    figures_.calls.insert(call.call());
    uint64_t before = figures_.failures;
    runWith(Buffers::FULL, call);
    if (call.inWorld)
        runWith(Buffers::UNUSED, call);
    if (figures_.failures == before)
        complain(call, "asks for no allocation");
    if (call.inWorld)
        runWithoutMutex(call);
    return faults_;
}

void Sweep::runWith(Buffers buffers, const Case &call)
{
    fault_ = "without a fault";
    attempt(call, buffers, Fault::none()); // what is made once in a process is made now
    const Trial reference = attempt(call, buffers, Fault::none());
    for (const FailAlloc::Span span : {FailAlloc::Once, FailAlloc::FromThereOn}) {
        for (uint32_t allowed = 0; allowed <= reference.asked; ++allowed) {
            const Fault fault(allowed, span);
            fault_ = fault.text();
            judge(call, reference, attempt(call, buffers, fault));
        }
    }
}

/// A call that takes the API mutex has to make it first.
void Sweep::runWithoutMutex(const Case &call)
{
    const Trial usual = attempt(call, Buffers::UNUSED, Fault::none());
    withoutMutex_ = true;
    const Trial reference = attempt(call, Buffers::UNUSED, Fault::none());
    if (reference.asked > usual.asked) {
        const Fault fault(0, FailAlloc::Once);
        fault_ = "the mutex cannot be made";
        const Trial trial = attempt(call, Buffers::UNUSED, fault);
        if (trial.first.answer != call.nothing || trial.first.state != trial.before)
            complain(call, "answers " + trial.first.answer);
        judge(call, reference, trial);
    }
    withoutMutex_ = false;
}

bool Sweep::isDone(const Case &call, const Outcome &expected, const Outcome &found)
{
    if (found.answer != expected.answer || found.state != expected.state)
        return false;
    if (found.output == expected.output)
        return true;
    figures_.cut += call.mayCut ? 1 : 0;
    return call.mayCut && isCut(found.output, expected.output);
}

void Sweep::judge(const Case &call, const Trial &reference, const Trial &trial)
{
    if (trial.left < 0 || trial.left > 2 * call.keeps)
        complain(call, "leaves " + std::to_string(trial.left) + " blocks");
    const Outcome &first = trial.first;
    const bool isRefused =
        first.answer == call.nothing && first.state == trial.before && first.output.empty();
    const bool isWhole = isDone(call, reference.first, first);
    const bool mayRepeat = isRefused && isDone(call, reference.first, trial.second);
    const bool mayGoOn = isWhole && isDone(call, reference.second, trial.second);
    if (mayGoOn || mayRepeat)
        ++(mayGoOn ? figures_.done : figures_.refused);
    else if (call.isComposite)
        judgeComposite(call, reference, trial);
    else if (isRefused || isWhole)
        complain(call, "does not work the next time: " + trial.second.answer + " " +
                           difference(reference.first.state, trial.second.state));
    else
        judgeKnown(call, reference, trial);
}

/// Nothing is promised of the state but that it is sound; and that the call works afterwards.
void Sweep::judgeComposite(const Case &call, const Trial &reference, const Trial &trial)
{
    ++figures_.partly;
    const auto isOneOf = [&](const std::string &answer, bool mayBeNothing) {
        return answer == reference.first.answer || answer == reference.second.answer ||
               (mayBeNothing && answer == call.nothing);
    };
    if (!isOneOf(trial.first.answer, true))
        complain(call, "answers " + trial.first.answer);
    if (!isOneOf(trial.second.answer, false))
        complain(call, "does not work the next time: " + trial.second.answer);
    for (const std::string &flaw : trial.flaws) {
        if (isKnownFlaw(flaw))
            ++figures_.known[flaw];
        else
            complain(call, flaw);
    }
}

void Sweep::judgeKnown(const Case &call, const Trial &reference, const Trial &trial)
{
    const Outcome &first = trial.first;
    const Known *known = knownOutcome(call.call(), first.answer, trial.before, first.state);
    if (known == nullptr)
        return complain(call, "answers " + first.answer + " " +
                                  difference(trial.before, first.state) + first.output);
    ++figures_.known[known->name];
    const auto isLike = [&](const Outcome &expected) {
        return trial.second.answer == expected.answer &&
               without(trial.second.state, known->left) == without(expected.state, known->left);
    };
    if (!isLike(reference.first) && !isLike(reference.second))
        complain(call, std::string(known->name) +
                           ", and then it does not work: " + trial.second.answer + " " +
                           difference(reference.first.state, trial.second.state));
}

void Sweep::complain(const Case &call, const std::string &what)
{
    ++faults_;
    std::fprintf(report_, "%s: %s: %s\n", call.name.c_str(), fault_.c_str(), what.c_str());
}

} // namespace zelvo_test
