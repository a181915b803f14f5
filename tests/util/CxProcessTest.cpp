// SPDX-License-Identifier: Apache-2.0
#include <gtest/gtest.h>

#include <cerrno>
#include <sys/wait.h>
#include <unistd.h>

#include <cstdlib>
#include <cstring>
#include <string>

#include "CxProcess.h"
#include "support/FakeSystem.h"
#include "support/StatusIs.h"
#include "support/TestDir.h"

namespace zelvo_test {
namespace {

/// How the child PROCESS ended: its exit status, or -1 when it did not exit by itself.
int exitStatus(int64_t process)
{
    int status = 0;
    if (waitpid(static_cast<pid_t>(process), &status, 0) < 0 || !WIFEXITED(status))
        return -1;
    return WEXITSTATUS(status);
}

/// Runs PATH and gives how it ended.
int run(const char *path, const char *script)
{
    std::string name = path;
    std::string option = "-c";
    std::string text = script;
    char *argv[] = {name.data(), option.data(), text.data(), nullptr};
    int64_t process = 0;
    EXPECT_TRUE(succeeded(CxProcessCreate(&process, path, argv)));
    if (process == -1)
        _exit(99);
    EXPECT_GT(process, 0);
    return exitStatus(process);
}

class CxProcessTest : public TestDir {};

TEST(CxProcessGetEnvTest, LendsTheValueOfAVariable)
{
    setenv("ZELVO_TEST_VARIABLE", "value", 1);
    EXPECT_STREQ(CxProcessGetEnv("ZELVO_TEST_VARIABLE"), "value");
    EXPECT_EQ(CxProcessGetEnv("ZELVO_TEST_VARIABLE"), getenv("ZELVO_TEST_VARIABLE"));
}

TEST(CxProcessGetEnvTest, IsNullForAnUnsetVariable)
{
    unsetenv("ZELVO_TEST_VARIABLE");
    EXPECT_EQ(CxProcessGetEnv("ZELVO_TEST_VARIABLE"), nullptr);
}

TEST(CxProcessGetEnvTest, IsNullForANullName)
{
    EXPECT_EQ(CxProcessGetEnv(nullptr), nullptr);
}

TEST(CxProcessGetCurrentIDTest, IsTheProcessId)
{
    EXPECT_EQ(CxProcessGetCurrentID(), static_cast<int64_t>(getpid()));
}

TEST(CxProcessGetCurrentIDTest, IsTheChildsOwnAfterAFork)
{
    pid_t child = fork();
    if (child == 0)
        _exit(CxProcessGetCurrentID() == getpid() ? 0 : 1);
    EXPECT_EQ(exitStatus(child), 0);
}

TEST_F(CxProcessTest, GetCwdGivesTheWorkingDirectory)
{
    char buffer[4096];
    EXPECT_TRUE(succeeded(CxProcessGetCwd(buffer, sizeof buffer)));
    EXPECT_EQ(std::string(buffer), std::filesystem::current_path().string());
}

TEST_F(CxProcessTest, GetCwdIntoABufferOfExactlyTheSizeSucceeds)
{
    char buffer[4096];
    size_t size = std::filesystem::current_path().string().size() + 1;
    EXPECT_TRUE(succeeded(CxProcessGetCwd(buffer, size)));
    EXPECT_EQ(std::strlen(buffer), size - 1);
}

TEST_F(CxProcessTest, GetCwdIntoABufferOneByteTooSmallLeavesItEmpty)
{
    char buffer[4096] = "before";
    size_t size = std::filesystem::current_path().string().size();
    EXPECT_TRUE(failedWith(CxProcessGetCwd(buffer, size), ERANGE));
    EXPECT_STREQ(buffer, "");
}

TEST_F(CxProcessTest, GetCwdIntoOneByteLeavesItEmpty)
{
    char buffer[4] = "xxx";
    EXPECT_TRUE(failedWith(CxProcessGetCwd(buffer, 1), ERANGE));
    EXPECT_EQ(buffer[0], 0);
    EXPECT_EQ(buffer[1], 'x');
}

TEST_F(CxProcessTest, GetCwdOfARemovedDirectoryLeavesTheBufferEmpty)
{
    std::filesystem::create_directory("gone");
    std::filesystem::current_path("gone");
    std::filesystem::remove("../gone");
    char buffer[4096] = "before";
    EXPECT_TRUE(failedWith(CxProcessGetCwd(buffer, sizeof buffer), ENOENT));
    EXPECT_STREQ(buffer, "");
    std::filesystem::current_path(directory());
}

TEST_F(CxProcessTest, GetCwdRefusesANullBuffer)
{
    EXPECT_TRUE(failedWith(CxProcessGetCwd(nullptr, 16), EINVAL));
    EXPECT_TRUE(failedWith(CxProcessGetCwd(nullptr, 0), EINVAL));
}

TEST_F(CxProcessTest, GetCwdRefusesSizeZeroAndLeavesTheBufferEmpty)
{
    char buffer[8] = "before";
    EXPECT_TRUE(failedWith(CxProcessGetCwd(buffer, 0), EINVAL));
    EXPECT_STREQ(buffer, "");
}

TEST_F(CxProcessTest, CreateRunsTheProgramWithItsArguments)
{
    EXPECT_EQ(run("/bin/sh", "echo started > mark; exit 7"), 7);
    EXPECT_EQ(read("mark"), "started\n");
}

TEST_F(CxProcessTest, CreateDoesNotSearchThePath)
{
    // The child finds no "sh" in the working directory, and comes back to run() with -1.
    EXPECT_EQ(run("sh", "exit 7"), 99);
}

TEST_F(CxProcessTest, AChildThatCannotRunComesBackWithSuccessAndMinusOne)
{
    char *argv[] = {nullptr};
    int64_t process = 0;
    pid_t parent = getpid();
    CxStatus status = CxProcessCreate(&process, "./absent", argv);
    if (getpid() != parent)
        _exit(process == -1 && status.type == '-' && status.code == 0 ? 42 : 1);
    EXPECT_TRUE(succeeded(status));
    EXPECT_EQ(exitStatus(process), 42);
}

TEST_F(CxProcessTest, CreateReportsAFailedForkAndLeavesMinusOne)
{
    char *argv[] = {nullptr};
    int64_t process = 77;
    FakeSystem system;
    system.fork = [] { return errno = EAGAIN, -1; };
    EXPECT_TRUE(failedWith(CxProcessCreate(&process, "/bin/true", argv), EAGAIN));
    EXPECT_EQ(process, -1);
}

TEST_F(CxProcessTest, CreateRefusesANullSlot)
{
    char *argv[] = {nullptr};
    EXPECT_TRUE(failedWith(CxProcessCreate(nullptr, "/bin/true", argv), EINVAL));
}

TEST_F(CxProcessTest, CreateRefusesANullOrEmptyPathWithoutForking)
{
    char *argv[] = {nullptr};
    int64_t process = 77;
    bool forked = false;
    FakeSystem system;
    system.fork = [&] { return forked = true, -1; };
    EXPECT_TRUE(failedWith(CxProcessCreate(&process, nullptr, argv), EINVAL));
    EXPECT_TRUE(failedWith(CxProcessCreate(&process, "", argv), EINVAL));
    EXPECT_FALSE(forked);
}

TEST_F(CxProcessTest, CreateTakesANullArgumentVector)
{
    int64_t process = 0;
    EXPECT_TRUE(succeeded(CxProcessCreate(&process, "/bin/true", nullptr)));
    if (process == -1)
        _exit(99);
    EXPECT_NE(exitStatus(process), 99);
}

TEST_F(CxProcessTest, ReleaseRefusesZero)
{
    EXPECT_TRUE(failedWith(CxProcessRelease(0), EINVAL));
}

TEST_F(CxProcessTest, ReleaseNeitherWaitsForNorSignalsTheChild)
{
    int ends[2];
    ASSERT_EQ(pipe(ends), 0);
    pid_t child = fork();
    if (child == 0) {
        close(ends[1]);
        char byte = 0;
        _exit(::read(ends[0], &byte, 1) == 1 ? byte : 1);
    }
    // The child lives until it gets its byte, so a release that waited would never return.
    EXPECT_TRUE(succeeded(CxProcessRelease(child)));
    EXPECT_EQ(::write(ends[1], "\x05", 1), 1);
    EXPECT_EQ(exitStatus(child), 5);
    close(ends[0]);
    close(ends[1]);
}

TEST_F(CxProcessTest, ReleaseAcceptsAnyOtherId)
{
    EXPECT_TRUE(succeeded(CxProcessRelease(-1)));
    EXPECT_TRUE(succeeded(CxProcessRelease(int64_t{1} << 40)));
}

} // namespace
} // namespace zelvo_test
