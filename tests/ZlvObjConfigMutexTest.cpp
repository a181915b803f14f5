// SPDX-License-Identifier: Apache-2.0
// What the calls on configurations give when the API mutex cannot be taken.
#include "ZlvObjConfig.h"

#include "support/BrokenMutex.h"
#include "support/CfgFixture.h"

namespace zelvo_test {
namespace {

/// A parent with a child and a property, and a configuration of their own for each test to try.
class ZlvObjConfigMutex : public CfgFixture {
protected:
    void SetUp() override
    {
        CfgFixture::SetUp();
        parent = get("a");
        child = get("a.b");
        single = alloc("single");
        set(parent, "p", "v");
    }

    ZlvObjCfg *parent = nullptr;
    ZlvObjCfg *child = nullptr;
    ZlvObjCfg *single = nullptr;
};

TEST_F(ZlvObjConfigMutex, WithoutItNoConfigurationIsMade)
{
    BrokenMutex broken;
    EXPECT_EQ(ZlvAllocObjCfg("b"), nullptr);
}

TEST_F(ZlvObjConfigMutex, WithoutItReferencesStay)
{
    BrokenMutex broken;
    EXPECT_EQ(ZlvAcquireObjCfg(single), nullptr);
    EXPECT_EQ(single->refCount, 1U);
    ZlvReleaseObjCfg(single);
    EXPECT_EQ(single->refCount, 1U);
}

TEST_F(ZlvObjConfigMutex, WithoutItThereIsNoName)
{
    BrokenMutex broken;
    EXPECT_EQ(ZlvObjCfgGetName(parent), nullptr);
}

TEST_F(ZlvObjConfigMutex, WithoutItTheFromFileFlagIsNeitherReadNorSet)
{
    ZlvObjCfgSetFromFile(parent, 1);
    BrokenMutex broken;
    EXPECT_EQ(ZlvObjCfgIsFromFile(parent), 0);
    ZlvObjCfgSetFromFile(single, 1);
    EXPECT_EQ(single->fromFile, 0);
}

TEST_F(ZlvObjConfigMutex, WithoutItTheParentIsNeitherGivenNorSet)
{
    BrokenMutex broken;
    EXPECT_EQ(ZlvObjCfgGetParent(child), nullptr);
    ZlvObjCfgSetParent(single, parent);
    EXPECT_EQ(single->parentName, nullptr);
}

TEST_F(ZlvObjConfigMutex, WithoutItChildrenStayAsTheyAre)
{
    {
        BrokenMutex broken;
        ZlvObjCfgAddChild(parent, single);
        ZlvObjCfgRemChild(parent, child);
    }
    EXPECT_EQ(childrenOf(parent), Names{"a.b"});
}

TEST_F(ZlvObjConfigMutex, WithoutItThereIsNothingToIterate)
{
    BrokenMutex broken;
    EXPECT_EQ(ZlvObjCfgChildrenNames(parent), nullptr);
    EXPECT_EQ(ZlvObjCfgProperties(parent), nullptr);
}

} // namespace
} // namespace zelvo_test
