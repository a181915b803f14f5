// SPDX-License-Identifier: Apache-2.0
#include "support/Life.h"

#include <algorithm>
#include <cstdio>

#include <sys/mman.h>
#include <sys/stat.h>
#include <unistd.h>

#include "CxSystem.h"
#include "ZlvToolkit.h"
#include "ZlvToolkitIntl.h"
#include "support/Fuzz.h"
#include "support/Scratch.h"
#include "support/Semaphores.h"

namespace zelvo_fuzz {
namespace {

constexpr double START = 1.7e12; // in November 2023

double now;

/// Standard output as a file in memory; fuzzers report on the standard error.
class Console {
public:
    Console() : descriptor_(memfd_create("console", MFD_CLOEXEC | MFD_ALLOW_SEALING))
    {
        check(dup2(descriptor_, STDOUT_FILENO) == STDOUT_FILENO, "standard output can be caught");
    }

    /// What was printed since the last call.
    std::string taken() const
    {
        std::fflush(stdout);
        struct stat facts {};
        fstat(descriptor_, &facts);
        std::string text(static_cast<size_t>(facts.st_size), '\0');
        check(pread(descriptor_, text.data(), text.size(), 0) == static_cast<ssize_t>(text.size()),
              "standard output can be read");
        check(ftruncate(descriptor_, 0) == 0 && lseek(STDOUT_FILENO, 0, SEEK_SET) == 0,
              "standard output can be emptied");
        return text;
    }

private:
    int descriptor_;
};

/// The lowest number that is free: it grows when a descriptor is left open.
int nextDescriptor()
{
    const int next = dup(STDERR_FILENO);
    close(next);
    return next;
}

void checkNothingIsKept(int descriptor)
{
    check(ZLV_TK_INSTANCES == nullptr, "a closed toolkit has no objects");
    check(ZLV_TK_CLASSES == nullptr, "a closed toolkit has no classes");
    check(ZLV_TK_CFG_DATA == nullptr, "a closed toolkit has no configurations");
    check(nextDescriptor() == descriptor, "a closed toolkit has no open files");
    check(allSemaphoresAreFree(), "a closed toolkit holds no semaphore");
}

bool areEqual(const ZlvStatus &a, const ZlvStatus &b)
{
    return a.type == b.type && a.code == b.code && a.icuError == b.icuError;
}

} // namespace

bool operator==(const Traces &a, const Traces &b)
{
    return a.opened == b.opened && a.console == b.console && a.files == b.files &&
           std::equal(a.results.begin(), a.results.end(), b.results.begin(), b.results.end(),
                      areEqual);
}

Traces live(const char *propertiesFile, const std::function<std::vector<ZlvStatus>()> &body)
{
    static const Console console;
    const Scratch::Visit visit;
    const int descriptor = nextDescriptor();
    now = START;
    forgetSemaphores();
    Traces traces{};
    CxStatus error{CX_STATUS_OK, 0};
    traces.opened = ZlvOpenToolkit(propertiesFile, &error) == 1;
    check(error.type == CX_STATUS_OK, "a file that is there can be read");
    if (traces.opened)
        traces.results = body();
    ZlvCloseToolkit();
    checkNothingIsKept(descriptor);
    traces.console = console.taken();
    traces.files = Scratch::only().emptied();
    return traces;
}

} // namespace zelvo_fuzz

// The names are the linker's.
// NOLINTBEGIN(bugprone-reserved-identifier, cert-dcl37-c, cert-dcl51-cpp)
extern "C" {
double __wrap_CxSystemGetTimestamp();
CxStatus __wrap_CxSystemGetFQHostname(char *buffer, size_t size);

double __wrap_CxSystemGetTimestamp()
{
    return zelvo_fuzz::now++;
}
CxStatus __wrap_CxSystemGetFQHostname(char *buffer, size_t size)
{
    std::snprintf(buffer, size, "till.example.org");
    return {CX_STATUS_OK, 0};
}
}
// NOLINTEND(bugprone-reserved-identifier, cert-dcl37-c, cert-dcl51-cpp)
