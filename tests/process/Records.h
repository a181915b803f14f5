// SPDX-License-Identifier: Apache-2.0
// Records that can be told from each other and from their own fragments, and the count of them.
#pragma once

#include <cstddef>
#include <cstdint>
#include <filesystem>
#include <map>
#include <string>
#include <string_view>
#include <vector>

namespace zelvo_test {

/// The one text of a record, 100 to 120 bytes without the line feed: '<', who and which, letters
/// that only this record has, '>'.
std::string recordText(uint32_t seed, uint32_t writer, uint32_t number);

/// What stands in the files of a log.
class Census {
public:
    /// Counts what stands in shared.log and its older files in a directory.
    Census(const std::filesystem::path &directory, uint32_t seed);

    size_t distinct() const;
    size_t doubled() const; ///< appearances beyond the first of each record
    size_t fragments() const { return fragments_; }
    size_t outOfOrder() const { return outOfOrder_; }
    uint32_t olderFiles() const { return olderFiles_; } ///< highest number of a file
    size_t copiesOf(uint32_t writer, uint32_t number) const;

private:
    void readFile(const std::filesystem::path &path);
    void readLine(std::string_view line);
    bool countRecord(std::string_view record);

    uint32_t seed_;
    uint32_t olderFiles_ = 0;
    size_t fragments_ = 0;
    size_t outOfOrder_ = 0;
    std::map<uint32_t, std::vector<uint8_t>> copies_; ///< by writer, then by number
    std::map<uint32_t, uint32_t> last_;               ///< number seen last, by writer
};

} // namespace zelvo_test
