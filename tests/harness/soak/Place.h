// SPDX-License-Identifier: Apache-2.0
// A directory with the files of a log, from which somebody takes files away.
#pragma once

#include <filesystem>
#include <functional>
#include <random>
#include <vector>

#include "Tally.h"

namespace zelvo_test {

class Place {
public:
    /// How often each of those who write here has begun something that looks for the file by its
    /// name. Two such steps after a file was taken away, nobody writes to it any more.
    using Steps = std::function<std::vector<uint32_t>()>;

    /// Makes the directory.
    Place(const std::filesystem::path &directory, Steps steps);
    Place(Place &&other) = default;
    Place(const Place &) = delete;
    Place &operator=(const Place &) = delete;

    /// Take the live file away, if there is one.
    void moveLive(std::minstd_rand &random);
    void deleteLive(std::minstd_rand &random);

    /// Reads and deletes the files that nobody writes to any more.
    void settle(Tally &tally);
    /// Reads all files that are left, when nobody writes.
    void settleAll(Tally &tally);

    size_t moved() const { return moved_; }
    size_t deleted() const { return deleted_; }

private:
    /// A file that was taken away and may still be written to.
    struct Taken {
        int descriptor;
        std::filesystem::path path;
        std::vector<uint32_t> since;
    };

    bool take(std::minstd_rand &random);
    bool isQuiet(const Taken &file) const;
    void readTaken(const Taken &file, Tally &tally) const;
    void readRemoved(Tally &tally) const;

    std::filesystem::path directory_;
    Steps steps_;
    std::vector<Taken> taken_;
    size_t moved_ = 0;
    size_t deleted_ = 0;
};

} // namespace zelvo_test
