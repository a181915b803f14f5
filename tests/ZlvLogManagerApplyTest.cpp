// SPDX-License-Identifier: Apache-2.0
// Applying a chain of configurations to an object.
#include "ZlvLogManager.h"

#include "support/CfgFixture.h"

namespace zelvo_test {
namespace {

/// Names of the properties that objects of the class "recorder" were told about, in order.
std::vector<std::string> changes;

void recordChange(ZlvObject *, const char *property)
{
    changes.emplace_back(property);
}

class ZlvLogManagerApply : public CfgFixture {
protected:
    /// A fresh object of a class that records configuration changes; nothing is recorded yet.
    ZlvObject *recorder()
    {
        ZlvAddLoggerClass("recorder", nullptr, nullptr, nullptr, recordChange, nullptr);
        ZlvObject *object = logger("object", "recorder");
        changes.clear();
        return object;
    }
};

TEST_F(ZlvLogManagerApply, SetsEveryPropertyOnTheObject)
{
    ZlvObjCfg *cfg = get("a");
    set(cfg, "p", "1");
    set(cfg, "q", "2");
    ZlvObject *object = logger("object");
    EXPECT_EQ(ZlvLogMgrApplyCfg(object, "a"), 1);
    EXPECT_EQ(prop(object, "p"), "1");
    EXPECT_EQ(prop(object, "q"), "2");
}

TEST_F(ZlvLogManagerApply, TellsTheClassOfEachPropertyInTheOrderOfTheMap)
{
    ZlvObjCfg *cfg = get("a");
    set(cfg, "z", "1");
    set(cfg, "b", "2");
    set(cfg, "m", "3");
    EXPECT_EQ(ZlvLogMgrApplyCfg(recorder(), "a"), 1);
    EXPECT_EQ(changes, (Names{"z", "b", "m"}));
}

TEST_F(ZlvLogManagerApply, SetsAncestorsFirstAndTheOwnLast)
{
    set(get("a"), "top", "1");
    set(get("a.b"), "middle", "2");
    set(get("a.b.c"), "own", "3");
    EXPECT_EQ(ZlvLogMgrApplyCfg(recorder(), "a.b.c"), 1);
    EXPECT_EQ(changes, (Names{"top", "middle", "own"}));
}

TEST_F(ZlvLogManagerApply, SetsAPropertyOncePerConfigurationThatHasIt)
{
    set(get("a"), "p", "far");
    set(get("a.b"), "p", "near");
    ZlvObject *object = recorder();
    EXPECT_EQ(ZlvLogMgrApplyCfg(object, "a.b"), 1);
    EXPECT_EQ(changes, (Names{"p", "p"}));
    EXPECT_EQ(prop(object, "p"), "near");
}

TEST_F(ZlvLogManagerApply, TheNearestLoggingOnLeavesTheObjectEnabled)
{
    set(get("a"), "logging", "off");
    set(get("a.b"), "logging", "on");
    ZlvObject *object = logger("object");
    EXPECT_EQ(ZlvLogMgrApplyCfg(object, "a.b"), 1);
    EXPECT_EQ(ZlvIsObjectEnabled(object), 1);
}

TEST_F(ZlvLogManagerApply, TheNearestLoggingOffLeavesTheObjectDisabled)
{
    set(get("a"), "logging", "on");
    set(get("a.b"), "logging", "off");
    ZlvObject *object = logger("object");
    EXPECT_EQ(ZlvLogMgrApplyCfg(object, "a.b"), 1);
    EXPECT_EQ(ZlvIsObjectEnabled(object), 0);
}

TEST_F(ZlvLogManagerApply, AnUnknownNameIsMadeAndAppliesNothing)
{
    ZlvObject *object = recorder();
    EXPECT_EQ(ZlvLogMgrApplyCfg(object, "unknown"), 1);
    EXPECT_TRUE(has("unknown"));
    EXPECT_EQ(changes, Names{});
}

TEST_F(ZlvLogManagerApply, TheRootAppliesNothing)
{
    ZlvObject *object = recorder();
    EXPECT_EQ(ZlvLogMgrApplyCfg(object, "/"), 0);
    EXPECT_EQ(changes, Names{});
}

TEST_F(ZlvLogManagerApply, ANullObjectIsRefusedAndMakesNoConfiguration)
{
    EXPECT_EQ(ZlvLogMgrApplyCfg(nullptr, "a"), 0);
    EXPECT_FALSE(has("a"));
}

TEST_F(ZlvLogManagerApply, ANullNameIsRefused)
{
    EXPECT_EQ(ZlvLogMgrApplyCfg(logger("object"), nullptr), 0);
}

TEST_F(ZlvLogManagerApply, KeepsNoReferenceToTheConfigurations)
{
    ZlvObjCfg *parent = get("a");
    ZlvObjCfg *cfg = get("a.b");
    ZlvLogMgrApplyCfg(logger("object"), "a.b");
    EXPECT_EQ(parent->refCount, 2U);
    EXPECT_EQ(cfg->refCount, 2U);
}

TEST_F(ZlvLogManagerApply, LeavesTheObjectsCountAsItWas)
{
    set(get("a"), "p", "1");
    ZlvObject *object = logger("object");
    ZlvLogMgrApplyCfg(object, "a");
    EXPECT_EQ(object->refCount, 2U);
}

TEST_F(ZlvLogManagerApply, AnUnregisteredParentNameIsMade)
{
    ZlvObjCfgSetParent(get("c"), alloc("p"));
    EXPECT_EQ(ZlvLogMgrApplyCfg(logger("object"), "c"), 1);
    EXPECT_TRUE(has("p"));
}

TEST_F(ZlvLogManagerApply, EndsWhenAConfigurationIsItsOwnAncestor)
{
    ZlvObjCfg *one = get("one");
    ZlvObjCfg *other = get("other");
    ZlvObjCfgSetParent(one, other);
    ZlvObjCfgSetParent(other, one);
    set(one, "own", "1");
    set(other, "parents", "2");
    ZlvObject *object = recorder();
    EXPECT_EQ(ZlvLogMgrApplyCfg(object, "one"), 1);
    EXPECT_EQ(changes, (Names{"parents", "own"}));
}

TEST_F(ZlvLogManagerApply, ANewObjectGetsTheChainOfItsName)
{
    set(get("a"), "top", "1");
    set(get("a.b"), "own", "2");
    ZlvObject *object = logger("a.b");
    EXPECT_EQ(prop(object, "top"), "1");
    EXPECT_EQ(prop(object, "own"), "2");
}

TEST_F(ZlvLogManagerApply, SettingAConfigurationLeavesExistingObjectsAlone)
{
    ZlvObject *object = logger("a");
    set(get("a"), "p", "v");
    EXPECT_EQ(prop(object, "p"), std::nullopt);
    EXPECT_EQ(ZlvLogMgrApplyCfg(object, "a"), 1);
    EXPECT_EQ(prop(object, "p"), "v");
}

} // namespace
} // namespace zelvo_test
