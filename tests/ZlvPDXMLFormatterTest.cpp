// SPDX-License-Identifier: Apache-2.0
// The variables, settings and pieces of the XML formatter, each by itself.
#include <cstring>
#include <ostream>

#include "ZlvPDXMLFormatter.h"
#include "support/FailAlloc.h"
#include "support/Records.h"

namespace zelvo_test {
namespace {

class ZlvPDXMLFormatter : public XMLRecordFixture {};

/* Variables. */

TEST_F(ZlvPDXMLFormatter, StartsWithSingleItemsDueAndAllElseOff)
{
    EXPECT_EQ(vars()->emitSingleItems, 1);
    EXPECT_EQ(vars()->singleComponent, 0);
    EXPECT_EQ(vars()->singleProduct, 0);
    EXPECT_EQ(vars()->singleProductId, 0);
    EXPECT_EQ(vars()->singleServer, 0);
    EXPECT_EQ(vars()->forceAsMessage, 0);
    EXPECT_EQ(vars()->forceAsTrace, 0);
}

TEST_F(ZlvPDXMLFormatter, HasVariablesOfSevenBytes)
{
    EXPECT_EQ(sizeof(PDXMLFormatterVars), 7U);
}

TEST_F(ZlvPDXMLFormatter, HasNoVariablesWhenMemoryRunsOut)
{
    FailAlloc fail(0);
    EXPECT_EQ(ZlvPDXMLFormatterFAllocVars(), nullptr);
    EXPECT_EQ(fail.failed(), 1U);
}

TEST_F(ZlvPDXMLFormatter, FreesItsVariables)
{
    void *made = ZlvPDXMLFormatterFAllocVars();
    ASSERT_NE(made, nullptr);
    ZlvPDXMLFormatterFFreeVars(made);
}

TEST_F(ZlvPDXMLFormatter, IgnoresNullVariables)
{
    ZlvPDXMLFormatterFFreeVars(nullptr);
    EXPECT_EQ(vars()->emitSingleItems, 1);
}

/* Settings. */

struct FlagRow {
    const char *property;
    uint8_t PDXMLFormatterVars::*flag;
};

void PrintTo(const FlagRow &row, std::ostream *out)
{
    *out << row.property;
}

class ZlvPDXMLFormatterFlag : public XMLRecordFixture, public testing::WithParamInterface<FlagRow> {
protected:
    void setTo(const char *value) { setProp(formatter_, GetParam().property, value); }
    uint8_t flag() { return vars()->*GetParam().flag; }
};

TEST_P(ZlvPDXMLFormatterFlag, IsTurnedOnAndOffByItsProperty)
{
    setTo("true");
    EXPECT_EQ(flag(), 1);
    setTo("false");
    EXPECT_EQ(flag(), 0);
}

TEST_P(ZlvPDXMLFormatterFlag, IsOffWhenItsPropertyIsRemoved)
{
    setTo("true");
    setTo(nullptr);
    EXPECT_EQ(flag(), 0);
}

TEST_P(ZlvPDXMLFormatterFlag, IsOffWhenItsPropertyIsNoTruthValue)
{
    setTo("true");
    setTo("maybe");
    EXPECT_EQ(flag(), 0);
}

TEST_P(ZlvPDXMLFormatterFlag, IsOffWhenItChangesWithoutEverBeingSet)
{
    vars()->*GetParam().flag = 1;
    HeldMutex held;
    ZlvPDXMLFormatterFCfgChange(formatter_, GetParam().property);
    EXPECT_EQ(flag(), 0);
}

TEST_P(ZlvPDXMLFormatterFlag, ChangesNoOther)
{
    setTo("true");
    PDXMLFormatterVars expected{1, 0, 0, 0, 0, 0, 0};
    expected.*GetParam().flag = 1;
    EXPECT_EQ(std::memcmp(vars(), &expected, sizeof expected), 0);
}

TEST_P(ZlvPDXMLFormatterFlag, IsReadFromAConfiguration)
{
    close();
    open("xml.className=zlv_xmlformatter\nxml." + std::string(GetParam().property) + "=true\n");
    formatter_ = object("xml");
    EXPECT_EQ(flag(), 1);
}

TEST_P(ZlvPDXMLFormatterFlag, IsNoMatterOfAFormatterWithoutVariables)
{
    ZlvObject *plain = formatter("plain");
    HeldMutex held;
    ZlvPDXMLFormatterFCfgChange(plain, GetParam().property);
    EXPECT_EQ(plain->vars, nullptr);
}

INSTANTIATE_TEST_SUITE_P(
    , ZlvPDXMLFormatterFlag,
    testing::Values(FlagRow{"singleComponent", &PDXMLFormatterVars::singleComponent},
                    FlagRow{"singleProduct", &PDXMLFormatterVars::singleProduct},
                    FlagRow{"singleProductId", &PDXMLFormatterVars::singleProductId},
                    FlagRow{"singleServer", &PDXMLFormatterVars::singleServer},
                    FlagRow{"forceAsMessage", &PDXMLFormatterVars::forceAsMessage},
                    FlagRow{"forceAsTrace", &PDXMLFormatterVars::forceAsTrace}),
    [](const auto &row) { return std::string(row.param.property); });

TEST_F(ZlvPDXMLFormatter, TakesTheSettingsOfTheBasicFormatter)
{
    setProp(formatter_, "separator", "|");
    setProp(formatter_, "dateTimeFormat", "HH:mm");
    setProp(formatter_, "locale", "de");
    EXPECT_STREQ(formatter_->formatter.separator, "|");
    EXPECT_STREQ(formatter_->formatter.dateTimeFormat, "HH:mm");
    EXPECT_STREQ(formatter_->formatter.locale, "de");
}

TEST_F(ZlvPDXMLFormatter, TakesTheSettingsOfEveryObject)
{
    setProp(formatter_, "logging", "false");
    EXPECT_EQ(formatter_->enabled, 0);
}

TEST_F(ZlvPDXMLFormatter, ComparesSettingsExactly)
{
    for (const char *name : {"SingleServer", "singleserver", "singleServers", "singleProductID"})
        setProp(formatter_, name, "true");
    constexpr PDXMLFormatterVars expected{1, 0, 0, 0, 0, 0, 0};
    EXPECT_EQ(std::memcmp(vars(), &expected, sizeof expected), 0);
}

TEST_F(ZlvPDXMLFormatter, IgnoresChangesOfNoObjectAndOfNoProperty)
{
    HeldMutex held;
    ZlvPDXMLFormatterFCfgChange(nullptr, "singleServer");
    ZlvPDXMLFormatterFCfgChange(formatter_, nullptr);
    EXPECT_EQ(vars()->singleServer, 0);
}

/* Header and trailer. */

TEST_F(ZlvPDXMLFormatter, HasNoHeaderTextButMakesSingleItemsDue)
{
    vars()->emitSingleItems = 0;
    EXPECT_EQ(ZlvPDXMLFormatterFGetHeader(formatter_), nullptr);
    EXPECT_EQ(vars()->emitSingleItems, 1);
}

TEST_F(ZlvPDXMLFormatter, HasNoTrailer)
{
    vars()->emitSingleItems = 0;
    EXPECT_EQ(ZlvPDXMLFormatterFGetTrailer(formatter_), nullptr);
    EXPECT_EQ(vars()->emitSingleItems, 0);
}

TEST_F(ZlvPDXMLFormatter, OfNullHasNeitherHeaderNorTrailer)
{
    EXPECT_EQ(ZlvPDXMLFormatterFGetHeader(nullptr), nullptr);
    EXPECT_EQ(ZlvPDXMLFormatterFGetTrailer(nullptr), nullptr);
}

TEST_F(ZlvPDXMLFormatter, WithoutVariablesHasNoHeader)
{
    EXPECT_EQ(ZlvPDXMLFormatterFGetHeader(formatter("plain")), nullptr);
}

/* No record. */

TEST_F(ZlvPDXMLFormatter, GivesNothingWithoutFormatterEventOrVariables)
{
    ZlvObject *plain = formatter("plain");
    HeldMutex held;
    EXPECT_EQ(ZlvPDXMLUFormatterFFormat(nullptr, event_, noArgs()), nullptr);
    EXPECT_EQ(ZlvPDXMLUFormatterFFormat(formatter_, nullptr, noArgs()), nullptr);
    EXPECT_EQ(ZlvPDXMLUFormatterFFormat(plain, event_, noArgs()), nullptr);
}

TEST_F(ZlvPDXMLFormatter, KeepsSingleItemsDueWhenThereIsNoEvent)
{
    HeldMutex held;
    EXPECT_EQ(ZlvPDXMLUFormatterFFormat(formatter_, nullptr, noArgs()), nullptr);
    EXPECT_EQ(vars()->emitSingleItems, 1);
}

} // namespace
} // namespace zelvo_test
