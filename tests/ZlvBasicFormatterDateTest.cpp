// SPDX-License-Identifier: Apache-2.0
// The date that the basic formatter puts first: patterns, zones and their suffix.
#include <unicode/ucal.h>
#include <unicode/uloc.h>

#include <algorithm>
#include <ostream>

#include "ZlvBasicFormatter.h"
#include "support/Recorder.h"
#include "support/VaList.h"

namespace zelvo_test {
namespace {

/// 2006-08-16 08:48:55.123 UTC, summer in the north.
constexpr double summer = 1155718135123.0;
/// 2006-02-16 08:48:55.123 UTC, winter in the north.
constexpr double winter = 1140079735123.0;

class ZlvBasicFormatterDate : public ToolkitFixture {
protected:
    void SetUp() override
    {
        open();
        formatter_ = formatter("line");
    }

    static void zone(const char16_t *id)
    {
        UErrorCode status = U_ZERO_ERROR;
        ucal_setDefaultTimeZone(id, &status);
        ASSERT_LE(status, U_ZERO_ERROR);
    }

    static void defaultLocale(const char *name)
    {
        UErrorCode status = U_ZERO_ERROR;
        uloc_setDefault(name, &status);
        ASSERT_LE(status, U_ZERO_ERROR);
    }

    void pattern(const char *text) { setProp(formatter_, "dateTimeFormat", text); }

    UText date(double time) { return taken(ZlvBasicUFormatterFormatDate(formatter_, time)); }

