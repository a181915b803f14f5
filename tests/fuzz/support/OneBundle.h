// SPDX-License-Identifier: Apache-2.0
// A world with one resource bundle, which answers to every name and has one pattern under every
// key.
#pragma once

#include <unicode/umachine.h>

namespace zelvo_fuzz {

/// The pattern; the caller keeps it alive.
extern const UChar *bundlePattern;

} // namespace zelvo_fuzz
