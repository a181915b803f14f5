// SPDX-License-Identifier: Apache-2.0
#include "support/RecordModel.h"

#include <algorithm>
#include <ctime>

#include <unicode/ustring.h>

#include "support/Fuzz.h"
#include "support/Identifiers.h"
#include "support/Numbers.h"
#include "support/OneBundle.h"

namespace zelvo_fuzz {
namespace {

constexpr int32_t NO_LEVEL = -9999;

struct LevelWord {
    int32_t level;
    const char *word;
    const char *field;
};

constexpr LevelWord levelWords[] = {
    {1000, "MAX", " MAX "},   {2000, "MID", " MID "},  {3000, "MIN", " MIN "},
    {4000, "INFO", "INFO "},  {5000, "WARN", "WARN "}, {6000, "ERROR", "ERROR"},
    {7000, "ERROR", "ERROR"},
};

LevelWord wordOf(int32_t level)
{
    for (const LevelWord &word : levelWords)
        if (word.level == level)
            return word;
    return {level, "OTHER", "OTHER"};
}

/// The pieces of one record.
class Layout {
public:
    explicit Layout(const EventStory &event) : event_(event) {}

    Layout &add(std::string_view bytes)
    {
        text_ += wide(bytes);
        return *this;
    }
    Layout &add(const WideText &text)
    {
        text_ += text;
        return *this;
    }

    const std::string *property(const std::string &key) const
    {
        for (const auto &[name, value] : event_.properties)
            if (name == key)
                return &value;
        return nullptr;
    }

    bool addProperty(std::string_view before, const std::string &key, std::string_view after)
    {
        const std::string *value = property(key);
        if (value != nullptr)
            add(before).add(*value).add(after);
        return value != nullptr;
    }

    bool addSigned(std::string_view before, const std::string &key, std::string_view after)
    {
        const LeadingNumber number = numberOf(key);
        if (number.isThere)
            add(before).add(std::to_string(number.low32())).add(after);
        return number.isThere;
    }

    /// Numbers below zero show as very large ones.
    bool addUnsigned(std::string_view before, const std::string &key, std::string_view after)
    {
        const LeadingNumber number = numberOf(key);
        const auto widened = static_cast<uint64_t>(int64_t{number.low32()});
        if (number.isThere)
            add(before).add(std::to_string(widened)).add(after);
        return number.isThere;
    }

    /// The event's own identifier, or the one that its text begins with.
    std::string identifier() const
    {
        if (event_.messageId)
            return *event_.messageId;
        const IdentifierForm *form = identifierFormOf(event_.text);
        const size_t length = form != nullptr ? form->letters + form->digits + 1 : 0;
        return {event_.text.begin(), event_.text.begin() + static_cast<std::ptrdiff_t>(length)};
    }

    WideText take() { return std::move(text_); }

private:
    LeadingNumber numberOf(const std::string &key) const
    {
        const std::string *value = property(key);
        return value != nullptr ? leadingNumber(*value) : LeadingNumber{};
    }

