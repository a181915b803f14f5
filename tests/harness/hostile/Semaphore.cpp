// SPDX-License-Identifier: Apache-2.0
// The semaphore of shared log files in the hands of other users.
#include <cerrno>

#include <sys/sem.h>

#include "Hostile.h"

namespace zelvo_test {
namespace {

bool doTo(int set, int16_t operation)
{
    sembuf step{.sem_num = 0, .sem_op = operation, .sem_flg = SEM_UNDO};
    return semop(set, &step, 1) == 0;
}

class HostileSemaphore : public Hostile {
protected:
    void SetUp() override
    {
        ZELVO_NEEDS_ROOT();
        Hostile::SetUp();
        permit(0777);
    }

    void logShared()
    {
        logTo(SHARED, "fileName", "app.log");
        log(u"a");
    }
};

TEST_F(HostileSemaphore, AnyUserMayHoldItAndEverybodyWaits)
{
    logShared();
    EXPECT_TRUE(as(User::OTHER, [this] {
        if (!doTo(semSet(), -1))
            return false;
        Child writer([this] { return ok(logged(u"b")) ? 0 : 1; });
        untilSomebodyWaits();
        return file("app.log") == "a\n" && doTo(semSet(), 1) && writer.result() == 0;
    }));
    EXPECT_EQ(file("app.log"), "a\nb\n");
}

TEST_F(HostileSemaphore, AnyUserMaySetItsValue)
{
    logShared();
    EXPECT_TRUE(as(User::OTHER, [this] { return semctl(semSet(), 0, SETVAL, 7) == 0; }));
    EXPECT_EQ(semValue(), 7); // so that seven processes write at a time
}

TEST_F(HostileSemaphore, NobodyElseMayRemoveIt)
{
    logShared();
    EXPECT_TRUE(
        as(User::OTHER, [this] { return semctl(semSet(), 0, IPC_RMID) == -1 && errno == EPERM; }));
}

TEST_F(HostileSemaphore, WhoMakesItFirstMaySilenceTheOthers)
{
    ASSERT_TRUE(as(User::OTHER, [this] { return semget(key_, 1, IPC_CREAT | 0600) != -1; }));
    EXPECT_TRUE(as(User::VICTIM, [this] {
        logTo(SHARED, "fileName", "app.log");
        return bool(ok(logged(u"lost")));
    }));
    EXPECT_EQ(file("app.log"), "");
}

TEST_F(HostileSemaphore, WhoMakesItFirstMayLeaveItHeld)
{
    ASSERT_TRUE(as(User::OTHER, [this] { return semget(key_, 1, IPC_CREAT | 0666) != -1; }));
    EXPECT_TRUE(as(User::VICTIM, [this] {
        logTo(SHARED, "fileName", "app.log");
        Child writer([this] { return ok(logged(u"a")) ? 0 : 1; });
        untilSomebodyWaits();
        setSemValue(1);
        return writer.result() == 0;
    }));
    EXPECT_EQ(file("app.log"), "a\n");
}

} // namespace
} // namespace zelvo_test
