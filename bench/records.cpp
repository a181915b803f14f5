// SPDX-License-Identifier: Apache-2.0
// What a record of each kind costs in a file of its own, and the system calls that it needs, with
// the same bytes.
#include <deque>

#include "support/Floor.h"
#include "support/Records.h"
#include "zelvo.hpp"

using namespace zelvo_bench;

int main(int argc, char **argv)
{
    const Place place;
    const OpenToolkit toolkit;
    std::deque<Tree> trees;
    for (const Kind &kind : allKinds) {
        const Tree &tree = trees.emplace_back(place, kind);
        const std::string name = kind.name, record = tree.sample(),
                          file = place.file("floor " + name);
        measure(name, tree.output(), [&tree] { tree.log(); });
        measure("floor of " + name, {{file}, record.size()}, AppendFloor(file, record));
    }
    const zelvo::Logger logger(zelvo::Object::share(trees.front().logger()));
    measure("line in C++", trees.front().output(), [&logger] {
        logger.debugMin({ASKED, nullptr, nullptr, 0}, CLIENT, WISH, SERIAL);
    });
    const std::string line = trees.front().sample(), calls = place.file("own calls");
    measure("own calls", {{calls}, line.size()}, OwnCallsFloor(calls, line));
    const std::string record = trees.front().sample(), file = place.file("write");
    measure("write", {{file}, record.size()}, WriteFloor(file, record));
    return runBenchmarks(argc, argv);
}
