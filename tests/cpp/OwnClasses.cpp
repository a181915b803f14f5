// SPDX-License-Identifier: Apache-2.0
// Classes of one's own, written in C++, behind the toolkit's tables of functions.
#include "OwnClasses.h"

namespace zelvo_test {

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

TEST_F(CppOwnClass, AnEventCarriesItsLocaleOn)
{
    const zelvo::Logger logger("german", "germanising");
    logger.addListener(memory_);
    logger.text(u"{0,number}", 1234.5);
    EXPECT_EQ(text(), u"1.234,5");
    app_.text(u"{0,number}", 1234.5);
    EXPECT_EQ(text(), u"1,234.5");
}

} // namespace zelvo_test
