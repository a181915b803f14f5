// SPDX-License-Identifier: Apache-2.0
// A fork at a moment when another thread is inside the library for certain.
#include <pthread.h>

#include "ForkedLog.h"

using namespace zelvo_test;

namespace {

std::atomic<bool> isInside = false;
std::atomic<bool> mayLeave = false;

void raise(std::atomic<bool> &flag)
{
    flag = true;
    flag.notify_all();
}

/// Holds the API mutex until a fork has begun to wait for it, or has not waited at all.
void stayInside(ZlvObject *, ZlvEvent *, va_list)
{
    raise(isInside);
    mayLeave.wait(false);
}

} // namespace

TEST_F(ForkedLog, AForkWaitsForAThreadInAClassFunction)
{
    open("zlv_multiproc_filehandler");
    ZlvAddLoggerClass("staying_logger", nullptr, nullptr, nullptr, nullptr, stayInside);
    ZlvObject *staying = ZlvGetObject("staying.log", "staying_logger");
    // Handlers run in the reverse order of their registration: this one before the library's.
    pthread_atfork([] { raise(mayLeave); }, nullptr, nullptr);
    std::thread inside([staying] { ZlvLogUText(staying, u"text"); });
    isInside.wait(false);
    forkOnce(1, 1);
    raise(mayLeave);
    inside.join();
    ZlvReleaseObject(staying);
    EXPECT_EQ(lost(close()), 0U);
}
