// SPDX-License-Identifier: Apache-2.0
#include "process/Records.h"

#include <algorithm>
#include <cstdio>
#include <fstream>
#include <sstream>

namespace zelvo_test {

namespace {

uint32_t olderFilesIn(const std::filesystem::path &directory)
{
    uint32_t highest = 0;
    for (const auto &entry : std::filesystem::directory_iterator(directory)) {
        uint32_t number = 0;
        if (std::sscanf(entry.path().filename().c_str(), "shared%u.log", &number) == 1)
            highest = std::max(highest, number);
    }
    return highest;
}

} // namespace

std::string recordText(uint32_t seed, uint32_t writer, uint32_t number)
{
    char head[48];
    const int length = std::snprintf(head, sizeof head, "<s%u w%02u n%07u ", seed, writer, number);
    std::string text(head, static_cast<size_t>(length));
    uint32_t state = (seed * 64 + writer) * 0x9E3779B9U ^ (number + 1) * 0x85EBCA6BU;
    const auto next = [&state] {
        state = state * 1664525U + 1013904223U;
        return state >> 16;
    };
    text.resize(99 + next() % 21, ' ');
    std::generate(text.begin() + length, text.end(),
                  [&next] { return static_cast<char>('a' + next() % 26); });
    return text + '>';
}

Census::Census(const std::filesystem::path &directory, uint32_t seed)
    : seed_(seed), olderFiles_(olderFilesIn(directory))
{
    for (uint32_t number = olderFiles_; number > 0; --number)
        readFile(directory / ("shared" + std::to_string(number) + ".log"));
    readFile(directory / "shared.log");
}

void Census::readFile(const std::filesystem::path &path)
{
    std::ostringstream content;
    content << std::ifstream(path, std::ios::binary).rdbuf();
    const std::string text = content.str();
    std::string_view rest = text;
    for (size_t end = rest.find('\n'); end != rest.npos; end = rest.find('\n')) {
        readLine(rest.substr(0, end));
        rest.remove_prefix(end + 1);
    }
    fragments_ += rest.empty() ? 0 : 1;
}

/// A whole record that follows a fragment in the same line is a whole record.
void Census::readLine(std::string_view line)
{
    const size_t start = line.rfind('<');
    const bool isWhole = start != line.npos && countRecord(line.substr(start));
    fragments_ += isWhole && start == 0 ? 0 : 1;
}

bool Census::countRecord(std::string_view record)
{
    uint32_t seed = 0;
    uint32_t writer = 0;
    uint32_t number = 0;
    const std::string text(record);
    if (std::sscanf(text.c_str(), "<s%u w%u n%u ", &seed, &writer, &number) != 3 || seed != seed_ ||
        text != recordText(seed, writer, number))
        return false;
    auto &copies = copies_[writer];
    if (copies.size() <= number)
        copies.resize(number + 1);
    ++copies[number];
    outOfOrder_ += number < last_[writer] ? 1 : 0;
    last_[writer] = number;
    return true;
}

size_t Census::distinct() const
{
    size_t sum = 0;
    for (const auto &[writer, copies] : copies_)
        sum += static_cast<size_t>(
            std::count_if(copies.begin(), copies.end(), [](uint8_t count) { return count > 0; }));
    return sum;
}

size_t Census::doubled() const
{
    size_t sum = 0;
    for (const auto &[writer, copies] : copies_)
        for (const uint8_t count : copies)
            sum += count > 1 ? count - 1U : 0U;
    return sum;
}

size_t Census::copiesOf(uint32_t writer, uint32_t number) const
{
    const auto copies = copies_.find(writer);
    return copies != copies_.end() && number < copies->second.size() ? copies->second[number] : 0;
}

} // namespace zelvo_test
