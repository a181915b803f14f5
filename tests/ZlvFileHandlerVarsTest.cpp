// SPDX-License-Identifier: Apache-2.0
// The variables of the file handlers: what they hold at first, and their end.
#include "support/FailAlloc.h"
#include "support/FileHandlerFixture.h"

namespace zelvo_test {
namespace {

/// Fresh variables; both classes share the entries that make and free them.
class ZlvFileHandlerVars : public TestDir {
protected:
    ~ZlvFileHandlerVars() override { ZlvFileHandlerFFreeVars(vars_); }

    FileHandlerVars *vars_ = static_cast<FileHandlerVars *>(ZlvFileHandlerFAllocVars());
};

TEST_F(ZlvFileHandlerVars, BeginWithoutAFile)
{
    EXPECT_EQ(vars_->file, -1);
    EXPECT_EQ(vars_->isOpen, 0);
    EXPECT_EQ(vars_->currentSize, 0u);
    EXPECT_TRUE(std::filesystem::is_empty("."));
}

TEST_F(ZlvFileHandlerVars, BeginWithAMegabyte)
{
    EXPECT_EQ(vars_->maxBytes, 1048576);
}

TEST_F(ZlvFileHandlerVars, BeginWithThreeFiles)
{
    EXPECT_EQ(vars_->maxFiles, 3);
}

TEST_F(ZlvFileHandlerVars, BeginWithTheDefaultName)
{
    EXPECT_EQ(peeked(vars_->fullName), directory().string() + "/default.log");
    EXPECT_EQ(peeked(vars_->directory), directory().string());
    EXPECT_EQ(peeked(vars_->base), "default");
    EXPECT_EQ(peeked(vars_->extension), "log");
    EXPECT_EQ(vars_->number, 0);
}

TEST_F(ZlvFileHandlerVars, BeginWithoutAnEncoding)
{
    EXPECT_EQ(vars_->encoding, nullptr);
}

TEST_F(ZlvFileHandlerVars, BeginWithThePermissionsOfFilesAndDirectories)
{
    EXPECT_EQ(vars_->filePermission, 0744u);
    EXPECT_EQ(vars_->dirPermission, 0771u);
}

TEST_F(ZlvFileHandlerVars, BeginAppending)
{
    EXPECT_EQ(vars_->appending, 1);
}

TEST_F(ZlvFileHandlerVars, BeginWithTheDefaultSemaphoreNotSetUp)
{
    EXPECT_EQ(vars_->semReady, 0);
    EXPECT_EQ(vars_->semKey, 31821);
    EXPECT_EQ(vars_->semId, -1);
}

TEST_F(ZlvFileHandlerVars, BeginLoggingInternalErrors)
{
    EXPECT_EQ(vars_->logInternalErrs, 1);
}

TEST_F(ZlvFileHandlerVars, AreNotMadeWithoutMemory)
{
    FailAlloc fail(0);
    EXPECT_EQ(ZlvFileHandlerFAllocVars(), nullptr);
    EXPECT_EQ(fail.failed(), 1u);
}

TEST_F(ZlvFileHandlerVars, HaveNoNameWhenMemoryRunsOutForIt)
{
    for (uint32_t allowed = 1;; ++allowed) {
        FailAlloc fail(allowed, FailAlloc::Once);
        auto *vars = static_cast<FileHandlerVars *>(ZlvFileHandlerFAllocVars());
        const bool hasFailed = fail.failed() != 0;
        ASSERT_NE(vars, nullptr);
        EXPECT_EQ(vars->fullName == nullptr, hasFailed) << "after " << allowed;
        ZlvFileHandlerFFreeVars(vars);
        if (!hasFailed)
            break;
    }
}

TEST_F(ZlvFileHandlerVars, FreeingNoneIsHarmless)
{
    ZlvFileHandlerFFreeVars(nullptr);
}

class ZlvFileHandlerVarsEnd : public FileHandlerFixture {};

TEST_F(ZlvFileHandlerVarsEnd, OfAHandlerInUseAtTheToolkitsEndWritesNoTrailer)
{
    framedHandler("fileName", "app.log");
    log(u"a");
    ZlvAcquireObject(handler_);
    close();
    EXPECT_EQ(file("app.log"), "[\na\n");
}

TEST_F(ZlvFileHandlerVarsEnd, ReportsAFailureToClose)
{
    handler("fileName", "app.log");
    log(u"a");
    ::close(vars()->file);
    FileFaults faults;
    close();
    EXPECT_EQ(faults.reports, 1u);
    EXPECT_TRUE(failedWith(faults.reported, EBADF));
}

TEST_F(ZlvFileHandlerVarsEnd, OfAReleasedHandlerComesAfterItsTrailer)
{
    open();
    ZlvObject *handler = ZlvGetObject("alone", "zlv_filehandler");
    ZlvHandlerSetFormatter(handler, formatter("framed", LineFormatter::framed));
    ZlvSetObjProp(handler, "fileName", "alone.log");
    {
        zelvo::ApiLock lock;
        ZlvFileHandlerFOpen(handler);
    }
    ZlvReleaseObject(handler);
    EXPECT_EQ(file("alone.log"), "[\n]\n");
}

} // namespace
} // namespace zelvo_test
