// SPDX-License-Identifier: Apache-2.0
// Classes of one's own, written in C++, behind the toolkit's tables of functions.
#include <cstring>

#include "CppTest.h"

namespace zelvo_test {
namespace {

/// What has become of the states of all classes of this file.
struct Counts {
    int made = 0;
    int destroyed = 0;
    int closed = 0;
} counts;

/// Counts its life, and that of what it inherits from it.
struct Counted {
    Counted() noexcept { ++counts.made; }
    Counted(const Counted &) = delete;
    Counted &operator=(const Counted &) = delete;
    ~Counted() { ++counts.destroyed; }
};

/// A handler that gathers texts up to a limit.
class Gatherer : Counted {
public:
    bool configure(zelvo::Self self, const char *property) noexcept
    {
        if (std::strcmp(property, "limit") != 0)
            return false;
        limit_ = self.property<int32_t>("limit").value_or(-1);
        return true;
    }

    void process(zelvo::Self self, const zelvo::Event &event) noexcept
    {
        if (int32_t(texts_.size()) < limit_)
            texts_.emplace_back(event.text().view());
        if (event.level() == ZLV_LEVEL_FATAL)
            event.fail({CX_STATUS_PLATFORM, ENOSPC});
        event.setProperty("seen_by", self.name());
        self.passOn(event);
    }

    void close(zelvo::Self) noexcept { ++counts.closed; }

    int32_t limit() const { return limit_; }
    const std::vector<std::u16string> &texts() const { return texts_; }

private:
    int32_t limit_ = 2;
    std::vector<std::u16string> texts_;
};

/// A filter that lets every second event pass.
class Alternator : Counted {
public:
    bool accepts(zelvo::Self, zelvo::Event) noexcept { return (pass_ = !pass_); }

private:
    bool pass_ = false;
};

/// A logger that stamps events with a number each.
class Numbering : Counted {
public:
    void log(zelvo::Self self, zelvo::Event event) noexcept
    {
        event.setProperty("number", ++number_);
        event.setMessageId("ID7");
        self.passOn(event);
    }

private:
    int32_t number_ = 0;
};

/// A logger whose messages are German.
class Germanising {
public:
    void log(zelvo::Self self, zelvo::Event event) noexcept
    {
        event.setLocale("de");
        self.passOn(event);
    }
};

/// A formatter that puts a text between brackets.
class Brackets {
public:
    zelvo::UString format(zelvo::Self, zelvo::Event event) noexcept
    {
        std::u16string text = u"[";
        text += event.text().view();
        text += u"]";
        return zelvo::UString::copyOf(text);
    }

    zelvo::String header(zelvo::Self) noexcept { return zelvo::String::copyOf("begin"); }
    zelvo::String trailer(zelvo::Self) noexcept { return zelvo::String::copyOf("end"); }
};

/// A handler that asks its formatter for everything, and holds it.
class Asking {
public:
    void process(zelvo::Self self, zelvo::Event event) noexcept
    {
        formatter_ = self.object("brackets");
        all_ = std::string(self.header().view());
        all_ += zelvo::bytes(self.format(event)).view();
        all_ += self.trailer().view();
    }

    const std::string &all() const { return all_; }

private:
    zelvo::InnerObject formatter_;
    std::string all_;
};

} // namespace

/// Registers the classes of this file.
class CppOwnClass : public CppTest {
protected:
    void SetUp() override
    {
        CppTest::SetUp();
        counts = {};
        zelvo::addHandlerClass<Gatherer>("gatherer");
        zelvo::addFilterClass<Alternator>("alternator");
        zelvo::addLoggerClass<Numbering>("numbering");
        zelvo::addLoggerClass<Germanising>("germanising");
        zelvo::addFormatterClass<Brackets>("brackets");
        zelvo::addHandlerClass<Asking>("asking");
    }

    /// Makes an object what it is when there was no memory for its state.
    template <class T>
    static void loseState(const zelvo::Object &object)
    {
        object.get()->objClass->fFreeVars(object.get()->vars);
        object.get()->vars = nullptr;
        EXPECT_FALSE(zelvo::withState<T>(object, [](T &) { FAIL(); }));
    }

