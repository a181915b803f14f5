// SPDX-License-Identifier: Apache-2.0
// How the portability layer makes the status records that it returns.
#pragma once

#include <cerrno>

#include "CxTypes.h"

namespace zelvo {

inline constexpr CxStatus success{CX_STATUS_OK, 0};

constexpr CxStatus platformError(int code)
{
    return {CX_STATUS_PLATFORM, code};
}

inline constexpr CxStatus missingArgument = platformError(EINVAL);

/// The failure that the last system call left in errno.
inline CxStatus lastError()
{
    return platformError(errno);
}

/// The status of a system call that answers -1 on failure.
inline CxStatus statusOfCall(long result)
{
    return result == -1 ? lastError() : success;
}

/// The status of a thread-library call, whose result is the error number itself.
constexpr CxStatus statusOfNumber(int number)
{
    return number == 0 ? success : platformError(number);
}

} // namespace zelvo
