// SPDX-License-Identifier: Apache-2.0
// What the problem-determination logger stamps on events.
#include "ZlvPDLogger.h"

#include <thread>

#include <unistd.h>

#include "CxThread.h"
#include "support/FailAlloc.h"
#include "support/PDLoggerFixture.h"

namespace zelvo_test {
namespace {

class ZlvPDLogger : public PDLoggerFixture {
protected:
    /// Sends an event that the test holds through the logger.
    void send(const OwnEvent &event) { ZlvPDLoggerFLog(pd_, event.get(), noArgs()); }

    static std::vector<std::string> keysOf(const OwnEvent &event)
    {
        std::vector<std::string> keys;
        for (auto *node = event->properties->first; node != nullptr; node = node->next)
            keys.emplace_back(node->key);
        return keys;
    }
};

/* Properties. */

TEST_F(ZlvPDLogger, WithoutConfigurationStampsTheServerAndTheNumbersAlone)
{
    const Properties all = logged(pd_).properties;
    EXPECT_EQ(all.size(), 4u);
    EXPECT_EQ(all.at("server"), "node.example.org");
    EXPECT_EQ(all.at("serverFormat"), "IP");
    EXPECT_EQ(all.count("processId"), 1u);
    EXPECT_EQ(all.count("threadId"), 1u);
}

TEST_F(ZlvPDLogger, StampsTheNumberOfTheProcess)
{
    EXPECT_EQ(logged(pd_).properties.at("processId"), std::to_string(getpid()));
}

TEST_F(ZlvPDLogger, StampsTheNumberOfTheThread)
{
    const auto id = static_cast<int32_t>(CxThreadGetCurrentID());
    EXPECT_EQ(logged(pd_).properties.at("threadId"), std::to_string(id));
}

TEST_F(ZlvPDLogger, StampsTheThreadThatLogs)
{
    int32_t id = 0;
    std::thread([&] {
        id = static_cast<int32_t>(CxThreadGetCurrentID());
        logged(pd_);
    }).join();
    EXPECT_EQ(records().at(0).properties.at("threadId"), std::to_string(id));
    EXPECT_NE(id, static_cast<int32_t>(CxThreadGetCurrentID()));
}

TEST_F(ZlvPDLogger, StampsInAFixedOrder)
{
    for (const char *property : {"productInstance", "serverFormat", "server", "client", "component",
                                 "product", "organization"})
        setProp(pd_, property, "value");
    OwnEvent event;
    send(event);
    EXPECT_EQ(keysOf(event), (Names{"organization", "product", "component", "client", "server",
                                    "serverFormat", "productInstance", "processId", "threadId"}));
}

TEST_F(ZlvPDLogger, OverwritesWhatTheEventHas)
{
    setProp(pd_, "product", "shop");
    OwnEvent event;
    for (const char *property : {"product", "server", "processId", "threadId"})
        ZlvSetEventProp(event.get(), property, "before");
    send(event);
    EXPECT_EQ(taken(ZlvGetEventProp(event.get(), "product", nullptr)), "shop");
    EXPECT_EQ(taken(ZlvGetEventProp(event.get(), "server", nullptr)), "node.example.org");
    EXPECT_NE(taken(ZlvGetEventProp(event.get(), "processId", nullptr)), "before");
    EXPECT_NE(taken(ZlvGetEventProp(event.get(), "threadId", nullptr)), "before");
}

TEST_F(ZlvPDLogger, LeavesWhatItHasNoValueFor)
{
    OwnEvent event;
    ZlvSetEventProp(event.get(), "product", "before");
    ZlvSetEventProp(event.get(), "other", "kept");
    send(event);
    EXPECT_EQ(taken(ZlvGetEventProp(event.get(), "product", nullptr)), "before");
    EXPECT_EQ(taken(ZlvGetEventProp(event.get(), "other", nullptr)), "kept");
}

TEST_F(ZlvPDLogger, StampsDebugEventsBesideTheirPlace)
{
    Recorder::clear();
    ZlvLogDebugMin(pd_, "a.c", "f", 12, u"text");
    const Properties &all = records().at(0).properties;
    EXPECT_EQ(all.at("zlv_prop_srcfile"), "a.c");
    EXPECT_EQ(all.at("server"), "node.example.org");
}

TEST_F(ZlvPDLogger, WithoutVariablesStampsTheNumbersAlone)
{
    OwnEvent event(u"ABC0001E stopped");
    ZlvPDLoggerFLog(app_, event.get(), noArgs()); // a basic logger, which has none
    EXPECT_EQ(keysOf(event), (Names{"processId", "threadId"}));
    EXPECT_EQ(event.messageId(), "ABC0001E");
    EXPECT_EQ(records().size(), 1u);
}

/* The message's identifier. */

TEST_F(ZlvPDLogger, GivesTheEventTheIdentifierOfItsText)
{
    EXPECT_EQ(logged(pd_, u"ABC0001E stopped").messageId, "ABC0001E");
}

TEST_F(ZlvPDLogger, GivesTheEmptyIdentifierToATextWithoutOne)
{
    EXPECT_EQ(logged(pd_, u"stopped").messageId, "");
}

TEST_F(ZlvPDLogger, GivesTheEmptyIdentifierToADebugEventWithoutOne)
{
    Recorder::clear();
    ZlvLogDebugMin(pd_, "a.c", "f", 12, u"stopped");
    EXPECT_EQ(records().at(0).messageId, "");
}

TEST_F(ZlvPDLogger, GivesTheEmptyIdentifierToAMessageThatCannotBeHad)
{
    Recorder::clear();
    ZlvLogUMsg(pd_, nullptr, nullptr);
    EXPECT_EQ(records().at(0).messageId, "");
}

TEST_F(ZlvPDLogger, BindsTheTextWithTheArgumentsAndHandsThemOn)
{
    Recorder::clear();
    ZlvLogUText(pd_, u"{0} {1,number,integer}", u"ABC0001E", 5);
    EXPECT_EQ(records().at(0).messageId, "ABC0001E");
    EXPECT_EQ(records().at(0).text, u"ABC0001E 5");
}

TEST_F(ZlvPDLogger, KeepsTheIdentifierThatTheEventHas)
{
    OwnEvent event(u"ABC0001E stopped");
    ZlvSetEventMessageId(event.get(), "XYZ0002W");
    send(event);
    EXPECT_EQ(event.messageId(), "XYZ0002W");
}

TEST_F(ZlvPDLogger, KeepsTheEmptyIdentifierThatTheEventHas)
{
    OwnEvent event(u"ABC0001E stopped");
    ZlvSetEventMessageId(event.get(), "");
    send(event);
    EXPECT_EQ(event.messageId(), "");
}

TEST_F(ZlvPDLogger, ServesAFilterByIdentifier)
{
    ZlvRemListener(pd_, recorder_);
    ZlvObject *ids = filter("ids", "zlv_msgidfilter");
    ZlvAddListener(pd_, ids);
    ZlvAddListener(ids, recorder_);
    ZlvLogUText(pd_, u"ABC0001I started");
    ZlvLogUText(pd_, u"ABC0002E stopped");
    ASSERT_EQ(records().size(), 1u);
    EXPECT_EQ(records()[0].messageId, "ABC0002E");
}

/* Dispatch. */

TEST_F(ZlvPDLogger, SendsToItsListenersInTheirOrder)
{
    ZlvAddListener(pd_, handler("second", Recorder::className));
    ZlvLogUText(pd_, u"text");
    EXPECT_EQ(Recorder::order(), (Names{"recorder", "second"}));
}

TEST_F(ZlvPDLogger, StartsWithTheLevelOfAnyLogger)
{
    EXPECT_EQ(pd_->logger.level, ZLV_LEVEL_DEBUG_MIN);
    EXPECT_EQ(ZlvIsLoggable(pd_, ZLV_LEVEL_DEBUG_MID), 0);
}

TEST_F(ZlvPDLogger, LogsNothingWhileDisabled)
{
    setProp(pd_, "logging", "off");
    ZlvLogUText(pd_, u"text");
    EXPECT_TRUE(records().empty());
}

TEST_F(ZlvPDLogger, DoesNothingWithANullArgument)
{
    OwnEvent event;
    ZlvPDLoggerFLog(nullptr, event.get(), noArgs());
    ZlvPDLoggerFLog(pd_, nullptr, noArgs());
    ZlvPDLoggerFLog(nullptr, nullptr, noArgs());
    EXPECT_EQ(event->properties, nullptr);
    EXPECT_TRUE(records().empty());
}

/* Memory that runs out. */

TEST_F(ZlvPDLogger, DeliversTheEventWhicheverAllocationFails)
{
    setProp(pd_, "product", "shop");
    for (uint32_t allowed = 0, failed = 1; failed > 0; ++allowed) {
        OwnEvent event(u"ABC0001E stopped");
        FailAlloc fail(allowed, FailAlloc::Once);
        send(event);
        failed = fail.failed();
        EXPECT_EQ(records().size(), allowed + 1u);
    }
}

} // namespace
} // namespace zelvo_test
