// SPDX-License-Identifier: Apache-2.0
// Position and size of an open file: seek, truncate, get size.
#include <gtest/gtest.h>

#include <cerrno>
#include <fcntl.h>
#include <unistd.h>

#include "CxFile.h"
#include "support/StatusIs.h"
#include "support/TestDir.h"

namespace zelvo_test {
namespace {

/// Each test has an open file of ten bytes, "0123456789", at position 5.
class CxFileSizeTest : public TestDir {
protected:
    CxFileSizeTest()
    {
        write("file", "0123456789");
        CxFileOpen(&file, "file", O_RDWR);
        lseek(file, 5, SEEK_SET);
    }

    ~CxFileSizeTest() override { CxFileClose(&file); }

    off_t position() const { return lseek(file, 0, SEEK_CUR); }

    CxFile file = -1;
    CxFile closed = -1;
};

constexpr int64_t twoTo32 = int64_t{1} << 32;

TEST_F(CxFileSizeTest, SeekToTheStartSucceeds)
{
    EXPECT_TRUE(succeeded(CxFileSeek(&file, 0, SEEK_SET)));
    EXPECT_EQ(position(), 0);
}

TEST_F(CxFileSizeTest, SeekToANonZeroPositionIsReportedAsFailureButMoves)
{
    EXPECT_EQ(CxFileSeek(&file, 100, SEEK_SET).type, 'p');
    EXPECT_EQ(position(), 100);
}

TEST_F(CxFileSizeTest, SeekToANonZeroPositionReportsTheErrorNumberThatStands)
{
    errno = ENOTTY;
    EXPECT_TRUE(failedWith(CxFileSeek(&file, 3, SEEK_SET), ENOTTY));
}

TEST_F(CxFileSizeTest, SeekCountsFromTheCurrentPosition)
{
    EXPECT_EQ(CxFileSeek(&file, 2, SEEK_CUR).type, 'p');
    EXPECT_EQ(position(), 7);
    EXPECT_TRUE(succeeded(CxFileSeek(&file, -7, SEEK_CUR)));
    EXPECT_EQ(position(), 0);
}

TEST_F(CxFileSizeTest, SeekCountsFromTheEnd)
{
    EXPECT_EQ(CxFileSeek(&file, -1, SEEK_END).type, 'p');
    EXPECT_EQ(position(), 9);
    EXPECT_TRUE(succeeded(CxFileSeek(&file, -10, SEEK_END)));
    EXPECT_EQ(position(), 0);
}

TEST_F(CxFileSizeTest, SeekUsesOnlyTheLow32BitsOfTheOffset)
{
    EXPECT_TRUE(succeeded(CxFileSeek(&file, twoTo32, SEEK_SET)));
    EXPECT_EQ(position(), 0);
    EXPECT_EQ(CxFileSeek(&file, twoTo32 + 3, SEEK_SET).type, 'p');
    EXPECT_EQ(position(), 3);
}

TEST_F(CxFileSizeTest, SeekTakesTheLow32BitsWithTheirSign)
{
    EXPECT_EQ(CxFileSeek(&file, twoTo32 - 1, SEEK_END).type, 'p');
    EXPECT_EQ(position(), 9);
}

TEST_F(CxFileSizeTest, SeekOfAClosedFileFails)
{
    EXPECT_TRUE(failedWith(CxFileSeek(&closed, 0, SEEK_SET), EBADF));
}

TEST_F(CxFileSizeTest, SeekBeforeTheStartFailsAndStays)
{
    EXPECT_TRUE(failedWith(CxFileSeek(&file, -1, SEEK_SET), EINVAL));
    EXPECT_EQ(position(), 5);
}

TEST_F(CxFileSizeTest, SeekRefusesNull)
{
    EXPECT_TRUE(failedWith(CxFileSeek(nullptr, 0, SEEK_SET), EINVAL));
}

TEST_F(CxFileSizeTest, TruncEmptiesTheFileAndGoesToItsStart)
{
    EXPECT_TRUE(succeeded(CxFileTrunc(&file)));
    EXPECT_EQ(read("file"), "");
    EXPECT_EQ(position(), 0);
}

TEST_F(CxFileSizeTest, TruncOfAnEmptyFileSucceeds)
{
    write("file", "");
    EXPECT_TRUE(succeeded(CxFileTrunc(&file)));
}

TEST_F(CxFileSizeTest, TruncThatLeavesContentIsAlwaysAnInvalidArgument)
{
    CxFile reader = -1;
    ASSERT_TRUE(succeeded(CxFileOpen(&reader, "file", O_RDONLY)));
    EXPECT_TRUE(failedWith(CxFileTrunc(&reader), EINVAL));
    EXPECT_EQ(read("file"), "0123456789");
    CxFileClose(&reader);
}

TEST_F(CxFileSizeTest, TruncOfAnEmptyFileThatCannotBeCutReportsTheCut)
{
    write("empty", "");
    CxFile reader = -1;
    ASSERT_TRUE(succeeded(CxFileOpen(&reader, "empty", O_RDONLY)));
    EXPECT_TRUE(failedWith(CxFileTrunc(&reader), EINVAL));
    CxFileClose(&reader);
}

TEST_F(CxFileSizeTest, TruncReportsAFailedSeekWhenTheSizeIsZero)
{
    int ends[2];
    ASSERT_EQ(pipe(ends), 0);
    CxFile end = ends[1];
    EXPECT_TRUE(failedWith(CxFileTrunc(&end), ESPIPE));
    close(ends[0]);
    close(ends[1]);
}

TEST_F(CxFileSizeTest, TruncOfAClosedFileReportsIt)
{
    EXPECT_TRUE(failedWith(CxFileTrunc(&closed), EBADF));
}

TEST_F(CxFileSizeTest, TruncRefusesNull)
{
    EXPECT_TRUE(failedWith(CxFileTrunc(nullptr), EINVAL));
}

TEST_F(CxFileSizeTest, GetSizeGivesTheSize)
{
    uint64_t size = 0;
    EXPECT_TRUE(succeeded(CxFileGetSize(&file, &size)));
    EXPECT_EQ(size, 10U);
    EXPECT_EQ(position(), 5);
}

TEST_F(CxFileSizeTest, GetSizeGivesAllOf64Bits)
{
    ASSERT_EQ(ftruncate(file, 5 * twoTo32), 0);
    uint64_t size = 0;
    EXPECT_TRUE(succeeded(CxFileGetSize(&file, &size)));
    EXPECT_EQ(size, static_cast<uint64_t>(5 * twoTo32));
}

TEST_F(CxFileSizeTest, GetSizeOfAClosedFileFails)
{
    uint64_t size = 0;
    EXPECT_TRUE(failedWith(CxFileGetSize(&closed, &size), EBADF));
}

TEST_F(CxFileSizeTest, GetSizeRefusesNullArguments)
{
    uint64_t size = 0;
    EXPECT_TRUE(failedWith(CxFileGetSize(nullptr, &size), EINVAL));
    EXPECT_TRUE(failedWith(CxFileGetSize(&file, nullptr), EINVAL));
}

} // namespace
} // namespace zelvo_test
