// SPDX-License-Identifier: Apache-2.0
#include "ZlvSecondText.h"

#include <cmath>
#include <cstring>
#include <string_view>

#include <unicode/ustring.h>

#include "CxMemory.h"
#include "util/CxOwned.h"

namespace zelvo {
namespace {

constexpr int64_t MILLISECONDS = 1000;
constexpr int64_t SAMPLE = 987; // its digits differ from those of 000 and from each other

/// Whole milliseconds from 1970 to 9999: no date outside needs to be fast.
bool isOrdinary(UDate time)
{
    return time >= 0 && time < 253402300800000.0 && std::floor(time) == time;
}

std::u16string_view threeUnits(const UChar *text, int32_t position)
{
    return {text + position, 3};
}

int32_t firstDifference(const UChar *a, const UChar *b)
{
    int32_t position = 0;
    while (a[position] != 0 && a[position] == b[position])
        ++position;
    return position;
}

} // namespace

UChar *SecondText::text(const DateFormat &format, UDate time)
{
    if (!isOrdinary(time))
        return format.text(time);
    const auto whole = static_cast<int64_t>(time);
    if (whole / MILLISECONDS != second_) {
        second_ = whole / MILLISECONDS;
        state_ = State::SEEN_ONCE;
        return format.text(time);
    }
    if (state_ == State::SEEN_ONCE)
        state_ = learn(format) ? State::LEARNT : State::IRREGULAR;
    return state_ == State::LEARNT ? copy(static_cast<int32_t>(whole % MILLISECONDS))
                                   : format.text(time);
}

bool SecondText::learn(const DateFormat &format)
{
    const auto start = static_cast<UDate>(second_ * MILLISECONDS);
    const OwnedUStr atStart{format.text(start)};
    const OwnedUStr atSample{format.text(start + SAMPLE)};
    return atStart && atSample && compare(atStart.get(), atSample.get());
}

bool SecondText::compare(const UChar *atStart, const UChar *atSample)
{
    length_ = u_strlen(atStart);
    if (length_ >= CAPACITY || u_strlen(atSample) != length_)
        return false;
    u_strcpy(text_, atStart);
    position_ = firstDifference(atStart, atSample);
    if (position_ == length_) {
        position_ = -1;
        return true;
    }
    return position_ + 3 <= length_ && threeUnits(atStart, position_) == u"000" &&
           threeUnits(atSample, position_) == u"987" &&
           u_strcmp(atStart + position_ + 3, atSample + position_ + 3) == 0;
}

UChar *SecondText::copy(int32_t milliseconds) const
{
    const size_t size = (static_cast<size_t>(length_) + 1) * sizeof(UChar);
    auto *text = static_cast<UChar *>(RkoMemoryMalloc(size));
    if (text == nullptr)
        return nullptr;
    std::memcpy(text, text_, size);
    if (position_ >= 0) {
        UChar *digits = text + position_;
        digits[0] = static_cast<UChar>(u'0' + milliseconds / 100);
        digits[1] = static_cast<UChar>(u'0' + milliseconds / 10 % 10);
        digits[2] = static_cast<UChar>(u'0' + milliseconds % 10);
    }
    return text;
}

} // namespace zelvo
