// SPDX-License-Identifier: Apache-2.0
#include "LifeJudge.h"

#include <algorithm>
#include <cerrno>

#include "Text.h"
#include "World.h"

namespace zelvo_test {
namespace {

/// What a rollover that cannot name a file may lose: that file.
constexpr size_t RECORDS_OF_A_FILE = 4;

bool isWhole(const Stage::Call &call, const Stage::Call &expected)
{
    return call.output == expected.output && textOf(call.status) == textOf(expected.status);
}

} // namespace

void LifeJudge::expect(const Stage &reference)
{
    calls_ = reference.calls();
    files_ = reference.files();
}

bool LifeJudge::isAsExpected(const Stage &found) const
{
    return found.files() == files_ && std::equal(found.calls().begin(), found.calls().end(),
                                                 calls_.begin(), calls_.end(), isWhole);
}

std::vector<std::string> LifeJudge::judge(const Stage &found)
{
    faults_.clear();
    if (found.calls().size() != calls_.size())
        return {"another number of calls"};
    judgeStatuses(found);
    // Where the objects could not be made as they should be, anything may come out.
    if (!found.isStruckElsewhere())
        act_.isOfFiles ? judgeFiles(found) : judgeOutputs(found);
    return faults_;
}

void LifeJudge::judgeStatuses(const Stage &found)
{
    for (const Stage::Call &call : found.calls()) {
        const bool isOk = call.status.type == CX_STATUS_OK;
        ++figures_.records;
        figures_.reported += !isOk || call.status.icuError > 0 ? 1 : 0;
        if (!isOk && call.status.code != ENOMEM && !found.isStruckElsewhere())
            faults_.push_back("a call reports " + textOf(call.status));
    }
}

void LifeJudge::judgeOutputs(const Stage &found)
{
    for (size_t i = 0; i < calls_.size(); ++i)
        judgeOutput(i, found.calls()[i]);
}

/// A call in which memory ran out shows what it could; all others show everything. A filter passes
/// what it has no memory to know.
void LifeJudge::judgeOutput(size_t number, const Stage::Call &call)
{
    const Stage::Call &expected = calls_[number];
    if (isWhole(call, expected))
        return;
    if (act_.isFiltered && expected.output.empty())
        ++figures_.passed;
    else if (call.isStruck && isCut(call.output, expected.output))
        ++figures_.cut;
    else
        faults_.push_back("call " + std::to_string(number) + " gives " + textOf(call.status) +
                          " and shows " + call.output);
}

bool LifeJudge::isRollover(size_t call) const
{
    const std::string &output = calls_[call].output;
    return output.find("1.log:") != std::string::npos || output.find("2.log:") != std::string::npos;
}

/// A record may be missing if memory ran out when it was logged, or if it was in a file that a
/// rollover could not name.
void LifeJudge::judgeFiles(const Stage &found)
{
    size_t bound = 0;
    size_t lost = 0;
    for (size_t i = 0; i < calls_.size(); ++i) {
        const bool isStruck = found.calls()[i].isStruck;
        const std::string record = fileRecord(i + 1);
        const bool isMissing = files_.find(record) != std::string::npos &&
                               found.files().find(record) == std::string::npos;
        bound += isStruck && isRollover(i) ? RECORDS_OF_A_FILE : 0;
        figures_.cut += isMissing && isStruck ? 1 : 0;
        lost += isMissing && !isStruck ? 1 : 0;
    }
    figures_.lost += lost;
    if (lost > bound)
        faults_.push_back(std::to_string(lost) + " acknowledged records are lost");
}

} // namespace zelvo_test
