// SPDX-License-Identifier: Apache-2.0
// ICU's reading of a pattern. A quote quotes only directly before a character that would otherwise
// mean something, texts may be nested in the styles of some types, and the argument that stands
// last in the pattern decides the kind of its number.
#include "ZlvPatternScan.h"

#include <string_view>

#include <unicode/uchar.h>

namespace zelvo {
namespace {

using Word = std::u16string_view;

/// Deeper nesting counts as malformed, so that no pattern can exhaust the stack.
constexpr int32_t DEEPEST = 64;

/// What a text is nested in, which decides what ends it and what can be quoted in it.
enum class Within : uint8_t { NOTHING, CHOICE, PLURAL, SELECT };

struct Type {
    Word name;
    Within style; ///< NOTHING: the style has no nested texts
    ArgKind kind;
};

constexpr Type types[] = {
    {u"number", Within::NOTHING, ArgKind::DOUBLE},
    {u"spellout", Within::NOTHING, ArgKind::DOUBLE},
    {u"ordinal", Within::NOTHING, ArgKind::DOUBLE},
    {u"duration", Within::NOTHING, ArgKind::DOUBLE},
    {u"choice", Within::CHOICE, ArgKind::DOUBLE},
    {u"plural", Within::PLURAL, ArgKind::DOUBLE},
    {u"selectordinal", Within::PLURAL, ArgKind::DOUBLE},
    {u"select", Within::SELECT, ArgKind::TEXT},
};
constexpr Type otherType{u"", Within::NOTHING, ArgKind::UNKNOWN};

bool isSpace(UChar c)
{
    return u_hasBinaryProperty(c, UCHAR_PATTERN_WHITE_SPACE) != 0;
}

bool isLetter(UChar c)
{
    return (c >= u'a' && c <= u'z') || (c >= u'A' && c <= u'Z');
}

/// Compares without regard to the case of letters.
bool isWord(Word text, Word word)
{
    if (text.size() != word.size())
        return false;
    for (size_t i = 0; i < word.size(); ++i)
        if (u_tolower(text[i]) != word[i])
            return false;
    return true;
}

const Type &typeOf(Word name)
{
    for (const Type &type : types)
        if (isWord(name, type.name))
            return type;
    return otherType;
}

Word trimmed(Word text)
{
    while (!text.empty() && isSpace(text.front()))
        text.remove_prefix(1);
    while (!text.empty() && isSpace(text.back()))
        text.remove_suffix(1);
    return text;
}

/// A walk over the pattern. Its functions give false when the pattern is malformed.
class Reading {
public:
    Reading(const UChar *pattern, ArgKinds &kinds) : at_(pattern), kinds_(kinds) {}

    /// Reads a text up to what ends it, which is left unread.
    bool text(Within within, int32_t depth)
    {
        while (*at_ != 0 && !isEnd(*at_, within)) {
            const UChar c = *at_++;
            if (c == u'\'')
                skipQuoted(within);
            else if (c == u'{' && !argument(depth))
                return false;
        }
        return true;
    }

private:
    static bool isEnd(UChar c, Within within)
    {
        return (c == u'}' && within != Within::NOTHING) || (c == u'|' && within == Within::CHOICE);
    }

    static bool canBeQuoted(UChar c, Within within)
    {
        return c == u'{' || c == u'}' || (c == u'|' && within == Within::CHOICE) ||
               (c == u'#' && within == Within::PLURAL);
    }

    /// Behind a quote: skips a second one, or quoted text up to and with its closing quote.
    void skipQuoted(Within within)
    {
        if (*at_ == u'\'') {
            ++at_;
            return;
        }
        if (!canBeQuoted(*at_, within))
            return;
        while (*at_ != 0) {
            if (*at_++ != u'\'')
                continue;
            if (*at_ != u'\'')
                return;
            ++at_;
        }
    }

    void skipSpace()
    {
        while (isSpace(*at_))
            ++at_;
    }

    template <class Predicate>
    Word run(Predicate belongs)
    {
        const UChar *start = at_;
        while (*at_ != 0 && belongs(*at_))
            ++at_;
        return {start, static_cast<size_t>(at_ - start)};
    }

    /// Reads an argument behind its opening brace, up to and with the closing one.
    bool argument(int32_t depth)
    {
        skipSpace();
        const int64_t number =
            numberOf(run([](UChar c) { return c != u',' && c != u'}' && !isSpace(c); }));
        skipSpace();
        if (*at_ == u',') {
            ++at_;
            return depth < DEEPEST && typed(number, depth) && *at_++ == u'}';
        }
        kinds_.set(number, ArgKind::TEXT);
        return *at_ != 0 && *at_++ == u'}';
    }

    /// The number that a name is; one that is none, or too large for any argument, is -1.
    static int64_t numberOf(Word name)
    {
        int64_t number = name.empty() ? -1 : 0;
        for (const UChar c : name) {
            if (c < u'0' || c > u'9' || number >= ArgKinds::COUNT)
                return -1;
            number = number * 10 + (c - u'0');
        }
        return number;
    }

    /// Reads type and style of an argument up to its closing brace.
    bool typed(int64_t number, int32_t depth)
    {
        skipSpace();
        const Type &type = typeOf(run(isLetter));
        skipSpace();
        kinds_.set(number, type.kind); // before those of nested texts, which stand behind it
        if (*at_ != u',')
            return true;
        ++at_;
        if (type.style == Within::NOTHING)
            return simplyStyled(number, type);
        return type.style == Within::CHOICE ? choices(depth) : branches(type.style, depth);
    }

    bool simplyStyled(int64_t number, const Type &type)
    {
        const UChar *start = at_;
        if (!simpleStyle())
            return false;
        const Word style{start, static_cast<size_t>(at_ - start)};
        if (type.name == u"number" && isWord(trimmed(style), u"integer"))
            kinds_.set(number, ArgKind::INTEGER);
        return true;
    }

    /// Reads a style without nested texts. Here every quote begins or ends quoted text.
    bool simpleStyle()
    {
        int32_t braces = 0;
        for (bool quoted = false; *at_ != 0; ++at_) {
            if (*at_ == u'\'')
                quoted = !quoted;
            if (quoted)
                continue;
            if (*at_ == u'}' && braces-- == 0)
                return true;
            braces += *at_ == u'{' ? 1 : 0;
        }
        return false;
    }

    /// Reads limits, each with the text behind it.
    bool choices(int32_t depth)
    {
        for (;;) {
            run([](UChar c) { return c != u'#' && c != u'<' && c != u'\u2264' && c != u'}'; });
            if (*at_ == 0 || *at_++ == u'}' || !text(Within::CHOICE, depth + 1))
                return false;
            if (*at_ != u'|')
                return *at_ == u'}';
            ++at_;
        }
    }

    /// Reads names, each with the text in braces behind it.
    bool branches(Within within, int32_t depth)
    {
        for (;;) {
            run([](UChar c) { return c != u'{' && c != u'}'; });
            if (*at_ != u'{')
                return *at_ == u'}';
            ++at_;
            if (!text(within, depth + 1) || *at_ != u'}')
                return false;
            ++at_;
        }
    }

    const UChar *at_;
    ArgKinds &kinds_;
};

} // namespace

ArgKinds kindsInIcuReading(const UChar *pattern)
{
    ArgKinds kinds{};
    Reading{pattern, kinds}.text(Within::NOTHING, 0);
    return kinds;
}

} // namespace zelvo
