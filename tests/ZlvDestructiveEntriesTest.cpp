// SPDX-License-Identifier: Apache-2.0
// Entries that act in the middle of a release or of close.
#include "support/DestructiveOrders.h"

namespace zelvo_test {
namespace {

/// What entries do in the middle of a release or of close: each row does its deed in a close entry
/// and in a free entry.
struct Deed {
    const char *name;
    void (*act)();
};

class ZlvEntriesDuringTheEnd : public ZlvDestructiveOrders,
                               public testing::WithParamInterface<Deed> {
protected:
    void SetUp() override
    {
        ZlvDestructiveOrders::SetUp();
        get("early", Scripted::handler);
        ZlvObject *app = get("app", "zlv_basiclogger");
        addOwn(app, "listener");
        victim_ = get("victim", Scripted::handler);
        get("late", Scripted::logger);
    }

    /// Every object has variables, so that the free entries run in the first pass of close.
    static void *someVars()
    {
        static int vars;
        return &vars;
    }

    ZlvObject *victim_ = nullptr;
};

TEST_P(ZlvEntriesDuringTheEnd, ActInTheCloseEntryOfAReleasedObject)
{
    Scripted::script.close = [](ZlvObject *) { GetParam().act(); };
    ZlvReleaseObject(victim_);
    EXPECT_FALSE(exists("victim"));
    Scripted::script = Script{};
}

TEST_P(ZlvEntriesDuringTheEnd, ActInTheFreeEntryOfAReleasedObject)
{
    Scripted::script.free = [](void *) { GetParam().act(); };
    ZlvReleaseObject(victim_);
    EXPECT_FALSE(exists("victim"));
    Scripted::script = Script{};
}

TEST_P(ZlvEntriesDuringTheEnd, ActInTheCloseEntriesAtClose)
{
    Scripted::script.close = [](ZlvObject *) { GetParam().act(); };
    close();
    EXPECT_EQ(ZLV_TK_INSTANCES, nullptr);
    EXPECT_GE(Scripted::closed.size(), 3u);
}

TEST_P(ZlvEntriesDuringTheEnd, ActInTheFreeEntriesAtClose)
{
    Scripted::script.alloc = [] { return someVars(); };
    get("variables", Scripted::logger);
    get("moreVariables", Scripted::formatter);
    Scripted::script.alloc = nullptr;
    Scripted::script.free = [](void *) { GetParam().act(); };
    close();
    EXPECT_EQ(ZLV_TK_INSTANCES, nullptr);
}

INSTANTIATE_TEST_SUITE_P(
    , ZlvEntriesDuringTheEnd,
    testing::Values(
        Deed{"LookUp",
             [] {
                 for (const char *name : {"early", "app", "listener", "victim", "late", "unknown"})
                     zlvIntlReleaseObject(zlvToolkitGetObjInstance(name));
             }},
        Deed{"Create",
             [] {
                 static int number;
                 std::string name = "created" + std::to_string(++number % 8);
                 zlvIntlReleaseObject(zlvIntlGetObject(name.c_str(), "zlv_consolehandler"));
             }},
        Deed{"CreateAndKeep",
             [] {
                 static int number;
                 std::string name = "kept" + std::to_string(++number % 8);
                 zlvIntlGetObject(name.c_str(), "zlv_consolehandler");
             }},
        Deed{"CreateFromConfiguration",
             [] { zlvIntlReleaseObject(zlvIntlGetObject("configured", nullptr)); }},
        Deed{"ReleaseAnother",
             [] {
                 if (ZlvObject *early = zlvToolkitGetObjInstance("early")) {
                     zlvIntlReleaseObject(early);
                     zlvIntlReleaseObject(early);
                 }
             }},
        Deed{"ReleaseTheLoggerWithItsListener",
             [] {
                 if (ZlvObject *app = zlvToolkitGetObjInstance("app")) {
                     zlvIntlReleaseObject(app);
                     zlvIntlReleaseObject(app);
                 }
             }},
        Deed{"DropTheLoggersListeners",
             [] {
                 zelvo::ObjectRef app{zlvToolkitGetObjInstance("app")};
                 zlvIntlSetObjProp(app.get(), "listenerNames", "");
             }},
        Deed{"AddAListener",
             [] {
                 zelvo::ObjectRef app{zlvToolkitGetObjInstance("app")};
                 zelvo::ObjectRef early{zlvToolkitGetObjInstance("early")};
                 zlvIntlAddListener(app.get(), early.get());
             }},
        Deed{"SetAFormatter",
             [] {
                 zelvo::ObjectRef early{zlvToolkitGetObjInstance("early")};
                 zelvo::ObjectRef format{
                     zlvIntlGetObject("zelvo.defaultFormatter", "zlv_basicformatter")};
                 zlvIntlHandlerSetFormatter(early.get(), format.get());
             }},
        Deed{"Log",
             [] {
                 zelvo::ObjectRef app{zlvToolkitGetObjInstance("app")};
                 zlvLogUDebugEntry(app.get(), ZLV_LEVEL_INFO, nullptr, nullptr, 0, u"text",
                                   nullptr);
             }}),
    [](const auto &row) { return row.param.name; });

} // namespace
} // namespace zelvo_test
