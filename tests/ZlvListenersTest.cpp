// SPDX-License-Identifier: Apache-2.0
// Groups of listeners, and the dispatch of an event to them.
#include "support/FailAlloc.h"
#include "support/Recorder.h"
#include "support/Scripted.h"
#include "support/VaList.h"

#include "ZlvOwned.h"

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

/// Dispatch, seen through recorders.
class ZlvDispatch : public RecordedToolkit {
protected:
    void SetUp() override
    {
        RecordedToolkit::SetUp();
        Scripted::addClasses();
    }

    ZlvObject *recorder(const char *name) { return handler(name, Recorder::className); }
};

TEST_F(ZlvDispatch, ReachesEachListenerInTheOrderOfAddition)
{
    ZlvAddListener(app_, recorder("third"));
    ZlvAddListener(app_, recorder("second"));
    log(app_, u"text");
    EXPECT_EQ(Recorder::order(), (Names{"recorder", "third", "second"}));
}

TEST_F(ZlvDispatch, HandsOnTheOneEventAndItsArguments)
{
    ZlvAddListener(app_, recorder("second"));
    ZlvLogUText(app_, u"{0}", u"text");
    ASSERT_EQ(records().size(), 2u);
    EXPECT_EQ(records()[0].text, u"text");
    EXPECT_EQ(records()[1].text, u"text") << "each listener reads the arguments from the start";
}

TEST_F(ZlvDispatch, GoesThroughFiltersToTheirListeners)
{
    ZlvObject *inner = filter("inner");
    ZlvAddListener(app_, inner);
    ZlvAddListener(inner, recorder("below"));
    log(app_, u"text");
    EXPECT_EQ(Recorder::order(), (Names{"recorder", "below"}));
}

TEST_F(ZlvDispatch, ADisabledFilterBlocksEverythingBelowIt)
{
    ZlvObject *outer = filter("outer");
    ZlvObject *inner = filter("inner");
    ZlvRemListener(app_, recorder_);
    ZlvAddListener(app_, outer);
    ZlvAddListener(outer, inner);
    ZlvAddListener(outer, recorder_);
    ZlvAddListener(inner, recorder_);
    ZlvSetObjectEnabled(outer, 0);
    log(app_, u"text");
    EXPECT_EQ(Recorder::order(), Names{});
}

TEST_F(ZlvDispatch, ALoggerThatListensReceivesNothing)
{
    ZlvObject *other = logger("other");
    ZlvAddListener(app_, other);
    ZlvAddListener(other, recorder("below"));
    log(app_, u"text");
    EXPECT_EQ(Recorder::order(), Names{"recorder"});
}

TEST_F(ZlvDispatch, AFormatterThatListensIsSkipped)
{
    ZlvRemListener(app_, recorder_);
    ZlvAddListener(app_, formatter("formatter"));
    ZlvAddListener(app_, recorder_);
    log(app_, u"text");
    EXPECT_EQ(Recorder::order(), Names{"recorder"});
}

TEST_F(ZlvDispatch, AListenerWithoutAClassIsSkipped)
{
    ZlvObject *odd = recorder("odd");
    ZlvAddListener(app_, odd);
    ZlvObjClass *objClass = std::exchange(odd->objClass, nullptr);
    log(app_, u"text");
    odd->objClass = objClass;
    EXPECT_EQ(Recorder::order(), Names{"recorder"});
}

class ZlvDispatchWithoutEntry : public ZlvDispatch,
                                public testing::WithParamInterface<const char *> {};

TEST_P(ZlvDispatchWithoutEntry, SkipsTheListener)
{
    ZlvObjClass *objClass = zlvToolkitGetClassDef(GetParam());
    objClass->filter.fProcess = nullptr;
    objClass->handler.fProcess = nullptr;
    ZlvObject *mute = object("mute", GetParam());
    ZlvAddListener(mute, recorder("below"));
    ZlvAddListener(app_, mute);
    log(app_, u"text");
    EXPECT_EQ(Recorder::order(), Names{"recorder"});
}

