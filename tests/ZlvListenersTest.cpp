// SPDX-License-Identifier: Apache-2.0
// Groups of listeners.
#include "support/FailAlloc.h"
#include "support/ToolkitFixture.h"

#include "ZlvIntl.h"

namespace zelvo_test {
namespace {

class ZlvListeners : public ToolkitFixture {
protected:
    void SetUp() override
    {
        open();
        app_ = logger("app");
        a_ = handler("a");
        b_ = handler("b");
    }

    ZlvObject *app_ = nullptr;
    ZlvObject *a_ = nullptr;
    ZlvObject *b_ = nullptr;
};

TEST_F(ZlvListeners, KeepTheOrderOfTheirAddition)
{
    ZlvAddListener(app_, b_);
    ZlvAddListener(app_, a_);
    EXPECT_EQ(listeners(app_), (Names{"b", "a"}));
}

TEST_F(ZlvListeners, AreHeldByTheGroup)
{
    ZlvAddListener(app_, a_);
    EXPECT_EQ(a_->refCount, 3u);
}

TEST_F(ZlvListeners, AreInTheGroupOnce)
{
    ZlvAddListener(app_, a_);
    ZlvAddListener(app_, b_);
    ZlvAddListener(app_, a_);
    EXPECT_EQ(listeners(app_), (Names{"a", "b"}));
    EXPECT_EQ(a_->refCount, 3u);
}

TEST_F(ZlvListeners, NullsAreNotAdded)
{
    ZlvAddListener(nullptr, a_);
    ZlvAddListener(app_, nullptr);
    EXPECT_EQ(a_->refCount, 2u);
    EXPECT_EQ(listeners(app_), Names{});
}

TEST_F(ZlvListeners, RemovingUnlinksAndReleases)
{
    ZlvAddListener(app_, a_);
    ZlvAddListener(app_, b_);
    ZlvRemListener(app_, a_);
    EXPECT_EQ(listeners(app_), Names{"b"});
    EXPECT_EQ(a_->refCount, 2u);
}

TEST_F(ZlvListeners, RemovingAnAbsentOneIsHarmless)
{
    ZlvAddListener(app_, a_);
    ZlvRemListener(app_, b_);
    EXPECT_EQ(listeners(app_), Names{"a"});
    EXPECT_EQ(b_->refCount, 2u);
}

TEST_F(ZlvListeners, RemovingMakesNoGroup)
{
    ZlvRemListener(app_, a_);
    EXPECT_EQ(app_->logger.listeners, nullptr);
}

TEST_F(ZlvListeners, RemovingNullsIsIgnored)
{
    ZlvAddListener(app_, a_);
    ZlvRemListener(nullptr, a_);
    ZlvRemListener(app_, nullptr);
    EXPECT_EQ(listeners(app_), Names{"a"});
}

TEST_F(ZlvListeners, RemovingTheLastHolderDestroysTheListener)
{
    ZlvObject *only = ZlvGetObject("only", "zlv_consolehandler");
    ZlvAddListener(app_, only);
    ZlvReleaseObject(only);
    ZlvRemListener(app_, only);
    EXPECT_EQ(zlvToolkitGetObjInstance("only"), nullptr);
}

TEST_F(ZlvListeners, WithoutAGroupTheIteratorIsEmpty)
{
    EXPECT_EQ(ZlvGetListeners(app_), nullptr);
    EXPECT_EQ(ZlvListenerGroupIterHasNext(ZlvGetListeners(app_)), 0);
    EXPECT_EQ(ZlvGetListeners(nullptr), nullptr);
}

TEST_F(ZlvListeners, ListingMakesNoGroup)
{
    ZlvGetListeners(app_);
    EXPECT_EQ(app_->logger.listeners, nullptr);
}

TEST_F(ZlvListeners, WantOfMemoryAddsNothing)
{
    for (uint32_t allowed = 0; listeners(app_).empty(); ++allowed) {
        ASSERT_LT(allowed, 100u);
        EXPECT_EQ(a_->refCount, 2u);
        FailAlloc fail(allowed);
        ZlvAddListener(app_, a_);
    }
    EXPECT_EQ(listeners(app_), Names{"a"});
}

/// Where an object of a kind keeps its group.
struct Place {
    const char *kind;
    const char *className;
    ListenerGroup *(*group)(const ZlvObject *);
};

class ZlvListenersOfKind : public ToolkitFixture, public testing::WithParamInterface<Place> {
protected:
    void SetUp() override
    {
        open();
        object_ = object("object", GetParam().className);
    }