    static std::vector<std::u16string> textsOf(const zelvo::Handler &handler)
    {
        std::vector<std::u16string> texts;
        EXPECT_TRUE(zelvo::withState<Gatherer>(
            handler, [&texts](const Gatherer &gatherer) { texts = gatherer.texts(); }));
        return texts;
    }
};

TEST_F(CppOwnClass, EachObjectHasAStateOfItsOwn)
{
    zelvo::Handler first("first", "gatherer");
    zelvo::Handler second("second", "gatherer");
    EXPECT_EQ(counts.made, 2);
    app_.addListener(first);
    app_.text(u"one");
    app_.addListener(second);
    app_.text(u"two");
    EXPECT_EQ(textsOf(first), (std::vector<std::u16string>{u"one", u"two"}));
    EXPECT_EQ(textsOf(second), (std::vector<std::u16string>{u"two"}));
    app_.removeListener(first);
    first.reset();
    EXPECT_EQ(counts.destroyed, 1);
    EXPECT_EQ(counts.closed, 1);
}

TEST_F(CppOwnClass, AHandlerHandsEventsOn)
{
    const zelvo::Handler handler("first", "gatherer");
    app_.removeListener(memory_);
    app_.addListener(handler);
    handler.addListener(memory_);
    app_.text(u"through");
    EXPECT_EQ(text(), u"through");
    EXPECT_EQ(property("seen_by"), "first");
}

TEST_F(CppOwnClass, ADisabledHandlerIsNotAsked)
{
    const zelvo::Handler handler("first", "gatherer");
    app_.addListener(handler);
    handler.setProperty("logging", "off");
    app_.text(u"no");
    EXPECT_TRUE(textsOf(handler).empty());
}

TEST_F(CppOwnClass, ItsPropertiesArriveAndTheOthersAreTheKinds)
{
    const zelvo::Handler handler("first", "gatherer");
    handler.setProperty("limit", 7);
    int32_t limit = 0;
    zelvo::withState<Gatherer>(handler, [&limit](Gatherer &state) { limit = state.limit(); });
    EXPECT_EQ(limit, 7);
    const zelvo::Object brackets("brackets", "brackets");
    handler.setProperty("formatterName", "brackets");
    EXPECT_TRUE(handler.formatter() == brackets);
    handler.setProperty("logging", "off");
    EXPECT_FALSE(handler.enabled());
}

TEST_F(CppOwnClass, AFailureReachesTheCaller)
{
    const zelvo::Handler handler("first", "gatherer");
    app_.addListener(handler);
    const ZlvStatus status = app_.fatal("bundle", "key");
    EXPECT_EQ(status.type, CX_STATUS_PLATFORM);
    EXPECT_EQ(status.code, ENOSPC);
}

TEST_F(CppOwnClass, AFilterDecides)
{
    const zelvo::Object filter("every.second", "alternator");
    app_.removeListener(memory_);
    app_.addListener(filter);
    filter.addListener(memory_);
    for (const char16_t *text : {u"1", u"2", u"3", u"4"})
        app_.text(text);
    EXPECT_EQ(memory_.count(), 2U);
    EXPECT_EQ(memory_.events()[0].text, u"1");
    EXPECT_EQ(memory_.events()[1].text, u"3");
    filter.setProperty("level", "WARN"); // a property of every filter, which this one ignores
    app_.info("bundle", "key");
    EXPECT_EQ(memory_.count(), 3U);
}

TEST_F(CppOwnClass, ALoggerStampsItsEvents)
{
    const zelvo::Logger logger("numbered", "numbering");
    logger.addListener(memory_);
    logger.text(u"first");
    logger.text(u"second");
    EXPECT_EQ(property("number"), "2");
    EXPECT_EQ(memory_.last()->messageId, "ID7");
    logger.setProperty("level", "WARN");
    EXPECT_FALSE(logger.takes(ZLV_LEVEL_INFO));
}

TEST_F(CppOwnClass, AFormatterMakesTheRecord)
{
    const zelvo::Object formatter("brackets", "brackets");
    const zelvo::Handler asking("asking", "asking");
    asking.setFormatter(formatter);
    app_.addListener(asking);
    app_.text(u"{0}", u"x");
    std::string all;
    zelvo::withState<Asking>(asking, [&all](const Asking &state) { all = state.all(); });
    EXPECT_EQ(all, "begin[x]end");
}

TEST_F(CppOwnClass, TheStateOfAnotherClassIsOutOfReach)
{
    const zelvo::Handler handler("first", "gatherer");
    EXPECT_FALSE(zelvo::withState<Asking>(handler, [](Asking &) { FAIL(); }));
    EXPECT_FALSE(zelvo::withState<Asking>(app_, [](Asking &) { FAIL(); }));
    EXPECT_FALSE(zelvo::withState<Asking>(zelvo::Object(), [](Asking &) { FAIL(); }));
}

TEST_F(CppOwnClass, WithoutAStateAnObjectIsTheDefaultOfItsKind)
{
    const zelvo::Logger logger("numbered", "numbering");
    const zelvo::Object filter("every.second", "alternator");
    const zelvo::Handler handler("first", "gatherer");
    const zelvo::Object formatter("brackets", "brackets");
    loseState<Numbering>(logger);
    loseState<Alternator>(filter);
    loseState<Gatherer>(handler);
    loseState<Brackets>(formatter);
    logger.addListener(filter);
    filter.addListener(memory_);
    filter.addListener(handler);
    filter.setProperty("level", "INFO");

    handler.setFormatter(formatter);
    handler.setProperty("limit", 7);
    logger.text(u"through");
    logger.debugMin(u"below the level of the filter");
    EXPECT_EQ(memory_.count(), 1U);
    EXPECT_EQ(property("number"), "(none)");
    EXPECT_FALSE(zelvo::String(ZlvHandlerGetFmtHeader(handler.get())));
    EXPECT_FALSE(zelvo::String(ZlvHandlerGetFmtTrailer(handler.get())));
}

TEST_F(CppOwnClass, WithoutItsStateAFormatterIsTheBasicOne)
{
    const zelvo::Object formatter("brackets", "brackets");
    const zelvo::Handler asking("asking", "asking");
    loseState<Brackets>(formatter);
    formatter.setProperty("dateTimeFormat", "'date'");
    asking.setFormatter(formatter);
    app_.addListener(asking);
    app_.text(u"x");
    std::string all;
    zelvo::withState<Asking>(asking, [&all](const Asking &state) { all = state.all(); });
    EXPECT_EQ(all, "date x\n");
}

TEST_F(CppOwnClass, AnEventCarriesItsLocaleOn)
{
    const zelvo::Logger logger("german", "germanising");
    logger.addListener(memory_);
    logger.text(u"{0,number}", 1234.5);
    EXPECT_EQ(text(), u"1.234,5");
    app_.text(u"{0,number}", 1234.5);
    EXPECT_EQ(text(), u"1,234.5");
}

TEST_F(CppOwnClass, WithoutAnEventTheEntriesDoNothing)
{
    const zelvo::Handler handler("first", "gatherer");
    const zelvo::Object filter("every.second", "alternator");
    handler.get()->objClass->handler.fProcess(handler.get(), nullptr, zelvo::ArgumentList{});
    EXPECT_TRUE(textsOf(handler).empty());
    EXPECT_EQ(ZlvIsLoggableByFilter(filter.get(), nullptr, zelvo::ArgumentList{}), 0);
}

TEST(CppOwnClassLife, ClosingTheToolkitDestroysStatesAndDoesNotCloseThem)
{
    counts = {};
    {
        const zelvo::Toolkit toolkit;
        zelvo::addHandlerClass<Gatherer>("gatherer");
        zelvo::addFilterClass<Alternator>("alternator");
        zelvo::addLoggerClass<Numbering>("numbering");
        const zelvo::Logger logger("numbered", "numbering");
        zelvo::Object handler("first", "gatherer");
        logger.addListener(handler);
        logger.addListener(zelvo::Object("every.second", "alternator"));
        handler.release(); // as a reference that the program has forgotten
        EXPECT_EQ(counts.made, 3);
        ZlvAcquireObject(logger.get()); // and another
    }
    EXPECT_EQ(counts.destroyed, 3);
    EXPECT_EQ(counts.closed, 0);
}

} // namespace zelvo_test
