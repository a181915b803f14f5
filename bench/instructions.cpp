// SPDX-License-Identifier: Apache-2.0
// Logs records of one kind, for scripts/gate, which counts the instructions that they take:
//     zelvo_bench_instructions KIND RECORDS
// Without arguments it prints the kinds, and with "versions" what the figures depend on. It runs in
// the directory that holds the message bundle.
#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <initializer_list>
#include <thread>

#include <gnu/libc-version.h>
#include <sys/ipc.h>
#include <sys/sem.h>
#include <unicode/uversion.h>
#include <unistd.h>

#include "fixed_surroundings.h"
#include "zelvo.h"

namespace {

constexpr const char *BUNDLE = "./messages";
constexpr const char *NO_ROLLOVER = "2000000000";
constexpr unsigned WARM_UP = 100;

/// A log file whose path has the same length in each run.
class LogFile {
public:
    LogFile() : isThere_(mkdtemp(directory_) != nullptr)
    {
        static_cast<void>(std::snprintf(path_, sizeof path_, "%s/records.log", directory_));
    }
    LogFile(const LogFile &) = delete;
    LogFile &operator=(const LogFile &) = delete;
    ~LogFile()
    {
        unlink(path_);
        rmdir(directory_);
    }

    bool isThere() const { return isThere_; }
    const char *path() const { return path_; }

private:
    char directory_[32] = "/tmp/zelvo.XXXXXX";
    char path_[64];
    bool isThere_;
};

/// What a kind of record is made with.
struct Kind {
    const char *name;
    const char *logger;
    const char *handler;
    const char *formatter;
    const char *locale;
    void (*logOne)(ZlvObject *logger, int32_t number);
};

void logRefused(ZlvObject *logger, int32_t number)
{
    ZlvLogDebugMax(logger, "instructions.cpp", __func__, __LINE__, u"{0} has stored {1}", u"Müller",
                   number);
}

void logText(ZlvObject *logger, int32_t number)
{
    ZlvLogUText(logger, u"{0} has stored {1,number,integer} items, status {2}", u"client 17",
                12000 + number, u"complete");
}

void logMessage(ZlvObject *logger, int32_t number)
{
    ZlvLogInfo(logger, BUNDLE, "stored", u"Müller & Söhne", 12000 + number, 98765.432 + number);
}

constexpr Kind KINDS[] = {
    {"refused", "zlv_basiclogger", "zlv_filehandler", "zlv_basicformatter", nullptr, logRefused},
    {"line", "zlv_basiclogger", "zlv_filehandler", "zlv_basicformatter", nullptr, logText},
    {"localised", "zlv_basiclogger", "zlv_filehandler", "zlv_basicformatter", "de_DE", logMessage},
    {"xml", "zlv_pdlogger", "zlv_filehandler", "zlv_xmlformatter", "de_DE", logMessage},
    {"shared", "zlv_basiclogger", "zlv_multiproc_filehandler", "zlv_basicformatter", nullptr,
     logText},
};

/// The key of a semaphore that no other process of the machine has at the same time.
int32_t semaphoreKey()
{
    return 0x67000000 | (gettid() & 0xFFFFFF);
}

const Kind *kindNamed(const char *name)
{
    for (const Kind &kind : KINDS)
        if (std::strcmp(kind.name, name) == 0)
            return &kind;
    return nullptr;
}

/// A logger, bound to a handler with its formatter.
struct Tree {
    Tree(const Kind &kind, const LogFile &file)
        : logger(ZlvGetObject("logger", kind.logger)),
          handler(ZlvGetObject("handler", kind.handler)),
          formatter(ZlvGetObject("formatter", kind.formatter))
    {
        ZlvSetObjProp(logger, "level", "INFO");
        ZlvSetObjProp(logger, "product", "Shop");
        ZlvSetObjProp(logger, "component", "Store");
        ZlvSetObjProp(logger, "server", "store17.example.org");
        ZlvSetObjProp(handler, "fileName", file.path());
        ZlvSetObjProp(handler, "maxFileBytes", NO_ROLLOVER);
        ZlvSetObjPropInt(handler, "MPFileSemKey", semaphoreKey());
        if (kind.locale != nullptr)
            ZlvSetObjProp(formatter, "locale", kind.locale);
        ZlvHandlerSetFormatter(handler, formatter);
        ZlvAddListener(logger, handler);
    }
    Tree(const Tree &) = delete;
    Tree &operator=(const Tree &) = delete;
    ~Tree()
    {
        for (ZlvObject *object : {formatter, handler, logger})
            ZlvReleaseObject(object);
    }

