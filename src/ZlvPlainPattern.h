// SPDX-License-Identifier: Apache-2.0
// The direct path for patterns of messages that ask for nothing but texts and integers.
#pragma once

#include <cstdarg>

#include "ZlvIntegerText.h"
#include "ZlvPatternScan.h"

namespace zelvo {

/// A pattern taken apart, if it is a plain one: literal text with ICU's apostrophes, and the
/// placeholders {n} and {n,number,integer}, of one kind for each number, without a gap. What such
/// a pattern yields is put together here; every other pattern is left to ICU.
class PlainPattern {
public:
    explicit PlainPattern(const UChar *pattern);

    bool isPlain() const { return isPlain_; }
    bool takesArguments() const { return argumentCount_ > 0; }
    bool takesIntegers() const { return takesIntegers_; }

    /// The text with the arguments in place, which the caller frees; null when it is empty, an
    /// argument is a null text, or memory ran out. INTEGERS is needed only for patterns that take
    /// some. The list is read only if there are arguments.
    UChar *bind(const IntegerText *integers, va_list args) const;

private:
    /// Text between two placeholders, or a placeholder.
    struct Piece {
        const UChar *text;
        int32_t length;
        int32_t argument; ///< -1 for a text
    };

    static constexpr int32_t MOST_PIECES = 2 * ArgKinds::COUNT + 1;

    bool parse(const UChar *pattern);
    const UChar *takePlaceholder(const UChar *brace);
    bool addText(const UChar *begin, const UChar *end);
    bool add(const Piece &piece);
    bool hasNoGap() const;

    Piece pieces_[MOST_PIECES]; // the first pieceCount_ are set
    int32_t pieceCount_ = 0;
    int32_t argumentCount_ = 0;
    ArgKinds kinds_{};
    bool takesIntegers_ = false;
    bool isPlain_;
};

} // namespace zelvo
