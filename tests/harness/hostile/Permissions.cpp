// SPDX-License-Identifier: Apache-2.0
// Permissions of files and directories under odd umasks, and those that are there already.
#include "Hostile.h"

namespace zelvo_test {
namespace {

class Umask {
public:
    explicit Umask(mode_t mask) : former_(umask(mask)) {}
    Umask(const Umask &) = delete;
    Umask &operator=(const Umask &) = delete;
    ~Umask() { umask(former_); }

private:
    mode_t former_;
};

class HostilePermissions : public HostileBoth {
protected:
    /// The permissions of a new file, and that of its directory, which is always the same.
    unsigned madeUnder(mode_t mask)
    {
        const Umask umask(mask);
        logTo("fileName", "d/app.log");
        log(u"a");
        EXPECT_EQ(modeOf("d"), 0771U);
        return modeOf("d/app.log");
    }
};

TEST_P(HostilePermissions, WithoutUmaskOthersMayReadAFile)
{
    EXPECT_EQ(madeUnder(0), 0744U);
}

TEST_P(HostilePermissions, AUmaskOf077KeepsOthersFromAFileButNotFromItsDirectory)
{
    EXPECT_EQ(madeUnder(077), 0700U);
}

TEST_P(HostilePermissions, AUmaskOf0777LeavesAFileThatItsOwnerCannotOpenAgain)
{
    EXPECT_EQ(madeUnder(0777), 0U);
    ZELVO_NEEDS_ROOT();
    permit(0777);
    ASSERT_EQ(chown("d/app.log", 65533, 65533), 0);
    EXPECT_TRUE(as(User::VICTIM, [this] {
        closeFile();
        return bool(failed(logged(u"lost"), EACCES));
    }));
}

TEST_P(HostilePermissions, FilePermissionSaysWhoMayReadAFile)
{
    logTo("fileName", "app.log", "filePermission", "600");
    log(u"a");
    EXPECT_EQ(modeOf("app.log"), 0600U);
}

TEST_P(HostilePermissions, DirPermissionSaysWhoMayEnterADirectoryWhateverTheUmask)
{
    const Umask umask(077);
    logTo("fileName", "d/e/app.log", "dirPermission", "2755");
    log(u"a");
    EXPECT_EQ(modeOf("d"), 02755U);
    EXPECT_EQ(modeOf("d/e"), 02755U);
}

TEST_P(HostilePermissions, FilePermissionOfRootCanBeThatOfAProgramThatRunsAsItsOwner)
{
    ZELVO_NEEDS_ROOT(); // a write takes the bit away from others
    logTo("fileName", "app.log", "filePermission", "4755");
    log(u"a");
    EXPECT_EQ(modeOf("app.log"), 04755U);
}

TEST_P(HostilePermissions, AFileThatExistsKeepsItsPermissions)
{
    chmod(write("app.log", "").c_str(), 0666);
    logTo("fileName", "app.log", "filePermission", "600");
    log(u"a");
    EXPECT_EQ(modeOf("app.log"), 0666U);
}

TEST_P(HostilePermissions, ADirectoryThatExistsKeepsItsPermissions)
{
    fs::create_directory("d");
    chmod("d", 0777);
    logTo("fileName", "d/app.log", "dirPermission", "700");
    log(u"a");
    EXPECT_EQ(modeOf("d"), 0777U);
}

INSTANTIATE_TEST_SUITE_P(Handlers, HostilePermissions, handlerClasses, byRow);

class HostileOlderPermissions : public Hostile {};

TEST_F(HostileOlderPermissions, ARenamedFileKeepsThem)
{
    chmod(write("app.log", "a\n").c_str(), 0666);
    logInTurns(ALONE, "filePermission", "600");
    log(u"b");
    EXPECT_EQ(modeOf("app1.log"), 0666U);
    EXPECT_EQ(modeOf("app.log"), 0600U);
}

TEST_F(HostileOlderPermissions, ACopyGetsThoseOfANewFile)
{
    chmod(write("app.log", "a\n").c_str(), 0666);
    logInTurns(SHARED, "filePermission", "600");
    log(u"b");
    EXPECT_EQ(modeOf("app1.log"), 0600U);
    EXPECT_EQ(modeOf("app.log"), 0666U);
}

} // namespace
} // namespace zelvo_test
