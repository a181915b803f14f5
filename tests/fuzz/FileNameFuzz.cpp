// SPDX-License-Identifier: Apache-2.0
// Feeds names to everything that takes names of files apart or puts them together. The first byte
// of an input is the size of the areas that names are copied into, the others are the name.
#include <filesystem>
#include <optional>
#include <vector>

#include "CxFile.h"
#include "CxFilePath.h"
#include "ZlvFileHandler.h"
#include "support/Fuzz.h"
#include "support/Numbers.h"
#include "util/CxOwned.h"

using namespace zelvo_fuzz;
using zelvo::OwnedStr;

namespace {

constexpr size_t LONGEST_NAME = 256;

using Text = std::optional<std::string>;

std::string native(std::string name)
{
    std::replace(name.begin(), name.end(), '\\', '/');
    return name;
}

/* The parts of a log file's name. */

struct Parts {
    Text directory;
    Text base;
    int32_t number = 0;
    Text extension;

    bool operator==(const Parts &) const = default;
};

/// Cuts a text from a place on, and gives what was cut.
std::string cut(std::string &text, size_t from)
{
    const std::string tail = text.substr(from);
    text.resize(from);
    return tail;
}

Parts expectedParts(std::string name)
{
    if (name.size() > LONGEST_NAME)
        return {};
    name = native(name);
    Parts parts;
    if (const size_t dot = name.rfind('.'); dot != std::string::npos)
        parts.extension = cut(name, dot).substr(1);
    const size_t digits = name.find_last_not_of("0123456789") + 1;
    parts.number = leadingNumber(cut(name, digits)).low32();
    if (faultIsSeeded() && parts.number > 9)
        ++parts.number;
    const size_t separator = name.rfind('/');
    parts.base = cut(name, separator == std::string::npos ? 0 : separator);
    static const std::string workingDirectory = std::filesystem::current_path();
    parts.directory = name.empty() ? workingDirectory : name;
    return parts;
}

Text composed(const Parts &parts)
{
    if (!parts.base)
        return std::nullopt;
    return parts.directory.value_or("") + (parts.directory ? "/" : "") + *parts.base +
           (parts.number != 0 ? std::to_string(parts.number) : "") + (parts.extension ? "." : "") +
           parts.extension.value_or("");
}

Text textOf(const char *text)
{
    return text != nullptr ? Text(text) : std::nullopt;
}

/// The parts that the library finds, after a look at what it makes of them.
Parts partsOf(const std::string &name)
{
    FileHandlerVars vars{};
    zlvFHGetFileNameParts(ExactText("some/former7.name").get(), &vars);
    zlvFHGetFileNameParts(ExactText(name).get(), &vars);
    const Parts parts{textOf(vars.directory), textOf(vars.base), vars.number,
                      textOf(vars.extension)};
    const OwnedStr whole{
        zlvSetFileNameParts(vars.directory, vars.base, vars.number, vars.extension)};
    check(textOf(whole.get()) == composed(parts), "a name is put together from its parts");
    zlvFHGetFileNameParts(nullptr, &vars);
    check(vars.base == nullptr && vars.directory == nullptr, "without a name there are no parts");
    return parts;
}

std::string withSingleSeparators(const std::string &name)
{
    std::string result;
    for (const char c : name)
        if (c != '/' || !result.ends_with('/'))
            result += c;
    return result;
}

/// The name of the live file, taken apart as a name of its own, leads to the same file.
void checkSecondPass(const Parts &parts)
{
    const std::string first = composed(parts).value_or("");
    if (first.empty() || first.size() > LONGEST_NAME)
        return;
    const std::string second = composed(partsOf(first)).value_or("");
    check(withSingleSeparators(second) == withSingleSeparators(first),
          "a composed name is composed of the parts that it is taken apart into");
}

void checkTrailingDigit(const std::string &name)
{
    const int32_t digit = zlvFHTrailingBaseDigit(ExactText(name).get());
    const size_t end = std::min(name.rfind('.'), name.size());
    const bool isThere = end > 0 && name[end - 1] >= '0' && name[end - 1] <= '9';
    check(digit == (isThere ? static_cast<int32_t>(end) - 1 : -1),
          "the digit before the extension is found");
    if (isThere && name.size() < LONGEST_NAME)
        check(partsOf(std::string(name).insert(end, "_")).number == 0,
              "a '_' behind a digit keeps the digits in the base");
}

/* Names in areas of a size. */

void checkAreas(const std::string &name, size_t size)
{
    const ExactText exact(name);
    std::string expected = native(name.substr(0, size));
    expected.resize(size, '\0');
    using Call = ZlvBool (*)(const char *, char *, size_t);
    for (const Call call : {CxFileNameLocalize, CxFileNameGetNative, zlvGetNativePath}) {
        std::vector<char> area(size, 'x');
        const bool mustFit = call == zlvGetNativePath;
        const bool isTaken = mustFit ? name.size() < size : size > 0 || call == CxFileNameGetNative;
        check((call(exact.get(), area.data(), size) == 1) == (isTaken && size > 0),
              "a name is copied if there is room for it");
        if (isTaken)
            check(std::equal(area.begin(), area.end(), expected.begin()),
                  "a copied name has '/' alone and zeros behind");
    }
}

/* Paths. */

void checkParents(CxFilePath path)
{
    std::string text(path.path, static_cast<size_t>(path.pathLength));
    for (;;) {
        const size_t separator = text.rfind('/');
        const bool hasParent = separator != std::string::npos;
        check(path.lastSeparator == (hasParent ? static_cast<int32_t>(separator) : -1),
              "a path knows its last separator");
        check((CxFilePathParent(&path, &path) == 1) == hasParent, "a path with '/' has a parent");
        if (!hasParent)
            return;
        text.resize(separator);
        check(text == path.path && path.pathLength == static_cast<int32_t>(separator),
              "the parent is what stands before the last separator");
    }
}

void checkPath(const std::string &name)
{
    CxFilePath path;
    const bool fits = name.size() < CX_FILE_PATH_SIZE;
    check((CxInitFilePath(&path, ExactText(name).get()) == 1) == fits, "a path of 255 bytes fits");
    if (!fits) {
        check(path.pathLength == -1, "a path that does not fit is none");
        return;
    }
    check(native(name) == path.path, "a path has '/' alone");
    checkParents(path);
}

} // namespace

int LLVMFuzzerTestOneInput(const uint8_t *data, size_t size)
{
    Input input(data, size);
    const size_t areaSize = input.byte();
    const std::string name = input.text();
    const Parts parts = partsOf(name);
    check(parts == expectedParts(name), "a name has directory, base, number and extension");
    checkSecondPass(parts);
    checkTrailingDigit(name);
    checkAreas(name, areaSize);
    checkPath(name);
    return 0;
}
