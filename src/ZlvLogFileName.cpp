// SPDX-License-Identifier: Apache-2.0
// The names of log files: taken apart, and put together with a number.
#include "ZlvFileHandler.h"

#include <algorithm>
#include <cstring>
#include <iterator>
#include <utility>

#include "CxChars.h"
#include "CxMemory.h"
#include "CxProcess.h"
#include "CxString.h"
#include "ZlvFileHandlerIntl.h"
#include "ZlvPropsIntl.h"
#include "util/CxDecimal.h"

using namespace zelvo;

namespace {

constexpr size_t LONGEST_NAME = 256;
constexpr size_t CWD_SIZE = 256;

void clearParts(FileHandlerVars &vars)
{
    RkoMemoryFree(std::exchange(vars.directory, nullptr));
    RkoMemoryFree(std::exchange(vars.base, nullptr));
    RkoMemoryFree(std::exchange(vars.extension, nullptr));
    vars.number = 0;
}

/// Takes a copy of a part; false when memory ran out.
bool takePart(char *&part, const char *text)
{
    part = RkoStringDup(text);
    return part != nullptr;
}

/// Cuts the extension off a name, if it has one.
bool takeExtension(FileHandlerVars &vars, char *name)
{
    char *dot = std::strrchr(name, '.');
    if (dot == nullptr)
        return true;
    *dot = '\0';
    return takePart(vars.extension, dot + 1);
}

/// Cuts the digits off the end of a name.
void takeNumber(FileHandlerVars &vars, char *name)
{
    char *digits = name + std::strlen(name);
    while (digits != name && CxIsLocalDigit(digits[-1]) == 1)
        --digits;
    vars.number = zlvPropStrToInt32(digits, nullptr);
    *digits = '\0';
}

/// Cuts the base off a name; where there is no '/', nothing is left.
bool takeBase(FileHandlerVars &vars, char *name)
{
    char *separator = std::strrchr(name, '/');
    char *base = separator != nullptr ? separator : name;
    const bool taken = takePart(vars.base, base);
    *base = '\0';
    return taken;
}

bool takeWorkingDirectory(FileHandlerVars &vars)
{
    char path[CWD_SIZE];
    return !isOk(reported(CxProcessGetCwd(path, sizeof path))) || takePart(vars.directory, path);
}

bool takeDirectory(FileHandlerVars &vars, const char *name)
{
    return *name != '\0' ? takePart(vars.directory, name) : takeWorkingDirectory(vars);
}

bool takeParts(FileHandlerVars &vars, char *name)
{
    if (!takeExtension(vars, name))
        return false;
    takeNumber(vars, name);
    return takeBase(vars, name) && takeDirectory(vars, name);
}

} // namespace

void zlvFHGetFileNameParts(const char *name, FileHandlerVars *vars)
{
    if (vars == nullptr)
        return;
    clearParts(*vars);
    char buffer[LONGEST_NAME + 1];
    // All or nothing: a name without one of its parts would be a file somewhere else.
    if (zlvGetNativePath(name, buffer, sizeof buffer) == 1 && !takeParts(*vars, buffer))
        clearParts(*vars);
}

int32_t zlvFHTrailingBaseDigit(const char *name)
{
    if (name == nullptr)
        return -1;
    const char *dot = std::strrchr(name, '.');
    const char *end = dot != nullptr ? dot : name + std::strlen(name);
    const bool isDigit = end != name && CxIsLocalDigit(end[-1]) == 1;
    return isDigit ? static_cast<int32_t>(end - name) - 1 : -1;
}

char *zlvSetFileNameParts(const char *directory, const char *base, int32_t number,
                          const char *extension)
{
    if (base == nullptr)
        return nullptr;
    const DecimalText digits = number != 0 ? decimalText(number) : DecimalText{};
    const char *const parts[] = {directory,   directory != nullptr ? "/" : nullptr, base,
                                 digits.text, extension != nullptr ? "." : nullptr, extension};
    size_t size = 1;
    for (const char *part : parts)
        size += RkoStringLen(part);
    auto *name = static_cast<char *>(RkoMemoryMalloc(size));
    if (name == nullptr)
        return nullptr;
    *name = '\0';
    for (const char *part : parts)
        RkoStringCat(name, part);
    return name;
}

ZlvBool zlvGetNativePath(const char *name, char *dst, size_t size)
{
    if (name == nullptr || dst == nullptr || std::strlen(name) >= size)
        return 0;
    return CxFileNameGetNative(name, dst, size);
}
