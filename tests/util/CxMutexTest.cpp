// SPDX-License-Identifier: Apache-2.0
#include <gtest/gtest.h>

#include <cerrno>
#include <pthread.h>

#include <thread>

#include "CxMutex.h"
#include "support/FakeSystem.h"
#include "support/StatusIs.h"

namespace zelvo_test {
namespace {

pthread_mutex_t *posix(CxMutex mutex)
{
    return reinterpret_cast<pthread_mutex_t *>(mutex);
}

class CxMutexTest : public testing::Test {
protected:
    CxMutexTest() { CxMutexCreate(&mutex); }

    ~CxMutexTest() override
    {
        if (mutex != nullptr)
            CxMutexDestroy(&mutex);
    }

    CxMutex mutex = nullptr;
};

TEST(CxMutexCreateTest, FillsTheSlot)
{
    CxMutex mutex = nullptr;
    EXPECT_TRUE(succeeded(CxMutexCreate(&mutex)));
    EXPECT_NE(mutex, nullptr);
    EXPECT_TRUE(succeeded(CxMutexDestroy(&mutex)));
}

TEST(CxMutexCreateTest, RefusesANullSlot)
{
    EXPECT_TRUE(failedWith(CxMutexCreate(nullptr), EINVAL));
}

TEST(CxMutexCreateTest, ReportsThatMemoryRanOut)
{
    CxMutex mutex = nullptr;
    FakeSystem system;
    system.malloc = [](size_t) { return nullptr; };
    CxStatus status = CxMutexCreate(&mutex);
    system.malloc = nullptr;
    EXPECT_TRUE(failedWith(status, ENOMEM));
    EXPECT_EQ(mutex, nullptr);
}

TEST(CxMutexCreateTest, ReportsTheNumberOfAFailedInitAndEmptiesTheSlot)
{
    int before = 0;
    CxMutex mutex = reinterpret_cast<CxMutex>(&before);
    FakeSystem system;
    system.pthread_mutex_init = [](auto *, auto *) { return EAGAIN; };
    EXPECT_TRUE(failedWith(CxMutexCreate(&mutex), EAGAIN));
    EXPECT_EQ(mutex, nullptr);
}

TEST_F(CxMutexTest, LocksAndUnlocksAnyNumberOfTimes)
{
    for (int round = 0; round < 3; ++round) {
        EXPECT_TRUE(succeeded(CxMutexLock(mutex)));
        EXPECT_TRUE(succeeded(CxMutexUnlock(mutex)));
    }
}

TEST_F(CxMutexTest, IsAPosixMutexThatIsNotRecursive)
{
    ASSERT_TRUE(succeeded(CxMutexLock(mutex)));
    EXPECT_EQ(pthread_mutex_trylock(posix(mutex)), EBUSY);
    EXPECT_TRUE(succeeded(CxMutexUnlock(mutex)));
    EXPECT_EQ(pthread_mutex_trylock(posix(mutex)), 0);
    EXPECT_TRUE(succeeded(CxMutexUnlock(mutex)));
}

TEST_F(CxMutexTest, KeepsThreadsApart)
{
    int counter = 0;
    auto count = [&] {
        for (int i = 0; i < 2000; ++i) {
            CxMutexLock(mutex);
            ++counter;
            CxMutexUnlock(mutex);
        }
    };
    std::thread first(count);
    std::thread second(count);
    first.join();
    second.join();
    EXPECT_EQ(counter, 4000);
}

TEST(CxMutexNull, LockReportsAMissingArgumentWithoutBlocking)
{
    EXPECT_TRUE(failedWith(CxMutexLock(nullptr), EINVAL));
}

TEST(CxMutexNull, UnlockReportsAMissingArgument)
{
    EXPECT_TRUE(failedWith(CxMutexUnlock(nullptr), EINVAL));
}

TEST(CxMutexNull, DestroyReportsAMissingArgument)
{
    EXPECT_TRUE(failedWith(CxMutexDestroy(nullptr), EINVAL));
}

TEST(CxMutexNull, DestroyRefusesAnEmptyHandleAndLeavesItEmpty)
{
    CxMutex mutex = nullptr;
    EXPECT_TRUE(failedWith(CxMutexDestroy(&mutex), EINVAL));
    EXPECT_EQ(mutex, nullptr);
}

TEST_F(CxMutexTest, LockReportsTheNumberOfTheThreadLibrary)
{
    FakeSystem system;
    system.pthread_mutex_lock = [](pthread_mutex_t *) { return EDEADLK; };
    CxStatus status = CxMutexLock(mutex);
    system.pthread_mutex_lock = nullptr;
    EXPECT_TRUE(failedWith(status, EDEADLK));
}

TEST_F(CxMutexTest, UnlockReportsTheNumberOfTheThreadLibrary)
{
    FakeSystem system;
    system.pthread_mutex_unlock = [](pthread_mutex_t *) { return EPERM; };
    CxStatus status = CxMutexUnlock(mutex);
    system.pthread_mutex_unlock = nullptr;
    EXPECT_TRUE(failedWith(status, EPERM));
}

TEST_F(CxMutexTest, DestroyEmptiesTheSlotSoThatASecondOneIsRefused)
{
    EXPECT_TRUE(succeeded(CxMutexDestroy(&mutex)));
    EXPECT_EQ(mutex, nullptr);
    EXPECT_TRUE(failedWith(CxMutexDestroy(&mutex), EINVAL));
    EXPECT_EQ(mutex, nullptr);
}

// The leak checker proves that the mutex object went too.
TEST_F(CxMutexTest, AFailingDestroyIsReportedAndStillEmptiesTheSlot)
{
    FakeSystem system;
    system.pthread_mutex_destroy = [](pthread_mutex_t *) { return EBUSY; };
    CxStatus status = CxMutexDestroy(&mutex);
    system.pthread_mutex_destroy = nullptr;
    EXPECT_TRUE(failedWith(status, EBUSY));
    EXPECT_EQ(mutex, nullptr);
}

} // namespace
} // namespace zelvo_test
