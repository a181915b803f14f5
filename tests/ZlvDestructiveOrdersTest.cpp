// SPDX-License-Identifier: Apache-2.0
// Destructive orders of events: every test here is one that a walk or a count could fall over.
// Under the address sanitizer none of them may give a report.
#include "support/HeapInUse.h"
#include "support/Recorder.h"
#include "support/Scripted.h"

#include "ZlvHandler.h"
#include "ZlvOwned.h"

namespace zelvo_test {
namespace {

class ZlvDestructiveOrders : public ToolkitFixture {
protected:
    void SetUp() override
    {
        open();
        addClasses();
    }

    static void addClasses()
    {
        Recorder::addClass();
        Scripted::addClasses();
    }

    /// Closes and opens with the text PROPERTIES.
    void reopen(const std::string &properties)
    {
        close();
        open(properties);
        addClasses();
    }

    static bool exists(const char *name)
    {
        return zlvIntlStringToObjMapHasKey(ZLV_TK_INSTANCES, name) == 1;
    }
    static ZlvObject *get(const char *name, const char *className)
    {
        return ZlvGetObject(name, className);
    }
    /// Makes an object that only OBJECT holds, as its listener.
    static ZlvObject *addOwn(ZlvObject *object, const char *name,
                             const char *className = Scripted::handler)
    {
        ZlvObject *listener = get(name, className);
        ZlvAddListener(object, listener);
        ZlvReleaseObject(listener);
        return listener;
    }
};

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

/// The logger "app" with the listeners "first" and "second", which nobody but it holds.
class ZlvChangesWhileDispatching : public ZlvDestructiveOrders {
protected:
    void SetUp() override
    {
        ZlvDestructiveOrders::SetUp();
        app_ = get("app", "zlv_basiclogger");
        first_ = addOwn(app_, "first");
        second_ = addOwn(app_, "second");
    }
    void TearDown() override
    {
        if (app_ != nullptr)
            ZlvReleaseObject(app_);
        ZlvDestructiveOrders::TearDown();
    }

    /// Logs one text, during which the listener NAME does STEP.
    void logWhile(const std::string &name, const std::function<void()> &step)
    {
        Scripted::script.process = [name, step](ZlvObject *self, ZlvEvent *) {
            if (self->name == name)
                step();
        };
        log(app_, u"text");
    }

    /// What a class function does to make and add a listener that only the logger holds.
    void append(const char *name) const
    {
        ZlvObject *made = zlvIntlGetObject(name, Scripted::handler);
        zlvIntlAddListener(app_, made);
        zlvIntlReleaseObject(made);
    }

