// SPDX-License-Identifier: Apache-2.0
// Handles of configurations.
#include "CppTest.h"

namespace zelvo_test {

using CppConfig = CppTest;

TEST_F(CppConfig, DescribesObjects)
{
    const zelvo::Config config("parts.log");
    config.setProperty("className", "zlv_basiclogger");
    config.setProperty("level", "WARN");
    zelvo::Logger logger("parts.log");
    ASSERT_TRUE(logger);
    EXPECT_TRUE(logger.takes(ZLV_LEVEL_WARN));
    EXPECT_FALSE(logger.takes(ZLV_LEVEL_INFO));

    config.setProperty("level", ZLV_LEVEL_INFO);
    EXPECT_FALSE(logger.takes(ZLV_LEVEL_INFO));
    EXPECT_TRUE(config.applyTo(logger));
    EXPECT_TRUE(logger.takes(ZLV_LEVEL_INFO));
}

TEST_F(CppConfig, InheritsFromItsParent)
{
    const zelvo::Config parent("parent");
    parent.setProperty("separator", "|");
    const zelvo::Config child("parent.child");
    EXPECT_EQ(child.property("separator").view(), "|");
    EXPECT_TRUE(child.parent() == parent);
    EXPECT_FALSE(parent.parent());
    EXPECT_EQ(child.name().view(), "parent.child");
}

TEST_F(CppConfig, PropertiesKeepTheirTypes)
{
    const zelvo::Config config("typed");
    config.setProperty("truth", false);
    config.setProperty("number", 42);
    config.setProperty("single", 0.5F);
    config.setProperty("double", 0.25);
    config.setProperty("long", "12345678901");
    EXPECT_EQ(config.property<bool>("truth"), false);
    EXPECT_EQ(config.property<int32_t>("number"), 42);
    EXPECT_EQ(config.property<float>("single"), 0.5F);
    EXPECT_EQ(config.property<double>("double"), 0.25);
    EXPECT_EQ(config.property<int64_t>("long"), 12345678901);
    EXPECT_EQ(config.property<int32_t>("absent"), std::nullopt);
}

TEST_F(CppConfig, IsHeldByTheLogManagerUntilUnregistered)
{
    EXPECT_FALSE(zelvo::Config::exists("held"));
    zelvo::Config config("held");
    EXPECT_TRUE(zelvo::Config::exists("held"));
    EXPECT_FALSE(config.isFromFile());
    config.unregister();
    EXPECT_FALSE(zelvo::Config::exists("held"));
    EXPECT_EQ(config.name().view(), "held");
}

TEST_F(CppConfig, AnEmptyHandleDoesNothing)
{
    const zelvo::Config none("/");
    EXPECT_FALSE(none);
    none.setProperty("a", 1);
    none.unregister();
    EXPECT_FALSE(none.applyTo(app_));
    EXPECT_FALSE(none.property("a"));
    EXPECT_FALSE(none.parent());
    EXPECT_FALSE(zelvo::Config(nullptr));
}

} // namespace zelvo_test
