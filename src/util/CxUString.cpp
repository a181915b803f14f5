// SPDX-License-Identifier: Apache-2.0
// Conversions between byte strings and UTF-16 strings.
#include "CxUString.h"

#include <cstring>

#include <unicode/ustdio.h>
#include <unicode/ustring.h>

#include "CxAscii.h"
#include "CxDecimal.h"
#include "CxMemory.h"
#include "CxStatusIntl.h"
#include "CxString.h"
#include "ZlvParm.h"

static constexpr size_t MOST_BYTES_PER_UNIT = 4;

static size_t lengthOf(const UChar *str)
{
    return static_cast<size_t>(u_strlen(str));
}

static UChar *allocUnits(size_t length)
{
    return static_cast<UChar *>(RkoMemoryMalloc((length + 1) * sizeof(UChar)));
}

UChar *CxUStringDupStrToUChar(const char *str)
{
    const size_t length = RkoStringLen(str);
    UChar *copy = str == nullptr ? nullptr : allocUnits(length);
    if (copy == nullptr)
        return nullptr;
    if (!zelvo::isCopiedPlainly(str, length))
        return u_uastrcpy(copy, str);
    zelvo::copyAscii(copy, str, length + 1);
    return copy;
}

char *CxUStringDupUCharToStr(const UChar *str)
{
    if (str == nullptr)
        return nullptr;
    const size_t length = lengthOf(str);
    const bool isPlain = zelvo::isCopiedPlainly(str, length);
    const size_t bytesPerUnit = isPlain ? 1 : MOST_BYTES_PER_UNIT;
    auto *copy = static_cast<char *>(RkoMemoryMalloc(bytesPerUnit * (length + 1)));
    if (copy == nullptr || !isPlain)
        return copy == nullptr ? nullptr : u_austrcpy(copy, str);
    zelvo::copyAscii(copy, str, length + 1);
    return copy;
}

UChar *CxUStringDup(const UChar *str)
{
    const size_t length = str == nullptr ? 0 : lengthOf(str);
    UChar *copy = str == nullptr ? nullptr : allocUnits(length);
    if (copy != nullptr)
        std::memcpy(copy, str, (length + 1) * sizeof(UChar));
    return copy;
}

namespace {

/// A string is cut at 255 units; the longest number, a double with its 309 digits before the point,
/// must not be.
constexpr int32_t STRING_LIMIT = 255;
constexpr int32_t NUMBER_LIMIT = 383;

/// Text that is terminated even when the formatter fills it up to its limit and stops there.
using ParmText = UChar[NUMBER_LIMIT + 1];

} // namespace

static void formatParm(ParmText &text, const ZlvParm &parm)
{
    switch (parm.type) {
    case ZLV_PARM_BYTE:
    case ZLV_PARM_CHAR:
        u_snprintf(text, NUMBER_LIMIT, "%c", parm.value.byteValue);
        break;
    case ZLV_PARM_FLOAT:
        u_snprintf(text, NUMBER_LIMIT, "%f", static_cast<double>(parm.value.floatValue));
        break;
    case ZLV_PARM_DOUBLE:
        u_snprintf(text, NUMBER_LIMIT, "%f", parm.value.doubleValue);
        break;
    case ZLV_PARM_STRING:
        u_snprintf(text, STRING_LIMIT, "%s", parm.value.stringValue);
        break;
    default:
        break;
    }
}

char *CxUStringParmToStr(const ZlvParm *parm)
{
    if (parm == nullptr)
        return nullptr;
    if (parm->type == ZLV_PARM_INT || parm->type == ZLV_PARM_LONG)
        return RkoStringDup(zelvo::decimalText(parm->value.intValue).text);
    ParmText text = {};
    formatParm(text, *parm);
    return CxUStringDupUCharToStr(text);
}

CxStatus CxUStringToStdout(const UChar *str)
{
    UFILE *out = str == nullptr ? nullptr : u_finit(stdout, nullptr, nullptr);
    if (out != nullptr) {
        u_file_write(str, u_strlen(str), out);
        u_fputc('\n', out);
        // Flushes and frees the wrapper alone: it did not open the stream and leaves it open.
        u_fclose(out);
    }
    return zelvo::success;
}
