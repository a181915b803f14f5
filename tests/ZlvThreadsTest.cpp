// SPDX-License-Identifier: Apache-2.0
// Several threads on the same objects. Bounded by counts, so that the thread sanitizer sees the
// same work each time.
#include <atomic>
#include <barrier>
#include <thread>

#include "support/Recorder.h"

#include "ZlvOwned.h"

namespace zelvo_test {
namespace {

constexpr int THREADS = 4;
constexpr int ROUNDS = 200;

/// Runs WORK in four threads that start together; each is given its number.
void inFourThreads(const std::function<void(int)> &work)
{
    std::barrier start(THREADS);
    std::vector<std::thread> threads;
    for (int number = 0; number < THREADS; ++number)
        threads.emplace_back([&, number] {
            start.arrive_and_wait();
            work(number);
        });
    for (std::thread &thread : threads)
        thread.join();
}

class ZlvThreads : public RecordedToolkit {
protected:
    /// The four threads do STEP round after round and log in between.
    void mixWithLogging(const std::function<void(int)> &step)
    {
        inFourThreads([&](int) {
            for (int round = 0; round < ROUNDS; ++round) {
                step(round);
                log(app_, u"text");
                ZlvLogInfo(app_, nullptr, "key");
            }
        });
    }
};

TEST_F(ZlvThreads, EveryEventOfEveryThreadArrives)
{
    inFourThreads([&](int) {
        for (int round = 0; round < ROUNDS; ++round)
            log(app_, u"text");
    });
    EXPECT_EQ(records().size(), size_t{THREADS} * ROUNDS);
}

TEST_F(ZlvThreads, EachEventArrivesWithItsOwnArguments)
{
    inFourThreads([&](int number) {
        for (int round = 0; round < ROUNDS; ++round)
            ZlvLogUText(app_, u"{0,number,integer}-{1,number,integer}", number, round);
    });
    std::vector<UText> texts;
    for (const Record &record : records())
        texts.push_back(record.text);
    std::sort(texts.begin(), texts.end());
    EXPECT_EQ(std::unique(texts.begin(), texts.end()), texts.end());
    EXPECT_EQ(texts.size(), size_t{THREADS} * ROUNDS);
}

TEST_F(ZlvThreads, LevelsChangeWhileOthersLog)
{
    mixWithLogging(
        [&](int round) { ZlvSetObjProp(app_, "level", round % 2 == 0 ? "INFO" : "ERROR"); });
    EXPECT_EQ(app_->logger.level, ZLV_LEVEL_ERROR);
    EXPECT_GE(records().size(), size_t{THREADS} * ROUNDS) << "those without level all arrive";
}

TEST_F(ZlvThreads, LoggersAreEnabledAndDisabledWhileOthersLog)
{
    mixWithLogging([&](int round) { ZlvSetObjectEnabled(app_, round % 2 == 0); });
    EXPECT_EQ(ZlvIsObjectEnabled(app_), 0);
    EXPECT_LE(records().size(), size_t{2} * THREADS * ROUNDS);
}

TEST_F(ZlvThreads, LoggingIsSwitchedByPropertyWhileOthersLog)
{
    mixWithLogging(
        [&](int round) { ZlvSetObjProp(app_, "logging", round % 2 == 0 ? "on" : "off"); });
    EXPECT_EQ(ZlvIsObjectEnabled(app_), 0);
}

TEST_F(ZlvThreads, ListenersComeAndGoWhileOthersLog)
{
    ZlvObject *second = handler("second", Recorder::className);
    mixWithLogging([&](int round) {
        round % 2 == 0 ? ZlvAddListener(app_, second) : ZlvRemListener(app_, second);
    });
    ZlvRemListener(app_, second);
    EXPECT_EQ(listeners(app_), Names{"recorder"});
    EXPECT_EQ(second->refCount, 2u);
}

TEST_F(ZlvThreads, ListenersAreRenamedWhileOthersLog)
{
    mixWithLogging(
        [&](int round) { ZlvSetObjProp(app_, "listenerNames", round % 2 == 0 ? "recorder" : ""); });
    EXPECT_EQ(listeners(app_), Names{});
    EXPECT_EQ(recorder_->refCount, 2u);
}

TEST_F(ZlvThreads, PropertiesAreSetAndReadWhileOthersLog)
{
    mixWithLogging([&](int round) {
        ZlvSetObjPropInt(app_, "key", round);
        ZlvBool found = 0;
        EXPECT_GE(ZlvGetObjPropInt(app_, "key", &found), 0);
        EXPECT_EQ(found, 1);
    });
    EXPECT_EQ(ZlvGetObjPropInt(app_, "key", nullptr), ROUNDS - 1);
}

TEST_F(ZlvThreads, ObjectsAreCreatedAndReleasedWhileOthersLog)
{
    mixWithLogging([&](int round) {
        std::string name = "object" + std::to_string(round % 3);
        ZlvObject *made = ZlvGetObject(name.c_str(), "zlv_consolehandler");
        ZlvReleaseObject(ZlvAcquireObject(made));
        ZlvReleaseObject(made);
    });
    for (const char *name : {"object0", "object1", "object2"})
        EXPECT_EQ(zlvIntlStringToObjMapHasKey(ZLV_TK_INSTANCES, name), 0);
}

TEST_F(ZlvThreads, ConfigurationsAreMadeAndAppliedWhileOthersLog)
{
    mixWithLogging([&](int round) {
        std::string name = "app.part" + std::to_string(round % 3);
        ZlvObjCfg *cfg = ZlvLogMgrGetCfg(name.c_str());
        ZlvSetObjCfgPropInt(cfg, "key", round);
        EXPECT_EQ(ZlvLogMgrApplyCfg(app_, name.c_str()), 1);
        ZlvReleaseObjCfg(cfg);
    });
    EXPECT_GE(ZlvGetObjPropInt(app_, "key", nullptr), 0);
}

TEST_F(ZlvThreads, ClassesAreRegisteredOnceWhoeverComesFirst)
{
    inFourThreads([&](int) {
        for (int round = 0; round < 20; ++round) {
            std::string name = "class" + std::to_string(round);
            ZlvAddLoggerClass(name.c_str(), nullptr, nullptr, nullptr, nullptr, nullptr);
        }
    });
    size_t count = 0;
    for (auto at = ZlvGetLoggerClasses(); ZlvStringGroupIterHasNext(at);
         at = ZlvStringGroupIterNext(at))
        count += taken(ZlvStringGroupIterGet(at))->starts_with("class") ? 1 : 0;
    EXPECT_EQ(count, 20u);
}

class ZlvThreadsFirst : public ToolkitFixture {};

TEST_F(ZlvThreadsFirst, FirstCallersFromSeveralThreadsCreateOneMutex)
{
    for (int round = 0; round < 50; ++round) {
        ZlvCloseToolkit();
        ASSERT_EQ(ZLV_TK_API_MUTEX_EXISTS, 0);
        int inside = 0; // guarded by the API mutex alone
        inFourThreads([&](int) {
            zelvo::ApiLock lock;
            EXPECT_TRUE(static_cast<bool>(lock));
            ++inside;
        });
        EXPECT_EQ(inside, THREADS);
        EXPECT_EQ(ZLV_TK_API_MUTEX_EXISTS, 1);
    }
}

TEST_F(ZlvThreadsFirst, SeveralThreadsMayOpenTheToolkitAtOnce)
{
    std::atomic<int> opened = 0;
    inFourThreads([&](int) { opened += ZlvOpenToolkit(nullptr, nullptr); });
    EXPECT_EQ(opened, THREADS);
    EXPECT_EQ(ZLV_TK_ERROR_LOG->refCount, 2u);
    EXPECT_EQ(listeners(ZLV_TK_ERROR_LOG), Names{"zelvo.defaultConsole"});
}

TEST_F(ZlvThreadsFirst, SeveralThreadsGetTheSameObject)
{
    open();
    std::array<ZlvObject *, THREADS> got{};
    inFourThreads([&](int number) {
        got[static_cast<size_t>(number)] = ZlvGetObject("app", "zlv_basiclogger");
    });
    for (ZlvObject *each : got)
        EXPECT_EQ(keep(each), got[0]);
    EXPECT_EQ(got[0]->refCount, uint32_t{THREADS} + 1);
}

} // namespace
} // namespace zelvo_test
