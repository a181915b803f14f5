// SPDX-License-Identifier: Apache-2.0
// Creating a directory and its missing ancestors.
#include <gtest/gtest.h>

#include <cerrno>
#include <sys/stat.h>
#include <unistd.h>

#include <filesystem>
#include <string>
#include <vector>

#include "CxFilePath.h"
#include "support/FakeSystem.h"
#include "support/TestDir.h"

namespace zelvo_test {
namespace {

class CxFilePathMkdirsTest : public TestDir {
protected:
    ~CxFilePathMkdirsTest() override { umask(022); }

    static int32_t mkdirs(const std::string &text, uint32_t mode)
    {
        CxFilePath path;
        CxInitFilePath(&path, text.c_str());
        return CxFilePathMkdirs(&path, mode);
    }

    static mode_t permissions(const std::string &name)
    {
        struct stat facts = {};
        stat(name.c_str(), &facts);
        return facts.st_mode & 07777;
    }
};

TEST_F(CxFilePathMkdirsTest, CreatesEveryMissingPart)
{
    EXPECT_EQ(mkdirs("x/y/z", 0750), 0);
    EXPECT_TRUE(std::filesystem::is_directory("x/y/z"));
}

TEST_F(CxFilePathMkdirsTest, GivesEveryPartTheCallersPermissionsWhateverTheUmask)
{
    umask(077);
    EXPECT_EQ(mkdirs("x/y/z", 0765), 0);
    EXPECT_EQ(permissions("x"), 0765U);
    EXPECT_EQ(permissions("x/y"), 0765U);
    EXPECT_EQ(permissions("x/y/z"), 0765U);
}

TEST_F(CxFilePathMkdirsTest, TakesBackslashes)
{
    EXPECT_EQ(mkdirs("x\\y", 0700), 0);
    EXPECT_TRUE(std::filesystem::is_directory("x/y"));
}

TEST_F(CxFilePathMkdirsTest, CreatesBelowAnExistingDirectoryOfAnAbsolutePath)
{
    EXPECT_EQ(mkdirs((directory() / "a/b").string(), 0700), 0);
    EXPECT_TRUE(std::filesystem::is_directory("a/b"));
}

TEST_F(CxFilePathMkdirsTest, LeavesAnExistingDirectoryAndItsPermissions)
{
    std::filesystem::create_directory("dir");
    mode_t before = permissions("dir");
    EXPECT_EQ(mkdirs("dir", 0711), 0);
    EXPECT_EQ(permissions("dir"), before);
}

TEST_F(CxFilePathMkdirsTest, LeavesThePermissionsOfExistingAncestors)
{
    std::filesystem::create_directory("dir");
    mode_t before = permissions("dir");
    EXPECT_EQ(mkdirs("dir/new", 0711), 0);
    EXPECT_EQ(permissions("dir"), before);
    EXPECT_EQ(permissions("dir/new"), 0711U);
}

TEST_F(CxFilePathMkdirsTest, AnswersNotADirectoryWhenAFileIsInTheWay)
{
    write("file", "x");
    EXPECT_EQ(mkdirs("file", 0700), ENOTDIR);
    EXPECT_EQ(mkdirs("file/below", 0700), ENOTDIR);
}

TEST_F(CxFilePathMkdirsTest, GivesTheErrorNumberOfTheTest)
{
    std::filesystem::create_symlink("loop", "loop");
    EXPECT_EQ(mkdirs("loop", 0700), ELOOP);
}

TEST_F(CxFilePathMkdirsTest, RefusesTheEmptyPath)
{
    EXPECT_EQ(mkdirs("", 0700), EINVAL);
}

TEST_F(CxFilePathMkdirsTest, RefusesAnInvalidRecord)
{
    EXPECT_EQ(mkdirs(std::string(256, 'p'), 0700), EINVAL);
}

TEST_F(CxFilePathMkdirsTest, RefusesNull)
{
    EXPECT_EQ(CxFilePathMkdirs(nullptr, 0700), EINVAL);
}

TEST_F(CxFilePathMkdirsTest, RefusesToCreateDirectlyUnderTheRoot)
{
    EXPECT_EQ(mkdirs("/zelvo-absent", 0700), EINVAL);
    EXPECT_FALSE(std::filesystem::exists("/zelvo-absent"));
}

TEST_F(CxFilePathMkdirsTest, RefusesToCreateBelowAMissingTopLevelDirectory)
{
    EXPECT_EQ(mkdirs("/nonexistent/y", 0700), EINVAL);
    EXPECT_FALSE(std::filesystem::exists("/nonexistent"));
}

TEST_F(CxFilePathMkdirsTest, AFailingAncestorEndsTheWork)
{
    std::vector<std::string> made;
    FakeSystem system;
    system.mkdir = [&](const char *path, mode_t) {
        made.emplace_back(path);
        errno = EROFS;
        return -1;
    };
    EXPECT_EQ(mkdirs("x/y/z", 0700), EROFS);
    EXPECT_EQ(made, std::vector<std::string>{"x"});
}

TEST_F(CxFilePathMkdirsTest, AsksForAllPermissionsAndThenSetsTheCallers)
{
    mode_t asked = 0;
    mode_t set = 0;
    FakeSystem system;
    system.mkdir = [&](const char *, mode_t mode) { return asked = mode, 0; };
    system.chmod = [&](const char *, mode_t mode) { return set = mode, 0; };
    EXPECT_EQ(mkdirs("x", 0751), 0);
    EXPECT_EQ(asked, 0777U);
    EXPECT_EQ(set, 0751U);
}

TEST_F(CxFilePathMkdirsTest, SetsThePermissionsEvenWhenCreatingFailed)
{
    std::string changed;
    FakeSystem system;
    system.mkdir = [](const char *, mode_t) { return errno = EROFS, -1; };
    system.chmod = [&](const char *path, mode_t) { return changed = path, 0; };
    EXPECT_EQ(mkdirs("x", 0700), EROFS);
    EXPECT_EQ(changed, "x");
}

TEST_F(CxFilePathMkdirsTest, AFailingChmodDoesNotHideWhyCreatingFailed)
{
    FakeSystem system;
    system.mkdir = [](const char *, mode_t) { return errno = ENOSPC, -1; };
    system.chmod = [](const char *, mode_t) { return errno = EPERM, -1; };
    EXPECT_EQ(mkdirs("x", 0700), ENOSPC);
}

TEST_F(CxFilePathMkdirsTest, AFailingChmodAloneIsNoFailure)
{
    FakeSystem system;
    system.chmod = [](const char *, mode_t) { return errno = EPERM, -1; };
    EXPECT_EQ(mkdirs("x", 0700), 0);
    EXPECT_TRUE(std::filesystem::is_directory("x"));
}

TEST_F(CxFilePathMkdirsTest, ADirectoryThatAppearedMeanwhileIsSuccess)
{
    FakeSystem system;
    system.mkdir = [](const char *, mode_t) { return errno = EEXIST, -1; };
    EXPECT_EQ(mkdirs("x", 0700), 0);
}

TEST_F(CxFilePathMkdirsTest, ADanglingLinkCountsAsExisting)
{
    std::filesystem::create_symlink("absent", "link");
    EXPECT_EQ(mkdirs("link", 0700), 0);
}

} // namespace
} // namespace zelvo_test
