// SPDX-License-Identifier: Apache-2.0
// What a line record costs when it goes to several files, and when several threads log at once.
#include <deque>

#include "support/Floor.h"
#include "support/Records.h"

using namespace zelvo_bench;

namespace {

void measureFanOut(const Place &place, std::deque<Tree> &trees)
{
    for (const unsigned handlers : {1u, 2u, 4u, 8u}) {
        const Tree &tree = trees.emplace_back(place, LINE, handlers);
        measure("fan-out " + std::to_string(handlers), tree.output(), [&tree] { tree.log(); });
    }
}

void measureThreads(const Tree &tree)
{
    for (const int threads : {1, 2, 4})
        measure("threads " + std::to_string(threads), tree.output(), [&tree] {
            tree.log();
        })->Threads(threads);
}

} // namespace

int main(int argc, char **argv)
{
    const Place place;
    const OpenToolkit toolkit;
    std::deque<Tree> trees;
    measureFanOut(place, trees);
    measureThreads(trees.front());

    const std::string record = trees.front().sample(), file = place.file("floor");
    measure("floor", {{file}, record.size()}, AppendFloor(file, record));
    return runBenchmarks(argc, argv);
}
