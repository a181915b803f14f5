// SPDX-License-Identifier: Apache-2.0
#include "support/Contest.h"

#include <cstdio>
#include <cstdlib>

namespace zelvo_bench {

namespace {

void require(bool held, const std::string &file, const char *what)
{
    if (held)
        return;
    std::fprintf(stderr, "%s: %s\n", file.c_str(), what);
    std::exit(1);
}

} // namespace

Contest::Contest() : line_(place_, LINE), refusing_(place_, LINE, 2)
{
    const std::string record = line_.sample(), floor = place_.file("floor");
    measure("zelvo", line_.output(), [this] { line_.log(); });
    measure("floor", {{floor}, record.size()}, AppendFloor(floor, record));

    ZlvSetObjProp(refusing_.logger(), "level", "WARN");
    refusal("zelvo refused", refusing_.files()[0], [this] { refusing_.log(); });
}

std::string Contest::file(const std::string &name) const
{
    std::string file = place_.file(name + ".txt");
    empty(file);
    return file;
}

void Contest::shared(int32_t semaphoreKey)
{
    const Tree &tree = shared_.emplace(place_, LINE, Shared{semaphoreKey});
    measure("zelvo shared", tree.output(), [&tree] { tree.log(); });
}

void Contest::mustBeTheLine(const std::string &file, const std::string &line)
{
    require(line.find("Client 10.23.42.17 asked for /articles/index.html (4711)\n") !=
                std::string::npos,
            file, "not the line that was wanted");
}

void Contest::mustHoldNothing(const std::string &file)
{
    require(sizeOf(file) == 0, file, "a call that should be refused was logged");
}

} // namespace zelvo_bench
