// SPDX-License-Identifier: Apache-2.0
#include "Arguments.h"

#include <cstdlib>
#include <initializer_list>
#include <utility>

#include <sys/mman.h>

#include "Choices.h"
#include "support/VaList.h"

namespace zelvo_equivalence {
namespace {

using Action = std::function<void(va_list)>;
using Value = Arguments::Value;

constexpr size_t MOST_TYPED = 4;
constexpr size_t TEXTS = 104;
constexpr size_t TEXT_UNITS = 48;

/// Passes the values from AT on, one after the other, behind those that are PASSED already.
template <class... Passed>
void pass(const Action &action, const std::vector<Value> &values, size_t at, Passed... passed)
{
    if (at == values.size())
        return zelvo_test::withArgs([&](va_list args) { action(args); }, passed...);
    if constexpr (sizeof...(Passed) < MOST_TYPED) {
        const Value &value = values[at];
        if (value.type == ArgType::INTEGER)
            pass(action, values, at + 1, passed..., value.integer);
        else if (value.type == ArgType::DOUBLE)
            pass(action, values, at + 1, passed..., value.real);
        else
            pass(action, values, at + 1, passed..., value.text ? value.text->c_str() : nullptr);
    }
}

/// Texts whose addresses are the same in each process, as they are numbers too.
struct FixedTexts {
    FixedTexts()
        : texts(static_cast<UChar *>(mmap(
              reinterpret_cast<void *>(0x10000000), TEXTS * TEXT_UNITS * sizeof(UChar),
              PROT_READ | PROT_WRITE, MAP_PRIVATE | MAP_ANONYMOUS | MAP_FIXED_NOREPLACE, -1, 0)))
    {
        if (texts == MAP_FAILED)
            std::abort();
        Random random{TEXTS};
        for (size_t i = 0; i < TEXTS; ++i)
            anyText(random).copy(texts + i * TEXT_UNITS, TEXT_UNITS - 1);
    }

    UChar *texts;
};

/// Doubles fill the floating-point registers; pointers the others, and memory.
template <size_t... I, size_t... J>
void passUniversal(const Action &action, const UChar *texts, std::index_sequence<I...>,
                   std::index_sequence<J...>)
{
    zelvo_test::withArgs([&](va_list args) { action(args); }, 1000.25 * I...,
                         texts + J * TEXT_UNITS...);
}

/// An argument number that no list is long enough for.
bool mayAskForMany(const std::u16string &pattern)
{
    size_t digits = 0;
    for (const char16_t unit : pattern) {
        digits = unit >= u'0' && unit <= u'9' ? digits + 1 : 0;
        if (digits > 2)
            return true;
    }
    return false;
}

/// ICU's rules for numbers in words do not survive a number without end, and take minutes for one
/// with hundreds of decimals.
bool writesWords(const std::u16string &pattern)
{
    for (const char16_t *style : {u"spellout", u"ordinal", u"duration"})
        if (pattern.find(style) != std::u16string::npos)
            return true;
    return false;
}

double anyDoubleFor(const std::u16string &pattern, Random &random)
{
    if (writesWords(pattern))
        return anyInteger(random) / 4.0;
    return random.oneIn(3) ? anyTime(random) : anyDouble(random);
}

Value anyValue(Random &random, ArgType type, const std::u16string &pattern)
{
    Value value{type, {}, 0, 0.0};
    if (type == ArgType::INTEGER)
        value.integer = anyInteger(random);
    else if (type == ArgType::DOUBLE)
        value.real = anyDoubleFor(pattern, random);
    else if (!random.oneIn(20))
        value.text = anyText(random);
    return value;
}

void note(const Value &value, Transcript &transcript)
{
    if (value.type == ArgType::INTEGER)
        transcript.note("int", int64_t{value.integer});
    else if (value.type == ArgType::DOUBLE)
        transcript.note("double", value.real);
    else
        transcript.note("text", value.text);
    if (value.type == ArgType::TEXT && !value.text)
        transcript.count("null arguments");
}

} // namespace

Arguments::Arguments(Random &random, const Pattern &pattern, Transcript &transcript)
    : form_(pattern.isTyped               ? Form::TYPED
            : mayAskForMany(pattern.text) ? Form::ABSENT
                                          : Form::UNIVERSAL)
{
    if (random.oneIn(25))
        form_ = Form::ABSENT;
    if (form_ == Form::TYPED)
        for (const ArgType type : pattern.types) {
            values_.push_back(anyValue(random, type, pattern.text));
            note(values_.back(), transcript);
        }
    transcript.note("list", form_ == Form::TYPED       ? "typed"
                            : form_ == Form::UNIVERSAL ? "universal"
                                                       : "absent");
}

void Arguments::with(const Action &action) const
{
    if (form_ == Form::TYPED)
        pass(action, values_, 0);
    else if (form_ == Form::UNIVERSAL)
        withUniversalList(action);
    else
        action(zelvo_test::noArgs());
}

void withUniversalList(const Action &action)
{
    static const FixedTexts fixed;
    passUniversal(action, fixed.texts, std::make_index_sequence<8>{},
                  std::make_index_sequence<TEXTS>{});
}

} // namespace zelvo_equivalence
