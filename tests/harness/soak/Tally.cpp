// SPDX-License-Identifier: Apache-2.0
#include "Tally.h"

#include <algorithm>
#include <cctype>
#include <cstdio>
#include <string>

#include "process/Records.h"

namespace zelvo_test {

namespace {

/// What may stand before a record, with a 0 for each digit: the forms of its date.
constexpr std::string_view DATES[] = {
    "", "0000-00-00 00:00:00.000 ", "00:00:00 ", "day 0 ", "day 00 ", "day 000 "};
/// What is not counted, behind a date or not.
constexpr std::string_view CHATTER[] = {"chatter", "soak chatter 1 chatter"};

bool isDate(std::string_view text)
{
    std::string form(text);
    std::replace_if(
        form.begin(), form.end(), [](unsigned char c) { return std::isdigit(c) != 0; }, '0');
    return std::find(std::begin(DATES), std::end(DATES), form) != std::end(DATES);
}

bool isChatter(std::string_view line)
{
    return std::any_of(std::begin(CHATTER), std::end(CHATTER), [&](std::string_view chatter) {
        return line.ends_with(chatter) && isDate(line.substr(0, line.size() - chatter.size()));
    });
}

} // namespace

void Tally::read(std::string_view content)
{
    for (size_t end = content.find('\n'); end != content.npos; end = content.find('\n')) {
        readLine(content.substr(0, end));
        content.remove_prefix(end + 1);
    }
    fragments_ += content.empty() ? 0 : 1;
}

/// A record that follows a fragment in the same line is whole all the same.
void Tally::readLine(std::string_view line)
{
    const size_t start = line.rfind('<');
    const bool isRecord = start != line.npos && countRecord(line.substr(start));
    const bool isClean = isRecord ? isDate(line.substr(0, start)) : isChatter(line);
    fragments_ += isClean ? 0 : 1;
}

bool Tally::countRecord(std::string_view record)
{
    uint32_t seed = 0;
    uint32_t stream = 0;
    uint32_t number = 0;
    const std::string text(record);
    if (std::sscanf(text.c_str(), "<s%u w%u n%u ", &seed, &stream, &number) != 3 || seed != seed_ ||
        stream >= STREAMS || number == 0 || text != recordText(seed, stream, number))
        return false;
    std::vector<uint8_t> &copies = copies_[stream];
    copies.resize(std::max<size_t>(copies.size(), number));
    ++copies[number - 1];
    return true;
}

} // namespace zelvo_test
