// SPDX-License-Identifier: Apache-2.0
// What a portability call answered, told so that a failing test shows both type and code.
#pragma once

#include <gtest/gtest.h>

#include "CxTypes.h"

namespace zelvo_test {

inline testing::AssertionResult statusIs(CxStatus status, char type, int32_t code)
{
    if (status.type == type && status.code == code)
        return testing::AssertionSuccess();
    return testing::AssertionFailure() << "status is '" << status.type << "'/" << status.code;
}

/// Success: '-' and code 0.
inline testing::AssertionResult succeeded(CxStatus status)
{
    return statusIs(status, '-', 0);
}

/// Failure with the platform error number CODE.
inline testing::AssertionResult failedWith(CxStatus status, int32_t code)
{
    return statusIs(status, 'p', code);
}

} // namespace zelvo_test
