// SPDX-License-Identifier: Apache-2.0
// Messages: inline patterns, and keys of bundles that are there, are not, or come and go.
#pragma once

#include "Patterns.h"
#include "World.h"

namespace zelvo_equivalence {

/// The bundle that comes and goes.
constexpr const char *LATE_BUNDLE = "./late";

struct Message {
    const char *bundle; ///< null for an inline pattern
    const char *key;
    Pattern pattern; ///< of a message with a bundle only the types hold

    const UChar *text() const { return bundle == nullptr ? pattern.text.c_str() : nullptr; }
};

/// A message, noted in the transcript.
Message anyMessage(World &world);
Message anyBundleMessage(World &world);

} // namespace zelvo_equivalence
