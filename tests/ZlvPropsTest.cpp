// SPDX-License-Identifier: Apache-2.0
// Typed access to a property map.
#include "ZlvProps.h"

#include <gtest/gtest.h>

#include <cmath>

#include "ZlvStringToStringMap.h"
#include "support/FailAlloc.h"
#include "support/Text.h"

namespace zelvo_test {
namespace {

class ZlvProps : public testing::Test {
protected:
    ~ZlvProps() override { ZlvFreeStringToStringMap(map); }

    Text text(const char *property = "p") const
    {
        return taken(ZlvStringToStringMapGet(map, property));
    }

    StringToStringMap *map = ZlvAllocStringToStringMap();
};

TEST_F(ZlvProps, ATextIsHandedOutAsANewString)
{
    ZlvSetMapProp(map, "p", "v");
    ZlvBool found = 0;
    char *value = ZlvGetMapProp(map, "p", &found);
    EXPECT_EQ(found, 1);
    EXPECT_NE(value, map->first->value);
    EXPECT_EQ(taken(value), "v");
}

TEST_F(ZlvProps, TheEmptyTextIsFound)
{
    ZlvSetMapProp(map, "p", "");
    ZlvBool found = 0;
    EXPECT_EQ(taken(ZlvGetMapProp(map, "p", &found)), "");
    EXPECT_EQ(found, 1);
}

TEST_F(ZlvProps, ANullValueIsNotFound)
{
    EXPECT_EQ(ZlvSetMapProp(map, "p", nullptr), 1);
    ZlvBool found = 1;
    EXPECT_EQ(ZlvGetMapProp(map, "p", &found), nullptr);
    EXPECT_EQ(found, 0);
}

TEST_F(ZlvProps, PropertyNamesAreCaseSensitive)
{
    ZlvSetMapProp(map, "p", "v");
    EXPECT_EQ(ZlvGetMapProp(map, "P", nullptr), nullptr);
}

TEST_F(ZlvProps, SettingATextGivesTheResultOfThePut)
{
    EXPECT_EQ(ZlvSetMapProp(map, "p", "v"), 1);
    EXPECT_EQ(ZlvSetMapProp(nullptr, "p", "v"), 0);
    EXPECT_EQ(ZlvSetMapProp(map, nullptr, "v"), 0);
    FailAlloc fail(0);
    EXPECT_EQ(ZlvSetMapProp(map, "q", "v"), 0);
}

TEST_F(ZlvProps, SettingATextCopiesIt)
{
    char value[] = "before";
    ZlvSetMapProp(map, "p", value);
    value[0] = 'B';
    EXPECT_EQ(text(), "before");
}

TEST_F(ZlvProps, TypedGettersConvertTheText)
{
    for (const char *property : {"bool", "char", "int", "long", "float", "double"})
        ZlvSetMapProp(map, property, "7.5x");
    ZlvSetMapProp(map, "bool", "TRUE");
    ZlvSetMapProp(map, "long", "4294967297");
    EXPECT_EQ(ZlvGetMapPropBool(map, "bool", nullptr), 1);
    EXPECT_EQ(ZlvGetMapPropChar(map, "char", nullptr), '7');
    EXPECT_EQ(ZlvGetMapPropInt(map, "int", nullptr), 7);
    EXPECT_EQ(ZlvGetMapPropLong(map, "long", nullptr), 4294967297);
    EXPECT_EQ(ZlvGetMapPropFloat(map, "float", nullptr), 7.5F);
    EXPECT_EQ(ZlvGetMapPropDouble(map, "double", nullptr), 7.5);
}

TEST_F(ZlvProps, ABoolIsReadIgnoringCase)
{
    ZlvSetMapProp(map, "p", "TRUE");
    ZlvBool found = 0;
    EXPECT_EQ(ZlvGetMapPropBool(map, "p", &found), 1);
    EXPECT_EQ(found, 1);
}

TEST_F(ZlvProps, AHexadecimalIntReadsAsZeroAndIsFound)
{
    ZlvSetMapProp(map, "p", "0x10");
    ZlvBool found = 0;
    EXPECT_EQ(ZlvGetMapPropInt(map, "p", &found), 0);
    EXPECT_EQ(found, 1);
}

TEST_F(ZlvProps, TheCharOfTheEmptyTextIsZeroAndFound)
{
    ZlvSetMapProp(map, "p", "");
    ZlvBool found = 0;
    EXPECT_EQ(ZlvGetMapPropChar(map, "p", &found), '\0');
    EXPECT_EQ(found, 1);
}

/// A typed getter under a name, reduced to its verdict: whether it gave the failure value and
/// cleared the flag.
struct Getter {
    const char *name;
    bool (*fails)(StringToStringMap *map, const char *property);
};

template <auto get>
bool fails(StringToStringMap *map, const char *property)
{
    ZlvBool found = 1;
    bool nothing = get(map, property, &found) == decltype(get(map, property, &found)){};
    return nothing && found == 0 &&
           get(map, property, nullptr) == decltype(get(map, property, nullptr)){};
}

class ZlvPropsGetter : public testing::TestWithParam<Getter> {
protected:
    ~ZlvPropsGetter() override { ZlvFreeStringToStringMap(map); }

