// SPDX-License-Identifier: Apache-2.0
// Message patterns, well-formed and broken, that come back often enough to be worth keeping.
#pragma once

#include <string>
#include <vector>

#include "Random.h"

namespace zelvo_equivalence {

/// The types of arguments that a pattern can ask for.
enum class ArgType { TEXT, INTEGER, DOUBLE };

struct Pattern {
    std::u16string text;
    std::vector<ArgType> types; ///< of the arguments; means nothing in a pattern that is not typed
    bool isTyped;               ///< false when nobody knows what ICU will ask for
};

class Patterns {
public:
    explicit Patterns(bool hasDates) : hasDates_(hasDates) {}

    /// A former pattern, one that differs from it a little, or a new one.
    const Pattern &next(Random &random);

private:
    static constexpr size_t MOST = 48;

    Pattern fresh(Random &random) const;

    bool hasDates_;
    std::vector<Pattern> former_;
};

} // namespace zelvo_equivalence
