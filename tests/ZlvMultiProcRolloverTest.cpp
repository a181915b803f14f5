// SPDX-License-Identifier: Apache-2.0
// How the shared log file is rolled over while every process keeps it open.
#include "support/Child.h"
#include "support/FakeSystem.h"
#include "support/FileHandlerFixture.h"

namespace zelvo_test {
namespace {

class ZlvMultiProcRollover : public MultiProcFixture {
protected:
    void rollOver()
    {
        zelvo::ApiLock lock;
        zlvMultiProcFileHandlerDoRollover(handler_);
    }

    /// A handler whose file is open and holds CONTENT.
    template <class... Properties>
    void openHandlerOn(const std::string &content, Properties... properties)
    {
        write("app.log", content);
        handler("fileName", "app.log", properties...);
        openHandler();
    }
};

TEST_F(ZlvMultiProcRollover, CopiesTheLiveFileAndEmptiesIt)
{
    openHandlerOn("live", "maxFiles", "2");
    write("app1.log", "older, and longer than the live file");
    FileFaults faults;
    rollOver();
    EXPECT_EQ(rolled(1), "live");
    EXPECT_EQ(rolled(2), std::nullopt);
    EXPECT_EQ(file("app.log"), "");
    EXPECT_EQ(faults.reports, 0u);
}

TEST_F(ZlvMultiProcRollover, LeavesTheLiveFileInItsPlace)
{
    openHandlerOn("live", "maxFiles", "3");
    std::filesystem::create_hard_link("app.log", "same.log");
    rollOver();
    EXPECT_TRUE(std::filesystem::equivalent("app.log", "same.log"));
}

TEST_F(ZlvMultiProcRollover, MovesEachOlderFileOnAndDropsTheOldest)
{
    openHandlerOn("0", "maxFiles", "4");
    for (const char *number : {"1", "2", "3"})
        write(std::string("app") + number + ".log", number);
    rollOver();
    EXPECT_EQ(rolled(1), "0");
    EXPECT_EQ(rolled(2), "1");
    EXPECT_EQ(rolled(3), "2");
    EXPECT_EQ(rolled(4), std::nullopt);
}

TEST_F(ZlvMultiProcRollover, PassesOverFilesThatAreNotThereInSilence)
{
    openHandlerOn("0", "maxFiles", "5");
    write("app2.log", "2");
    FileFaults faults;
    rollOver();
    EXPECT_EQ(rolled(1), "0");
    EXPECT_EQ(rolled(3), "2");
    EXPECT_EQ(faults.reports, 0u);
}

TEST_F(ZlvMultiProcRollover, ReportsOtherFailuresAndGoesOn)
{
    openHandlerOn("0", "maxFiles", "3");
    write("app1.log", "");
    std::filesystem::create_directories("app2.log/full");
    FileFaults faults;
    rollOver();
    EXPECT_EQ(faults.reports, 2u);
    EXPECT_TRUE(failedWith(faults.reported, EISDIR));
    EXPECT_EQ(rolled(1), "0");
}

TEST_F(ZlvMultiProcRollover, OverwritesWithoutCuttingAFileThatCouldNotBeMoved)
{
    openHandlerOn("new", "maxFiles", "3");
    write("app1.log", "older");
    std::filesystem::create_directories("app2.log/full");
    rollOver();
    EXPECT_EQ(rolled(1), "newer");
}

TEST_F(ZlvMultiProcRollover, GivesTheCopyItsPermission)
{
    openHandlerOn("live", "filePermission", "640");
    openHandler();
    const mode_t before = umask(022);
    rollOver();
    umask(before);
    EXPECT_EQ(modeOf("app1.log"), 0640u);
}

TEST_F(ZlvMultiProcRollover, CopiesMoreThanOneChunk)
{
    std::string content;
    while (content.size() < 3 * 8192 + 5)
        content += std::to_string(content.size()) + "\n";
    openHandlerOn(content);
    rollOver();
    EXPECT_EQ(rolled(1), content);
    EXPECT_EQ(file("app.log"), "");
}

TEST_F(ZlvMultiProcRollover, CopiesExactlyOneChunk)
{
    openHandlerOn(std::string(8192, 'x'));
    rollOver();
    EXPECT_EQ(rolled(1), std::string(8192, 'x'));
}

TEST_F(ZlvMultiProcRollover, BringsTheCopyToTheDevice)
{
    openHandlerOn("live");
    FakeSystem system;
    std::string flushed;
    system.fsync = [&](int file) {
        flushed = std::filesystem::read_symlink("/proc/self/fd/" + std::to_string(file));
        return 0;
    };
    rollOver();
    EXPECT_EQ(flushed, std::filesystem::canonical("app1.log"));
}

TEST_F(ZlvMultiProcRollover, ReportsACopyThatDoesNotReachTheDevice)
{
    openHandlerOn("live");
    FakeSystem system;
    system.fsync = [](int) {
        errno = EIO;
        return -1;
    };
    FileFaults faults;
    rollOver();
    EXPECT_EQ(faults.reports, 1u);
    EXPECT_TRUE(failedWith(faults.reported, EIO));
    EXPECT_EQ(rolled(1), "live");
}

TEST_F(ZlvMultiProcRollover, ThatCannotOpenTheCopySaysSoAndLosesTheContent)
{
    openHandlerOn("live", "maxFiles", "2");
    std::filesystem::create_directories("app1.log/full");
    const std::string said = console([this] { rollOver(); });
    EXPECT_EQ(said, "ERR opening " + directory().string() + "/app1.log pre rollover\n");
    EXPECT_EQ(file("app.log"), "");
}

TEST_F(ZlvMultiProcRollover, ThatCannotReadTheLiveFileLosesTheContent)
{
    openHandlerOn("live");
    FileFaults faults;
    faults.failReads(0, EIO);
    rollOver();
    EXPECT_EQ(faults.reports, 1u);
    EXPECT_TRUE(failedWith(faults.reported, EIO));
    EXPECT_EQ(rolled(1), "");
    EXPECT_EQ(file("app.log"), "");
}

TEST_F(ZlvMultiProcRollover, ThatCannotReadTheRestKeepsWhatWasCopied)
{
    openHandlerOn(std::string(8192, 'x') + "rest");
    FileFaults faults;
    faults.failReads(8192, EIO);
    rollOver();
    EXPECT_EQ(rolled(1), std::string(8192, 'x'));
    EXPECT_EQ(file("app.log"), "");
}

TEST_F(ZlvMultiProcRollover, ThatCannotWriteTheCopyLosesTheContent)
{
    openHandlerOn(std::string(20000, 'x'), "maxFiles", "3");
    std::filesystem::create_directories("app2.log/full");
    std::filesystem::create_symlink("/dev/full", "app1.log");
    FileFaults faults;
    rollOver();
    EXPECT_GT(faults.reports, 0u);
    EXPECT_EQ(file("app.log"), "");
}

TEST_F(ZlvMultiProcRollover, ReportsALiveFileThatCannotBeEmptied)
{
    openHandlerOn("live");
    FakeSystem system;
    system.ftruncate = [](int, off_t) {
        errno = EPERM;
        return -1;
    };
    FileFaults faults;
    rollOver();
    EXPECT_EQ(faults.reports, 1u);
    EXPECT_TRUE(failedWith(faults.reported, EINVAL));
    EXPECT_EQ(rolled(1), "live");
    EXPECT_EQ(file("app.log"), "live");
}

TEST_F(ZlvMultiProcRollover, OfAFileThatCannotSeekCopiesNothing)
{
    mkfifo("app.log", 0600);
    handler("fileName", "app.log");
    openHandler();
    FileFaults faults;
    rollOver();
    EXPECT_EQ(faults.reports, 3u);
    EXPECT_TRUE(failedWith(faults.reported, ESPIPE));
    EXPECT_EQ(rolled(1), std::nullopt);
}

TEST_F(ZlvMultiProcRollover, ComesBeforeTheRecordThatFindsTheFileFull)
{
    handler("fileName", "app.log", "maxFileSize", "10", "maxFiles", "2");
    log(u"1234");
    log(u"1234");
    EXPECT_EQ(file("app.log"), "1234\n1234\n");
    log(u"b");
    EXPECT_EQ(rolled(1), "1234\n1234\n");
    EXPECT_EQ(file("app.log"), "b\n");
    log(u"123456789");
    log(u"c");
    EXPECT_EQ(rolled(1), "b\n123456789\n");
    EXPECT_EQ(rolled(2), std::nullopt);
}

TEST_F(ZlvMultiProcRollover, CountsWhatOthersAppended)
{
    handler("fileName", "app.log", "maxFileSize", "10");
    log(u"a");
    std::ofstream("app.log", std::ios::app) << "from another\n";
    log(u"b");
    EXPECT_EQ(rolled(1), "a\nfrom another\n");
    EXPECT_EQ(file("app.log"), "b\n");
}

TEST_F(ZlvMultiProcRollover, KeepsOtherProcessesWritingAtTheNewEnd)
{
    handler("fileName", "app.log", "maxFileSize", "4");
    std::ofstream other("app.log", std::ios::app);
    other << "other" << std::flush;
    log(u"a");
    other << "other\n" << std::flush;
    EXPECT_EQ(rolled(1), "other");
    EXPECT_EQ(file("app.log"), "a\nother\n");
}

TEST_F(ZlvMultiProcRollover, WithTheLimitZeroComesWithEachRecord)
{
    handler("fileName", "app.log", "maxFileSize", "0", "maxFiles", "3");
    log(u"a");
    EXPECT_EQ(rolled(1), "");
    log(u"b");
    EXPECT_EQ(rolled(1), "a\n");
    EXPECT_EQ(rolled(2), "");
    EXPECT_EQ(file("app.log"), "b\n");
}

TEST_F(ZlvMultiProcRollover, WithANegativeLimitOrOneFileNeverComes)
{
    write("app.log", std::string(5000, 'x'));
    handler("fileName", "app.log", "maxFileSize", "-1");
    log(u"a");
    set("maxFileSize", "10", "maxFiles", "1");
    log(u"b");
    rollOver();
    EXPECT_EQ(file("app.log"), std::string(5000, 'x') + "a\nb\n");
    EXPECT_EQ(rolled(1), std::nullopt);
}

TEST_F(ZlvMultiProcRollover, KeepsTheNumbersApartFromTheDigitsOfTheName)
{
    handler("fileName", "trace7.log", "maxFileSize", "1");
    log(u"a");
    log(u"b");
    EXPECT_EQ(file("trace7_.log"), "b\n");
    EXPECT_EQ(file("trace7_1.log"), "a\n");
}

TEST_F(ZlvMultiProcRollover, OfNoHandlerDoesNothing)
{
    ZlvObject *recorder = object("recorder", Recorder::className);
    zelvo::ApiLock lock;
    for (ZlvObject *none : {static_cast<ZlvObject *>(nullptr), recorder}) {
        zlvMultiProcFileHandlerDoRollover(none);
        zlvMultiProcFileHandlerRollActiveLog(none);
    }
    EXPECT_TRUE(std::filesystem::is_empty("."));
}

TEST_F(ZlvMultiProcRollover, OfTwoProcessesLosesNoRecord)
{
    handler("fileName", "app.log", "maxFileSize", "2000", "maxFiles", "50");
    const auto hundreds = [this](char16_t name) {
        int failures = 0;
        for (int record = 0; record < 300; ++record)
            failures += ok(logged(std::u16string(99, name).c_str())) ? 0 : 1;
        return failures;
    };
    Child first([&] { return hundreds(u'a'); });
    Child second([&] { return hundreds(u'b'); });
    EXPECT_EQ(first.result(), 0);
    EXPECT_EQ(second.result(), 0);

    std::map<std::string, int> lines;
    for (const auto &entry : std::filesystem::directory_iterator("."))
        for (auto [content, line] = std::pair(std::ifstream(entry.path()), std::string());
             std::getline(content, line);)
            ++lines[line];
    const std::map<std::string, int> whole{{std::string(99, 'a'), 300},
                                           {std::string(99, 'b'), 300}};
    EXPECT_EQ(lines, whole);
    EXPECT_EQ(std::filesystem::file_size("app29.log"), 2000u);
}

} // namespace
} // namespace zelvo_test
