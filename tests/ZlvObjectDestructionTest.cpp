// SPDX-License-Identifier: Apache-2.0
// The end of an object: its steps, their order and what they let go.
#include "support/Scripted.h"
#include "support/ToolkitFixture.h"

#include "ZlvHandler.h"
#include "ZlvOwned.h"

namespace zelvo_test {
namespace {

class ZlvObjectDestruction : public ToolkitFixture {
protected:
    void SetUp() override
    {
        open();
        Scripted::addClasses();
    }

    static bool exists(const char *name)
    {
        return zlvIntlStringToObjMapHasKey(ZLV_TK_INSTANCES, name) == 1;
    }

    /// An object that the test itself releases.
    static ZlvObject *get(const char *name, const char *className = Scripted::handler)
    {
        return ZlvGetObject(name, className);
    }
};

TEST_F(ZlvObjectDestruction, LeavesTheRegistryBeforeItsCloseEntryRuns)
{
    bool registered = true;
    Scripted::script.close = [&](ZlvObject *self) { registered = exists(self->name); };
    ZlvReleaseObject(get("app"));
    EXPECT_EQ(Scripted::closed, Names{"app"});
    EXPECT_FALSE(registered);
}

TEST_F(ZlvObjectDestruction, CloseEntrySeesTheWholeObject)
{
    Text key;
    size_t listenersSeen = 0;
    bool hasFormatter = false;
    Scripted::script.close = [&](ZlvObject *self) {
        key = taken(zlvIntlGetObjProp(self, "key", nullptr));
        for (auto at = zlvIntlGetListeners(self); at; at = zlvIntlListenerGroupIterNext(at))
            ++listenersSeen;
        hasFormatter = self->handler.formatter != nullptr;
    };
    ZlvObject *app = get("app");
    setProp(app, "key", "value");
    ZlvAddListener(app, handler("below"));
    ZlvReleaseObject(app);
    EXPECT_EQ(key, "value");
    EXPECT_EQ(listenersSeen, 1u);
    EXPECT_TRUE(hasFormatter);
}

TEST_F(ZlvObjectDestruction, ReleasesTheListenersAndThoseInTheirTurnTheirs)
{
    ZlvObject *top = get("top", "zlv_basiclogger");
    ZlvObject *middle = get("middle", "zlv_levelfilter");
    ZlvObject *bottom = get("bottom");
    ZlvAddListener(top, middle);
    ZlvAddListener(middle, bottom);
    ZlvReleaseObject(middle);
    ZlvReleaseObject(bottom);
    EXPECT_TRUE(exists("middle") && exists("bottom"));
    ZlvReleaseObject(top);
    EXPECT_FALSE(exists("top") || exists("middle") || exists("bottom"));
    EXPECT_EQ(Scripted::closed, Names{"bottom"});
}

TEST_F(ZlvObjectDestruction, KeepsListenersThatOthersHold)
{
    ZlvObject *top = get("top", "zlv_basiclogger");
    ZlvObject *shared = handler("shared");
    ZlvAddListener(top, shared);
    ZlvReleaseObject(top);
    EXPECT_EQ(shared->refCount, 2u);
}

TEST_F(ZlvObjectDestruction, HandsTheVariablesToTheFreeEntry)
{
    int vars = 0;
    std::vector<void *> freed;
    Scripted::script.alloc = [&] { return &vars; };
    Scripted::script.free = [&](void *given) { freed.push_back(given); };
    ZlvReleaseObject(get("app"));
    EXPECT_EQ(freed, std::vector<void *>{&vars});
}

TEST_F(ZlvObjectDestruction, CallsTheFreeEntryForAbsentVariablesToo)
{
    int calls = 0;
    Scripted::script.free = [&](void *vars) { calls += vars == nullptr ? 1 : 100; };
    ZlvReleaseObject(get("app"));
    EXPECT_EQ(calls, 1);
}

TEST_F(ZlvObjectDestruction, NeedsNoFreeEntry)
{
    static int vars;
    ZlvAddLoggerClass(
        "careless", nullptr, [] { return static_cast<void *>(&vars); }, nullptr, nullptr, nullptr);
    ZlvReleaseObject(get("app", "careless"));
    EXPECT_FALSE(exists("app"));
}

TEST_F(ZlvObjectDestruction, RunsTheCloseEntryBeforeItFreesTheVariables)
{
    Names steps;
    Scripted::script.close = [&](ZlvObject *) { steps.emplace_back("close"); };
    Scripted::script.free = [&](void *) { steps.emplace_back("free"); };
    ZlvReleaseObject(get("app"));
    EXPECT_EQ(steps, (Names{"close", "free"}));
}

TEST_F(ZlvObjectDestruction, ReleasesTheListenersBeforeItFreesTheVariables)
{
    bool listenerThere = true;
    ZlvObject *app = get("app", Scripted::filter);
    ZlvObject *below = get("below", "zlv_consolehandler");
    ZlvAddListener(app, below);
    ZlvReleaseObject(below);
    Scripted::script.free = [&](void *) { listenerThere = exists("below"); };
    ZlvReleaseObject(app);
    EXPECT_FALSE(listenerThere);
}

TEST_F(ZlvObjectDestruction, ReleasesAHandlersFormatterAfterItsVariables)
{
    bool formatterThere = false;
    ZlvObject *app = get("app");
    ZlvObject *format = get("format", "zlv_basicformatter");
    ZlvHandlerSetFormatter(app, format);
    ZlvReleaseObject(format);
    Scripted::script.free = [&](void *) { formatterThere = exists("format"); };
    ZlvReleaseObject(app);
    EXPECT_TRUE(formatterThere);
    EXPECT_FALSE(exists("format"));
}

TEST_F(ZlvObjectDestruction, OfALoggerOrAFilterCallsNoCloseEntry)
{
    ZlvReleaseObject(get("logger", Scripted::logger));
    ZlvReleaseObject(get("filter", Scripted::filter));
    ZlvReleaseObject(get("formatter", Scripted::formatter));
    EXPECT_EQ(Scripted::closed, Names{});
}

TEST_F(ZlvObjectDestruction, NeedsNoCloseEntry)
{
    zlvToolkitGetClassDef(Scripted::handler)->handler.fClose = nullptr;
    ZlvReleaseObject(get("app"));
    EXPECT_FALSE(exists("app"));
}

TEST_F(ZlvObjectDestruction, FreesAFormattersTexts)
{
    ZlvObject *format = get("format", "zlv_basicformatter");
    setProp(format, "separator", "|");
    setProp(format, "dateTimeFormat", "HH");
    setProp(format, "locale", "de");
    ZlvReleaseObject(format);
    EXPECT_FALSE(exists("format")) << "and the leak checker finds nothing";
}

TEST_F(ZlvObjectDestruction, LeavesARecordWithoutAClassUntilTheMutexIsReleased)
{
    ZlvObject *app = get("app", "zlv_basiclogger");
    zelvo::ApiLock lock;
    zlvIntlReleaseObject(app);
    EXPECT_EQ(app->objClass, nullptr);
    zlvIntlReleaseObject(app);
    EXPECT_EQ(zlvIntlLoggerGetFLog(app), nullptr);
}

TEST_F(ZlvObjectDestruction, HappensOnceThoughTheCloseEntryAcquiresAndReleases)
{
    Scripted::script.close = [&](ZlvObject *self) {
        zlvIntlAcquireObject(self);
        zlvIntlReleaseObject(self);
        zlvIntlReleaseObject(zlvIntlAcquireObject(self));
    };
    ZlvReleaseObject(get("app"));
    EXPECT_EQ(Scripted::closed, Names{"app"});
    EXPECT_FALSE(exists("app"));
}

TEST_F(ZlvObjectDestruction, LeavesAnotherObjectThatTookItsNameMeanwhileInTheRegistry)
{
    Scripted::script.close = [&](ZlvObject *self) {
        Scripted::script.close = nullptr;
        ZlvObject *successor = zlvIntlGetObject(self->name, "zlv_basiclogger");
        EXPECT_NE(successor, self);
    };
    ZlvReleaseObject(get("app"));
    ZlvObject *successor = keep(object("app"));
    ASSERT_NE(successor, nullptr);
    EXPECT_STREQ(successor->objClass->name, "zlv_basiclogger");
}

TEST_F(ZlvObjectDestruction, OfAnObjectWhoseEntryHoldsAnotherKeepsThatEntry)
{
    ZlvObject *app = ZlvAcquireObject(get("app", "zlv_basiclogger"));
    ZlvObject *other = logger("other");
    zlvToolkitAddObjInstance("app", other);
    EXPECT_EQ(app->refCount, 2u);
    ZlvReleaseObject(app);
    EXPECT_EQ(keep(zlvToolkitGetObjInstance("app")), other);
    zlvToolkitRemObjInstance("app");
}

TEST_F(ZlvObjectDestruction, DoesNotHappenWhileAListenerGroupHoldsTheObject)
{
    ZlvObject *app = logger("app");
    ZlvObject *listener = get("listener");
    ZlvAddListener(app, listener);
    ZlvReleaseObject(listener);
    EXPECT_EQ(listeners(app), Names{"listener"});
    EXPECT_EQ(Scripted::closed, Names{});
}

TEST_F(ZlvObjectDestruction, DoesNotHappenWhileAHandlerHoldsItsFormatter)
{
    ZlvObject *format = get("format", "zlv_basicformatter");
    ZlvHandlerSetFormatter(handler("console"), format);
    ZlvReleaseObject(format);
    EXPECT_TRUE(exists("format"));
}

} // namespace
} // namespace zelvo_test
