// SPDX-License-Identifier: Apache-2.0
// The dispatch of an event to the listeners of an object.
#include "support/Recorder.h"
#include "support/Scripted.h"
#include "support/VaList.h"

namespace zelvo_test {
namespace {

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
