// SPDX-License-Identifier: Apache-2.0
// Configurations that are their own ancestors.
#include "support/DestructiveOrders.h"

namespace zelvo_test {
namespace {

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

} // namespace
} // namespace zelvo_test
