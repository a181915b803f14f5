// SPDX-License-Identifier: Apache-2.0
#include "support/Semaphores.h"

#include <algorithm>
#include <cerrno>
#include <cstdarg>
#include <vector>

#include <sys/sem.h>

#include "support/Fuzz.h"

namespace zelvo_fuzz {
namespace {

struct Set {
    key_t key;
    int value;
};

std::vector<Set> sets; // the identifier of a set is its place

int failWith(int code)
{
    errno = code;
    return -1;
}

bool canBeDone(const Set &set, const sembuf &step)
{
    return step.sem_op == 0 ? set.value == 0 : set.value + step.sem_op >= 0;
}

} // namespace

bool allSemaphoresAreFree()
{
    return std::all_of(sets.begin(), sets.end(), [](const Set &set) { return set.value == 1; });
}

void forgetSemaphores()
{
    sets.clear();
}

} // namespace zelvo_fuzz

using namespace zelvo_fuzz;

// The names are the linker's.
// NOLINTBEGIN(bugprone-reserved-identifier, cert-dcl37-c, cert-dcl51-cpp, cert-dcl50-cpp)
extern "C" {
int __wrap_semget(key_t key, int count, int flags);
int __wrap_semctl(int id, int number, int command, ...);
int __wrap_semop(int id, sembuf *steps, size_t count);

int __wrap_semget(key_t key, int count, int flags)
{
    check(count == 1, "a set has one semaphore");
    const auto found = std::find_if(sets.begin(), sets.end(), [&](const Set &set) {
        return set.key == key && key != IPC_PRIVATE;
    });
    if (found != sets.end())
        return (flags & IPC_EXCL) != 0 ? failWith(EEXIST) : static_cast<int>(found - sets.begin());
    if ((flags & IPC_CREAT) == 0)
        return failWith(ENOENT);
    sets.push_back({key, 0});
    return static_cast<int>(sets.size()) - 1;
}

int __wrap_semctl(int id, int number, int command, ...)
{
    check(number == 0 && command == SETVAL, "a new semaphore is given its value, no more");
    va_list arguments;
    va_start(arguments, command);
    sets.at(static_cast<size_t>(id)).value = va_arg(arguments, int);
    va_end(arguments);
    return 0;
}

int __wrap_semop(int id, sembuf *steps, size_t count)
{
    Set after = sets.at(static_cast<size_t>(id));
    for (size_t i = 0; i < count; ++i) {
        check(canBeDone(after, steps[i]), "nobody waits for a semaphore that he holds himself");
        after.value += steps[i].sem_op;
    }
    check(after.value <= 1, "one process holds a semaphore at a time");
    sets.at(static_cast<size_t>(id)) = after;
    return 0;
}
}
// NOLINTEND(bugprone-reserved-identifier, cert-dcl37-c, cert-dcl51-cpp, cert-dcl50-cpp)
