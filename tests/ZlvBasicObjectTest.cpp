// SPDX-License-Identifier: Apache-2.0
// What the basic object does with a property.
#include "support/ToolkitFixture.h"

#include "ZlvHandler.h"
#include "ZlvIntl.h"

namespace zelvo_test {
namespace {

/// The basic object's answer to a property.
class ZlvBasicObject : public ToolkitFixture {
protected:
    void SetUp() override
    {
        open();
        app_ = logger("app");
    }

    ZlvObject *app_ = nullptr;
};

struct Logging {
    const char *name;
    const char *value;
    ZlvBool enabledWhenOn;
    ZlvBool enabledWhenOff;
};

class ZlvBasicObjectLogging : public ZlvBasicObject, public testing::WithParamInterface<Logging> {};

TEST_P(ZlvBasicObjectLogging, MakesAnEnabledObject)
{
    setProp(app_, "logging", GetParam().value);
    EXPECT_EQ(ZlvIsObjectEnabled(app_), GetParam().enabledWhenOn);
}

TEST_P(ZlvBasicObjectLogging, MakesADisabledObject)
{
    ZlvSetObjectEnabled(app_, 0);
    setProp(app_, "logging", GetParam().value);
    EXPECT_EQ(ZlvIsObjectEnabled(app_), GetParam().enabledWhenOff);
}

INSTANTIATE_TEST_SUITE_P(
    , ZlvBasicObjectLogging,
    testing::Values(Logging{"On", "on", 1, 1}, Logging{"True", "true", 1, 1},
                    Logging{"OnInCapitals", "ON", 1, 1}, Logging{"TrueMixed", "True", 1, 1},
                    Logging{"Off", "off", 0, 0}, Logging{"False", "false", 0, 0},
                    Logging{"OffInCapitals", "OFF", 0, 0}, Logging{"FalseMixed", "False", 0, 0},
                    Logging{"Yes", "yes", 1, 0}, Logging{"Empty", "", 1, 0},
                    Logging{"None", nullptr, 1, 0}, Logging{"OnWithMore", "on ", 1, 0}),
    [](const auto &row) { return row.param.name; });

class ZlvBasicObjectIgnored : public ZlvBasicObject,
                              public testing::WithParamInterface<const char *> {};

TEST_P(ZlvBasicObjectIgnored, PropertyIsStoredWithoutEffect)
{
    ZlvObject *listener = handler("listener");
    ZlvAddListener(app_, listener);
    setProp(app_, GetParam(), "5");
    EXPECT_EQ(prop(app_, GetParam()), "5");
    EXPECT_EQ(ZlvIsObjectEnabled(app_), 1);
    EXPECT_EQ(listeners(app_), Names{"listener"});
    EXPECT_EQ(app_->logger.level, 3000);
    EXPECT_EQ(ZlvGetObjectDesc(app_), nullptr);
}

INSTANTIATE_TEST_SUITE_P(, ZlvBasicObjectIgnored,
                         testing::Values("description", "descriptionFile", "descriptionSet",
                                         "descriptionKey", "LOGGING", "listenernames", "anything"),
                         [](const auto &row) { return std::string(row.param); });

TEST_F(ZlvBasicObject, DoesNothingWithoutAnObjectOrAName)
{
    ZlvBasicObjectFCfgChange(nullptr, "logging");
    ZlvBasicObjectFCfgChange(app_, nullptr);
    EXPECT_EQ(ZlvIsObjectEnabled(app_), 1);
}

TEST_F(ZlvBasicObject, DoesNothingWithAnObjectThatHasNoClass)
{
    ZlvObject loose{};
    loose.enabled = 1;
    ZlvBasicObjectFCfgChange(&loose, "listenerNames");
    ZlvBasicObjectFCfgChange(&loose, "logging");
    EXPECT_EQ(loose.enabled, 1);
}

TEST_F(ZlvBasicObject, ADisabledLoggerDispatchesNothing)
{
    ZlvAddListener(app_, handler("console"));
    setProp(app_, "logging", "OFF");
    EXPECT_EQ(console([&] { log(app_, u"text"); }), "");
}

} // namespace
} // namespace zelvo_test
