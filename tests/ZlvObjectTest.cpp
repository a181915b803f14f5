// SPDX-License-Identifier: Apache-2.0
// Objects: create-or-get.
#include "support/FailAlloc.h"
#include "support/Scripted.h"
#include "support/ToolkitFixture.h"

#include "ZlvIntl.h"

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

} // namespace
} // namespace zelvo_test
