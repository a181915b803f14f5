// SPDX-License-Identifier: Apache-2.0
// Listeners that change what is being dispatched to.
#include "support/DestructiveOrders.h"

namespace zelvo_test {
namespace {

/// The logger "app" with the listeners "first" and "second", which nobody but it holds.
class ZlvChangesWhileDispatching : public ZlvDestructiveOrders {
protected:
    void SetUp() override
    {
        ZlvDestructiveOrders::SetUp();
        app_ = get("app", "zlv_basiclogger");
        first_ = addOwn(app_, "first");
        second_ = addOwn(app_, "second");
    }
    void TearDown() override
    {
        if (app_ != nullptr)
            ZlvReleaseObject(app_);
        ZlvDestructiveOrders::TearDown();
    }

    /// Logs one text, during which the listener NAME does STEP.
    void logWhile(const std::string &name, const std::function<void()> &step)
    {
        Scripted::script.process = [name, step](ZlvObject *self, ZlvEvent *) {
            if (self->name == name)
                step();
        };
        log(app_, u"text");
    }

    /// What a class function does to make and add a listener that only the logger holds.
    void append(const char *name) const
    {
        ZlvObject *made = zlvIntlGetObject(name, Scripted::handler);
        zlvIntlAddListener(app_, made);
        zlvIntlReleaseObject(made);
    }

