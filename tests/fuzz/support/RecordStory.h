// SPDX-License-Identifier: Apache-2.0
// An input of the record target, taken apart. It is, in this order: three bytes that choose, a
// level, a time, and texts that end with a zero: pattern, identifier, separator, then names and
// values of properties in turn.
#pragma once

#include <cstdint>
#include <iterator>
#include <string>
#include <utility>
#include <vector>

#include <unicode/umachine.h>

#include "support/Arguments.h"
#include "support/Fuzz.h"
#include "support/RecordModel.h"

namespace zelvo_fuzz {

inline constexpr int64_t DAY = 86400000;
inline constexpr int64_t BEHIND_9999 = 253402300800000;
inline constexpr size_t MOST_PROPERTIES = 8;

inline constexpr int32_t levels[] = {-9999, 0, 1000, 2000, 3000, 4000, 5000, 6000, 7000, 9999};
inline constexpr const char *dateFormats[] = {nullptr, "HH:mm", "'at' yyyy", ""};
inline constexpr const char *locales[] = {nullptr, "de", "en_US", "tr"};
inline constexpr const char *defaultLocales[] = {"en_US", "de"};

struct Zone {
    const UChar *name;
    int32_t minutes; ///< east of UTC
};
inline constexpr Zone zones[] = {
    {u"UTC", 0}, {u"GMT+03:30", 210}, {u"GMT-03:30", -210}, {u"GMT-00:30", -30}};

inline constexpr const char *knownProperties[] = {
    "threadId",        "correlationId", "client",      "zlv_prop_srcfile",     "zlv_prop_srcline",
    "server",          "serverFormat",  "product",     "zlv_prop_srcfunction", "component",
    "productInstance", "processId",     "organization"};

/// An input, taken apart.
struct Story {
    explicit Story(Input input)
        : choices(static_cast<uint32_t>(input.number(3))), level(levelOf(input)),
          time(DAY + static_cast<int64_t>(input.number(6)) % (BEHIND_9999 - 2 * DAY)),
          pattern(patternOf(input.text())), messageId(input.text()), separator(input.text())
    {
        while (!input.isAtEnd() && properties.size() < MOST_PROPERTIES)
            takeProperty(input);
    }

    bool chooses(int bit) const { return (choices >> bit & 1) != 0; }
    const char *dateFormat() const { return dateFormats[choices >> 16 & 3]; }
    const char *locale() const { return locales[choices >> 18 & 3]; }
    unsigned arguments() const { return choices >> 20; }
    const char *defaultLocale() const { return defaultLocales[choices >> 10 & 1]; }
    const Zone &zone() const { return zones[choices >> 11 & 3]; }

    bool isMessage() const { return chooses(0); }
    bool hasBundle() const { return chooses(1); }
    bool hasMessageId() const { return chooses(2); }
    bool hasSeparator() const { return chooses(3); }

    XmlSettings settings() const
    {
        return {.forceAsMessage = chooses(4),
                .forceAsTrace = chooses(5),
                .singleServer = chooses(6),
                .singleProduct = chooses(7),
                .singleComponent = chooses(8),
                .singleProductId = chooses(9),
                .isFirst = true};
    }

    uint32_t choices;
    int32_t level;
    int64_t time;
    std::u16string pattern;
    std::string messageId;
    std::string separator;
    std::vector<std::pair<std::string, std::string>> properties;

private:
    /// One of the usual levels, or any.
    static int32_t levelOf(Input &input)
    {
        const uint8_t choice = input.byte();
        return choice < std::size(levels) ? levels[choice] : static_cast<int32_t>(input.number(4));
    }

    /// A name that is one byte chooses one of those that mean something.
    void takeProperty(Input &input)
    {
        std::string name = input.text();
        if (name.size() == 1)
            name = knownProperties[static_cast<uint8_t>(name[0]) % std::size(knownProperties)];
        const std::string value = input.text();
        for (auto &[known, former] : properties)
            if (known == name) {
                former = value;
                return;
            }
        properties.emplace_back(name, value);
    }
};

} // namespace zelvo_fuzz
