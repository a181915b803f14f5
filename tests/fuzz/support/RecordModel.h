// SPDX-License-Identifier: Apache-2.0
// What an event looks like in the three layouts, put together from what a target knows of it.
#pragma once

#include <cstdint>
#include <optional>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

namespace zelvo_fuzz {

using WideText = std::u16string;

/// An event, as the target made it, with its message already bound.
struct EventStory {
    bool isMessage;
    int32_t level;
    int64_t time;
    std::optional<std::string> messageId;
    std::vector<std::pair<std::string, std::string>> properties; ///< keys once, in order
    WideText text;                                               ///< empty when there is none
    std::optional<WideText> parameters; ///< as in translation information; absent without a bundle
};

/// How the XML formatter was set up.
struct XmlSettings {
    bool forceAsMessage, forceAsTrace;
    bool singleServer, singleProduct, singleComponent, singleProductId;
    bool isFirst; ///< of the file: the single items are still to be written
};

/// Each takes the text of the date besides.
WideText lineRecord(const EventStory &event, const WideText &date, const std::string &separator);
WideText xmlRecord(const EventStory &event, const WideText &date, const XmlSettings &settings);
WideText traceRecord(const EventStory &event, const WideText &date);

/// The bundle of events that have one; its key is that of OneBundle.h.
constexpr std::string_view BUNDLE = "shop";

/// The default form of a date between 1970 and 9999, in a zone that many minutes east of UTC.
WideText plainDate(int64_t time, int32_t minutesEast);

/// Bytes in the default code page, which the targets set to UTF-8.
WideText wide(std::string_view bytes);

} // namespace zelvo_fuzz
