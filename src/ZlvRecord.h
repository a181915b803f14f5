// SPDX-License-Identifier: Apache-2.0
// What the formatters share: a record under construction, and the pieces that it is made of.
#pragma once

#include <string_view>

#include "CxUStringBuff.h"
#include "ZlvIntl.h"

namespace zelvo {

/// Owns the text of a record until it is taken.
class Record {
public:
    Record() = default;
    Record(const Record &) = delete;
    Record &operator=(const Record &) = delete;
    ~Record() { CxUStringBuffDiscard(&text_); }

    CxUStringBuff *text() { return &text_; }
    UChar *take() { return CxUStringBuffTakeUStr(&text_); }

private:
    CxUStringBuff text_{};
};

/// Appends a number in decimal, with its sign. (The buffer's own call shows numbers below zero as
/// very large ones.)
ZlvBool appendSigned(CxUStringBuff *out, int64_t value);

/// Appends a text of known length.
void append(CxUStringBuff *out, std::u16string_view text);

/// The value of a property, which the event keeps; null when there is none.
const char *propertyOf(const ZlvEvent *event, const char *property);

/// Appends a property between two texts, if the event has it. Tells whether it has.
bool appendProperty(CxUStringBuff *out, const ZlvEvent *event, const char *property,
                    std::u16string_view before = u"", std::u16string_view after = u"");

/// The same with a property that is a 32-bit number, which APPEND_DECIMAL renders: appendSigned(),
/// or CxUStringBuffAppendInt64() for numbers without sign.
bool appendNumber(CxUStringBuff *out, const ZlvEvent *event, const char *property,
                  ZlvBool (*appendDecimal)(CxUStringBuff *, int64_t),
                  std::u16string_view before = u"", std::u16string_view after = u"");

/// Binds an event's message in the formatter's locale, if it has one, else in the event's.
UChar *boundMessage(const ZlvObject *formatter, ZlvEvent *event, ZlvFBindMsg bind, va_list args);

/// The identifier at the start of a bound text, as a new string; null when there is none.
char *identifierIn(const UChar *text);

/// The identifier of an event, as a new string: its own, be it empty, or else the one in its bound
/// text; null when there is neither.
char *identifierOf(const ZlvEvent *event, const UChar *text);

} // namespace zelvo
