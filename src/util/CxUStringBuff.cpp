// SPDX-License-Identifier: Apache-2.0
// The growable UTF-16 buffer. Its length counts code units and its capacity bytes, so every sum of
// the growth is made in bytes.
#include "CxUStringBuff.h"

#include <unicode/ustring.h>

#include "CxAscii.h"
#include "CxDecimal.h"
#include "CxGrowth.h"
#include "CxMemory.h"
#include "CxNumberText.h"
#include "CxOwned.h"
#include "CxString.h"
#include "CxStringBuff.h"
#include "CxUString.h"

static constexpr uint32_t FIRST_CAPACITY = 1024;

ZlvBool cxUStringBuffHasCapacity(CxUStringBuff *buff, uint32_t extra)
{
    if (buff == nullptr)
        return false;
    const bool isFresh = buff->data == nullptr;
    const uint32_t present = isFresh ? 0 : buff->capacity;
    const uint64_t units = uint64_t{isFresh ? 0 : buff->length} + extra + 1;
    const uint64_t capacity = zelvo::capacityFor(present, FIRST_CAPACITY, units * sizeof(UChar));
    if (capacity == present)
        return true;
    void *data = capacity > UINT32_MAX ? nullptr : RkoMemoryRealloc(buff->data, capacity);
    if (data == nullptr)
        return false;
    buff->data = static_cast<UChar *>(data);
    buff->capacity = static_cast<uint32_t>(capacity);
    if (isFresh)
        CxUStringBuffRestart(buff);
    return true;
}

ZlvBool CxUStringBuffAppendUStr(CxUStringBuff *buff, const UChar *str)
{
    if (str == nullptr)
        return false;
    const int32_t count = u_strlen(str);
    if (!cxUStringBuffHasCapacity(buff, static_cast<uint32_t>(count)))
        return false;
    u_memcpy(buff->data + buff->length, str, count + 1);
    buff->length += static_cast<uint32_t>(count);
    return true;
}

/// Appends bytes that are all ASCII, without a copy in between.
static bool appendAscii(CxUStringBuff *buff, const char *str, size_t length)
{
    const auto count = static_cast<uint32_t>(length);
    if (count != length || !cxUStringBuffHasCapacity(buff, count))
        return false;
    zelvo::copyAscii(buff->data + buff->length, str, length + 1);
    buff->length += count;
    return true;
}

ZlvBool CxUStringBuffAppendStr(CxUStringBuff *buff, const char *str)
{
    if (buff == nullptr || str == nullptr)
        return false;
    const size_t length = RkoStringLen(str);
    if (zelvo::isCopiedPlainly(str, length))
        return appendAscii(buff, str, length);
    const zelvo::OwnedUStr converted{CxUStringDupStrToUChar(str)};
    return CxUStringBuffAppendUStr(buff, converted.get());
}

ZlvBool CxUStringBuffAppendStrN(CxUStringBuff *buff, const char *bytes, uint32_t n)
{
    CxStringBuff collected = {};
    if (!CxStringBuffAppendStrN(&collected, bytes, n))
        return false;
    const zelvo::OwnedStr str{CxStringBuffTakeStr(&collected)};
    return CxUStringBuffAppendStr(buff, str.get());
}

ZlvBool CxUStringBuffAppendChar(CxUStringBuff *buff, char c)
{
    if (buff == nullptr || c == '\0')
        return buff != nullptr;
    const char str[] = {c, '\0'};
    return CxUStringBuffAppendStr(buff, str);
}

ZlvBool CxUStringBuffAppendInt32(CxUStringBuff *buff, int32_t value)
{
    return CxUStringBuffAppendInt64(buff, value);
}

ZlvBool CxUStringBuffAppendInt64(CxUStringBuff *buff, int64_t value)
{
    return CxUStringBuffAppendUInt64(buff, static_cast<uint64_t>(value));
}

ZlvBool CxUStringBuffAppendUInt64(CxUStringBuff *buff, uint64_t value)
{
    // Not u_snprintf(): its "%llu" prints the upper half of the range as negative numbers.
    const zelvo::DecimalText decimal = zelvo::decimalText(value);
    return appendAscii(buff, decimal.text, RkoStringLen(decimal.text));
}

static bool appendNumber(CxUStringBuff *buff, zelvo::NumberForm form, double value)
{
    zelvo::NumberText number;
    return zelvo::writeNumber(form, value, number) && CxUStringBuffAppendUStr(buff, number.text);
}

ZlvBool CxUStringBuffAppendUDate(CxUStringBuff *buff, UDate value)
{
    return appendNumber(buff, zelvo::NumberForm::WHOLE, value);
}

ZlvBool CxUStringBuffAppendUDouble(CxUStringBuff *buff, double value)
{
    return appendNumber(buff, zelvo::NumberForm::FRACTION, value);
}

UChar *CxUStringBuffTakeUStr(CxUStringBuff *buff)
{
    if (buff == nullptr)
        return nullptr;
    UChar *text = buff->data;
    *buff = {};
    return text;
}

void CxUStringBuffRestart(CxUStringBuff *buff)
{
    if (buff == nullptr)
        return;
    buff->length = 0;
    if (buff->data != nullptr)
        buff->data[0] = 0;
}

void CxUStringBuffDiscard(CxUStringBuff *buff)
{
    RkoMemoryFree(CxUStringBuffTakeUStr(buff));
}
