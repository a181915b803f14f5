// SPDX-License-Identifier: Apache-2.0
// A world with one resource bundle, which answers to every name and has one pattern under every
// key. Another pattern gets another key, since what is found under a key may be remembered.
#pragma once

#include <string>

namespace zelvo_fuzz {

void setBundlePattern(const std::u16string &pattern);

/// The key that belongs to the pattern.
const std::string &bundleKey();

} // namespace zelvo_fuzz