    ZlvObject *app_ = nullptr;
    ZlvObject *first_ = nullptr;
    ZlvObject *second_ = nullptr;
};

TEST_F(ZlvChangesWhileDispatching, AListenerResetsTheListeners)
{
    logWhile("first", [&] { zlvIntlSetObjProp(app_, "listenerNames", ""); });
    EXPECT_EQ(Scripted::processed, Names{"first"});
    EXPECT_EQ(Scripted::closed, (Names{"second", "first"})) << "the one being called ends last";
    EXPECT_EQ(listeners(app_), Names{});
}

TEST_F(ZlvChangesWhileDispatching, AListenerResetsTheListenersToItself)
{
    ZlvObjCfg *cfg = ZlvLogMgrGetCfg("first");
    ZlvSetObjCfgProp(cfg, "className", Scripted::handler);
    ZlvReleaseObjCfg(cfg);
    logWhile("first", [&] { zlvIntlSetObjProp(app_, "listenerNames", "first"); });
    EXPECT_EQ(listeners(app_), Names{"first"});
    EXPECT_FALSE(exists("second"));
}

TEST_F(ZlvChangesWhileDispatching, AListenerRemovesItself)
{
    logWhile("first", [&] { zlvIntlRemListener(app_, first_); });
    EXPECT_EQ(Scripted::processed, (Names{"first", "second"}));
    EXPECT_EQ(Scripted::closed, Names{"first"});
    EXPECT_EQ(listeners(app_), Names{"second"});
}

TEST_F(ZlvChangesWhileDispatching, AListenerRemovesTheNextOne)
{
    logWhile("first", [&] { zlvIntlRemListener(app_, second_); });
    EXPECT_EQ(Scripted::processed, Names{"first"});
    EXPECT_EQ(listeners(app_), Names{"first"});
}

TEST_F(ZlvChangesWhileDispatching, AListenerRemovesThePreviousOne)
{
    logWhile("second", [&] { zlvIntlRemListener(app_, first_); });
    EXPECT_EQ(Scripted::processed, (Names{"first", "second"}));
    EXPECT_EQ(listeners(app_), Names{"second"});
}

TEST_F(ZlvChangesWhileDispatching, AListenerRemovesItselfAndTheNextOne)
{
    addOwn(app_, "third");
    logWhile("first", [&] {
        zlvIntlRemListener(app_, first_);
        zlvIntlRemListener(app_, second_);
    });
    EXPECT_EQ(Scripted::processed, (Names{"first", "third"}));
    EXPECT_EQ(listeners(app_), Names{"third"});
}

TEST_F(ZlvChangesWhileDispatching, AListenerRemovesTheNextOneAndThenItself)
{
    addOwn(app_, "third");
    logWhile("first", [&] {
        zlvIntlRemListener(app_, second_);
        zlvIntlRemListener(app_, first_);
    });
    EXPECT_EQ(Scripted::processed, (Names{"first", "third"}));
    EXPECT_EQ(listeners(app_), Names{"third"});
}

TEST_F(ZlvChangesWhileDispatching, AListenerAppendsAnother)
{
    logWhile("first", [&] { append("third"); });
    EXPECT_EQ(Scripted::processed, (Names{"first", "second", "third"}));
}

TEST_F(ZlvChangesWhileDispatching, TheLastListenerAppendsAnother)
{
    logWhile("second", [&] { append("third"); });
    EXPECT_EQ(Scripted::processed, (Names{"first", "second", "third"}));
}

TEST_F(ZlvChangesWhileDispatching, TheLastListenerRemovesItselfAndAppendsAnother)
{
    logWhile("second", [&] {
        zlvIntlRemListener(app_, second_);
        append("third");
    });
    EXPECT_EQ(Scripted::closed, Names{"second"});
    EXPECT_EQ(listeners(app_), (Names{"first", "third"}));
    EXPECT_EQ(Scripted::processed, (Names{"first", "second", "third"}));
}

TEST_F(ZlvChangesWhileDispatching, TheLastListenerAppendsAnotherAndRemovesItself)
{
    logWhile("second", [&] {
        append("third");
        zlvIntlRemListener(app_, second_);
    });
    EXPECT_EQ(Scripted::processed, (Names{"first", "second", "third"}));
}

TEST_F(ZlvChangesWhileDispatching, AListenerIsRemovedAndAddedAgainAtTheEnd)
{
    logWhile("first", [&, done = std::make_shared<bool>(false)] {
        if (std::exchange(*done, true))
            return;
        zlvIntlAcquireObject(first_);
        zlvIntlRemListener(app_, first_);
        zlvIntlAddListener(app_, first_);
        zlvIntlReleaseObject(first_);
    });
    EXPECT_EQ(listeners(app_), (Names{"second", "first"}));
    EXPECT_EQ(Scripted::processed, (Names{"first", "second", "first"}));
}

TEST_F(ZlvChangesWhileDispatching, AListenerReleasesTheLogger)
{
    logWhile("first", [&] { zlvIntlReleaseObject(std::exchange(app_, nullptr)); });
    EXPECT_FALSE(exists("app") || exists("first") || exists("second"));
    EXPECT_EQ(Scripted::closed.size(), 2u);
}

TEST_F(ZlvChangesWhileDispatching, AListenerDisablesTheLogger)
{
    logWhile("first", [&] { zlvIntlSetObjectEnabled(app_, 0); });
    EXPECT_EQ(Scripted::processed, (Names{"first", "second"})) << "asked once, at the start";
}

TEST_F(ZlvChangesWhileDispatching, AListenerLogsToTheSameLogger)
{
    logWhile("first", [&] {
        if (Scripted::processed.size() == 1)
            zlvLogUDebugEntry(app_, ZLV_LEVEL_INFO, nullptr, nullptr, 0, u"inner", nullptr);
    });
    EXPECT_EQ(Scripted::processed, (Names{"first", "first", "second", "second"}));
}

TEST_F(ZlvChangesWhileDispatching, AListenerDestroysAFilterThatIsPassingTheEventOn)
{
    ZlvObject *between = get("between", "zlv_levelfilter");
    addOwn(between, "below");
    addOwn(between, "beside");
    ZlvAddListener(app_, between);
    ZlvReleaseObject(between);
    logWhile("below", [&] { zlvIntlRemListener(app_, between); });
    EXPECT_FALSE(exists("between") || exists("below") || exists("beside"));
    EXPECT_EQ(Scripted::processed[2], "below");
}

TEST_F(ZlvChangesWhileDispatching, AListenerReplacesTheFormatterThatIsFormatting)
{
    ZlvObject *out = handler("out");
    static ZlvObject *target;
    target = out;
    ZlvAddUFormatterClass(
        "suicidal", nullptr, nullptr, nullptr, nullptr,
        [](ZlvObject *, ZlvEvent *event, va_list args) {
            zlvIntlHandlerSetFormatter(target, nullptr);
            return ZlvBindEventUMsg(event, zlvIntlBindUI18Msg, args);
        },
        nullptr, nullptr, nullptr);
    ZlvObject *format = get("format", "suicidal");
    ZlvHandlerSetFormatter(out, format);
    ZlvReleaseObject(format);
    ZlvAddListener(app_, out);
    EXPECT_EQ(console([&] { log(app_, u"text"); }), "text\n");
    EXPECT_FALSE(exists("format"));
}

} // namespace
} // namespace zelvo_test
