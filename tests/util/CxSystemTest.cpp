// SPDX-License-Identifier: Apache-2.0
#include <gtest/gtest.h>

#include <cerrno>
#include <cmath>
#include <cstring>
#include <string>

#include "CxSystem.h"
#include "support/FakeSystem.h"
#include "support/StatusIs.h"

namespace zelvo_test {
namespace {

/// The number that stands for every failure of the host name, whatever the system said.
constexpr int32_t hostnameFailure = 38;

double timestampAt(time_t seconds, suseconds_t microseconds)
{
    FakeSystem system;
    system.gettimeofday = [=](struct timeval *now, void *) {
        *now = {seconds, microseconds};
        return 0;
    };
    return CxSystemGetTimestamp();
}

TEST(CxSystemTimestamp, IsInMillisecondsSince1970)
{
    // 12:00:00.123456 on 1 January 2005, UTC
    EXPECT_EQ(timestampAt(1104580800, 123456), 1104580800123.0);
}

TEST(CxSystemTimestamp, CutsMicrosecondsOff)
{
    EXPECT_EQ(timestampAt(1, 999), 1000.0);
    EXPECT_EQ(timestampAt(1, 1000), 1001.0);
    EXPECT_EQ(timestampAt(1, 999999), 1999.0);
}

TEST(CxSystemTimestamp, IsComputedIn64Bits)
{
    EXPECT_EQ(timestampAt(253402300799, 0), 253402300799000.0);
}

TEST(CxSystemTimestamp, IsZeroAtTheStartOf1970)
{
    EXPECT_EQ(timestampAt(0, 0), 0.0);
}

TEST(CxSystemTimestamp, OfTheRealClockIsAWholeNumber)
{
    double now = CxSystemGetTimestamp();
    EXPECT_EQ(now, std::floor(now));
    EXPECT_GT(now, 1104580800123.0);
}

/// A host with a name of its own and a resolver that knows one official name, or none.
class CxSystemHostname : public testing::Test {
protected:
    void host(const std::string &name, const char *official)
    {
        system.gethostname = [name](char *own, size_t size) {
            std::strncpy(own, name.c_str(), size);
            return 0;
        };
        if (official != nullptr)
            text = official;
        entry.h_name = official == nullptr ? nullptr : text.data();
        system.gethostbyname = [this](const char *asked) {
            resolved = asked;
            return entry.h_name == nullptr ? nullptr : &entry;
        };
    }

    CxStatus ask() { return CxSystemGetFQHostname(buffer, sizeof buffer); }

    FakeSystem system;
    hostent entry = {};
    std::string text;
    std::string resolved;
    char buffer[64] = "before";
};

TEST_F(CxSystemHostname, AQualifiedNameIsKeptWithoutAskingTheResolver)
{
    host("node.example.org", "other.example.org");
    EXPECT_TRUE(succeeded(ask()));
    EXPECT_STREQ(buffer, "node.example.org");
    EXPECT_EQ(resolved, "");
}

TEST_F(CxSystemHostname, AShortNameGivesWayToAQualifiedOfficialName)
{
    host("node", "node.example.org");
    EXPECT_TRUE(succeeded(ask()));
    EXPECT_STREQ(buffer, "node.example.org");
    EXPECT_EQ(resolved, "node");
}

TEST_F(CxSystemHostname, AShortNameIsKeptWhenTheOfficialNameIsShortToo)
{
    host("node", "localhost");
    EXPECT_TRUE(succeeded(ask()));
    EXPECT_STREQ(buffer, "node");
}

TEST_F(CxSystemHostname, AShortNameThatTheResolverDoesNotKnowIsAFailureButStays)
{
    host("node", nullptr);
    EXPECT_TRUE(failedWith(ask(), hostnameFailure));
    EXPECT_STREQ(buffer, "node");
}

TEST_F(CxSystemHostname, AnOfficialNameIsCutAtTheSizeWithoutATerminator)
{
    host("node", "node.example.org");
    std::memset(buffer, 'x', 16);
    EXPECT_TRUE(succeeded(CxSystemGetFQHostname(buffer, 10)));
    EXPECT_EQ(std::string(buffer, 12), "node.exampxx");
}

TEST_F(CxSystemHostname, AnUnknownOwnNameIsAFailureWithAFixedNumber)
{
    system.gethostname = [](char *, size_t) { return errno = ENAMETOOLONG, -1; };
    EXPECT_TRUE(failedWith(ask(), hostnameFailure));
    EXPECT_STREQ(buffer, "");
}

TEST_F(CxSystemHostname, TheSystemIsAskedWithTheCallersBufferAndSize)
{
    std::pair<char *, size_t> asked;
    system.gethostname = [&](char *name, size_t size) {
        asked = {name, size};
        std::strcpy(name, "a.b");
        return 0;
    };
    EXPECT_TRUE(succeeded(CxSystemGetFQHostname(buffer, 33)));
    EXPECT_EQ(asked.first, buffer);
    EXPECT_EQ(asked.second, 33U);
}

TEST_F(CxSystemHostname, RefusesANullBuffer)
{
    EXPECT_TRUE(failedWith(CxSystemGetFQHostname(nullptr, 16), EINVAL));
}

TEST_F(CxSystemHostname, OfTheRealHostFailsInABufferThatIsTooSmall)
{
    EXPECT_TRUE(failedWith(CxSystemGetFQHostname(buffer, 1), hostnameFailure));
}

} // namespace
} // namespace zelvo_test
