// SPDX-License-Identifier: Apache-2.0
#include "support/Arguments.h"

#include <algorithm>
#include <iterator>
#include <limits>

#include <unicode/locid.h>
#include <unicode/messagepattern.h>
#include <unicode/uchar.h>

using zelvo::ArgKind;
using zelvo::ArgKinds;

namespace zelvo_fuzz {
namespace {

/// A type or a style without the white space around it, which is that of patterns, in lower case.
icu::UnicodeString wordOf(const icu::MessagePattern &parsed, int32_t part)
{
    icu::UnicodeString word = parsed.getSubstring(parsed.getPart(part));
    auto isSpace = [&](int32_t at) {
        return u_hasBinaryProperty(word[at], UCHAR_PATTERN_WHITE_SPACE) != 0;
    };
    while (!word.isEmpty() && isSpace(word.length() - 1))
        word.truncate(word.length() - 1);
    while (!word.isEmpty() && isSpace(0))
        word.remove(0, 1);
    return word.toLower(icu::Locale::getRoot());
}

ArgKind kindOfSimple(const icu::MessagePattern &parsed, int32_t typePart)
{
    const icu::UnicodeString type = wordOf(parsed, typePart);
    const bool hasStyle = typePart + 1 < parsed.countParts() &&
                          parsed.getPartType(typePart + 1) == UMSGPAT_PART_TYPE_ARG_STYLE;
    if (type == u"number")
        return hasStyle && wordOf(parsed, typePart + 1) == u"integer" ? ArgKind::INTEGER
                                                                      : ArgKind::DOUBLE;
    const bool isRuleBased = type == u"spellout" || type == u"ordinal" || type == u"duration";
    return isRuleBased ? ArgKind::DOUBLE : ArgKind::UNKNOWN;
}

ArgKind kindOf(const icu::MessagePattern &parsed, int32_t start)
{
    switch (parsed.getPart(start).getArgType()) {
    case UMSGPAT_ARG_TYPE_NONE:
    case UMSGPAT_ARG_TYPE_SELECT:
        return ArgKind::TEXT;
    case UMSGPAT_ARG_TYPE_SIMPLE:
        return kindOfSimple(parsed, start + 2);
    default:
        return ArgKind::DOUBLE;
    }
}

Kinds prefixOf(const ArgKinds &kinds)
{
    const ArgKind *end = std::find(std::begin(kinds.of), std::end(kinds.of), ArgKind::ABSENT);
    return {std::begin(kinds.of), end};
}

constexpr const UChar *texts[] = {u"text", u"", nullptr, u"]]>{0}'\xDC00<&"};
constexpr double doubles[] = {0.5, -1e300, std::numeric_limits<double>::infinity(),
                              std::numeric_limits<double>::quiet_NaN()};

} // namespace

std::u16string patternOf(std::string_view bytes)
{
    std::u16string pattern;
    for (const char byte : bytes.substr(0, bytes.find('\0'))) {
        const auto c = static_cast<uint8_t>(byte);
        pattern += c == 0xFF   ? u'\u2264' // a limit of choices
                   : c == 0xFE ? u'\u2028' // white space in patterns
                   : c == 0xFD ? u'\xD800' // half a character
                               : static_cast<char16_t>(c);
    }
    return pattern;
}

bool kindsByIcu(const std::u16string &pattern, Kinds &kinds)
{
    UErrorCode status = U_ZERO_ERROR;
    const icu::MessagePattern parsed(icu::UnicodeString(pattern.c_str()), nullptr, status);
    if (U_FAILURE(status))
        return false;
    for (int32_t i = 0; i < parsed.countParts(); ++i) {
        if (parsed.getPartType(i) != UMSGPAT_PART_TYPE_ARG_START ||
            parsed.getPartType(i + 1) != UMSGPAT_PART_TYPE_ARG_NUMBER)
            continue;
        const auto number = static_cast<size_t>(parsed.getPart(i + 1).getValue());
        kinds.resize(std::max(kinds.size(), std::min(number, MOST_ARGUMENTS) + 1));
        kinds[std::min(number, MOST_ARGUMENTS)] = kindOf(parsed, i);
    }
    return true;
}

Kinds kindsToPass(const std::u16string &pattern)
{
    Kinds kinds;
    return kindsByIcu(pattern, kinds) ? kinds : prefixOf(zelvo::fetchableKinds(pattern.c_str()));
}

uint64_t slotOf(ArgKind kind, unsigned choice)
{
    uint64_t slot = 0xDEADBEEFDEADBEEF; // no pointer to anything
    if (kind == ArgKind::TEXT)
        slot = reinterpret_cast<uint64_t>(texts[choice % 4]);
    else if (kind == ArgKind::DOUBLE)
        std::memcpy(&slot, &doubles[choice % 4], sizeof slot);
    return slot;
}

const UChar *textIn(uint64_t slot)
{
    return reinterpret_cast<const UChar *>(slot);
}

double doubleIn(uint64_t slot)
{
    double value = 0;
    std::memcpy(&value, &slot, sizeof value);
    return value;
}

std::vector<uint64_t> slotsOf(const Kinds &kinds, unsigned choice)
{
    std::vector<uint64_t> slots;
    slots.reserve(kinds.size());
    for (const ArgKind kind : kinds)
        slots.push_back(slotOf(kind, choice++));
    return slots;
}

} // namespace zelvo_fuzz
