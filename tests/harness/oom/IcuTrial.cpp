// SPDX-License-Identifier: Apache-2.0
#include "IcuTrial.h"

#include <csignal>
#include <cstdio>
#include <cstring>

#include <execinfo.h>
#include <sys/mman.h>
#include <sys/wait.h>
#include <unicode/uclean.h>
#include <unistd.h>

namespace zelvo_test {
namespace {

constexpr int SECONDS = 20;
constexpr int DEPTH = 48;

/// What a process tells its parent, even when it crashes.
struct Message {
    char crash[512];
    char leaks[4096]; ///< one in each line
    char complaint[1024];
    uint64_t failed;
    bool leaves;
};

Message *message()
{
    static void *area =
        mmap(nullptr, sizeof(Message), PROT_READ | PROT_WRITE, MAP_SHARED | MAP_ANONYMOUS, -1, 0);
    return static_cast<Message *>(area);
}

template <size_t SIZE>
void tell(char (&field)[SIZE], const std::string &text)
{
    std::snprintf(field, SIZE, "%s", text.c_str());
}

/// The process is lost anyway, so this may do what a signal handler had better not.
void tellOfCrash(int number)
{
    void *stack[DEPTH];
    const std::string site = icuSite(stack, backtrace(stack, DEPTH));
    tell(message()->crash, number == SIGALRM ? "no end: " + site : site);
    _exit(1);
}

void listenToCrashes()
{
    void *stack[DEPTH];
    backtrace(stack, DEPTH); // the first call loads what later ones need
    for (const int number : {SIGSEGV, SIGBUS, SIGABRT, SIGFPE, SIGILL, SIGALRM})
        std::signal(number, tellOfCrash);
    alarm(SECONDS);
}

void runChild(IcuFault fault, bool traces, const std::function<std::string()> &underFault,
              const std::function<std::string()> &afterwards)
{
    listenToCrashes();
    if (traces)
        traceIcu();
    failIcu(fault);
    const std::string complaint = underFault();
    failIcuNoMore();
    message()->failed = icuFailed();
    tell(message()->complaint, complaint + afterwards());
    u_cleanup(); // what ICU keeps for itself goes, what it has lost stays
    message()->leaves = icuLive() != 0;
    std::string sites;
    for (const std::string &site : traces ? leakSites() : std::set<std::string>{})
        sites += site + "\n";
    tell(message()->leaks, sites);
}

std::set<std::string> linesOf(const char *text)
{
    std::set<std::string> lines;
    for (const char *end = std::strchr(text, '\n'); end != nullptr; end = std::strchr(text, '\n')) {
        lines.emplace(text, end);
        text = end + 1;
    }
    return lines;
}

Ending runOnce(IcuFault fault, bool traces, const std::function<std::string()> &underFault,
               const std::function<std::string()> &afterwards)
{
    *message() = {};
    std::fflush(nullptr);
    const pid_t child = fork();
    if (child == 0) {
        runChild(fault, traces, underFault, afterwards);
        _exit(0);
    }
    int status = 0;
    waitpid(child, &status, 0);
    const Message &told = *message();
    return {told.crash, linesOf(told.leaks), told.failed, status != 0, told.complaint};
}

} // namespace

Ending tryWithout(IcuFault fault, const std::function<std::string()> &underFault,
                  const std::function<std::string()> &afterwards)
{
    const Ending ending = runOnce(fault, false, underFault, afterwards);
    return message()->leaves ? runOnce(fault, true, underFault, afterwards) : ending;
}

} // namespace zelvo_test
