// SPDX-License-Identifier: Apache-2.0
// Argument lists for patterns.
#pragma once

#include <cstdarg>
#include <functional>
#include <string>
#include <vector>

#include "Patterns.h"
#include "Transcript.h"

namespace zelvo_equivalence {

/// The arguments of one call. For a pattern of which nobody knows what it asks for they are of a
/// kind that can be read as whatever it may be; now and then there is no list at all.
class Arguments {
public:
    Arguments(Random &random, const Pattern &pattern, Transcript &transcript);

    /// Calls ACTION with the list.
    void with(const std::function<void(va_list)> &action) const;

    struct Value {
        ArgType type;
        UText text;
        int32_t integer;
        double real;
    };

private:
    enum class Form { TYPED, UNIVERSAL, ABSENT };

    Form form_;
    std::vector<Value> values_;
};

/// Calls ACTION with arguments that can be read as texts, integers and doubles, a hundred of them.
void withUniversalList(const std::function<void(va_list)> &action);

} // namespace zelvo_equivalence
