// SPDX-License-Identifier: Apache-2.0
// Two threads that create or destroy the API mutex at once, and forks while there is none.
#include <thread>
#include <utility>

#include "support/Child.h"
#include "support/FakeSystem.h"
#include "support/FileFaults.h"
#include "support/ToolkitFixture.h"

#include "ZlvIntl.h"

// What a fake of these hands its call on to (tests/CMakeLists.txt).
extern "C" int __real_pthread_mutex_lock(pthread_mutex_t *mutex);
extern "C" int __real_pthread_mutex_unlock(pthread_mutex_t *mutex);

namespace zelvo_test {
namespace {

/// Tests begin without a mutex.
class ZlvApiMutexRaces : public ToolkitFixture {
protected:
    void SetUp() override { ZlvCloseToolkit(); }
};

TEST_F(ZlvApiMutexRaces, AChildForkedWhileThereIsNoneCreatesItsOwn)
{
    open();
    ZlvCloseToolkit();
    ASSERT_EQ(ZLV_TK_API_MUTEX_EXISTS, 0);
    EXPECT_EQ(inChild([] { return zlvAPIMutexLock() == 1 ? 0 : 1; }), 0);
    EXPECT_EQ(zlvAPIMutexLock(), 1);
    zlvAPIMutexUnlock();
}

TEST_F(ZlvApiMutexRaces, OfTwoFirstCallersOneCreatesIt)
{
    FakeSystem system;
    CxMutex others = nullptr;
    bool isFirst = true;
    system.pthread_mutex_lock = [&](pthread_mutex_t *mutex) {
        // Another thread comes before this one, which is about to create it.
        if (std::exchange(isFirst, false))
            std::thread([&others] {
                ZlvIsObjectEnabled(nullptr);
                others = ZLV_TK_API_MUTEX;
            }).join();
        return __real_pthread_mutex_lock(mutex);
    };
    EXPECT_EQ(zlvAPIMutexLock(), 1);
    zlvAPIMutexUnlock();
    EXPECT_NE(others, nullptr);
    EXPECT_EQ(ZLV_TK_API_MUTEX, others);
}

TEST_F(ZlvApiMutexRaces, OfTwoWhoCloseOneDestroysIt)
{
    open();
    FakeSystem system;
    FileFaults faults;
    const void *awaited = ZLV_TK_API_MUTEX;
    system.pthread_mutex_unlock = [&awaited](pthread_mutex_t *mutex) {
        const int result = __real_pthread_mutex_unlock(mutex);
        // Another thread closes while this one has given the mutex back and not destroyed it yet.
        if (mutex != awaited)
            return result;
        awaited = nullptr;
        std::thread([] { ZlvCloseToolkit(); }).join();
        return result;
    };
    ZlvCloseToolkit();
    EXPECT_EQ(faults.reports, 0u);
    EXPECT_EQ(ZLV_TK_API_MUTEX_EXISTS, 0);
}

} // namespace
} // namespace zelvo_test
