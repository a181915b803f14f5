// SPDX-License-Identifier: Apache-2.0
// Semaphores that only this process sees: the library's calls are answered here, so that no set is
// left on the machine.
#pragma once

namespace zelvo_fuzz {

/// Whether every semaphore that was made is free, and can be taken by one process at a time.
bool allSemaphoresAreFree();

void forgetSemaphores();

} // namespace zelvo_fuzz
