// SPDX-License-Identifier: Apache-2.0
// What ICU does by itself when its memory runs out. This program knows nothing of the library: it
// makes the calls of ICU that the library makes, with each of ICU's allocations failing, and prints
// where ICU crashes and which blocks it loses: "crash" or "leak", the place, the call that shows
// it.
//
// Usage: zelvo_oom_icu_alone BUNDLE
#include <cstdio>
#include <fstream>
#include <map>

#include <unicode/ucal.h>
#include <unicode/udat.h>
#include <unicode/umsg.h>
#include <unicode/ures.h>
#include <unicode/ustdio.h>
#include <unicode/ustring.h>

#include "IcuTrial.h"

using namespace zelvo_test;

namespace {

constexpr int32_t ROOM = 256;
constexpr UDate TIME = 1709294400000.0;
constexpr const char *LOCALES[] = {nullptr, "en", "de_DE", "ja_JP"};

const char *bundleName = nullptr;

void formatDate(const UChar *pattern)
{
    UErrorCode status = U_ZERO_ERROR;
    UChar text[ROOM];
    UDateFormat *format =
        udat_open(UDAT_PATTERN, UDAT_PATTERN, nullptr, nullptr, -1, pattern, -1, &status);
    if (U_SUCCESS(status))
        udat_format(format, TIME, text, ROOM, nullptr, &status);
    udat_close(format);
}

void formatDates()
{
    formatDate(u"yyyy-MM-dd HH:mm:ss.SSS");
    formatDate(u"dd.MM.yyyy HH:mm");
}

void askCalendar()
{
    UErrorCode status = U_ZERO_ERROR;
    UCalendar *calendar = ucal_open(nullptr, -1, nullptr, UCAL_DEFAULT, &status);
    ucal_setMillis(calendar, TIME, &status);
    ucal_get(calendar, UCAL_ZONE_OFFSET, &status);
    ucal_get(calendar, UCAL_DST_OFFSET, &status);
    ucal_close(calendar);
}

template <class... Arguments>
void formatMessage(const char *locale, const UChar *pattern, Arguments... arguments)
{
    UErrorCode status = U_ZERO_ERROR;
    UChar text[ROOM];
    u_formatMessage(locale, pattern, u_strlen(pattern), text, ROOM, &status, arguments...);
    status = U_ZERO_ERROR;
    UMessageFormat *format = umsg_open(pattern, -1, locale, nullptr, &status);
    if (U_SUCCESS(status))
        umsg_format(format, text, ROOM, &status, arguments...);
    umsg_close(format);
}

void formatMessages()
{
    for (const char *locale : LOCALES) {
        formatMessage(locale, u"{0,number,integer} items", 12500);
        formatMessage(locale, u"{0,number}", 98765.4);
        formatMessage(locale, u"{0,number,#}", 12345678901234.0);
        formatMessage(locale, u"{0} and {1}", u"one", u"two");
    }
}

void readBundles()
{
    for (const char *name : {bundleName, "missing"}) {
        for (const char *locale : LOCALES) {
            UErrorCode status = U_ZERO_ERROR;
            int32_t length = 0;
            UResourceBundle *bundle = ures_open(name, locale, &status);
            ures_getStringByKey(bundle, "count", &length, &status);
            ures_getStringByKey(bundle, "missing", &length, &status);
            ures_close(bundle);
        }
    }
}

void printNumbers()
{
    UChar text[ROOM];
    u_snprintf(text, ROOM, "%d", 42);
    u_snprintf(text, ROOM, "%f", 42.5);
    u_snprintf(text, ROOM, "%s", "text");
}

void writeFile()
{
    FILE *stream = std::fopen("/dev/null", "w");
    if (UFILE *file = u_finit(stream, nullptr, nullptr)) {
        u_file_write(u"text", 4, file);
        u_fputc(u'\n', file);
        u_fclose(file);
    }
    std::fclose(stream);
}

void convert()
{
    UChar wide[ROOM];
    char narrow[ROOM];
    u_uastrcpy(wide, "text");
    u_austrcpy(narrow, wide);
}

struct Recipe {
    const char *name;
    void (*run)();
};

constexpr Recipe RECIPES[] = {
    {"udat_format", formatDates},    {"ucal_get", askCalendar},
    {"umsg_format", formatMessages}, {"ures_getStringByKey", readBundles},
    {"u_snprintf", printNumbers},    {"u_fputc", writeFile},
    {"u_austrcpy", convert},
};

using Places = std::map<std::string, std::string>;

void tryRecipe(const Recipe &recipe, bool once, Places &places)
{
    Ending ending{.failed = 1};
    for (uint64_t allowed = 0; ending.failed > 0 || ending.isBad; ++allowed) {
        const IcuFault fault{allowed, once};
        const auto run = [&] {
            recipe.run();
            return std::string();
        };
        ending = tryWithout(fault, run, run);
        const std::string how = std::string(" by ") + recipe.name + ", when " + fault.text();
        if (ending.isBad)
            places.emplace("crash " + ending.crash, how);
        for (const std::string &site : ending.leaks)
            places.emplace("leak " + site, how);
    }
}

} // namespace

int main(int argc, char **argv)
{
    if (argc != 3 || !takeIcuHeap())
        return 2;
    bundleName = argv[1];
    Places places;
    for (const Recipe &recipe : RECIPES) {
        recipe.run(); // what is made once in a process is made now
        for (const bool once : {true, false})
            tryRecipe(recipe, once, places);
    }
    std::ofstream notes(argv[2]);
    for (const auto &[place, how] : places)
        notes << place << how << '\n';
    std::printf("figures: ICU by itself: %zu places\n", places.size());
    return notes.flush() ? 0 : 1;
}
