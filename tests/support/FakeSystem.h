// SPDX-License-Identifier: Apache-2.0
// Lets a test answer in place of the system where a fault, a clock or a host name cannot be had for
// real. The linker sends the calls below, made by the library or by a test, through FakeSystem.cpp.
#pragma once

#include <netdb.h>
#include <pthread.h>
#include <sys/sem.h>
#include <sys/stat.h>
#include <sys/time.h>
#include <unistd.h>

#include <functional>

namespace zelvo_test {

/// While one lives, each call that has been given an answer is answered by it; the others go to the
/// system. One at a time; a test starts no thread of its own that would race with its setting.
///
///     FakeSystem system;
///     system.fork = [] { errno = EAGAIN; return -1; };
struct FakeSystem {
    FakeSystem();
    FakeSystem(const FakeSystem &) = delete;
    FakeSystem &operator=(const FakeSystem &) = delete;
    ~FakeSystem();

    std::function<void *(size_t)> malloc;
    std::function<void *(size_t, size_t)> calloc;
    std::function<void *(void *, size_t)> realloc;
    std::function<int(pthread_mutex_t *, const pthread_mutexattr_t *)> pthread_mutex_init;
    std::function<int(pthread_mutex_t *)> pthread_mutex_lock;
    std::function<int(pthread_mutex_t *)> pthread_mutex_unlock;
    std::function<int(pthread_mutex_t *)> pthread_mutex_destroy;
    std::function<int(pthread_attr_t *)> pthread_attr_init;
    std::function<int(pthread_attr_t *, size_t)> pthread_attr_setstacksize;
    std::function<int(pthread_attr_t *)> pthread_attr_destroy;
    std::function<int(pthread_t *, const pthread_attr_t *, void *(*)(void *), void *)>
        pthread_create;
    std::function<int(pthread_t, void **)> pthread_join;
    std::function<int()> sched_yield;
    std::function<unsigned(unsigned)> sleep;
    std::function<int(const struct timespec *, struct timespec *)> nanosleep;
    std::function<int(struct timeval *, void *)> gettimeofday;
    std::function<int(char *, size_t)> gethostname;
    std::function<struct hostent *(const char *)> gethostbyname;
    std::function<pid_t()> fork;
    std::function<int(const char *, mode_t)> mkdir;
    std::function<int(const char *, mode_t)> chmod;
    std::function<int(int, const char *, int, unsigned, struct statx *)> statx;
    std::function<ssize_t(int, const void *, size_t)> write;
    std::function<int(int)> fsync;
    std::function<int(int, off_t)> ftruncate;
    std::function<int(key_t, int, int)> semget;
    std::function<int(int, struct sembuf *, size_t)> semop;
    std::function<int(int, int, int)> semctl;
};

} // namespace zelvo_test
