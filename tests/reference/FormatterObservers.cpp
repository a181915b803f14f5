// SPDX-License-Identifier: Apache-2.0
// What the properties of formatters do.
#include <map>

#include "Observers.h"

namespace zelvo_test {
namespace {

/// The element that a property of the XML formatter moves, and the event property it shows.
struct Item {
    const char *property;
    const char *element;
};

const std::map<std::string, Item> ITEMS = {
    {"singleServer", {"server", "<Server "}},
    {"singleProduct", {"product", "<ProductId>"}},
    {"singleComponent", {"component", "<Component>"}},
    {"singleProductId", {"productInstance", "<ProductInstance>"}},
};

bool isXml(const Subject &subject)
{
    return subject.object()->objClass->fAllocVars == ZlvPDXMLFormatterFAllocVars;
}

bool begins(const std::string &text, const char *start)
{
    return text.rfind(start, 0) == 0;
}

bool holds(const std::string &text, const char *part)
{
    return text.find(part) != std::string::npos;
}

/// The date of a record, and what follows it up to the text "x" of its event.
std::string dateOf(const Subject &subject, const std::string &record)
{
    if (!isXml(subject))
        return record.substr(0, record.size() - std::string(" x\n").size());
    const size_t start = record.find("\">", record.find("<Time")) + 2;
    return record.substr(start, record.find("</Time>") - start);
}

} // namespace

std::string isWrittenOnce(Subject &subject, const char *key)
{
    const Item &item = ITEMS.at(key);
    const Event event(u"x");
    ZlvSetEventProp(event.get(), item.property, "value");
    zlvAPIMutexLock();
    subject.object()->objClass->formatter.fGetHeader(subject.object()); // as a handler that opens
    zlvAPIMutexUnlock();
    if (!holds(subject.render(event.get()), item.element))
        return "never written";
    return holds(subject.render(event.get()), item.element) ? "false" : "true";
}

std::string isForcedAsMessage(Subject &subject, const char * /*key*/)
{
    const Event event(u"x");
    ZlvSetEventIsMessage(event.get(), 0);
    return begins(subject.render(event.get()), "<Message") ? "true" : "false";
}

std::string isForcedAsTrace(Subject &subject, const char * /*key*/)
{
    const Event event(u"x");
    ZlvSetEventIsMessage(event.get(), 1);
    return holds(subject.render(event.get()), "<Trace") ? "true" : "false";
}

std::string separatorOfFields(Subject &subject, const char * /*key*/)
{
    const Event event(u"x");
    const std::string record = subject.render(event.get());
    const size_t date = std::string("2006-08-16 08:48:55.123+00:00").size();
    const std::string separator = record.substr(date, record.size() - date - 2);
    return separator == " " ? "one blank" : separator;
}

std::string separatorKept(Subject &subject, const char * /*key*/)
{
    const Event event(u"x");
    const char *kept = subject.object()->formatter.separator;
    if (kept != nullptr && holds(subject.render(event.get()), kept))
        return "written";
    return kept != nullptr ? kept : "none";
}

std::string dateWritten(Subject &subject, const char * /*key*/)
{
    const Event event(u"x");
    const std::string date = dateOf(subject, subject.render(event.get()));
    const bool isFirst = date == "2006-08-16 08:48:55.123+00:00";
    return isFirst ? "yyyy-MM-dd HH:mm:ss.SSS and offset" : date;
}

std::string localeOfNumbers(Subject &subject, const char * /*key*/)
{
    const Event event(u"{0,number}");
    const std::string record = subject.render(event.get(), 1.5);
    if (holds(record, "1,5"))
        return "de";
    return holds(record, "1.5") ? "that of the event" : record;
}

} // namespace zelvo_test
