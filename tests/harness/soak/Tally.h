// SPDX-License-Identifier: Apache-2.0
// The records that were found in files.
#pragma once

#include <array>
#include <string_view>
#include <vector>

#include "Ledger.h"

namespace zelvo_test {

class Tally {
public:
    explicit Tally(uint32_t seed) : seed_(seed) {}

    /// Counts the records of a file.
    void read(std::string_view content);

    uint32_t copiesOf(uint32_t stream, uint32_t number) const
    {
        return number <= copies_[stream].size() ? copies_[stream][number - 1] : 0;
    }
    size_t fragments() const { return fragments_; }

private:
    void readLine(std::string_view line);
    bool countRecord(std::string_view record);

    uint32_t seed_;
    size_t fragments_ = 0; ///< lines that hold something else than one record or chatter
    std::array<std::vector<uint8_t>, STREAMS> copies_;
};

} // namespace zelvo_test
