// SPDX-License-Identifier: Apache-2.0
// What a writer process is to do, and what it tells about its progress.
#pragma once

#include <atomic>
#include <cstdint>
#include <string>
#include <vector>

namespace zelvo_test {

/// The work of one writer; handed over as arguments of the program, in the order of the fields.
struct Job {
    std::string file = "shared.log";
    std::string progress{}; ///< file that holds the writer's Progress
    int32_t key = 0;        ///< of the semaphore
    int32_t maxBytes = 64 * 1024;
    int32_t maxFiles = 400;
    uint32_t seed = 1;
    uint32_t writer = 0;       ///< number of the writer, below MOST_WRITERS
    uint32_t count = 0;        ///< records to write; 0 writes until told to stop
    uint32_t signalMicros = 0; ///< interval of a timer's signals; 0 for none
};

/// Shared with the test through a mapped file, so that it outlives a killed writer.
struct Progress {
    std::atomic<uint32_t> begun;        ///< number of the last record handed to the library
    std::atomic<uint32_t> acknowledged; ///< number of the last record whose call succeeded
    std::atomic<uint32_t> stop;         ///< set by the test
};

constexpr uint32_t MOST_WRITERS = 64;

/// What a writer exits with.
enum WriterResult { WRITER_DONE = 0, WRITER_UNUSABLE = 1, WRITER_RECORD_FAILED = 2 };

inline std::vector<std::string> argumentsOf(const Job &job)
{
    return {job.file,
            job.progress,
            std::to_string(job.key),
            std::to_string(job.maxBytes),
            std::to_string(job.maxFiles),
            std::to_string(job.seed),
            std::to_string(job.writer),
            std::to_string(job.count),
            std::to_string(job.signalMicros)};
}

inline Job jobOf(const std::vector<std::string> &arguments)
{
    const auto number = [&](size_t index) {
        return static_cast<uint32_t>(std::stoul(arguments.at(index)));
    };
    return {.file = arguments.at(0),
            .progress = arguments.at(1),
            .key = static_cast<int32_t>(number(2)),
            .maxBytes = static_cast<int32_t>(number(3)),
            .maxFiles = static_cast<int32_t>(number(4)),
            .seed = number(5),
            .writer = number(6),
            .count = number(7),
            .signalMicros = number(8)};
}

} // namespace zelvo_test
