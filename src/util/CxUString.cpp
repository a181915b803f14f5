// SPDX-License-Identifier: Apache-2.0
// Conversions between byte strings and UTF-16 strings.
#include "CxUString.h"

#include <unicode/ustdio.h>
#include <unicode/ustring.h>

#include "CxMemory.h"
#include "CxStatusIntl.h"
#include "CxString.h"
#include "ZlvParm.h"

static constexpr size_t BYTES_PER_UNIT = 4;

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
    UChar *copy = str == nullptr ? nullptr : allocUnits(RkoStringLen(str));
    return copy == nullptr ? nullptr : u_uastrcpy(copy, str);
}

char *CxUStringDupUCharToStr(const UChar *str)
{
    void *copy = str == nullptr ? nullptr : RkoMemoryMalloc(BYTES_PER_UNIT * (lengthOf(str) + 1));
    return copy == nullptr ? nullptr : u_austrcpy(static_cast<char *>(copy), str);
}

UChar *CxUStringDup(const UChar *str)
{
    UChar *copy = str == nullptr ? nullptr : allocUnits(lengthOf(str));
    return copy == nullptr ? nullptr : u_strcpy(copy, str);
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
    case ZLV_PARM_INT:
    case ZLV_PARM_LONG:
        u_snprintf(text, NUMBER_LIMIT, "%d", parm.value.intValue);
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
