// SPDX-License-Identifier: Apache-2.0
// Feeds events to the three formatters: any properties, texts, identifiers, levels, bundles,
// arguments and settings. Each record is compared with the same record put together by a model.
//
// An input is, in this order: bytes that choose (see Story), a level, a time, and texts that end
// with a zero: pattern, identifier, separator, then names and values of properties in turn.
#include <unicode/umsg.h>

#include "CxUStringBuff.h"
#include "ZlvBasicFormatter.h"
#include "ZlvEvent.h"
#include "ZlvIntl.h"
#include "ZlvOwned.h"
#include "ZlvPDXMLFormatter.h"
#include "ZlvToolkit.h"
#include "ZlvVyxTraceFormatter.h"
#include "support/Arguments.h"
#include "support/Defaults.h"
#include "support/Fuzz.h"
#include "support/OneBundle.h"
#include "support/RecordModel.h"
#include "util/CxOwned.h"

using namespace zelvo_fuzz;
using zelvo::ArgKind;
using zelvo::ArgKinds;
using zelvo::OwnedUStr;

namespace {

constexpr int64_t BEHIND_9999 = 253402300800000;
constexpr size_t MOST_PROPERTIES = 8;

constexpr int32_t levels[] = {-9999, 0, 1000, 2000, 3000, 4000, 5000, 6000, 7000, 9999};
constexpr const char *dateFormats[] = {nullptr, "HH:mm", "'at' yyyy", ""};
constexpr const char *locales[] = {nullptr, "de", "en_US", "tr"};
constexpr const char *knownProperties[] = {
    "threadId",        "correlationId", "client",      "zlv_prop_srcfile",     "zlv_prop_srcline",
    "server",          "serverFormat",  "product",     "zlv_prop_srcfunction", "component",
    "productInstance", "processId",     "organization"};

/// An input, taken apart.
struct Story {
    explicit Story(Input input)
        : choices(static_cast<uint32_t>(input.number(3))), level(levelOf(input)),
          time(static_cast<int64_t>(input.number(6)) % BEHIND_9999),
          pattern(patternOf(input.text())), messageId(input.text()), separator(input.text())
    {
        while (!input.isAtEnd() && properties.size() < MOST_PROPERTIES)
            takeProperty(input);
    }

    bool chooses(int bit) const { return (choices >> bit & 1) != 0; }
    const char *dateFormat() const { return dateFormats[choices >> 16 & 3]; }
    const char *locale() const { return locales[choices >> 18 & 3]; }
    unsigned arguments() const { return choices >> 20; }

    bool isMessage() const { return chooses(0); }
    bool hasBundle() const { return chooses(1); }
    bool hasMessageId() const { return chooses(2); }
    bool hasSeparator() const { return chooses(3); }

    XmlSettings settings() const
    {
        return {.forceAsMessage = chooses(4),
                .forceAsTrace = chooses(5),
                .singleServer = chooses(6),
                .singleProduct = chooses(7),
                .singleComponent = chooses(8),
                .singleProductId = chooses(9),
                .isFirst = true};
    }

    uint32_t choices;
    int32_t level;
    int64_t time;
    std::u16string pattern;
    std::string messageId;
    std::string separator;
    std::vector<std::pair<std::string, std::string>> properties;

private:
    /// One of the usual levels, or any.
    static int32_t levelOf(Input &input)
    {
        const uint8_t choice = input.byte();
        return choice < std::size(levels) ? levels[choice] : static_cast<int32_t>(input.number(4));
    }

    /// A name that is one byte chooses one of those that mean something.
    void takeProperty(Input &input)
    {
        std::string name = input.text();
        if (name.size() == 1)
            name = knownProperties[static_cast<uint8_t>(name[0]) % std::size(knownProperties)];
        const std::string value = input.text();
        for (auto &[known, former] : properties)
            if (known == name) {
                former = value;
                return;
            }
        properties.emplace_back(name, value);
    }
};

/// The formatters.
class World {
public:
    World()
    {
        setDefaults();
        check(ZlvOpenToolkit(nullptr, nullptr) == 1, "the toolkit opens");
        line = ZlvGetObject("line", "zlv_basicformatter");
        xml = ZlvGetObject("xml", "zlv_xmlformatter");
        trace = ZlvGetObject("trace", "zlv_vyxtraceformatter");
    }

    void configure(const Story &story) const
    {
        const XmlSettings settings = story.settings();
        for (ZlvObject *formatter : {line, xml}) {
            ZlvSetObjProp(formatter, "locale", story.locale());
            ZlvSetObjProp(formatter, "dateTimeFormat", story.dateFormat());
        }
        ZlvSetObjProp(line, "separator", story.hasSeparator() ? story.separator.c_str() : nullptr);
        ZlvSetObjPropBool(xml, "forceAsMessage", settings.forceAsMessage);
        ZlvSetObjPropBool(xml, "forceAsTrace", settings.forceAsTrace);
        ZlvSetObjPropBool(xml, "singleServer", settings.singleServer);
        ZlvSetObjPropBool(xml, "singleProduct", settings.singleProduct);
        ZlvSetObjPropBool(xml, "singleComponent", settings.singleComponent);
        ZlvSetObjPropBool(xml, "singleProductId", settings.singleProductId);
    }

