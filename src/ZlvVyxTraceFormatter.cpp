// SPDX-License-Identifier: Apache-2.0
// The formatter that renders an event as one line of fixed fields.
#include "ZlvVyxTraceFormatter.h"

#include "CxString.h"
#include "ZlvKeptDates.h"
#include "ZlvLevelWords.h"
#include "ZlvRecord.h"
#include "util/CxOwned.h"

using namespace zelvo;

namespace {

void endField(CxUStringBuff *out)
{
    append(out, u" - ");
}

void addDate(CxUStringBuff *out, const ZlvObject *formatter, const ZlvEvent *event)
{
    append(out, u"[");
    appendDate(out, formatter->formatter.dateTimeFormat, ZlvGetEventTime(event));
    append(out, u"]");
}

/// Of a qualified host name only the first label is shown.
void addServer(CxUStringBuff *out, const ZlvEvent *event)
{
    const OwnedStr server{ZlvGetEventProp(event, "server", nullptr)};
    if (!server)
        return;
    if (char *dot = RkoStringChr(server.get(), '.'))
        *dot = '\0';
    CxUStringBuffAppendStr(out, server.get());
}

void addProcessAndThread(CxUStringBuff *out, const ZlvEvent *event)
{
    const bool hasProcess = appendNumber(out, event, "processId", CxUStringBuffAppendInt64, u"p");
    appendNumber(out, event, "threadId", CxUStringBuffAppendInt64, hasProcess ? u":t" : u"t");
}

void addSource(CxUStringBuff *out, const ZlvEvent *event)
{
    const bool hasFile = appendProperty(out, event, "zlv_prop_srcfile");
    appendProperty(out, event, "zlv_prop_srcfunction", hasFile ? u":" : u"");
    appendNumber(out, event, "zlv_prop_srcline", appendSigned, u"(", u")");
}

void addIdentifier(CxUStringBuff *out, const ZlvEvent *event, const UChar *text)
{
    const OwnedStr id{identifierOf(event, text)};
    CxUStringBuffAppendStr(out, id.get());
}

} // namespace

UChar *ZlvVyxTraceUFormatterFFormat(ZlvObject *formatter, ZlvEvent *event, va_list args)
{
    if (formatter == nullptr || event == nullptr)
        return nullptr;
    Record record;
    CxUStringBuff *out = record.text();
    append(out, u"\u001e");
    addDate(out, formatter, event);
    endField(out);
    CxUStringBuffAppendUStr(out, wordsOf(ZlvGetEventLevel(event)).field);
    endField(out);
    addServer(out, event);
    endField(out);
    addProcessAndThread(out, event);
    endField(out);
    addSource(out, event);
    endField(out);
    const OwnedUStr text{boundMessage(formatter, event, zlvIntlBindUI18Msg, args)};
    addIdentifier(out, event, text.get());
    endField(out);
    CxUStringBuffAppendUStr(out, text.get());
    append(out, u"\n");
    return record.take();
}
