// SPDX-License-Identifier: Apache-2.0
// The registry of objects.
#include "support/FailAlloc.h"
#include "support/ToolkitFixture.h"

#include "ZlvIntl.h"
#include "ZlvOwned.h"

namespace zelvo_test {
namespace {

class ZlvInstances : public ToolkitFixture {
protected:
    void SetUp() override { open(); }

    /// Whether the registry holds an object under NAME.
    static bool holds(const char *name)
    {
        return zlvIntlStringToObjMapHasKey(ZLV_TK_INSTANCES, name);
    }
};

TEST_F(ZlvInstances, AddingTakesAReference)
{
    ZlvObject *app = logger("app");
    zlvToolkitAddObjInstance("alias", app);
    EXPECT_EQ(app->refCount, 3u);
    zlvToolkitRemObjInstance("alias");
}

TEST_F(ZlvInstances, AddingUnderATakenNameReleasesAndReplacesTheOld)
{
    ZlvObject *first = logger("first");
    ZlvObject *second = logger("second");
    zlvToolkitAddObjInstance("alias", first);
    zlvToolkitAddObjInstance("alias", second);
    EXPECT_EQ(first->refCount, 2u);
    EXPECT_EQ(second->refCount, 3u);
    zlvToolkitRemObjInstance("alias");
}

TEST_F(ZlvInstances, ANullNameIsNotAdded)
{
    ZlvObject *app = logger("app");
    zlvToolkitAddObjInstance(nullptr, app);
    EXPECT_EQ(app->refCount, 2u);
}

TEST_F(ZlvInstances, ANullObjectIsNotAdded)
{
    zlvToolkitAddObjInstance("nothing", nullptr);
    EXPECT_FALSE(holds("nothing"));
}

TEST_F(ZlvInstances, ANullObjectIsNotAddedBeforeTheRegistryExists)
{
    close();
    zlvToolkitAddObjInstance("nothing", nullptr);
    zlvToolkitAddObjInstance(nullptr, nullptr);
    EXPECT_EQ(ZLV_TK_INSTANCES, nullptr);
}

TEST_F(ZlvInstances, TheFirstObjectMakesTheRegistry)
{
    close();
    ASSERT_EQ(ZLV_TK_INSTANCES, nullptr);
    zlvToolkitInitObjClasses();
    logger("app");
    EXPECT_NE(ZLV_TK_INSTANCES, nullptr);
}

TEST_F(ZlvInstances, LookingUpGivesTheCallerAReference)
{
    ZlvObject *app = logger("app");
    EXPECT_EQ(keep(zlvToolkitGetObjInstance("app")), app);
    EXPECT_EQ(app->refCount, 3u);
}

TEST_F(ZlvInstances, NamesAreLookedUpExactly)
{
    logger("app");
    EXPECT_EQ(zlvToolkitGetObjInstance("App"), nullptr);
    EXPECT_EQ(zlvToolkitGetObjInstance("ap"), nullptr);
}

TEST_F(ZlvInstances, LookingUpANullNameFindsNothing)
{
    EXPECT_EQ(zlvToolkitGetObjInstance(nullptr), nullptr);
}

TEST_F(ZlvInstances, LookingUpWhileThereIsNoRegistryFindsNothing)
{
    close();
    EXPECT_EQ(zlvToolkitGetObjInstance("app"), nullptr);
}

TEST_F(ZlvInstances, RemovingReleasesTheRegistrysReference)
{
    ZlvObject *app = logger("app");
    zlvToolkitAddObjInstance("alias", app);
    zlvToolkitRemObjInstance("alias");
    EXPECT_EQ(app->refCount, 2u);
    EXPECT_EQ(zlvToolkitGetObjInstance("alias"), nullptr);
}

TEST_F(ZlvInstances, RemovingANullOrAnUnknownNameIsIgnored)
{
    ZlvObject *app = logger("app");
    zlvToolkitRemObjInstance(nullptr);
    zlvToolkitRemObjInstance("unknown");
    EXPECT_EQ(app->refCount, 2u);
    EXPECT_TRUE(holds("app"));
}

TEST_F(ZlvInstances, FreeingThemWithoutAnyIsHarmless)
{
    close();
    zlvFreeInstancesMap();
    EXPECT_EQ(ZLV_TK_INSTANCES, nullptr);
}

TEST_F(ZlvInstances, FreeingThemLeavesNoRegistry)
{
    {
        zelvo::ApiLock lock;
        zlvFreeInstancesMap();
    }
    EXPECT_EQ(ZLV_TK_INSTANCES, nullptr);
}

TEST_F(ZlvInstances, AnObjectIsRegisteredWhenItWasMadeAndOnlyThen)
{
    for (uint32_t allowed = 0;; ++allowed) {
        FailAlloc fail(allowed);
        ZlvObject *made = ZlvGetObject("app", "zlv_basiclogger");
        EXPECT_EQ(holds("app"), made != nullptr) << "after " << allowed << " allocations";
        if (made != nullptr) {
            EXPECT_EQ(keep(made)->refCount, 2u);
            break;
        }
        EXPECT_GT(fail.failed(), 0u);
    }
}

} // namespace
} // namespace zelvo_test
