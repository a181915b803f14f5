// SPDX-License-Identifier: Apache-2.0
// The piece of an XML record that lets a reader translate the message: where its pattern comes
// from, and the arguments to put into it.
#include "ZlvBundlePattern.h"
#include "ZlvPDXMLFormatter.h"
#include "ZlvPatternScan.h"
#include "ZlvRecord.h"
#include "util/CxOwned.h"

using namespace zelvo;

namespace {

/// Takes the next argument from the list; a null text shows as nothing.
void addArgument(CxUStringBuff *out, ArgKind kind, ArgList &args)
{
    if (kind == ArgKind::TEXT)
        CxUStringBuffAppendUStr(out, va_arg(args.list, const UChar *));
    else if (kind == ArgKind::INTEGER)
        appendSigned(out, va_arg(args.list, int32_t));
    else
        CxUStringBuffAppendUDouble(out, va_arg(args.list, double));
}

/// Stands in for an argument when there is no list: zeros, as for binding the message.
void addZero(CxUStringBuff *out, ArgKind kind)
{
    if (kind != ArgKind::TEXT)
        append(out, u"0");
}

/// Shows the arguments, up to the first that is absent; ADD appends the value of one.
template <class Add>
void addEach(CxUStringBuff *out, const ArgKinds &kinds, Add add)
{
    for (const ArgKind kind : kinds.of) {
        if (kind == ArgKind::ABSENT)
            return;
        append(out, u"<Param><![CDATA[");
        add(kind);
        append(out, u"]]></Param>");
    }
}

/// Shows the arguments of the message's pattern, if that can be had.
void addArguments(CxUStringBuff *out, const ZlvI18Msg *message, va_list args)
{
    UErrorCode status = U_ZERO_ERROR;
    const BundlePattern pattern{message, &status};
    if (U_FAILURE(status))
        return;
    const ArgKinds kinds = fetchableKinds(pattern.get());
    if (isAbsent(args))
        return addEach(out, kinds, [&](ArgKind kind) { addZero(out, kind); });
    ArgList own{args};
    addEach(out, kinds, [&](ArgKind kind) { addArgument(out, kind, own); });
}

} // namespace

void zlvPDXMLEmitUTranslationInfo(CxUStringBuff *buff, const ZlvEvent *event, va_list args)
{
    const ZlvI18Msg *message = event != nullptr ? event->message : nullptr;
    if (message == nullptr || message->bundle == nullptr || message->key == nullptr)
        return;
    // "Resource Bundle", with its blank, is the attribute's name to all readers of these records.
    append(buff, u" <TranslationInfo Resource Bundle=\"");
    CxUStringBuffAppendStr(buff, message->bundle);
    append(buff, u"\" MsgKey=\"");
    CxUStringBuffAppendStr(buff, message->key);
    append(buff, u"\">");
    addArguments(buff, message, args);
    append(buff, u"</TranslationInfo>\n");
}
