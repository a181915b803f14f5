// SPDX-License-Identifier: Apache-2.0
#include "Patterns.h"

#include <algorithm>
#include <utility>

#include "Choices.h"

namespace zelvo_equivalence {
namespace {

constexpr size_t MOST_ARGUMENTS = 4;

constexpr const char16_t *TEXT_STYLES[] = {
    u"", u"", u"", u"", u" ", u",select,a{A}b{'{'B'}'}other{O}", u", select, other {it''s #}"};

constexpr const char16_t *INTEGER_STYLES[] = {u",number,integer", u",number,integer",
                                              u",number,integer", u", number, integer",
                                              u",NUMBER,Integer"};

constexpr const char16_t *DOUBLE_STYLES[] = {
    u",number",
    u",number",
    u",number,percent",
    u",number,currency",
    u",number,#,##0.00",
    u",number,0.###E0",
    u",number,'#'#",
    u",number,000",
    u",number,#.#####",
    u",number,::compact-short",
    u",number,::currency/EUR .00",
    u",date",
    u",date,short",
    u",date,full",
    u",date,yyyy-MM-dd G HH:mm:ss.SSS zzzz",
    u",date,::yMMMMd",
    u",time",
    u",time,full",
    u",time,HH:mm:ss.SSS",
    u",spellout",
    u",ordinal",
    u",duration",
    u",choice,0#none|1#one|1<many, '|' even",
    u",plural,=0{nobody}one{# other}few{# few}other{# others}",
    u",plural,offset:1 =1{one}one{one and # other}other{one and # others '#'}",
    u",selectordinal,one{#st}two{#nd}few{#rd}other{#th}",
};

constexpr const char16_t *LITERALS[] = {u" ",
                                        u", ",
                                        u" it's ",
                                        u"''",
                                        u"'{'",
                                        u"'}'",
                                        u"'{0}'",
                                        u"\"",
                                        u"#",
                                        u"|",
                                        u"100 %",
                                        u"<&>",
                                        u"\t",
                                        u"\n",
                                        u"\u00e4\u00f6\u00fc",
                                        u"\u65e5\u672c",
                                        u"\U0001F600",
                                        u"'",
                                        u"\u0001",
                                        u"KDY1234E "};

constexpr const char16_t *MALFORMED[] = {
    u"{",
    u"{0",
    u"}",
    u"{0}}",
    u"{}",
    u"{0,number",
    u"{0,nonsense}",
    u"{0,number,'}",
    u"{0,number,#'}",
    u"{0,number,::nonsense}",
    u"{0,number,#.#.#}",
    u"{0,date,'x}",
    u"{name}",
    u"{-1}",
    u"{00}",
    u"{01}",
    u"{0}{0,number}",
    u"{0,number}{0,number,integer}{0,date}",
    u"{0,choice,}",
    u"{0,choice,1}",
    u"{0,choice,1#a|0#b}",
    u"{0,plural,}",
    u"{0,plural,one{a}}",
    u"{0,plural,other{{1}{2}}}",
    u"{0,select,other}",
    u"{0,select,other{{1,select,other{{2}}}}}",
    u"'{0}",
    u"it's {0",
    u"{0} {2}",
    u"{ 0 } {1 }",
    u"{63}",
    u"{64}",
    u"{99}",
    u"{0,",
    u"{0,,}",
    u"{0 1}",
    u"{2147483648}",
    u"{0}{1}{2}{3}{4}{5}{6}{7}{8}{9}",
    u"{9} {8} {7,number,integer} {6} {5} {4,number,integer} {3} {2} {1} {0}",
    u"{0}{1}{2}{3}{4}{5}{6}{7}{8}{9}{10}",
    u"{0}{1}{2}{3}{0}{1}{2}{3}{0}{1}{2}{3}{0}{1}{2}{3}{0}{1}{2}{3}{0}{1}{2}{3}{0}{1}{2}{3}",
    u"",
};

const char16_t *anyStyle(Random &random, ArgType type)
{
    if (type == ArgType::TEXT)
        return random.of(TEXT_STYLES);
    return type == ArgType::INTEGER ? random.of(INTEGER_STYLES) : random.of(DOUBLE_STYLES);
}

ArgType anyType(Random &random)
{
    static constexpr ArgType types[] = {ArgType::TEXT, ArgType::TEXT, ArgType::INTEGER,
                                        ArgType::INTEGER, ArgType::DOUBLE};
    return random.of(types);
}

/// A pattern under construction. What no argument uses, and stands before one that is used, is
/// asked for as a pointer, like a text.
class Construction {
public:
    explicit Construction(Random &random) : random_(random) {}

