// SPDX-License-Identifier: Apache-2.0
// The identifier at the start of a message: letters, digits, severity letter.
#include "CxKvtID.h"

#include <cstring>

#include "CxChars.h"

namespace {

/// No format is longer, so no character behind this place is read.
constexpr int32_t EXAMINED = 10;
constexpr int32_t MOST_LETTERS = 6;

struct Format {
    int32_t letters;
    int32_t digits;
    const char *name;
};

/// Each format by its counts. The name with "45" is the one that readers of records know.
constexpr Format formats[] = {
    {6, 3, "Ozk6.3.1"}, {5, 4, "Ozk45.4.1"}, {5, 3, "Ozk5.3.1"}, {5, 2, "Ozk5.2.1"},
    {4, 4, "Ozk4.4.1"}, {4, 3, "Ozk4.3.1"},  {4, 5, "Ozk4.5.1"}, {3, 4, "Ozk3.4.1"},
    {3, 3, "Ozk3.3.1"}, {3, 5, "Ozk3.5.1"},  {3, 6, "Ozk3.6.1"},
};

/// Counts the characters of one kind from a place on, up to a limit. The terminating 0 is of no
/// kind.
int32_t countOf(ZlvBool (*isOfKind)(char), const char *text, int32_t limit)
{
    int32_t count = 0;
    while (count < limit && isOfKind(text[count]) != 0)
        ++count;
    return count;
}

bool isSeverity(char c)
{
    return c == 'I' || c == 'W' || c == 'E';
}

/// The format of a text's identifier; null when it has none. The counts settle the format: a letter
/// more, or a digit more, makes another one, or none.
const Format *formatOf(const char *text)
{
    const int32_t letters = countOf(CxIsASCIIAlpha, text, MOST_LETTERS);
    const int32_t digits = countOf(CxIsASCIIDigit, text + letters, EXAMINED - letters);
    if (letters + digits >= EXAMINED || !isSeverity(text[letters + digits]))
        return nullptr;
    for (const Format &format : formats)
        if (format.letters == letters && format.digits == digits)
            return &format;
    return nullptr;
}

} // namespace

CxKvtIDInfo CxParseKvtID(const char *text)
{
    CxKvtIDInfo info{.format = "", .code = 0, .length = 0, .identifier = ""};
    const Format *format = text != nullptr ? formatOf(text) : nullptr;
    if (format == nullptr)
        return info;
    info.format = format->name;
    info.code = format->letters * 100 + format->digits * 10 + 1;
    info.length = format->letters + format->digits + 1;
    // The severity is the last of the bytes that the identifier spans; the terminating 0, which
    // comes after it, takes its place when the identifier fills them all.
    info.identifier[sizeof info.identifier - 1] = text[info.length - 1];
    std::memcpy(info.identifier, text, static_cast<size_t>(info.length));
    info.identifier[info.length] = '\0';
    return info;
}
