// SPDX-License-Identifier: Apache-2.0
#include <gtest/gtest.h>

#include <cerrno>
#include <csignal>
#include <fcntl.h>
#include <sys/resource.h>
#include <sys/stat.h>
#include <unistd.h>

#include <string>

#include "CxFile.h"
#include "support/FakeSystem.h"
#include "support/LongPath.h"
#include "support/StatusIs.h"
#include "support/TestDir.h"

namespace zelvo_test {
namespace {

constexpr size_t allOnes = static_cast<size_t>(-1);

/// Each test has an open file of ten bytes, "0123456789", at position 0.
class CxFileTest : public TestDir {
protected:
    CxFileTest()
    {
        write("file", "0123456789");
        CxFileOpen(&file, "file", O_RDWR);
    }

    ~CxFileTest() override
    {
        if (file >= 0)
            CxFileClose(&file);
    }

    off_t position() const { return lseek(file, 0, SEEK_CUR); }

    static mode_t permissions(const char *name)
    {
        struct stat facts = {};
        stat(name, &facts);
        return facts.st_mode & 07777;
    }

    CxFile file = -1;
    CxFile closed = -1;
};

class CxFileOpenTest : public CxFileTest {
protected:
    CxFileOpenTest() { umask(0); }
    ~CxFileOpenTest() override { umask(022); }
};

TEST_F(CxFileOpenTest, OpensAnExistingFile)
{
    CxFile other = -1;
    EXPECT_TRUE(succeeded(CxFileOpen(&other, "file", O_RDONLY)));
    EXPECT_GE(other, 0);
    EXPECT_TRUE(succeeded(CxFileClose(&other)));
}

TEST_F(CxFileOpenTest, TurnsBackslashesIntoSeparators)
{
    std::filesystem::create_directory("dir");
    CxFile other = -1;
    EXPECT_TRUE(succeeded(CxFileOpen(&other, "dir\\file.log", O_WRONLY | O_CREAT)));
    EXPECT_TRUE(std::filesystem::exists("dir/file.log"));
    EXPECT_TRUE(succeeded(CxFileClose(&other)));
}

TEST_F(CxFileOpenTest, CreatesFilesForTheOwnerAlone)
{
    CxFile other = -1;
    EXPECT_TRUE(succeeded(CxFileOpen(&other, "new", O_WRONLY | O_CREAT)));
    EXPECT_EQ(permissions("new"), 0600U);
    CxFileClose(&other);
}

TEST_F(CxFileOpenTest, ModeCreatesFilesWithTheCallersPermissions)
{
    CxFile other = -1;
    EXPECT_TRUE(succeeded(CxFileOpenMode(&other, "new", O_WRONLY | O_CREAT, 0640)));
    EXPECT_EQ(permissions("new"), 0640U);
    CxFileClose(&other);
}

TEST_F(CxFileOpenTest, ModeTurnsBackslashesIntoSeparators)
{
    std::filesystem::create_directory("dir");
    CxFile other = -1;
    EXPECT_TRUE(succeeded(CxFileOpenMode(&other, "dir\\new", O_WRONLY | O_CREAT, 0600)));
    EXPECT_TRUE(std::filesystem::exists("dir/new"));
    CxFileClose(&other);
}

TEST_F(CxFileOpenTest, HonoursTheOpenFlags)
{
    CxFile other = -1;
    EXPECT_TRUE(failedWith(CxFileOpen(&other, "file", O_WRONLY | O_CREAT | O_EXCL), EEXIST));
    EXPECT_EQ(read("file"), "0123456789");
}

TEST_F(CxFileOpenTest, OpensCloseOnExec)
{
    EXPECT_NE(fcntl(file, F_GETFD) & FD_CLOEXEC, 0);
}

TEST_F(CxFileOpenTest, FailureLeavesMinusOneInTheSlot)
{
    CxFile other = 77;
    EXPECT_TRUE(failedWith(CxFileOpen(&other, "absent", O_RDONLY), ENOENT));
    EXPECT_EQ(other, -1);
}

TEST_F(CxFileOpenTest, ModeFailureLeavesMinusOneInTheSlot)
{
    CxFile other = 77;
    EXPECT_TRUE(failedWith(CxFileOpenMode(&other, "file/below", O_RDONLY, 0600), ENOTDIR));
    EXPECT_EQ(other, -1);
}

TEST_F(CxFileOpenTest, RefusesNullArguments)
{
    CxFile other = -1;
    EXPECT_TRUE(failedWith(CxFileOpen(nullptr, "file", O_RDONLY), EINVAL));
    EXPECT_TRUE(failedWith(CxFileOpen(&other, nullptr, O_RDONLY), EINVAL));
    EXPECT_EQ(other, -1);
}

TEST_F(CxFileOpenTest, ModeRefusesNullArguments)
{
    CxFile other = -1;
    EXPECT_TRUE(failedWith(CxFileOpenMode(nullptr, "file", O_RDONLY, 0600), EINVAL));
    EXPECT_TRUE(failedWith(CxFileOpenMode(&other, nullptr, O_RDONLY, 0600), EINVAL));
    EXPECT_EQ(other, -1);
}

TEST_F(CxFileOpenTest, TakesALongPathThatFits)
{
    std::string name = longPath(255);
    CxFile other = -1;
    EXPECT_TRUE(succeeded(CxFileOpen(&other, name.c_str(), O_WRONLY | O_CREAT)));
    EXPECT_TRUE(std::filesystem::exists(name));
    CxFileClose(&other);
}

TEST_F(CxFileOpenTest, RefusesANameOf256BytesAndCreatesNothing)
{
    std::string name = longPath(256);
    CxFile other = 77;
    EXPECT_TRUE(failedWith(CxFileOpen(&other, name.c_str(), O_WRONLY | O_CREAT), ENAMETOOLONG));
    EXPECT_EQ(other, -1);
    EXPECT_FALSE(std::filesystem::exists(name));
}

TEST_F(CxFileOpenTest, ModeRefusesANameOf256BytesAndCreatesNothing)
{
    std::string name = longPath(256);
    CxFile other = 77;
    EXPECT_TRUE(
        failedWith(CxFileOpenMode(&other, name.c_str(), O_WRONLY | O_CREAT, 0600), ENAMETOOLONG));
    EXPECT_EQ(other, -1);
    EXPECT_FALSE(std::filesystem::exists(name));
}

TEST_F(CxFileTest, ReadFillsTheBufferAndCounts)
{
    char buffer[8] = "xxxxxxx";
    size_t count = 0;
    EXPECT_TRUE(succeeded(CxFileRead(&file, buffer, 4, &count)));
    EXPECT_EQ(count, 4U);
    EXPECT_STREQ(buffer, "0123xxx");
}

TEST_F(CxFileTest, AShortReadIsNoFailure)
{
    char buffer[32];
    size_t count = 0;
    EXPECT_TRUE(succeeded(CxFileRead(&file, buffer, sizeof buffer, &count)));
    EXPECT_EQ(count, 10U);
}

TEST_F(CxFileTest, AShortReadIsNotRetried)
{
    int ends[2];
    ASSERT_EQ(pipe(ends), 0);
    ASSERT_EQ(::write(ends[1], "abc", 3), 3);
    CxFile reader = ends[0];
    char buffer[8];
    size_t count = 0;
    // The writing end stays open: a second read would block for ever.
    EXPECT_TRUE(succeeded(CxFileRead(&reader, buffer, sizeof buffer, &count)));
    EXPECT_EQ(count, 3U);
    close(ends[0]);
    close(ends[1]);
}

TEST_F(CxFileTest, ReadAtTheEndCountsZero)
{
    char buffer[16];
    size_t count = 0;
    CxFileRead(&file, buffer, sizeof buffer, &count);
    EXPECT_TRUE(succeeded(CxFileRead(&file, buffer, sizeof buffer, &count)));
    EXPECT_EQ(count, 0U);
}

TEST_F(CxFileTest, AFailedReadCountsAllOnes)
{
    char buffer[4];
    size_t count = 0;
    EXPECT_TRUE(failedWith(CxFileRead(&closed, buffer, sizeof buffer, &count), EBADF));
    EXPECT_EQ(count, allOnes);
}

TEST_F(CxFileTest, ReadOfADirectoryFailsWithItsErrorNumber)
{
    CxFile directory = -1;
    ASSERT_TRUE(succeeded(CxFileOpen(&directory, ".", O_RDONLY)));
    char buffer[4];
    size_t count = 0;
    EXPECT_TRUE(failedWith(CxFileRead(&directory, buffer, sizeof buffer, &count), EISDIR));
    EXPECT_EQ(count, allOnes);
    CxFileClose(&directory);
}

TEST_F(CxFileTest, ReadRefusesNullArguments)
{
    char buffer[4];
    size_t count = 0;
    EXPECT_TRUE(failedWith(CxFileRead(nullptr, buffer, 4, &count), EINVAL));
    EXPECT_TRUE(failedWith(CxFileRead(&file, nullptr, 4, &count), EINVAL));
    EXPECT_TRUE(failedWith(CxFileRead(&file, buffer, 4, nullptr), EINVAL));
    EXPECT_EQ(position(), 0);
}

TEST_F(CxFileTest, WriteWritesTheBytesAndCounts)
{
    size_t count = 0;
    EXPECT_TRUE(succeeded(CxFileWrite(&file, "abcdef", 3, &count)));
    EXPECT_EQ(count, 3U);
    EXPECT_EQ(read("file"), "abc3456789");
}

TEST_F(CxFileTest, WriteOfZeroBytesInTheMiddleKeepsThem)
{
    size_t count = 0;
    EXPECT_TRUE(succeeded(CxFileWrite(&file, "a\0b", 3, &count)));
    EXPECT_EQ(read("file").substr(0, 3), std::string("a\0b", 3));
}

TEST_F(CxFileTest, AFailedWriteCountsAllOnes)
{
    CxFile reader = -1;
    ASSERT_TRUE(succeeded(CxFileOpen(&reader, "file", O_RDONLY)));
    size_t count = 0;
    EXPECT_TRUE(failedWith(CxFileWrite(&reader, "a", 1, &count), EBADF));
    EXPECT_EQ(count, allOnes);
    CxFileClose(&reader);
}

TEST_F(CxFileTest, AFullDeviceIsReported)
{
    CxFile full = -1;
    ASSERT_TRUE(succeeded(CxFileOpen(&full, "/dev/full", O_WRONLY)));
    size_t count = 0;
    EXPECT_TRUE(failedWith(CxFileWrite(&full, "a", 1, &count), ENOSPC));
    EXPECT_EQ(count, allOnes);
    CxFileClose(&full);
}

TEST_F(CxFileTest, APartialWriteIsReportedOnlyThroughTheCount)
{
    rlimit before = {};
    getrlimit(RLIMIT_FSIZE, &before);
    rlimit limit = before;
    limit.rlim_cur = 4;
    setrlimit(RLIMIT_FSIZE, &limit);
    size_t count = 0;
    CxStatus status = CxFileWrite(&file, "abcdefgh", 8, &count);
    setrlimit(RLIMIT_FSIZE, &before);
    EXPECT_TRUE(succeeded(status));
    EXPECT_EQ(count, 4U);
}

TEST_F(CxFileTest, WriteRefusesNullArguments)
{
    size_t count = 0;
    EXPECT_TRUE(failedWith(CxFileWrite(nullptr, "a", 1, &count), EINVAL));
    EXPECT_TRUE(failedWith(CxFileWrite(&file, nullptr, 1, &count), EINVAL));
    EXPECT_TRUE(failedWith(CxFileWrite(&file, "a", 1, nullptr), EINVAL));
    EXPECT_EQ(read("file"), "0123456789");
}

TEST_F(CxFileTest, FlushSucceedsOnAFile)
{
    EXPECT_TRUE(succeeded(CxFileFlush(&file)));
}

TEST_F(CxFileTest, FlushSendsTheFileToTheDevice)
{
    int flushed = -1;
    FakeSystem system;
    system.fsync = [&](int descriptor) { return flushed = descriptor, 0; };
    EXPECT_TRUE(succeeded(CxFileFlush(&file)));
    EXPECT_EQ(flushed, file);
}

TEST_F(CxFileTest, FlushReportsItsErrorNumber)
{
    EXPECT_TRUE(failedWith(CxFileFlush(&closed), EBADF));
}

TEST_F(CxFileTest, FlushRefusesNull)
{
    EXPECT_TRUE(failedWith(CxFileFlush(nullptr), EINVAL));
}

TEST_F(CxFileTest, CloseClosesAndForgetsTheDescriptor)
{
    int descriptor = file;
    EXPECT_TRUE(succeeded(CxFileClose(&file)));
    EXPECT_EQ(file, -1);
    EXPECT_EQ(fcntl(descriptor, F_GETFD), -1);
}

TEST_F(CxFileTest, CloseOfADescriptorThatIsNotOpenFailsAndStillForgetsIt)
{
    CxFile other = 1000000;
    EXPECT_TRUE(failedWith(CxFileClose(&other), EBADF));
    EXPECT_EQ(other, -1);
}

TEST_F(CxFileTest, CloseRefusesNull)
{
    EXPECT_TRUE(failedWith(CxFileClose(nullptr), EINVAL));
}

} // namespace
} // namespace zelvo_test
