// SPDX-License-Identifier: Apache-2.0
// The growable byte buffer. Every append makes its room first and writes only then, so that a
// failed growth leaves the buffer untouched.
#include "CxStringBuff.h"

#include <cstring>

#include "CxDecimal.h"
#include "CxGrowth.h"
#include "CxMemory.h"
#include "CxString.h"

using zelvo::decimalText;

static constexpr uint32_t FIRST_CAPACITY = 1024;
static constexpr uint32_t UP_TO_TERMINATOR = UINT32_MAX;

static uint32_t usedLength(const CxStringBuff *buff)
{
    return buff->data == nullptr ? 0 : buff->length;
}

static bool reallocate(CxStringBuff *buff, uint64_t capacity)
{
    if (capacity > UINT32_MAX)
        return false;
    void *data = RkoMemoryRealloc(buff->data, capacity);
    if (data == nullptr)
        return false;
    buff->data = static_cast<char *>(data);
    buff->capacity = static_cast<uint32_t>(capacity);
    return true;
}

ZlvBool cxStringBuffHasCapacity(CxStringBuff *buff, uint32_t extra)
{
    if (buff == nullptr)
        return false;
    const bool isFresh = buff->data == nullptr;
    const uint32_t present = isFresh ? 0 : buff->capacity;
    const uint64_t need = uint64_t{usedLength(buff)} + extra + 1;
    const uint64_t capacity = zelvo::capacityFor(present, FIRST_CAPACITY, need);
    if (capacity != present && !reallocate(buff, capacity))
        return false;
    if (isFresh)
        CxStringBuffRestart(buff);
    return true;
}

static void setLength(CxStringBuff *buff, uint32_t length)
{
    buff->length = length;
    buff->data[length] = '\0';
}

/// Appends `count` bytes after making room for `room` of them, which is no fewer.
static bool append(CxStringBuff *buff, const char *bytes, uint32_t count, uint32_t room)
{
    if (!cxStringBuffHasCapacity(buff, room))
        return false;
    std::memcpy(buff->data + buff->length, bytes, count);
    setLength(buff, buff->length + count);
    return true;
}

ZlvBool CxStringBuffAppendChar(CxStringBuff *buff, char c)
{
    return append(buff, &c, 1, 1);
}

namespace {

/// One form of UTF-8, by its number of bytes: up to which code point it serves, and its first byte.
struct Utf8Form {
    int32_t limit;
    uint8_t lead;
    uint8_t leadMask;
};

/// The two-byte form ends one short of what it could hold; 0x7FF is written in three bytes.
constexpr Utf8Form UTF8_FORMS[] = {
    {0x7F, 0x00, 0x7F},     {0x7FE, 0xC0, 0x1F},     {0xFFFF, 0xE0, 0x0F},
    {0x1FFFFF, 0xF0, 0x07}, {0x3FFFFFF, 0xF8, 0x03}, {INT32_MAX, 0xFC, 0x01},
};

} // namespace

static void appendForm(CxStringBuff *buff, const Utf8Form &form, uint32_t bytes, uint32_t codePoint)
{
    uint32_t shift = 6 * (bytes - 1);
    char *next = buff->data + buff->length;
    *next++ = static_cast<char>(form.lead + (codePoint >> shift & form.leadMask));
    while (shift > 0) {
        shift -= 6;
        *next++ = static_cast<char>(0x80 + (codePoint >> shift & 0x3F));
    }
    setLength(buff, buff->length + bytes);
}

ZlvBool CxStringBuffAppendUTF32Char(CxStringBuff *buff, int32_t codePoint)
{
    uint32_t bytes = 0;
    for (const Utf8Form &form : UTF8_FORMS) {
        ++bytes;
        if (codePoint <= form.limit && cxStringBuffHasCapacity(buff, bytes)) {
            appendForm(buff, form, bytes, static_cast<uint32_t>(codePoint));
            return true;
        }
    }
    return false;
}

