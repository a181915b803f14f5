// SPDX-License-Identifier: Apache-2.0
#include "ZlvRecord.h"

#include <algorithm>

#include "CxKvtID.h"
#include "CxString.h"
#include "CxUString.h"
#include "ZlvPropsIntl.h"
#include "util/CxOwned.h"

namespace zelvo {

ZlvBool appendSigned(CxUStringBuff *out, int64_t value)
{
    const auto bits = static_cast<uint64_t>(value);
    if (value >= 0)
        return CxUStringBuffAppendUInt64(out, bits);
    append(out, u"-");
    return CxUStringBuffAppendUInt64(out, 0 - bits);
}

void append(CxUStringBuff *out, std::u16string_view text)
{
    const auto count = static_cast<uint32_t>(text.size());
    if (cxUStringBuffHasCapacity(out, count) == 0)
        return;
    std::copy(text.begin(), text.end(), out->data + out->length);
    out->length += count;
    out->data[out->length] = 0;
}

const char *propertyOf(const ZlvEvent *event, const char *property)
{
    const StringToStringMap *properties = event != nullptr ? event->properties : nullptr;
    const StringToStringMapNode *node = zlvIntlStringToStringMapGetNode(properties, property);
    return node != nullptr ? node->value : nullptr;
}

bool appendProperty(CxUStringBuff *out, const ZlvEvent *event, const char *property,
                    std::u16string_view before, std::u16string_view after)
{
    const char *value = propertyOf(event, property);
    if (value == nullptr)
        return false;
    append(out, before);
    CxUStringBuffAppendStr(out, value);
    append(out, after);
    return true;
}

bool appendNumber(CxUStringBuff *out, const ZlvEvent *event, const char *property,
                  ZlvBool (*appendDecimal)(CxUStringBuff *, int64_t), std::u16string_view before,
                  std::u16string_view after)
{
    ZlvBool found = 0;
    const int32_t value = zlvPropStrToInt32(propertyOf(event, property), &found);
    if (found == 0)
        return false;
    append(out, before);
    appendDecimal(out, value);
    append(out, after);
    return true;
}

UChar *boundMessage(const ZlvObject *formatter, ZlvEvent *event, ZlvFBindMsg bind, va_list args)
{
    if (formatter->formatter.locale != nullptr)
        zlvSetEventLocale(event, formatter->formatter.locale);
    return ZlvBindEventUMsg(event, bind, args);
}

char *identifierIn(const UChar *text)
{
    const OwnedStr bytes{CxUStringDupUCharToStr(text)};
    const CxKvtIDInfo info = CxParseKvtID(bytes.get());
    return info.length > 0 ? RkoStringDup(info.identifier) : nullptr;
}

char *identifierOf(const ZlvEvent *event, const UChar *text)
{
    char *own = ZlvGetEventMessageId(event);
    return own != nullptr ? own : identifierIn(text);
}

} // namespace zelvo
