// SPDX-License-Identifier: Apache-2.0
// Other users in the directory of a log file, and the records they get to see.
#include "Hostile.h"

namespace zelvo_test {
namespace {

/// Whether the system guards directories that others may write and that are sticky; see proc(5).
bool isProtected(const char *setting)
{
    int value = 0;
    std::ifstream(std::string("/proc/sys/fs/protected_") + setting) >> value;
    return value > 0;
}

bool canRead(User user, const std::string &name)
{
    return as(user, [&] { return std::ifstream(name).good(); });
}

bool canList(User user, const std::string &name)
{
    return as(user, [&] {
        std::error_code error;
        const fs::directory_iterator listing(name, error);
        return !error;
    });
}

class HostileOtherUsers : public HostileBoth {
protected:
    void SetUp() override
    {
        ZELVO_NEEDS_ROOT();
        HostileBoth::SetUp();
    }

    /// Somebody else makes a file for everybody.
    static void otherMakes(const char *name)
    {
        ASSERT_TRUE(as(User::OTHER, [&] {
            write(name, "o\n");
            return chmod(name, 0666) == 0;
        }));
    }

    static uid_t ownerOf(const char *name)
    {
        struct stat facts {};
        stat(name, &facts);
        return facts.st_uid;
    }
};

TEST_P(HostileOtherUsers, ReadRecordsUnlessFilePermissionForbidsIt)
{
    permit(0755);
    logTo("fileName", "d/app.log");
    log(u"a");
    EXPECT_TRUE(canRead(User::OTHER, "d/app.log"));
    EXPECT_FALSE(canList(User::OTHER, "d"));
    set("fileName", "d/private.log", "filePermission", "600");
    log(u"b");
    EXPECT_FALSE(canRead(User::OTHER, "d/private.log"));
}

TEST_P(HostileOtherUsers, ReadAndKeepAFileThatTheyMadeBefore)
{
    permit(0777);
    otherMakes("app.log");
    logTo("fileName", "app.log", "filePermission", "600");
    log(u"a");
    EXPECT_EQ(ownerOf("app.log"), 65534U);
    EXPECT_TRUE(canRead(User::OTHER, "app.log"));
}

TEST_P(HostileOtherUsers, HaveRecordsWrittenToAnyFileThroughALink)
{
    permit(0777);
    chmod(write("private", "p\n").c_str(), 0600);
    ASSERT_TRUE(as(User::OTHER, [] { return symlink("private", "app.log") == 0; }));
    logTo("fileName", "app.log");
    log(u"a");
    EXPECT_EQ(file("private"), "p\na\n");
}

TEST_P(HostileOtherUsers, DoSoInAStickyDirectoryUnlessTheSystemProtectsLinks)
{
    permit(01777);
    write("private", "p\n");
    ASSERT_TRUE(as(User::OTHER, [] { return symlink("private", "app.log") == 0; }));
    logTo("fileName", "app.log");
    const bool isGuarded = isProtected("symlinks");
    EXPECT_TRUE(isGuarded ? failed(logged(u"a"), EACCES) : ok(logged(u"a")));
    EXPECT_EQ(file("private"), isGuarded ? "p\n" : "p\na\n");
}

TEST_P(HostileOtherUsers, KeepTheirFileInAStickyDirectoryUnlessTheSystemProtectsFiles)
{
    permit(01777);
    otherMakes("app.log");
    logTo("fileName", "app.log");
    const bool isGuarded = isProtected("regular");
    EXPECT_TRUE(isGuarded ? failed(logged(u"a"), EACCES) : ok(logged(u"a")));
    EXPECT_EQ(file("app.log"), isGuarded ? "o\n" : "o\na\n");
}

TEST_P(HostileOtherUsers, CannotTakeALogFileAwayFromAStickyDirectory)
{
    permit(01777);
    logTo("fileName", "app.log");
    log(u"a");
    EXPECT_FALSE(as(User::OTHER, [] { return rename("app.log", "taken.log") == 0; }));
}

TEST_P(HostileOtherUsers, PutAFileOfTheirsInThePlaceOfALogFile)
{
    permit(0777);
    logTo("fileName", "app.log");
    log(u"a");
    ASSERT_TRUE(as(User::OTHER, [] {
        write("forged", "f\n");
        return rename("forged", "app.log") == 0;
    }));
    log(u"unseen");
    EXPECT_EQ(file("app.log"), "f\n");
}

TEST_P(HostileOtherUsers, CannotWriteInADirectoryThatAHandlerMade)
{
    permit(0755);
    logTo("fileName", "d/app.log");
    log(u"a");
    EXPECT_FALSE(as(User::OTHER, [] { return symlink("private", "d/app1.log") == 0; }));
}

INSTANTIATE_TEST_SUITE_P(Handlers, HostileOtherUsers, handlerClasses, byRow);

/// A victim, who is not root, rolls over in a sticky directory where somebody else has taken the
/// name of the older file.
class HostileStickyRollover : public Hostile {
protected:
    void SetUp() override
    {
        ZELVO_NEEDS_ROOT();
        Hostile::SetUp();
        permit(01777);
        ASSERT_TRUE(
            as(User::OTHER, [] { return chmod(write("app1.log", "o\n").c_str(), 0) == 0; }));
    }

    bool victimLogsTwice(const char *className)
    {
        return as(User::VICTIM, [=, this] {
            logInTurns(className);
            return ok(logged(u"a")) && ok(logged(u"b"));
        });
    }
};

TEST_F(HostileStickyRollover, ThatRenamesDoesNotHappen)
{
    EXPECT_TRUE(victimLogsTwice(ALONE));
    EXPECT_EQ(file("app.log"), "a\nb\n");
    EXPECT_EQ(rolled(1), "o\n");
}

TEST_F(HostileStickyRollover, ThatCopiesCostsTheLiveFile)
{
    EXPECT_TRUE(victimLogsTwice(SHARED));
    EXPECT_EQ(file("app.log"), "b\n");
    EXPECT_EQ(rolled(1), "o\n");
}

} // namespace
} // namespace zelvo_test
