// SPDX-License-Identifier: Apache-2.0
// Classes of one's own in C++: an alarm that prints the first few records and then only counts, a
// formatter that writes a level and a text, and a filter that damps repeats.
#include <clocale>
#include <cstdio>
#include <cstring>

#include "zelvo.hpp"

namespace {

/// A handler. Each object of its class has an Alarm of its own.
class Alarm {
public:
    bool configure(zelvo::Self self, const char *property) noexcept
    {
        if (std::strcmp(property, "limit") != 0)
            return false; // the others are those of every handler
        limit_ = self.property<int32_t>(property).value_or(3);
        return true;
    }

    void process(zelvo::Self self, zelvo::Event event) noexcept
    {
        if (count_++ < limit_)
            zlvI18PrintUCharAsLocal(stdout, self.format(event).get());
        self.passOn(event);
    }

    int32_t count() const { return count_; }

private:
    int32_t limit_ = 3;
    int32_t count_ = 0;
};

/// A formatter.
class Brief {
public:
    zelvo::UString format(zelvo::Self, zelvo::Event event) noexcept
    {
        std::u16string record = event.level() >= ZLV_LEVEL_WARN ? u"! " : u"  ";
        record += event.text().view();
        return zelvo::UString::copyOf(record);
    }
};

/// A filter: drops a text that is the same as the one before.
class Damper {
public:
    bool accepts(zelvo::Self, zelvo::Event event) noexcept
    {
        const zelvo::UString text = event.text();
        const bool isNew = text.view() != last_.view();
        last_ = zelvo::UString::copyOf(text.view());
        return isNew;
    }

private:
    zelvo::UString last_;
};

/// The objects that the classes are for: plant.log -> plant.damper -> plant.alarm.
void runPlant()
{
    const zelvo::Logger logger("plant.log", "zlv_basiclogger");
    const zelvo::Object damper("plant.damper", "example_damper");
    const zelvo::Handler alarm("plant.alarm", "example_alarm");
    alarm.setFormatter(zelvo::Object("plant.brief", "example_brief"));
    alarm.setProperty("limit", 2);
    logger.addListener(damper);
    damper.addListener(alarm);

    for (int32_t pump = 1; pump <= 4; ++pump)
        for (int32_t again = 0; again < 3; ++again)
            logger.text(u"pump {0,number,integer} is dry", pump);

    zelvo::withState<Alarm>(alarm,
                            [](const Alarm &state) { std::printf("%d alarms\n", state.count()); });
}

} // namespace

int main()
{
    std::setlocale(LC_ALL, "");
    const zelvo::Toolkit toolkit;
    if (!toolkit)
        return 1;
    zelvo::addHandlerClass<Alarm>("example_alarm");
    zelvo::addFormatterClass<Brief>("example_brief");
    zelvo::addFilterClass<Damper>("example_damper");
    runPlant();
    return 0;
}
