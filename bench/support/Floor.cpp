// SPDX-License-Identifier: Apache-2.0
#include "support/Floor.h"

#include <cstdlib>
#include <iterator>
#include <utility>

#include <fcntl.h>
#include <sys/sem.h>
#include <sys/stat.h>
#include <unistd.h>

namespace zelvo_bench {

namespace {

int openToAppend(const std::string &file)
{
    return open(file.c_str(), O_RDWR | O_CREAT | O_APPEND | O_CLOEXEC, 0644);
}

/// A floor that fails would be a low one.
void must(bool succeeded)
{
    if (!succeeded)
        std::abort();
}

/// Looks at a file without its times; at the directory itself, here a file, when the name is empty.
void lookAt(int directory, const char *name)
{
    struct statx facts;
    const int flags = *name == '\0' ? AT_EMPTY_PATH : 0;
    must(statx(directory, name, flags, STATX_TYPE | STATX_INO | STATX_SIZE, &facts) == 0);
}

} // namespace

WriteFloor::WriteFloor(const std::string &file, std::string record)
    : record_(std::move(record)), descriptor_(openToAppend(file))
{
}

void WriteFloor::operator()() const
{
    must(write(descriptor_, record_.data(), record_.size()) ==
         static_cast<ssize_t>(record_.size()));
}

AppendFloor::AppendFloor(const std::string &file, std::string record)
    : file_(file), write_(file, std::move(record))
{
}

void AppendFloor::operator()() const
{
    struct stat facts;
    must(stat(file_.c_str(), &facts) == 0);
    write_();
}

OwnCallsFloor::OwnCallsFloor(const std::string &file, std::string record)
    : file_(file), write_(file, std::move(record))
{
}

void OwnCallsFloor::operator()() const
{
    lookAt(AT_FDCWD, file_.c_str());
    write_();
}

SharedFloor::SharedFloor(const std::string &file, std::string record, int semaphore)
    : write_(file, std::move(record)), semaphore_(semaphore)
{
}

void SharedFloor::operator()() const
{
    sembuf down{.sem_num = 0, .sem_op = -1, .sem_flg = SEM_UNDO};
    must(semop(semaphore_, &down, 1) == 0);
    lookAt(write_.descriptor(), "");
    write_();
    sembuf up[] = {{.sem_num = 0, .sem_op = 0, .sem_flg = IPC_NOWAIT},
                   {.sem_num = 0, .sem_op = 1, .sem_flg = SEM_UNDO}};
    must(semop(semaphore_, up, std::size(up)) == 0);
}

} // namespace zelvo_bench
