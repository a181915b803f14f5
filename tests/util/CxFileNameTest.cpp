// SPDX-License-Identifier: Apache-2.0
// Operations on files by name.
#include <gtest/gtest.h>

#include <cerrno>
#include <fcntl.h>
#include <sys/stat.h>

#include <cstring>
#include <filesystem>
#include <string>

#include "CxFile.h"
#include "support/LongPath.h"
#include "support/StatusIs.h"
#include "support/TestDir.h"

namespace zelvo_test {
namespace {

constexpr int64_t twoTo32 = int64_t{1} << 32;

class CxFileNameTest : public TestDir {
protected:
    CxFileNameTest()
    {
        std::filesystem::create_directory("dir");
        write("dir/file", "0123456789");
    }

    static bool exists(const std::string &name) { return std::filesystem::exists(name); }
};

TEST(CxFileNameLocalizeTest, TurnsEveryBackslashIntoASlash)
{
    char dst[32];
    EXPECT_EQ(CxFileNameLocalize("a\\b/c\\\\d", dst, sizeof dst), 1);
    EXPECT_STREQ(dst, "a/b/c//d");
}

TEST(CxFileNameLocalizeTest, FillsTheRestWithZeros)
{
    char dst[8] = "xxxxxxx";
    EXPECT_EQ(CxFileNameLocalize("a\\", dst, 6), 1);
    EXPECT_EQ(std::memcmp(dst, "a/\0\0\0\0x", 8), 0);
}

TEST(CxFileNameLocalizeTest, AddsNoTerminatorWhenTheNameFillsTheSize)
{
    char dst[8] = "xxxxxxx";
    EXPECT_EQ(CxFileNameLocalize("a\\bcdef", dst, 4), 1);
    EXPECT_STREQ(dst, "a/bcxxx");
}

TEST(CxFileNameLocalizeTest, LeavesBackslashesBehindTheSize)
{
    char dst[8] = "xxx\\\\\\\\";
    EXPECT_EQ(CxFileNameLocalize("\\\\\\\\\\", dst, 3), 1);
    EXPECT_STREQ(dst, "///\\\\\\\\");
}

TEST(CxFileNameLocalizeTest, RefusesNullArgumentsAndSizeZero)
{
    char dst[8] = "xxxxxxx";
    EXPECT_EQ(CxFileNameLocalize(nullptr, dst, 8), 0);
    EXPECT_EQ(CxFileNameLocalize("a", nullptr, 8), 0);
    EXPECT_EQ(CxFileNameLocalize("a", dst, 0), 0);
    EXPECT_STREQ(dst, "xxxxxxx");
}

TEST(CxFileNameGetNativeTest, TurnsEveryBackslashIntoASlash)
{
    char dst[32];
    EXPECT_EQ(CxFileNameGetNative("a\\b/c\\\\d", dst, sizeof dst), 1);
    EXPECT_STREQ(dst, "a/b/c//d");
}

TEST(CxFileNameGetNativeTest, FillsTheRestWithZeros)
{
    char dst[8] = "xxxxxxx";
    EXPECT_EQ(CxFileNameGetNative("a\\", dst, 6), 1);
    EXPECT_EQ(std::memcmp(dst, "a/\0\0\0\0x", 8), 0);
}

TEST(CxFileNameGetNativeTest, AddsNoTerminatorWhenTheNameFillsTheSize)
{
    char dst[8] = "xxxxxxx";
    EXPECT_EQ(CxFileNameGetNative("a\\bcdef", dst, 4), 1);
    EXPECT_STREQ(dst, "a/bcxxx");
}

TEST(CxFileNameGetNativeTest, SizeZeroIsNoFailureAndWritesNothing)
{
    char dst[4] = "\\xx";
    EXPECT_EQ(CxFileNameGetNative("a", dst, 0), 1);
    EXPECT_STREQ(dst, "\\xx");
}

TEST(CxFileNameGetNativeTest, RefusesNullArguments)
{
    char dst[8] = "xxxxxxx";
    EXPECT_EQ(CxFileNameGetNative(nullptr, dst, 8), 0);
    EXPECT_EQ(CxFileNameGetNative("a", nullptr, 8), 0);
    EXPECT_STREQ(dst, "xxxxxxx");
}

TEST_F(CxFileNameTest, RemoveRemovesAFileNamedWithABackslash)
{
    EXPECT_TRUE(succeeded(CxFileNameRemove("dir\\file")));
    EXPECT_FALSE(exists("dir/file"));
}

TEST_F(CxFileNameTest, RemoveRemovesAnEmptyDirectory)
{
    std::filesystem::create_directory("empty");
    EXPECT_TRUE(succeeded(CxFileNameRemove("empty")));
    EXPECT_FALSE(exists("empty"));
}

TEST_F(CxFileNameTest, RemoveReportsAnAbsentFile)
{
    EXPECT_TRUE(failedWith(CxFileNameRemove("absent"), ENOENT));
}

TEST_F(CxFileNameTest, RemoveReportsADirectoryWithContent)
{
    EXPECT_TRUE(failedWith(CxFileNameRemove("dir"), ENOTEMPTY));
}

TEST_F(CxFileNameTest, RemoveRefusesNull)
{
    EXPECT_TRUE(failedWith(CxFileNameRemove(nullptr), EINVAL));
}

TEST_F(CxFileNameTest, RemoveTakesANameOf255Bytes)
{
    std::string name = write(longPath(255), "x");
    EXPECT_TRUE(succeeded(CxFileNameRemove(name.c_str())));
    EXPECT_FALSE(exists(name));
}

TEST_F(CxFileNameTest, RemoveRefusesANameOf256BytesAndRemovesNothing)
{
    std::string name = write(longPath(256), "x");
    EXPECT_TRUE(failedWith(CxFileNameRemove(name.c_str()), ENAMETOOLONG));
    EXPECT_TRUE(exists(name));
}

TEST_F(CxFileNameTest, RenameMovesAFileNamedWithBackslashes)
{
    EXPECT_TRUE(succeeded(CxFileNameRename("dir\\file", "dir\\other")));
    EXPECT_FALSE(exists("dir/file"));
    EXPECT_EQ(read("dir/other"), "0123456789");
}

TEST_F(CxFileNameTest, RenameReplacesAnExistingTarget)
{
    write("target", "old");
    EXPECT_TRUE(succeeded(CxFileNameRename("dir/file", "target")));
    EXPECT_EQ(read("target"), "0123456789");
}

TEST_F(CxFileNameTest, RenameReportsAnAbsentFile)
{
    EXPECT_TRUE(failedWith(CxFileNameRename("absent", "target"), ENOENT));
}

TEST_F(CxFileNameTest, RenameReportsATargetBelowAFile)
{
    EXPECT_TRUE(failedWith(CxFileNameRename("dir/file", "dir/file/x"), ENOTDIR));
}

TEST_F(CxFileNameTest, RenameRefusesNullArguments)
{
    EXPECT_TRUE(failedWith(CxFileNameRename(nullptr, "target"), EINVAL));
    EXPECT_TRUE(failedWith(CxFileNameRename("dir/file", nullptr), EINVAL));
    EXPECT_TRUE(exists("dir/file"));
}

TEST_F(CxFileNameTest, RenameRefusesAnOldNameOf256Bytes)
{
    std::string name = write(longPath(256), "x");
    EXPECT_TRUE(failedWith(CxFileNameRename(name.c_str(), "target"), ENAMETOOLONG));
    EXPECT_TRUE(exists(name));
    EXPECT_FALSE(exists("target"));
}

TEST_F(CxFileNameTest, RenameRefusesANewNameOf256Bytes)
{
    EXPECT_TRUE(failedWith(CxFileNameRename("dir/file", longPath(256).c_str()), ENAMETOOLONG));
    EXPECT_TRUE(exists("dir/file"));
}

TEST_F(CxFileNameTest, RenameTakesNamesOf255Bytes)
{
    EXPECT_TRUE(succeeded(CxFileNameRename("dir/file", longPath(255).c_str())));
    EXPECT_TRUE(succeeded(CxFileNameRename(longPath(255).c_str(), "target")));
    EXPECT_TRUE(exists("target"));
}

TEST_F(CxFileNameTest, GetSizeGivesTheSize)
{
    uint64_t size = 0;
    EXPECT_TRUE(succeeded(CxFileNameGetSize("dir/file", &size)));
    EXPECT_EQ(size, 10U);
}

TEST_F(CxFileNameTest, GetSizeGivesAllOf64Bits)
{
    std::filesystem::resize_file("dir/file", 5 * static_cast<uint64_t>(twoTo32));
    uint64_t size = 0;
    EXPECT_TRUE(succeeded(CxFileNameGetSize("dir/file", &size)));
    EXPECT_EQ(size, 5 * static_cast<uint64_t>(twoTo32));
}

TEST_F(CxFileNameTest, GetSizeTakesTheNameUnchanged)
{
    write("back\\slash", "abc");
    uint64_t size = 0;
    EXPECT_TRUE(succeeded(CxFileNameGetSize("back\\slash", &size)));
    EXPECT_EQ(size, 3U);
    EXPECT_TRUE(failedWith(CxFileNameGetSize("dir\\file", &size), ENOENT));
}

TEST_F(CxFileNameTest, GetSizeTakesANameOf256Bytes)
{
    std::string name = write(longPath(256), "abcd");
    uint64_t size = 0;
    EXPECT_TRUE(succeeded(CxFileNameGetSize(name.c_str(), &size)));
    EXPECT_EQ(size, 4U);
}

TEST_F(CxFileNameTest, GetSizeReportsItsErrorNumber)
{
    uint64_t size = 0;
    EXPECT_TRUE(failedWith(CxFileNameGetSize("absent", &size), ENOENT));
    EXPECT_TRUE(failedWith(CxFileNameGetSize("dir/file/x", &size), ENOTDIR));
}

TEST_F(CxFileNameTest, GetSizeRefusesNullArguments)
{
    uint64_t size = 0;
    EXPECT_TRUE(failedWith(CxFileNameGetSize(nullptr, &size), EINVAL));
    EXPECT_TRUE(failedWith(CxFileNameGetSize("dir/file", nullptr), EINVAL));
}

TEST_F(CxFileNameTest, GetInfoGivesSizeAndTimesInSeconds)
{
    timespec times[2] = {{1104580800, 999999999}, {1000000000, 999999999}};
    ASSERT_EQ(utimensat(AT_FDCWD, "dir/file", times, 0), 0);
    struct stat facts = {};
    ASSERT_EQ(stat("dir/file", &facts), 0);
    CxFileInfo info = {};
    EXPECT_TRUE(succeeded(CxFileNameGetInfo(&info, "dir/file")));
    EXPECT_EQ(info.size, 10);
    EXPECT_EQ(info.accessTime, 1104580800);
    EXPECT_EQ(info.modifyTime, 1000000000);
    EXPECT_EQ(info.changeTime, facts.st_ctim.tv_sec);
}

TEST_F(CxFileNameTest, GetInfoKeepsTheSignOfATime)
{
    timespec times[2] = {{-5, 0}, {-7, 0}};
    ASSERT_EQ(utimensat(AT_FDCWD, "dir/file", times, 0), 0);
    CxFileInfo info = {};
    EXPECT_TRUE(succeeded(CxFileNameGetInfo(&info, "dir/file")));
    EXPECT_EQ(info.accessTime, -5);
    EXPECT_EQ(info.modifyTime, -7);
}

TEST_F(CxFileNameTest, GetInfoTakesTheNameUnchanged)
{
    CxFileInfo info = {};
    EXPECT_TRUE(failedWith(CxFileNameGetInfo(&info, "dir\\file"), ENOENT));
    write("back\\slash", "abc");
    EXPECT_TRUE(succeeded(CxFileNameGetInfo(&info, "back\\slash")));
    EXPECT_EQ(info.size, 3);
}

TEST_F(CxFileNameTest, GetInfoReportsItsErrorNumber)
{
    CxFileInfo info = {};
    EXPECT_TRUE(failedWith(CxFileNameGetInfo(&info, "absent"), ENOENT));
    EXPECT_TRUE(failedWith(CxFileNameGetInfo(&info, "dir/file/x"), ENOTDIR));
}

TEST_F(CxFileNameTest, GetInfoRefusesNullArgumentsAndTheEmptyName)
{
    CxFileInfo info = {};
    EXPECT_TRUE(failedWith(CxFileNameGetInfo(nullptr, "dir/file"), EINVAL));
    EXPECT_TRUE(failedWith(CxFileNameGetInfo(&info, nullptr), EINVAL));
    EXPECT_TRUE(failedWith(CxFileNameGetInfo(&info, ""), EINVAL));
}

} // namespace
} // namespace zelvo_test