    void addArgument()
    {
        const size_t number = random_.below(MOST_ARGUMENTS);
        std::vector<ArgType> &types = pattern.types;
        types.resize(std::max(types.size(), number + 1), ArgType::TEXT);
        if (!std::exchange(isUsed_[number], true))
            types[number] = anyType(random_);
        pattern.text += u'{';
        pattern.text += static_cast<char16_t>(u'0' + number);
        pattern.text += anyStyle(random_, types[number]);
        pattern.text += u'}';
    }

    Pattern pattern{{}, {}, true};

private:
    Random &random_;
    bool isUsed_[MOST_ARGUMENTS]{};
};

/// A literal text in which nothing begins an argument.
std::u16string anyLiteral(Random &random)
{
    if (!random.oneIn(6))
        return random.of(LITERALS);
    std::u16string text = anyText(random);
    std::erase_if(text,
                  [](char16_t unit) { return unit == u'{' || unit == u'}' || unit == u'\''; });
    return text;
}

/// A quote that stands before a brace would hide an argument, and what is asked for with it.
bool mayHideArguments(const std::u16string &text)
{
    return text.find(u"'{") != std::u16string::npos || text.find(u"'}") != std::u16string::npos;
}

/// The quoted literals in the table are balanced, if nothing else puts a quote before them.
Pattern wellFormed(Random &random)
{
    Construction construction{random};
    Pattern &pattern = construction.pattern;
    const uint32_t pieces = random.below(7);
    bool hasSingleQuotes = false;
    for (uint32_t i = 0; i < pieces; ++i) {
        if (random.oneIn(2)) {
            construction.addArgument();
            continue;
        }
        const std::u16string literal = anyLiteral(random);
        hasSingleQuotes = hasSingleQuotes || literal == u"'" || literal == u" it's ";
        pattern.text += literal;
    }
    pattern.isTyped = !hasSingleQuotes || !mayHideArguments(pattern.text);
    return pattern;
}

Pattern malformed(Random &random)
{
    return {random.of(MALFORMED), {}, false};
}

/// A pattern with one unit taken out, doubled or exchanged.
Pattern mutated(Random &random)
{
    Pattern pattern = wellFormed(random);
    pattern.isTyped = false;
    if (pattern.text.empty())
        return pattern;
    static constexpr char16_t units[] = {u'{', u'}', u'\'', u',', u'0', u'#', u'|', u'x'};
    const size_t at = random.below(pattern.text.size());
    if (random.oneIn(3))
        pattern.text.erase(at, 1);
    else if (random.oneIn(2))
        pattern.text.insert(at, 1, random.of(units));
    else
        pattern.text[at] = random.of(units);
    return pattern;
}

Pattern anyPattern(Random &random)
{
    if (random.oneIn(10))
        return malformed(random);
    return random.oneIn(10) ? mutated(random) : wellFormed(random);
}

bool asksForDate(const Pattern &pattern)
{
    return pattern.text.find(u"date") != std::u16string::npos ||
           pattern.text.find(u"time") != std::u16string::npos;
}

} // namespace

Pattern Patterns::fresh(Random &random) const
{
    Pattern pattern = anyPattern(random);
    while (!hasDates_ && asksForDate(pattern))
        pattern = anyPattern(random);
    return pattern;
}

const Pattern &Patterns::next(Random &random)
{
    if (former_.size() < MOST) {
        former_.push_back(fresh(random));
        return former_.back();
    }
    Pattern &place = former_[random.below(MOST)];
    if (random.oneIn(4))
        place = fresh(random);
    else if (random.oneIn(8))
        place.text += static_cast<char16_t>(u'a' + random.below(26));
    return place;
}

} // namespace zelvo_equivalence
