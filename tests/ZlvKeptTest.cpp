// SPDX-License-Identifier: Apache-2.0
// What is kept between records: how much, how long, and that a change of a default shows.
#include "ZlvKept.h"

#include <string>

#include <unicode/ucal.h>

#include "ZlvBundlePattern.h"
#include "ZlvKeptBundles.h"
#include "ZlvKeptDates.h"
#include "ZlvKeptTable.h"
#include "ZlvMessageFormat.h"
#include "support/Bundles.h"
#include "support/FailAlloc.h"
#include "support/HeapInUse.h"
#include "support/IcuDefaults.h"
#include "support/ToolkitFixture.h"

namespace zelvo_test {
namespace {

class ZlvKept : public ToolkitFixture {
protected:
    void TearDown() override
    {
        zelvo::dropKept();
        ToolkitFixture::TearDown();
    }

    static std::u16string date(const char *pattern, double time = 0)
    {
        CxUStringBuff out = {};
        zelvo::appendDate(&out, pattern, time);
        const std::u16string text(out.data != nullptr ? out.data : u"");
        CxUStringBuffDiscard(&out);
        return text;
    }

    static void zone(const char16_t *id)
    {
        UErrorCode status = U_ZERO_ERROR;
        ucal_setDefaultTimeZone(id, &status);
        ASSERT_TRUE(U_SUCCESS(status));
    }
};

/* Dates. */

TEST_F(ZlvKept, DatesFollowTheDefaultZone)
{
    zone(u"UTC");
    EXPECT_EQ(date(nullptr), u"1970-01-01 00:00:00.000+00:00");
    zone(u"Asia/Kolkata");
    EXPECT_EQ(date(nullptr), u"1970-01-01 05:30:00.000+05:30");
    zone(u"UTC");
    EXPECT_EQ(date(nullptr), u"1970-01-01 00:00:00.000+00:00");
}

TEST_F(ZlvKept, DatesFollowTheDefaultLocale)
{
    const DefaultLocale english("en");
    EXPECT_EQ(date("MMMM"), u"January");
    const DefaultLocale german("de");
    EXPECT_EQ(date("MMMM"), u"Januar");
}

TEST_F(ZlvKept, DatesOfMoreFormsThanAreKeptAreAllRight)
{
    for (int round = 0; round < 3; ++round)
        for (int form = 0; form < 20; ++form)
            EXPECT_EQ(date(("'" + std::to_string(form) + "x'").c_str()),
                      std::u16string(1, static_cast<char16_t>(u'0' + form / 10))
                              .substr(form < 10 ? 1 : 0) +
                          static_cast<char16_t>(u'0' + form % 10) + u"x");
}

TEST_F(ZlvKept, DatesForWhichThereIsNoMemoryAreEmptyAndThereAgainAfterwards)
{
    {
        const FailAlloc fail(0);
        EXPECT_EQ(date("yyyy"), u"");
    }
    EXPECT_EQ(date("yyyy"), u"1970");
}

/* Formats of messages. */

TEST_F(ZlvKept, AFormatIsFoundAgain)
{
    const UMessageFormat *first = zelvo::MessageFormat(u"{0,number}", "en").get();
    EXPECT_NE(first, nullptr);
    EXPECT_EQ(zelvo::MessageFormat(u"{0,number}", "en").get(), first);
}

TEST_F(ZlvKept, AFormatIsFoundByItsPatternAndItsLocale)
{
    const UMessageFormat *first = zelvo::MessageFormat(u"{0,number}", "en").get();
    EXPECT_NE(zelvo::MessageFormat(u"{0,number} ", "en").get(), first);
    EXPECT_NE(zelvo::MessageFormat(u"{0,number}", "de").get(), first);
    EXPECT_NE(zelvo::MessageFormat(u"{0,number}", nullptr).get(), first);
}

TEST_F(ZlvKept, AFormatThatIsRefusedIsAskedForAgain)
{
    for (int round = 0; round < 2; ++round)
        EXPECT_EQ(zelvo::MessageFormat(u"{0", "en").get(), nullptr);
}

TEST_F(ZlvKept, AFormatForWhichThereIsNoMemoryIsNotKept)
{
    const FailAlloc fail(0);
    const zelvo::MessageFormat first{u"{0,number}", "en"};
    const zelvo::MessageFormat second{u"{0,number}", "en"};
    EXPECT_NE(first.get(), nullptr);
    EXPECT_NE(first.get(), second.get());
}

TEST_F(ZlvKept, FormatsOfUnboundedPatternsAreBounded)
{
    const auto open = [](int number) {
        const std::string digits = std::to_string(number);
        const std::u16string pattern = std::u16string(digits.begin(), digits.end()) + u"{0,number}";
        EXPECT_NE(zelvo::MessageFormat(pattern.c_str(), "en").get(), nullptr);
    };
    for (int number = 0; number < 2000; ++number)
        open(number);
    const size_t before = heapInUse();
    for (int number = 2000; number < 6000; ++number)
        open(number);
    EXPECT_LT(heapInUse(), before + before / 8);
}

/* Bundles. */

TEST_F(ZlvKept, APatternOfABundleIsFoundAgain)
{
    ZlvI18Msg *message = zlvIntlAllocUI18Msg(bundlePath, "plain", nullptr);
    UErrorCode status = U_ZERO_ERROR;
    EXPECT_NE(zelvo::BundlePattern(message, &status).get(), nullptr);
    const UChar *kept = zelvo::BundlePattern(message, &status).get();
    ASSERT_NE(kept, nullptr);
    EXPECT_EQ(zelvo::BundlePattern(message, &status).get(), kept);
    EXPECT_EQ(std::u16string(kept), u"Service halted");
    zlvIntlFreeI18Msg(message);
}

TEST_F(ZlvKept, ABundleIsFoundByItsNameAndItsLocale)
{
    UErrorCode status = U_ZERO_ERROR;
    const UResourceBundle *german = zelvo::keptBundle(bundlePath, "de", &status);
    ASSERT_NE(german, nullptr);
    EXPECT_EQ(zelvo::keptBundle(bundlePath, "de", &status), german);
    EXPECT_NE(zelvo::keptBundle(bundlePath, "ja", &status), german);
}

TEST_F(ZlvKept, ABundleThatIsMissingIsLookedForAgain)
{
    for (int round = 0; round < 2; ++round) {
        UErrorCode status = U_ZERO_ERROR;
        EXPECT_EQ(zelvo::keptBundle("missing", "de", &status), nullptr);
        EXPECT_TRUE(U_FAILURE(status));
    }
}

TEST_F(ZlvKept, BundlesBeyondTheCapacityTakeTurns)
{
    for (int round = 0; round < 2; ++round)
        for (const char *locale : {"de", "en", "ja", "fr", "es", "it", "nl", "pl", "sv", "fi"}) {
            UErrorCode status = U_ZERO_ERROR;
            EXPECT_NE(zelvo::keptBundle(bundlePath, locale, &status), nullptr);
        }
}

TEST_F(ZlvKept, ABundleForWhichThereIsNoMemoryIsNotKeptAndNotAnError)
{
    const FailAlloc fail(0);
    UErrorCode status = U_ZERO_ERROR;
    EXPECT_EQ(zelvo::keptBundle(bundlePath, "de", &status), nullptr);
    EXPECT_TRUE(U_SUCCESS(status));
}

/* The table, and the names that it is asked with. */

struct Entry {
    bool isUsed;
    uint64_t hash;

