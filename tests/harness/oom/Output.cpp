// SPDX-License-Identifier: Apache-2.0
// What calls leave outside the process: printed text, files, a semaphore.
#include <algorithm>
#include <cstdio>
#include <filesystem>
#include <fstream>
#include <map>
#include <sstream>

#include <sys/mman.h>
#include <sys/sem.h>
#include <sys/syscall.h>
#include <unistd.h>

#include "World.h"

namespace fs = std::filesystem;

namespace zelvo_test {
namespace {

int capture = -1;

/// By file, how many of its bytes have been seen.
std::map<std::string, size_t> seen;

std::string printed()
{
    std::fflush(stdout);
    const off_t size = lseek(capture, 0, SEEK_CUR);
    std::string text(static_cast<size_t>(std::max<off_t>(size, 0)), '\0');
    if (pread(capture, text.data(), text.size(), 0) < 0)
        text.clear();
    if (ftruncate(capture, 0) == 0)
        lseek(capture, 0, SEEK_SET);
    return text;
}

std::string contentOf(const fs::path &path)
{
    std::ostringstream content;
    content << std::ifstream(path, std::ios::binary).rdbuf();
    return content.str();
}

/// What stands behind the part of a file that was seen before; all of it when that part is gone.
std::string appended(const std::string &name)
{
    const std::string content = contentOf(name);
    size_t &known = seen[name];
    const std::string fresh = content.substr(known <= content.size() ? known : 0);
    known = content.size();
    return fresh;
}

Lines fileNames()
{
    Lines names;
    for (const fs::directory_entry &entry : fs::recursive_directory_iterator("."))
        if (entry.is_regular_file())
            names.push_back(entry.path().string());
    std::sort(names.begin(), names.end());
    return names;
}

} // namespace

int32_t ownSemaphoreKey()
{
    static const int32_t key =

        0x5B000000 | static_cast<int32_t>(syscall(SYS_getpid) & 0xFFFFFF); // for children too
    return key;
}

void removeSemaphore()
{
    semctl(semget(ownSemaphoreKey(), 1, 0), 0, IPC_RMID);
}

OwnDirectory::OwnDirectory()
    : previous_(fs::current_path()), path_(fs::temp_directory_path() / "zelvo-XXXXXX")
{
    fs::current_path(mkdtemp(path_.data()));
}

OwnDirectory::~OwnDirectory()
{
    fs::current_path(previous_);
    fs::remove_all(path_);
}

bool isCut(const std::string &part, const std::string &whole)
{
    size_t at = 0;
    for (const char c : part) {
        at = whole.find(c, at);
        if (at == std::string::npos)
            return false;
        ++at;
    }
    return true;
}

FILE *captureOutput()
{
    FILE *previous = fdopen(dup(STDOUT_FILENO), "w");
    capture = memfd_create("output", MFD_CLOEXEC);
    dup2(capture, STDOUT_FILENO);
    return previous;
}

std::string newOutput()
{
    std::string text = printed();
    for (const std::string &name : fileNames())
        if (const std::string fresh = appended(name); !fresh.empty())
            text += name + ":" + fresh;
    return text;
}

std::string allFiles()
{
    std::string content;
    for (const std::string &name : fileNames())
        content += contentOf(name);
    return content;
}

void removeFiles()
{
    seen.clear();
    for (const fs::directory_entry &entry : fs::directory_iterator("."))
        fs::remove_all(entry.path());
}

} // namespace zelvo_test
