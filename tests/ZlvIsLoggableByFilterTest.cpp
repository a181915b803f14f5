// SPDX-License-Identifier: Apache-2.0
// Asking a filter whether it accepts an event.
#include "support/ToolkitFixture.h"
#include "support/VaList.h"

#include "ZlvEvent.h"
#include "ZlvIntl.h"

namespace zelvo_test {
namespace {

class ZlvIsLoggableByFilterTest : public ToolkitFixture {
protected:
    void SetUp() override
    {
        open();
        event_ = ZlvVaAllocUEvent(ZLV_LEVEL_INFO, nullptr, nullptr, u"text", noArgs());
    }
    void TearDown() override
    {
        ZlvFreeEvent(event_);
        ToolkitFixture::TearDown();
    }

    ZlvBool asked(ZlvObject *filter) { return ZlvIsLoggableByFilter(filter, event_, noArgs()); }

    ZlvEvent *event_ = nullptr;
};

TEST_F(ZlvIsLoggableByFilterTest, GivesTheEntrysAnswer)
{
    ZlvObject *warn = filter("warn");
    EXPECT_EQ(asked(warn), 1);
    setProp(warn, "level", "WARN");
    EXPECT_EQ(asked(warn), 0);
}

TEST_F(ZlvIsLoggableByFilterTest, HandsTheEntrysResultOn)
{
    ZlvAddFilterClass(
        "two", nullptr, nullptr, nullptr, nullptr, nullptr,
        [](ZlvObject *, ZlvEvent *, va_list) { return 2; }, nullptr);
    EXPECT_EQ(asked(filter("filter", "two")), 2);
}

TEST_F(ZlvIsLoggableByFilterTest, DoesNotAskWhetherTheFilterIsEnabled)
{
    ZlvObject *off = filter("off");
    ZlvSetObjectEnabled(off, 0);
    EXPECT_EQ(asked(off), 1);
}

TEST_F(ZlvIsLoggableByFilterTest, OtherKindsAcceptNothing)
{
    EXPECT_EQ(asked(logger("app")), 0);
    EXPECT_EQ(asked(handler("handler")), 0);
    EXPECT_EQ(asked(formatter("formatter")), 0);
}

TEST_F(ZlvIsLoggableByFilterTest, AClassWithoutTheEntryAcceptsNothing)
{
    ZlvAddFilterClass("none", nullptr, nullptr, nullptr, nullptr, nullptr, nullptr, nullptr);
    zlvToolkitGetClassDef("none")->filter.fIsLoggable = nullptr;
    EXPECT_EQ(asked(filter("filter", "none")), 0);
}

TEST_F(ZlvIsLoggableByFilterTest, NullAcceptsNothing)
{
    EXPECT_EQ(asked(nullptr), 0);
    EXPECT_EQ(ZlvIsLoggableByFilter(filter("filter"), nullptr, noArgs()), 0);
}

} // namespace
} // namespace zelvo_test