    ZlvObject *line;
    ZlvObject *xml;
    ZlvObject *trace;
};

ZlvEvent *newEvent(const Story &story)
{
    const bool bundled = story.hasBundle();
    ZlvEvent *event =
        ZlvVaAllocUEvent(story.level, bundled ? BUNDLE.data() : nullptr,
                         bundled ? KEY.data() : nullptr, story.pattern.c_str(), nullptr);
    event->time = static_cast<double>(story.time);
    ZlvSetEventIsMessage(event, story.isMessage());
    if (story.hasMessageId())
        ZlvSetEventMessageId(event, story.messageId.c_str());
    for (const auto &[name, value] : story.properties)
        ZlvSetEventProp(event, name.c_str(), value.c_str());
    return event;
}

/* What the model is told. */

WideText boundText(const Story &story, const char *locale, va_list list)
{
    constexpr int32_t CAPACITY = 64 * 1024;
    static UChar area[CAPACITY];
    UErrorCode status = U_ZERO_ERROR;
    va_list own;
    va_copy(own, list);
    const int32_t length =
        u_vformatMessage(locale, story.pattern.c_str(), static_cast<int32_t>(story.pattern.size()),
                         area, CAPACITY, own, &status);
    va_end(own);
    check(status != U_BUFFER_OVERFLOW_ERROR, "the area is large enough");
    return U_SUCCESS(status) ? WideText(area, static_cast<size_t>(length)).c_str() : WideText();
}

WideText valueOf(ArgKind kind, uint64_t slot)
{
    if (kind == ArgKind::TEXT)
        return textIn(slot) != nullptr ? textIn(slot) : u"";
    if (kind == ArgKind::INTEGER)
        return wide(std::to_string(static_cast<int32_t>(slot)));
    CxUStringBuff number{};
    CxUStringBuffAppendUDouble(&number, doubleIn(slot));
    const OwnedUStr text{CxUStringBuffTakeUStr(&number)};
    return text ? text.get() : u"";
}

WideText parametersOf(const Story &story, const std::vector<uint64_t> &slots)
{
    const ArgKinds kinds = zelvo::fetchableKinds(story.pattern.c_str());
    WideText parameters;
    for (size_t i = 0; i < ArgKinds::COUNT && kinds.of[i] != ArgKind::ABSENT; ++i)
        parameters += u"<Param><![CDATA[" + valueOf(kinds.of[i], slots.at(i)) + u"]]></Param>";
    return parameters;
}

EventStory eventStory(const Story &story, const std::vector<uint64_t> &slots, const char *locale,
                      va_list list)
{
    EventStory event{.isMessage = story.isMessage(),
                     .level = story.level,
                     .time = story.time,
                     .messageId = {},
                     .properties = story.properties,
                     .text = boundText(story, locale, list),
                     .parameters = {}};
    if (story.hasMessageId())
        event.messageId = story.messageId;
    if (story.hasBundle())
        event.parameters = parametersOf(story, slots);
    return event;
}

WideText taken(UChar *text)
{
    const OwnedUStr owned{text};
    check(bool(owned), "an event has a record in each layout");
    return owned.get();
}

WideText dateOf(ZlvObject *formatter, const Story &story)
{
    const bool isPlain = formatter->formatter.dateTimeFormat == nullptr;
    return isPlain
               ? plainDate(story.time)
               : taken(ZlvBasicUFormatterFormatDate(formatter, static_cast<double>(story.time)));
}

/* What is compared. */

void checkXml(const World &world, const Story &story, ZlvEvent *event, const EventStory &told,
              va_list list)
{
    const WideText date = dateOf(world.xml, story);
    XmlSettings settings = story.settings();
    ZlvPDXMLFormatterFGetHeader(world.xml);
    check(taken(ZlvPDXMLUFormatterFFormat(world.xml, event, list)) ==
              xmlRecord(told, date, settings),
          "the first XML record of a file has the single items before it");
    settings.isFirst = false;
    check(taken(ZlvPDXMLUFormatterFFormat(world.xml, event, list)) ==
              xmlRecord(told, date, settings),
          "further XML records do not have them");
}

void checkLayouts(const World &world, const Story &story, ZlvEvent *event,
                  const std::vector<uint64_t> &slots, va_list list)
{
    // The trace formatter takes no settings; before the others it finds the event without locale.
    const EventStory plain = eventStory(story, slots, nullptr, list);
    check(taken(ZlvVyxTraceUFormatterFFormat(world.trace, event, list)) ==
              traceRecord(plain, plainDate(story.time)),
          "a trace line has its fields");
    const EventStory local = eventStory(story, slots, story.locale(), list);
    check(taken(ZlvBasicUFormatterFFormat(world.line, event, list)) ==
              lineRecord(local, dateOf(world.line, story),
                         story.hasSeparator() ? story.separator : " "),
          "a line has its fields");
    checkXml(world, story, event, local, list);
}

} // namespace

int LLVMFuzzerTestOneInput(const uint8_t *data, size_t size)
{
    static const World world;
    const Story story(Input(data, size));
    bundlePattern = story.pattern.c_str();
    const std::vector<uint64_t> slots = slotsOf(kindsToPass(story.pattern), story.arguments());
    if (slots.size() > MOST_ARGUMENTS)
        return 0;
    world.configure(story);
    ZlvEvent *event = newEvent(story);
    {
        const zelvo::ApiLock lock;
        withList(slots, [&](va_list list) { checkLayouts(world, story, event, slots, list); });
    }
    ZlvFreeEvent(event);
    return 0;
}
