// SPDX-License-Identifier: Apache-2.0
#include "ZlvSecondText.h"

#include <algorithm>
#include <cmath>

#include "ZlvRecord.h"

namespace zelvo {
namespace {

constexpr int64_t MILLISECONDS = 1000;
constexpr int64_t SAMPLE = 987; // its digits differ from those of 000 and from each other

/// Whole milliseconds from 1970 to 9999: no date outside needs to be fast.
bool isOrdinary(UDate time)
{
    return time >= 0 && time < 253402300800000.0 && std::floor(time) == time;
}

std::u16string_view viewOf(Record &record)
{
    const CxUStringBuff *text = record.text();
    return {text->data, text->length};
}

} // namespace

void SecondText::append(CxUStringBuff *out, const DateFormat &format, UDate time)
{
    if (!isOrdinary(time))
        return format.append(out, time);
    const auto whole = static_cast<int64_t>(time);
    if (whole / MILLISECONDS != second_) {
        second_ = whole / MILLISECONDS;
        state_ = State::SEEN_ONCE;
        return format.append(out, time);
    }
    if (state_ == State::SEEN_ONCE)
        state_ = learn(format) ? State::LEARNT : State::IRREGULAR;
    if (state_ == State::IRREGULAR)
        return format.append(out, time);
    setMilliseconds(static_cast<int32_t>(whole % MILLISECONDS));
    zelvo::append(out, {text_, length_});
}

bool SecondText::learn(const DateFormat &format)
{
    const auto start = static_cast<UDate>(second_ * MILLISECONDS);
    Record atStart;
    Record atSample;
    format.append(atStart.text(), start);
    format.append(atSample.text(), start + SAMPLE);
    return compare(viewOf(atStart), viewOf(atSample));
}

/// Keeps the text if it has the milliseconds in one place or not at all.
bool SecondText::compare(std::u16string_view atStart, std::u16string_view atSample)
{
    length_ = atStart.size();
    if (length_ == 0 || length_ > CAPACITY || atSample.size() != length_)
        return false;
    const auto difference = std::mismatch(atStart.begin(), atStart.end(), atSample.begin()).first;
    milliseconds_ = static_cast<size_t>(difference - atStart.begin());
    std::copy(atStart.begin(), atStart.end(), text_);
    if (milliseconds_ == length_)
        return true;
    const auto behind = milliseconds_ + 3;
    return atStart.substr(milliseconds_, 3) == u"000" &&
           atSample.substr(milliseconds_, 3) == u"987" &&
           atStart.substr(behind) == atSample.substr(behind);
}

void SecondText::setMilliseconds(int32_t milliseconds)
{
    if (milliseconds_ == length_)
        return;
    UChar *digits = text_ + milliseconds_;
    digits[0] = static_cast<UChar>(u'0' + milliseconds / 100);
    digits[1] = static_cast<UChar>(u'0' + milliseconds / 10 % 10);
    digits[2] = static_cast<UChar>(u'0' + milliseconds % 10);
}

} // namespace zelvo
