// SPDX-License-Identifier: Apache-2.0
// How the file handler closes its file.
#include "support/FileHandlerFixture.h"

namespace zelvo_test {
namespace {

using ZlvFileHandlerClose = FileHandlerFixture;

TEST_F(ZlvFileHandlerClose, WritesTheTrailerAndClosesTheFile)
{
    framedHandler("fileName", "app.log");
    log(u"a");
    closeHandler();
    EXPECT_EQ(file("app.log"), "[\na\n]\n");
    EXPECT_EQ(vars()->isOpen, 0);
    EXPECT_EQ(vars()->file, -1);
}

TEST_F(ZlvFileHandlerClose, WithoutATrailerWritesNothing)
{
    handler("fileName", "app.log");
    log(u"a");
    closeHandler();
    EXPECT_EQ(file("app.log"), "a\n");
}

TEST_F(ZlvFileHandlerClose, OfAClosedFileDoesNothing)
{
    framedHandler("fileName", "app.log");
    closeHandler();
    log(u"a");
    closeHandler();
    FileFaults faults;
    closeHandler();
    EXPECT_EQ(file("app.log"), "[\na\n]\n");
    EXPECT_EQ(faults.reports, 0u);
}

TEST_F(ZlvFileHandlerClose, ReportsBothTheTrailerAndTheFile)
{
    framedHandler("fileName", "app.log");
    log(u"a");
    ::close(vars()->file);
    FileFaults faults;
    closeHandler();
    EXPECT_EQ(faults.reports, 2u);
    EXPECT_TRUE(failedWith(faults.reported, EBADF));
    EXPECT_EQ(vars()->isOpen, 0);
}

TEST_F(ZlvFileHandlerClose, ReportsAFailureToCloseAndClearsTheFlag)
{
    handler("fileName", "app.log");
    log(u"a");
    FileFaults faults;
    faults.failCloses(EIO);
    closeHandler();
    EXPECT_EQ(faults.reports, 1u);
    EXPECT_TRUE(failedWith(faults.reported, EIO));
    EXPECT_EQ(vars()->isOpen, 0);
}

TEST_F(ZlvFileHandlerClose, OfNothingIsHarmless)
{
    ZlvObject *recorder = object("recorder", Recorder::className);
    zelvo::ApiLock lock;
    ZlvFileHandlerFClose(nullptr);
    ZlvFileHandlerFClose(recorder);
}

} // namespace
} // namespace zelvo_test
