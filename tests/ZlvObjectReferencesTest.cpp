// SPDX-License-Identifier: Apache-2.0
// References to objects, and what an object says of itself.
#include "support/ToolkitFixture.h"

#include "ZlvI18Msg.h"
#include "ZlvIntl.h"
#include "ZlvOwned.h"

namespace zelvo_test {
namespace {

class ZlvObjectReferences : public ToolkitFixture {
protected:
    void SetUp() override { open(); }
};

TEST_F(ZlvObjectReferences, AcquiringAddsAReference)
{
    ZlvObject *app = logger("app");
    EXPECT_EQ(ZlvAcquireObject(app), app);
    EXPECT_EQ(app->refCount, 3u);
    ZlvReleaseObject(app);
}

TEST_F(ZlvObjectReferences, ReleasingTakesAReferenceAway)
{
    ZlvObject *app = logger("app");
    logger("app");
    ZlvAcquireObject(app);
    ZlvReleaseObject(app);
    EXPECT_EQ(app->refCount, 3u);
}

TEST_F(ZlvObjectReferences, TheLastReleaseDestroysTheObject)
{
    ZlvReleaseObject(ZlvGetObject("app", "zlv_basiclogger"));
    EXPECT_EQ(zlvToolkitGetObjInstance("app"), nullptr);
}

TEST_F(ZlvObjectReferences, AFreshObjectOfAReleasedNameIsConfiguredAgain)
{
    close();
    open("app.key=value\n");
    ZlvObject *first = ZlvGetObject("app", "zlv_basiclogger");
    setProp(first, "key", "other");
    ZlvReleaseObject(first);
    EXPECT_EQ(prop(logger("app"), "key"), "value");
}

TEST_F(ZlvObjectReferences, AReleasedNameCanBeTakenByAnotherClass)
{
    ZlvReleaseObject(ZlvGetObject("app", "zlv_basiclogger"));
    EXPECT_NE(filter("app"), nullptr);
}

TEST_F(ZlvObjectReferences, AnObjectReleasedTooOftenIsNotDestroyedAgain)
{
    ZlvObject *app = ZlvGetObject("app", "zlv_basiclogger");
    zelvo::ApiLock lock;
    zlvIntlReleaseObject(app);
    zlvIntlReleaseObject(app);
    zlvIntlReleaseObject(app);
    EXPECT_EQ(app->objClass, nullptr) << "readable until the mutex is released";
}

TEST_F(ZlvObjectReferences, AnObjectWithoutAClassIsNotReleased)
{
    ZlvObject loose{};
    loose.refCount = 2;
    ZlvReleaseObject(&loose);
    EXPECT_EQ(loose.refCount, 2u);
}

TEST_F(ZlvObjectReferences, ACountThatFallsToZeroDestroysNothing)
{
    ZlvObject *app = logger("app");
    app->refCount = 1;
    zlvIntlReleaseObject(app);
    EXPECT_EQ(app->refCount, 0u);
    EXPECT_NE(app->objClass, nullptr);
    app->refCount = 2;
}

TEST_F(ZlvObjectReferences, NullIsNeitherAcquiredNorReleased)
{
    EXPECT_EQ(ZlvAcquireObject(nullptr), nullptr);
    ZlvReleaseObject(nullptr);
}

TEST_F(ZlvObjectReferences, TheNameIsHandedOutAsACopy)
{
    ZlvObject *app = logger("app");
    char *name = ZlvGetObjectName(app);
    EXPECT_NE(name, app->name);
    EXPECT_EQ(taken(name), "app");
}

TEST_F(ZlvObjectReferences, NullHasNoName)
{
    EXPECT_EQ(ZlvGetObjectName(nullptr), nullptr);
}

TEST_F(ZlvObjectReferences, TheDescriptionIsThatOfItsClassBoundToText)
{
    ZlvI18Msg *description = ZlvAllocUI18Msg(nullptr, nullptr, u"It''s a logger");
    ZlvAddLoggerClass("mine", description, nullptr, nullptr, nullptr, nullptr);
    ZlvFreeI18Msg(description);
    EXPECT_EQ(taken(ZlvGetObjectDesc(logger("app", "mine"))), u"It's a logger");
}

TEST_F(ZlvObjectReferences, ADescriptionWithPlaceholdersIsBoundWithZeros)
{
    ZlvI18Msg *description = ZlvAllocUI18Msg(nullptr, nullptr, u"No. {0,number,integer}");
    ZlvAddLoggerClass("mine", description, nullptr, nullptr, nullptr, nullptr);
    ZlvFreeI18Msg(description);
    EXPECT_EQ(taken(ZlvGetObjectDesc(logger("app", "mine"))), u"No. 0");
}

TEST_F(ZlvObjectReferences, AClassWithoutADescriptionGivesNone)
{
    EXPECT_EQ(ZlvGetObjectDesc(logger("app")), nullptr);
}

TEST_F(ZlvObjectReferences, NullHasNoDescription)
{
    EXPECT_EQ(ZlvGetObjectDesc(nullptr), nullptr);
}

TEST_F(ZlvObjectReferences, HandlesAreEqualWhenTheyAreTheSame)
{
    ZlvObject *app = logger("app");
    EXPECT_EQ(ZlvAreObjectsEqual(app, object("app")), 1);
    EXPECT_EQ(ZlvAreObjectsEqual(app, logger("other")), 0);
    EXPECT_EQ(ZlvAreObjectsEqual(app, nullptr), 0);
    EXPECT_EQ(ZlvAreObjectsEqual(nullptr, app), 0);
    EXPECT_EQ(ZlvAreObjectsEqual(nullptr, nullptr), 1);
}

TEST_F(ZlvObjectReferences, IsDisabledAndEnabledAgain)
{
    ZlvObject *app = logger("app");
    EXPECT_EQ(ZlvIsObjectEnabled(app), 1);
    ZlvSetObjectEnabled(app, 0);
    EXPECT_EQ(ZlvIsObjectEnabled(app), 0);
    ZlvSetObjectEnabled(app, 1);
    EXPECT_EQ(ZlvIsObjectEnabled(app), 1);
}

TEST_F(ZlvObjectReferences, AnyTruthEnables)
{
    ZlvObject *app = logger("app");
    ZlvSetObjectEnabled(app, 0);
    ZlvSetObjectEnabled(app, 2);
    EXPECT_EQ(ZlvIsObjectEnabled(app), 1);
}

TEST_F(ZlvObjectReferences, NullIsNotEnabled)
{
    EXPECT_EQ(ZlvIsObjectEnabled(nullptr), 0);
    ZlvSetObjectEnabled(nullptr, 1);
    EXPECT_EQ(ZlvIsObjectEnabled(nullptr), 0);
}

} // namespace
} // namespace zelvo_test
