// SPDX-License-Identifier: Apache-2.0
// What may become of a call that runs out of memory, other than being done or changing nothing.
#pragma once

#include <string>

#include "ToolkitState.h"

namespace zelvo_test {

/// A way in which calls may end, as patterns of fnmatch() with the extended operators.
struct Known {
    const char *name;
    const char *calls;
    const char *answers;
    const char *gone; ///< lines that the state may lack afterwards
    const char *left; ///< lines that it may have gained
};

/// The one that an outcome belongs to: a call, its answer and the change of the state; else null.
const Known *knownOutcome(const std::string &call, const std::string &answer, const Lines &before,
                          const Lines &after);

/// Whether a flaw of the registries may be left by a call that ran out of memory.
bool isKnownFlaw(const std::string &flaw);

/// The lines that match nothing in a pattern.
Lines without(const Lines &lines, const char *pattern);

/// The lines that are only in one of two states: '-' those of the first, '+' those of the second.
std::string difference(const Lines &first, const Lines &second);

} // namespace zelvo_test
