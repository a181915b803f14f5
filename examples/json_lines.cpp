// SPDX-License-Identifier: Apache-2.0
// A formatter class of one's own that writes an event as one line of JSON, and a logger class that
// stamps the logger's name on it, which events do not carry by themselves. json_lines.properties
// describes the objects.
//
// Run it as build/release/examples/json_lines and look at the file that it leaves in the working
// directory: python3 -m json.tool --json-lines json_lines.log
#include <algorithm>
#include <clocale>
#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <ctime>
#include <iterator>
#include <string>
#include <unicode/utf16.h>

#include "zelvo.hpp"

namespace {

/// Lines are all ASCII, and so are JSON in whichever code page a handler writes them: each other
/// unit of UTF-16, control characters among them, becomes \uXXXX.
std::string escaped(char16_t unit)
{
    if (unit == '"' || unit == '\\')
        return {'\\', static_cast<char>(unit)};
    if (unit >= ' ' && unit <= '~')
        return {static_cast<char>(unit)};
    char text[8];
    std::snprintf(text, sizeof text, "\\u%04x", static_cast<unsigned>(unit));
    return text;
}

/// A string of JSON, or null. A surrogate without its other half is no character and becomes
/// U+FFFD: readers do not agree on what else to make of it.
std::string quoted(const zelvo::UString &text)
{
    if (!text)
        return "null";
    std::string json = "\"";
    for (const char16_t *unit = text.get(); *unit != 0; ++unit) {
        const bool isPair = U16_IS_LEAD(unit[0]) && U16_IS_TRAIL(unit[1]);
        if (isPair)
            json += escaped(*unit++);
        json += escaped(isPair || !U16_IS_SURROGATE(*unit) ? *unit : u'\uFFFD');
    }
    return json + '"';
}

/// The same for bytes in the code page of the process, such as names.
std::string quoted(const char *bytes)
{
    return quoted(zelvo::utf16(bytes));
}

/// RFC 3339, always in UTC.
std::string utc(double milliseconds)
{
    const auto seconds = static_cast<std::time_t>(milliseconds / 1000);
    const int rest = static_cast<int>(milliseconds - static_cast<double>(seconds) * 1000);
    std::tm parts{};
    char time[32];
    const auto length = std::strftime(time, 24, "%Y-%m-%dT%H:%M:%S", gmtime_r(&seconds, &parts));
    std::snprintf(time + length, sizeof time - length, ".%03dZ", rest);
    return time;
}

/// A level may be any number; it has the name of the highest named level that it reaches.
const char *levelName(ZlvLevel level)
{
    static const char *const names[] = {"DEBUG_MAX", "DEBUG_MID", "DEBUG_MIN", "INFO",
                                        "WARN",      "ERROR",     "FATAL"};
    const int32_t thousands = level / 1000;
    return thousands < 1 ? nullptr : names[(thousands > 7 ? 7 : thousands) - 1];
}

/// The number with which the logger stamps a thread has 32 bits and no sign.
std::string number(const char *decimal)
{
    return std::to_string(static_cast<uint32_t>(std::strtoll(decimal, nullptr, 10)));
}

/// Appends a member to an object of JSON that is still open.
void add(std::string &json, const char *name, const std::string &value)
{
    if (json.back() != '{')
        json += ',';
    json += quoted(name) + ':' + value;
}

/// Event properties that have a field of their own.
const struct {
    const char *property;
    const char *field;
    std::string (*json)(const char *value);
} FIELDS[] = {
    {"logger", "logger", quoted},         {"processId", "process", number},
    {"threadId", "thread", number},       {"zlv_prop_srcfile", "file", quoted},
    {"zlv_prop_srcline", "line", number}, {"zlv_prop_srcfunction", "function", quoted},
};

/// Each property becomes its field, or else a member of the object of all others.
void addProperties(std::string &json, const StringToStringMap *properties)
{
    std::string others = "{";
    const auto *node = properties != nullptr ? properties->first : nullptr;
    for (; node != nullptr; node = node->next) {
        if (node->key == nullptr || node->value == nullptr) // removed, or memory ran out
            continue;
        const auto *known = std::find_if(std::begin(FIELDS), std::end(FIELDS), [=](auto &field) {
            return std::strcmp(field.property, node->key) == 0;
        });
        if (known != std::end(FIELDS))
            add(json, known->field, known->json(node->value));
        else
            add(others, node->key, quoted(node->value));
    }
    add(json, "properties", others + '}');
}

/// What a message from a bundle is known by, whichever language it was written in.
void addMessageKey(std::string &json, zelvo::Event event)
{
    const ZlvI18Msg *message = event.message();
    if (!event.isMessage() || message == nullptr)
        return;
    add(json, "id", quoted(event.messageId().get()));
    add(json, "bundle", quoted(message->bundle));
    add(json, "key", quoted(message->key));
}

/// The formatter. Of the keys that the basic formatter knows it has "locale".
class Json {
public:
    zelvo::UString format(zelvo::Self self, zelvo::Event event) noexcept
    {
        const zelvo::String locale = self.property("locale");
        if (locale)
            event.setLocale(locale.get());
        std::string json = "{";
        add(json, "time", '"' + utc(event.time()) + '"');
        add(json, "level", quoted(levelName(event.level())));
        add(json, "message", quoted(event.text()));
        addMessageKey(json, event);
        addProperties(json, event.get()->properties);
        json += "}\n";
        return zelvo::UString::copyOf(std::u16string(json.begin(), json.end()));
    }
};

/// The log function of the logger class, which otherwise is that of problem-determination loggers:
/// those stamp process and thread.
void stampName(ZlvObject *logger, ZlvEvent *event, va_list args)
{
    ZlvSetEventProp(event, "logger", logger->name);
    ZlvPDLoggerFLog(logger, event, args);
}

void keepShop()
{
    const zelvo::Logger log("shop.log");
    log.warn(EXAMPLE_BUNDLE, "low_stock", u"Grüner \"Tee\"", 12, 2500.5);
    log.error(EXAMPLE_BUNDLE, "till_offline", u"C:\\tills\\7");
    log.info(EXAMPLE_BUNDLE, "no_such_key");
    log.debugMin(u"two\nlines,\ta tab, {0} and {1}", std::u16string{1, 0x1f, 0x7f, 0x85, 0x2028},
                 u"\U0001F600");
    log.text(u"halves of pairs: {0}", std::u16string{0xd83d, u'x', 0xde00, 0xde00, 0xd83d});
}

} // namespace

int main()
{
    std::setlocale(LC_ALL, "");
    const zelvo::Toolkit toolkit(EXAMPLE_PROPERTIES);
    if (!toolkit)
        return 1;
    zelvo::addFormatterClass<Json>("example_json");
    ZlvAddLoggerClass("example_named_logger", nullptr, ZlvPDLoggerFAllocVars, ZlvPDLoggerFFreeVars,
                      ZlvPDLoggerFCfgChange, stampName);
    keepShop();
    return 0;
}
