// SPDX-License-Identifier: Apache-2.0
// Two threads that call a twin without the mutex: what the thread checker has to find.
#include <thread>

#include "zelvo.h"

int main()
{
    ZlvOpenToolkit(nullptr, nullptr);
    ZlvObject *logger = ZlvGetObject("unlocked.log", "zlv_basiclogger");
    const auto change = [logger] {
        for (int round = 0; round < 100; ++round)
            zlvIntlSetObjPropInt(logger, "number", round);
    };
    std::thread other(change);
    change();
    other.join();
    ZlvReleaseObject(logger);
    ZlvCloseToolkit();
    return 0;
}
