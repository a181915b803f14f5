// SPDX-License-Identifier: Apache-2.0
// Shared, own and circular objects, and entries that act in the middle of a creation.
#include "support/DestructiveOrders.h"

namespace zelvo_test {
namespace {

TEST_F(ZlvDestructiveOrders, AListenerRegisteredBeforeItsLoggerIsClosedWithItsVariables)
{
    ZlvObject *listener = get("listener", "zlv_consolehandler");
    ZlvObject *app = get("app", "zlv_basiclogger");
    ZlvAddListener(app, listener);
    ZlvReleaseObject(listener);
    ZlvReleaseObject(app);
    EXPECT_FALSE(exists("listener"));
}

TEST_F(ZlvDestructiveOrders, AListenerRegisteredBeforeItsLoggerSurvivesUntilClose)
{
    ZlvObject *listener = get("listener", Scripted::handler);
    ZlvObject *app = get("app", "zlv_basiclogger");
    ZlvAddListener(app, listener);
    ZlvReleaseObject(listener);
    close();
    EXPECT_EQ(Scripted::closed, Names{"listener"});
}

TEST_F(ZlvDestructiveOrders, AHandlerSharedByTwoLoggersOutlivesTheFirst)
{
    ZlvObject *one = get("one", "zlv_basiclogger");
    ZlvObject *two = logger("two");
    ZlvObject *shared = addOwn(one, "shared");
    ZlvAddListener(two, shared);
    ZlvReleaseObject(one);
    log(two, u"text");
    EXPECT_EQ(Scripted::processed, Names{"shared"});
}

TEST_F(ZlvDestructiveOrders, AHandlerSharedByTwoLoggersIsClosedOnce)
{
    ZlvObject *one = get("one", "zlv_basiclogger");
    ZlvObject *two = get("two", "zlv_basiclogger");
    ZlvAddListener(two, addOwn(one, "shared"));
    close();
    EXPECT_EQ(Scripted::closed, Names{"shared"});
}

TEST_F(ZlvDestructiveOrders, AFormatterSharedByTwoHandlersOutlivesTheFirst)
{
    ZlvObject *one = get("one", "zlv_consolehandler");
    ZlvObject *two = handler("two");
    ZlvObject *format = get("format", "zlv_basicformatter");
    ZlvHandlerSetFormatter(one, format);
    ZlvHandlerSetFormatter(two, format);
    ZlvReleaseObject(format);
    ZlvReleaseObject(one);
    EXPECT_EQ(keep(ZlvHandlerGetFormatter(two)), format);
}

TEST_F(ZlvDestructiveOrders, SettingTheFormatterThatOnlyThisHandlerHoldsKeepsIt)
{
    ZlvObject *console = handler("console");
    ZlvObject *format = get("format", "zlv_basicformatter");
    ZlvHandlerSetFormatter(console, format);
    ZlvReleaseObject(format);
    ZlvHandlerSetFormatter(console, format);
    EXPECT_TRUE(exists("format"));
    EXPECT_EQ(format->refCount, 2u);
}

TEST_F(ZlvDestructiveOrders, NamingTheSameFormatterAgainKeepsIt)
{
    reopen("out.className=zlv_consolehandler\nout.formatterName=format\n"
           "format.className=zlv_basicformatter\n");
    ZlvObject *out = object("out");
    ZlvObject *format = out->handler.formatter;
    setProp(out, "formatterName", "format");
    EXPECT_EQ(out->handler.formatter, format);
    EXPECT_EQ(format->refCount, 2u);
}

TEST_F(ZlvDestructiveOrders, NamingTheSameListenersAgainMakesThemAfresh)
{
    reopen("app.listenerNames=one two\none.className=test_scripted_handler\n"
           "two.className=test_scripted_handler\n");
    ZlvObject *app = logger("app");
    setProp(app, "listenerNames", "one two");
    EXPECT_EQ(Scripted::closed, (Names{"one", "two"}));
    EXPECT_EQ(listeners(app), (Names{"one", "two"}));
}

TEST_F(ZlvDestructiveOrders, AnObjectNamedInItsOwnListenerNamesEndsItsDispatch)
{
    reopen("self.className=zlv_levelfilter\nself.listenerNames=self below\n"
           "below.className=test_recorder\n");
    ZlvObject *app = logger("app");
    ZlvAddListener(app, object("self"));
    log(app, u"text");
    EXPECT_EQ(Recorder::order(), Names{"below"});
}

TEST_F(ZlvDestructiveOrders, AnObjectThatListensToItselfIsFreedAtClose)
{
    reopen("self.className=test_scripted_handler\nself.listenerNames=self\n");
    get("self", nullptr);
    close();
    EXPECT_EQ(ZLV_TK_INSTANCES, nullptr);
}

TEST_F(ZlvDestructiveOrders, AnObjectThatListensToItselfIsFreedAtCloseThoughNobodyHoldsIt)
{
    reopen("self.className=test_scripted_handler\nself.listenerNames=self\n");
    ZlvReleaseObject(get("self", nullptr));
    EXPECT_TRUE(exists("self")) << "it holds itself";
    close();
    EXPECT_EQ(ZLV_TK_INSTANCES, nullptr);
}

TEST_F(ZlvDestructiveOrders, ListenerNamesThatAChildInheritsMakeItItsParentsListenersListener)
{
    reopen("app.listenerNames=app.out\napp.out.className=test_recorder\n");
    ZlvObject *app = logger("app");
    EXPECT_EQ(listeners(app), Names{"app.out"});
    EXPECT_EQ(listeners(object("app.out")), Names{"app.out"}) << "inherited, so its own listener";
    log(app, u"text");
    EXPECT_EQ(Recorder::order(), Names{"app.out"});
}

TEST_F(ZlvDestructiveOrders, AConsoleThatInheritsItsOwnNameAsListenerPrintsOnce)
{
    reopen("app.listenerNames=app.out\napp.out.className=zlv_consolehandler\n"
           "app.out.formatterName=plain\nplain.className=zlv_basicformatter\n"
           "plain.dateTimeFormat='x'\n");
    ZlvObject *app = logger("app");
    EXPECT_EQ(console([&] { log(app, u"text"); }), "x text\n\n");
}

TEST_F(ZlvDestructiveOrders, AChildMayClearTheListenerNamesThatItInherits)
{
    reopen("app.listenerNames=app.out\napp.out.className=test_recorder\n"
           "app.out.listenerNames=\n");
    ZlvObject *app = logger("app");
    EXPECT_EQ(listeners(object("app.out")), Names{});
    log(app, u"text");
    EXPECT_EQ(Recorder::order(), Names{"app.out"});
}

TEST_F(ZlvDestructiveOrders, AnAllocateEntryCreatesTheVeryObjectBeingCreated)
{
    Scripted::script.alloc = []() -> void * {
        Scripted::script.alloc = nullptr;
        return zlvIntlGetObject("app", Scripted::logger);
    };
    ZlvObject *outer = keep(get("app", Scripted::logger));
    ASSERT_NE(outer, nullptr);
    EXPECT_EQ(outer, object("app")) << "one object of that name";
    EXPECT_EQ(outer->vars, nullptr) << "the one that was registered first";
    ZlvReleaseObject(outer);
}

TEST_F(ZlvDestructiveOrders, AnAllocateEntryCreatesTheObjectAsOneOfAnotherClass)
{
    Scripted::script.alloc = []() -> void * {
        Scripted::script.alloc = nullptr;
        return zlvIntlGetObject("app", "zlv_basiclogger");
    };
    EXPECT_EQ(get("app", Scripted::logger), nullptr) << "the name is taken by then";
    EXPECT_STREQ(keep(object("app"))->objClass->name, "zlv_basiclogger");
    ZlvReleaseObject(object("app"));
}

TEST_F(ZlvDestructiveOrders, AConfigurationChangeReleasesTheObjectBeingConfigured)
{
    reopen("app.one=1\napp.two=2\n");
    Scripted::script.change = [](ZlvObject *self, const std::string &) {
        zlvIntlReleaseObject(zlvIntlAcquireObject(self));
    };
    EXPECT_EQ(object("app", Scripted::handler)->refCount, 2u);
}

TEST_F(ZlvDestructiveOrders, AConfigurationChangeSetsAnotherProperty)
{
    reopen("app.one=1\napp.two=2\n");
    Scripted::script.change = [](ZlvObject *self, const std::string &name) {
        if (name == "one")
            zlvIntlSetObjProp(self, "three", "3");
    };
    EXPECT_EQ(prop(object("app", Scripted::handler), "three"), "3");
}

TEST_F(ZlvDestructiveOrders, AConfigurationChangeGivesTheLastReferenceBack)
{
    ZlvObject *app = get("app", Scripted::handler);
    Scripted::script.change = [](ZlvObject *self, const std::string &) {
        zlvIntlReleaseObject(self);
    };
    ZlvSetObjProp(app, "key", "value");
    EXPECT_FALSE(exists("app"));
}

TEST_F(ZlvDestructiveOrders, AConfigurationChangeRemovesTheConfigurationBeingApplied)
{
    reopen("app.one=1\napp.two=2\n");
    Scripted::script.change = [](ZlvObject *, const std::string &) {
        zelvo::CfgRef cfg{zlvIntlLogMgrGetCfg("app")};
        zlvIntlLogMgrRemCfg(cfg.get());
    };
    ZlvObject *app = object("app", Scripted::handler);
    EXPECT_EQ(prop(app, "two"), "2");
}

TEST_F(ZlvDestructiveOrders, ObjectsThatTheApplicationHoldsTwiceAreFreedAtClose)
{
    for (const char *name : {"one", "two"}) {
        ZlvAcquireObject(get(name, Scripted::handler));
        get(name, Scripted::handler);
    }
    close();
    EXPECT_EQ(ZLV_TK_INSTANCES, nullptr);
}

TEST_F(ZlvDestructiveOrders, ObjectsHeldTwiceThatListenToEachOtherAreFreedAtClose)
{
    ZlvObject *one = get("one", Scripted::filter);
    ZlvObject *two = get("two", Scripted::filter);
    ZlvAcquireObject(one);
    ZlvAddListener(one, two);
    ZlvAddListener(two, one);
    close();
    EXPECT_EQ(ZLV_TK_INSTANCES, nullptr);
}

TEST_F(ZlvDestructiveOrders, CyclicListenersThatNobodyHoldsAreFreedAtClose)
{
    ZlvObject *one = get("one", "zlv_levelfilter");
    ZlvObject *two = get("two", "zlv_levelfilter");
    ZlvAddListener(one, two);
    ZlvAddListener(two, one);
    ZlvReleaseObject(one);
    ZlvReleaseObject(two);
    EXPECT_TRUE(exists("one") && exists("two"));
    close();
    EXPECT_EQ(ZLV_TK_INSTANCES, nullptr);
}

TEST_F(ZlvDestructiveOrders, ACircleOfListenersCanBeUndone)
{
    ZlvObject *one = get("one", "zlv_levelfilter");
    ZlvObject *two = get("two", "zlv_levelfilter");
    ZlvAddListener(one, two);
    ZlvAddListener(two, one);
    ZlvReleaseObject(two);
    setProp(one, "listenerNames", "");
    ZlvReleaseObject(one);
    EXPECT_FALSE(exists("one") || exists("two"));
}

TEST_F(ZlvDestructiveOrders, AFailedOpenLeavesNothingForTheNext)
{
    close();
    EXPECT_EQ(tryOpen("app.listenerNames=out\nout.className=zlv_consolehandler\nx=1\n"), 0);
    EXPECT_EQ(ZLV_TK_CFG_DATA, nullptr);
    open();
    EXPECT_EQ(listeners(logger("app")), Names{});
}

} // namespace
} // namespace zelvo_test
