// SPDX-License-Identifier: Apache-2.0
// The semaphore that the processes of a shared log file take turns with.
#include "support/Child.h"
#include "support/FakeSystem.h"
#include "support/FileHandlerFixture.h"
#include "support/Rows.h"

namespace zelvo_test {
namespace {

class ZlvSharedLock : public MultiProcFixture {
protected:
    void SetUp() override
    {
        MultiProcFixture::SetUp();
        handler("fileName", "app.log");
    }

    /// What each answer to a missing or odd handler is, with STEP one of the three.
    static bool refuses(ZlvBool (*step)(ZlvObject *), ZlvObject *handler)
    {
        zelvo::ApiLock lock;
        return step(handler) == 0;
    }
};

TEST_F(ZlvSharedLock, IsTakenAndGivenBack)
{
    initSem();
    FileFaults faults;
    EXPECT_TRUE(lockSem());
    EXPECT_EQ(semValue(), 0);
    unlockSem();
    EXPECT_EQ(semValue(), 1);
    EXPECT_EQ(faults.reports, 0u);
}

TEST_F(ZlvSharedLock, TakesItSoThatTheSystemGivesItBack)
{
    initSem();
    FakeSystem system;
    std::vector<int> asked;
    system.semop = [&](int set, struct sembuf *operations, size_t count) {
        asked = {set, operations->sem_num, operations->sem_op, operations->sem_flg,
                 static_cast<int>(count)};
        return 0;
    };
    EXPECT_TRUE(lockSem());
    EXPECT_EQ(asked, (std::vector<int>{vars()->semId, 0, -1, SEM_UNDO, 1}));
}

TEST_F(ZlvSharedLock, LeavesAFreeOneAtOneAndReportsIt)
{
    initSem();
    FileFaults faults;
    unlockSem();
    EXPECT_EQ(semValue(), 1);
    EXPECT_EQ(faults.reports, 1u);
    EXPECT_EQ(faults.reported.type, 'p');
}

TEST_F(ZlvSharedLock, GivesNothingBackBeforeSetUp)
{
    FileFaults faults;
    FakeSystem system;
    int calls = 0;
    system.semop = [&](int, struct sembuf *, size_t) { return ++calls; };
    system.semctl = [&](int, int, int) { return ++calls; };
    unlockSem();
    EXPECT_EQ(calls, 0);
    EXPECT_EQ(faults.reports, 0u);
}

TEST_F(ZlvSharedLock, ReportsThatItCannotBeGivenBack)
{
    initSem();
    lockSem();
    removeSet();
    FileFaults faults;
    unlockSem();
    EXPECT_EQ(faults.reports, 1u);
    EXPECT_EQ(faults.reported.type, 'p');
}

struct Pause {
    const char *row;
    int code;
};

/// Failures that are waited out, a second each.
class ZlvSharedLockPauses : public ZlvSharedLock, public testing::WithParamInterface<Pause> {
protected:
    void SetUp() override
    {
        ZlvSharedLock::SetUp();
        initSem();
        system_.nanosleep = [this](const timespec *time, timespec *) {
            pauses_.push_back(static_cast<unsigned>(time->tv_sec));
            return 0;
        };
        system_.semop = [this](int, struct sembuf *, size_t) {
            errno = GetParam().code;
            return ++attempts_ > failures_ ? 0 : -1;
        };
    }

