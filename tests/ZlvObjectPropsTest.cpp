// SPDX-License-Identifier: Apache-2.0
// Properties of objects and the notification of their classes.
#include "support/FailAlloc.h"
#include "support/Scripted.h"
#include "support/ToolkitFixture.h"

#include "ZlvIntl.h"

namespace zelvo_test {
namespace {

class ZlvObjectProps : public ToolkitFixture {
protected:
    void SetUp() override
    {
        open();
        Scripted::addClasses();
        app_ = object("app", Scripted::logger);
    }

    ZlvObject *app_ = nullptr;
    ZlvBool found_ = 7;
};

TEST_F(ZlvObjectProps, TheFirstSetMakesTheMap)
{
    EXPECT_EQ(app_->properties, nullptr);
    setProp(app_, "key", "value");
    EXPECT_NE(app_->properties, nullptr);
}

TEST_F(ZlvObjectProps, ReadingMakesNoMap)
{
    EXPECT_EQ(prop(app_, "key"), std::nullopt);
    EXPECT_EQ(app_->properties, nullptr);
}

TEST_F(ZlvObjectProps, TheMapIsMadeOnDemandAndStays)
{
    StringToStringMap *map = zlvFetchObjPropMap(app_);
    EXPECT_NE(map, nullptr);
    EXPECT_EQ(app_->properties, map);
    EXPECT_EQ(zlvFetchObjPropMap(app_), map);
    EXPECT_EQ(zlvFetchObjPropMap(nullptr), nullptr);
}

TEST_F(ZlvObjectProps, AValueIsReadBackAsACopy)
{
    setProp(app_, "key", "value");
    char *value = ZlvGetObjProp(app_, "key", &found_);
    EXPECT_NE(value, app_->properties->first->value);
    EXPECT_EQ(taken(value), "value");
    EXPECT_EQ(found_, 1);
}

TEST_F(ZlvObjectProps, AValueIsReplaced)
{
    setProp(app_, "key", "old");
    setProp(app_, "key", "new");
    EXPECT_EQ(prop(app_, "key"), "new");
}

TEST_F(ZlvObjectProps, NamesAreComparedExactly)
{
    setProp(app_, "key", "value");
    EXPECT_EQ(prop(app_, "Key"), std::nullopt);
}

TEST_F(ZlvObjectProps, AnAbsentPropertyIsNotFound)
{
    EXPECT_EQ(ZlvGetObjProp(app_, "key", &found_), nullptr);
    EXPECT_EQ(found_, 0);
}

TEST_F(ZlvObjectProps, ANullValueRemovesTheProperty)
{
    setProp(app_, "key", "value");
    Scripted::clear();
    setProp(app_, "key", nullptr);
    EXPECT_EQ(ZlvGetObjProp(app_, "key", &found_), nullptr);
    EXPECT_EQ(found_, 0);
    EXPECT_EQ(Scripted::changed, Names{"app.key"}) << "the class is told";
}

TEST_F(ZlvObjectProps, ItsOwnStoredValueMayBeSetAgain)
{
    setProp(app_, "key", "value");
    ZlvSetObjProp(app_, "key", app_->properties->first->value);
    EXPECT_EQ(prop(app_, "key"), "value");
}

TEST_F(ZlvObjectProps, ItsOwnStoredNameMayBeUsedToSetIt)
{
    setProp(app_, "key", "value");
    ZlvSetObjProp(app_, app_->properties->first->key, "other");
    EXPECT_EQ(prop(app_, "key"), "other");
}

/// A typed setter, what it stores and what the getter of its type gives back.
struct Typed {
    const char *name;
    void (*set)(ZlvObject *);
    const char *stored;
    bool (*isReadBack)(ZlvObject *, ZlvBool *);
};

class ZlvObjectTypedProps : public ZlvObjectProps, public testing::WithParamInterface<Typed> {};

TEST_P(ZlvObjectTypedProps, AreStoredAsText)
{
    GetParam().set(app_);
    EXPECT_EQ(prop(app_, "key"), GetParam().stored);
}

TEST_P(ZlvObjectTypedProps, AreReadBack)
{
    GetParam().set(app_);
    EXPECT_TRUE(GetParam().isReadBack(app_, &found_));
    EXPECT_EQ(found_, 1);
}

TEST_P(ZlvObjectTypedProps, AreReadWithoutAFlagToo)
{
    GetParam().set(app_);
    EXPECT_TRUE(GetParam().isReadBack(app_, nullptr));
}

TEST_P(ZlvObjectTypedProps, TellTheClassOnce)
{
    GetParam().set(app_);
    EXPECT_EQ(Scripted::changed, Names{"app.key"});
}

#define TYPED(name, type, value, text, back)                                                       \
    Typed                                                                                          \
    {                                                                                              \
        name, [](ZlvObject *o) { ZlvSetObjProp##type(o, "key", value); }, text,                    \
            [](ZlvObject *o, ZlvBool *found) {                                                     \
                return ZlvGetObjProp##type(o, "key", found) == (back);                             \
            }                                                                                      \
    }

INSTANTIATE_TEST_SUITE_P(
    , ZlvObjectTypedProps,
    testing::Values(TYPED("True", Bool, 1, "true", 1), TYPED("False", Bool, 0, "false", 0),
                    TYPED("Two", Bool, 2, "false", 0), TYPED("Int", Int, 42, "42", 42),
                    TYPED("NegativeInt", Int, -42, "-42", -42),
                    TYPED("SmallestInt", Int, INT32_MIN, "-2147483648", INT32_MIN),
                    TYPED("Long", Long, 42, "42", 42),
                    TYPED("LongBeyond32Bits", Long, (int64_t{1} << 32) + 1, "1", 1),
                    TYPED("Float", Float, 1.5F, "1.500000", 1.5F),
                    TYPED("Double", Double, -2.25, "-2.250000", -2.25)),
    [](const auto &row) { return row.param.name; });

#undef TYPED

TEST_F(ZlvObjectProps, ATrueValueIsReadIgnoringCase)
{
    setProp(app_, "key", "TRUE");
    EXPECT_EQ(ZlvGetObjPropBool(app_, "key", &found_), 1);
    EXPECT_EQ(found_, 1);
}

TEST_F(ZlvObjectProps, ALongIsReadWithSixtyFourBits)
{
    setProp(app_, "key", "4294967297");
    EXPECT_EQ(ZlvGetObjPropLong(app_, "key", &found_), (int64_t{1} << 32) + 1);
    EXPECT_EQ(found_, 1);
}

/// A typed getter asked for a value that there is not.
struct Getter {
    const char *name;
    bool (*givesNothing)(ZlvObject *, const char *, ZlvBool *);
};

class ZlvObjectPropGetter : public ZlvObjectProps, public testing::WithParamInterface<Getter> {};

TEST_P(ZlvObjectPropGetter, FindsNoAbsentProperty)
{
    EXPECT_TRUE(GetParam().givesNothing(app_, "key", &found_));
    EXPECT_EQ(found_, 0);
}

TEST_P(ZlvObjectPropGetter, FindsNothingInANullObject)
{
    EXPECT_TRUE(GetParam().givesNothing(nullptr, "key", &found_));
    EXPECT_EQ(found_, 0);
}

TEST_P(ZlvObjectPropGetter, FindsNoNullName)
{
    setProp(app_, "key", "1");
    EXPECT_TRUE(GetParam().givesNothing(app_, nullptr, &found_));
    EXPECT_EQ(found_, 0);
}

TEST_P(ZlvObjectPropGetter, NeedsNoFlag)
{
    EXPECT_TRUE(GetParam().givesNothing(app_, "key", nullptr));
}

TEST_P(ZlvObjectPropGetter, FindsNoValueThatDoesNotConvert)
{
    const bool converts = std::string(GetParam().name) == "Text"; // every text is a text
    setProp(app_, "key", "word");
    EXPECT_EQ(GetParam().givesNothing(app_, "key", &found_), !converts);
    EXPECT_EQ(found_, converts ? 1 : 0);
}

void freeText(char *text)
{
    RkoMemoryFree(text);
}

template <class Number>
void freeText(Number /*nothing to free*/)
{
}

#define GETTER(name, type, nothing)                                                                \
    Getter                                                                                         \
    {                                                                                              \
        name, [](ZlvObject *o, const char *key, ZlvBool *found) {                                  \
            const auto value = ZlvGetObjProp##type(o, key, found);                                 \
            const bool isNothing = value == (nothing);                                             \
            freeText(value);                                                                       \
            return isNothing;                                                                      \
        }                                                                                          \
    }

INSTANTIATE_TEST_SUITE_P(, ZlvObjectPropGetter,
                         testing::Values(GETTER("Text", , nullptr), GETTER("Bool", Bool, 0),
                                         GETTER("Int", Int, 0), GETTER("Long", Long, 0),
                                         GETTER("Float", Float, 0.0F),
                                         GETTER("Double", Double, 0.0)),
                         [](const auto &row) { return row.param.name; });

#undef GETTER

/// A setter, given an object and a name.
struct Setter {
    const char *name;
    void (*set)(ZlvObject *, const char *);
};

class ZlvObjectPropSetter : public ZlvObjectProps, public testing::WithParamInterface<Setter> {};

TEST_P(ZlvObjectPropSetter, IgnoresANullObject)
{
    GetParam().set(nullptr, "key");
    EXPECT_EQ(Scripted::changed, Names{});
}

TEST_P(ZlvObjectPropSetter, IgnoresANullName)
{
    GetParam().set(app_, nullptr);
    EXPECT_EQ(Scripted::changed, Names{});
    EXPECT_TRUE(app_->properties == nullptr || app_->properties->first == nullptr);
}

TEST_P(ZlvObjectPropSetter, NeedsNoConfigurationChangeEntry)
{
    ZlvAddLoggerClass("deaf", nullptr, nullptr, nullptr, nullptr, nullptr);
    ZlvObject *deaf = logger("deaf", "deaf");
    GetParam().set(deaf, "key");
    EXPECT_NE(prop(deaf, "key"), std::nullopt);
}

TEST_P(ZlvObjectPropSetter, TellsTheClassAfterStoring)
{
    Text seen;
    Scripted::script.change = [&](ZlvObject *object, const std::string &name) {
        seen = taken(zlvIntlGetObjProp(object, name.c_str(), nullptr));
    };
    GetParam().set(app_, "key");
    EXPECT_EQ(seen, prop(app_, "key"));
    EXPECT_NE(seen, std::nullopt);
}

INSTANTIATE_TEST_SUITE_P(
    , ZlvObjectPropSetter,
    testing::Values(
        Setter{"Text", [](ZlvObject *o, const char *key) { ZlvSetObjProp(o, key, "1"); }},
        Setter{"Bool", [](ZlvObject *o, const char *key) { ZlvSetObjPropBool(o, key, 1); }},
        Setter{"Int", [](ZlvObject *o, const char *key) { ZlvSetObjPropInt(o, key, 1); }},
        Setter{"Long", [](ZlvObject *o, const char *key) { ZlvSetObjPropLong(o, key, 1); }},
        Setter{"Float", [](ZlvObject *o, const char *key) { ZlvSetObjPropFloat(o, key, 1); }},
        Setter{"Double", [](ZlvObject *o, const char *key) { ZlvSetObjPropDouble(o, key, 1); }}),
    [](const auto &row) { return row.param.name; });

TEST_F(ZlvObjectProps, NotifyingTellsTheClass)
{
    zlvNotifyObjCfgChange(app_, "key");
    EXPECT_EQ(Scripted::changed, Names{"app.key"});
}

TEST_F(ZlvObjectProps, NotifyingANullObjectIsIgnored)
{
    zlvNotifyObjCfgChange(nullptr, "key");
    EXPECT_EQ(Scripted::changed, Names{});
}

TEST_F(ZlvObjectProps, WantOfMemoryLeavesAnObjectThatCanBeSetAgain)
{
    for (uint32_t allowed = 0; allowed < 8; ++allowed) {
        std::string key = "key" + std::to_string(allowed);
        {
            FailAlloc fail(allowed);
            ZlvSetObjProp(app_, key.c_str(), "new");
        }
        ZlvSetObjProp(app_, key.c_str(), "newer");
        EXPECT_EQ(prop(app_, key.c_str()), "newer") << "after " << allowed << " allocations";
    }
}

} // namespace
} // namespace zelvo_test
