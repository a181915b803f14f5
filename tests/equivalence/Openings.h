// SPDX-License-Identifier: Apache-2.0
// How often things of ICU are opened that can be kept.
#pragma once

namespace zelvo_equivalence {

/// Prints how many date formats, message formats and bundles have been opened so far.
void printOpenings();

} // namespace zelvo_equivalence
