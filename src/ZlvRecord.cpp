// SPDX-License-Identifier: Apache-2.0
#include "ZlvRecord.h"

#include "CxKvtID.h"
#include "CxString.h"
#include "CxUString.h"
#include "util/CxOwned.h"

namespace zelvo {

ZlvBool appendSigned(CxUStringBuff *out, int64_t value)
{
    const auto bits = static_cast<uint64_t>(value);
    if (value >= 0)
        return CxUStringBuffAppendUInt64(out, bits);
    CxUStringBuffAppendUStr(out, u"-");
    return CxUStringBuffAppendUInt64(out, 0 - bits);
}

bool appendProperty(CxUStringBuff *out, const ZlvEvent *event, const char *property,
                    const UChar *before, const UChar *after)
{
    const OwnedStr value{ZlvGetEventProp(event, property, nullptr)};
    if (!value)
        return false;
    CxUStringBuffAppendUStr(out, before);
    CxUStringBuffAppendStr(out, value.get());
    CxUStringBuffAppendUStr(out, after);
    return true;
}

bool appendNumber(CxUStringBuff *out, const ZlvEvent *event, const char *property,
                  ZlvBool (*append)(CxUStringBuff *, int64_t), const UChar *before,
                  const UChar *after)
{
    ZlvBool found = 0;
    const int32_t value = ZlvGetEventPropInt(event, property, &found);
    if (found == 0)
        return false;
    CxUStringBuffAppendUStr(out, before);
    append(out, value);
    CxUStringBuffAppendUStr(out, after);
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
