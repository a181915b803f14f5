// SPDX-License-Identifier: Apache-2.0
// The properties of an event.
#include <gtest/gtest.h>

#include "ZlvIntl.h"
#include "support/FailAlloc.h"
#include "support/Text.h"
#include "support/VaList.h"

namespace zelvo_test {
namespace {

class ZlvEventProps : public testing::Test {
protected:
    ~ZlvEventProps() override { ZlvFreeEvent(event_); }

    Text stored(const char *name) { return taken(ZlvGetEventProp(event_, name, &found_)); }

    ZlvEvent *event_ = ZlvVaAllocUEvent(1, nullptr, nullptr, nullptr, noArgs());
    ZlvBool found_ = 7;
};

/* Each type there and back. */

TEST_F(ZlvEventProps, AStringComesBack)
{
    EXPECT_EQ(ZlvSetEventProp(event_, "name", "value"), 1);
    EXPECT_EQ(stored("name"), "value");
    EXPECT_EQ(found_, 1);
}

TEST_F(ZlvEventProps, AStringIsCopiedInAndOut)
{
    std::string value = "one";
    ZlvSetEventProp(event_, "name", value.c_str());
    value = "two";
    EXPECT_EQ(stored("name"), "one");
    EXPECT_EQ(stored("name"), "one");
}

TEST_F(ZlvEventProps, ABooleanComesBack)
{
    ZlvSetEventPropBool(event_, "name", 1);
    EXPECT_EQ(ZlvGetEventPropBool(event_, "name", &found_), 1);
    EXPECT_EQ(found_, 1);
    EXPECT_EQ(stored("name"), "true");
}

TEST_F(ZlvEventProps, ABooleanOtherThanOneIsFalse)
{
    for (int value : {0, 2, 255}) {
        ZlvSetEventPropBool(event_, "name", static_cast<ZlvBool>(value));
        EXPECT_EQ(ZlvGetEventPropBool(event_, "name", &found_), 0);
        EXPECT_EQ(found_, 1);
        EXPECT_EQ(stored("name"), "false");
    }
}

TEST_F(ZlvEventProps, AnIntComesBack)
{
    for (int32_t value : {0, -7, INT32_MAX, INT32_MIN}) {
        ZlvSetEventPropInt(event_, "name", value);
        EXPECT_EQ(ZlvGetEventPropInt(event_, "name", &found_), value);
        EXPECT_EQ(found_, 1);
    }
    EXPECT_EQ(stored("name"), "-2147483648");
}

TEST_F(ZlvEventProps, ALongIsWidenedWithItsSign)
{
    for (int32_t value : {0, -7, INT32_MAX, INT32_MIN}) {
        ZlvSetEventPropLong(event_, "name", value);
        EXPECT_EQ(ZlvGetEventPropLong(event_, "name", &found_), int64_t{value});
        EXPECT_EQ(found_, 1);
    }
    EXPECT_EQ(stored("name"), "-2147483648");
}

TEST_F(ZlvEventProps, ALongIsReadWithSixtyFourBits)
{
    ZlvSetEventProp(event_, "name", "-9000000000");
    EXPECT_EQ(ZlvGetEventPropLong(event_, "name", nullptr), -9000000000);
}

TEST_F(ZlvEventProps, AFloatComesBack)
{
    ZlvSetEventPropFloat(event_, "name", 1.5F);
    EXPECT_EQ(ZlvGetEventPropFloat(event_, "name", &found_), 1.5F);
    EXPECT_EQ(found_, 1);
    EXPECT_EQ(stored("name"), "1.500000");
}

TEST_F(ZlvEventProps, ADoubleComesBack)
{
    ZlvSetEventPropDouble(event_, "name", -2.25);
    EXPECT_EQ(ZlvGetEventPropDouble(event_, "name", &found_), -2.25);
    EXPECT_EQ(found_, 1);
    EXPECT_EQ(stored("name"), "-2.250000");
}

/* Setting again, names, null. */

TEST_F(ZlvEventProps, ASecondValueReplacesTheFirst)
{
    ZlvSetEventPropInt(event_, "name", 1);
    ZlvSetEventProp(event_, "name", "two");
    EXPECT_EQ(stored("name"), "two");
}

TEST_F(ZlvEventProps, NamesAreComparedWithCase)
{
    ZlvSetEventProp(event_, "name", "lower");
    ZlvSetEventProp(event_, "Name", "upper");
    EXPECT_EQ(stored("name"), "lower");
    EXPECT_EQ(stored("Name"), "upper");
}

TEST_F(ZlvEventProps, ANullValueIsNotFound)
{
    ZlvSetEventProp(event_, "name", "value");
    EXPECT_EQ(ZlvSetEventProp(event_, "name", nullptr), 1);
    EXPECT_EQ(stored("name"), Text{});
    EXPECT_EQ(found_, 0);
}

TEST_F(ZlvEventProps, ANullNameStoresNothing)
{
    EXPECT_EQ(ZlvSetEventProp(event_, nullptr, "value"), 0);
    ZlvSetEventPropBool(event_, nullptr, 1);
    ZlvSetEventPropInt(event_, nullptr, 1);
    ZlvSetEventPropLong(event_, nullptr, 1);
    ZlvSetEventPropFloat(event_, nullptr, 1);
    ZlvSetEventPropDouble(event_, nullptr, 1);
    EXPECT_EQ(zlvFetchEventPropMap(event_)->first, nullptr);
}

TEST_F(ZlvEventProps, ATextThatIsNoNumberIsNotFound)
{
    ZlvSetEventProp(event_, "name", "abc");
    EXPECT_EQ(ZlvGetEventPropInt(event_, "name", &found_), 0);
    EXPECT_EQ(found_, 0);
}

/* The getters on what is not there: every name, absent or null, found flag or none. */

class ZlvEventPropsAbsent : public ZlvEventProps {
protected:
    /// Every getter fails for NAME of EVENT, and clears the flag.
    void expectNothing(const ZlvEvent *event, const char *name)
    {
        expectCleared([&] { EXPECT_EQ(ZlvGetEventProp(event, name, &found_), nullptr); });
        expectCleared([&] { EXPECT_EQ(ZlvGetEventPropBool(event, name, &found_), 0); });
        expectCleared([&] { EXPECT_EQ(ZlvGetEventPropInt(event, name, &found_), 0); });
        expectCleared([&] { EXPECT_EQ(ZlvGetEventPropLong(event, name, &found_), 0); });
        expectCleared([&] { EXPECT_EQ(ZlvGetEventPropFloat(event, name, &found_), 0.0F); });
        expectCleared([&] { EXPECT_EQ(ZlvGetEventPropDouble(event, name, &found_), 0.0); });
    }

private:
    template <class Get>
    void expectCleared(Get get)
    {
        found_ = 7;
        get();
        EXPECT_EQ(found_, 0);
    }
};

TEST_F(ZlvEventPropsAbsent, WithoutAMapNothingIsFoundAndNoMapIsMade)
{
    expectNothing(event_, "name");
    EXPECT_EQ(event_->properties, nullptr);
}

TEST_F(ZlvEventPropsAbsent, AnotherNameIsNotFound)
{
    ZlvSetEventProp(event_, "other", "value");
    expectNothing(event_, "name");
}

TEST_F(ZlvEventPropsAbsent, ANullNameIsNotFound)
{
    ZlvSetEventProp(event_, "other", "value");
    expectNothing(event_, nullptr);
}

TEST_F(ZlvEventPropsAbsent, ANullEventHasNothing)
{
    expectNothing(nullptr, "name");
}

TEST_F(ZlvEventPropsAbsent, ANullFlagIsNotWritten)
{
    EXPECT_EQ(ZlvGetEventProp(event_, "name", nullptr), nullptr);
    EXPECT_EQ(ZlvGetEventPropBool(event_, "name", nullptr), 0);
    EXPECT_EQ(ZlvGetEventPropInt(event_, "name", nullptr), 0);
    EXPECT_EQ(ZlvGetEventPropLong(event_, "name", nullptr), 0);
    EXPECT_EQ(ZlvGetEventPropFloat(event_, "name", nullptr), 0.0F);
    EXPECT_EQ(ZlvGetEventPropDouble(event_, "name", nullptr), 0.0);
}

TEST_F(ZlvEventPropsAbsent, SettersIgnoreANullEvent)
{
    EXPECT_EQ(ZlvSetEventProp(nullptr, "name", "value"), 0);
    ZlvSetEventPropBool(nullptr, "name", 1);
    ZlvSetEventPropInt(nullptr, "name", 1);
    ZlvSetEventPropLong(nullptr, "name", 1);
    ZlvSetEventPropFloat(nullptr, "name", 1);
    ZlvSetEventPropDouble(nullptr, "name", 1);
}

/* The map. */

TEST_F(ZlvEventProps, FetchingTheMapMakesItOnce)
{
    StringToStringMap *map = zlvFetchEventPropMap(event_);
    ASSERT_NE(map, nullptr);
    EXPECT_EQ(zlvFetchEventPropMap(event_), map);
    EXPECT_EQ(event_->properties, map);
}

TEST_F(ZlvEventProps, WithoutMemoryForTheMapNothingIsStored)
{
    {
        FailAlloc fail(0);
        EXPECT_EQ(ZlvSetEventProp(event_, "name", "value"), 0);
        EXPECT_GT(fail.failed(), 0u);
    }
    EXPECT_EQ(event_->properties, nullptr);
}

struct SetRow {
    const char *name;
    void (*set)(ZlvEvent *event);
};

void PrintTo(const SetRow &row, std::ostream *out)
{
    *out << row.name;
}

class ZlvEventPropSetter : public ZlvEventProps, public testing::WithParamInterface<SetRow> {};

TEST_P(ZlvEventPropSetter, MakesTheMap)
{
    GetParam().set(event_);
    ASSERT_NE(event_->properties, nullptr);
    EXPECT_NE(event_->properties->first, nullptr);
}

constexpr SetRow setters[] = {
    {"String", [](ZlvEvent *event) { ZlvSetEventProp(event, "n", "v"); }},
    {"Bool", [](ZlvEvent *event) { ZlvSetEventPropBool(event, "n", 1); }},
    {"Int", [](ZlvEvent *event) { ZlvSetEventPropInt(event, "n", 1); }},
    {"Long", [](ZlvEvent *event) { ZlvSetEventPropLong(event, "n", 1); }},
    {"Float", [](ZlvEvent *event) { ZlvSetEventPropFloat(event, "n", 1); }},
    {"Double", [](ZlvEvent *event) { ZlvSetEventPropDouble(event, "n", 1); }},
};

INSTANTIATE_TEST_SUITE_P(Each, ZlvEventPropSetter, testing::ValuesIn(setters),
                         [](const auto &test) { return std::string(test.param.name); });

} // namespace
} // namespace zelvo_test