    FakeSystem system_;
    FileFaults faults_;
    std::vector<unsigned> pauses_;
    int attempts_ = 0;
    int failures_ = 0; ///< attempts that fail, before they succeed
};

TEST_P(ZlvSharedLockPauses, AreNotMadeWithoutAFailure)
{
    EXPECT_TRUE(lockSem());
    EXPECT_TRUE(pauses_.empty());
}

TEST_P(ZlvSharedLockPauses, GoOnAfterASignalWithWhatIsLeft)
{
    std::vector<long> times;
    system_.nanosleep = [&times](const timespec *time, timespec *rest) {
        times.push_back(time->tv_nsec);
        *rest = {.tv_sec = 0, .tv_nsec = 7};
        errno = EINTR;
        return times.size() < 3 ? -1 : 0;
    };
    failures_ = 1;
    EXPECT_TRUE(lockSem());
    EXPECT_EQ(times, (std::vector<long>{0, 7, 7}));
}

TEST_P(ZlvSharedLockPauses, ThatCannotBeMadeAreGivenUp)
{
    int pauses = 0;
    system_.nanosleep = [&pauses](const timespec *, timespec *) {
        ++pauses;
        errno = EINVAL;
        return -1;
    };
    failures_ = 1;
    EXPECT_TRUE(lockSem());
    EXPECT_EQ(pauses, 1);
}

TEST_P(ZlvSharedLockPauses, FollowOneFailure)
{
    failures_ = 1;
    EXPECT_TRUE(lockSem());
    EXPECT_EQ(pauses_, std::vector<unsigned>(1, 1));
    EXPECT_EQ(attempts_, 2);
}

TEST_P(ZlvSharedLockPauses, FollowTenFailures)
{
    failures_ = 10;
    EXPECT_TRUE(lockSem());
    EXPECT_EQ(pauses_, std::vector<unsigned>(10, 1));
    EXPECT_EQ(attempts_, 11);
}

TEST_P(ZlvSharedLockPauses, EndWithTheEleventhFailureUnguarded)
{
    failures_ = 1000;
    EXPECT_TRUE(lockSem());
    EXPECT_EQ(pauses_, std::vector<unsigned>(10, 1));
    EXPECT_EQ(attempts_, 11);
    EXPECT_EQ(faults_.reports, 0u);
    EXPECT_EQ(semValue(), 1);
}

TEST_P(ZlvSharedLockPauses, DoNotKeepARecordFromBeingWritten)
{
    failures_ = 1000;
    log(u"a");
    EXPECT_EQ(file("app.log"), "a\n");
}

INSTANTIATE_TEST_SUITE_P(Rows, ZlvSharedLockPauses,
                         testing::Values(Pause{"Interrupted", EINTR}, Pause{"NoRoom", ENOSPC}),
                         byRow);

class ZlvSharedLockFailures : public ZlvSharedLock, public testing::WithParamInterface<Pause> {};

TEST_P(ZlvSharedLockFailures, AreReportedWithoutAPause)
{
    initSem();
    FakeSystem system;
    int pauses = 0;
    system.nanosleep = [&](const timespec *, timespec *) { return pauses++; };
    system.semop = [](int, struct sembuf *, size_t) {
        errno = GetParam().code;
        return -1;
    };
    FileFaults faults;
    EXPECT_FALSE(lockSem());
    EXPECT_EQ(pauses, 0);
    EXPECT_EQ(faults.reports, 1u);
    EXPECT_TRUE(failedWith(faults.reported, GetParam().code));
}

INSTANTIATE_TEST_SUITE_P(Rows, ZlvSharedLockFailures,
                         testing::Values(Pause{"NoPermission", EACCES}, Pause{"NoSet", EINVAL},
                                         Pause{"Removed", EIDRM}, Pause{"NoMemory", ENOMEM},
                                         Pause{"OutOfRange", ERANGE}),
                         byRow);

TEST_F(ZlvSharedLock, ThatWasRemovedIsNotTaken)
{
    initSem();
    removeSet();
    FileFaults faults;
    EXPECT_FALSE(lockSem());
    EXPECT_EQ(faults.reports, 1u);
}

TEST_F(ZlvSharedLock, RemovedWhileAnotherProcessWaitsLetsItGo)
{
    initSem();
    lockSem();
    Child waiting([this] {
        FileFaults faults;
        return !lockSem() && faults.reported.code == EIDRM ? 0 : 1;
    });
    untilSomebodyWaits();
    removeSet();
    EXPECT_EQ(waiting.result(), 0);
}

TEST_F(ZlvSharedLock, KeepsAnotherProcessWaitingUntilItIsGivenBack)
{
    initSem();
    lockSem();
    Child waiting([this] { return lockSem() ? 0 : 1; });
    untilSomebodyWaits();
    unlockSem();
    EXPECT_EQ(waiting.result(), 0);
    EXPECT_EQ(semValue(), 1);
}

TEST_F(ZlvSharedLock, OfAProcessThatDiesIsGivenBackToTheOneThatWaits)
{
    initSem();
    lockSem();
    Child holder([this] {
        lockSem();
        pause();
        return 1;
    });
    untilSomebodyWaits();
    unlockSem();
    while (semctl(semSet(), 0, GETPID) == getpid())
        sched_yield();
    Child waiting([this] { return lockSem() ? 0 : 1; });
    untilSomebodyWaits();
    holder.kill();
    EXPECT_EQ(waiting.result(), 0);
    EXPECT_EQ(semValue(), 1);
}

TEST_F(ZlvSharedLock, OfAProcessThatEndsWithoutGivingItBackIsFree)
{
    initSem();
    EXPECT_EQ(inChild([this] { return lockSem() ? 7 : 1; }), 7);
    EXPECT_EQ(semValue(), 1);
    EXPECT_TRUE(lockSem());
    unlockSem();
}

TEST_F(ZlvSharedLock, OfSomebodyElseIsRefused)
{
    // A set that is one's own is never refused: this takes a second user.
    if (geteuid() != 0)
        GTEST_SKIP() << "only root can become somebody else";
    semget(key_, 1, IPC_CREAT | 0600);
    setSemValue(1);
    const int result = inChild([this] {
        FileFaults faults;
        const bool refused = becomeNobody() && initSem() && !lockSem();
        return refused && faults.reports == 1 && faults.reported.code == EACCES ? 0 : 1;
    });
    EXPECT_EQ(result, 0);
    EXPECT_EQ(semValue(), 1);
}

TEST_F(ZlvSharedLock, OfNoHandlerIsRefused)
{
    EXPECT_TRUE(refuses(zlvMultiProcFileHandlerInitSem, nullptr));
    EXPECT_TRUE(refuses(zlvMultiProcFileHandlerLockSem, nullptr));
    zlvMultiProcFileHandlerUnlockSem(nullptr);
}

TEST_F(ZlvSharedLock, OfAHandlerWithoutVariablesIsRefused)
{
    ZlvObject *recorder = object("recorder", Recorder::className);
    EXPECT_TRUE(refuses(zlvMultiProcFileHandlerInitSem, recorder));
    EXPECT_TRUE(refuses(zlvMultiProcFileHandlerLockSem, recorder));
    zelvo::ApiLock lock;
    zlvMultiProcFileHandlerUnlockSem(recorder);
}

TEST_F(ZlvSharedLock, StaysWhenTheHandlerCloses)
{
    log(u"a");
    closeHandler();
    EXPECT_EQ(vars()->semReady, 1);
    close();
    EXPECT_EQ(semValue(), 1);
}

} // namespace
} // namespace zelvo_test
