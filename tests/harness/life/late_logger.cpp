// SPDX-License-Identifier: Apache-2.0
// A program that logs when it is nearly over, in the way that its argument names. It ends with 0 if
// every call has answered as it should.
#include <cstdlib>
#include <cstring>
#include <thread>

#include <unistd.h>

#include "zelvo.h"

namespace {

ZlvObject *logger = nullptr;
int failures = 0;

void expect(bool holds)
{
    failures += holds ? 0 : 1;
}

void open()
{
    expect(ZlvOpenToolkit("late.properties", nullptr) == 1);
    logger = ZlvGetObject("late.log", nullptr);
    expect(logger != nullptr);
}

void log(const UChar *text)
{
    expect(ZlvLogUText(logger, text).type == CX_STATUS_OK);
}

void close()
{
    ZlvReleaseObject(logger);
    logger = nullptr;
    ZlvCloseToolkit();
}

/// What calls answer once the toolkit is closed.
void callAfterClose()
{
    expect(ZlvGetObject("late.log", nullptr) == nullptr);
    expect(ZlvGetObject("late.log", "zlv_basiclogger") == nullptr);
    expect(ZlvIsLoggable(logger, ZLV_LEVEL_FATAL) == 0);
    expect(ZlvGetLoggerClasses() == nullptr);
    log(u"never written");
    ZlvCloseToolkit();
}

/// Runs when static objects are destroyed, which is after main() and after what main() has
/// registered with atexit(). Only then does the program know how it ends.
class AtTheEnd {
public:
    void (*action)() = nullptr;

    ~AtTheEnd()
    {
        if (action != nullptr)
            action();
        if (failures != 0)
            _exit(1);
    }
};

AtTheEnd atTheEnd;

class AtThreadEnd {
public:
    ~AtThreadEnd() { log(u"from the end of a thread"); }
    void touch() {}
};

thread_local AtThreadEnd atThreadEnd;

void logInDestructor()
{
    atTheEnd.action = [] {
        log(u"from a destructor");
        close();
    };
}

void logInDestructorAndLeaveOpen()
{
    atTheEnd.action = [] { log(u"from a destructor"); };
}

void logAtExit()
{
    std::atexit([] {
        log(u"from atexit");
        close();
    });
}

void callAfterCloseAtExit()
{
    std::atexit(close);
    log(u"before");
    atTheEnd.action = callAfterClose;
}

void openAgainAfterCloseAtExit()
{
    std::atexit(close);
    log(u"before");
    atTheEnd.action = [] {
        callAfterClose();
        open();
        log(u"from a second life");
        close();
    };
}

void logAtThreadEnds()
{
    std::thread([] { atThreadEnd.touch(); }).join();
    atThreadEnd.touch();
}

void leaveThreadsLogging()
{
    for (int thread = 0; thread < 4; ++thread)
        std::thread([] {
            while (true)
                log(u"from a thread that is left");
        }).detach();
    for (int record = 0; record < 1000; ++record)
        log(u"from a thread that is left");
}

void leaveAtOnce()
{
    log(u"before");
    _exit(failures == 0 ? 0 : 1);
}

struct Way {
    const char *name;
    void (*prepare)();
};

constexpr Way WAYS[] = {
    {"destructor", logInDestructor},
    {"destructor_left_open", logInDestructorAndLeaveOpen},
    {"atexit", logAtExit},
    {"after_close", callAfterCloseAtExit},
    {"second_life", openAgainAfterCloseAtExit},
    {"thread_ends", logAtThreadEnds},
    {"threads_left", leaveThreadsLogging},
    {"at_once", leaveAtOnce},
};

} // namespace

int main(int, char **argv)
{
    open();
    for (const Way &way : WAYS)
        if (std::strcmp(way.name, argv[1]) == 0) {
            way.prepare();
            return 0;
        }
    return 2;
}
