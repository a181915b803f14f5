// SPDX-License-Identifier: Apache-2.0
// The control of the tests in which nothing may stand still.
#include "Hostile.h"

namespace zelvo_test {
namespace {

class HostileGuard : public TestDir {};

TEST_F(HostileGuard, AChildThatStandsStillIsFound)
{
    ASSERT_EQ(mkfifo("fifo", 0600), 0);
    EXPECT_EQ(within(1, [] { return ::open("fifo", O_WRONLY); }), -1);
}

TEST_F(HostileGuard, AChildThatEndsGivesItsResult)
{
    EXPECT_EQ(within(PATIENCE, [] { return 3; }), 3);
}

} // namespace
} // namespace zelvo_test