    ZlvObject *object_ = nullptr;
};

TEST_P(ZlvListenersOfKind, AreNoneAtFirst)
{
    EXPECT_EQ(GetParam().group(object_), nullptr);
    EXPECT_EQ(zlvFetchListenerGroup(object_, 0), nullptr);
}

TEST_P(ZlvListenersOfKind, GroupIsMadeOnDemand)
{
    ListenerGroup *group = zlvFetchListenerGroup(object_, 1);
    ASSERT_NE(group, nullptr);
    EXPECT_EQ(GetParam().group(object_), group);
    EXPECT_EQ(zlvFetchListenerGroup(object_, 0), group);
    EXPECT_EQ(zlvFetchListenerGroup(object_, 1), group);
}

TEST_P(ZlvListenersOfKind, AreAddedAndRemoved)
{
    ZlvObject *listener = handler("listener");
    ZlvAddListener(object_, listener);
    EXPECT_EQ(listeners(object_), Names{"listener"});
    ZlvRemListener(object_, listener);
    EXPECT_EQ(listeners(object_), Names{});
}

INSTANTIATE_TEST_SUITE_P(
    , ZlvListenersOfKind,
    testing::Values(
        Place{"Logger", "zlv_basiclogger", [](const ZlvObject *o) { return o->logger.listeners; }},
        Place{"Filter", "zlv_levelfilter", [](const ZlvObject *o) { return o->filter.listeners; }},
        Place{"Handler", "zlv_consolehandler",
              [](const ZlvObject *o) { return o->handler.listeners; }}),
    [](const auto &row) { return row.param.kind; });

TEST_F(ZlvListeners, FormattersHaveNone)
{
    ZlvObject *format = formatter("formatter");
    ZlvAddListener(format, a_);
    EXPECT_EQ(zlvFetchListenerGroup(format, 1), nullptr);
    EXPECT_EQ(ZlvGetListeners(format), nullptr);
    EXPECT_EQ(a_->refCount, 2u);
    ZlvRemListener(format, a_);
    EXPECT_EQ(a_->refCount, 2u);
}

TEST_F(ZlvListeners, NullHasNoGroup)
{
    EXPECT_EQ(zlvFetchListenerGroup(nullptr, 1), nullptr);
}

TEST_F(ZlvListeners, ListenerNamesAreSeparatedByBlanksAndLineEnds)
{
    setProp(app_, "listenerNames", "  a\tb\n");
    EXPECT_EQ(listeners(app_), (Names{"a", "b"}));
}

class ZlvListenerNamesSeparator : public ZlvListeners, public testing::WithParamInterface<char> {};

TEST_P(ZlvListenerNamesSeparator, SeparatesNames)
{
    std::string names = std::string("a") + GetParam() + GetParam() + "b";
    setProp(app_, "listenerNames", names.c_str());
    EXPECT_EQ(listeners(app_), (Names{"a", "b"}));
}

INSTANTIATE_TEST_SUITE_P(, ZlvListenerNamesSeparator,
                         testing::Values(' ', '\t', '\r', '\n', '\f', '\v'));

TEST_F(ZlvListeners, OtherCharactersDoNotSeparateNames)
{
    setProp(app_, "listenerNames", "a,b");
    EXPECT_EQ(listeners(app_), Names{});
    EXPECT_EQ(ZlvLogMgrHasCfg("a,b"), 1) << "asked for under that name";
}

TEST_F(ZlvListeners, AnEmptyListOfNamesRemovesAll)
{
    ZlvAddListener(app_, a_);
    setProp(app_, "listenerNames", "");
    EXPECT_EQ(listeners(app_), Names{});
    EXPECT_EQ(app_->logger.listeners, nullptr);
    EXPECT_EQ(a_->refCount, 2u);
}

TEST_F(ZlvListeners, RemovingTheListOfNamesRemovesAll)
{
    setProp(app_, "listenerNames", "a b");
    setProp(app_, "listenerNames", nullptr);
    EXPECT_EQ(listeners(app_), Names{});
}

TEST_F(ZlvListeners, ANewListOfNamesReplacesTheListeners)
{
    ZlvAddListener(app_, a_);
    setProp(app_, "listenerNames", "b");
    EXPECT_EQ(listeners(app_), Names{"b"});
    EXPECT_EQ(a_->refCount, 2u);
    EXPECT_EQ(b_->refCount, 3u) << "only the group keeps a reference";
}

TEST_F(ZlvListeners, ANameTwiceListensOnce)
{
    setProp(app_, "listenerNames", "a b a");
    EXPECT_EQ(listeners(app_), (Names{"a", "b"}));
    EXPECT_EQ(a_->refCount, 3u);
}

TEST_F(ZlvListeners, ANameWithoutAClassIsLeftOut)
{
    setProp(app_, "listenerNames", "a unknown b");
    EXPECT_EQ(listeners(app_), (Names{"a", "b"}));
}

TEST_F(ZlvListeners, NamedListenersAreMadeFromTheirConfigurations)
{
    close();
    open("out.className=zlv_consolehandler\nwarn.className=zlv_levelfilter\n"
         "warn.listenerNames=out\napp.listenerNames=warn\n");
    ZlvObject *app = logger("app");
    EXPECT_EQ(listeners(app), Names{"warn"});
    EXPECT_EQ(listeners(object("warn")), Names{"out"});
    EXPECT_EQ(object("warn")->refCount, 4u) << "the registry's, the group's and these two";
}

} // namespace
} // namespace zelvo_test
