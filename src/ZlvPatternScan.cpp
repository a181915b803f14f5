// SPDX-License-Identifier: Apache-2.0
// The plain reading of a pattern.
#include "ZlvPatternScan.h"

#include <algorithm>
#include <string_view>

namespace zelvo {
namespace {

enum class Step : uint8_t { KEEP, SKIP, CLOSE, ABANDON };

/// One of the three parts of an argument, kept as far as any word or number reaches.
class Part {
public:
    void add(UChar c)
    {
        if (length_ < CAPACITY)
            text_[length_] = c;
        length_ = std::min(length_ + 1, CAPACITY + 1);
    }

    bool isEmpty() const { return length_ == 0; }
    bool is(std::u16string_view word) const { return length_ <= CAPACITY && kept() == word; }

    /// The decimal number that the part is; -1 if it is none, or has more than ten digits.
    int64_t number() const
    {
        if (isEmpty() || length_ > CAPACITY)
            return -1;
        int64_t number = 0;
        for (const UChar digit : kept()) {
            if (digit < u'0' || digit > u'9')
                return -1;
            number = number * 10 + (digit - u'0');
        }
        return number;
    }

private:
    static constexpr size_t CAPACITY = 10;

    std::u16string_view kept() const { return {text_, std::min(length_, CAPACITY)}; }

    UChar text_[CAPACITY]{};
    size_t length_ = 0;
};

/// An argument, taken in character by character behind its opening brace.
class Argument {
public:
    Step take(UChar c)
    {
        if (c == u'\'')
            quoted_ = !quoted_;
        const Step step = quoted_ ? Step::KEEP : structure(c);
        if (step == Step::KEEP)
            parts_[part_].add(c);
        return step;
    }

    int64_t number() const { return parts_[NUMBER].number(); }

    ArgKind kind() const
    {
        const Part &type = parts_[TYPE];
        if (type.isEmpty())
            return ArgKind::TEXT;
        if (type.is(u"number"))
            return parts_[STYLE].is(u"integer") ? ArgKind::INTEGER : ArgKind::DOUBLE;
        return type.is(u"choice") ? ArgKind::DOUBLE : ArgKind::UNKNOWN;
    }

private:
    enum { NUMBER, TYPE, STYLE, PARTS };

    /// Tells what a character that is not quoted means.
    Step structure(UChar c)
    {
        if (c == u' ')
            return Step::SKIP;
        if (part_ == STYLE)
            return inStyle(c);
        if (c == u'{')
            return Step::ABANDON;
        if (c == u'}')
            return Step::CLOSE;
        if (c != u',')
            return Step::KEEP;
        ++part_;
        return Step::SKIP;
    }

    /// Commas belong to the style, and braces in pairs.
    Step inStyle(UChar c)
    {
        if (c == u'{')
            ++depth_;
        if (c == u'}' && depth_-- == 0)
            return Step::CLOSE;
        return Step::KEEP;
    }

    Part parts_[PARTS];
    int32_t part_ = NUMBER;
    int32_t depth_ = 0;
    bool quoted_ = false;
};

/// Reads the argument behind an opening brace. AT is left at its closing brace, or at the end of
/// the pattern, where an argument without closing brace ends and counts for nothing.
bool readArgument(const UChar *&at, ArgKinds &kinds)
{
    Argument argument;
    for (; *at != 0; ++at) {
        const Step step = argument.take(*at);
        if (step == Step::KEEP || step == Step::SKIP)
            continue;
        const int64_t number = step == Step::CLOSE ? argument.number() : -1;
        kinds.set(number, argument.kind());
        return number >= 0;
    }
    return true;
}

bool isFetchable(ArgKind kind)
{
    return kind != ArgKind::ABSENT && kind != ArgKind::UNKNOWN;
}

} // namespace

ArgKinds kindsInPlainReading(const UChar *pattern)
{
    ArgKinds kinds{};
    bool quoted = false;
    for (const UChar *at = pattern; *at != 0;) {
        const UChar c = *at++;
        if (c == u'\'')
            quoted = !quoted;
        if (c == u'{' && !quoted && !readArgument(at, kinds))
            return {};
    }
    return kinds;
}

ArgKinds fetchableKinds(const UChar *pattern)
{
    const ArgKinds plain = kindsInPlainReading(pattern);
    const ArgKinds icu = kindsInIcuReading(pattern);
    ArgKinds kinds{};
    for (int32_t i = 0; i < ArgKinds::COUNT; ++i) {
        if (!isFetchable(plain.of[i]) || plain.of[i] != icu.of[i])
            break;
        kinds.of[i] = plain.of[i];
    }
    return kinds;
}

} // namespace zelvo
