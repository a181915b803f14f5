// SPDX-License-Identifier: Apache-2.0
// Feeds texts to the parser of level names.
#include "ZlvLevel.h"
#include "support/Fuzz.h"
#include "support/Numbers.h"

using namespace zelvo_fuzz;

namespace {

struct Name {
    std::string_view text;
    ZlvLevel level;
};

constexpr Name names[] = {
    {"fatal", 7000},     {"error", 6000}, {"warn", 5000},      {"info", 4000},
    {"debug_min", 3000}, {"min", 3000},   {"debug_mid", 2000}, {"mid", 2000},
    {"debug_max", 1000}, {"max", 1000},   {"all", 0},          {"off", 9999},
};
constexpr ZlvLevel none = -9999;

std::string withLetters(std::string text, char first, char last, int distance)
{
    for (char &c : text)
        if (c >= first && c <= last)
            c = static_cast<char>(c + distance);
    return text;
}

std::string lower(const std::string &text)
{
    return withLetters(text, 'A', 'Z', 'a' - 'A');
}

std::string upper(const std::string &text)
{
    return withLetters(text, 'a', 'z', 'A' - 'a');
}

ZlvLevel levelNamed(const std::string &text)
{
    const std::string folded = lower(text);
    for (const Name &name : names)
        if (folded.compare(0, name.text.size(), name.text) == 0)
            return name.level == 2000 && faultIsSeeded() ? 2001 : name.level;
    return none;
}

ZlvLevel expectedLevel(const std::string &text)
{
    const LeadingNumber number = leadingNumber(text);
    return number.isThere || number.isAllBlank ? number.low32() : levelNamed(text);
}

ZlvLevel levelOf(const std::string &text)
{
    return ZlvGetLevelFromString(ExactText(text).get());
}

} // namespace

int LLVMFuzzerTestOneInput(const uint8_t *data, size_t size)
{
    const std::string text = Input(data, size).text();
    const ZlvLevel level = levelOf(text);
    check(level == expectedLevel(text), "a level is a number, or one that the text's start names");
    check(levelOf(upper(text)) == level, "capital letters change no level");
    check(levelOf(lower(text)) == level, "small letters change no level");
    check(level == none || leadingNumber(text).isAllBlank || levelOf(text + " x") == level,
          "what follows a level does not matter");
    return 0;
}