    ZlvObject *app_ = nullptr;
    ZlvObject *first_ = nullptr;
    ZlvObject *second_ = nullptr;
};

TEST_F(ZlvChangesWhileDispatching, AListenerResetsTheListeners)
{
    logWhile("first", [&] { zlvIntlSetObjProp(app_, "listenerNames", ""); });
    EXPECT_EQ(Scripted::processed, Names{"first"});
    EXPECT_EQ(Scripted::closed, (Names{"second", "first"})) << "the one being called ends last";
    EXPECT_EQ(listeners(app_), Names{});
}

TEST_F(ZlvChangesWhileDispatching, AListenerResetsTheListenersToItself)
{
    ZlvObjCfg *cfg = ZlvLogMgrGetCfg("first");
    ZlvSetObjCfgProp(cfg, "className", Scripted::handler);
    ZlvReleaseObjCfg(cfg);
    logWhile("first", [&] { zlvIntlSetObjProp(app_, "listenerNames", "first"); });
    EXPECT_EQ(listeners(app_), Names{"first"});
    EXPECT_FALSE(exists("second"));
}

TEST_F(ZlvChangesWhileDispatching, AListenerRemovesItself)
{
    logWhile("first", [&] { zlvIntlRemListener(app_, first_); });
    EXPECT_EQ(Scripted::processed, (Names{"first", "second"}));
    EXPECT_EQ(Scripted::closed, Names{"first"});
    EXPECT_EQ(listeners(app_), Names{"second"});
}

TEST_F(ZlvChangesWhileDispatching, AListenerRemovesTheNextOne)
{
    logWhile("first", [&] { zlvIntlRemListener(app_, second_); });
    EXPECT_EQ(Scripted::processed, Names{"first"});
    EXPECT_EQ(listeners(app_), Names{"first"});
}

TEST_F(ZlvChangesWhileDispatching, AListenerRemovesThePreviousOne)
{
    logWhile("second", [&] { zlvIntlRemListener(app_, first_); });
    EXPECT_EQ(Scripted::processed, (Names{"first", "second"}));
    EXPECT_EQ(listeners(app_), Names{"second"});
}

TEST_F(ZlvChangesWhileDispatching, AListenerRemovesItselfAndTheNextOne)
{
    addOwn(app_, "third");
    logWhile("first", [&] {
        zlvIntlRemListener(app_, first_);
        zlvIntlRemListener(app_, second_);
    });
    EXPECT_EQ(Scripted::processed, (Names{"first", "third"}));
    EXPECT_EQ(listeners(app_), Names{"third"});
}

TEST_F(ZlvChangesWhileDispatching, AListenerRemovesTheNextOneAndThenItself)
{
    addOwn(app_, "third");
    logWhile("first", [&] {
        zlvIntlRemListener(app_, second_);
        zlvIntlRemListener(app_, first_);
    });
    EXPECT_EQ(Scripted::processed, (Names{"first", "third"}));
    EXPECT_EQ(listeners(app_), Names{"third"});
}

TEST_F(ZlvChangesWhileDispatching, AListenerAppendsAnother)
{
    logWhile("first", [&] { append("third"); });
    EXPECT_EQ(Scripted::processed, (Names{"first", "second", "third"}));
}

TEST_F(ZlvChangesWhileDispatching, TheLastListenerAppendsAnother)
{
    logWhile("second", [&] { append("third"); });
    EXPECT_EQ(Scripted::processed, (Names{"first", "second", "third"}));
}

TEST_F(ZlvChangesWhileDispatching, TheLastListenerRemovesItselfAndAppendsAnother)
{
    logWhile("second", [&] {
        zlvIntlRemListener(app_, second_);
        append("third");
    });
    EXPECT_EQ(Scripted::closed, Names{"second"});
    EXPECT_EQ(listeners(app_), (Names{"first", "third"}));
    EXPECT_EQ(Scripted::processed, (Names{"first", "second", "third"}));
}

TEST_F(ZlvChangesWhileDispatching, TheLastListenerAppendsAnotherAndRemovesItself)
{
    logWhile("second", [&] {
        append("third");
        zlvIntlRemListener(app_, second_);
    });
    EXPECT_EQ(Scripted::processed, (Names{"first", "second", "third"}));
}

TEST_F(ZlvChangesWhileDispatching, AListenerIsRemovedAndAddedAgainAtTheEnd)
{
    logWhile("first", [&, done = std::make_shared<bool>(false)] {
        if (std::exchange(*done, true))
            return;
        zlvIntlAcquireObject(first_);
        zlvIntlRemListener(app_, first_);
        zlvIntlAddListener(app_, first_);
        zlvIntlReleaseObject(first_);
    });
    EXPECT_EQ(listeners(app_), (Names{"second", "first"}));
    EXPECT_EQ(Scripted::processed, (Names{"first", "second", "first"}));
}

TEST_F(ZlvChangesWhileDispatching, AListenerReleasesTheLogger)
{
    logWhile("first", [&] { zlvIntlReleaseObject(std::exchange(app_, nullptr)); });
    EXPECT_FALSE(exists("app") || exists("first") || exists("second"));
    EXPECT_EQ(Scripted::closed.size(), 2u);
}

TEST_F(ZlvChangesWhileDispatching, AListenerDisablesTheLogger)
{
    logWhile("first", [&] { zlvIntlSetObjectEnabled(app_, 0); });
    EXPECT_EQ(Scripted::processed, (Names{"first", "second"})) << "asked once, at the start";
}

TEST_F(ZlvChangesWhileDispatching, AListenerLogsToTheSameLogger)
{
    logWhile("first", [&] {
        if (Scripted::processed.size() == 1)
            zlvLogUDebugEntry(app_, ZLV_LEVEL_INFO, nullptr, nullptr, 0, u"inner", nullptr);
    });
    EXPECT_EQ(Scripted::processed, (Names{"first", "first", "second", "second"}));
}

TEST_F(ZlvChangesWhileDispatching, AListenerDestroysAFilterThatIsPassingTheEventOn)
{
    ZlvObject *between = get("between", "zlv_levelfilter");
    addOwn(between, "below");
    addOwn(between, "beside");
    ZlvAddListener(app_, between);
    ZlvReleaseObject(between);
    logWhile("below", [&] { zlvIntlRemListener(app_, between); });
    EXPECT_FALSE(exists("between") || exists("below") || exists("beside"));
    EXPECT_EQ(Scripted::processed[2], "below");
}

TEST_F(ZlvChangesWhileDispatching, AListenerReplacesTheFormatterThatIsFormatting)
{
    ZlvObject *out = handler("out");
    static ZlvObject *target;
    target = out;
    ZlvAddUFormatterClass(
        "suicidal", nullptr, nullptr, nullptr, nullptr,
        [](ZlvObject *, ZlvEvent *event, va_list args) {
            zlvIntlHandlerSetFormatter(target, nullptr);
            return ZlvBindEventUMsg(event, zlvIntlBindUI18Msg, args);
        },
        nullptr, nullptr, nullptr);
    ZlvObject *format = get("format", "suicidal");
    ZlvHandlerSetFormatter(out, format);
    ZlvReleaseObject(format);
    ZlvAddListener(app_, out);
    EXPECT_EQ(console([&] { log(app_, u"text"); }), "text\n");
    EXPECT_FALSE(exists("format"));
}

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

/// Two configurations that are each other's parent.
class ZlvCyclicParents : public ZlvDestructiveOrders {
protected:
    void SetUp() override
    {
        ZlvDestructiveOrders::SetUp();
        one_ = ZlvLogMgrGetCfg("one");
        two_ = ZlvLogMgrGetCfg("two");
        ZlvObjCfgSetParent(one_, two_);
        ZlvObjCfgSetParent(two_, one_);
        ZlvSetObjCfgProp(two_, "key", "value");
    }
    void TearDown() override
    {
        ZlvReleaseObjCfg(one_);
        ZlvReleaseObjCfg(two_);
        ZlvDestructiveOrders::TearDown();
    }

