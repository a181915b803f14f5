// SPDX-License-Identifier: Apache-2.0
#include "ZlvPlainPattern.h"

#include <algorithm>
#include <string_view>

#include <unicode/ustring.h>

#include "CxMemory.h"
#include "util/CxOwned.h"

namespace zelvo {
namespace {

constexpr std::u16string_view INTEGER_STYLE = u",number,integer}";

bool startsWith(const UChar *text, std::u16string_view start)
{
    size_t i = 0;
    while (i < start.size() && text[i] == start[i])
        ++i;
    return i == start.size();
}

bool isSpecial(UChar c)
{
    // Most units are settled by the first test: nothing between the two is special.
    const bool isOutside = c <= u'\'' || c >= u'{';
    return isOutside && (c == 0 || c == u'\'' || c == u'{' || c == u'}');
}

std::u16string_view viewOf(const UChar *text, int32_t length)
{
    return {text, static_cast<size_t>(length)};
}

/// The arguments of one call, read from its list in order and measured.
class Arguments {
public:
    /// False when a text is missing.
    bool read(const ArgKinds &kinds, int32_t count, const IntegerText *integers, va_list args)
    {
        ArgList own{args};
        bool areThere = true;
        for (int32_t i = 0; i < count; ++i)
            if (kinds.of[i] == ArgKind::TEXT)
                areThere = take(i, va_arg(own.list, const UChar *)) && areThere;
            else
                take(i, va_arg(own.list, int32_t), integers);
        return areThere;
    }

    std::u16string_view operator[](int32_t number) const { return values_[number]; }

private:
    bool take(int32_t number, const UChar *text)
    {
        if (text == nullptr)
            return false;
        values_[number] = viewOf(text, u_strlen(text));
        return true;
    }

    void take(int32_t number, int32_t value, const IntegerText *integers)
    {
        UChar *area = numbers_[number];
        values_[number] = viewOf(area, integers->write(value, area));
    }

    std::u16string_view values_[ArgKinds::COUNT];
    UChar numbers_[ArgKinds::COUNT][IntegerText::SIZE];
};

} // namespace

PlainPattern::PlainPattern(const UChar *pattern) : isPlain_(ZELVO_KEEP != 0 && parse(pattern)) {}

/// Gives up at the first thing that is not plain.
bool PlainPattern::parse(const UChar *pattern)
{
    const UChar *begin = pattern; // of the text that is not a piece yet
    for (const UChar *c = pattern;;) {
        while (!isSpecial(*c))
            ++c;
        if (*c == 0)
            return addText(begin, c) && hasNoGap();
        if (*c == u'\'') {
            ++c;
            if (*c == u'{' || *c == u'}')
                return false; // begins quoted text
            if (*c == u'\'') {
                if (!addText(begin, c)) // with one apostrophe of the pair
                    return false;
                begin = ++c;
            }
            continue;
        }
        c = *c == u'{' && addText(begin, c) ? takePlaceholder(c) : nullptr;
        if (c == nullptr)
            return false;
        begin = c;
    }
}

/// Gives what follows the placeholder; null if it is not plain.
const UChar *PlainPattern::takePlaceholder(const UChar *brace)
{
    const int32_t number = brace[1] - u'0';
    if (number < 0 || number >= ArgKinds::COUNT)
        return nullptr;
    const UChar *style = brace + 2;
    const bool isText = *style == u'}';
    if (!isText && !startsWith(style, INTEGER_STYLE))
        return nullptr;
    const ArgKind kind = isText ? ArgKind::TEXT : ArgKind::INTEGER;
    if (kinds_.of[number] != ArgKind::ABSENT && kinds_.of[number] != kind)
        return nullptr;
    kinds_.set(number, kind);
    argumentCount_ = std::max(argumentCount_, number + 1);
    takesIntegers_ = takesIntegers_ || !isText;
    return add({nullptr, 0, number}) ? style + (isText ? 1 : INTEGER_STYLE.size()) : nullptr;
}

bool PlainPattern::addText(const UChar *begin, const UChar *end)
{
    return begin == end || add({begin, static_cast<int32_t>(end - begin), -1});
}

bool PlainPattern::add(const Piece &piece)
{
    if (pieceCount_ == MOST_PIECES)
        return false;
    pieces_[pieceCount_++] = piece;
    return true;
}

bool PlainPattern::hasNoGap() const
{
    return std::count(kinds_.of, kinds_.of + argumentCount_, ArgKind::ABSENT) == 0;
}

UChar *PlainPattern::bind(const IntegerText *integers, va_list args) const
{
    Arguments arguments;
    if (takesArguments() && !arguments.read(kinds_, argumentCount_, integers, args))
        return nullptr;
    const auto viewOfPiece = [&](const Piece &piece) {
        return piece.argument < 0 ? viewOf(piece.text, piece.length) : arguments[piece.argument];
    };
    size_t length = 0;
    for (int32_t i = 0; i < pieceCount_; ++i)
        length += viewOfPiece(pieces_[i]).size();
    void *area = length > 0 ? RkoMemoryMalloc((length + 1) * sizeof(UChar)) : nullptr;
    auto *text = static_cast<UChar *>(area);
    if (text == nullptr)
        return nullptr;
    UChar *end = text;
    for (int32_t i = 0; i < pieceCount_; ++i) {
        const std::u16string_view piece = viewOfPiece(pieces_[i]);
        end = std::copy(piece.begin(), piece.end(), end);
    }
    *end = 0;
    return text;
}

} // namespace zelvo
