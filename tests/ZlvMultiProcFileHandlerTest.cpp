// SPDX-License-Identifier: Apache-2.0
// The file handler that several processes share: opening, writing, closing.
#include "ZlvEvent.h"
#include "support/Child.h"
#include "support/FailAlloc.h"
#include "support/FakeSystem.h"
#include "support/FileHandlerFixture.h"

namespace zelvo_test {
namespace {

class ZlvMultiProcFileHandler : public MultiProcFixture {
protected:
    /// Hands the handler an event whose message has no arguments.
    static void process(ZlvObject *handler, ZlvEvent *event, ...)
    {
        zelvo::ApiLock lock;
        va_list none;
        va_start(none, event);
        ZlvMultiProcFileUHandlerFProcess(handler, event, none);
        va_end(none);
    }
};

TEST_F(ZlvMultiProcFileHandler, WritesTheRecordAndAddsNothing)
{
    handler("fileName", "app.log");
    log(u"first");
    log(u"second");
    EXPECT_EQ(file("app.log"), "first\nsecond\n");
}

TEST_F(ZlvMultiProcFileHandler, WritesNeitherHeaderNorTrailer)
{
    framedHandler("fileName", "app.log");
    log(u"a");
    closeHandler();
    log(u"b");
    closeHandler();
    EXPECT_EQ(file("app.log"), "a\nb\n");
}

TEST_F(ZlvMultiProcFileHandler, AppendsWhateverItsPropertySays)
{
    write("app.log", "before\n");
    handler("fileName", "app.log", "appending", "false");
    log(u"a");
    EXPECT_EQ(file("app.log"), "before\na\n");
}

TEST_F(ZlvMultiProcFileHandler, DropsTheEventWhenTheFileCannotBeOpened)
{
    std::filesystem::create_directory("app.log");
    handler("fileName", "app.log");
    listenToHandler();
    EXPECT_TRUE(failed(logged(u"lost"), EISDIR));
    EXPECT_TRUE(Recorder::records().empty());
    EXPECT_EQ(LineFormatter::formatted(), 0);
}

TEST_F(ZlvMultiProcFileHandler, DropsTheEventWithoutAFileName)
{
    handler("fileName", nullptr);
    listenToHandler();
    log(u"lost");
    EXPECT_TRUE(Recorder::records().empty());
}

TEST_F(ZlvMultiProcFileHandler, PassesTheEventOnBehindTheRecord)
{
    handler("fileName", "app.log");
    listenToHandler();
    log(u"a");
    EXPECT_EQ(Recorder::records().size(), 1u);
    EXPECT_EQ(file("app.log"), "a\n");
}

TEST_F(ZlvMultiProcFileHandler, OfADisabledHandlerDoesNothing)
{
    handler("fileName", "app.log");
    listenToHandler();
    ZlvSetObjectEnabled(handler_, 0);
    log(u"a");
    EXPECT_EQ(file("app.log"), std::nullopt);
    EXPECT_EQ(semSet(), -1);
    EXPECT_TRUE(Recorder::records().empty());
}

TEST_F(ZlvMultiProcFileHandler, WithoutTextTakesNoTurnAndPassesTheEventOn)
{
    handler("fileName", "app.log");
    ZlvHandlerSetFormatter(handler_, nullptr);
    listenToHandler();
    FakeSystem system;
    int turns = 0;
    system.semop = [&](int, struct sembuf *, size_t) { return ++turns; };
    log(u"a");
    EXPECT_EQ(turns, 0);
    EXPECT_EQ(Recorder::records().size(), 1u);
}

TEST_F(ZlvMultiProcFileHandler, WithoutTheLockWritesNothingAndPassesTheEventOn)
{
    handler("fileName", "app.log");
    listenToHandler();
    openHandler();
    removeSet();
    FileFaults faults;
    log(u"lost");
    EXPECT_EQ(faults.reports, 1u);
    EXPECT_EQ(file("app.log"), "");
    EXPECT_EQ(Recorder::records().size(), 1u);
}

TEST_F(ZlvMultiProcFileHandler, GivesTheLockBackAfterEachRecord)
{
    handler("fileName", "app.log");
    log(u"a");
    EXPECT_EQ(semValue(), 1);
    log(u"b");
    EXPECT_EQ(semValue(), 1);
}

TEST_F(ZlvMultiProcFileHandler, GivesTheLockBackAfterAFailedWrite)
{
    std::filesystem::create_symlink("/dev/full", "app.log");
    handler("fileName", "app.log");
    listenToHandler();
    FileFaults faults;
    EXPECT_TRUE(failed(logged(u"lost"), ENOSPC));
    EXPECT_EQ(faults.reports, 1u);
    EXPECT_EQ(semValue(), 1);
    EXPECT_EQ(Recorder::records().size(), 1u);
}

TEST_F(ZlvMultiProcFileHandler, ReportsASizeThatCannotBeReadAndTheWrite)
{
    handler("fileName", "app.log");
    log(u"a");
    ::close(vars()->file);
    FileFaults faults;
    EXPECT_TRUE(failed(logged(u"lost"), EBADF));
    EXPECT_EQ(faults.reports, 2u);
    EXPECT_EQ(semValue(), 1);
}

TEST_F(ZlvMultiProcFileHandler, TakesTheSizeAsLastKnownWhenItCannotBeRead)
{
    write("app1.log", "1");
    handler("fileName", "app.log", "maxFileSize", "1000", "maxFiles", "3");
    log(u"a");
    ::close(vars()->file);
    EXPECT_TRUE(failed(logged(u"lost"), EBADF));
    EXPECT_EQ(rolled(1), "1");
    vars()->currentSize = 1000;
    EXPECT_TRUE(failed(logged(u"lost"), EBADF));
    EXPECT_EQ(rolled(2), "1");
}

TEST_F(ZlvMultiProcFileHandler, MeasuresTheFileBeforeTheRecord)
{
    write("app.log", "12345");
    handler("fileName", "app.log");
    log(u"a");
    EXPECT_EQ(vars()->currentSize, 5u);
    log(u"b");
    EXPECT_EQ(vars()->currentSize, 7u);
}

TEST_F(ZlvMultiProcFileHandler, RunningOutOfMemoryForConvertedBytesIsAFailure)
{
    handler("fileName", "app.log");
    log(u"before");
    bool seen = false;
    for (uint32_t allowed = 0;; ++allowed) {
        FailAlloc fail(allowed, FailAlloc::Once);
        const ZlvStatus status = logged(u"ä");
        if (fail.failed() == 0)
            break;
        seen = seen || failed(status, ENOMEM);
        EXPECT_TRUE(ok(status) || failed(status, ENOMEM)) << "after " << allowed;
    }
    EXPECT_TRUE(seen);
    EXPECT_EQ(semValue(), 1);
}

TEST_F(ZlvMultiProcFileHandler, KeepsWritingToAFileThatWasDeletedUntilItIsClosed)
{
    handler("fileName", "app.log");
    log(u"a");
    std::filesystem::remove("app.log");
    log(u"b");
    EXPECT_EQ(file("app.log"), std::nullopt);
    closeHandler();
    log(u"c");
    EXPECT_EQ(file("app.log"), "c\n");
}

TEST_F(ZlvMultiProcFileHandler, ClosesTheFileAndReportsAFailure)
{
    handler("fileName", "app.log");
    log(u"a");
    FileFaults faults;
    faults.failCloses(EIO);
    closeHandler();
    EXPECT_EQ(faults.reports, 1u);
    EXPECT_TRUE(failedWith(faults.reported, EIO));
    EXPECT_EQ(vars()->isOpen, 0);
    closeHandler();
    EXPECT_EQ(faults.reports, 1u);
}

TEST_F(ZlvMultiProcFileHandler, OfNothingDoesNothing)
{
    handler("fileName", "app.log");
    process(handler_, nullptr);
    EXPECT_EQ(file("app.log"), std::nullopt);
    ZlvEvent event{};
    process(nullptr, &event);
    ZlvObject *recorder = object("recorder", Recorder::className);
    process(recorder, &event);
    EXPECT_EQ(event.status.code, 0);
    zelvo::ApiLock lock;
    ZlvMultiProcFileHandlerFClose(nullptr);
    ZlvMultiProcFileHandlerFClose(recorder);
}

TEST_F(ZlvMultiProcFileHandler, OfTwoProcessesLosesAndTearsNoRecord)
{
    handler("fileName", "app.log", "maxFiles", "1");
    const auto thousand = [this](char16_t name) {
        int failures = 0;
        for (int record = 0; record < 1000; ++record)
            failures += ok(logged(std::u16string(99, name).c_str())) ? 0 : 1;
        return failures;
    };
    Child first([&] { return thousand(u'a'); });
    Child second([&] { return thousand(u'b'); });
    EXPECT_EQ(first.result(), 0);
    EXPECT_EQ(second.result(), 0);

    std::map<std::string, int> lines;
    std::ifstream content("app.log");
    for (std::string line; std::getline(content, line);)
        ++lines[line];
    const std::map<std::string, int> whole{{std::string(99, 'a'), 1000},
                                           {std::string(99, 'b'), 1000}};
    EXPECT_EQ(lines, whole);
    EXPECT_EQ(std::filesystem::file_size("app.log"), 200000u);
    EXPECT_EQ(semValue(), 1);
}

} // namespace
} // namespace zelvo_test