ZlvBool CxStringBuffAppendUCS2Char(CxStringBuff *buff, uint16_t unit)
{
    return CxStringBuffAppendUTF32Char(buff, unit);
}

ZlvBool CxStringBuffAppendInt32(CxStringBuff *buff, int32_t value)
{
    return CxStringBuffAppendInt64(buff, value);
}

ZlvBool CxStringBuffAppendInt64(CxStringBuff *buff, int64_t value)
{
    return CxStringBuffAppendStr(buff, decimalText(value).text);
}

ZlvBool CxStringBuffAppendUInt64(CxStringBuff *buff, uint64_t value)
{
    if (buff == nullptr)
        return false;
    const zelvo::DecimalText decimal = decimalText(value);
    for (const char *digit = decimal.text; *digit != '\0'; ++digit)
        CxStringBuffAppendChar(buff, *digit);
    return true;
}

ZlvBool CxStringBuffAppendEBCDICInt64(CxStringBuff *buff, int64_t value)
{
    if (value == 0)
        return append(buff, "", 0, 0);
    zelvo::DecimalText decimal = decimalText(value);
    for (char *c = decimal.text; *c != '\0'; ++c)
        *c = static_cast<char>(*c == '-' ? 0x60 : 0xF0 + (*c - '0'));
    return CxStringBuffAppendStr(buff, decimal.text);
}

ZlvBool CxStringBuffAppendStr(CxStringBuff *buff, const char *str)
{
    const size_t length = RkoStringLen(str);
    if (str == nullptr || length >= UINT32_MAX)
        return false;
    return append(buff, str, static_cast<uint32_t>(length), static_cast<uint32_t>(length));
}

ZlvBool CxStringBuffAppendStrN(CxStringBuff *buff, const char *bytes, uint32_t n)
{
    if (bytes == nullptr)
        return false;
    if (n == UP_TO_TERMINATOR)
        return CxStringBuffAppendStr(buff, bytes);
    return append(buff, bytes, static_cast<uint32_t>(strnlen(bytes, n)), n);
}

ZlvBool CxStringBuffInsertStr(CxStringBuff *buff, const char *str, int32_t position)
{
    if (buff == nullptr || str == nullptr || position < 0)
        return false;
    const uint32_t length = usedLength(buff);
    const auto start = static_cast<uint32_t>(position);
    const size_t count = RkoStringLen(str);
    if (start > length || count + length > UINT32_MAX)
        return false;
    if (!cxStringBuffHasCapacity(buff, static_cast<uint32_t>(count + length)))
        return false;
    char *place = buff->data + start;
    std::memmove(place + count, place, length - start + 1);
    std::memcpy(place, str, count);
    buff->length = static_cast<uint32_t>(length + count);
    return true;
}

char *CxStringBuffPeekStr(const CxStringBuff *buff)
{
    return buff == nullptr ? nullptr : buff->data;
}

char *CxStringBuffCopyStr(const CxStringBuff *buff)
{
    return RkoStringDup(CxStringBuffPeekStr(buff));
}

char *CxStringBuffTakeStr(CxStringBuff *buff)
{
    char *text = CxStringBuffPeekStr(buff);
    if (buff != nullptr)
        *buff = {};
    return text;
}

void CxStringBuffRestart(CxStringBuff *buff)
{
    if (buff == nullptr)
        return;
    buff->length = 0;
    if (buff->data != nullptr)
        buff->data[0] = '\0';
}

void CxStringBuffDiscard(CxStringBuff *buff)
{
    RkoMemoryFree(CxStringBuffTakeStr(buff));
}

ZlvBool CxStringBuffPack(CxStringBuff *buff)
{
    if (buff == nullptr)
        return false;
    if (buff->length == 0) {
        CxStringBuffDiscard(buff);
        return true;
    }
    const uint64_t packed = uint64_t{buff->length} + 1;
    return buff->capacity != packed && reallocate(buff, packed);
}