    StringToStringMap *map = ZlvAllocStringToStringMap();
};

TEST_P(ZlvPropsGetter, FailsForAnAbsentProperty)
{
    ZlvSetMapProp(map, "q", "true");
    EXPECT_TRUE(GetParam().fails(map, "p"));
}

TEST_P(ZlvPropsGetter, FailsForANullValue)
{
    ZlvSetMapProp(map, "p", nullptr);
    EXPECT_TRUE(GetParam().fails(map, "p"));
}

TEST_P(ZlvPropsGetter, FailsForANullMap)
{
    EXPECT_TRUE(GetParam().fails(nullptr, "p"));
}

TEST_P(ZlvPropsGetter, FailsForANullName)
{
    EXPECT_TRUE(GetParam().fails(map, nullptr));
}

const auto getterName = [](const auto &row) { return std::string(row.param.name); };
INSTANTIATE_TEST_SUITE_P(All, ZlvPropsGetter,
                         testing::Values(Getter{"Text", fails<ZlvGetMapProp>},
                                         Getter{"Bool", fails<ZlvGetMapPropBool>},
                                         Getter{"Char", fails<ZlvGetMapPropChar>},
                                         Getter{"Int", fails<ZlvGetMapPropInt>},
                                         Getter{"Long", fails<ZlvGetMapPropLong>},
                                         Getter{"Float", fails<ZlvGetMapPropFloat>},
                                         Getter{"Double", fails<ZlvGetMapPropDouble>}),
                         getterName);

class ZlvPropsConvertingGetter : public ZlvPropsGetter {};

TEST_P(ZlvPropsConvertingGetter, FailsForATextThatDoesNotConvert)
{
    ZlvSetMapProp(map, "p", "yes");
    EXPECT_TRUE(GetParam().fails(map, "p"));
}

INSTANTIATE_TEST_SUITE_P(All, ZlvPropsConvertingGetter,
                         testing::Values(Getter{"Bool", fails<ZlvGetMapPropBool>},
                                         Getter{"Int", fails<ZlvGetMapPropInt>},
                                         Getter{"Long", fails<ZlvGetMapPropLong>},
                                         Getter{"Float", fails<ZlvGetMapPropFloat>},
                                         Getter{"Double", fails<ZlvGetMapPropDouble>}),
                         getterName);

/// A typed setter with a value, and the text it stores.
struct Setting {
    const char *name;
    void (*set)(StringToStringMap *map, const char *property);
    std::string text;
};

class ZlvPropsSetter : public testing::TestWithParam<Setting> {
protected:
    ~ZlvPropsSetter() override { ZlvFreeStringToStringMap(map); }

    StringToStringMap *map = ZlvAllocStringToStringMap();
};

TEST_P(ZlvPropsSetter, StoresTheText)
{
    GetParam().set(map, "p");
    EXPECT_EQ(taken(ZlvStringToStringMapGet(map, "p")), GetParam().text);
}

TEST_P(ZlvPropsSetter, ReplacesAnEarlierText)
{
    ZlvSetMapProp(map, "p", "before");
    GetParam().set(map, "p");
    EXPECT_EQ(taken(ZlvStringToStringMapGet(map, "p")), GetParam().text);
    EXPECT_EQ(map->first, map->last);
}

TEST_P(ZlvPropsSetter, IgnoresANullMapOrName)
{
    GetParam().set(nullptr, "p");
    GetParam().set(map, nullptr);
    EXPECT_EQ(map->first, nullptr);
}

#define SETTING(NAME, TYPE, VALUE, TEXT)                                                           \
    Setting                                                                                        \
    {                                                                                              \
        NAME, [](StringToStringMap *map, const char *p) { ZlvSetMapProp##TYPE(map, p, VALUE); },   \
            TEXT                                                                                   \
    }
INSTANTIATE_TEST_SUITE_P(
    Rows, ZlvPropsSetter,
    testing::Values(
        SETTING("BoolOne", Bool, 1, "true"), SETTING("BoolZero", Bool, 0, "false"),
        SETTING("BoolTwo", Bool, 2, "false"), SETTING("BoolAllBits", Bool, 255, "false"),
        SETTING("Char", Char, 'x', "x"), SETTING("CharZero", Char, '\0', ""),
        SETTING("Int", Int, 42, "42"), SETTING("IntZero", Int, 0, "0"),
        SETTING("IntLargest", Int, INT32_MAX, "2147483647"),
        SETTING("IntSmallest", Int, INT32_MIN, "-2147483648"), SETTING("Long", Long, -5, "-5"),
        SETTING("LongBeyond32Bits", Long, (INT64_C(1) << 32) + 1, "1"),
        SETTING("LongWithTheLowSignBit", Long, INT64_C(0x80000000), "-2147483648"),
        SETTING("LongLargest", Long, INT64_MAX, "-1"), SETTING("Float", Float, 1.5F, "1.500000"),
        SETTING("FloatNegative", Float, -0.25F, "-0.250000"),
        SETTING("Double", Double, 2.125, "2.125000"),
        SETTING("DoubleNegative", Double, -1.0, "-1.000000")),
    [](const auto &row) { return std::string(row.param.name); });

TEST_F(ZlvProps, ALargeDoubleIsStoredWhole)
{
    ZlvSetMapPropDouble(map, "p", 1e300);
    EXPECT_EQ(text().value_or("").size(), 308U);
    EXPECT_EQ(ZlvGetMapPropDouble(map, "p", nullptr), 1e300);
}

TEST_F(ZlvProps, AValueThatCannotBeRenderedIsNotStored)
{
    ZlvSetMapProp(map, "p", "before");
    FailAlloc fail(0);
    ZlvSetMapPropInt(map, "p", 7);
    EXPECT_GT(fail.failed(), 0U);
    EXPECT_STREQ(map->first->value, "before");
}

TEST_F(ZlvProps, ALongIsReadWithAll64BitsThoughItIsStoredCut)
{
    ZlvSetMapPropLong(map, "p", (INT64_C(1) << 32) + 1);
    EXPECT_EQ(ZlvGetMapPropLong(map, "p", nullptr), 1);
    ZlvSetMapProp(map, "p", "4294967297");
    EXPECT_EQ(ZlvGetMapPropLong(map, "p", nullptr), 4294967297);
}

} // namespace
} // namespace zelvo_test
