// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <string>

namespace zelvo_test {

/// A path of LENGTH bytes, which is above 2, in the working directory.
inline std::string longPath(size_t length)
{
    std::string path(length, 'n');
    path[0] = '.';
    path[1] = '/';
    return path;
}

} // namespace zelvo_test