INSTANTIATE_TEST_SUITE_P(, ZlvDispatchWithoutEntry,
                         testing::Values(Scripted::filter, Scripted::handler));

TEST_F(ZlvDispatch, LeavesItToAHandlerWhetherADisabledOneActs)
{
    ZlvSetObjectEnabled(recorder_, 0);
    log(app_, u"text");
    EXPECT_EQ(Recorder::order(), Names{"recorder"}) << "a recorder does not look at its flag";
}

TEST_F(ZlvDispatch, AListenersFailureDoesNotStopTheWalk)
{
    ZlvAddListener(app_, recorder("second"));
    Recorder::leave({CX_STATUS_PLATFORM, 28});
    EXPECT_EQ(log(app_, u"text").code, 28);
    EXPECT_EQ(Recorder::order(), (Names{"recorder", "second"}));
}

TEST_F(ZlvDispatch, ADisabledOrNullObjectDispatchesNothing)
{
    ZlvEvent *event = ZlvVaAllocUEvent(ZLV_LEVEL_INFO, nullptr, nullptr, u"text", noArgs());
    ZlvSetObjectEnabled(app_, 0);
    ZlvBasicObjectFLog(app_, event, noArgs());
    ZlvBasicObjectFLog(nullptr, event, noArgs());
    EXPECT_EQ(Recorder::order(), Names{});
    ZlvFreeEvent(event);
}

TEST_F(ZlvDispatch, WithoutListenersDoesNothing)
{
    EXPECT_EQ(log(logger("lonely"), u"text").type, CX_STATUS_OK);
}

TEST_F(ZlvDispatch, HoldsEachListenerWhileItIsCalled)
{
    uint32_t count = 0;
    ZlvObject *held = handler("held", Scripted::handler);
    Scripted::script.process = [&](ZlvObject *self, ZlvEvent *) { count = self->refCount; };
    ZlvAddListener(app_, held);
    log(app_, u"text");
    EXPECT_GT(count, 3u);
    EXPECT_EQ(held->refCount, 3u);
}

TEST_F(ZlvDispatch, EndsWhereListenersFormACircle)
{
    ZlvObject *one = filter("one");
    ZlvObject *two = filter("two");
    ZlvAddListener(app_, one);
    ZlvAddListener(one, two);
    ZlvAddListener(two, one);
    ZlvAddListener(two, recorder("below"));
    log(app_, u"text");
    EXPECT_EQ(Recorder::order(), (Names{"recorder", "below"}));
    ZlvRemListener(two, one);
}

TEST_F(ZlvDispatch, PassesTheNextEventThroughACircleAgain)
{
    ZlvObject *one = filter("one");
    ZlvAddListener(app_, one);
    ZlvAddListener(one, one);
    ZlvAddListener(one, recorder("below"));
    log(app_, u"text");
    log(app_, u"text");
    EXPECT_EQ(Recorder::order(), (Names{"recorder", "below", "recorder", "below"}));
    ZlvRemListener(one, one);
}

TEST_F(ZlvDispatch, AHandlerThatIsItsOwnListenerPrintsOnce)
{
    ZlvObject *self = handler("self");
    ZlvAddListener(self, self);
    ZlvObject *formatter = this->formatter("plain");
    setProp(formatter, "dateTimeFormat", "'x'");
    ZlvHandlerSetFormatter(self, formatter);
    ZlvAddListener(app_, self);
    EXPECT_EQ(console([&] { log(app_, u"text"); }), "x text\n\n");
    ZlvRemListener(self, self);
}

TEST_F(ZlvDispatch, ReachesAListenerTwiceThroughTwoFilters)
{
    ZlvObject *one = filter("one");
    ZlvObject *two = filter("two");
    ZlvRemListener(app_, recorder_);
    for (ZlvObject *each : {one, two}) {
        ZlvAddListener(app_, each);
        ZlvAddListener(each, recorder_);
    }
    log(app_, u"text");
    EXPECT_EQ(Recorder::order(), (Names{"recorder", "recorder"})) << "no circle: not skipped";
}

} // namespace
} // namespace zelvo_test
