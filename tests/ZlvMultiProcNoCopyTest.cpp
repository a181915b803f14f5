// SPDX-License-Identifier: Apache-2.0
// Copies of a shared live file that cannot be made: what they were to save is lost.
#include "support/FailAlloc.h"
#include "support/FakeSystem.h"
#include "support/FileHandlerFixture.h"

namespace zelvo_test {
namespace {

class ZlvMultiProcNoCopy : public MultiProcFixture {
protected:
    void SetUp() override
    {
        MultiProcFixture::SetUp();
        write("app.log", "live");
        handler("fileName", "app.log");
        openHandler();
    }

    void rollOver()
    {
        zelvo::ApiLock lock;
        zlvMultiProcFileHandlerDoRollover(handler_);
    }
};

TEST_F(ZlvMultiProcNoCopy, OfWhichTheSystemTakesNothingIsGivenUp)
{
    FakeSystem system;
    int writes = 0;
    system.write = [&writes](int, const void *, size_t) {
        ++writes;
        return 0;
    };
    rollOver();
    EXPECT_EQ(writes, 1);
    EXPECT_EQ(rolled(1), "");
    EXPECT_EQ(file("app.log"), "");
}

TEST_F(ZlvMultiProcNoCopy, WithoutMemoryForItsNameSaysSo)
{
    const std::string said = console([this] {
        FailAlloc fail(0);
        rollOver();
        EXPECT_GT(fail.failed(), 0u);
    });
    EXPECT_EQ(said, "ERR opening  pre rollover\n");
    EXPECT_EQ(file("app.log"), "");
}

} // namespace
} // namespace zelvo_test
