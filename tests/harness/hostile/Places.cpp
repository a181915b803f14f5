// SPDX-License-Identifier: Apache-2.0
// Devices, sockets and file systems where log files should be.
#include <sys/socket.h>
#include <sys/un.h>

#include "Hostile.h"
#include "support/Limits.h"

namespace zelvo_test {
namespace {

class HostilePlaces : public HostileBoth {};

TEST_P(HostilePlaces, TheNullDeviceTakesEverything)
{
    fs::create_symlink("/dev/null", "app.log");
    logTo("fileName", "app.log");
    log(u"a");
    log(u"b");
    EXPECT_TRUE(fs::is_character_file("app.log"));
}

TEST_P(HostilePlaces, TheNullDeviceIsNotRolledOver)
{
    fs::create_symlink("/dev/null", "app.log");
    logTo("fileName", "app.log", "maxFileBytes", "1");
    log(u"a");
    log(u"b");
    EXPECT_TRUE(isLink("app.log"));
    EXPECT_FALSE(fs::exists("app1.log"));
}

TEST_P(HostilePlaces, TheFullDeviceFailsEachRecord)
{
    fs::create_symlink("/dev/full", "app.log");
    logTo("fileName", "app.log");
    EXPECT_TRUE(failed(logged(u"lost"), ENOSPC));
    EXPECT_TRUE(failed(logged(u"lost"), ENOSPC));
}

TEST_P(HostilePlaces, ASocketFailsEachRecord)
{
    const int listening = socket(AF_UNIX, SOCK_STREAM | SOCK_CLOEXEC, 0);
    const sockaddr_un address{AF_UNIX, "app.log"};
    ASSERT_EQ(bind(listening, reinterpret_cast<const sockaddr *>(&address), sizeof address), 0);
    logTo("fileName", "app.log");
    EXPECT_TRUE(failed(logged(u"lost"), ENXIO));
    ::close(listening);
    fs::remove("app.log");
    log(u"a");
    EXPECT_EQ(file("app.log"), "a\n");
}

TEST_P(HostilePlaces, AReadOnlyFileSystemFailsEachRecordUntilItCanBeWritten)
{
    const SmallDisk disk;
    // Only a mount can become read-only, and mounting takes root.
    if (!disk.isThere())
        GTEST_SKIP() << "no right to mount a file system";
    logTo("fileName", "disk/d/app.log");
    ASSERT_EQ(mount("none", "disk", "tmpfs", MS_REMOUNT | MS_RDONLY, nullptr), 0);
    EXPECT_TRUE(failed(logged(u"lost"), ENOENT)); // the directory could not be made
    ASSERT_EQ(mount("none", "disk", "tmpfs", MS_REMOUNT, nullptr), 0);
    log(u"a");
    EXPECT_EQ(file("disk/d/app.log"), "a\n");
    closeHandler();
}

TEST_P(HostilePlaces, AFileSystemThatBecomesReadOnlyFailsTheOpening)
{
    const SmallDisk disk;
    // Only a mount can become read-only, and mounting takes root.
    if (!disk.isThere())
        GTEST_SKIP() << "no right to mount a file system";
    logTo("fileName", "disk/app.log");
    log(u"a");
    closeFile();
    ASSERT_EQ(mount("none", "disk", "tmpfs", MS_REMOUNT | MS_RDONLY, nullptr), 0);
    EXPECT_TRUE(failed(logged(u"lost"), EROFS));
    EXPECT_EQ(file("disk/app.log"), "a\n");
}

INSTANTIATE_TEST_SUITE_P(Handlers, HostilePlaces, handlerClasses, byRow);

} // namespace
} // namespace zelvo_test
