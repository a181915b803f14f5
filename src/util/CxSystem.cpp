// SPDX-License-Identifier: Apache-2.0
#include "CxSystem.h"

#include <cstring>
#include <netdb.h>
#include <sys/time.h>
#include <unistd.h>

#include "util/CxStatusIntl.h"

using namespace zelvo;

namespace {

/// The code of every failed look-up of the host's name: the resolver sets no errno to report.
constexpr CxStatus unknownHost = platformError(38);

bool isQualified(const char *name)
{
    return std::strchr(name, '.') != nullptr;
}

} // namespace

double CxSystemGetTimestamp()
{
    timeval now{};
    gettimeofday(&now, nullptr);
    const int64_t milliseconds = int64_t{now.tv_sec} * 1000 + now.tv_usec / 1000;
    return static_cast<double>(milliseconds);
}

CxStatus CxSystemGetFQHostname(char *buffer, size_t size)
{
    if (buffer == nullptr)
        return missingArgument;
    *buffer = '\0';
    if (gethostname(buffer, size) == -1) {
        *buffer = '\0'; // a name that did not fit was left there without a terminator
        return unknownHost;
    }
    if (isQualified(buffer))
        return success;
    const hostent *host = gethostbyname(buffer);
    if (host == nullptr)
        return unknownHost;
    if (isQualified(host->h_name))
        std::strncpy(buffer, host->h_name, size);
    return success;
}
