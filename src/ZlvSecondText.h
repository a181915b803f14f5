// SPDX-License-Identifier: Apache-2.0
// The text of a date within one second.
#pragma once

#include <string_view>

#include "ZlvDateFormat.h"

namespace zelvo {

/// Remembers what the dates of one second look like. Where they differ in their milliseconds alone,
/// three ASCII digits, ICU writes two of them, and the others are copies with other milliseconds.
class SecondText {
public:
    /// Appends a time as FORMAT writes it.
    void append(CxUStringBuff *out, const DateFormat &format, UDate time);

private:
    enum class State : uint8_t { SEEN_ONCE, LEARNT, IRREGULAR };

    static constexpr size_t CAPACITY = 96;

    bool learn(const DateFormat &format);
    bool compare(std::u16string_view atStart, std::u16string_view atSample);
    void setMilliseconds(int32_t milliseconds);

    int64_t second_ = -1;
    State state_ = State::SEEN_ONCE;
    size_t length_ = 0;
    size_t milliseconds_ = 0; ///< where they stand; at the end if there are none
    UChar text_[CAPACITY]{};
};

} // namespace zelvo