    ZlvObject *formatter_ = nullptr;
};

/* The default pattern and the zone's suffix. */

struct ZoneRow {
    const char *label;
    const char16_t *zone;
    double time;
    const char16_t *date;
};

void PrintTo(const ZoneRow &row, std::ostream *out)
{
    *out << row.label;
}

class ZlvBasicFormatterZone : public ZlvBasicFormatterDate,
                              public testing::WithParamInterface<ZoneRow> {};

TEST_P(ZlvBasicFormatterZone, StandsBehindTheDate)
{
    zone(GetParam().zone);
    EXPECT_EQ(date(GetParam().time), GetParam().date);
}

constexpr ZoneRow zones[] = {
    {"Utc", u"UTC", summer, u"2006-08-16 08:48:55.123+00:00"},
    {"EastOneHour", u"GMT+01:00", summer, u"2006-08-16 09:48:55.123+01:00"},
    {"EastWithMinutes", u"GMT+05:30", summer, u"2006-08-16 14:18:55.123+05:30"},
    {"EastMinutesAlone", u"GMT+00:30", summer, u"2006-08-16 09:18:55.123+00:30"},
    {"EastQuarter", u"Asia/Kathmandu", summer, u"2006-08-16 14:33:55.123+05:45"},
    {"FarEast", u"GMT+14:00", summer, u"2006-08-16 22:48:55.123+14:00"},
    {"WestOneHour", u"GMT-01:00", summer, u"2006-08-16 07:48:55.123-01:00"},
    {"WestWithMinutes", u"GMT-03:30", summer, u"2006-08-16 05:18:55.123-03:-30"},
    {"WestMinutesAlone", u"GMT-00:30", summer, u"2006-08-16 08:18:55.123+00:-30"},
    {"WestFewMinutes", u"GMT-02:05", summer, u"2006-08-16 06:43:55.123-02:-5"},
    {"FarWest", u"GMT-11:00", summer, u"2006-08-15 21:48:55.123-11:00"},
    {"EastInSummer", u"Europe/Berlin", summer, u"2006-08-16 10:48:55.123+02:00"},
    {"EastInWinter", u"Europe/Berlin", winter, u"2006-02-16 09:48:55.123+01:00"},
    {"WestInSummer", u"America/St_Johns", summer, u"2006-08-16 06:18:55.123-02:-30"},
    {"WestInWinter", u"America/St_Johns", winter, u"2006-02-16 05:18:55.123-03:-30"},
    {"SecondsAreCut", u"GMT+01:00:59", summer, u"2006-08-16 09:49:54.123+01:00"},
    {"Epoch", u"UTC", 0, u"1970-01-01 00:00:00.000+00:00"},
    {"BeforeTheEpoch", u"UTC", -1, u"1969-12-31 23:59:59.999+00:00"},
    {"LastMillisecond", u"UTC", 4102444799999.0, u"2099-12-31 23:59:59.999+00:00"},
};

INSTANTIATE_TEST_SUITE_P(Each, ZlvBasicFormatterZone, testing::ValuesIn(zones),
                         [](const auto &test) { return std::string(test.param.label); });

TEST_F(ZlvBasicFormatterDate, FollowsAChangeOfTheDefaultZone)
{
    zone(u"GMT+05:30");
    EXPECT_EQ(date(summer), u"2006-08-16 14:18:55.123+05:30");
    zone(u"GMT-03:30");
    EXPECT_EQ(date(summer), u"2006-08-16 05:18:55.123-03:-30");
}

TEST_F(ZlvBasicFormatterDate, FollowsTheClockChangeOfAZone)
{
    zone(u"Europe/Berlin");
    constexpr double change = 1143334800000.0; // 2006-03-26 01:00 UTC
    EXPECT_EQ(date(change - 1), u"2006-03-26 01:59:59.999+01:00");
    EXPECT_EQ(date(change), u"2006-03-26 03:00:00.000+02:00");
}

TEST_F(ZlvBasicFormatterDate, UsesTheDigitsOfTheDefaultLocale)
{
    zone(u"GMT+05:30");
    defaultLocale("ar_EG");
    EXPECT_EQ(date(summer), u"٢٠٠٦-٠٨-١٦ ١٤:١٨:٥٥.١٢٣+05:30");
}

/* A pattern of one's own. */

TEST_F(ZlvBasicFormatterDate, OfAPatternHasNoSuffix)
{
    zone(u"GMT+05:30");
    pattern("HH:mm");
    EXPECT_EQ(date(summer), u"14:18");
}

TEST_F(ZlvBasicFormatterDate, FollowsAChangeOfThePattern)
{
    pattern("HH:mm");
    EXPECT_EQ(date(summer), u"08:48");
    pattern("yyyy");
    EXPECT_EQ(date(summer), u"2006");
}

TEST_F(ZlvBasicFormatterDate, ComesBackToTheDefaultWhenThePatternIsRemoved)
{
    pattern("HH:mm");
    pattern(nullptr);
    EXPECT_EQ(date(summer), u"2006-08-16 08:48:55.123+00:00");
    EXPECT_EQ(formatter_->formatter.dateTimeFormat, nullptr);
}

TEST_F(ZlvBasicFormatterDate, OfAPatternFollowsDefaultZoneAndLocale)
{
    pattern("EEEE HH");
    EXPECT_EQ(date(summer), u"Wednesday 08");
    defaultLocale("de_DE");
    EXPECT_EQ(date(summer), u"Mittwoch 08");
    zone(u"GMT+14:00");
    EXPECT_EQ(date(summer), u"Mittwoch 22");
}

TEST_F(ZlvBasicFormatterDate, OfAnEmptyPatternIsEmpty)
{
    pattern("");
    EXPECT_EQ(date(summer), u"");
}

TEST_F(ZlvBasicFormatterDate, OfAPatternMayBeLong)
{
    std::string quoted(5000, 'x');
    pattern(("'" + quoted + "'yyyy").c_str());
    EXPECT_EQ(date(summer), std::u16string(5000, u'x') + u"2006");
}

TEST_F(ZlvBasicFormatterDate, OfTwoFormattersKeepsTheirPatternsApart)
{
    ZlvObject *other = formatter("other");
    setProp(other, "dateTimeFormat", "yyyy");
    pattern("HH");
    EXPECT_EQ(date(summer), u"08");
    EXPECT_EQ(taken(ZlvBasicUFormatterFormatDate(other, summer)), u"2006");
    EXPECT_EQ(date(summer), u"08");
}

TEST_F(ZlvBasicFormatterDate, DoesNotUseTheLocaleSetting)
{
    pattern("MMMM");
    setProp(formatter_, "locale", "de");
    EXPECT_EQ(date(0), u"January");
}

TEST_F(ZlvBasicFormatterDate, IsTheSameAfterTheToolkitWasClosedAndOpenedAgain)
{
    pattern("HH:mm");
    EXPECT_EQ(date(summer), u"08:48");
    close();
    open();
    formatter_ = formatter("line");
    EXPECT_EQ(date(summer), u"2006-08-16 08:48:55.123+00:00");
}

TEST_F(ZlvBasicFormatterDate, OfANullFormatterIsNull)
{
    EXPECT_EQ(ZlvBasicUFormatterFormatDate(nullptr, summer), nullptr);
}

/* In a record. */

TEST_F(ZlvBasicFormatterDate, StandsFirstInARecordWithTheTimeOfTheEvent)
{
    ZlvEvent *event = ZlvVaAllocUEvent(1, nullptr, nullptr, u"message", noArgs());
    event->time = summer;
    zone(u"Europe/Berlin");
    EXPECT_EQ(taken(ZlvBasicUFormatterFFormat(formatter_, event, noArgs())),
              u"2006-08-16 10:48:55.123+02:00 message\n");
    ZlvFreeEvent(event);
}

TEST_F(ZlvBasicFormatterDate, OfALoggedEventHasTheDefaultShape)
{
    ZlvObject *app = logger("app");
    ZlvAddListener(app, handler("screen"));
    std::string printed = console([&] { log(app, u"message"); });
    ASSERT_GT(printed.size(), 23u);
    std::replace_if(
        printed.begin(), printed.begin() + 23, [](char c) { return c >= '0' && c <= '9'; }, '9');
    EXPECT_EQ(printed, "9999-99-99 99:99:99.999+00:00 message\n\n");
}

} // namespace
} // namespace zelvo_test