    const EventStory &event_;
    WideText text_;
};

void addItems(Layout &out, const XmlSettings &settings, bool single)
{
    if (settings.singleServer == single && out.property("server") != nullptr) {
        out.add(" <Server Format=\"");
        out.addProperty("", "serverFormat", "");
        out.addProperty("\">", "server", "</Server>\n");
    }
    if (settings.singleProduct == single)
        out.addProperty(" <ProductId>", "product", "</ProductId>\n");
    if (settings.singleComponent == single)
        out.addProperty(" <Component>", "component", "</Component>\n");
    if (settings.singleProductId == single)
        out.addProperty(" <ProductInstance>", "productInstance", "</ProductInstance>\n");
}

void openElement(Layout &out, const EventStory &event, bool isMessage)
{
    const std::string id = out.identifier();
    if (isMessage)
        out.add("<Message Id=\"").add(id.empty() ? "None" : id).add("\"");
    else
        out.add("<Trace");
    if (event.level != NO_LEVEL)
        out.add(isMessage ? " Severity=\"" : " Level=\"").add(wordOf(event.level).word).add("\"");
    out.add(">\n");
}

void addAttributes(Layout &out, const EventStory &event)
{
    static const std::vector<std::string> placed = {
        "threadId",         "correlationId",    "client",
        "zlv_prop_srcfile", "zlv_prop_srcline", "zlv_prop_srcfunction",
        "server",           "serverFormat",     "product",
        "component",        "productInstance",  "processId"};
    Layout inner(event);
    for (const auto &[key, value] : event.properties)
        if (std::find(placed.begin(), placed.end(), key) == placed.end())
            inner.add("<Key>").add(key).add("</Key><Value>").add(value).add("</Value>");
    const WideText attributes = inner.take();
    if (!attributes.empty())
        out.add(" <LogAttribs>").add(attributes).add("</LogAttribs>\n");
}

bool addSource(Layout &out)
{
    if (!out.addProperty(" <Source FileName=\"", "zlv_prop_srcfile", ""))
        return false;
    out.addProperty("\" Method=\"", "zlv_prop_srcfunction", "");
    out.addSigned("\" Line=\"", "zlv_prop_srcline", "");
    out.add("\"/>\n");
    return true;
}

void addMessageParts(Layout &out, const EventStory &event)
{
    addSource(out);
    if (event.parameters)
        out.add(" <TranslationInfo Resource Bundle=\"")
            .add(BUNDLE)
            .add("\" MsgKey=\"")
            .add(bundleKey())
            .add("\">")
            .add(*event.parameters)
            .add("</TranslationInfo>\n");
}

void addTraceParts(Layout &out)
{
    if (!addSource(out))
        out.add(" <Source FileName=\"None\" Method=\"None\"/>\n");
    out.addUnsigned(" <Thread>", "threadId", "</Thread>\n");
    out.addSigned(" <Process>", "processId", "</Process>\n");
}

} // namespace

WideText wide(std::string_view bytes)
{
    WideText text(bytes.size(), u'\0');
    int32_t length = 0;
    UErrorCode status = U_ZERO_ERROR;
    u_strFromUTF8WithSub(text.data(), static_cast<int32_t>(text.size()), &length, bytes.data(),
                         static_cast<int32_t>(bytes.size()), 0xFFFD, nullptr, &status);
    check(U_SUCCESS(status), "no text has more units than bytes");
    text.resize(static_cast<size_t>(length));
    return text;
}

WideText plainDate(int64_t time, int32_t minutesEast)
{
    const time_t seconds = time / 1000 + int64_t{minutesEast} * 60;
    tm parts{};
    gmtime_r(&seconds, &parts);
    char text[64];
    const size_t length = std::strftime(text, sizeof text, "%Y-%m-%d %H:%M:%S", &parts);
    // The hours of a zone decide on the sign that stands before them, the minutes keep theirs.
    const int32_t hours = minutesEast / 60;
    std::snprintf(text + length, sizeof text - length, ".%03d%c%02d:%02d",
                  static_cast<int>(time % 1000), hours < 0 ? '-' : '+', std::abs(hours),
                  minutesEast % 60);
    return wide(text);
}

WideText lineRecord(const EventStory &event, const WideText &date, const std::string &separator)
{
    Layout out(event);
    out.add(date).add(separator);
    out.addProperty("", "zlv_prop_srcfile", separator);
    out.addProperty("", "zlv_prop_srcfunction", separator);
    out.addSigned("", "zlv_prop_srcline", separator);
    for (const char *key : {"organization", "product", "component", "client", "server"})
        out.addProperty("", key, separator);
    return out.add(event.text).add("\n").take();
}

WideText xmlRecord(const EventStory &event, const WideText &date, const XmlSettings &settings)
{
    const bool isForced = settings.forceAsMessage != settings.forceAsTrace;
    const bool isMessage = isForced ? settings.forceAsMessage : event.isMessage;
    Layout out(event);
    if (settings.isFirst)
        addItems(out, settings, true);
    openElement(out, event, isMessage);
    const int wrong = faultIsSeeded() && event.level == 5000 ? 1 : 0;
    out.add(" <Time Millis=\"").add(std::to_string(event.time + wrong));
    out.add("\">").add(date).add("</Time>\n");
    addItems(out, settings, false);
    out.add(" <LogText><![CDATA[").add(event.text).add("]]></LogText>\n");
    addAttributes(out, event);
    if (isMessage)
        addMessageParts(out, event);
    else
        addTraceParts(out);
    out.addProperty(" <CorrelationId>", "correlationId", "</CorrelationId>\n");
    out.addProperty(" <Principal>", "client", "</Principal>\n");
    return out.add(isMessage ? "</Message>\n" : "</Trace>\n").take();
}

WideText traceRecord(const EventStory &event, const WideText &date)
{
    const std::string_view end = " - ";
    Layout out(event);
    out.add("\x1e[").add(date).add("]").add(end).add(wordOf(event.level).field).add(end);
    if (const std::string *server = out.property("server"))
        out.add(std::string_view(*server).substr(0, server->find('.')));
    out.add(end);
    const bool hasProcess = out.addUnsigned("p", "processId", "");
    out.addUnsigned(hasProcess ? ":t" : "t", "threadId", "");
    out.add(end);
    const bool hasFile = out.addProperty("", "zlv_prop_srcfile", "");
    out.addProperty(hasFile ? ":" : "", "zlv_prop_srcfunction", "");
    out.addSigned("(", "zlv_prop_srcline", ")");
    out.add(end).add(out.identifier()).add(end);
    return out.add(event.text).add("\n").take();
}

} // namespace zelvo_fuzz
