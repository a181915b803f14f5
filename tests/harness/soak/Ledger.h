// SPDX-License-Identifier: Apache-2.0
// What writers tell about their records, in memory that they share with the test.
#pragma once

#include <array>
#include <atomic>
#include <cstdint>

#include "soak_faults.h"

namespace zelvo_test {

constexpr uint32_t PROCESSES = 4;
/// Each process writes to the shared log and to one of its own: the shared streams come first.
constexpr uint32_t STREAMS = 2 * PROCESSES;

enum class Fate : uint8_t {
    NOT_LOGGED,
    ACKNOWLEDGED,
    CUT_SHORT, ///< acknowledged, but the system took a part of it only
    REFUSED    ///< the call returned an error
};

/// How far the records of one process in one log have come.
struct Stream {
    std::atomic<uint32_t> begun;
    std::atomic<uint32_t> acknowledged;
    std::atomic<uint32_t> refused;
};

/// What processes and test tell each other.
struct Board {
    std::atomic<bool> stop;   ///< set by the test
    std::atomic<bool> isFull; ///< set by the test: own logs find no space
    std::array<std::atomic<uint32_t>, PROCESSES> changes; ///< of the configuration, by process
    std::array<Stream, STREAMS> streams;
    std::array<SoakFaults, PROCESSES> faults;
};

class Ledger {
public:
    /// Has room for so many records of each stream.
    explicit Ledger(uint32_t capacity);
    Ledger(const Ledger &) = delete;
    Ledger &operator=(const Ledger &) = delete;
    ~Ledger();

    Board &board() const { return *static_cast<Board *>(area_); }
    Stream &stream(uint32_t stream) const { return board().streams[stream]; }
    /// Records are numbered from 1.
    uint32_t capacity() const { return capacity_; }

    Fate fate(uint32_t stream, uint32_t number) const { return *entry(stream, number); }
    void begin(uint32_t stream, uint32_t number) { this->stream(stream).begun = number; }
    void end(uint32_t stream, uint32_t number, Fate fate);

private:
    size_t size() const { return sizeof(Board) + size_t{STREAMS} * capacity_; }
    Fate *entry(uint32_t stream, uint32_t number) const;

    uint32_t capacity_;
    void *area_;
};

} // namespace zelvo_test
