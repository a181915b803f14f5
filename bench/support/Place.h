// SPDX-License-Identifier: Apache-2.0
// Where a program leaves its log files.
#pragma once

#include <cstddef>
#include <string>

namespace zelvo_bench {

/// A directory of this process alone, removed at the end. It is made in the directory that the
/// environment variable ZELVO_BENCH_DIR names, or in the build directory.
class Place {
public:
    Place();
    Place(const Place &) = delete;
    Place &operator=(const Place &) = delete;
    ~Place();

    std::string file(const std::string &name) const { return path_ + "/" + name; }

private:
    std::string path_;
};

/// Makes a file, or empties the one there is, which those who have it open keep.
void empty(const std::string &file);

std::string contentOf(const std::string &file);

size_t sizeOf(const std::string &file);

} // namespace zelvo_bench
