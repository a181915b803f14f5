// SPDX-License-Identifier: Apache-2.0
// Feeds events to the three formatters: any properties, texts, identifiers, levels, bundles,
// arguments and settings. Each record is compared with the same record put together by a model.
#include <unicode/ucal.h>
#include <unicode/uloc.h>
#include <unicode/umsg.h>
#include <unicode/unistr.h>

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
#include "support/RecordStory.h"
#include "util/CxOwned.h"

using namespace zelvo_fuzz;
using zelvo::ArgKind;
using zelvo::ArgKinds;
using zelvo::OwnedUStr;

namespace {

/// Changes the defaults of ICU where the story has others than the one before.
void configureIcu(const Story &story)
{
    static const char *locale;
    static const UChar *zone;
    UErrorCode status = U_ZERO_ERROR;
    if (std::exchange(locale, story.defaultLocale()) != story.defaultLocale())
        uloc_setDefault(locale, &status);
    if (std::exchange(zone, story.zone().name) != story.zone().name)
        ucal_setDefaultTimeZone(zone, &status);
    check(U_SUCCESS(status), "ICU takes the defaults");
}

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
        configureIcu(story);
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
                         bundled ? bundleKey().c_str() : nullptr, story.pattern.c_str(), nullptr);
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
               ? plainDate(story.time, story.zone().minutes)
               : taken(ZlvBasicUFormatterFormatDate(formatter, static_cast<double>(story.time)));
}

/* What is compared. */

void print(const char *title, const WideText &text)
{
    std::string bytes;
    icu::UnicodeString(text.c_str()).toUTF8String(bytes);
    std::fprintf(stderr, "%s: %s\n", title, bytes.c_str());
}

void checkRecord(UChar *record, const WideText &expected, const char *claim)
{
    const WideText found = taken(record);
    if (found == expected)
        return;
    print("found", found);
    print("expected", expected);
    refute(claim);
}

void checkXml(const World &world, const Story &story, ZlvEvent *event, const EventStory &told,
              va_list list)
{
    const WideText date = dateOf(world.xml, story);
    XmlSettings settings = story.settings();
    ZlvPDXMLFormatterFGetHeader(world.xml);
    checkRecord(ZlvPDXMLUFormatterFFormat(world.xml, event, list), xmlRecord(told, date, settings),
                "the first XML record of a file has the single items before it");
    settings.isFirst = false;
    checkRecord(ZlvPDXMLUFormatterFFormat(world.xml, event, list), xmlRecord(told, date, settings),
                "further XML records do not have them");
}

void checkLayouts(const World &world, const Story &story, ZlvEvent *event,
                  const std::vector<uint64_t> &slots, va_list list)
{
    // The trace formatter takes no settings; before the others it finds the event without locale.
    const EventStory plain = eventStory(story, slots, nullptr, list);
    checkRecord(ZlvVyxTraceUFormatterFFormat(world.trace, event, list),
                traceRecord(plain, plainDate(story.time, story.zone().minutes)),
                "a trace line has its fields");
    const EventStory local = eventStory(story, slots, story.locale(), list);
    const std::string separator = story.hasSeparator() ? story.separator : " ";
    checkRecord(ZlvBasicUFormatterFFormat(world.line, event, list),
                lineRecord(local, dateOf(world.line, story), separator), "a line has its fields");
    checkXml(world, story, event, local, list);
}

} // namespace

int LLVMFuzzerTestOneInput(const uint8_t *data, size_t size)
{
    static const World world;
    const Story story(Input(data, size));
    setBundlePattern(story.pattern);
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
