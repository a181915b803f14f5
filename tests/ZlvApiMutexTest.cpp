// SPDX-License-Identifier: Apache-2.0
// The API mutex, and what a public call answers without it.
#include <cerrno>
#include <thread>

#include <sys/wait.h>
#include <unistd.h>

#include "support/BrokenMutex.h"
#include "support/FileFaults.h"
#include "support/MutexFaults.h"
#include "support/ToolkitFixture.h"
#include "support/VaList.h"

#include "ZlvHandler.h"
#include "ZlvIntl.h"

namespace zelvo_test {
namespace {

class ZlvApiMutex : public ToolkitFixture {
protected:
    void SetUp() override { ZlvCloseToolkit(); }
};

TEST_F(ZlvApiMutex, TheFirstLockCreatesIt)
{
    ASSERT_EQ(ZLV_TK_API_MUTEX_EXISTS, 0);
    EXPECT_EQ(zlvAPIMutexLock(), 1);
    EXPECT_EQ(ZLV_TK_API_MUTEX_EXISTS, 1);
    EXPECT_NE(ZLV_TK_API_MUTEX, nullptr);
    zlvAPIMutexUnlock();
}

TEST_F(ZlvApiMutex, LaterLocksUseTheSame)
{
    EXPECT_EQ(zlvAPIMutexLock(), 1);
    CxMutex first = ZLV_TK_API_MUTEX;
    zlvAPIMutexUnlock();
    EXPECT_EQ(zlvAPIMutexLock(), 1);
    EXPECT_EQ(ZLV_TK_API_MUTEX, first);
    zlvAPIMutexUnlock();
}

TEST_F(ZlvApiMutex, UnlockingNoneDoesAndReportsNothing)
{
    FileFaults faults;
    zlvAPIMutexUnlock();
    EXPECT_EQ(faults.reports, 0u);
    EXPECT_EQ(ZLV_TK_API_MUTEX_EXISTS, 0);
}

TEST_F(ZlvApiMutex, AFailingCreationIsReportedAndRefusesTheLock)
{
    FileFaults faults;
    MutexFaults mutexes;
    mutexes.createCode = EAGAIN;
    EXPECT_EQ(zlvAPIMutexLock(), 0);
    EXPECT_EQ(faults.reports, 1u);
    EXPECT_EQ(faults.reported.type, CX_STATUS_PLATFORM);
    EXPECT_EQ(faults.reported.code, EAGAIN);
    EXPECT_EQ(ZLV_TK_API_MUTEX_EXISTS, 0);
}

TEST_F(ZlvApiMutex, IsCreatedByTheNextCallAfterAFailingCreation)
{
    {
        MutexFaults mutexes;
        mutexes.createCode = EAGAIN;
        EXPECT_EQ(zlvAPIMutexLock(), 0);
    }
    EXPECT_EQ(zlvAPIMutexLock(), 1);
    zlvAPIMutexUnlock();
}

TEST_F(ZlvApiMutex, AFailingLockIsReportedAndRefused)
{
    FileFaults faults;
    BrokenMutex broken;
    EXPECT_EQ(zlvAPIMutexLock(), 0);
    EXPECT_EQ(faults.reports, 1u);
    EXPECT_EQ(faults.reported.type, CX_STATUS_PLATFORM);
    EXPECT_EQ(faults.reported.code, EINVAL);
}

TEST_F(ZlvApiMutex, AFailingUnlockIsReported)
{
    FileFaults faults;
    BrokenMutex broken;
    zlvAPIMutexUnlock();
    EXPECT_EQ(faults.reports, 1u);
    EXPECT_EQ(faults.reported.type, CX_STATUS_PLATFORM);
    EXPECT_EQ(faults.reported.code, EINVAL);
}

TEST_F(ZlvApiMutex, CloseDestroysIt)
{
    open();
    ZlvCloseToolkit();
    EXPECT_EQ(ZLV_TK_API_MUTEX_EXISTS, 0);
    EXPECT_EQ(ZLV_TK_API_MUTEX, nullptr);
}

TEST_F(ZlvApiMutex, TheNextCallAfterCloseCreatesAnother)
{
    open();
    ZlvCloseToolkit();
    EXPECT_EQ(ZlvIsObjectEnabled(nullptr), 0);
    EXPECT_EQ(ZLV_TK_API_MUTEX_EXISTS, 1);
}

TEST_F(ZlvApiMutex, AFailingDestructionIsReportedAndTheFlagClearedAllTheSame)
{
    open();
    FileFaults faults;
    MutexFaults mutexes;
    mutexes.destroyCode = EBUSY;
    ZlvCloseToolkit();
    EXPECT_EQ(faults.reports, 1u);
    EXPECT_EQ(faults.reported.code, EBUSY);
    EXPECT_EQ(ZLV_TK_API_MUTEX_EXISTS, 0);
}

TEST_F(ZlvApiMutex, SuccessReportsNothing)
{
    FileFaults faults;
    open();
    ZlvCloseToolkit();
    EXPECT_EQ(faults.reports, 0u);
}

/// In the child: takes the mutex once and ends with 0, or is killed when it cannot.
[[noreturn]] void takeItInTheChild()
{
    alarm(30);
    _exit(zlvAPIMutexLock() == 1 ? 0 : 1);
}

TEST_F(ZlvApiMutex, IsUsableInAForkedChildWhateverOtherThreadsDid)
{
    open();
    std::atomic<bool> ends = false;
    std::thread other([&] {
        while (!ends)
            ZlvIsObjectEnabled(nullptr);
    });
    for (int round = 0; round < 50; ++round) {
        pid_t child = fork();
        if (child == 0)
            takeItInTheChild();
        int status = -1;
        waitpid(child, &status, 0);
        EXPECT_EQ(status, 0) << "round " << round;
    }
    ends = true;
    other.join();
}

TEST_F(ZlvApiMutex, StaysHeldByAThreadThatForksWhileItHoldsIt)
{
    open();
    ASSERT_EQ(zlvAPIMutexLock(), 1);
    pid_t child = fork();
    if (child == 0) {
        zlvAPIMutexUnlock();
        takeItInTheChild();
    }
    zlvAPIMutexUnlock();
    int status = -1;
    waitpid(child, &status, 0);
    EXPECT_EQ(status, 0);
    EXPECT_EQ(ZlvIsObjectEnabled(nullptr), 0);
}

/// A public call with valid arguments that tells whether it answered with nothing.
struct PublicCall {
    const char *name;
    std::function<bool(ZlvObject *logger, ZlvObject *handler)> answersNothing;
};

class WithoutTheApiMutex : public ToolkitFixture, public testing::WithParamInterface<PublicCall> {};

TEST_P(WithoutTheApiMutex, AnswersNothing)
{
    open();
    ZlvObject *app = logger("app");
    ZlvObject *console = handler("console");
    ZlvAddListener(app, console);
    setProp(app, "number", "5");
    setProp(app, "truth", "true");
    bool nothing = false;
    {
        BrokenMutex broken;
        nothing = GetParam().answersNothing(app, console);
    }
    EXPECT_TRUE(nothing);
    EXPECT_EQ(app->refCount, 2u);
    EXPECT_EQ(listeners(app), Names{"console"});
    EXPECT_EQ(prop(app, "number"), "5");
    EXPECT_EQ(ZlvIsObjectEnabled(app), 1);
    EXPECT_EQ(zlvToolkitGetClassDef("new"), nullptr);
}

#define CALL(name, ...)                                                                            \
    PublicCall                                                                                     \
    {                                                                                              \
#name, []([[maybe_unused]] ZlvObject * app,                                                \
                  [[maybe_unused]] ZlvObject * console) -> bool { __VA_ARGS__ }                    \
    }

INSTANTIATE_TEST_SUITE_P(
    , WithoutTheApiMutex,
    testing::Values(
        CALL(ZlvGetObject, return ZlvGetObject("app", nullptr) == nullptr;),
        CALL(ZlvAcquireObject, return ZlvAcquireObject(app) == nullptr;),
        CALL(ZlvReleaseObject, ZlvReleaseObject(app); return true;),
        CALL(ZlvGetObjectName, return ZlvGetObjectName(app) == nullptr;),
        CALL(ZlvGetObjectDesc, return ZlvGetObjectDesc(app) == nullptr;),
        CALL(ZlvIsObjectEnabled, return ZlvIsObjectEnabled(app) == 0;),
        CALL(ZlvSetObjectEnabled, ZlvSetObjectEnabled(app, 0); return true;),
        CALL(ZlvIsLoggableByFilter, return ZlvIsLoggableByFilter(app, nullptr, noArgs()) == 0;),
        CALL(ZlvGetObjProp, return ZlvGetObjProp(app, "number", nullptr) == nullptr;),
        CALL(ZlvGetObjPropBool, return ZlvGetObjPropBool(app, "truth", nullptr) == 0;),
        CALL(ZlvGetObjPropInt, return ZlvGetObjPropInt(app, "number", nullptr) == 0;),
        CALL(ZlvGetObjPropLong, return ZlvGetObjPropLong(app, "number", nullptr) == 0;),
        CALL(ZlvGetObjPropFloat, return ZlvGetObjPropFloat(app, "number", nullptr) == 0.0F;),
        CALL(ZlvGetObjPropDouble, return ZlvGetObjPropDouble(app, "number", nullptr) == 0.0;),
        CALL(ZlvSetObjProp, ZlvSetObjProp(app, "number", "6"); return true;),
        CALL(ZlvSetObjPropBool, ZlvSetObjPropBool(app, "number", 1); return true;),
        CALL(ZlvSetObjPropInt, ZlvSetObjPropInt(app, "number", 6); return true;),
        CALL(ZlvSetObjPropLong, ZlvSetObjPropLong(app, "number", 6); return true;),
        CALL(ZlvSetObjPropFloat, ZlvSetObjPropFloat(app, "number", 6); return true;),
        CALL(ZlvSetObjPropDouble, ZlvSetObjPropDouble(app, "number", 6); return true;),
        CALL(ZlvAddListener, ZlvAddListener(app, app); return true;),
        CALL(ZlvRemListener, ZlvRemListener(app, console); return true;),
        CALL(ZlvGetListeners, return ZlvGetListeners(app) == nullptr;),
        CALL(ZlvGetLoggerClasses, return ZlvGetLoggerClasses() == nullptr;),
        CALL(ZlvGetFilterClasses, return ZlvGetFilterClasses() == nullptr;),
        CALL(ZlvGetHandlerClasses, return ZlvGetHandlerClasses() == nullptr;),
        CALL(ZlvGetFormatterClasses, return ZlvGetFormatterClasses() == nullptr;),
        CALL(ZlvAddLoggerClass,
             ZlvAddLoggerClass("new", nullptr, nullptr, nullptr, nullptr, nullptr);
             return true;),
        CALL(ZlvAddFilterClass, ZlvAddFilterClass("new", nullptr, nullptr, nullptr, nullptr,
                                                  nullptr, nullptr, nullptr);
             return true;),
        CALL(ZlvAddHandlerClass, ZlvAddHandlerClass("new", nullptr, nullptr, nullptr, nullptr,
                                                    nullptr, nullptr, nullptr);
             return true;),
        CALL(ZlvAddUFormatterClass, ZlvAddUFormatterClass("new", nullptr, nullptr, nullptr, nullptr,
                                                          nullptr, nullptr, nullptr, nullptr);
             return true;),
        CALL(ZlvOpenToolkit, return ZlvOpenToolkit(nullptr, nullptr) == 0;),
        CALL(ZlvCloseToolkit, ZlvCloseToolkit(); return true;)),
    [](const auto &row) { return row.param.name; });

#undef CALL

TEST_F(ZlvApiMutex, IdentityOfObjectsNeedsNoLock)
{
    open();
    ZlvObject *app = logger("app");
    BrokenMutex broken;
    EXPECT_EQ(ZlvAreObjectsEqual(app, app), 1);
}

} // namespace
} // namespace zelvo_test
