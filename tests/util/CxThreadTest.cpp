// SPDX-License-Identifier: Apache-2.0
#include <gtest/gtest.h>

#include <cerrno>
#include <pthread.h>

#include <string>
#include <utility>
#include <vector>

#include "CxThread.h"
#include "support/FakeSystem.h"
#include "support/StatusIs.h"

namespace zelvo_test {
namespace {

void *increment(void *argument)
{
    ++*static_cast<int *>(argument);
    return nullptr;
}

void *tellId(void *argument)
{
    *static_cast<uint64_t *>(argument) = CxThreadGetCurrentID();
    return nullptr;
}

void *giveArgument(void *argument)
{
    return argument;
}

TEST(CxThread, SupportIsAlwaysThere)
{
    EXPECT_EQ(CxHasThreadSupport(), 1);
}

TEST(CxThread, CurrentIdIsThatOfTheThreadLibrary)
{
    EXPECT_EQ(CxThreadGetCurrentID(), static_cast<uint64_t>(pthread_self()));
}

TEST(CxThread, CreateRunsTheRoutineWithItsArgument)
{
    int counter = 0;
    uint64_t thread = 0;
    ASSERT_TRUE(succeeded(CxThreadCreate(&thread, 0, increment, &counter)));
    EXPECT_TRUE(succeeded(CxThreadJoin(thread)));
    EXPECT_EQ(counter, 1);
}

TEST(CxThread, CreateGivesTheIdOfTheThread)
{
    uint64_t told = 0;
    uint64_t thread = 0;
    ASSERT_TRUE(succeeded(CxThreadCreate(&thread, 0, tellId, &told)));
    ASSERT_TRUE(succeeded(CxThreadJoin(thread)));
    EXPECT_EQ(thread, told);
    EXPECT_NE(thread, CxThreadGetCurrentID());
}

TEST(CxThread, CreateTakesANullArgument)
{
    uint64_t thread = 0;
    ASSERT_TRUE(succeeded(CxThreadCreate(&thread, 0, giveArgument, nullptr)));
    EXPECT_TRUE(succeeded(CxThreadJoin(thread)));
}

TEST(CxThread, CreateRefusesANullSlot)
{
    int counter = 0;
    EXPECT_TRUE(failedWith(CxThreadCreate(nullptr, 0, increment, &counter), EINVAL));
    EXPECT_EQ(counter, 0);
}

TEST(CxThread, CreateRefusesANullRoutine)
{
    uint64_t thread = 0;
    EXPECT_TRUE(failedWith(CxThreadCreate(&thread, 0, nullptr, nullptr), EINVAL));
}

// Asked of the attributes, since the thread library may give a thread a larger stack that it kept.
TEST(CxThread, CreateAsksForAStackOfTheSize)
{
    size_t size = 0;
    uint64_t thread = 0;
    FakeSystem system;
    system.pthread_create = [&](auto *, const pthread_attr_t *attributes, auto, void *) {
        return pthread_attr_getstacksize(attributes, &size);
    };
    EXPECT_TRUE(succeeded(CxThreadCreate(&thread, size_t{3} << 20, giveArgument, nullptr)));
    EXPECT_EQ(size, size_t{3} << 20);
}

TEST(CxThread, CreateLeavesTheStackSizeAloneWhenItIsZero)
{
    bool set = false;
    int counter = 0;
    uint64_t thread = 0;
    FakeSystem system;
    system.pthread_attr_setstacksize = [&](pthread_attr_t *, size_t) { return set = true, 0; };
    ASSERT_TRUE(succeeded(CxThreadCreate(&thread, 0, increment, &counter)));
    EXPECT_TRUE(succeeded(CxThreadJoin(thread)));
    EXPECT_FALSE(set);
}

TEST(CxThread, CreateReportsAStackSizeThatIsTooSmall)
{
    int counter = 0;
    uint64_t thread = 0;
    EXPECT_TRUE(failedWith(CxThreadCreate(&thread, 1, increment, &counter), EINVAL));
    EXPECT_EQ(counter, 0);
}

TEST(CxThread, CreateStartsNoThreadAfterARefusedStackSize)
{
    bool started = false;
    uint64_t thread = 0;
    FakeSystem system;
    system.pthread_attr_setstacksize = [](pthread_attr_t *, size_t) { return ENOTSUP; };
    system.pthread_create = [&](auto *, auto *, auto, void *) { return started = true, 0; };
    EXPECT_TRUE(failedWith(CxThreadCreate(&thread, 65536, giveArgument, nullptr), ENOTSUP));
    EXPECT_FALSE(started);
}

TEST(CxThread, CreateReportsFailedAttributes)
{
    uint64_t thread = 0;
    FakeSystem system;
    system.pthread_attr_init = [](pthread_attr_t *) { return ENOMEM; };
    system.pthread_attr_destroy = [](pthread_attr_t *) { return 0; };
    system.pthread_create = [](auto *, auto *, auto, void *) { return EPERM; };
    EXPECT_TRUE(failedWith(CxThreadCreate(&thread, 0, giveArgument, nullptr), ENOMEM));
}

TEST(CxThread, CreateReportsThatTheThreadCouldNotStart)
{
    uint64_t thread = 0;
    FakeSystem system;
    system.pthread_create = [](auto *, auto *, auto, void *) { return EAGAIN; };
    EXPECT_TRUE(failedWith(CxThreadCreate(&thread, 0, giveArgument, nullptr), EAGAIN));
}

TEST(CxThread, CreateStartsAJoinableThread)
{
    int state = -1;
    uint64_t thread = 0;
    FakeSystem system;
    system.pthread_create = [&](auto *, const pthread_attr_t *attributes, auto, void *) {
        return pthread_attr_getdetachstate(attributes, &state);
    };
    EXPECT_TRUE(succeeded(CxThreadCreate(&thread, 0, giveArgument, nullptr)));
    EXPECT_EQ(state, PTHREAD_CREATE_JOINABLE);
}

/// One way for the creation to go: what setting the stack size and starting the thread answer.
struct Course {
    const char *name;
    int setStackSize;
    int create;
};

class CxThreadAttributes : public testing::TestWithParam<Course> {};

TEST_P(CxThreadAttributes, AreDestroyedInEveryCase)
{
    int destroyed = 0;
    uint64_t thread = 0;
    FakeSystem system;
    system.pthread_attr_setstacksize = [](auto *, size_t) { return GetParam().setStackSize; };
    system.pthread_create = [](auto *, auto *, auto, void *) { return GetParam().create; };
    system.pthread_attr_destroy = [&](auto *) { return ++destroyed, 0; };
    CxThreadCreate(&thread, 65536, giveArgument, nullptr);
    EXPECT_EQ(destroyed, 1);
}

INSTANTIATE_TEST_SUITE_P(Courses, CxThreadAttributes,
                         testing::Values(Course{"Success", 0, 0},
                                         Course{"RefusedStackSize", EINVAL, 0},
                                         Course{"RefusedStart", 0, EAGAIN}),
                         [](const auto &row) { return std::string(row.param.name); });

TEST(CxThread, JoinReportsTheNumberOfTheThreadLibrary)
{
    FakeSystem system;
    system.pthread_join = [](pthread_t, void **) { return EDEADLK; };
    EXPECT_TRUE(failedWith(CxThreadJoin(CxThreadGetCurrentID()), EDEADLK));
}

TEST(CxThread, JoinRefusesTheIdOfNoThread)
{
    EXPECT_TRUE(failedWith(CxThreadJoin(0), EINVAL));
}

TEST(CxThread, JoinDiscardsTheThreadsResult)
{
    int argument = 0;
    uint64_t thread = 0;
    ASSERT_TRUE(succeeded(CxThreadCreate(&thread, 0, giveArgument, &argument)));
    EXPECT_TRUE(succeeded(CxThreadJoin(thread)));
}

TEST(CxThread, YieldDoesNothing)
{
    int yielded = 0;
    FakeSystem system;
    system.sched_yield = [&] { return ++yielded, 0; };
    CxThreadYield();
    EXPECT_EQ(yielded, 0);
}

/// A wish in milliseconds and the whole seconds that are slept.
using Nap = std::pair<uint32_t, unsigned>;

class CxThreadSleepTest : public testing::TestWithParam<Nap> {};

TEST_P(CxThreadSleepTest, RoundsToTheNearestSecond)
{
    unsigned slept = 0;
    FakeSystem system;
    system.sleep = [&](unsigned seconds) { return slept += seconds, 0U; };
    EXPECT_EQ(CxThreadSleep(GetParam().first), 0U);
    EXPECT_EQ(slept, GetParam().second);
}

INSTANTIATE_TEST_SUITE_P(Naps, CxThreadSleepTest,
                         testing::Values(Nap{0, 0}, Nap{1, 0}, Nap{499, 0}, Nap{500, 1},
                                         Nap{1000, 1}, Nap{1499, 1}, Nap{1500, 2}, Nap{60000, 60},
                                         Nap{4294967295, 4294967}),
                         [](const auto &row) {
                             return std::to_string(row.param.first) + "Milliseconds";
                         });

TEST(CxThread, SleepGivesTheSecondsThatWereNotSlept)
{
    FakeSystem system;
    system.sleep = [](unsigned) { return 3U; };
    EXPECT_EQ(CxThreadSleep(5000), 3U);
}

} // namespace
} // namespace zelvo_test
