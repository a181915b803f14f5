// SPDX-License-Identifier: Apache-2.0
// What the file handler does with an event.
#include "ZlvEvent.h"
#include "support/FailAlloc.h"
#include "support/FileHandlerFixture.h"

namespace zelvo_test {
namespace {

class ZlvFileHandlerProcess : public FileHandlerFixture {
protected:
    /// Hands the handler an event whose message has no arguments.
    static void process(ZlvObject *handler, ZlvEvent *event, ...)
    {
        zelvo::ApiLock lock;
        va_list none;
        va_start(none, event);
        ZlvFileUHandlerFProcess(handler, event, none);
        va_end(none);
    }
};

TEST_F(ZlvFileHandlerProcess, WritesTheRecordAndAddsNothing)
{
    handler("fileName", "app.log");
    log(u"first");
    log(u"second");
    EXPECT_EQ(file("app.log"), "first\nsecond\n");
}

TEST_F(ZlvFileHandlerProcess, WritesTheDefaultLayoutByItself)
{
    handler("fileName", "app.log");
    ZlvHandlerSetFormatter(handler_, object("zelvo.defaultFormatter"));
    log(u"text");
    const std::string content = read("app.log");
    EXPECT_EQ(content.substr(content.size() - 5), "text\n");
}

TEST_F(ZlvFileHandlerProcess, HandsTheArgumentsToTheFormatter)
{
    handler("fileName", "app.log");
    ZlvLogUText(app_, u"{0,number,integer} of {1,number,integer}", 3, 7);
    EXPECT_EQ(file("app.log"), "3 of 7\n");
}

TEST_F(ZlvFileHandlerProcess, WithoutTextFromTheFormatterWritesNothing)
{
    handler("fileName", "app.log");
    log(u"");
    EXPECT_EQ(LineFormatter::formatted(), 1);
    EXPECT_EQ(file("app.log"), "");
}

TEST_F(ZlvFileHandlerProcess, WritesALongRecordWhole)
{
    handler("fileName", "app.log");
    std::string line(100000, 'x');
    log(std::u16string(line.begin(), line.end()).c_str());
    line += '\n';
    EXPECT_EQ(file("app.log"), line);
}

TEST_F(ZlvFileHandlerProcess, MeasuresTheFileAfterTheRecord)
{
    framedHandler("fileName", "app.log");
    log(u"1234");
    EXPECT_EQ(vars()->currentSize, 7u);
    log(u"1234");
    EXPECT_EQ(vars()->currentSize, 12u);
}

TEST_F(ZlvFileHandlerProcess, OfADisabledHandlerDoesNothing)
{
    handler("fileName", "app.log");
    listenToHandler();
    ZlvSetObjectEnabled(handler_, 0);
    log(u"a");
    EXPECT_EQ(file("app.log"), std::nullopt);
    EXPECT_EQ(LineFormatter::formatted(), 0);
    EXPECT_TRUE(Recorder::records().empty());
}

TEST_F(ZlvFileHandlerProcess, PassesTheEventOnBehindTheRecord)
{
    handler("fileName", "app.log");
    listenToHandler();
    log(u"a");
    ASSERT_EQ(Recorder::records().size(), 1u);
    EXPECT_EQ(Recorder::records().front().text, u"a");
    EXPECT_EQ(file("app.log"), "a\n");
}

TEST_F(ZlvFileHandlerProcess, WithoutAFormatterWritesNothingAndPassesTheEventOn)
{
    handler("fileName", "app.log");
    ZlvHandlerSetFormatter(handler_, nullptr);
    listenToHandler();
    log(u"a");
    EXPECT_EQ(file("app.log"), "");
    EXPECT_EQ(Recorder::records().size(), 1u);
}

TEST_F(ZlvFileHandlerProcess, WithoutAFileNameFailsToWriteAndPassesTheEventOn)
{
    handler("fileName", nullptr);
    listenToHandler();
    FileFaults faults;
    EXPECT_TRUE(failed(logged(u"a"), EBADF));
    EXPECT_EQ(faults.reports, 1u);
    EXPECT_EQ(LineFormatter::formatted(), 1);
    EXPECT_EQ(Recorder::records().size(), 1u);
}

TEST_F(ZlvFileHandlerProcess, WithNeitherFileNameNorFormatterSucceeds)
{
    handler("fileName", nullptr);
    ZlvHandlerSetFormatter(handler_, nullptr);
    log(u"a");
}

TEST_F(ZlvFileHandlerProcess, AfterAFailedOpenFormatsTheRecordAndPassesTheEventOn)
{
    std::filesystem::create_directory("app.log");
    handler("fileName", "app.log");
    listenToHandler();
    FileFaults faults;
    EXPECT_TRUE(failed(logged(u"a"), EISDIR));
    EXPECT_EQ(faults.reports, 1u);
    EXPECT_EQ(LineFormatter::formatted(), 1);
    EXPECT_EQ(Recorder::records().size(), 1u);
}

TEST_F(ZlvFileHandlerProcess, AfterAFailedWriteReportsItAndPassesTheEventOn)
{
    std::filesystem::create_symlink("/dev/full", "app.log");
    handler("fileName", "app.log");
    listenToHandler();
    FileFaults faults;
    EXPECT_TRUE(failed(logged(u"a"), ENOSPC));
    EXPECT_EQ(faults.reports, 1u);
    EXPECT_EQ(vars()->currentSize, 0u);
    EXPECT_EQ(Recorder::records().size(), 1u);
}

TEST_F(ZlvFileHandlerProcess, RunningOutOfMemoryForConvertedBytesIsAFailure)
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
    log(u"after");
    EXPECT_EQ(read("app.log").substr(0, 7), "before\n");
}

TEST_F(ZlvFileHandlerProcess, OfNothingDoesNothing)
{
    handler("fileName", "app.log");
    process(handler_, nullptr);
    EXPECT_EQ(file("app.log"), std::nullopt);
    ZlvEvent event{};
    process(nullptr, &event);
    process(object("recorder", Recorder::className), &event);
    EXPECT_EQ(event.status.code, 0);
}

TEST_F(ZlvFileHandlerProcess, TwoHandlersWriteEachItsFile)
{
    handler("fileName", "app.log");
    ZlvObject *second = object("second", "zlv_filehandler");
    ZlvHandlerSetFormatter(second, formatter("framed", LineFormatter::framed));
    setProp(second, "fileName", "second.log");
    ZlvAddListener(app_, second);
    log(u"a");
    EXPECT_EQ(file("app.log"), "a\n");
    EXPECT_EQ(file("second.log"), "[\na\n");
}

} // namespace
} // namespace zelvo_test
