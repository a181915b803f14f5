// SPDX-License-Identifier: Apache-2.0
// Objects: create-or-get, references, name, description, the enabled flag.
#include "support/FailAlloc.h"
#include "support/Scripted.h"
#include "support/ToolkitFixture.h"
#include "support/VaList.h"

#include "ZlvEvent.h"
#include "ZlvHandler.h"
#include "ZlvIntl.h"
#include "ZlvOwned.h"

namespace zelvo_test {
namespace {

class ZlvObjectTest : public ToolkitFixture {
protected:
    void SetUp() override { open(); }
};

struct NewObject {
    const char *kind;
    const char *className;
    bool (*isInitial)(const ZlvObject *object);
};

class ZlvObjectOfKind : public ToolkitFixture, public testing::WithParamInterface<NewObject> {
protected:
    void SetUp() override { open(); }
};

TEST_P(ZlvObjectOfKind, StartsWithTheFieldsOfItsKind)
{
    EXPECT_TRUE(GetParam().isInitial(object("new", GetParam().className)));
}

TEST_P(ZlvObjectOfKind, StartsEnabledWithoutPropertiesAndVariables)
{
    ZlvObject *made = object("new", GetParam().className);
    EXPECT_EQ(made->enabled, 1);
    EXPECT_EQ(made->properties, nullptr);
    EXPECT_EQ(made->vars != nullptr, made->objClass->fAllocVars != nullptr);
}

TEST_P(ZlvObjectOfKind, StartsWithItsClassItsNameAndTwoReferences)
{
    ZlvObject *made = object("new", GetParam().className);
    EXPECT_EQ(made->objClass, zlvToolkitGetClassDef(GetParam().className));
    EXPECT_STREQ(made->name, "new");
    EXPECT_EQ(made->refCount, 2u);
}

INSTANTIATE_TEST_SUITE_P(, ZlvObjectOfKind,
                         testing::Values(NewObject{"Logger", "zlv_basiclogger",
                                                   [](const ZlvObject *o) {
                                                       return o->logger.level == 3000 &&
                                                              o->logger.listeners == nullptr;
                                                   }},
                                         NewObject{"Filter", "zlv_levelfilter",
                                                   [](const ZlvObject *o) {
                                                       return o->filter.level == 0 &&
                                                              o->filter.listeners == nullptr;
                                                   }},
                                         NewObject{"Handler", "zlv_consolehandler",
                                                   [](const ZlvObject *o) {
                                                       return o->handler.listeners == nullptr &&
                                                              o->handler.formatter != nullptr &&
                                                              o->handler.reserved == nullptr;
                                                   }},
                                         NewObject{"Formatter", "zlv_basicformatter",
                                                   [](const ZlvObject *o) {
                                                       return o->formatter.separator == nullptr &&
                                                              o->formatter.dateTimeFormat ==
                                                                  nullptr &&
                                                              o->formatter.locale == nullptr;
                                                   }}),
                         [](const auto &row) { return row.param.kind; });

TEST_F(ZlvObjectTest, ANewHandlersFormatterIsTheDefaultOne)
{
    ZlvObject *standard = formatter("zelvo.defaultFormatter");
    uint32_t count = standard->refCount;
    EXPECT_EQ(handler("new")->handler.formatter, standard);
    EXPECT_EQ(standard->refCount, count + 1) << "counted";
}

TEST_F(ZlvObjectTest, ANewHandlerMakesTheDefaultFormatterWhenThereIsNone)
{
    close();
    zlvToolkitInitObjClasses();
    ZlvObject *made = handler("new");
    ASSERT_NE(made->handler.formatter, nullptr);
    EXPECT_STREQ(made->handler.formatter->name, "zelvo.defaultFormatter");
    EXPECT_STREQ(made->handler.formatter->objClass->name, "zlv_basicformatter");
    EXPECT_EQ(made->handler.formatter->refCount, 2u) << "the registry's and the handler's";
}

TEST_F(ZlvObjectTest, TheSameNameAndClassGiveTheSameObjectWithAReference)
{
    ZlvObject *first = logger("app");
    EXPECT_EQ(logger("app"), first);
    EXPECT_EQ(first->refCount, 3u);
}

TEST_F(ZlvObjectTest, AnExistingObjectIsGotWithoutAClassName)
{
    ZlvObject *first = logger("app");
    EXPECT_EQ(object("app"), first);
    EXPECT_EQ(first->refCount, 3u);
}

TEST_F(ZlvObjectTest, ANameTakenByAnotherClassGivesNothingAndLeavesTheObjectAsItIs)
{
    ZlvObject *first = logger("app");
    setProp(first, "key", "value");
    EXPECT_EQ(ZlvGetObject("app", "zlv_levelfilter"), nullptr);
    EXPECT_EQ(first->refCount, 2u);
    EXPECT_STREQ(first->objClass->name, "zlv_basiclogger");
    EXPECT_EQ(prop(first, "key"), "value");
}

TEST_F(ZlvObjectTest, TheClassNameOfAnExistingObjectIsComparedExactly)
{
    logger("app");
    EXPECT_EQ(ZlvGetObject("app", "ZLV_BASICLOGGER"), nullptr);
}

TEST_F(ZlvObjectTest, NamesAreComparedExactly)
{
    EXPECT_NE(logger("app"), logger("APP"));
}

TEST_F(ZlvObjectTest, ANullNameGivesNothing)
{
    EXPECT_EQ(ZlvGetObject(nullptr, "zlv_basiclogger"), nullptr);
    EXPECT_EQ(ZlvGetObject(nullptr, nullptr), nullptr);
}

TEST_F(ZlvObjectTest, AnUnknownClassGivesNothing)
{
    EXPECT_EQ(ZlvGetObject("app", "unknown"), nullptr);
    EXPECT_EQ(zlvToolkitGetObjInstance("app"), nullptr);
}

TEST_F(ZlvObjectTest, AnUnknownClassDoesNotFallBackToTheConfiguration)
{
    close();
    open("app.className=zlv_basiclogger\n");
    EXPECT_EQ(ZlvGetObject("app", "unknown"), nullptr);
}

TEST_F(ZlvObjectTest, AClassNameInTheCallNeedsNoConfiguration)
{
    logger("app");
    EXPECT_EQ(ZlvLogMgrHasCfg("other"), 0);
}

TEST_F(ZlvObjectTest, WithoutAClassNameTheConfigurationNamesTheClass)
{
    close();
    open("app.className=zlv_levelfilter\n");
    ZlvObject *made = object("app");
    ASSERT_NE(made, nullptr);
    EXPECT_STREQ(made->objClass->name, "zlv_levelfilter");
}

TEST_F(ZlvObjectTest, TheClassNameIsInherited)
{
    close();
    open("app.className=zlv_levelfilter\napp.net.key=value\n");
    ZlvObject *made = object("app.net");
    ASSERT_NE(made, nullptr);
    EXPECT_STREQ(made->objClass->name, "zlv_levelfilter");
}

TEST_F(ZlvObjectTest, AConfigurationThatNamesAnUnknownClassGivesNothing)
{
    close();
    open("app.className=unknown\n");
    EXPECT_EQ(ZlvGetObject("app", nullptr), nullptr);
}

TEST_F(ZlvObjectTest, WithoutAnyClassNameNothingIsMadeButAnEmptyConfiguration)
{
    EXPECT_EQ(ZlvGetObject("app", nullptr), nullptr);
    EXPECT_EQ(zlvToolkitGetObjInstance("app"), nullptr);
    ASSERT_EQ(ZlvLogMgrHasCfg("app"), 1);
    ZlvObjCfg *cfg = ZlvLogMgrGetCfg("app");
    EXPECT_EQ(ZlvObjCfgProperties(cfg), nullptr);
    ZlvReleaseObjCfg(cfg);
}

TEST_F(ZlvObjectTest, ANewObjectGetsItsConfigurationAncestorsFirst)
{
    close();
    open("app.level=WARN\napp.logging=off\napp.net.logging=on\n");
    ZlvObject *made = logger("app.net");
    EXPECT_EQ(made->logger.level, ZLV_LEVEL_WARN);
    EXPECT_EQ(made->enabled, 1);
}

TEST_F(ZlvObjectTest, EachConfiguredPropertyReachesTheClassInTheOrderOfTheChain)
{
    close();
    open("app.one=1\napp.two=2\napp.net.three=3\napp.net.one=4\n");
    Scripted::addClasses();
    ZlvObject *made = object("app.net", Scripted::handler);
    EXPECT_EQ(Scripted::changed,
              (Names{"app.net.one", "app.net.two", "app.net.three", "app.net.one"}));
    EXPECT_EQ(prop(made, "one"), "4");
}

TEST_F(ZlvObjectTest, TheConfigurationIsAppliedToARegisteredObjectThatIsHeld)
{
    close();
    open("app.key=value\n");
    Scripted::addClasses();
    uint32_t count = 0;
    bool registered = false;
    Scripted::script.change = [&](ZlvObject *made, const std::string &) {
        ZlvObject *found = zlvToolkitGetObjInstance(made->name);
        registered = found == made;
        zlvIntlReleaseObject(found);
        count = made->refCount;
    };
    ZlvObject *made = object("app", Scripted::handler);
    EXPECT_TRUE(registered);
    EXPECT_GE(count, 2u);
    EXPECT_EQ(made->refCount, 2u);
}

TEST_F(ZlvObjectTest, AnExistingObjectIsNotConfiguredAgain)
{
    close();
    open("app.key=value\n");
    ZlvObject *made = logger("app");
    setProp(made, "key", "other");
    logger("app");
    EXPECT_EQ(prop(made, "key"), "other");
}

TEST_F(ZlvObjectTest, TheVariablesComeFromTheClassesAllocateEntry)
{
    Scripted::addClasses();
    int vars = 0;
    Scripted::script.alloc = [&] { return &vars; };
    EXPECT_EQ(object("app", Scripted::logger)->vars, &vars);
}

TEST_F(ZlvObjectTest, VariablesMayBeNone)
{
    Scripted::addClasses();
    ZlvObject *made = object("app", Scripted::logger);
    ASSERT_NE(made, nullptr);
    EXPECT_EQ(made->vars, nullptr);
}

TEST_F(ZlvObjectTest, TheNameIsTheObjectsOwnCopy)
{
    std::string name = "app";
    ZlvObject *made = logger(name.c_str());
    name[0] = 'x';
    EXPECT_EQ(taken(ZlvGetObjectName(made)), "app");
}

TEST_F(ZlvObjectTest, ObjectsCanBeMadeBeforeOpenOnceThereAreClasses)
{
    close();
    ZlvAddLoggerClass("mine", nullptr, nullptr, nullptr, nullptr, nullptr);
    EXPECT_NE(logger("early", "mine"), nullptr);
    EXPECT_NE(logger("early2"), nullptr) << "the built-in classes are there too";
}

TEST_F(ZlvObjectTest, WithoutClassesNoObjectCanBeMade)
{
    close();
    EXPECT_EQ(ZlvGetObject("early", "zlv_basiclogger"), nullptr);
    EXPECT_EQ(ZLV_TK_CLASSES, nullptr);
}

TEST_F(ZlvObjectTest, ObjectsMadeBeforeOpenAreTheSameAfterwards)
{
    close();
    zlvToolkitInitObjClasses();
    ZlvObject *early = logger("early");
    open();
    EXPECT_EQ(object("early"), early);
}

TEST_F(ZlvObjectTest, AcquiringAddsAReference)
{
    ZlvObject *app = logger("app");
    EXPECT_EQ(ZlvAcquireObject(app), app);
    EXPECT_EQ(app->refCount, 3u);
    ZlvReleaseObject(app);
}

TEST_F(ZlvObjectTest, ReleasingTakesAReferenceAway)
{
    ZlvObject *app = logger("app");
    logger("app");
    ZlvAcquireObject(app);
    ZlvReleaseObject(app);
    EXPECT_EQ(app->refCount, 3u);
}

TEST_F(ZlvObjectTest, TheLastReleaseDestroysTheObject)
{
    ZlvReleaseObject(ZlvGetObject("app", "zlv_basiclogger"));
    EXPECT_EQ(zlvToolkitGetObjInstance("app"), nullptr);
}

TEST_F(ZlvObjectTest, AFreshObjectOfAReleasedNameIsConfiguredAgain)
{
    close();
    open("app.key=value\n");
    ZlvObject *first = ZlvGetObject("app", "zlv_basiclogger");
    setProp(first, "key", "other");
    ZlvReleaseObject(first);
    EXPECT_EQ(prop(logger("app"), "key"), "value");
}

TEST_F(ZlvObjectTest, AReleasedNameCanBeTakenByAnotherClass)
{
    ZlvReleaseObject(ZlvGetObject("app", "zlv_basiclogger"));
    EXPECT_NE(filter("app"), nullptr);
}

TEST_F(ZlvObjectTest, AnObjectReleasedTooOftenIsNotDestroyedAgain)
{
    ZlvObject *app = ZlvGetObject("app", "zlv_basiclogger");
    zelvo::ApiLock lock;
    zlvIntlReleaseObject(app);
    zlvIntlReleaseObject(app);
    zlvIntlReleaseObject(app);
    EXPECT_EQ(app->objClass, nullptr) << "readable until the mutex is released";
}

TEST_F(ZlvObjectTest, AnObjectWithoutAClassIsNotReleased)
{
    ZlvObject loose{};
    loose.refCount = 2;
    ZlvReleaseObject(&loose);
    EXPECT_EQ(loose.refCount, 2u);
}

TEST_F(ZlvObjectTest, ACountThatFallsToZeroDestroysNothing)
{
    ZlvObject *app = logger("app");
    app->refCount = 1;
    zlvIntlReleaseObject(app);
    EXPECT_EQ(app->refCount, 0u);
    EXPECT_NE(app->objClass, nullptr);
    app->refCount = 2;
}

TEST_F(ZlvObjectTest, NullIsNeitherAcquiredNorReleased)
{
    EXPECT_EQ(ZlvAcquireObject(nullptr), nullptr);
    ZlvReleaseObject(nullptr);
}

TEST_F(ZlvObjectTest, TheNameIsHandedOutAsACopy)
{
    ZlvObject *app = logger("app");
    char *name = ZlvGetObjectName(app);
    EXPECT_NE(name, app->name);
    EXPECT_EQ(taken(name), "app");
}

TEST_F(ZlvObjectTest, NullHasNoName)
{
    EXPECT_EQ(ZlvGetObjectName(nullptr), nullptr);
}

TEST_F(ZlvObjectTest, TheDescriptionIsThatOfItsClassBoundToText)
{
    ZlvI18Msg *description = ZlvAllocUI18Msg(nullptr, nullptr, u"It''s a logger");
    ZlvAddLoggerClass("mine", description, nullptr, nullptr, nullptr, nullptr);
    ZlvFreeI18Msg(description);
    EXPECT_EQ(taken(ZlvGetObjectDesc(logger("app", "mine"))), u"It's a logger");
}

TEST_F(ZlvObjectTest, ADescriptionWithPlaceholdersIsBoundWithZeros)
{
    ZlvI18Msg *description = ZlvAllocUI18Msg(nullptr, nullptr, u"No. {0,number,integer}");
    ZlvAddLoggerClass("mine", description, nullptr, nullptr, nullptr, nullptr);
    ZlvFreeI18Msg(description);
    EXPECT_EQ(taken(ZlvGetObjectDesc(logger("app", "mine"))), u"No. 0");
}

TEST_F(ZlvObjectTest, AClassWithoutADescriptionGivesNone)
{
    EXPECT_EQ(ZlvGetObjectDesc(logger("app")), nullptr);
}

TEST_F(ZlvObjectTest, NullHasNoDescription)
{
    EXPECT_EQ(ZlvGetObjectDesc(nullptr), nullptr);
}

TEST_F(ZlvObjectTest, HandlesAreEqualWhenTheyAreTheSame)
{
    ZlvObject *app = logger("app");
    EXPECT_EQ(ZlvAreObjectsEqual(app, object("app")), 1);
    EXPECT_EQ(ZlvAreObjectsEqual(app, logger("other")), 0);
    EXPECT_EQ(ZlvAreObjectsEqual(app, nullptr), 0);
    EXPECT_EQ(ZlvAreObjectsEqual(nullptr, app), 0);
    EXPECT_EQ(ZlvAreObjectsEqual(nullptr, nullptr), 1);
}

TEST_F(ZlvObjectTest, IsDisabledAndEnabledAgain)
{
    ZlvObject *app = logger("app");
    EXPECT_EQ(ZlvIsObjectEnabled(app), 1);
    ZlvSetObjectEnabled(app, 0);
    EXPECT_EQ(ZlvIsObjectEnabled(app), 0);
    ZlvSetObjectEnabled(app, 1);
    EXPECT_EQ(ZlvIsObjectEnabled(app), 1);
}

TEST_F(ZlvObjectTest, AnyTruthEnables)
{
    ZlvObject *app = logger("app");
    ZlvSetObjectEnabled(app, 0);
    ZlvSetObjectEnabled(app, 2);
    EXPECT_EQ(ZlvIsObjectEnabled(app), 1);
}

TEST_F(ZlvObjectTest, NullIsNotEnabled)
{
    EXPECT_EQ(ZlvIsObjectEnabled(nullptr), 0);
    ZlvSetObjectEnabled(nullptr, 1);
    EXPECT_EQ(ZlvIsObjectEnabled(nullptr), 0);
}

TEST_F(ZlvObjectTest, WantOfMemoryMakesNoObjectAndLosesNothing)
{
    ZlvObject *app = nullptr;
    for (uint32_t allowed = 0; app == nullptr; ++allowed) {
        ASSERT_LT(allowed, 100u);
        FailAlloc fail(allowed);
        app = ZlvGetObject("app", "zlv_consolehandler");
    }
    EXPECT_EQ(keep(app)->refCount, 2u);
}

/// Asking a filter's accept entry from outside.
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
