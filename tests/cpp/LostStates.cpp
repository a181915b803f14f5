// SPDX-License-Identifier: Apache-2.0
// Objects of classes of one's own at the edges of their lives: without a state, without an event,
// and when the toolkit closes.
#include "OwnClasses.h"

namespace zelvo_test {

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
