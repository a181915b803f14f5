// SPDX-License-Identifier: Apache-2.0
// How the semaphore of a shared log file is found or made.
#include "support/FakeSystem.h"
#include "support/FileHandlerFixture.h"
#include "support/Rows.h"

namespace zelvo_test {
namespace {

class ZlvSharedLockSetUp : public MultiProcFixture {
protected:
    void SetUp() override
    {
        MultiProcFixture::SetUp();
        handler("fileName", "app.log");
    }
};

TEST_F(ZlvSharedLockSetUp, MakesItFreeForEveryUser)
{
    EXPECT_TRUE(initSem());
    EXPECT_EQ(semValue(), 1);
    semid_ds facts{};
    ASSERT_EQ(semctl(semSet(), 0, IPC_STAT, &facts), 0);
    EXPECT_EQ(facts.sem_perm.mode & 0777, 0666);
    EXPECT_EQ(facts.sem_nsems, 1u);
}

TEST_F(ZlvSharedLockSetUp, RemembersTheSet)
{
    EXPECT_TRUE(initSem());
    EXPECT_EQ(vars()->semReady, 1);
    EXPECT_EQ(vars()->semId, semSet());
}

TEST_F(ZlvSharedLockSetUp, LeavesASetThatExistsAsItIs)
{
    const int set = semget(key_, 1, IPC_CREAT | 0600);
    FileFaults faults;
    EXPECT_TRUE(initSem());
    EXPECT_EQ(vars()->semId, set);
    EXPECT_EQ(semValue(), 0);
    EXPECT_EQ(faults.reports, 0u);
}

TEST_F(ZlvSharedLockSetUp, DoneTwiceKeepsItTaken)
{
    initSem();
    lockSem();
    EXPECT_TRUE(initSem());
    EXPECT_EQ(semValue(), 0);
    unlockSem();
}

TEST_F(ZlvSharedLockSetUp, AsksForOneSemaphoreOfTheKey)
{
    FakeSystem system;
    std::vector<int> asked;
    system.semget = [&](key_t key, int count, int flags) {
        asked.insert(asked.end(), {key, count, flags});
        errno = EEXIST;
        return -1;
    };
    EXPECT_FALSE(initSem());
    EXPECT_EQ(asked, (std::vector<int>{key_, 1, 0x7b6, key_, 1, 0}));
}

struct Refusal {
    const char *row;
    int code;
};

class ZlvSharedLockSetUpRefusals : public ZlvSharedLockSetUp,
                                   public testing::WithParamInterface<Refusal> {};

TEST_P(ZlvSharedLockSetUpRefusals, AreReportedAtOnce)
{
    FakeSystem system;
    int calls = 0;
    system.semget = [&](key_t, int, int) {
        ++calls;
        errno = GetParam().code;
        return -1;
    };
    FileFaults faults;
    EXPECT_FALSE(initSem());
    EXPECT_EQ(calls, 1);
    EXPECT_EQ(faults.reports, 1u);
    EXPECT_TRUE(failedWith(faults.reported, GetParam().code));
    EXPECT_EQ(vars()->semReady, 0);
}

INSTANTIATE_TEST_SUITE_P(Rows, ZlvSharedLockSetUpRefusals,
                         testing::Values(Refusal{"NoPermission", EACCES},
                                         Refusal{"OddSize", EINVAL}, Refusal{"NoSet", ENOENT},
                                         Refusal{"NoRoom", ENOSPC}),
                         byRow);

class ZlvSharedLockSetUpOtherErrors : public ZlvSharedLockSetUp,
                                      public testing::WithParamInterface<Refusal> {};

TEST_P(ZlvSharedLockSetUpOtherErrors, MeanThatTheSetExists)
{
    FakeSystem system;
    system.semget = [&](key_t, int, int flags) {
        errno = GetParam().code;
        return flags == 0 ? 4711 : -1;
    };
    FileFaults faults;
    EXPECT_TRUE(initSem());
    EXPECT_EQ(vars()->semId, 4711);
    EXPECT_EQ(faults.reports, 0u);
}

INSTANTIATE_TEST_SUITE_P(Rows, ZlvSharedLockSetUpOtherErrors,
                         testing::Values(Refusal{"Exists", EEXIST}, Refusal{"NoMemory", ENOMEM},
                                         Refusal{"Interrupted", EINTR}),
                         byRow);

TEST_F(ZlvSharedLockSetUp, ReportsASetThatVanishesMeanwhile)
{
    FakeSystem system;
    system.semget = [](key_t, int, int flags) {
        errno = flags == 0 ? ENOENT : EEXIST;
        return -1;
    };
    FileFaults faults;
    EXPECT_FALSE(initSem());
    EXPECT_EQ(faults.reports, 1u);
    EXPECT_TRUE(failedWith(faults.reported, ENOENT));
    EXPECT_EQ(vars()->semReady, 0);
}

TEST_F(ZlvSharedLockSetUp, ReportsASetThatCannotBeMadeFree)
{
    FakeSystem system;
    system.semctl = [](int, int, int) {
        errno = EPERM;
        return -1;
    };
    FileFaults faults;
    EXPECT_FALSE(initSem());
    EXPECT_EQ(faults.reports, 1u);
    EXPECT_TRUE(failedWith(faults.reported, EPERM));
    EXPECT_EQ(vars()->semReady, 0);
}

TEST_F(ZlvSharedLockSetUp, IsNotRepeatedForAChangedKey)
{
    initSem();
    const int set = vars()->semId;
    this->set("MPFileSemKey", "1");
    log(u"a");
    EXPECT_EQ(vars()->semId, set);
    EXPECT_EQ(semget(1, 1, 0), -1);
}

} // namespace
} // namespace zelvo_test
