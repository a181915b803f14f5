// SPDX-License-Identifier: Apache-2.0
// The API mutex: created by the first call that takes it, destroyed by close.
#include <atomic>
#include <pthread.h>

#include "ZlvApiMutex.h"
#include "ZlvDeferredFree.h"
#include "ZlvMisc.h"
#include "ZlvToolkitIntl.h"

CxMutex ZLV_TK_API_MUTEX = nullptr;
ZlvBool ZLV_TK_API_MUTEX_EXISTS = 0;

namespace {

// Keeps two first callers from both creating the API mutex, and close from destroying it while
// another thread forks.
pthread_mutex_t creation = PTHREAD_MUTEX_INITIALIZER;

std::atomic_ref<ZlvBool> exists()
{
    return std::atomic_ref<ZlvBool>(ZLV_TK_API_MUTEX_EXISTS);
}

// Whether this thread holds the API mutex, which a class function may do when it forks.
thread_local bool held = false;

// A fork waits until no other thread is inside the library. The child, whose only thread is the one
// that forked, thus finds the mutex free and everything under it whole. A class function that forks
// waits for nobody: who could be inside is the forking thread itself, and others that fork wait for
// it with the creation mutex in their hands.
void beforeFork()
{
    if (held)
        return;
    pthread_mutex_lock(&creation);
    if (exists().load(std::memory_order_relaxed) == 1)
        CxMutexLock(ZLV_TK_API_MUTEX);
}

void afterForkInParent()
{
    if (held)
        return;
    if (exists().load(std::memory_order_relaxed) == 1)
        CxMutexUnlock(ZLV_TK_API_MUTEX);
    pthread_mutex_unlock(&creation);
}

/// Those who held the creation mutex while a class function forked are not there in the child.
void afterForkInChild()
{
    if (held)
        pthread_mutex_init(&creation, nullptr);
    else
        afterForkInParent();
}

/// The caller holds the creation mutex.
void watchForks()
{
    static bool watching = false;
    if (!watching)
        watching = pthread_atfork(beforeFork, afterForkInParent, afterForkInChild) == 0;
}

CxStatus createOnce()
{
    CxStatus status{CX_STATUS_OK, 0};
    pthread_mutex_lock(&creation);
    watchForks();
    if (exists().load(std::memory_order_relaxed) == 0) {
        status = CxMutexCreate(&ZLV_TK_API_MUTEX);
        if (status.type == CX_STATUS_OK)
            exists().store(1, std::memory_order_release);
    }
    pthread_mutex_unlock(&creation);
    return status;
}

/// Reports a failure; gives 1 for success.
ZlvBool succeeded(CxStatus status)
{
    if (status.type == CX_STATUS_OK)
        return 1;
    ZlvReportPlatformErr(status.type, status.code);
    return 0;
}

} // namespace

ZlvBool zlvAPIMutexLock(void)
{
    if (exists().load(std::memory_order_acquire) == 0 && succeeded(createOnce()) == 0)
        return 0;
    const ZlvBool locked = succeeded(CxMutexLock(ZLV_TK_API_MUTEX));
    held = locked == 1;
    return locked;
}

void zlvAPIMutexUnlock(void)
{
    if (exists().load(std::memory_order_relaxed) == 0)
        return;
    zelvo::freeDeferred();
    held = false;
    succeeded(CxMutexUnlock(ZLV_TK_API_MUTEX));
}

void zelvo::destroyApiMutex()
{
    pthread_mutex_lock(&creation);
    if (exists().load(std::memory_order_relaxed) == 1) {
        succeeded(CxMutexDestroy(&ZLV_TK_API_MUTEX));
        exists().store(0, std::memory_order_relaxed);
    }
    pthread_mutex_unlock(&creation);
}
