// SPDX-License-Identifier: Apache-2.0
// Properties files, read a second time: by a reader that goes down the grammar of a line, where the
// library steps through a table of states.
#pragma once

#include <map>
#include <optional>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

namespace zelvo_fuzz {

/// An entry as it is handed on. Until the first value of a file that holds a character, values are
/// absent rather than empty.
struct PropertyEntry {
    std::string key;
    std::optional<std::string> value;
};

struct PropertiesReading {
    std::vector<PropertyEntry> entries; ///< those before the first fault, in their order
    bool isWellFormed;
};

PropertiesReading readProperties(std::string_view bytes);

/// What a list of properties holds after a file was read into it.
struct PropertiesInList {
    std::vector<std::pair<std::string, std::string>> entries;
    bool isComplete;
};

PropertiesInList propertiesInList(const PropertiesReading &reading);

/// What configurations hold after a file was read into them, each in order of first mention.
struct PropertiesInConfigs {
    using Properties = std::vector<std::pair<std::string, std::string>>;

    std::vector<std::pair<std::string, Properties>> configs;
    bool isComplete;
};

PropertiesInConfigs propertiesInConfigs(const PropertiesReading &reading);

} // namespace zelvo_fuzz
