// SPDX-License-Identifier: Apache-2.0
#include "ZlvMisc.h"

#include <cstring>

const char *ZlvReportPlatformErr(char type, int32_t code)
{
    return ZlvGetPlatformErrStr(type, code);
}

const char *ZlvGetPlatformErrStr(char type, int32_t code)
{
    // strerror() itself allocates the text of an unknown number; here that text is the thread's
    // own.
    thread_local char unknown[64];
    return type == CX_STATUS_PLATFORM ? strerror_r(code, unknown, sizeof unknown) : nullptr;
}
