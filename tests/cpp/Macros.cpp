// SPDX-License-Identifier: Apache-2.0
// The macros of ZlvLogMacros.h: what they evaluate, and what arrives.
#include "CppTest.h"

namespace zelvo_test {

/// Counts what a macro asks for.
class CppMacros : public CppTest {
protected:
    ZlvObject *logger()
    {
        ++loggers_;
        return app_.get();
    }
    int32_t number()
    {
        ++numbers_;
        return 42;
    }

    int loggers_ = 0;
    int numbers_ = 0;
};

TEST_F(CppMacros, ATakenCallEvaluatesEverythingOnce)
{
    ZLV_DEBUG_MIN(logger(), u"{0,number,integer}", number());
    EXPECT_EQ(text(), u"42");
    EXPECT_EQ(loggers_, 1);
    EXPECT_EQ(numbers_, 1);
}

TEST_F(CppMacros, ARefusedCallEvaluatesItsLoggerAlone)
{
    app_.setProperty("level", "OFF");
    ZLV_DEBUG_MIN(logger(), u"{0,number,integer}", number());
    ZLV_DEBUG_MID(logger(), u"{0,number,integer}", number());
    ZLV_DEBUG_MAX(logger(), u"{0,number,integer}", number());
    ZLV_FATAL(logger(), "bundle", "key", number());
    ZLV_ERROR(logger(), "bundle", "key", number());
    ZLV_WARN(logger(), "bundle", "key", number());
    ZLV_INFO(logger(), "bundle", "key", number());
    EXPECT_EQ(loggers_, 7);
    EXPECT_EQ(numbers_, 0);
    EXPECT_EQ(memory_.count(), 0U);
}

TEST_F(CppMacros, ANullLoggerRefuses)
{
    ZLV_DEBUG_MIN(nullptr, u"{0,number,integer}", number());
    EXPECT_EQ(numbers_, 0);
}

TEST_F(CppMacros, EachMacroHasItsLevel)
{
    ZLV_FATAL(app_.get(), "bundle", "key");
    ZLV_ERROR(app_.get(), "bundle", "key");
    ZLV_WARN(app_.get(), "bundle", "key");
    ZLV_INFO(app_.get(), "bundle", "key");
    ZLV_DEBUG_MIN(app_.get(), u"text");
    ZLV_DEBUG_MID(app_.get(), u"text");
    ZLV_DEBUG_MAX(app_.get(), u"text");
    std::vector<ZlvLevel> levels;
    for (const auto &event : memory_.events())
        levels.push_back(event.level);
    EXPECT_EQ(levels, (std::vector<ZlvLevel>{ZLV_LEVEL_FATAL, ZLV_LEVEL_ERROR, ZLV_LEVEL_WARN,
                                             ZLV_LEVEL_INFO, ZLV_LEVEL_DEBUG_MIN,
                                             ZLV_LEVEL_DEBUG_MID, ZLV_LEVEL_DEBUG_MAX}));
}

TEST_F(CppMacros, EachDebugMacroTellsItsPlace)
{
    const int line = __LINE__;
    ZLV_DEBUG_MIN(app_.get(), u"min");
    ZLV_DEBUG_MID(app_.get(), u"mid");
    ZLV_DEBUG_MAX(app_.get(), u"max");
    const auto events = memory_.events();
    ASSERT_EQ(events.size(), 3U);
    for (size_t i = 0; i < events.size(); ++i) {
        EXPECT_EQ(*events[i].property("zlv_prop_srcfile"), __FILE__);
        EXPECT_EQ(*events[i].property("zlv_prop_srcfunction"), static_cast<const char *>(__func__));
        EXPECT_EQ(*events[i].property("zlv_prop_srcline"), std::to_string(line + 1 + int(i)));
    }
}

TEST_F(CppMacros, AMacroIsOneStatement)
{
    if (app_.takes(ZLV_LEVEL_OFF))
        ZLV_DEBUG_MIN(app_.get(), u"then");
    else
        ZLV_DEBUG_MIN(app_.get(), u"else");
    EXPECT_EQ(memory_.count(), 1U);
    EXPECT_EQ(text(), u"then");
}

} // namespace zelvo_test
