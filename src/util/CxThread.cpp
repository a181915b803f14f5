// SPDX-License-Identifier: Apache-2.0
#include "CxThread.h"

#include <pthread.h>
#include <unistd.h>

#include "util/CxStatusIntl.h"

using namespace zelvo;

static_assert(sizeof(pthread_t) <= sizeof(uint64_t));

namespace {

/// Starts a thread with initialised attributes; gives the thread library's number.
int startThread(uint64_t *thread, pthread_attr_t &attributes, size_t stackSize,
                void *(*start)(void *), void *argument)
{
    const int refused = stackSize == 0 ? 0 : pthread_attr_setstacksize(&attributes, stackSize);
    if (refused != 0)
        return refused;
    pthread_t id{};
    const int failure = pthread_create(&id, &attributes, start, argument);
    if (failure == 0)
        *thread = id;
    return failure;
}

} // namespace

ZlvBool CxHasThreadSupport()
{
    return 1;
}

uint64_t CxThreadGetCurrentID()
{
    return pthread_self();
}

CxStatus CxThreadCreate(uint64_t *thread, size_t stackSize, void *(*start)(void *), void *argument)
{
    if (thread == nullptr || start == nullptr)
        return missingArgument;
    pthread_attr_t attributes;
    int failure = pthread_attr_init(&attributes);
    if (failure != 0)
        return platformError(failure);
    failure = startThread(thread, attributes, stackSize, start, argument);
    pthread_attr_destroy(&attributes);
    return statusOfNumber(failure);
}

CxStatus CxThreadJoin(uint64_t thread)
{
    return thread == 0 ? missingArgument : statusOfNumber(pthread_join(thread, nullptr));
}

void CxThreadYield() {}

uint32_t CxThreadSleep(uint32_t milliseconds)
{
    constexpr uint64_t halfSecond = 500;
    return sleep(static_cast<uint32_t>((milliseconds + halfSecond) / 1000));
}
