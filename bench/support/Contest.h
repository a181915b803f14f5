// SPDX-License-Identifier: Apache-2.0
// A peer beside this toolkit and the floor, in one process and by turns.
#pragma once

#include <optional>

#include "support/Floor.h"
#include "support/Records.h"

namespace zelvo_bench {

/// What all records tell, as peers want it.
constexpr const char *PEER_CLIENT = "10.23.42.17";
constexpr const char *PEER_WISH = "/articles/index.html";

class Contest {
public:
    Contest();

    /// A file of the peer's own, empty.
    std::string file(const std::string &name) const;

    /// The peer's way to log a line. The file must have it when the action has returned.
    template <class Action>
    void record(const std::string &name, const std::string &file, Action action) const
    {
        measure(name, {{file}, lengthOf(file, action)}, action);
    }

    /// The peer's way to log a line on a level that is switched off.
    template <class Action>
    Benchmark *refusal(const std::string &name, const std::string &file, Action action) const
    {
        empty(file);
        action();
        mustHoldNothing(file);
        return measureCheap(name, action);
    }

    /// This toolkit's file of several processes, for the peers that have the like.
    void shared(int32_t semaphoreKey);

private:
    template <class Action>
    static size_t lengthOf(const std::string &file, Action action)
    {
        action(); // some begin a file with lines of their own
        empty(file);
        action();
        const std::string line = contentOf(file);
        mustBeTheLine(file, line);
        return line.size();
    }

    static void mustBeTheLine(const std::string &file, const std::string &line);
    static void mustHoldNothing(const std::string &file);

    Place place_;
    OpenToolkit toolkit_;
    Tree line_;
    Tree refusing_;
    std::optional<Tree> shared_;
};

} // namespace zelvo_bench
