// SPDX-License-Identifier: Apache-2.0
// A semaphore key that only this test uses.
#pragma once

#include <cstdint>

#include <sys/ipc.h>
#include <sys/sem.h>
#include <unistd.h>

namespace zelvo_test {

/// Removes the set of its key, whoever has made it, at both ends of its life.
class OwnSemaphore {
public:
    OwnSemaphore() { remove(); }
    OwnSemaphore(const OwnSemaphore &) = delete;
    OwnSemaphore &operator=(const OwnSemaphore &) = delete;
    ~OwnSemaphore() { remove(); }

    /// No two processes of one machine have it at the same time.
    int32_t key() const { return key_; }
    /// -1 when there is no set.
    int id() const { return semget(key(), 1, 0); }
    int value() const { return semctl(id(), 0, GETVAL); }
    int waiters() const { return semctl(id(), 0, GETNCNT); }
    void remove() const { semctl(id(), 0, IPC_RMID); }

    /// Makes the set with its semaphore held, by nobody who could die.
    void makeHeld() const { semget(key(), 1, IPC_CREAT | 0666); }

    /// Makes the set as a handler does, unless it is there.
    void makeFree() const
    {
        const int made = semget(key(), 1, IPC_CREAT | IPC_EXCL | 0666);
        if (made != -1)
            semctl(made, 0, SETVAL, 1);
    }

    /// Takes the semaphore as a process that gives it back when it dies.
    bool take() const
    {
        sembuf down{.sem_num = 0, .sem_op = -1, .sem_flg = SEM_UNDO};
        return semop(id(), &down, 1) == 0;
    }

private:
    int32_t key_ = 0x5A000000 | (getpid() & 0xFFFFFF);
};

} // namespace zelvo_test
