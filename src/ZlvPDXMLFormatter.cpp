// SPDX-License-Identifier: Apache-2.0
// The formatter that renders an event as an XML element: its configuration, and the order of an
// element's pieces. ZlvPDXMLItems.cpp and ZlvPDXMLTranslation.cpp write the pieces.
#include "ZlvPDXMLFormatter.h"

#include "CxMemory.h"
#include "CxString.h"
#include "ZlvBasicFormatter.h"
#include "ZlvKeptDates.h"
#include "ZlvRecord.h"
#include "util/CxOwned.h"

using namespace zelvo;

namespace {

struct FlagProperty {
    const char *name;
    uint8_t PDXMLFormatterVars::*flag;
};

constexpr FlagProperty flagProperties[] = {
    {"singleComponent", &PDXMLFormatterVars::singleComponent},
    {"singleProduct", &PDXMLFormatterVars::singleProduct},
    {"singleProductId", &PDXMLFormatterVars::singleProductId},
    {"singleServer", &PDXMLFormatterVars::singleServer},
    {"forceAsMessage", &PDXMLFormatterVars::forceAsMessage},
    {"forceAsTrace", &PDXMLFormatterVars::forceAsTrace},
};

PDXMLFormatterVars *varsOf(const ZlvObject *formatter)
{
    return formatter != nullptr ? static_cast<PDXMLFormatterVars *>(formatter->vars) : nullptr;
}

/// One flag alone forces the kind of the record; else the event has its way.
bool isWrittenAsMessage(const PDXMLFormatterVars &vars, const ZlvEvent *event)
{
    const bool isForced = vars.forceAsMessage != vars.forceAsTrace;
    return (isForced ? vars.forceAsMessage : ZlvGetEventIsMessage(event)) != 0;
}

/// Writes the product items that stand before the first record of a file.
void addSingleItems(CxUStringBuff *out, const ZlvEvent *event, const PDXMLFormatterVars &vars)
{
    zlvPDXMLEmitUProductInfo(out, event, vars.singleServer, vars.singleProduct,
                             vars.singleComponent, vars.singleProductId);
}

/// Writes the product items that stand in every record.
void addItems(CxUStringBuff *out, const ZlvEvent *event, const PDXMLFormatterVars &vars)
{
    zlvPDXMLEmitUProductInfo(out, event, vars.singleServer == 0, vars.singleProduct == 0,
                             vars.singleComponent == 0, vars.singleProductId == 0);
}

void addLevel(CxUStringBuff *out, std::u16string_view before, ZlvLevel level,
              std::u16string_view after)
{
    if (level == ZLV_LEVEL_NONE)
        return;
    append(out, before);
    zlvPDXMLEmitULevel(out, level);
    append(out, after);
}

void openMessage(CxUStringBuff *out, const ZlvEvent *event, const UChar *text)
{
    const OwnedStr id{identifierOf(event, text)};
    append(out, u"<Message Id=\"");
    if (id && *id.get() != '\0')
        CxUStringBuffAppendStr(out, id.get());
    else
        append(out, u"None");
    addLevel(out, u"\" Severity=\"", ZlvGetEventLevel(event), u"");
    append(out, u"\">\n");
}

void openTrace(CxUStringBuff *out, const ZlvEvent *event)
{
    append(out, u"<Trace");
    addLevel(out, u" Level=\"", ZlvGetEventLevel(event), u"\"");
    append(out, u">\n");
}

void addTime(CxUStringBuff *out, ZlvObject *formatter, const ZlvEvent *event)
{
    const double time = ZlvGetEventTime(event);
    append(out, u" <Time Millis=\"");
    CxUStringBuffAppendUDate(out, time);
    append(out, u"\">");
    appendDate(out, formatter->formatter.dateTimeFormat, time);
    append(out, u"</Time>\n");
}

void addText(CxUStringBuff *out, const UChar *text)
{
    append(out, u" <LogText><![CDATA[");
    CxUStringBuffAppendUStr(out, text);
    append(out, u"]]></LogText>\n");
}

void addAttribute(CxUStringBuff *out, const StringToStringMapNode *property)
{
    append(out, u"<Key>");
    CxUStringBuffAppendStr(out, property->key);
    append(out, u"</Key><Value>");
    CxUStringBuffAppendStr(out, property->value);
    append(out, u"</Value>");
}

void addAttributes(CxUStringBuff *out, const ZlvEvent *event)
{
    bool any = false;
    const StringToStringMapNode *property = zlvIntlStringToStringMapIterator(event->properties);
    for (; property != nullptr; property = property->next) {
        if (zlvPDXMLCheckKey(property->key) == 0)
            continue;
        if (!any)
            append(out, u" <LogAttribs>");
        any = true;
        addAttribute(out, property);
    }
    if (any)
        append(out, u"</LogAttribs>\n");
}

void addTraceOrigin(CxUStringBuff *out, const ZlvEvent *event)
{
    if (zlvPDXMLEmitUSource(out, event) == 0)
        append(out, u" <Source FileName=\"None\" Method=\"None\"/>\n");
    appendNumber(out, event, "threadId", CxUStringBuffAppendInt64, u" <Thread>", u"</Thread>\n");
    appendNumber(out, event, "processId", appendSigned, u" <Process>", u"</Process>\n");
}

void addParties(CxUStringBuff *out, const ZlvEvent *event)
{
    appendProperty(out, event, "correlationId", u" <CorrelationId>", u"</CorrelationId>\n");
    appendProperty(out, event, "client", u" <Principal>", u"</Principal>\n");
}

} // namespace

