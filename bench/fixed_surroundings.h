// SPDX-License-Identifier: Apache-2.0
// Time and process as a program has them whose instructions are counted: the same in every run.
#pragma once

namespace zelvo_bench {

/// Lets a millisecond go by. Nothing else does.
void passMillisecond();

} // namespace zelvo_bench
