// SPDX-License-Identifier: Apache-2.0
// Properties of configurations: typed access and the lookup through the ancestors.
#include "ZlvObjConfig.h"

#include "support/BrokenMutex.h"
#include "support/CfgFixture.h"
#include "support/FailAlloc.h"

namespace zelvo_test {
namespace {

/// The lookup has two public names; both must do all of this.
using Lookup = char *(*)(ZlvObjCfg *cfg, const char *property, ZlvBool *found);

class ZlvObjConfigLookup : public CfgFixture, public testing::WithParamInterface<Lookup> {
protected:
    /// What the lookup finds; nothing when it finds nothing, with a flag that says the same.
    static Text found(ZlvObjCfg *cfg, const char *property)
    {
        ZlvBool flag = 2;
        Text text = taken(GetParam()(cfg, property, &flag));
        EXPECT_EQ(flag, text ? 1 : 0);
        EXPECT_EQ(taken(GetParam()(cfg, property, nullptr)), text);
        return text;
    }
};

TEST_P(ZlvObjConfigLookup, FindsAnOwnProperty)
{
    ZlvObjCfg *cfg = alloc("a");
    set(cfg, "p", "v");
    EXPECT_EQ(found(cfg, "p"), "v");
}

TEST_P(ZlvObjConfigLookup, HandsOutACopy)
{
    ZlvObjCfg *cfg = alloc("a");
    set(cfg, "p", "v");
    char *value = GetParam()(cfg, "p", nullptr);
    EXPECT_NE(value, cfg->properties->first->value);
    EXPECT_EQ(taken(value), "v");
}

TEST_P(ZlvObjConfigLookup, ReachesAPropertyTwoLevelsUp)
{
    set(get("a"), "p", "v");
    get("a.b");
    EXPECT_EQ(found(get("a.b.c"), "p"), "v");
}

TEST_P(ZlvObjConfigLookup, TheNearestConfigurationWins)
{
    set(get("a"), "p", "far");
    set(get("a.b"), "p", "near");
    EXPECT_EQ(found(get("a.b.c"), "p"), "near");
}

TEST_P(ZlvObjConfigLookup, TheOwnValueHidesEveryOther)
{
    set(get("a"), "p", "far");
    ZlvObjCfg *cfg = get("a.b");
    set(cfg, "p", "own");
    EXPECT_EQ(found(cfg, "p"), "own");
}

TEST_P(ZlvObjConfigLookup, ANullValueUncoversTheParents)
{
    set(get("a"), "p", "far");
    ZlvObjCfg *cfg = get("a.b");
    set(cfg, "p", "own");
    set(cfg, "p", nullptr);
    EXPECT_EQ(found(cfg, "p"), "far");
}

TEST_P(ZlvObjConfigLookup, AnAbsentPropertyIsNotFound)
{
    set(get("a"), "p", "v");
    EXPECT_EQ(found(get("a.b"), "q"), std::nullopt);
}

TEST_P(ZlvObjConfigLookup, NothingIsFoundForNull)
{
    ZlvObjCfg *cfg = alloc("a");
    set(cfg, "p", "v");
    EXPECT_EQ(found(nullptr, "p"), std::nullopt);
    EXPECT_EQ(found(cfg, nullptr), std::nullopt);
}

TEST_P(ZlvObjConfigLookup, StillReachesTheFormerParentOfARemovedChild)
{
    ZlvObjCfg *parent = get("a");
    ZlvObjCfg *child = get("a.b");
    set(parent, "p", "v");
    ZlvObjCfgRemChild(parent, child);
    EXPECT_EQ(found(child, "p"), "v");
}

TEST_P(ZlvObjConfigLookup, RegistersAParentThatIsAbsent)
{
    ZlvObjCfg *cfg = alloc("c");
    ZlvObjCfgSetParent(cfg, alloc("gone"));
    EXPECT_EQ(found(cfg, "p"), std::nullopt);
    EXPECT_EQ(registered(), Names{"gone"});
}

TEST_P(ZlvObjConfigLookup, AnOwnPropertyLeavesAnAbsentParentAbsent)
{
    ZlvObjCfg *cfg = alloc("c");
    ZlvObjCfgSetParent(cfg, alloc("gone"));
    set(cfg, "p", "v");
    EXPECT_EQ(found(cfg, "p"), "v");
    EXPECT_FALSE(has("gone"));
}

TEST_P(ZlvObjConfigLookup, KeepsNoReferenceToTheAncestors)
{
    ZlvObjCfg *parent = get("a");
    ZlvObjCfg *child = get("a.b");
    uint32_t before = parent->refCount;
    EXPECT_EQ(found(child, "p"), std::nullopt);
    EXPECT_EQ(parent->refCount, before);
}

TEST_P(ZlvObjConfigLookup, EndsWhenAConfigurationIsItsOwnAncestor)
{
    ZlvObjCfg *one = get("one");
    ZlvObjCfg *other = get("other");
    ZlvObjCfgSetParent(one, other);
    ZlvObjCfgSetParent(other, one);
    set(other, "p", "v");
    EXPECT_EQ(found(one, "p"), "v");
    EXPECT_EQ(found(one, "q"), std::nullopt);
}

TEST_P(ZlvObjConfigLookup, GivesNothingWithoutTheMutex)
{
    ZlvObjCfg *cfg = alloc("a");
    set(cfg, "p", "v");
    BrokenMutex broken;
    EXPECT_EQ(GetParam()(cfg, "p", nullptr), nullptr);
}

INSTANTIATE_TEST_SUITE_P(Names, ZlvObjConfigLookup,
                         testing::Values(ZlvGetObjCfgProp, ZlvGetInheritedObjCfgProp),
                         [](const auto &row) { return row.index == 0 ? "Short" : "Long"; });

/// A typed getter under a name, with a text that it reads as something other than nothing.
struct Typed {
    const char *name;
    const char *text;
    bool (*reads)(ZlvObjCfg *cfg, const char *property);
    bool (*fails)(ZlvObjCfg *cfg, const char *property);
};

template <class Get, class Value>
bool reads(Get get, Value value, ZlvObjCfg *cfg, const char *property)
{
    ZlvBool found = 0;
    return get(cfg, property, &found) == value && found == 1 &&
           get(cfg, property, nullptr) == value;
}

template <auto get>
bool fails(ZlvObjCfg *cfg, const char *property)
{
    ZlvBool found = 1;
    return get(cfg, property, &found) == 0 && found == 0 && get(cfg, property, nullptr) == 0;
}

class ZlvObjConfigTyped : public CfgFixture, public testing::WithParamInterface<Typed> {};

TEST_P(ZlvObjConfigTyped, ReadsAnOwnText)
{
    ZlvObjCfg *cfg = alloc("a");
    set(cfg, "p", GetParam().text);
    EXPECT_TRUE(GetParam().reads(cfg, "p"));
}

TEST_P(ZlvObjConfigTyped, ReadsAnInheritedText)
{
    set(get("a"), "p", GetParam().text);
    EXPECT_TRUE(GetParam().reads(get("a.b"), "p"));
}

TEST_P(ZlvObjConfigTyped, AnOwnTextThatDoesNotConvertHidesTheParents)
{
    set(get("a"), "p", GetParam().text);
    ZlvObjCfg *cfg = get("a.b");
    set(cfg, "p", "unreadable");
    EXPECT_TRUE(GetParam().fails(cfg, "p"));
}

TEST_P(ZlvObjConfigTyped, FailsForAnAbsentProperty)
{
    EXPECT_TRUE(GetParam().fails(alloc("a"), "p"));
}

TEST_P(ZlvObjConfigTyped, FailsForNull)
{
    ZlvObjCfg *cfg = alloc("a");
    set(cfg, "p", GetParam().text);
    EXPECT_TRUE(GetParam().fails(nullptr, "p"));
    EXPECT_TRUE(GetParam().fails(cfg, nullptr));
}

TEST_P(ZlvObjConfigTyped, GivesNothingWithoutTheMutex)
{
    ZlvObjCfg *cfg = alloc("a");
    set(cfg, "p", GetParam().text);
    BrokenMutex broken;
    EXPECT_FALSE(GetParam().reads(cfg, "p"));
}

#define TYPED(TYPE, TEXT, VALUE)                                                                         \
    Typed                                                                                                \
    {                                                                                                    \
#TYPE, TEXT,                                                                                     \
            [](ZlvObjCfg * cfg,                                                                          \
               const char *                                                                              \
                   p) { return reads(ZlvGetObjCfgProp##TYPE, VALUE, cfg, p); },                          \
                                                                             fails <                     \
                                                                                 ZlvGetObjCfgProp##TYPE> \
    }
INSTANTIATE_TEST_SUITE_P(Types, ZlvObjConfigTyped,
                         testing::Values(TYPED(Bool, "TRUE", ZlvBool{1}), TYPED(Int, "12abc", 12),
                                         TYPED(Long, "4294967297", INT64_C(4294967297)),
                                         TYPED(Float, "1.5", 1.5F), TYPED(Double, "1e300", 1e300)),
                         [](const auto &row) { return std::string(row.param.name); });

/// A setter with a value, and the text it stores.
struct Setting {
    const char *name;
    void (*set)(ZlvObjCfg *cfg, const char *property);
    std::string text;
};

class ZlvObjConfigSetter : public CfgFixture, public testing::WithParamInterface<Setting> {};

TEST_P(ZlvObjConfigSetter, StoresTheTextInTheConfigurationItself)
{
    ZlvObjCfg *parent = get("a");
    ZlvObjCfg *cfg = get("a.b");
    GetParam().set(cfg, "p");
    EXPECT_EQ(lookup(cfg, "p"), GetParam().text);
    EXPECT_EQ(lookup(parent, "p"), std::nullopt);
}

TEST_P(ZlvObjConfigSetter, IgnoresNull)
{
    ZlvObjCfg *cfg = alloc("a");
    GetParam().set(nullptr, "p");
    GetParam().set(cfg, nullptr);
    EXPECT_EQ(ZlvObjCfgProperties(cfg), nullptr);
}

TEST_P(ZlvObjConfigSetter, StoresNothingWithoutTheMutex)
{
    ZlvObjCfg *cfg = alloc("a");
    BrokenMutex broken;
    GetParam().set(cfg, "p");
    EXPECT_EQ(cfg->properties, nullptr);
}

TEST_P(ZlvObjConfigSetter, StoresNothingWithoutMemory)
{
    ZlvObjCfg *cfg = alloc("a");
    {
        FailAlloc fail(0);
        GetParam().set(cfg, "p");
        EXPECT_GT(fail.failed(), 0U);
    }
    EXPECT_EQ(lookup(cfg, "p"), std::nullopt);
}

#define SETTING(NAME, TYPE, VALUE, TEXT)                                                           \
    Setting                                                                                        \
    {                                                                                              \
        NAME, [](ZlvObjCfg *cfg, const char *p) { ZlvSetObjCfgProp##TYPE(cfg, p, VALUE); }, TEXT   \
    }
INSTANTIATE_TEST_SUITE_P(Rows, ZlvObjConfigSetter,
                         testing::Values(SETTING("Text", , "v", "v"),
                                         SETTING("BoolOne", Bool, 1, "true"),
                                         SETTING("BoolTwo", Bool, 2, "false"),
                                         SETTING("Int", Int, -42, "-42"),
                                         SETTING("LongCut", Long, (INT64_C(1) << 32) + 1, "1"),
                                         SETTING("Float", Float, 1.5F, "1.500000"),
                                         SETTING("Double", Double, 2.125, "2.125000")),
                         [](const auto &row) { return std::string(row.param.name); });

} // namespace
} // namespace zelvo_test
