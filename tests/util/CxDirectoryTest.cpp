// SPDX-License-Identifier: Apache-2.0
#include <gtest/gtest.h>

#include <cerrno>
#include <dirent.h>
#include <sys/resource.h>
#include <unistd.h>

#include <cstring>
#include <filesystem>
#include <set>
#include <string>

#include "CxDirectory.h"
#include "support/LongPath.h"
#include "support/StatusIs.h"
#include "support/TestDir.h"

namespace zelvo_test {
namespace {

class CxDirectoryTest : public TestDir {
protected:
    CxDirectoryTest()
    {
        std::filesystem::create_directories("dir/sub");
        write("dir/one", "1");
        write("dir/two", "2");
    }

    ~CxDirectoryTest() override
    {
        if (directory != nullptr)
            CxDirectoryClose(&directory);
    }

    void open(const char *path) { ASSERT_TRUE(succeeded(CxDirectoryOpen(&directory, path))); }

    std::string next()
    {
        char name[300] = "before";
        EXPECT_TRUE(succeeded(CxDirectoryGetNext(&directory, name, sizeof name - 1)));
        return name;
    }

    DIR *stream() const { return static_cast<DIR *>(directory); }

    CxDirectory directory = nullptr;
};

TEST_F(CxDirectoryTest, OpenFillsTheSlot)
{
    EXPECT_TRUE(succeeded(CxDirectoryOpen(&directory, "dir")));
    EXPECT_NE(directory, nullptr);
}

TEST_F(CxDirectoryTest, OpenTurnsBackslashesIntoSeparators)
{
    EXPECT_TRUE(succeeded(CxDirectoryOpen(&directory, "dir\\sub")));
    EXPECT_NE(directory, nullptr);
}

TEST_F(CxDirectoryTest, OpenRefusesNullArguments)
{
    EXPECT_TRUE(failedWith(CxDirectoryOpen(nullptr, "dir"), EINVAL));
    EXPECT_TRUE(failedWith(CxDirectoryOpen(&directory, nullptr), EINVAL));
    EXPECT_EQ(directory, nullptr);
}

TEST_F(CxDirectoryTest, AFailedOpenLeavesNullInTheSlot)
{
    int other = 0;
    CxDirectory slot = &other;
    EXPECT_TRUE(failedWith(CxDirectoryOpen(&slot, "dir/one"), EINVAL));
    EXPECT_EQ(slot, nullptr);
}

TEST_F(CxDirectoryTest, OpenRefusesARegularFile)
{
    EXPECT_TRUE(failedWith(CxDirectoryOpen(&directory, "dir/one"), EINVAL));
    EXPECT_EQ(directory, nullptr);
}

TEST_F(CxDirectoryTest, OpenRefusesAnAbsentDirectoryAsAnInvalidArgument)
{
    EXPECT_TRUE(failedWith(CxDirectoryOpen(&directory, "absent"), EINVAL));
    EXPECT_EQ(directory, nullptr);
}

TEST_F(CxDirectoryTest, OpenRefusesTheEmptyPath)
{
    EXPECT_TRUE(failedWith(CxDirectoryOpen(&directory, ""), EINVAL));
}

TEST_F(CxDirectoryTest, OpenRefusesAPathThatDoesNotFitAPathRecord)
{
    std::string path = longPath(256);
    std::filesystem::create_directory(path);
    EXPECT_TRUE(failedWith(CxDirectoryOpen(&directory, path.c_str()), EINVAL));
    EXPECT_EQ(directory, nullptr);
}

TEST_F(CxDirectoryTest, OpenTakesALongPathThatFits)
{
    std::string path = longPath(255);
    std::filesystem::create_directory(path);
    EXPECT_TRUE(succeeded(CxDirectoryOpen(&directory, path.c_str())));
}

TEST_F(CxDirectoryTest, OpenReportsTheErrorNumberWhenTheSystemRefuses)
{
    rlimit before = {};
    getrlimit(RLIMIT_NOFILE, &before);
    rlimit limit = before;
    limit.rlim_cur = 0;
    setrlimit(RLIMIT_NOFILE, &limit);
    CxStatus status = CxDirectoryOpen(&directory, "dir");
    setrlimit(RLIMIT_NOFILE, &before);
    EXPECT_TRUE(failedWith(status, EMFILE));
    EXPECT_EQ(directory, nullptr);
}

TEST_F(CxDirectoryTest, GetNextGivesEveryEntryAndTheDots)
{
    open("dir");
    std::multiset<std::string> names;
    for (std::string name = next(); !name.empty(); name = next())
        names.insert(name);
    EXPECT_EQ(names, (std::multiset<std::string>{".", "..", "one", "sub", "two"}));
}

TEST_F(CxDirectoryTest, GetNextKeepsTheOrderOfTheStream)
{
    open("dir");
    DIR *reference = opendir("dir");
    ASSERT_NE(reference, nullptr);
    while (const dirent *entry = readdir(reference))
        EXPECT_EQ(next(), entry->d_name);
    closedir(reference);
}

TEST_F(CxDirectoryTest, TheEndOfTheListingIsAnEmptyNameAndSuccess)
{
    open("dir");
    while (!next().empty()) {
    }
    char name[8] = "before";
    errno = EIO;
    EXPECT_TRUE(succeeded(CxDirectoryGetNext(&directory, name, 7)));
    EXPECT_STREQ(name, "");
}

TEST_F(CxDirectoryTest, GetNextGivesAtMostSizeBytesOfAName)
{
    open("dir");
    char name[4];
    bool seen = false;
    do {
        std::memset(name, 'x', sizeof name);
        ASSERT_TRUE(succeeded(CxDirectoryGetNext(&directory, name, 2)));
        EXPECT_EQ(name[3], 'x');
        seen = seen || std::strcmp(name, "on") == 0;
    } while (name[0] != 0);
    EXPECT_TRUE(seen);
}

TEST_F(CxDirectoryTest, GetNextRefusesNullArguments)
{
    open("dir");
    char name[8] = "before";
    EXPECT_TRUE(failedWith(CxDirectoryGetNext(nullptr, name, 7), EINVAL));
    EXPECT_TRUE(failedWith(CxDirectoryGetNext(&directory, nullptr, 7), EINVAL));
}

TEST_F(CxDirectoryTest, GetNextRefusesAClosedDirectory)
{
    char name[8] = "before";
    EXPECT_TRUE(failedWith(CxDirectoryGetNext(&directory, name, 7), EINVAL));
}

TEST_F(CxDirectoryTest, AFailedReadIsReportedWithAnEmptyName)
{
    open("dir");
    close(dirfd(stream()));
    char name[8] = "before";
    EXPECT_TRUE(failedWith(CxDirectoryGetNext(&directory, name, 7), EBADF));
    EXPECT_STREQ(name, "");
}

TEST_F(CxDirectoryTest, CloseEmptiesTheSlot)
{
    open("dir");
    int descriptor = dirfd(stream());
    EXPECT_TRUE(succeeded(CxDirectoryClose(&directory)));
    EXPECT_EQ(directory, nullptr);
    EXPECT_EQ(close(descriptor), -1);
}

TEST_F(CxDirectoryTest, AFailedCloseIsReportedAndStillEmptiesTheSlot)
{
    open("dir");
    close(dirfd(stream()));
    EXPECT_TRUE(failedWith(CxDirectoryClose(&directory), EBADF));
    EXPECT_EQ(directory, nullptr);
}

TEST_F(CxDirectoryTest, CloseRefusesANullSlot)
{
    EXPECT_TRUE(failedWith(CxDirectoryClose(nullptr), EINVAL));
}

TEST_F(CxDirectoryTest, CloseOfAClosedDirectoryFails)
{
    EXPECT_TRUE(failedWith(CxDirectoryClose(&directory), EINVAL));
    EXPECT_EQ(directory, nullptr);
}

} // namespace
} // namespace zelvo_test
