// SPDX-License-Identifier: Apache-2.0
// Feeds patterns and arguments to the translation information of XML records and to binding.
//
// The first byte of an input chooses the values of the arguments, the others are the pattern. The
// caller of a logging call passes what ICU reads when it binds the message, so the argument list
// made here holds exactly that, by ICU's own parser: one slot for each argument and none behind.
// Whoever reads an argument with another type, or one too many, is caught: by the comparison below
// or by the address sanitizer.
#include <algorithm>
#include <cstdarg>
#include <cstdint>
#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <limits>
#include <string>
#include <vector>

#include <unicode/locid.h>
#include <unicode/messagepattern.h>
#include <unicode/uchar.h>
#include <unicode/ures.h>

#include "ZlvEvent.h"
#include "ZlvIntl.h"
#include "ZlvPDXMLFormatter.h"
#include "ZlvPatternScan.h"
#include "util/CxOwned.h"

using namespace zelvo;

namespace {

/// The pattern of the one key of the one bundle that there is.
const UChar *currentPattern;

/// Larger numbers make ICU allocate a slot for every number below.
constexpr int32_t MOST_SLOTS = 1000;

std::u16string patternOf(const uint8_t *data, size_t size)
{
    std::u16string pattern;
    for (size_t i = 0; i < size && data[i] != 0; ++i)
        pattern += data[i] == 0xFF   ? u'\u2264' // a limit of choices
                   : data[i] == 0xFE ? u'\u2028' // white space in patterns
                   : data[i] == 0xFD ? u'\xD800' // half a character
                                     : static_cast<char16_t>(data[i]);
    return pattern;
}

/* What ICU reads. */

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

/// The kinds of the arguments from {0} on; false when ICU's parser refuses the pattern.
bool kindsByIcu(const std::u16string &pattern, std::vector<ArgKind> &kinds)
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
        kinds.resize(std::max(kinds.size(), std::min<size_t>(number, MOST_SLOTS) + 1));
        kinds[std::min<size_t>(number, MOST_SLOTS)] = kindOf(parsed, i);
    }
    return true;
}

/* The arguments. */

constexpr const UChar *texts[] = {u"text", u"", nullptr, u"]]>{0}'\xDC00<&"};
constexpr double doubles[] = {0.5, -1e300, std::numeric_limits<double>::infinity(),
                              std::numeric_limits<double>::quiet_NaN()};

uint64_t slotOf(ArgKind kind, unsigned choice)
{
    uint64_t slot = 0xDEADBEEFDEADBEEF; // no pointer to anything
    if (kind == ArgKind::TEXT)
        slot = reinterpret_cast<uint64_t>(texts[choice % 4]);
    else if (kind == ArgKind::DOUBLE)
        std::memcpy(&slot, &doubles[choice % 4], sizeof slot);
    return slot;
}

/// An argument list as the processor's conventions lay it out when the registers are used up.
struct StackOnly {
    uint32_t nextGeneral = 48;
    uint32_t nextFloating = 176;
    const void *onStack;
    const void *registers = nullptr;
};
static_assert(sizeof(StackOnly) == sizeof(va_list), "only x86-64 lays lists out like this");

/// Calls ACTION with a list of exactly these arguments, which end where their memory ends.
template <class Action>
void withList(const std::vector<ArgKind> &kinds, unsigned choice, Action action)
{
    std::vector<uint64_t> slots;
    slots.reserve(kinds.size());
    for (const ArgKind kind : kinds)
        slots.push_back(slotOf(kind, choice++));
    StackOnly layout{.onStack = slots.data()};
    va_list list;
    std::memcpy(&list, &layout, sizeof layout);
    action(list);
}

[[noreturn]] void fail(const char *what)
{
    std::fprintf(stderr, "%s\n", what);
    std::abort();
}

/// What is read of the list must be there, and of the type that ICU reads.
void compare(const ArgKinds &fetched, const std::vector<ArgKind> &passed)
{
    for (size_t i = 0; i < ArgKinds::COUNT && fetched.of[i] != ArgKind::ABSENT; ++i)
        if (i >= passed.size() || fetched.of[i] != passed[i])
            fail("an argument would be read with another type than ICU's");
}

std::vector<ArgKind> prefixOf(const ArgKinds &kinds)
{
    const ArgKind *end = std::find(std::begin(kinds.of), std::end(kinds.of), ArgKind::ABSENT);
    return {std::begin(kinds.of), end};
}

void writeAndBind(ZlvEvent *event, va_list args, bool binds)
{
    CxUStringBuff out{};
    zlvPDXMLEmitUTranslationInfo(&out, event, args);
    const OwnedUStr element{CxUStringBuffTakeUStr(&out)};
    if (!element)
        fail("no element");
    if (binds)
        RkoMemoryFree(zlvIntlBindUI18Msg(event->message, args));
}

} // namespace

// The names are the linker's: these answer for ICU wherever the library asks for a bundle.
// NOLINTBEGIN(bugprone-reserved-identifier, cert-dcl37-c, cert-dcl51-cpp)
extern "C" {
UResourceBundle *U_ICU_ENTRY_POINT_RENAME(__wrap_ures_open)(const char *, const char *,
                                                            UErrorCode *);
const UChar *U_ICU_ENTRY_POINT_RENAME(__wrap_ures_getStringByKey)(const UResourceBundle *,
                                                                  const char *, int32_t *,
                                                                  UErrorCode *);
void U_ICU_ENTRY_POINT_RENAME(__wrap_ures_close)(UResourceBundle *);
int LLVMFuzzerTestOneInput(const uint8_t *data, size_t size);

UResourceBundle *U_ICU_ENTRY_POINT_RENAME(__wrap_ures_open)(const char *, const char *,
                                                            UErrorCode *)
{
    return nullptr;
}
const UChar *U_ICU_ENTRY_POINT_RENAME(__wrap_ures_getStringByKey)(const UResourceBundle *,
                                                                  const char *, int32_t *length,
                                                                  UErrorCode *)
{
    *length = static_cast<int32_t>(std::char_traits<UChar>::length(currentPattern));
    return currentPattern;
}
void U_ICU_ENTRY_POINT_RENAME(__wrap_ures_close)(UResourceBundle *) {}
}
// NOLINTEND(bugprone-reserved-identifier, cert-dcl37-c, cert-dcl51-cpp)

int LLVMFuzzerTestOneInput(const uint8_t *data, size_t size)
{
    if (size == 0)
        return 0;
    const std::u16string pattern = patternOf(data + 1, size - 1);
    currentPattern = pattern.c_str();
    const ArgKinds fetched = fetchableKinds(currentPattern);
    std::vector<ArgKind> passed;
    const bool isWellFormed = kindsByIcu(pattern, passed);
    if (isWellFormed)
        compare(fetched, passed);
    else
        passed = prefixOf(fetched); // nobody can tell what ICU would read

    ZlvEvent *event = ZlvVaAllocUEvent(ZLV_LEVEL_NONE, "bundle", "key", nullptr, nullptr);
    writeAndBind(event, nullptr, false);
    withList(passed, data[0],
             [&](va_list list) { writeAndBind(event, list, passed.size() <= MOST_SLOTS); });
    ZlvFreeEvent(event);
    return 0;
}
