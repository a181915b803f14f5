// SPDX-License-Identifier: Apache-2.0
// Reading of properties files into a list of the test's own.
#pragma once

#include <string>

#include "ZlvIntl.h"
#include "support/Buffers.h"
#include "support/FailAlloc.h"
#include "support/FileFaults.h"
#include "support/TestDir.h"

namespace zelvo_test {

/// Gives a test files to read, the list they fill, and an error record that shows when it is
/// written.
class ReadProps : public TestDir {
protected:
    /// Reads TEXT as a whole file and tells whether that succeeded.
    bool reads(const std::string &text)
    {
        return zlvDoReadProps(write("test.properties", text).c_str(), &list, &error) == 1;
    }

    bool errorIs(char type, int32_t code) const { return error.type == type && error.code == code; }
    bool errorUntouched() const { return errorIs('x', -7); }

    Props list;
    CxStatus error{'x', -7};
};

} // namespace zelvo_test
