// SPDX-License-Identifier: Apache-2.0
// The registry of classes.
#include "support/FailAlloc.h"
#include "support/ToolkitFixture.h"

#include "CxString.h"
#include "ZlvBasicFormatter.h"
#include "ZlvConsoleHandler.h"
#include "ZlvHandler.h"
#include "ZlvIntl.h"
#include "ZlvLevelFilter.h"

namespace zelvo_test {
namespace {

class ZlvClasses : public ToolkitFixture {
protected:
    static Names namesOf(uint32_t kind)
    {
        Names names;
        for (StringGroupIterator at = zlvToolkitFetchClassnames(kind);
             ZlvStringGroupIterHasNext(at); at = ZlvStringGroupIterNext(at))
            names.push_back(taken(ZlvStringGroupIterGet(at)).value_or("(none)"));
        return names;
    }

    /// A record that the registry will own.
    static ZlvObjClass *record(const char *name, uint32_t kind)
    {
        return zlvInitObjectClass(name, kind, nullptr, nullptr, nullptr, nullptr);
    }
};

TEST_F(ZlvClasses, InitialisingMakesTheRegistryAndTheListsOfNames)
{
    zlvToolkitInitObjClasses();
    EXPECT_NE(ZLV_TK_CLASSES, nullptr);
    EXPECT_NE(ZLV_TK_LOGGER_CLASSNAMES, nullptr);
    EXPECT_NE(ZLV_TK_FILTER_CLASSNAMES, nullptr);
    EXPECT_NE(ZLV_TK_HANDLER_CLASSNAMES, nullptr);
    EXPECT_NE(ZLV_TK_FORMATTER_CLASSNAMES, nullptr);
}

TEST_F(ZlvClasses, InitialisingAgainChangesNothing)
{
    zlvToolkitInitObjClasses();
    StringToObjClassMap *before = ZLV_TK_CLASSES;
    ZlvObjClass *builtin = zlvToolkitGetClassDef("zlv_basiclogger");
    Names names = namesOf(ZLV_KIND_LOGGER);
    zlvToolkitInitObjClasses();
    EXPECT_EQ(ZLV_TK_CLASSES, before);
    EXPECT_EQ(zlvToolkitGetClassDef("zlv_basiclogger"), builtin);
    EXPECT_EQ(namesOf(ZLV_KIND_LOGGER), names);
}

TEST_F(ZlvClasses, WithoutMemoryForAllOfItThereIsNoRegistryAndTheNextCallMakesIt)
{
    for (uint32_t allowed = 0; allowed < 5; ++allowed) {
        {
            FailAlloc fail(allowed, FailAlloc::Once);
            zlvToolkitInitObjClasses();
        }
        EXPECT_EQ(ZLV_TK_CLASSES, nullptr);
        EXPECT_EQ(ZLV_TK_LOGGER_CLASSNAMES, nullptr);
        EXPECT_EQ(ZLV_TK_FORMATTER_CLASSNAMES, nullptr);
    }
    zlvToolkitInitObjClasses();
    EXPECT_FALSE(namesOf(ZLV_KIND_FORMATTER).empty());
}

TEST_F(ZlvClasses, AddingAClassMakesTheRegistryAndTheBuiltinClasses)
{
    zlvToolkitAddClassDef("mine", record("mine", ZLV_KIND_LOGGER));
    EXPECT_NE(zlvToolkitGetClassDef("mine"), nullptr);
    EXPECT_NE(zlvToolkitGetClassDef("zlv_basiclogger"), nullptr);
}

TEST_F(ZlvClasses, AddingANullClassIsIgnoredAndMakesNoRegistry)
{
    zlvToolkitAddClassDef("mine", nullptr);
    EXPECT_EQ(ZLV_TK_CLASSES, nullptr);
}

TEST_F(ZlvClasses, AddingAClassUnderANullNameRegistersNothingAndFreesIt)
{
    zlvToolkitInitObjClasses();
    zlvToolkitAddClassDef(nullptr, record("mine", ZLV_KIND_LOGGER));
    EXPECT_EQ(zlvToolkitGetClassDef("mine"), nullptr);
    EXPECT_EQ(namesOf(ZLV_KIND_LOGGER), (Names{"zlv_basiclogger", "zlv_pdlogger"}));
}

TEST_F(ZlvClasses, AnUnknownKindIsRegisteredButListedNowhere)
{
    zlvToolkitAddClassDef("odd", record("odd", 105));
    EXPECT_NE(zlvToolkitGetClassDef("odd"), nullptr);
    for (uint32_t kind = 100; kind <= 106; ++kind) {
        Names names = namesOf(kind);
        EXPECT_EQ(std::count(names.begin(), names.end(), "odd"), 0) << kind;
    }
}

TEST_F(ZlvClasses, ClassesAreLookedUpExactly)
{
    zlvToolkitInitObjClasses();
    EXPECT_EQ(zlvToolkitGetClassDef("ZLV_BASICLOGGER"), nullptr);
    EXPECT_EQ(zlvToolkitGetClassDef("zlv_basic"), nullptr);
}

TEST_F(ZlvClasses, LookingUpANullNameFindsNothing)
{
    zlvToolkitInitObjClasses();
    EXPECT_EQ(zlvToolkitGetClassDef(nullptr), nullptr);
}

TEST_F(ZlvClasses, LookingUpWhileThereIsNoRegistryFindsNothing)
{
    EXPECT_EQ(zlvToolkitGetClassDef("zlv_basiclogger"), nullptr);
}

TEST_F(ZlvClasses, NamesOfAnUnknownKindAreNone)
{
    zlvToolkitInitObjClasses();
    EXPECT_EQ(zlvToolkitFetchClassnames(100), nullptr);
    EXPECT_EQ(zlvToolkitFetchClassnames(105), nullptr);
    EXPECT_EQ(zlvToolkitFetchClassnames(0), nullptr);
}

TEST_F(ZlvClasses, NamesWhileThereIsNoRegistryAreNone)
{
    EXPECT_EQ(zlvToolkitFetchClassnames(ZLV_KIND_LOGGER), nullptr);
}

TEST_F(ZlvClasses, AClassRegisteredBeforeTheRegistryDisplacesTheBuiltinOne)
{
    ZlvAddLoggerClass("zlv_basiclogger", nullptr, nullptr, nullptr, nullptr, nullptr);
    ZlvObjClass *mine = zlvToolkitGetClassDef("zlv_basiclogger");
    ASSERT_NE(mine, nullptr);
    EXPECT_EQ(mine->fCfgChange, nullptr) << "the built-in one has an entry";
}

TEST_F(ZlvClasses, ADisplacedBuiltinsNameIsListedOnce)
{
    ZlvAddLoggerClass("zlv_basiclogger", nullptr, nullptr, nullptr, nullptr, nullptr);
    Names names = namesOf(ZLV_KIND_LOGGER);
    EXPECT_EQ(std::count(names.begin(), names.end(), "zlv_basiclogger"), 1);
}

TEST_F(ZlvClasses, ARefusedRegistrationMakesNoRegistry)
{
    ZlvAddLoggerClass(nullptr, nullptr, nullptr, nullptr, nullptr, nullptr);
    EXPECT_EQ(ZLV_TK_CLASSES, nullptr);
}

TEST_F(ZlvClasses, TheApplicationsClassesAreUnknownAfterCloseAndReopen)
{
    open();
    ZlvAddLoggerClass("mine", nullptr, nullptr, nullptr, nullptr, nullptr);
    close();
    EXPECT_EQ(zlvToolkitGetClassDef("mine"), nullptr);
    open();
    EXPECT_EQ(zlvToolkitGetClassDef("mine"), nullptr);
    EXPECT_EQ(namesOf(ZLV_KIND_LOGGER).front(), "zlv_basiclogger");
}

TEST_F(ZlvClasses, ClassesMadeBeforeOpenStayWhenItOpens)
{
    ZlvAddLoggerClass("mine", nullptr, nullptr, nullptr, nullptr, nullptr);
    ZlvObjClass *mine = zlvToolkitGetClassDef("mine");
    open();
    EXPECT_EQ(zlvToolkitGetClassDef("mine"), mine);
}

TEST_F(ZlvClasses, AMapTakesAClassAsItIs)
{
    ZlvObjClass objClass{};
    EXPECT_EQ(zlvReturnObjClass(&objClass), &objClass);
    EXPECT_EQ(zlvReturnObjClass(nullptr), nullptr);
}

TEST_F(ZlvClasses, AMapLetsGoOfAClassByDoingNothing)
{
    zlvToolkitInitObjClasses();
    ZlvObjClass *builtin = zlvToolkitGetClassDef("zlv_basiclogger");
    zlvIgnoreObjClass(builtin);
    zlvIgnoreObjClass(nullptr);
    EXPECT_STREQ(builtin->name, "zlv_basiclogger");
}

struct KindOfName {
    const char *name;
    uint32_t kind;
};

class ZlvClassesOfKind : public ToolkitFixture, public testing::WithParamInterface<KindOfName> {};

TEST_P(ZlvClassesOfKind, AddTheirNameToTheListOfTheirKindAlone)
{
    zlvToolkitAddClassDef(
        "mine", zlvInitObjectClass("mine", GetParam().kind, nullptr, nullptr, nullptr, nullptr));
    for (uint32_t kind : {101u, 102u, 103u, 104u}) {
        bool listed = false;
        for (auto at = zlvToolkitFetchClassnames(kind); ZlvStringGroupIterHasNext(at);
             at = ZlvStringGroupIterNext(at))
            listed |= taken(ZlvStringGroupIterGet(at)) == "mine";
        EXPECT_EQ(listed, kind == GetParam().kind) << kind;
    }
}

INSTANTIATE_TEST_SUITE_P(, ZlvClassesOfKind,
                         testing::Values(KindOfName{"Logger", 101}, KindOfName{"Filter", 102},
                                         KindOfName{"Handler", 103}, KindOfName{"Formatter", 104}),
                         [](const auto &row) { return row.param.name; });

} // namespace
} // namespace zelvo_test
