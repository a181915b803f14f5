// SPDX-License-Identifier: Apache-2.0
// Closing the toolkit.
#include "support/BrokenMutex.h"
#include "support/Scripted.h"
#include "support/ToolkitFixture.h"

#include "ZlvHandler.h"
#include "ZlvIntl.h"

namespace zelvo_test {
namespace {

/// One piece of the process-wide state.
struct State {
    const char *name;
    bool (*isEmpty)();
};

class ZlvToolkitState : public ToolkitFixture, public testing::WithParamInterface<State> {};

TEST_P(ZlvToolkitState, IsEmptyAtFirst)
{
    EXPECT_TRUE(GetParam().isEmpty());
}

TEST_P(ZlvToolkitState, IsEmptyAfterClose)
{
    open();
    logger("app");
    close();
    EXPECT_TRUE(GetParam().isEmpty());
}

TEST_P(ZlvToolkitState, IsNotEmptyWhileOpen)
{
    open();
    EXPECT_FALSE(GetParam().isEmpty());
}

TEST_P(ZlvToolkitState, IsEmptyAfterAFailedOpen)
{
    EXPECT_EQ(ZlvOpenToolkit("absent.properties", nullptr), 0);
    EXPECT_TRUE(GetParam().isEmpty());
}

#define EMPTY(name)                                                                                \
    State                                                                                          \
    {                                                                                              \
#name, [] { return name == decltype(name){}; }                                             \
    }

INSTANTIATE_TEST_SUITE_P(
    , ZlvToolkitState,
    testing::Values(EMPTY(ZLV_TK_API_MUTEX), EMPTY(ZLV_TK_API_MUTEX_EXISTS), EMPTY(ZLV_TK_CLASSES),
                    EMPTY(ZLV_TK_LOGGER_CLASSNAMES), EMPTY(ZLV_TK_FILTER_CLASSNAMES),
                    EMPTY(ZLV_TK_HANDLER_CLASSNAMES), EMPTY(ZLV_TK_FORMATTER_CLASSNAMES),
                    EMPTY(ZLV_TK_INSTANCES), EMPTY(ZLV_TK_ISOPEN), EMPTY(ZLV_TK_CFG_NAMES),
                    EMPTY(ZLV_TK_CFG_DATA), EMPTY(ZLV_TK_LOG_MGR_INITIALIZED)),
    [](const auto &row) { return row.param.name; });

#undef EMPTY

class ZlvToolkitClose : public ToolkitFixture {
protected:
    void SetUp() override
    {
        open();
        Scripted::addClasses();
    }

