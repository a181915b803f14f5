// SPDX-License-Identifier: Apache-2.0
// What the properties of handlers do.
#include <sys/stat.h>

#include <filesystem>
#include <fstream>
#include <iterator>
#include <sstream>

#include "Observers.h"

namespace fs = std::filesystem;

namespace zelvo_test {
namespace {

/// The names of what the working directory holds, which is empty afterwards.
std::string takeFiles(Subject &subject)
{
    subject.close();
    std::string names;
    for (const fs::directory_entry &entry : fs::directory_iterator("."))
        names += (names.empty() ? "" : " ") + entry.path().filename().string();
    for (const fs::directory_entry &entry : fs::directory_iterator("."))
        fs::remove_all(entry.path());
    return names;
}

/// Has the handler write to a file of SIZE bytes that it has not open; tells whether it rolled.
bool rollsAt(Subject &subject, uint64_t size)
{
    std::ofstream("default.log").close();
    fs::resize_file("default.log", size);
    subject.log();
    const bool rolled = fs::exists("default1.log");
    takeFiles(subject);
    return rolled;
}

std::string permissionsOf(const char *path)
{
    struct stat status = {};
    if (stat(path, &status) != 0)
        return "not there";
    std::ostringstream text;
    text << std::oct << (status.st_mode & 0777U);
    return text.str();
}

std::string contentOf(const char *path)
{
    std::ifstream file(path, std::ios::binary);
    return {std::istreambuf_iterator<char>(file), {}};
}

} // namespace

std::string formatterOf(Subject &subject, const char * /*key*/)
{
    ZlvObject *formatter = ZlvHandlerGetFormatter(subject.object());
    const std::string name = textOf(ZlvGetObjectName(formatter));
    ZlvReleaseObject(formatter);
    return name;
}

std::string limitOfFile(Subject &subject, const char * /*key*/)
{
    for (const uint64_t size : {0U, 1023U, 1024U, 4999U, 5000U, 1048575U, 1048576U})
        if (rollsAt(subject, size))
            return std::to_string(size);
    return "none";
}

std::string filesKept(Subject &subject, const char * /*key*/)
{
    ZlvSetObjProp(subject.object(), "maxFileBytes", "1");
    for (int record = 0; record < 8; ++record)
        subject.log();
    const std::string names = takeFiles(subject);
    std::istringstream words(names);
    return std::to_string(std::distance(std::istream_iterator<std::string>(words),
                                        std::istream_iterator<std::string>()));
}

std::string fileWritten(Subject &subject, const char * /*key*/)
{
    subject.log();
    const std::string names = takeFiles(subject);
    return names.empty() ? "no file" : names;
}

std::string isAppending(Subject &subject, const char * /*key*/)
{
    std::ofstream("default.log") << "before";
    subject.log();
    const bool isThere = contentOf("default.log").rfind("before", 0) == 0;
    takeFiles(subject);
    return isThere ? "true" : "false";
}

std::string modeOfFile(Subject &subject, const char * /*key*/)
{
    const mode_t before = umask(0);
    subject.log();
    umask(before);
    const std::string mode = permissionsOf("default.log");
    takeFiles(subject);
    return mode;
}

std::string modeOfDirectory(Subject &subject, const char * /*key*/)
{
    ZlvSetObjProp(subject.object(), "fileName", "logs/app.log");
    subject.log();
    const std::string mode = permissionsOf("logs");
    takeFiles(subject);
    return mode;
}

std::string encodingKept(Subject &subject, const char * /*key*/)
{
    subject.log();
    const bool isPlain = contentOf("default.log").find("record") != std::string::npos;
    takeFiles(subject);
    const char *kept = subject.fileVars()->encoding;
    if (!isPlain)
        return "other bytes";
    return kept != nullptr ? kept : "none";
}

std::string semaphoreKey(Subject &subject, const char * /*key*/)
{
    return std::to_string(subject.fileVars()->semKey);
}

std::string internalErrorsFlag(Subject &subject, const char * /*key*/)
{
    return subject.fileVars()->logInternalErrs == 1 ? "true" : "false";
}

} // namespace zelvo_test
