// SPDX-License-Identifier: Apache-2.0
#include "support/PropertiesModel.h"

#include <algorithm>

#include "support/Fuzz.h"

namespace zelvo_fuzz {
namespace {

bool isOneOf(char c, std::string_view set)
{
    return set.find(c) != std::string_view::npos;
}

bool isLineEnd(char c)
{
    return isOneOf(c, "\n\r");
}

bool isBlank(char c)
{
    return isOneOf(c, faultIsSeeded() ? " \t\f" : " \t\v\f");
}

/// The bytes without line ends that directly follow a line end.
std::string withSingleLineEnds(std::string_view bytes)
{
    std::string result;
    char previous = '\0';
    for (const char c : bytes) {
        if (!isLineEnd(previous) || !isLineEnd(c))
            result += c;
        previous = c;
    }
    return result;
}

/// A code point in the first definition of UTF-8, which goes up to 31 bits.
std::string utf8(uint32_t sum)
{
    const auto codePoint = static_cast<int32_t>(sum);
    if (codePoint <= 0x7F)
        return {static_cast<char>(sum & 0x7F)};
    int tailBytes = 1;
    // Two bytes end at 0x7FE here; each further one is worth five bits more.
    for (int64_t limit = 0x7FE; codePoint > limit; limit = (int64_t{1} << (5 * tailBytes + 6)) - 1)
        ++tailBytes;
    std::string bytes;
    for (; static_cast<int>(bytes.size()) < tailBytes; sum >>= 6)
        bytes.insert(bytes.begin(), static_cast<char>(0x80 | (sum & 0x3F)));
    const uint32_t lead = 0xFF00U >> (tailBytes + 1) & 0xFFU;
    return static_cast<char>(lead | sum) + bytes;
}

/// The value of a digit: letters count from 0, as digits do.
int digitValue(char c)
{
    const size_t place = std::string_view("0123456789abcdefABCDEF").find(c);
    if (place == std::string_view::npos)
        return -1;
    return static_cast<int>(place < 10 ? place : (place - 10) % 6);
}

/// How a part of the grammar ended.
enum class End { LINE, INPUT, FAULT };

class Reader {
public:
    explicit Reader(std::string_view bytes) : text_(withSingleLineEnds(bytes)) {}

    PropertiesReading run()
    {
        End end = End::LINE;
        while (end == End::LINE)
            end = line();
        if (end == End::INPUT && !key_.empty())
            emit();
        return {std::move(entries_), end == End::INPUT};
    }

private:
    bool isAtEnd() const { return at_ == text_.size(); }
    char next() { return text_[at_++]; }

    void skipBlanks()
    {
        while (!isAtEnd() && isBlank(text_[at_]))
            ++at_;
    }

    void emit()
    {
        const std::optional<std::string> value =
            hadValue_ ? std::optional(std::string(value_.c_str())) : std::nullopt;
        entries_.push_back({key_.c_str(), value}); // as C strings: a zero ends both
    }

    void addValue(const std::string &bytes)
    {
        value_ += bytes;
        hadValue_ = true;
    }

    End line()
    {
        if (isAtEnd())
            return End::INPUT;
        key_.clear();
        value_.clear();
        const bool isIndented = isBlank(text_[at_]);
        skipBlanks();
        if (isAtEnd())
            return End::INPUT;
        const char first = next();
        if (isLineEnd(first))
            return End::LINE;
        if (isOneOf(first, "!#"))
            return comment();
        if (isIndented && isOneOf(first, "=:"))
            return End::FAULT;
        key_ += first; // whatever it is
        return key();
    }

    End comment()
    {
        while (!isAtEnd())
            if (isLineEnd(next()))
                return End::LINE;
        return End::INPUT;
    }

    End key()
    {
        while (!isAtEnd()) {
            char c = next();
            if (isBlank(c))
                return separator();
            if (isOneOf(c, "=:"))
                return value();
            if (isLineEnd(c))
                return End::FAULT;
            if (c == '\\') {
                if (isAtEnd())
                    return End::INPUT;
                c = next();
                if (!isBlank(c) && !isOneOf(c, "\\=:"))
                    return End::FAULT;
            }
            key_ += c;
        }
        return End::INPUT;
    }

    /// Behind a key and a blank.
    End separator()
    {
        skipBlanks();
        if (isAtEnd())
            return End::INPUT;
        if (isLineEnd(text_[at_]))
            return End::FAULT;
        if (!isOneOf(text_[at_], "=:"))
            return rest();
        ++at_;
        return value();
    }

    End value()
    {
        skipBlanks();
        return rest();
    }

    End rest()
    {
        while (!isAtEnd()) {
            const char c = next();
            if (isLineEnd(c)) {
                emit();
                return End::LINE;
            }
            if (c != '\\')
                addValue({c});
            else if (const End end = escape(); end != End::LINE)
                return end;
        }
        return End::INPUT;
    }

    /// Ends with LINE when the value goes on.
    End escape()
    {
        if (isAtEnd())
            return End::INPUT;
        const char c = next();
        if (isOneOf(c, "uU"))
            return unicode();
        if (isLineEnd(c))
            skipBlanks();
        else if (isBlank(c) || isOneOf(c, "\"'\\"))
            addValue({c});
        else
            return End::FAULT;
        return End::LINE;
    }

    /// The digits of all escapes of a file add up.
    End unicode()
    {
        for (uint32_t weight = 0x1000; weight > 0; weight /= 0x10) {
            if (isAtEnd())
                return End::INPUT;
            const int digit = digitValue(next());
            if (digit < 0)
                return End::FAULT;
            sum_ += static_cast<uint32_t>(digit) * weight;
        }
        addValue(utf8(sum_));
        return End::LINE;
    }

    const std::string text_;
    size_t at_ = 0;
    std::string key_;
    std::string value_;
    bool hadValue_ = false;
    uint32_t sum_ = 0;
    std::vector<PropertyEntry> entries_;
};

/// The value of a key in a sequence of pairs, which is made at the end if need be.
template <class Pairs>
auto &at(Pairs &pairs, const std::string &key)
{
    const auto found =
        std::find_if(pairs.begin(), pairs.end(), [&](auto &pair) { return pair.first == key; });
    return found != pairs.end()
               ? found->second
               : pairs.emplace_back(key, typename Pairs::value_type::second_type{}).second;
}

bool put(PropertiesInConfigs &all, const PropertyEntry &entry)
{
    const size_t dot = entry.key.rfind('.');
    if (dot == std::string::npos || dot == 0 || dot + 1 == entry.key.size() || !entry.value)
        return false;
    const std::string config = entry.key.substr(0, dot);
    if (config == "/") // the root of all configurations, which has no properties
        return false;
    at(at(all.configs, config), entry.key.substr(dot + 1)) = *entry.value;
    return true;
}

} // namespace

PropertiesReading readProperties(std::string_view bytes)
{
    return Reader(bytes).run();
}

PropertiesInList propertiesInList(const PropertiesReading &reading)
{
    PropertiesInList list{{}, reading.isWellFormed};
    for (const PropertyEntry &entry : reading.entries) {
        if (!entry.value)
            return {std::move(list.entries), false};
        at(list.entries, entry.key) = *entry.value;
    }
    return list;
}

PropertiesInConfigs propertiesInConfigs(const PropertiesReading &reading)
{
    PropertiesInConfigs all{{}, reading.isWellFormed};
    for (const PropertyEntry &entry : reading.entries)
        if (!put(all, entry))
            return {std::move(all.configs), false};
    return all;
}

} // namespace zelvo_fuzz
