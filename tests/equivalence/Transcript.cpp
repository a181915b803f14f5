// SPDX-License-Identifier: Apache-2.0
#include "Transcript.h"

#include <functional>

#include <unicode/uchar.h>

namespace zelvo_equivalence {
namespace {

constexpr size_t NUMBER_SIZE = 48;

template <class Unit>
void showUnit(std::string &out, Unit unit, const char *escape)
{
    char area[NUMBER_SIZE];
    const auto code = static_cast<unsigned>(static_cast<std::make_unsigned_t<Unit>>(unit));
    if (code >= 0x20 && code < 0x7F && code != '\\' && code != '"') {
        out += static_cast<char>(code);
        return;
    }
    static_cast<void>(std::snprintf(area, sizeof area, escape, code));
    out += area;
}

template <class Units>
std::string shownUnits(const std::optional<Units> &text, const char *escape)
{
    if (!text)
        return "null";
    std::string out = "\"";
    for (const auto unit : *text)
        showUnit(out, unit, escape);
    return out + '"';
}

bool hasForeignDigits(const std::u16string &text)
{
    for (const char16_t unit : text)
        if (unit > 0x7F && u_charDigitValue(unit) >= 0)
            return true;
    return false;
}

} // namespace

std::string shown(const Text &text)
{
    return shownUnits(text, "\\x%02x");
}

std::string shown(const UText &text)
{
    return shownUnits(text, "\\u%04x");
}

void Transcript::beginStep(uint64_t number, const char *name)
{
    std::fprintf(file_, "\n%llu %s", static_cast<unsigned long long>(number), name);
    count("steps");
}

void Transcript::append(const char *name, const std::string &value)
{
    std::fprintf(file_, " %s=%s", name, value.c_str());
}

void Transcript::note(const char *name, int64_t value)
{
    append(name, std::to_string(value));
}

void Transcript::note(const char *name, double value)
{
    char area[NUMBER_SIZE];
    static_cast<void>(std::snprintf(area, sizeof area, "%.17g", value));
    append(name, area);
}

void Transcript::note(const char *name, const Text &value)
{
    append(name, shown(value));
}

void Transcript::note(const char *name, const UText &value)
{
    append(name, shown(value));
}

void Transcript::note(const char *name, const char *value)
{
    append(name, shown(zelvo_test::peeked(value)));
}

void Transcript::countResult(const std::string &value)
{
    count("results");
    if (distinct_.insert(std::hash<std::string>{}(value)).second)
        count("distinct results");
}

void Transcript::result(const char *name, const Text &value)
{
    const std::string text = shown(value);
    append(name, text);
    countResult(text);
}

void Transcript::result(const char *name, const UText &value)
{
    const std::string text = shown(value);
    append(name, text);
    countResult(text);
    if (!value)
        count("absent results");
    else if (hasForeignDigits(*value))
        count("results with foreign digits");
    if (value && value->size() > 1000)
        count("long results");
}

void Transcript::result(const char *name, int64_t value)
{
    append(name, std::to_string(value));
    count("statuses");
}

void Transcript::finish()
{
    for (const auto &[what, times] : counts_)
        std::fprintf(file_, "\ncount %llu %s", static_cast<unsigned long long>(times),
                     what.c_str());
    std::fputc('\n', file_);
}

} // namespace zelvo_equivalence