    void drop() { *this = {}; }
};

TEST(ZlvKeptTable, ARowThatIsFullLetsGoOfItsEntriesInTurn)
{
    zelvo::KeptTable<Entry> table;
    const auto any = [](const Entry &) { return true; };
    for (uint64_t number = 0; number < 5; ++number)
        table.makeRoom(number * 64) = {true, number * 64};
    EXPECT_EQ(table.find(0, any), nullptr);
    for (uint64_t number = 1; number < 5; ++number)
        EXPECT_NE(table.find(number * 64, any), nullptr);
    table.dropAll();
    EXPECT_EQ(table.find(64, any), nullptr);
}

TEST(ZlvKeptTable, EntriesOfOneHashAreToldApart)
{
    zelvo::KeptTable<Entry> table;
    table.makeRoom(1) = {true, 1};
    EXPECT_EQ(table.find(1, [](const Entry &) { return false; }), nullptr);
}

TEST(ZlvKeptTable, HashesTellAbsentTextsFromEmptyOnesAndMindTheOrder)
{
    const auto hash = [](const char *a, const char *b) {
        return zelvo::mixed(zelvo::mixed(0, a), b);
    };
    EXPECT_NE(hash("", "a"), hash(nullptr, "a"));
    EXPECT_NE(hash("a", "b"), hash("b", "a"));
    EXPECT_NE(hash("123456789", "b"), hash("12345678", "b"));
    EXPECT_EQ(hash("123456789", "b"), hash("123456789", "b"));
}

} // namespace
} // namespace zelvo_test
