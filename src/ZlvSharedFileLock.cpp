// SPDX-License-Identifier: Apache-2.0
// The semaphore that orders the writes of several processes: 1 when free, 0 when held. Everything
// is done with SEM_UNDO, so that the system gives it back for a process that dies.
#include "ZlvMultiProcFileHandler.h"

#include <cerrno>
#include <ctime>
#include <iterator>
#include <sys/sem.h>

#include "ZlvFileHandlerIntl.h"
#include "util/CxStatusIntl.h"

using namespace zelvo;

namespace {

constexpr int EVERY_USER = 0666;
constexpr int MOST_FAILURES = 11;

/// The last argument of semctl(), which the platform leaves to its callers to declare.
union SemaphoreArgument {
    int value;
    semid_ds *facts;
    unsigned short *values;
};

/// Tells whether making a set failed for want of permission or room, rather than because it exists.
bool isRefusal(int code)
{
    return code == EACCES || code == EINVAL || code == ENOENT || code == ENOSPC;
}

CxStatus release(int32_t id)
{
    const SemaphoreArgument free{.value = 1};
    return statusOfCall(semctl(id, 0, SETVAL, free));
}

/// Makes the set, or finds it. Those who find one that was just made wait for it to become free.
CxStatus findOrMake(key_t key, int32_t &id)
{
    id = semget(key, 1, IPC_CREAT | IPC_EXCL | EVERY_USER);
    if (id != -1)
        return release(id);
    if (isRefusal(errno))
        return lastError();
    id = semget(key, 1, 0);
    return statusOfCall(id);
}

CxStatus take(int32_t id)
{
    sembuf down{.sem_num = 0, .sem_op = -1, .sem_flg = SEM_UNDO};
    return statusOfCall(semop(id, &down, 1));
}

/// One step, so that no two of those who give back can both see it held.
CxStatus giveBackIfHeld(int32_t id)
{
    sembuf steps[] = {{.sem_num = 0, .sem_op = 0, .sem_flg = IPC_NOWAIT},
                      {.sem_num = 0, .sem_op = 1, .sem_flg = SEM_UNDO}};
    return statusOfCall(semop(id, steps, std::size(steps)));
}

/// Signals do not shorten it: a storm of them would use up all attempts in a moment, while another
/// process is still writing.
void pauseForASecond()
{
    timespec rest{.tv_sec = 1, .tv_nsec = 0};
    while (nanosleep(&rest, &rest) == -1 && errno == EINTR)
        continue;
}

bool mayPass(CxStatus status)
{
    return status.code == ENOSPC || status.code == EINTR;
}

} // namespace

ZlvBool zlvMultiProcFileHandlerInitSem(ZlvObject *handler)
{
    FileHandlerVars *vars = varsOf(handler);
    int32_t id = -1;
    if (vars == nullptr || !isOk(reported(findOrMake(vars->semKey, id))))
        return 0;
    vars->semId = id;
    vars->semReady = 1;
    return 1;
}

ZlvBool zlvMultiProcFileHandlerLockSem(ZlvObject *handler)
{
    const FileHandlerVars *vars = varsOf(handler);
    if (vars == nullptr)
        return 0;
    CxStatus status = take(vars->semId);
    for (int failures = 1; mayPass(status); ++failures) {
        if (failures == MOST_FAILURES)
            return 1;
        pauseForASecond();
        status = take(vars->semId);
    }
    return isOk(reported(status));
}

void zlvMultiProcFileHandlerUnlockSem(ZlvObject *handler)
{
    const FileHandlerVars *vars = varsOf(handler);
    if (vars != nullptr && vars->semReady != 0)
        reported(giveBackIfHeld(vars->semId));
}
