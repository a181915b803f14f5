// SPDX-License-Identifier: Apache-2.0
#include "support/Scratch.h"

#include <cerrno>
#include <fstream>
#include <iterator>

#include <unistd.h>

#include "CxFile.h"
#include "CxFilePath.h"
#include "support/Fuzz.h"
#include "util/CxStatusIntl.h"

namespace fs = std::filesystem;

namespace zelvo_fuzz {
namespace {

std::string newDirectory()
{
    std::string pattern = fs::temp_directory_path() / "zelvo-fuzz-XXXXXX";
    check(mkdtemp(pattern.data()) != nullptr, "a scratch directory can be made");
    return pattern;
}

std::string contentOf(const fs::path &path)
{
    std::ifstream file(path, std::ios::binary);
    return {std::istreambuf_iterator<char>(file), {}};
}

/// Directories may have been made with any permissions.
void collect(const fs::path &directory, std::map<std::string, std::string> &contents)
{
    fs::permissions(directory, fs::perms::owner_all);
    for (const auto &entry : fs::directory_iterator(directory)) {
        if (entry.is_directory())
            collect(entry.path(), contents);
        else
            contents[entry.path()] = contentOf(entry.path());
        fs::remove(entry.path());
    }
}

bool isAllowed(const char *name)
{
    return name == nullptr || Scratch::only().holds(name);
}

} // namespace

Scratch::Scratch() : path_(newDirectory()) {}

Scratch::~Scratch()
{
    std::error_code ignored;
    fs::remove_all(path_, ignored);
}

const Scratch &Scratch::only()
{
    static const Scratch scratch;
    return scratch;
}

bool Scratch::holds(const std::string &path) const
{
    std::string native = path;
    std::replace(native.begin(), native.end(), '\\', '/');
    const bool isRelative = !native.starts_with('/');
    return (isRelative || native == path_ || native.starts_with(path_ + "/")) &&
           native.find("..") == std::string::npos;
}

std::map<std::string, std::string> Scratch::emptied() const
{
    std::map<std::string, std::string> contents;
    collect(path_, contents);
    return contents;
}

Scratch::Visit::Visit()
{
    fs::current_path(only().path_);
}

Scratch::Visit::~Visit()
{
    fs::current_path(home_);
}

} // namespace zelvo_fuzz

using namespace zelvo_fuzz;

// The names are the linker's: these stand between the file handlers and the portability layer.
// NOLINTBEGIN(bugprone-reserved-identifier, cert-dcl37-c, cert-dcl51-cpp)
extern "C" {
CxStatus __real_CxFileOpenMode(CxFile *file, const char *name, int32_t flags, uint32_t mode);
CxStatus __wrap_CxFileOpenMode(CxFile *file, const char *name, int32_t flags, uint32_t mode);
CxStatus __real_CxFileNameRemove(const char *name);
CxStatus __wrap_CxFileNameRemove(const char *name);
CxStatus __real_CxFileNameRename(const char *oldName, const char *newName);
CxStatus __wrap_CxFileNameRename(const char *oldName, const char *newName);
int32_t __real_CxFilePathMkdirs(const CxFilePath *path, uint32_t mode);
int32_t __wrap_CxFilePathMkdirs(const CxFilePath *path, uint32_t mode);

CxStatus __wrap_CxFileOpenMode(CxFile *file, const char *name, int32_t flags, uint32_t mode)
{
    if (isAllowed(name))
        return __real_CxFileOpenMode(file, name, flags, mode);
    *file = -1;
    return zelvo::platformError(EACCES);
}
CxStatus __wrap_CxFileNameRemove(const char *name)
{
    return isAllowed(name) ? __real_CxFileNameRemove(name) : zelvo::platformError(EACCES);
}
CxStatus __wrap_CxFileNameRename(const char *oldName, const char *newName)
{
    return isAllowed(oldName) && isAllowed(newName) ? __real_CxFileNameRename(oldName, newName)
                                                    : zelvo::platformError(EACCES);
}
int32_t __wrap_CxFilePathMkdirs(const CxFilePath *path, uint32_t mode)
{
    const bool isValid = path->pathLength >= 0;
    return !isValid || isAllowed(path->path) ? __real_CxFilePathMkdirs(path, mode) : EACCES;
}
}
// NOLINTEND(bugprone-reserved-identifier, cert-dcl37-c, cert-dcl51-cpp)
