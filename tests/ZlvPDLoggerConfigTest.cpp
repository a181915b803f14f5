// SPDX-License-Identifier: Apache-2.0
// How the problem-determination logger is made and configured.
#include <ostream>

#include "support/FailAlloc.h"
#include "support/PDLoggerFixture.h"

namespace zelvo_test {
namespace {

class ZlvPDLoggerConfig : public PDLoggerFixture {};

/* Each of the seven strings. */

struct StringRow {
    const char *property;
    char *PDLoggerVars::*text;
    const char *atFirst;
};

void PrintTo(const StringRow &row, std::ostream *out)
{
    *out << row.property;
}

class ZlvPDLoggerString : public ZlvPDLoggerConfig, public testing::WithParamInterface<StringRow> {
protected:
    Text value() const { return peeked(varsOf(pd_)->*GetParam().text); }

    Text stampedValue()
    {
        const Properties all = stamped(pd_);
        const auto at = all.find(GetParam().property);
        return at == all.end() ? std::nullopt : Text(at->second);
    }
};

TEST_P(ZlvPDLoggerString, HasItsValueAtFirst)
{
    EXPECT_EQ(value(), peeked(GetParam().atFirst));
    EXPECT_EQ(stampedValue(), peeked(GetParam().atFirst));
}

TEST_P(ZlvPDLoggerString, ComesFromThePropertyOfItsName)
{
    setProp(pd_, GetParam().property, "new");
    EXPECT_EQ(value(), "new");
    EXPECT_EQ(stampedValue(), "new");
}

TEST_P(ZlvPDLoggerString, IsReplacedByTheNextValue)
{
    setProp(pd_, GetParam().property, "one");
    setProp(pd_, GetParam().property, "two");
    EXPECT_EQ(stampedValue(), "two");
}

TEST_P(ZlvPDLoggerString, IsGoneWithItsPropertyTheDefaultIncluded)
{
    setProp(pd_, GetParam().property, "new");
    setProp(pd_, GetParam().property, nullptr);
    EXPECT_EQ(value(), std::nullopt);
    EXPECT_EQ(stampedValue(), std::nullopt);
}

TEST_P(ZlvPDLoggerString, IsGoneWhenItsPropertyChangesWithoutBeingThere)
{
    ZlvPDLoggerFCfgChange(pd_, GetParam().property);
    EXPECT_EQ(value(), std::nullopt);
}

TEST_P(ZlvPDLoggerString, MayBeEmptyAndIsStampedThen)
{
    setProp(pd_, GetParam().property, "");
    EXPECT_EQ(stampedValue(), "");
}

TEST_P(ZlvPDLoggerString, TouchesNoOther)
{
    Properties expected{{"server", "node.example.org"}, {"serverFormat", "IP"}};
    expected[GetParam().property] = "new";
    setProp(pd_, GetParam().property, "new");
    EXPECT_EQ(stamped(pd_), expected);
}

const StringRow strings[] = {
    {"organization", &PDLoggerVars::organization, nullptr},
    {"product", &PDLoggerVars::product, nullptr},
    {"component", &PDLoggerVars::component, nullptr},
    {"client", &PDLoggerVars::client, nullptr},
    {"server", &PDLoggerVars::server, "node.example.org"},
    {"serverFormat", &PDLoggerVars::serverFormat, "IP"},
    {"productInstance", &PDLoggerVars::productInstance, nullptr},
};

INSTANTIATE_TEST_SUITE_P(, ZlvPDLoggerString, testing::ValuesIn(strings),
                         [](const auto &row) { return std::string(row.param.property); });

/* Other properties. */

TEST_F(ZlvPDLoggerConfig, TakesItsThresholdFromTheLevelProperty)
{
    setProp(pd_, "level", "WARN");
    EXPECT_EQ(pd_->logger.level, ZLV_LEVEL_WARN);
}

TEST_F(ZlvPDLoggerConfig, LeavesOtherPropertiesToTheBasicObject)
{
    setProp(pd_, "logging", "off");
    EXPECT_EQ(ZlvIsObjectEnabled(pd_), 0);
    setProp(pd_, "listenerNames", "");
    EXPECT_EQ(listeners(pd_), Names{});
}

TEST_F(ZlvPDLoggerConfig, ComparesNamesOfPropertiesExactly)
{
    for (const char *property : {"Product", "PRODUCT", "products", "produc", "serverformat",
                                 "processId", "threadId", "correlationId"})
        setProp(pd_, property, "new");
    EXPECT_EQ(stamped(pd_), (Properties{{"server", "node.example.org"}, {"serverFormat", "IP"}}));
}

TEST_F(ZlvPDLoggerConfig, ReadsItsConfiguration)
{
    close();
    open("shop.className=zlv_pdlogger\nshop.product=shop\nshop.level=ERROR\n"
         "shop.till.component=till\n");
    Recorder::addClass();
    recorder_ = handler("recorder", Recorder::className);
    ZlvObject *till = logger("shop.till", nullptr);
    ZlvAddListener(till, recorder_);
    EXPECT_EQ(stamped(till), (Properties{{"server", "node.example.org"},
                                         {"serverFormat", "IP"},
                                         {"product", "shop"},
                                         {"component", "till"}}));
    EXPECT_EQ(till->logger.level, ZLV_LEVEL_ERROR);
}

TEST_F(ZlvPDLoggerConfig, AConfigurationThatLosesAPropertyTakesItsStampAway)
{
    ZlvObjCfg *cfg = ZlvLogMgrGetCfg("configured");
    ZlvSetObjCfgProp(cfg, "product", "shop");
    ZlvObject *configured = pdLogger("configured");
    EXPECT_EQ(stamped(configured).count("product"), 1u);
    ZlvSetObjCfgProp(cfg, "product", nullptr);
    ZlvSetObjProp(configured, "product", nullptr);
    EXPECT_EQ(stamped(configured).count("product"), 0u);
    ZlvReleaseObjCfg(cfg);
}

TEST_F(ZlvPDLoggerConfig, AChangeWithANullArgumentDoesNothing)
{
    ZlvPDLoggerFCfgChange(nullptr, "server");
    ZlvPDLoggerFCfgChange(pd_, nullptr);
    ZlvPDLoggerFCfgChange(nullptr, nullptr);
    EXPECT_STREQ(varsOf(pd_)->server, "node.example.org");
}

TEST_F(ZlvPDLoggerConfig, AChangeWithoutVariablesDoesNothingAtAll)
{
    setProp(app_, "level", "WARN");
    zlvIntlStringToStringMapPut(app_->properties, "level", "ERROR");
    ZlvPDLoggerFCfgChange(app_, "level");
    ZlvPDLoggerFCfgChange(app_, "product");
    EXPECT_EQ(app_->logger.level, ZLV_LEVEL_WARN);
}

/* The host. */

TEST_F(ZlvPDLoggerConfig, TheServerIsUnnamedWhenTheHostIsUnknown)
{
    hostIsUnknown();
    EXPECT_EQ(stamped(pdLogger("lost")).at("server"), "NO_HOSTNAME");
}

TEST_F(ZlvPDLoggerConfig, TheServerIsUnnamedWhenTheResolverKnowsNoFullName)
{
    hostIs("node");
    system_.gethostbyname = [](const char *) -> hostent * { return nullptr; };
    EXPECT_EQ(stamped(pdLogger("lost")).at("server"), "NO_HOSTNAME");
}

TEST_F(ZlvPDLoggerConfig, TheServerIsTheFullNameThatTheResolverKnows)
{
    char full[] = "node.example.net";
    hostent entry{};
    entry.h_name = full;
    hostIs("node");
    system_.gethostbyname = [&](const char *) { return &entry; };
    EXPECT_EQ(stamped(pdLogger("found")).at("server"), "node.example.net");
}

TEST_F(ZlvPDLoggerConfig, TheHostIsAskedOnceForEachLogger)
{
    hostIs("other.example.org");
    EXPECT_EQ(stamped(pd_).at("server"), "node.example.org");
    EXPECT_EQ(stamped(pdLogger("new")).at("server"), "other.example.org");
}

TEST_F(ZlvPDLoggerConfig, AHostNameThatFillsItsAreaIsCutAt255Bytes)
{
    hostIs("a." + std::string(400, 'b'));
    EXPECT_EQ(stamped(pdLogger("long")).at("server"), "a." + std::string(253, 'b'));
}

/* The object that computes identifiers. */

TEST_F(ZlvPDLoggerConfig, HoldsTheFormatterOfThatName)
{
    const ZlvObject *held = varsOf(pd_)->idFormatter;
    ASSERT_NE(held, nullptr);
    EXPECT_STREQ(held->objClass->name, "zlv_xmlformatter");
    EXPECT_EQ(zlvToolkitGetObjInstance("zelvo.pdMsgIdFormatter"), held);
}

TEST_F(ZlvPDLoggerConfig, SharesTheFormatterWithOtherLoggers)
{
    EXPECT_EQ(varsOf(pdLogger("second"))->idFormatter, varsOf(pd_)->idFormatter);
}

TEST_F(ZlvPDLoggerConfig, LetsGoOfTheFormatterAtItsEnd)
{
    close();
    open();
    ZlvReleaseObject(ZlvGetObject("pd", "zlv_pdlogger"));
    EXPECT_EQ(zlvToolkitGetObjInstance("zelvo.pdMsgIdFormatter"), nullptr);
}

TEST_F(ZlvPDLoggerConfig, MakesTheFormatterFromItsConfiguration)
{
    close();
    open("zelvo.pdMsgIdFormatter.separator=;\n");
    const ZlvObject *made = varsOf(logger("pd", "zlv_pdlogger"))->idFormatter;
    ASSERT_NE(made, nullptr);
    EXPECT_STREQ(made->formatter.separator, ";");
}

TEST_F(ZlvPDLoggerConfig, DoesWithoutTheFormatterWhenItsNameBelongsToAnotherClass)
{
    close();
    open();
    Recorder::addClass();
    recorder_ = handler("recorder", Recorder::className);
    logger("zelvo.pdMsgIdFormatter");
    ZlvObject *alone = pdLogger("alone");
    EXPECT_EQ(varsOf(alone)->idFormatter, nullptr);
    EXPECT_EQ(logged(alone, u"ABC0001E stopped").messageId, "ABC0001E");
}

/* Memory. */

TEST_F(ZlvPDLoggerConfig, VariablesOfNullAreFreed)
{
    ZlvPDLoggerFFreeVars(nullptr);
}

TEST_F(ZlvPDLoggerConfig, VariablesAreNullWithoutTheirRecordOrDefaults)
{
    for (uint32_t allowed : {0u, 1u, 2u}) {
        FailAlloc fail(allowed, FailAlloc::Once);
        EXPECT_EQ(ZlvPDLoggerFAllocVars(), nullptr) << allowed;
    }
}

TEST_F(ZlvPDLoggerConfig, VariablesAreThereOrNullWhicheverAllocationFails)
{
    for (uint32_t allowed = 0, failed = 1; failed > 0; ++allowed) {
        FailAlloc fail(allowed);
        ZlvPDLoggerFFreeVars(ZlvPDLoggerFAllocVars());
        failed = fail.failed();
    }
}

TEST_F(ZlvPDLoggerConfig, ALoggerIsMadeOrNotWhicheverAllocationFails)
{
    for (uint32_t allowed = 0, failed = 1; failed > 0; ++allowed) {
        FailAlloc fail(allowed, FailAlloc::Once);
        ZlvReleaseObject(ZlvGetObject("other", "zlv_pdlogger"));
        failed = fail.failed();
    }
    EXPECT_NE(logger("other", "zlv_pdlogger"), nullptr);
}

} // namespace
} // namespace zelvo_test