    ZlvObjCfg *one_ = nullptr;
    ZlvObjCfg *two_ = nullptr;
};

TEST_F(ZlvCyclicParents, EndALookupThatFindsNothing)
{
    ZlvBool found = 7;
    EXPECT_EQ(ZlvGetObjCfgProp(one_, "absent", &found), nullptr);
    EXPECT_EQ(found, 0);
}

TEST_F(ZlvCyclicParents, StillInherit)
{
    EXPECT_EQ(taken(ZlvGetObjCfgProp(one_, "key", nullptr)), "value");
}

TEST_F(ZlvCyclicParents, EndAnApplication)
{
    ZlvObject *app = logger("app");
    EXPECT_EQ(ZlvLogMgrApplyCfg(app, "one"), 1);
    EXPECT_EQ(prop(app, "key"), "value");
}

TEST_F(ZlvCyclicParents, EndTheCreationOfAnObject)
{
    EXPECT_EQ(prop(logger("one"), "key"), "value");
    EXPECT_EQ(ZlvGetObject("two", nullptr), nullptr) << "no class name anywhere in the circle";
}

TEST_F(ZlvDestructiveOrders, AConfigurationThatIsItsOwnParentEndsLookups)
{
    ZlvObjCfg *self = ZlvLogMgrGetCfg("self");
    ZlvObjCfgSetParent(self, self);
    EXPECT_EQ(ZlvGetObjCfgProp(self, "absent", nullptr), nullptr);
    EXPECT_EQ(ZlvLogMgrApplyCfg(logger("app"), "self"), 1);
    ZlvReleaseObjCfg(self);
}

TEST_F(ZlvDestructiveOrders, AFailedOpenLeavesNothingForTheNext)
{
    close();
    EXPECT_EQ(tryOpen("app.listenerNames=out\nout.className=zlv_consolehandler\nx=1\n"), 0);
    EXPECT_EQ(ZLV_TK_CFG_DATA, nullptr);
    open();
    EXPECT_EQ(listeners(logger("app")), Names{});
}

/// One whole life of the toolkit with some of everything.
void liveOnce(const char *path)
{
    ASSERT_EQ(ZlvOpenToolkit(path, nullptr), 1);
    ZlvObject *app = ZlvGetObject("app", "zlv_basiclogger");
    ZlvSetObjProp(app, "key", "value");
    ZlvAcquireObject(app);
    ZlvLogUText(app, u"text");
    ZlvGetObject("filter", "zlv_levelfilter");
    ZlvCloseToolkit();
}

TEST_F(ZlvDestructiveOrders, AThousandLivesLeaveMemoryAndDescriptorsFlat)
{
    close();
    write("life.properties", "app.listenerNames=out\nout.className=zlv_consolehandler\n"
                             "out.logging=off\nout.formatterName=format\n"
                             "format.className=zlv_basicformatter\nformat.locale=de\n");
    for (int warmUp = 0; warmUp < 10; ++warmUp)
        liveOnce("life.properties");
    auto descriptors = openDescriptors();
    size_t before = heapInUse();
    for (int life = 0; life < 1000; ++life)
        liveOnce("life.properties");
    EXPECT_EQ(openDescriptors(), descriptors);
    EXPECT_LE(heapInUse(), before + 1024) << "less than two bytes a life";
}

TEST_F(ZlvDestructiveOrders, AHundredFailedLivesLeaveMemoryAndDescriptorsFlat)
{
    close();
    for (int warmUp = 0; warmUp < 10; ++warmUp)
        EXPECT_EQ(tryOpen("app.level=WARN\nx=1\n"), 0);
    auto descriptors = openDescriptors();
    size_t before = heapInUse();
    for (int life = 0; life < 100; ++life)
        EXPECT_EQ(ZlvOpenToolkit("zelvo.properties", nullptr), 0);
    EXPECT_EQ(openDescriptors(), descriptors);
    EXPECT_LE(heapInUse(), before + 99);
}

} // namespace
} // namespace zelvo_test
