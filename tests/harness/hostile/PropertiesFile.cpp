// SPDX-License-Identifier: Apache-2.0
// Things that are no properties file where one should be, and what one may ask for.
#include "Hostile.h"
#include "support/Limits.h"

namespace zelvo_test {
namespace {

constexpr const char *NAME = "zelvo.properties";
constexpr const char *ENTRY = "app.className = zlv_basiclogger\n";

class HostilePropertiesFile : public ToolkitFixture {
protected:
    /// The status of opening with the file; success when it opened.
    static CxStatus opened(const char *name = NAME)
    {
        CxStatus error{CX_STATUS_OK, 0};
        return ZlvOpenToolkit(name, &error) == 1 ? CxStatus{CX_STATUS_OK, 0} : error;
    }

    bool hasLogger() { return logger("app", nullptr) != nullptr; }
};

TEST_F(HostilePropertiesFile, AFifoIsReadOnceSomebodyWritesIt)
{
    ASSERT_EQ(mkfifo(NAME, 0600), 0);
    Child reader([this] { return opened().type == CX_STATUS_OK && hasLogger() ? 0 : 1; });
    std::ofstream(NAME) << ENTRY;
    EXPECT_EQ(reader.result(), 0);
}

TEST_F(HostilePropertiesFile, AFifoWithoutWriterIsWaitedFor)
{
    ASSERT_EQ(mkfifo(NAME, 0600), 0);
    EXPECT_EQ(within(1, [] { return opened().code; }), -1);
}

TEST_F(HostilePropertiesFile, ALinkIsFollowed)
{
    fs::create_symlink(write("target", ENTRY), NAME);
    EXPECT_TRUE(succeeded(opened()));
    EXPECT_TRUE(hasLogger());
}

TEST_F(HostilePropertiesFile, ADanglingLinkIsRefused)
{
    fs::create_symlink("target", NAME);
    EXPECT_TRUE(failedWith(opened(), ENOENT));
}

TEST_F(HostilePropertiesFile, ALinkToItselfIsRefused)
{
    fs::create_symlink(NAME, NAME);
    EXPECT_TRUE(failedWith(opened(), ELOOP));
}

TEST_F(HostilePropertiesFile, ADirectoryIsRefused)
{
    fs::create_directory(NAME);
    EXPECT_TRUE(failedWith(opened(), EISDIR));
}

TEST_F(HostilePropertiesFile, APathOf256BytesIsRefused)
{
    EXPECT_TRUE(failedWith(opened(std::string(256, 'n').c_str()), ENAMETOOLONG));
}

TEST_F(HostilePropertiesFile, OneThatMayNotBeReadIsRefused)
{
    ZELVO_NEEDS_ROOT();
    fs::permissions(".", fs::perms{0755});
    chmod(write(NAME, ENTRY).c_str(), 0600);
    EXPECT_TRUE(as(User::OTHER, [] { return bool(failedWith(opened(), EACCES)); }));
}

TEST_F(HostilePropertiesFile, TheNullDeviceIsEmpty)
{
    EXPECT_TRUE(succeeded(opened("/dev/null")));
}

TEST_F(HostilePropertiesFile, AnEndlessOneIsReadUntilMemoryRunsOut)
{
    EXPECT_EQ(within(PATIENCE,
                     [] {
                         constexpr rlim_t memory = 256 * 1024 * 1024;
                         const Limit limit(RLIMIT_AS, memory);
                         return int{ZlvOpenToolkit("/dev/zero", nullptr)};
                     }),
              0);
}

/// A properties file decides what the process does to files.
class HostileProperties : public Hostile {
protected:
    void SetUp() override {} // tests open the toolkit with a file of their own

    void openWith(const std::string &handlerProperties)
    {
        open("app.className = zlv_basiclogger\n"
             "app.listenerNames = log\n"
             "log.className = zlv_filehandler\n" +
             handlerProperties);
        app_ = logger("app", nullptr);
    }
};

TEST_F(HostileProperties, HaveFilesMadeAnywhere)
{
    const fs::path elsewhere = fs::temp_directory_path() / (directory().filename() += "-elsewhere");
    openWith("log.fileName = " + (elsewhere / "app.log").string() + "\n");
    log(u"a");
    EXPECT_TRUE(fs::exists(elsewhere / "app.log"));
    fs::remove_all(elsewhere);
}

TEST_F(HostileProperties, HaveFilesEmptied)
{
    write("victim", "v\n");
    openWith("log.fileName = victim\nlog.appending = false\n");
    log(u"a");
    EXPECT_EQ(read("victim").find("v\n"), std::string::npos);
}

TEST_F(HostileProperties, HaveFilesRemovedAndRenamed)
{
    write("victim", "v\n");
    write("victim1", "older\n");
    openWith("log.fileName = victim\nlog.maxFileBytes = 1\nlog.maxFiles = 2\n");
    log(u"a");
    EXPECT_EQ(read("victim1"), "v\n");
}

TEST_F(HostileProperties, HaveARolloverLookAtEveryNumber)
{
    write("app.log", "live\n");
    write("app7.log", "old\n");
    openWith("log.fileName = app.log\nlog.maxFileBytes = 1\nlog.maxFiles = 9\n");
    log(u"a");
    EXPECT_EQ(rolled(1), "live\n");
    EXPECT_EQ(rolled(8), "old\n");
}

TEST_F(HostileProperties, HaveARecordTakeEveryWayThroughListenersThatListOneAnother)
{
    open("app.className = zlv_basiclogger\n"
         "app.listenerNames = screen.1 screen.2 screen.3\n"
         "screen.className = zlv_consolehandler\n"
         "screen.listenerNames = screen.1 screen.2 screen.3\n");
    app_ = logger("app", nullptr);
    const std::string printed = console([&] { log(u"record"); });
    size_t records = 0;
    for (size_t at = 0; (at = printed.find("record", at)) != std::string::npos; ++at)
        ++records;
    EXPECT_EQ(records, 3U + 3 * 2 + 3 * 2 * 1);
}

TEST_F(HostileProperties, OfAClassThatNobodyRegisteredMakeNothing)
{
    open("x.className = elsewhere\n");
    EXPECT_EQ(object("x"), nullptr);
}

} // namespace
} // namespace zelvo_test
