// SPDX-License-Identifier: Apache-2.0
#include "CxString.h"

#include <cstdarg>
#include <cstdio>
#include <cstring>
#include <strings.h>

#include "CxMemory.h"

namespace {

/// Answers a comparison in which a string is absent; gives 0 when both are there.
int compareAbsent(const char *a, const char *b)
{
    if (a == nullptr)
        return 1;
    return b == nullptr ? -1 : 0;
}

/// Copies made from a null source are the empty string.
char *makeEmpty(char *dst)
{
    *dst = '\0';
    return dst;
}

} // namespace

int RkoStringCmp(const char *a, const char *b)
{
    const int absent = compareAbsent(a, b);
    return absent != 0 ? absent : std::strcmp(a, b);
}

int RkoStringNCmp(const char *a, const char *b, size_t n)
{
    const int absent = compareAbsent(a, b);
    return absent != 0 ? absent : std::strncmp(a, b, n);
}

int RkoStringICmp(const char *a, const char *b)
{
    const int absent = compareAbsent(a, b);
    return absent != 0 ? absent : strcasecmp(a, b);
}

int RkoStringNICmp(const char *a, const char *b, size_t n)
{
    const int absent = compareAbsent(a, b);
    return absent != 0 ? absent : strncasecmp(a, b, n);
}

char *RkoStringCpy(char *dst, const char *src)
{
    if (dst == nullptr)
        return nullptr;
    return src == nullptr ? makeEmpty(dst) : std::strcpy(dst, src);
}

char *RkoStringNCpy(char *dst, const char *src, size_t n)
{
    if (dst == nullptr)
        return nullptr;
    return src == nullptr ? makeEmpty(dst) : std::strncpy(dst, src, n);
}

char *RkoStringCat(char *dst, const char *src)
{
    return dst == nullptr || src == nullptr ? dst : std::strcat(dst, src);
}

char *RkoStringNCat(char *dst, const char *src, size_t n)
{
    return dst == nullptr || src == nullptr ? dst : std::strncat(dst, src, n);
}

char *RkoStringDup(const char *src)
{
    if (src == nullptr)
        return nullptr;
    const size_t size = std::strlen(src) + 1;
    void *copy = RkoMemoryMalloc(size);
    return copy == nullptr ? nullptr : static_cast<char *>(std::memcpy(copy, src, size));
}

size_t RkoStringLen(const char *str)
{
    return str == nullptr ? 0 : std::strlen(str);
}

char *RkoStringChr(const char *str, int c)
{
    return str == nullptr ? nullptr : const_cast<char *>(std::strchr(str, c));
}

char *RkoStringRChr(const char *str, int c)
{
    return str == nullptr ? nullptr : const_cast<char *>(std::strrchr(str, c));
}

char *RkoStringStr(const char *str, const char *part)
{
    if (str == nullptr || part == nullptr)
        return nullptr;
    return const_cast<char *>(std::strstr(str, part));
}

char *RkoStringStrpbrk(const char *str, const char *accept)
{
    if (str == nullptr || accept == nullptr)
        return nullptr;
    return const_cast<char *>(std::strpbrk(str, accept));
}

int32_t RkoStringStrcspn(const char *str, const char *reject)
{
    if (str == nullptr)
        return -1;
    return static_cast<int32_t>(std::strcspn(str, reject == nullptr ? "" : reject));
}

int32_t RkoStringStrspn(const char *str, const char *accept)
{
    if (str == nullptr)
        return -1;
    return static_cast<int32_t>(std::strspn(str, accept == nullptr ? "" : accept));
}

int RkoStringSprintf(char *dst, const char *format, ...)
{
    va_list args;
    va_start(args, format);
    const int count = std::vsprintf(dst, format, args);
    va_end(args);
    return count;
}
