// SPDX-License-Identifier: Apache-2.0
#include <gtest/gtest.h>

#include <cerrno>
#include <sys/stat.h>
#include <unistd.h>

#include <cstring>
#include <filesystem>
#include <string>

#include "CxFilePath.h"
#include "support/LongPath.h"
#include "support/TestDir.h"

namespace zelvo_test {
namespace {

CxFilePath pathOf(const std::string &text)
{
    CxFilePath path;
    CxInitFilePath(&path, text.c_str());
    return path;
}

TEST(CxInitFilePathTest, KeepsTheTextWithSlashesOnly)
{
    CxFilePath path;
    EXPECT_EQ(CxInitFilePath(&path, "a\\b/c"), 1);
    EXPECT_STREQ(path.path, "a/b/c");
    EXPECT_EQ(path.pathLength, 5);
    EXPECT_EQ(path.lastSeparator, 3);
}

TEST(CxInitFilePathTest, ATextWithoutASeparatorHasNone)
{
    CxFilePath path;
    EXPECT_EQ(CxInitFilePath(&path, "name"), 1);
    EXPECT_EQ(path.pathLength, 4);
    EXPECT_EQ(path.lastSeparator, -1);
}

TEST(CxInitFilePathTest, TheEmptyTextIsAPathOfLengthZero)
{
    CxFilePath path;
    EXPECT_EQ(CxInitFilePath(&path, ""), 1);
    EXPECT_STREQ(path.path, "");
    EXPECT_EQ(path.pathLength, 0);
    EXPECT_EQ(path.lastSeparator, -1);
}

TEST(CxInitFilePathTest, ATrailingBackslashIsTheLastSeparator)
{
    CxFilePath path;
    EXPECT_EQ(CxInitFilePath(&path, "a\\"), 1);
    EXPECT_STREQ(path.path, "a/");
    EXPECT_EQ(path.lastSeparator, 1);
}

TEST(CxInitFilePathTest, TakesATextOf255Bytes)
{
    CxFilePath path;
    EXPECT_EQ(CxInitFilePath(&path, std::string(255, 'p').c_str()), 1);
    EXPECT_EQ(path.pathLength, 255);
}

TEST(CxInitFilePathTest, RefusesATextOf256Bytes)
{
    CxFilePath path;
    EXPECT_EQ(CxInitFilePath(&path, std::string(256, 'p').c_str()), 0);
    EXPECT_EQ(path.pathLength, -1);
}

TEST(CxInitFilePathTest, RefusesANullRecord)
{
    EXPECT_EQ(CxInitFilePath(nullptr, "a"), 0);
    EXPECT_EQ(CxInitFilePath(nullptr, nullptr), 0);
}

TEST(CxInitFilePathTest, ANullTextMakesAnInvalidRecord)
{
    CxFilePath path = pathOf("a/b");
    EXPECT_EQ(CxInitFilePath(&path, nullptr), 0);
    EXPECT_EQ(path.pathLength, -1);
    EXPECT_EQ(path.lastSeparator, -1);
}

TEST(CxFilePathParentTest, IsTheTextBeforeTheLastSeparator)
{
    CxFilePath path = pathOf("a\\b/c");
    CxFilePath parent;
    EXPECT_EQ(CxFilePathParent(&path, &parent), 1);
    EXPECT_STREQ(parent.path, "a/b");
    EXPECT_EQ(parent.pathLength, 3);
    EXPECT_EQ(parent.lastSeparator, 1);
}

TEST(CxFilePathParentTest, OfATwoPartPathHasNoSeparator)
{
    CxFilePath path = pathOf("ab/c");
    CxFilePath parent;
    EXPECT_EQ(CxFilePathParent(&path, &parent), 1);
    EXPECT_STREQ(parent.path, "ab");
    EXPECT_EQ(parent.pathLength, 2);
    EXPECT_EQ(parent.lastSeparator, -1);
}

TEST(CxFilePathParentTest, OfATopLevelPathIsTheEmptyPath)
{
    CxFilePath path = pathOf("/a");
    CxFilePath parent;
    EXPECT_EQ(CxFilePathParent(&path, &parent), 1);
    EXPECT_STREQ(parent.path, "");
    EXPECT_EQ(parent.pathLength, 0);
    EXPECT_EQ(parent.lastSeparator, -1);
}

TEST(CxFilePathParentTest, OfATopLevelDirectorysEntryKeepsTheRootSeparator)
{
    CxFilePath path = pathOf("/a/b");
    CxFilePath parent;
    EXPECT_EQ(CxFilePathParent(&path, &parent), 1);
    EXPECT_STREQ(parent.path, "/a");
    EXPECT_EQ(parent.lastSeparator, 0);
}

TEST(CxFilePathParentTest, OfDoubledSeparatorsKeepsTheFirst)
{
    CxFilePath path = pathOf("a//b");
    CxFilePath parent;
    EXPECT_EQ(CxFilePathParent(&path, &parent), 1);
    EXPECT_STREQ(parent.path, "a/");
    EXPECT_EQ(parent.pathLength, 2);
    EXPECT_EQ(parent.lastSeparator, 1);
}

TEST(CxFilePathParentTest, MayReplaceItsOwnSource)
{
    CxFilePath path = pathOf("a/b/c");
    EXPECT_EQ(CxFilePathParent(&path, &path), 1);
    EXPECT_STREQ(path.path, "a/b");
    EXPECT_EQ(path.pathLength, 3);
    EXPECT_EQ(path.lastSeparator, 1);
}

TEST(CxFilePathParentTest, DoesNotExistForABareName)
{
    CxFilePath path = pathOf("a");
    CxFilePath parent;
    EXPECT_EQ(CxFilePathParent(&path, &parent), 0);
}

TEST(CxFilePathParentTest, DoesNotExistForAnInvalidRecord)
{
    CxFilePath path = pathOf(longPath(300));
    CxFilePath parent;
    EXPECT_EQ(CxFilePathParent(&path, &parent), 0);
}

TEST(CxFilePathParentTest, RefusesNullArguments)
{
    CxFilePath path = pathOf("a/b");
    CxFilePath parent;
    EXPECT_EQ(CxFilePathParent(nullptr, &parent), 0);
    EXPECT_EQ(CxFilePathParent(&path, nullptr), 0);
}

/// Both questions about a path give the same error numbers, the type test aside.
struct Question {
    const char *name;
    int32_t (*ask)(const CxFilePath *);
};

class CxFilePathQuestion : public TestDir, public testing::WithParamInterface<Question> {
protected:
    static int32_t ask(const std::string &text)
    {
        CxFilePath path = pathOf(text);
        return GetParam().ask(&path);
    }
};

TEST_P(CxFilePathQuestion, AnswersZeroForADirectory)
{
    std::filesystem::create_directory("dir");
    EXPECT_EQ(ask("dir"), 0);
}

TEST_P(CxFilePathQuestion, RefusesNull)
{
    EXPECT_EQ(GetParam().ask(nullptr), EINVAL);
}

TEST_P(CxFilePathQuestion, RefusesTheEmptyPath)
{
    EXPECT_EQ(ask(""), EINVAL);
}

TEST_P(CxFilePathQuestion, RefusesAnInvalidRecord)
{
    EXPECT_EQ(ask(std::string(256, 'p')), EINVAL);
}

TEST_P(CxFilePathQuestion, GivesTheErrorNumberForAnAbsentName)
{
    EXPECT_EQ(ask("absent"), ENOENT);
}

TEST_P(CxFilePathQuestion, GivesTheErrorNumberForAnEndlessLink)
{
    std::filesystem::create_symlink("loop", "loop");
    EXPECT_EQ(ask("loop"), ELOOP);
}

TEST_P(CxFilePathQuestion, FollowsALinkToADirectory)
{
    std::filesystem::create_directory("dir");
    std::filesystem::create_symlink("dir", "link");
    EXPECT_EQ(ask("link"), 0);
}

INSTANTIATE_TEST_SUITE_P(Both, CxFilePathQuestion,
                         testing::Values(Question{"IsDir", CxFilePathIsDir},
                                         Question{"Exists", CxFilePathExists}),
                         [](const auto &row) { return std::string(row.param.name); });

class CxFilePathTest : public TestDir {};

TEST_F(CxFilePathTest, IsDirOfARegularFileIsNotADirectory)
{
    CxFilePath path = pathOf(write("file", "x"));
    EXPECT_EQ(CxFilePathIsDir(&path), ENOTDIR);
}

TEST_F(CxFilePathTest, ARegularFileExists)
{
    CxFilePath path = pathOf(write("file", "x"));
    EXPECT_EQ(CxFilePathExists(&path), 0);
}

} // namespace
} // namespace zelvo_test
