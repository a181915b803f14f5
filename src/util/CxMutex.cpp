// SPDX-License-Identifier: Apache-2.0
// The record comes from malloc() itself, not from the wrappers, so that the lock stands below
// everything that could ever need it.
#include "CxMutex.h"

#include <cstdlib>
#include <pthread.h>

#include "util/CxStatusIntl.h"

using namespace zelvo;

struct CxMutexRec {
    pthread_mutex_t mutex;
};

CxStatus CxMutexCreate(CxMutex *slot)
{
    if (slot == nullptr)
        return missingArgument;
    *slot = static_cast<CxMutex>(std::malloc(sizeof(CxMutexRec)));
    if (*slot == nullptr)
        return platformError(ENOMEM);
    const int failure = pthread_mutex_init(&(*slot)->mutex, nullptr);
    if (failure != 0) {
        std::free(*slot);
        *slot = nullptr;
    }
    return statusOfNumber(failure);
}

CxStatus CxMutexLock(CxMutex mutex)
{
    return mutex == nullptr ? missingArgument : statusOfNumber(pthread_mutex_lock(&mutex->mutex));
}

CxStatus CxMutexUnlock(CxMutex mutex)
{
    return mutex == nullptr ? missingArgument : statusOfNumber(pthread_mutex_unlock(&mutex->mutex));
}

CxStatus CxMutexDestroy(CxMutex *slot)
{
    if (slot == nullptr || *slot == nullptr)
        return missingArgument;
    const CxStatus status = statusOfNumber(pthread_mutex_destroy(&(*slot)->mutex));
    std::free(*slot);
    *slot = nullptr;
    return status;
}