void *ZlvPDXMLFormatterFAllocVars(void)
{
    auto *vars = static_cast<PDXMLFormatterVars *>(RkoMemoryCalloc(1, sizeof(PDXMLFormatterVars)));
    if (vars != nullptr)
        vars->emitSingleItems = 1;
    return vars;
}

void ZlvPDXMLFormatterFFreeVars(void *vars)
{
    RkoMemoryFree(vars);
}

void ZlvPDXMLFormatterFCfgChange(ZlvObject *formatter, const char *propertyName)
{
    for (const FlagProperty &property : flagProperties) {
        if (RkoStringCmp(propertyName, property.name) != 0)
            continue;
        if (PDXMLFormatterVars *vars = varsOf(formatter))
            vars->*property.flag = zlvIntlGetObjPropBool(formatter, propertyName, nullptr);
        return;
    }
    ZlvBasicFormatterFCfgChange(formatter, propertyName);
}

UChar *ZlvPDXMLUFormatterFFormat(ZlvObject *formatter, ZlvEvent *event, va_list args)
{
    PDXMLFormatterVars *state = varsOf(formatter);
    if (event == nullptr || state == nullptr)
        return nullptr;
    const PDXMLFormatterVars vars = *state;
    state->emitSingleItems = 0;

    Record record;
    CxUStringBuff *out = record.text();
    if (vars.emitSingleItems != 0)
        addSingleItems(out, event, vars);
    const OwnedUStr text{boundMessage(formatter, event, zlvIntlBindUI18Msg, args)};
    const bool isMessage = isWrittenAsMessage(vars, event);
    if (isMessage)
        openMessage(out, event, text.get());
    else
        openTrace(out, event);
    addTime(out, formatter, event);
    addItems(out, event, vars);
    addText(out, text.get());
    addAttributes(out, event);
    if (isMessage) {
        zlvPDXMLEmitUSource(out, event);
        zlvPDXMLEmitUTranslationInfo(out, event, args);
    } else {
        addTraceOrigin(out, event);
    }
    addParties(out, event);
    append(out, isMessage ? u"</Message>\n" : u"</Trace>\n");
    return record.take();
}

char *ZlvPDXMLFormatterFGetHeader(ZlvObject *formatter)
{
    if (PDXMLFormatterVars *vars = varsOf(formatter))
        vars->emitSingleItems = 1;
    return nullptr;
}

char *ZlvPDXMLFormatterFGetTrailer(ZlvObject * /*formatter*/)
{
    return nullptr;
}

void zlvPDXMLUFormatterCacheMessageID(ZlvObject * /*formatter*/, ZlvEvent *event, va_list args)
{
    if (event == nullptr || event->messageId != nullptr)
        return;
    const OwnedUStr text{ZlvBindEventUMsg(event, zlvIntlBindUI18Msg, args)};
    const OwnedStr id{identifierIn(text.get())};
    ZlvSetEventMessageId(event, id ? id.get() : "");
}
