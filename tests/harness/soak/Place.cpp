// SPDX-License-Identifier: Apache-2.0
#include "Place.h"

#include <fstream>
#include <sstream>
#include <utility>

#include <fcntl.h>
#include <unistd.h>

#include "SoakWriter.h"

namespace zelvo_test {

namespace {

namespace fs = std::filesystem;

/// Where a rollover's removals are kept, and what was taken away.
constexpr const char *REMOVED = "removed";
constexpr const char *TAKEN = "taken";

std::string contentOf(int descriptor)
{
    std::string content;
    char chunk[65536];
    for (ssize_t length = 0; (length = read(descriptor, chunk, sizeof chunk)) > 0;)
        content.append(chunk, static_cast<size_t>(length));
    return content;
}

void readFile(const fs::path &path, Tally &tally)
{
    std::ostringstream content;
    content << std::ifstream(path, std::ios::binary).rdbuf();
    tally.read(content.str());
}

} // namespace

Place::Place(const fs::path &directory, Steps steps)
    : directory_(directory), steps_(std::move(steps))
{
    fs::create_directories(directory_ / REMOVED);
    fs::create_directories(directory_ / TAKEN);
}

/// Renames the live file, which cannot fall between two steps of those who write to it, and then
/// looks at what it has got.
bool Place::take(std::minstd_rand &random)
{
    const fs::path live = directory_ / LOG_NAMES[(random() >> 8) % LOG_NAMES.size()];
    const fs::path away = directory_ / TAKEN / std::to_string(moved_ + deleted_);
    std::error_code error;
    fs::rename(live, away, error);
    if (error)
        return false;
    taken_.push_back({open(away.c_str(), O_RDONLY | O_CLOEXEC), away, steps_()});
    return true;
}

void Place::moveLive(std::minstd_rand &random)
{
    moved_ += take(random) ? 1 : 0;
}

void Place::deleteLive(std::minstd_rand &random)
{
    if (!take(random))
        return;
    ++deleted_;
    fs::remove(std::exchange(taken_.back().path, {}));
}

bool Place::isQuiet(const Taken &file) const
{
    const std::vector<uint32_t> now = steps_();
    for (size_t writer = 0; writer < now.size(); ++writer)
        if (now[writer] < file.since[writer] + 2)
            return false;
    return true;
}

void Place::readTaken(const Taken &file, Tally &tally) const
{
    tally.read(contentOf(file.descriptor));
    close(file.descriptor);
    if (!file.path.empty())
        fs::remove(file.path);
}

void Place::readRemoved(Tally &tally) const
{
    for (const auto &entry : fs::directory_iterator(directory_ / REMOVED)) {
        readFile(entry.path(), tally);
        fs::remove(entry.path());
    }
}

void Place::settle(Tally &tally)
{
    readRemoved(tally);
    const auto quiet = std::stable_partition(taken_.begin(), taken_.end(),
                                             [this](const Taken &file) { return !isQuiet(file); });
    for (auto file = quiet; file != taken_.end(); ++file)
        readTaken(*file, tally);
    taken_.erase(quiet, taken_.end());
}

void Place::settleAll(Tally &tally)
{
    for (const Taken &file : std::exchange(taken_, {}))
        readTaken(file, tally);
    for (const auto &entry : fs::recursive_directory_iterator(directory_))
        if (entry.is_regular_file())
            readFile(entry.path(), tally);
}

} // namespace zelvo_test
