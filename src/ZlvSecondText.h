// SPDX-License-Identifier: Apache-2.0
// The text of a date within one second.
#pragma once

#include "ZlvDateFormat.h"

namespace zelvo {

/// Remembers what the dates of one second look like. Where they differ in their milliseconds alone,
/// three ASCII digits, ICU writes two of them, and the others are copies with other milliseconds.
class SecondText {
public:
    /// The text of a time, as FORMAT writes it.
    UChar *text(const DateFormat &format, UDate time);

private:
    enum class State : uint8_t { SEEN_ONCE, LEARNT, IRREGULAR };

    static constexpr int32_t CAPACITY = 96;

    bool learn(const DateFormat &format);
    bool compare(const UChar *atStart, const UChar *atSample);
    UChar *copy(int32_t milliseconds) const;

    int64_t second_ = -1;
    State state_ = State::SEEN_ONCE;
    int32_t length_ = 0;
    int32_t position_ = -1; ///< of the milliseconds; -1 if there are none
    UChar text_[CAPACITY]{};
};

} // namespace zelvo
