// SPDX-License-Identifier: Apache-2.0
// Handles of objects hold references, copy and give them back.
#include "CppTest.h"

namespace zelvo_test {
namespace {

/// Whether an object of that name exists, which its class would otherwise be made for.
bool exists(const char *name)
{
    return bool(zelvo::Object(name));
}

} // namespace

using CppObject = CppTest;

TEST_F(CppObject, LivesAsLongAsAHandleHoldsIt)
{
    zelvo::Object object("held", "zlv_basicformatter");
    EXPECT_TRUE(exists("held"));
    object.reset();
    EXPECT_FALSE(object);
    EXPECT_FALSE(exists("held"));
}

TEST_F(CppObject, ACopyHoldsItToo)
{
    zelvo::Object first("held", "zlv_basicformatter");
    {
        const zelvo::Object second = first;
        EXPECT_TRUE(first == second);
        first.reset();
        EXPECT_TRUE(exists("held"));
        EXPECT_TRUE(first != second);
    }
    EXPECT_FALSE(exists("held"));
}

TEST_F(CppObject, MovingHandsTheReferenceOn)
{
    zelvo::Object first("held", "zlv_basicformatter");
    ZlvObject *record = first.get();
    zelvo::Object second = std::move(first);
    EXPECT_EQ(first.get(), nullptr);
    EXPECT_EQ(second.get(), record);
    second = zelvo::Object("other", "zlv_basicformatter");
    EXPECT_FALSE(exists("held"));
    EXPECT_TRUE(exists("other"));
}

TEST_F(CppObject, AssigningToItselfKeepsIt)
{
    zelvo::Object object("held", "zlv_basicformatter");
    const zelvo::Object &same = object;
    object = same;
    EXPECT_TRUE(object);
    EXPECT_TRUE(exists("held"));
}

TEST_F(CppObject, ReleasedReferencesAreTheCallers)
{
    zelvo::Object object("held", "zlv_basicformatter");
    ZlvObject *record = object.release();
    EXPECT_FALSE(object);
    EXPECT_TRUE(exists("held"));
    ZlvReleaseObject(record);
    EXPECT_FALSE(exists("held"));
}

TEST_F(CppObject, AdoptTakesAReferenceOverAndShareAddsOne)
{
    ZlvObject *record = ZlvGetObject("held", "zlv_basicformatter");
    zelvo::Object shared = zelvo::Object::share(record);
    zelvo::Object adopted = zelvo::Object::adopt(record);
    EXPECT_TRUE(shared == adopted);
    adopted.reset();
    EXPECT_TRUE(exists("held"));
    shared.reset();
    EXPECT_FALSE(exists("held"));
}

TEST_F(CppObject, IsEmptyWithoutAnObjectOfTheClass)
{
    EXPECT_FALSE(zelvo::Object("app", "zlv_consolehandler"));
    EXPECT_FALSE(zelvo::Object("new", "no such class"));
    EXPECT_FALSE(zelvo::Object(nullptr));
}

TEST_F(CppObject, AKindIsNeverHeldAsAnother)
{
    const zelvo::Object console("console", "zlv_consolehandler");
    EXPECT_FALSE(zelvo::Logger("console"));
    EXPECT_FALSE(zelvo::Logger(console));
    EXPECT_TRUE(zelvo::Handler(console));
    EXPECT_FALSE(zelvo::Handler("app"));
    EXPECT_FALSE(zelvo::MemoryHandler("console"));
    EXPECT_TRUE(exists("console"));
}

TEST_F(CppObject, AnEmptyHandleDoesNothing)
{
    const zelvo::Handler none;
    none.setProperty("level", "ALL");
    none.addListener(app_);
    none.setFormatter(app_);
    none.setEnabled(true);
    EXPECT_FALSE(none.name());
    EXPECT_FALSE(none.enabled());
    EXPECT_FALSE(none.property("level"));
    EXPECT_FALSE(none.formatter());
    EXPECT_TRUE(none.listeners().empty());
}

TEST_F(CppObject, TellsItsName)
{
    EXPECT_EQ(app_.name().view(), "app");
    EXPECT_FALSE(app_.description());
}

TEST_F(CppObject, PropertiesKeepTheirTypes)
{
    app_.setProperty("truth", true);
    app_.setProperty("number", 42);
    app_.setProperty("single", 0.5F);
    app_.setProperty("double", 0.25);
    app_.setProperty("long", "12345678901");
    EXPECT_EQ(app_.property<bool>("truth"), true);
    EXPECT_EQ(app_.property<int32_t>("number"), 42);
    EXPECT_EQ(app_.property<float>("single"), 0.5F);
    EXPECT_EQ(app_.property<double>("double"), 0.25);
    EXPECT_EQ(app_.property<int64_t>("long"), 12345678901);
    EXPECT_EQ(app_.property("number").view(), "42");
    app_.setProperty("level", ZLV_LEVEL_WARN);
    EXPECT_EQ(app_.property<int32_t>("level"), ZLV_LEVEL_WARN);
}

TEST_F(CppObject, APropertyThatIsMissingOrDoesNotConvertGivesNothing)
{
    app_.setProperty("text", "abc");
    EXPECT_EQ(app_.property<int32_t>("text"), std::nullopt);
    EXPECT_EQ(app_.property<bool>("absent"), std::nullopt);
    EXPECT_FALSE(app_.property("absent"));
    app_.setProperty("text", nullptr);
    EXPECT_FALSE(app_.property("text"));
}

TEST_F(CppObject, ListsAndDropsItsListeners)
{
    const zelvo::Handler second("second", "zlv_consolehandler");
    app_.addListener(second);
    const auto listeners = app_.listeners();
    ASSERT_EQ(listeners.size(), 2U);
    EXPECT_TRUE(listeners[0] == memory_);
    EXPECT_TRUE(listeners[1] == second);
    app_.removeListener(memory_);
    EXPECT_EQ(app_.listeners().size(), 1U);
}

TEST_F(CppObject, AHandlerHasOneFormatter)
{
    const zelvo::Object format("format", "zlv_basicformatter");
    memory_.setFormatter(format);
    EXPECT_TRUE(memory_.formatter() == format);
    memory_.setFormatter(zelvo::Object());
    EXPECT_FALSE(memory_.formatter());
}

TEST_F(CppObject, CanBeDisabled)
{
    EXPECT_TRUE(app_.enabled());
    app_.setEnabled(false);
    EXPECT_FALSE(app_.enabled());
    app_.text(u"no");
    EXPECT_EQ(memory_.count(), 0U);
}

} // namespace zelvo_test
