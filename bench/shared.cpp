// SPDX-License-Identifier: Apache-2.0
// What a line record costs in a file that several processes share, while only one of them writes,
// and the system calls that it needs, with the same bytes.
#include "process/OwnSemaphore.h"
#include "support/Floor.h"
#include "support/Records.h"

using namespace zelvo_bench;

int main(int argc, char **argv)
{
    const Place place;
    const zelvo_test::OwnSemaphore semaphore;
    const OpenToolkit toolkit;
    const Tree tree(place, LINE, Shared{semaphore.key()});
    const std::string record = tree.sample(), file = place.file("floor");
    measure("shared", tree.output(), [&tree] { tree.log(); });
    measure("floor of shared", {{file}, record.size()}, SharedFloor(file, record, semaphore.id()));
    return runBenchmarks(argc, argv);
}
