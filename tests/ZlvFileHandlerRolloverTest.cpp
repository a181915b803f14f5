// SPDX-License-Identifier: Apache-2.0
// When and how the file handler rolls its file over.
#include "support/FileHandlerFixture.h"
#include "support/Rows.h"

namespace zelvo_test {
namespace {

class ZlvFileHandlerRollover : public FileHandlerFixture {
protected:
    void rollOver()
    {
        zelvo::ApiLock lock;
        zlvFileHandlerDoRollover(handler_);
    }

    /// Writes the live file and the older ones up to LAST, each with its number as content.
    static void writeFiles(int last)
    {
        write("app.log", "0");
        for (int number = 1; number <= last; ++number)
            write("app" + std::to_string(number) + ".log", std::to_string(number));
    }
};

TEST_F(ZlvFileHandlerRollover, MovesEachFileOnAndDropsTheOldest)
{
    writeFiles(3);
    handler("fileName", "app.log", "maxFiles", "4");
    FileFaults faults;
    rollOver();
    EXPECT_EQ(file("app.log"), std::nullopt);
    EXPECT_EQ(rolled(1), "0");
    EXPECT_EQ(rolled(2), "1");
    EXPECT_EQ(rolled(3), "2");
    EXPECT_EQ(rolled(4), std::nullopt);
    EXPECT_EQ(faults.reports, 0u);
}

TEST_F(ZlvFileHandlerRollover, LeavesOlderFilesThanThoseKeptAlone)
{
    writeFiles(3);
    handler("fileName", "app.log", "maxFiles", "2");
    rollOver();
    EXPECT_EQ(rolled(1), "0");
    EXPECT_EQ(rolled(2), "2");
    EXPECT_EQ(rolled(3), "3");
}

TEST_F(ZlvFileHandlerRollover, PassesOverFilesThatAreNotThereInSilence)
{
    write("app.log", "0");
    write("app2.log", "2");
    handler("fileName", "app.log", "maxFiles", "5");
    FileFaults faults;
    rollOver();
    EXPECT_EQ(rolled(1), "0");
    EXPECT_EQ(rolled(2), std::nullopt);
    EXPECT_EQ(rolled(3), "2");
    EXPECT_EQ(faults.reports, 0u);
}

TEST_F(ZlvFileHandlerRollover, ReportsOtherFailuresAndGoesOn)
{
    writeFiles(1);
    std::filesystem::create_directories("app2.log/full");
    handler("fileName", "app.log", "maxFiles", "3");
    FileFaults faults;
    rollOver();
    EXPECT_EQ(faults.reports, 2u);
    EXPECT_TRUE(failedWith(faults.reported, EISDIR));
    EXPECT_EQ(rolled(1), "0");
    EXPECT_TRUE(std::filesystem::is_directory("app2.log/full"));
}

TEST_F(ZlvFileHandlerRollover, OfNoHandlerDoesNothing)
{
    zlvFileHandlerDoRollover(nullptr);
    handler_ = object("recorder", Recorder::className);
    rollOver();
}

class ZlvFileHandlerRolloverCounts : public ZlvFileHandlerRollover,
                                     public testing::WithParamInterface<const char *> {};

TEST_P(ZlvFileHandlerRolloverCounts, LessThanTwoFilesNeverRollOver)
{
    write("app.log", std::string(2000, 'x'));
    write("app1.log", "1");
    handler("fileName", "app.log", "maxFileSize", "10", "maxFiles", GetParam());
    log(u"a");
    log(u"b");
    rollOver();
    EXPECT_EQ(file("app.log"), std::string(2000, 'x') + "a\nb\n");
    EXPECT_EQ(rolled(1), "1");
}

INSTANTIATE_TEST_SUITE_P(Rows, ZlvFileHandlerRolloverCounts, testing::Values("1", "0", "-3"));

TEST_F(ZlvFileHandlerRollover, ComesBeforeTheRecordThatFindsTheFileFull)
{
    const std::string before(1023, 'x');
    write("app.log", before);
    write("app1.log", "1");
    write("app2.log", "2");
    framedHandler("fileName", "app.log", "maxFileSize", "1024", "maxFiles", "3");
    log(u"a");
    EXPECT_EQ(file("app.log"), before + "[\na\n");
    log(u"b");
    EXPECT_EQ(file("app.log"), "[\nb\n");
    EXPECT_EQ(rolled(1), before + "[\na\n]\n");
    EXPECT_EQ(rolled(2), "1");
    EXPECT_EQ(rolled(3), std::nullopt);
}

TEST_F(ZlvFileHandlerRollover, LetsTheFilePassItsLimitByNoMoreThanARecord)
{
    handler("fileName", "app.log", "maxFileSize", "10", "maxFiles", "3");
    for (int record = 0; record < 4; ++record)
        log(u"1234");
    EXPECT_EQ(rolled(1), "1234\n1234\n");
    EXPECT_EQ(file("app.log"), "1234\n1234\n");
    log(u"12345678901234567890");
    EXPECT_EQ(file("app.log"), "12345678901234567890\n");
}

TEST_F(ZlvFileHandlerRollover, IsDueAtTheLimitAndNotOneByteBelow)
{
    handler("fileName", "app.log", "maxFileSize", "6");
    log(u"1234");
    log(u"a");
    EXPECT_EQ(file("app.log"), "1234\na\n");
    log(u"b");
    EXPECT_EQ(rolled(1), "1234\na\n");
    EXPECT_EQ(file("app.log"), "b\n");
}

TEST_F(ZlvFileHandlerRollover, CountsWhatOthersAppended)
{
    handler("fileName", "app.log", "maxFileSize", "10");
    log(u"a");
    std::ofstream("app.log", std::ios::app) << "from another\n";
    log(u"b");
    EXPECT_EQ(rolled(1), "a\nfrom another\n");
    EXPECT_EQ(file("app.log"), "b\n");
}

TEST_F(ZlvFileHandlerRollover, SeesAFileThatWasEmptiedOutside)
{
    handler("fileName", "app.log", "maxFileSize", "4");
    log(u"12345");
    std::filesystem::resize_file("app.log", 0);
    log(u"b");
    EXPECT_EQ(rolled(1), std::nullopt);
    EXPECT_EQ(file("app.log"), "b\n");
}

TEST_F(ZlvFileHandlerRollover, ComesAtOpenWhenTheFileIsFullAlready)
{
    write("app.log", "0123456789");
    framedHandler("fileName", "app.log", "maxFileSize", "10");
    EXPECT_TRUE(succeeded(openHandler()));
    EXPECT_EQ(rolled(1), "0123456789]\n");
    EXPECT_EQ(file("app.log"), "[\n");
    EXPECT_EQ(vars()->currentSize, 2u);
}

TEST_F(ZlvFileHandlerRollover, KeepsTheNumbersApartFromTheDigitsOfTheName)
{
    handler("fileName", "trace7.log", "maxFileSize", "1", "maxFiles", "3");
    log(u"a");
    log(u"b");
    log(u"c");
    EXPECT_EQ(file("trace7_.log"), "c\n");
    EXPECT_EQ(file("trace7_1.log"), "b\n");
    EXPECT_EQ(file("trace7_2.log"), "a\n");
}

TEST_F(ZlvFileHandlerRollover, WithTheLimitZeroComesTwiceForEachRecord)
{
    framedHandler("fileName", "app.log", "maxFileSize", "0", "maxFiles", "6");
    log(u"a");
    EXPECT_EQ(file("app.log"), "[\na\n");
    EXPECT_EQ(rolled(1), "]\n");
    log(u"b");
    EXPECT_EQ(file("app.log"), "[\nb\n");
    EXPECT_EQ(rolled(1), "]\n");
    EXPECT_EQ(rolled(2), "[\na\n]\n");
    EXPECT_EQ(rolled(3), "]\n");
    EXPECT_EQ(rolled(4), std::nullopt);
}

TEST_F(ZlvFileHandlerRollover, WithANegativeLimitNeverComes)
{
    write("app.log", std::string(5000, 'x'));
    handler("fileName", "app.log", "maxFileSize", "-1");
    log(u"a");
    log(u"b");
    EXPECT_EQ(rolled(1), std::nullopt);
}

TEST_F(ZlvFileHandlerRollover, WithTheLargestLimitComesAtItsLastByte)
{
    write("app.log", "");
    std::filesystem::resize_file("app.log", INT32_MAX - 1);
    handler("fileName", "app.log", "maxFileSize", "2147483647");
    log(u"a");
    EXPECT_EQ(rolled(1), std::nullopt);
    log(u"b");
    EXPECT_EQ(std::filesystem::file_size("app1.log"), INT32_MAX + uintmax_t{1});
    EXPECT_EQ(file("app.log"), "b\n");
}

TEST_F(ZlvFileHandlerRollover, BeyondFourGigabytesIsDueToo)
{
    write("app.log", "");
    std::filesystem::resize_file("app.log", (uintmax_t{1} << 32) + 5);
    handler("fileName", "app.log", "maxFileSize", "1024");
    log(u"a");
    EXPECT_EQ(file("app.log"), "a\n");
    EXPECT_EQ(std::filesystem::file_size("app1.log"), (uintmax_t{1} << 32) + 5);
}

TEST_F(ZlvFileHandlerRollover, HandlesANewLimitWithTheNextRecord)
{
    handler("fileName", "app.log");
    log(u"12345");
    set("maxFileBytes", "3");
    log(u"b");
    EXPECT_EQ(rolled(1), "12345\n");
    EXPECT_EQ(file("app.log"), "b\n");
}

TEST_F(ZlvFileHandlerRollover, ThatCannotMoveTheLiveFileKeepsAppendingToIt)
{
    std::filesystem::create_directories("app1.log/full");
    handler("fileName", "app.log", "maxFileSize", "2", "maxFiles", "2");
    log(u"a");
    log(u"b");
    EXPECT_EQ(file("app.log"), "a\nb\n");
    std::filesystem::remove_all("app1.log");
    log(u"c");
    EXPECT_EQ(rolled(1), "a\nb\n");
    EXPECT_EQ(file("app.log"), "c\n");
}

} // namespace
} // namespace zelvo_test
