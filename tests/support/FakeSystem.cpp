// SPDX-License-Identifier: Apache-2.0
#include "support/FakeSystem.h"

#include <cstdarg>

namespace zelvo_test {
namespace {
FakeSystem *current = nullptr;
}

FakeSystem::FakeSystem()
{
    current = this;
}

FakeSystem::~FakeSystem()
{
    current = nullptr;
}

} // namespace zelvo_test

using zelvo_test::current;

// The linker's --wrap=f sends calls of f to __wrap_f and names the real one __real_f. The list of
// wrapped names stands in tests/CMakeLists.txt.
// NOLINTBEGIN(bugprone-macro-parentheses): the macro's arguments are types and argument lists.
#define ANSWER(RESULT, NAME, PARAMETERS, ARGUMENTS)                                                \
    extern "C" RESULT __real_##NAME PARAMETERS;                                                    \
    extern "C" RESULT __wrap_##NAME PARAMETERS;                                                    \
    RESULT __wrap_##NAME PARAMETERS                                                                \
    {                                                                                              \
        return current != nullptr && current->NAME ? current->NAME ARGUMENTS                       \
                                                   : __real_##NAME ARGUMENTS;                      \
    }
// NOLINTEND(bugprone-macro-parentheses)

ANSWER(void *, malloc, (size_t size), (size))
ANSWER(void *, calloc, (size_t count, size_t size), (count, size))
ANSWER(void *, realloc, (void *block, size_t size), (block, size))
ANSWER(int, pthread_mutex_init, (pthread_mutex_t * mutex, const pthread_mutexattr_t *attributes),
       (mutex, attributes))
ANSWER(int, pthread_mutex_lock, (pthread_mutex_t * mutex), (mutex))
ANSWER(int, pthread_mutex_unlock, (pthread_mutex_t * mutex), (mutex))
ANSWER(int, pthread_mutex_destroy, (pthread_mutex_t * mutex), (mutex))
ANSWER(int, pthread_attr_init, (pthread_attr_t * attributes), (attributes))
ANSWER(int, pthread_attr_setstacksize, (pthread_attr_t * attributes, size_t size),
       (attributes, size))
ANSWER(int, pthread_attr_destroy, (pthread_attr_t * attributes), (attributes))
ANSWER(int, pthread_create,
       (pthread_t * thread, const pthread_attr_t *attributes, void *(*start)(void *),
        void *argument),
       (thread, attributes, start, argument))
ANSWER(int, pthread_join, (pthread_t thread, void **result), (thread, result))
ANSWER(int, sched_yield, (), ())
ANSWER(unsigned, sleep, (unsigned seconds), (seconds))
ANSWER(int, nanosleep, (const struct timespec *time, struct timespec *rest), (time, rest))
ANSWER(int, gettimeofday, (struct timeval * now, void *zone), (now, zone))
ANSWER(int, gethostname, (char *name, size_t size), (name, size))
ANSWER(struct hostent *, gethostbyname, (const char *name), (name))
ANSWER(pid_t, fork, (), ())
ANSWER(int, mkdir, (const char *path, mode_t mode), (path, mode))
ANSWER(int, chmod, (const char *path, mode_t mode), (path, mode))
ANSWER(int, statx, (int file, const char *path, int flags, unsigned wanted, struct statx *facts),
       (file, path, flags, wanted, facts))
ANSWER(ssize_t, write, (int file, const void *bytes, size_t size), (file, bytes, size))
ANSWER(int, fsync, (int file), (file))
ANSWER(int, ftruncate, (int file, off_t length), (file, length))
ANSWER(int, semget, (key_t key, int count, int flags), (key, count, flags))
ANSWER(int, semop, (int set, struct sembuf *operations, size_t count), (set, operations, count))

// A function with a variable argument; an answer does without it.
extern "C" int __real_semctl(int set, int number, int command, ...);
extern "C" int __wrap_semctl(int set, int number, int command, ...);
int __wrap_semctl(int set, int number, int command, ...)
{
    if (current != nullptr && current->semctl)
        return current->semctl(set, number, command);
    va_list list;
    va_start(list, command);
    void *argument = command == SETVAL || command == IPC_STAT ? va_arg(list, void *) : nullptr;
    va_end(list);
    return __real_semctl(set, number, command, argument);
}
