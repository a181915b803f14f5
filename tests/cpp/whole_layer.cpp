// SPDX-License-Identifier: Apache-2.0
// A program that uses all of the C++ layer, built with every standard, with and without exceptions
// and RTTI. It ends with the number of the first thing that went wrong.
#include <cstring>
#include <string>

#include "zelvo.hpp"

namespace {

struct Handling {
    bool configure(zelvo::Self self, const char *property) noexcept
    {
        if (std::strcmp(property, "limit") != 0)
            return false;
        limit = self.property<int32_t>(property).value_or(0);
        return true;
    }
    void process(zelvo::Self self, zelvo::Event event) noexcept
    {
        ++events;
        record = self.format(event);
        self.passOn(event);
    }
    void open(zelvo::Self) noexcept { isOpen = true; }
    void close(zelvo::Self) noexcept { isOpen = false; }

    bool isOpen = false;
    int32_t limit = 0;
    int32_t events = 0;
    zelvo::UString record;
};

struct Filtering {
    bool accepts(zelvo::Self, zelvo::Event event) noexcept
    {
        return event.level() >= ZLV_LEVEL_WARN || event.property<int32_t>("stamp") == 7;
    }
};

struct Stamping {
    void log(zelvo::Self self, zelvo::Event event) noexcept
    {
        event.setProperty("stamp", 7);
        self.passOn(event);
    }
};

struct Formatting {
    zelvo::UString format(zelvo::Self, zelvo::Event event) noexcept { return event.text(); }
    zelvo::String header(zelvo::Self) noexcept { return {}; }
    zelvo::String trailer(zelvo::Self) noexcept { return {}; }
};

int check(const zelvo::Toolkit &toolkit)
{
    if (!toolkit)
        return 1;
    zelvo::addHandlerClass<Handling>("handling");
    zelvo::addFilterClass<Filtering>("filtering");
    zelvo::addLoggerClass<Stamping>("stamping");
    zelvo::addFormatterClass<Formatting>("formatting");

    zelvo::Config("log").setProperty("className", "stamping");
    const zelvo::Logger logger("log");
    const zelvo::Object filter("filter", "filtering");
    const zelvo::Handler handler("handler", "handling");
    const zelvo::MemoryHandler memory("memory");
    handler.setFormatter(zelvo::Object("format", "formatting"));
    handler.setProperty("limit", 3);
    logger.addListener(filter);
    filter.addListener(handler);
    handler.addListener(memory);

    logger.debugMin(u"{0} {1,number,integer} {2,number} {3} {4}", u"text", 1, 0.5,
                    std::u16string(u"string"), [] { return std::u16string_view(u"view"); });
    logger.debugMax(u"refused {0}", u"text");
    logger.info("bundle", "key", zelvo::utf16("bytes"));

    const auto events = memory.events();
    if (events.size() != 2)
        return 2;
    if (events[0].text != u"text 1 0.5 string view")
        return 3;
    if (*events[0].property("zlv_prop_srcfunction") != "check" ||
        *events[0].property("stamp") != "7")
        return 4;
    if (events[1].bundle != "bundle" || events[1].key != "key")
        return 5;
    int32_t limit = 0;
    if (!zelvo::withState<Handling>(handler, [&limit](Handling &own) { limit = own.limit; }))
        return 6;
    return limit == 3 ? 0 : 7;
}

} // namespace

int main()
{
    const zelvo::Toolkit toolkit;
    return check(toolkit);
}
