// SPDX-License-Identifier: Apache-2.0
// Threads that log while others change the locale of the process and its zone.
#include <atomic>
#include <clocale>
#include <cstdio>
#include <ctime>
#include <string>
#include <thread>
#include <vector>

#include <unicode/ucal.h>

#include "support/TestDir.h"
#include "zelvo.h"

using namespace zelvo_test;

namespace {

constexpr int LOGGING_THREADS = 2;
constexpr int RECORDS = 10000; // of each thread

struct Zone {
    const char *name;
    const UChar *id;
};

constexpr Zone ZONES[] = {
    {"UTC", u"UTC"},
    {"Asia/Tokyo", u"Asia/Tokyo"},
    {"Asia/Kolkata", u"Asia/Kolkata"},
    {"America/Denver", u"America/Denver"},
};

class LocalesAndZones : public TestDir {
protected:
    void SetUp() override
    {
        ASSERT_EQ(ZlvOpenToolkit(nullptr, nullptr), 1);
        logger_ = ZlvGetObject("zones.log", "zlv_basiclogger");
        ZlvObject *handler = ZlvGetObject("zones.file", "zlv_filehandler");
        ZlvSetObjProp(handler, "fileName", "zones.log");
        ZlvSetObjPropInt(handler, "maxFiles", 1);
        ZlvSetObjProp(handler, "formatterName", "zelvo.defaultFormatter");
        ZlvAddListener(logger_, handler);
        ZlvReleaseObject(handler);
    }

    void TearDown() override
    {
        ZlvReleaseObject(logger_);
        ZlvCloseToolkit();
    }

    void logAll(int thread)
    {
        for (int number = 0; number < RECORDS; ++number)
            ZlvLogUText(logger_, u"{0,number,integer} of {1,number,integer}, {2,number}", number,
                        thread, 0.5);
    }

    void changeZones()
    {
        for (size_t round = 0; !done_; ++round) {
            const Zone &zone = ZONES[round % std::size(ZONES)];
            UErrorCode status = U_ZERO_ERROR;
            setenv("TZ", zone.name, 1);
            tzset();
            ucal_setDefaultTimeZone(zone.id, &status);
            EXPECT_EQ(status, U_ZERO_ERROR);
            ++zoneChanges_;
        }
    }

    void changeLocales()
    {
        for (size_t round = 0; !done_; ++round) {
            EXPECT_NE(std::setlocale(LC_ALL, round % 2 == 0 ? "C.UTF-8" : "C"), nullptr);
            ++localeChanges_;
        }
    }

    /// Runs them all until the records are logged.
    void logWhileAllChanges()
    {
        std::vector<std::thread> logging;
        std::thread zones([this] { changeZones(); });
        std::thread locales([this] { changeLocales(); });
        for (int thread = 0; thread < LOGGING_THREADS; ++thread)
            logging.emplace_back([this, thread] { logAll(thread); });
        for (std::thread &thread : logging)
            thread.join();
        done_ = true;
        zones.join();
        locales.join();
    }

    ZlvObject *logger_ = nullptr;
    std::atomic<bool> done_ = false;
    size_t zoneChanges_ = 0;
    size_t localeChanges_ = 0;
};

/// The moment that the date of a record tells, in seconds since 1970; -1 for no such record.
time_t momentOf(const std::string &line)
{
    tm local{};
    char sign = 0;
    int hours = 0;
    int minutes = 0;
    int milliseconds = 0;
    int end = 0;
    const int items =
        std::sscanf(line.c_str(), "%4d-%2d-%2d %2d:%2d:%2d.%3d%c%2d:%2d %*d of %*d, 0.5%n",
                    &local.tm_year, &local.tm_mon, &local.tm_mday, &local.tm_hour, &local.tm_min,
                    &local.tm_sec, &milliseconds, &sign, &hours, &minutes, &end);
    if (items != 10 || static_cast<size_t>(end) != line.size())
        return -1;
    local.tm_year -= 1900;
    local.tm_mon -= 1;
    const int offset = (hours * 60 + minutes) * 60;
    return timegm(&local) - (sign == '-' ? -offset : offset);
}

} // namespace

TEST_F(LocalesAndZones, MayChangeWhileOthersLogAndEachRecordTellsTheRightMoment)
{
    const time_t start = time(nullptr);
    logWhileAllChanges();
    const time_t end = time(nullptr);
    std::istringstream log(read("zones.log"));
    size_t records = 0;
    size_t wrong = 0;
    for (std::string line; std::getline(log, line); ++records) {
        const time_t moment = momentOf(line);
        wrong += moment < start || moment > end ? 1 : 0;
    }
    std::printf("figures: life: %zu records, %zu changes of the zone and %zu of the locale, "
                "%zu records with a wrong moment\n",
                records, zoneChanges_, localeChanges_, wrong);
    EXPECT_EQ(records, size_t{LOGGING_THREADS} * RECORDS);
    EXPECT_EQ(wrong, 0U);
}