    ZlvObject *logger;
    ZlvObject *handler;
    ZlvObject *formatter;
};

void logRecords(const Kind &kind, ZlvObject *logger, unsigned records)
{
    for (unsigned i = 0; i < records; ++i) {
        zelvo_bench::passMillisecond();
        kind.logOne(logger, static_cast<int32_t>(i));
    }
}

} // namespace

/// The function whose instructions are counted, with those of all that it calls.
extern "C" [[gnu::noinline]] void countedRecords(const Kind &kind, ZlvObject *logger,
                                                 unsigned records);

extern "C" void countedRecords(const Kind &kind, ZlvObject *logger, unsigned records)
{
    logRecords(kind, logger, records);
}

namespace {

unsigned linesIn(const char *path)
{
    unsigned lines = 0;
    std::FILE *file = std::fopen(path, "r");
    if (file == nullptr)
        return 0;
    for (int c = std::getc(file); c != EOF; c = std::getc(file))
        lines += c == '\n' ? 1 : 0;
    std::fclose(file);
    return lines;
}

/// Tells whether the log file has at least a line for each record, or none if all were refused.
bool isWritten(const Kind &kind, const LogFile &file, unsigned records)
{
    const unsigned lines = linesIn(file.path());
    return kind.logOne == logRefused ? lines == 0 : lines >= records;
}

bool run(const Kind &kind, unsigned records)
{
    const LogFile file;
    if (!file.isThere() || !ZlvOpenToolkit(nullptr, nullptr))
        return false;
    {
        const Tree tree{kind, file};
        logRecords(kind, tree.logger, WARM_UP);
        countedRecords(kind, tree.logger, records);
    }
    ZlvCloseToolkit();
    semctl(semget(semaphoreKey(), 0, 0), 0, IPC_RMID);
    return isWritten(kind, file, WARM_UP + records);
}

/// Runs in a thread: its stack and its heap begin at a page, wherever the environment and the path
/// of the program have put those of the main thread. Where a text begins in memory decides how many
/// instructions it takes to copy it.
int runInThread(const Kind &kind, unsigned records)
{
    bool isDone = false;
    std::thread([&] { isDone = run(kind, records); }).join();
    if (!isDone)
        std::fprintf(stderr, "%s: the records have not been written\n", kind.name);
    return isDone ? 0 : 1;
}

void printKinds()
{
    for (const Kind &kind : KINDS)
        std::puts(kind.name);
}

void printVersions()
{
    UVersionInfo version;
    char icu[U_MAX_VERSION_STRING_LENGTH];
    u_getVersion(version);
    u_versionToString(version, icu);
    std::printf("ICU %s, glibc %s, %s\n", icu, gnu_get_libc_version(), COMPILER);
}

} // namespace

int main(int argc, char **argv)
{
    if (argc == 1)
        printKinds();
    else if (argc == 2 && std::strcmp(argv[1], "versions") == 0)
        printVersions();
    else if (const Kind *kind = argc == 3 ? kindNamed(argv[1]) : nullptr)
        return runInThread(*kind, static_cast<unsigned>(std::strtoul(argv[2], nullptr, 10)));
    else
        return 2;
    return 0;
}
