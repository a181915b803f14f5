// SPDX-License-Identifier: Apache-2.0
// The handler that keeps events for the tests of applications.
#include <cstdio>
#include <fstream>
#include <set>
#include <thread>

#include <unistd.h>

#include "CppTest.h"

namespace zelvo_test {

using CppMemoryHandler = CppTest;

TEST_F(CppMemoryHandler, KeepsEverythingOfAnEvent)
{
    const zelvo::Logger logger("pd", "zlv_pdlogger");
    logger.setProperty("product", "shop");
    logger.addListener(memory_);
    logger.debugMin(u"KDY1234E {0} is full", u"disk");
    const auto event = memory_.last();
    ASSERT_TRUE(event);
    EXPECT_GT(event->time, 1.6e12);
    EXPECT_EQ(event->level, ZLV_LEVEL_DEBUG_MIN);
    EXPECT_FALSE(event->isMessage);
    EXPECT_EQ(event->text, u"KDY1234E disk is full");
    EXPECT_EQ(event->icuError, 0);
    EXPECT_EQ(event->bundle, "");
    EXPECT_EQ(event->key, "");
    EXPECT_EQ(event->messageId, "KDY1234E");
    EXPECT_EQ(*event->property("product"), "shop");
    EXPECT_EQ(event->property("absent"), nullptr);
}

TEST_F(CppMemoryHandler, KeepsPropertiesInTheirOrder)
{
    app_.debugMin(u"text");
    const auto event = memory_.last();
    ASSERT_TRUE(event);
    ASSERT_EQ(event->properties.size(), 3U);
    EXPECT_EQ(event->properties[0].first, "zlv_prop_srcfile");
    EXPECT_EQ(event->properties[1].first, "zlv_prop_srcline");
    EXPECT_EQ(event->properties[2].first, "zlv_prop_srcfunction");
}

TEST_F(CppMemoryHandler, KeepsEventsInTheirOrderUntilCleared)
{
    EXPECT_FALSE(memory_.last());
    app_.text(u"one");
    app_.text(u"two");
    ASSERT_EQ(memory_.count(), 2U);
    EXPECT_EQ(memory_.events()[0].text, u"one");
    EXPECT_EQ(memory_.last()->text, u"two");
    memory_.clear();
    EXPECT_EQ(memory_.count(), 0U);
    EXPECT_TRUE(memory_.events().empty());
}

TEST_F(CppMemoryHandler, CopiesOutliveTheHandler)
{
    app_.text(u"{0}", u"kept");
    const auto events = memory_.events();
    app_.removeListener(memory_);
    memory_ = zelvo::MemoryHandler("other");
    ASSERT_EQ(events.size(), 1U);
    EXPECT_EQ(events[0].text, u"kept");
}

TEST_F(CppMemoryHandler, HandlesOfOneNameReadTheSameEvents)
{
    const zelvo::MemoryHandler again("memory");
    app_.text(u"one");
    EXPECT_TRUE(again == memory_);
    EXPECT_EQ(again.count(), 1U);
}

TEST_F(CppMemoryHandler, HandsEventsOn)
{
    const zelvo::MemoryHandler second("second");
    memory_.addListener(second);
    app_.text(u"through");
    EXPECT_EQ(second.count(), 1U);
}

TEST_F(CppMemoryHandler, AnEmptyOneHasNoEvents)
{
    const zelvo::MemoryHandler none("app");
    EXPECT_FALSE(none);
    EXPECT_EQ(none.count(), 0U);
    EXPECT_TRUE(none.events().empty());
    EXPECT_FALSE(none.last());
    none.clear();
}

TEST_F(CppMemoryHandler, IsKnownToConfigurationsOnceRegistered)
{
    zelvo::Config("from.config").setProperty("className", zelvo::MemoryHandler::className);
    app_.setProperty("listenerNames", "from.config");
    app_.text(u"configured");
    EXPECT_EQ(zelvo::MemoryHandler("from.config").last()->text, u"configured");
}

TEST(CppMemoryHandlerLife, MayServeWhatOpeningMakes)
{
    const std::string path = testing::TempDir() + "zelvo_memory_" + std::to_string(getpid());
    std::ofstream(path) << "zelvo.errorLogger.listenerNames = early\n"
                        << "early.className = zelvo_memoryhandler\n";
    zelvo::MemoryHandler::addClass();
    {
        const zelvo::Toolkit toolkit(path.c_str());
        ASSERT_TRUE(toolkit);
        zelvo::Logger(ZLV_ERROR_LOGGER_NAME).text(u"from the start");
        EXPECT_EQ(zelvo::MemoryHandler("early").last()->text, u"from the start");
    }
    std::remove(path.c_str());
}

TEST_F(CppMemoryHandler, ThreadsLogWhileOthersRead)
{
    constexpr int32_t threads = 4;
    constexpr int32_t each = 500;
    std::vector<std::thread> writers;
    for (int32_t thread = 0; thread < threads; ++thread)
        writers.emplace_back([this, thread] {
            for (int32_t i = 0; i < each; ++i)
                app_.text(u"{0,number,#}", double(thread * each + i));
        });
    std::size_t seen = 0;
    std::thread reader([this, &seen] {
        while (seen < threads * each) {
            const auto events = memory_.events();
            EXPECT_GE(events.size(), seen);
            seen = events.size();
        }
    });
    for (auto &writer : writers)
        writer.join();
    reader.join();
    std::set<std::u16string> texts;
    for (const auto &event : memory_.events())
        texts.insert(event.text);
    EXPECT_EQ(texts.size(), std::size_t(threads * each));
}

} // namespace zelvo_test