    /// An object whose reference the application never gives back.
    static ZlvObject *hold(const char *name, const char *className = Scripted::handler)
    {
        return ZlvGetObject(name, className);
    }
};

TEST_F(ZlvToolkitClose, IsHarmlessWhenNothingIsOpen)
{
    ZlvCloseToolkit();
    ZlvCloseToolkit();
    EXPECT_EQ(ZLV_TK_ISOPEN, 0);
}

TEST_F(ZlvToolkitClose, DoesNothingWithoutTheMutex)
{
    {
        BrokenMutex broken;
        ZlvCloseToolkit();
    }
    EXPECT_EQ(ZLV_TK_ISOPEN, 1);
    EXPECT_NE(ZLV_TK_CLASSES, nullptr);
    EXPECT_NE(ZLV_TK_INSTANCES, nullptr);
}

TEST_F(ZlvToolkitClose, LeavesTheStaleErrorLogger)
{
    ZlvObject *errorLog = ZLV_TK_ERROR_LOG;
    ZlvCloseToolkit();
    EXPECT_EQ(ZLV_TK_ERROR_LOG, errorLog);
    EXPECT_EQ(zlvToolkitLogger(), nullptr);
}

TEST_F(ZlvToolkitClose, FreesClassesRegisteredWhileClosed)
{
    ZlvCloseToolkit();
    ZlvAddLoggerClass("mine", nullptr, nullptr, nullptr, nullptr, nullptr);
    ZlvCloseToolkit();
    EXPECT_EQ(ZLV_TK_CLASSES, nullptr);
}

TEST_F(ZlvToolkitClose, DestroysObjectsThatTheApplicationHoldsOnce)
{
    hold("app");
    ZlvCloseToolkit();
    EXPECT_EQ(Scripted::closed, Names{"app"});
}

TEST_F(ZlvToolkitClose, DestroysObjectsThatOnlyOthersHold)
{
    ZlvObject *app = hold("app", "zlv_basiclogger");
    ZlvObject *below = hold("below");
    ZlvAddListener(app, below);
    ZlvReleaseObject(below);
    ZlvReleaseObject(app);
    ZlvObject *held = hold("held", "zlv_basiclogger");
    ZlvAddListener(held, keep(hold("listener")));
    close();
    EXPECT_EQ(Scripted::closed, (Names{"below", "listener"}));
}

TEST_F(ZlvToolkitClose, FreesTheVariablesOfEachObjectOnce)
{
    int blocks[3] = {};
    int next = 0;
    std::vector<void *> freed;
    Scripted::script.alloc = [&] { return &blocks[next++]; };
    Scripted::script.free = [&](void *vars) {
        if (vars != nullptr)
            freed.push_back(vars);
    };
    hold("one");
    hold("two", Scripted::logger);
    hold("three", Scripted::formatter);
    ZlvCloseToolkit();
    EXPECT_EQ(freed, (std::vector<void *>{&blocks[0], &blocks[1], &blocks[2]}));
}

TEST_F(ZlvToolkitClose, FreesTheVariablesBeforeAnyObjectIsDestroyed)
{
    Names steps;
    int vars = 0;
    Scripted::script.alloc = [&] { return &vars; };
    Scripted::script.free = [&](void *given) { steps.emplace_back(given ? "free" : "free null"); };
    Scripted::script.close = [&](ZlvObject *self) {
        steps.emplace_back(self->vars ? "close" : "close without variables");
    };
    hold("one");
    hold("two");
    ZlvCloseToolkit();
    EXPECT_EQ(steps, (Names{"free", "free", "close without variables", "free null",
                            "close without variables", "free null"}));
}

TEST_F(ZlvToolkitClose, DetachesTheFormattersOfHandlersFirst)
{
    bool detached = false;
    Scripted::script.close = [&](ZlvObject *self) {
        detached = self->handler.formatter == nullptr;
    };
    hold("app");
    ZlvCloseToolkit();
    EXPECT_TRUE(detached);
}

TEST_F(ZlvToolkitClose, FreeingVariablesMayReleaseOtherObjects)
{
    ZlvObject *other = hold("other");
    Scripted::script.alloc = [&] { return static_cast<void *>(other); };
    Scripted::script.free = [&](void *vars) {
        zlvIntlReleaseObject(static_cast<ZlvObject *>(vars));
    };
    hold("holder", Scripted::logger);
    hold("bystander", "zlv_basiclogger");
    ZlvCloseToolkit();
    EXPECT_EQ(Scripted::closed, Names{"other"});
}

TEST_F(ZlvToolkitClose, ClosesTheConfigurationsBeforeTheObjects)
{
    bool initialized = true;
    Scripted::script.close = [&](ZlvObject *) { initialized = ZLV_TK_LOG_MGR_INITIALIZED == 1; };
    hold("app");
    ZlvCloseToolkit();
    EXPECT_EQ(Scripted::closed, Names{"app"});
    EXPECT_FALSE(initialized);
}

TEST_F(ZlvToolkitClose, ClosesTheObjectsBeforeTheClasses)
{
    bool known = false;
    Scripted::script.close = [&](ZlvObject *) {
        known = zlvToolkitGetClassDef(Scripted::handler) != nullptr;
    };
    hold("app");
    ZlvCloseToolkit();
    EXPECT_TRUE(known);
}

TEST_F(ZlvToolkitClose, ReleasesWhatTheApplicationStillHoldsSilently)
{
    ZlvObject *app = hold("app");
    ZlvAcquireObject(app);
    ZlvAcquireObject(app);
    ZlvCloseToolkit();
    EXPECT_EQ(ZLV_TK_INSTANCES, nullptr);
    EXPECT_EQ(Scripted::closed.size(), 1u) << "closed once, whoever holds it";
}

TEST_F(ZlvToolkitClose, PrintsNoTrailerOfAConsoleWhoseVariablesWereFreedFirst)
{
    ZlvObject *app = logger("app");
    ZlvAddListener(app, handler("out"));
    console([&] { log(app, u"text"); });
    EXPECT_EQ(console([&] { close(); }), "");
}

TEST_F(ZlvToolkitClose, OpensAgainWithTheBuiltinClassesAndDefaultObjects)
{
    close();
    open();
    EXPECT_NE(zlvToolkitGetClassDef("zlv_basiclogger"), nullptr);
    EXPECT_EQ(listeners(object("zelvo.errorLogger")), Names{"zelvo.defaultConsole"});
}

TEST_F(ZlvToolkitClose, ForgetsObjectsAndConfigurations)
{
    ZlvObject *app = logger("app");
    setProp(app, "key", "value");
    ZlvObjCfg *cfg = ZlvLogMgrGetCfg("app");
    ZlvSetObjCfgProp(cfg, "key", "configured");
    ZlvReleaseObjCfg(cfg);
    close();
    open();
    EXPECT_EQ(ZlvLogMgrHasCfg("app"), 0);
    EXPECT_EQ(prop(logger("app"), "key"), std::nullopt);
}

TEST_F(ZlvToolkitClose, CreatesNothingOnceItHasBegun)
{
    std::vector<ZlvObject *> made;
    Scripted::script.close = [&](ZlvObject *) {
        made.push_back(zlvIntlGetObject("late", "zlv_basiclogger"));
    };
    hold("app");
    ZlvCloseToolkit();
    EXPECT_EQ(made, std::vector<ZlvObject *>{nullptr});
}

} // namespace
} // namespace zelvo_test
