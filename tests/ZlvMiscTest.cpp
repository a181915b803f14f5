// SPDX-License-Identifier: Apache-2.0
#include <gtest/gtest.h>

#include <cerrno>
#include <cstring>
#include <string>

#include "ZlvMisc.h"

namespace zelvo_test {
namespace {

/// The calls that give the text of a platform error.
struct Lookup {
    const char *name;
    const char *(*text)(char type, int32_t code);
};

class ZlvPlatformErr : public testing::TestWithParam<Lookup> {
protected:
    static const char *text(char type, int32_t code) { return GetParam().text(type, code); }
};

TEST_P(ZlvPlatformErr, HasThePlatformsText)
{
    for (int32_t code : {ENOENT, EINVAL, ENOMEM, 38})
        EXPECT_STREQ(text('p', code), std::strerror(code));
}

TEST_P(ZlvPlatformErr, HasATextForANumberThatThePlatformDoesNotKnow)
{
    EXPECT_STREQ(text('p', 99999), "Unknown error 99999");
}

TEST_P(ZlvPlatformErr, HasNoTextForSuccess)
{
    EXPECT_EQ(text('-', 0), nullptr);
    EXPECT_EQ(text('-', ENOENT), nullptr);
}

TEST_P(ZlvPlatformErr, HasNoTextForAnotherType)
{
    EXPECT_EQ(text('P', ENOENT), nullptr);
    EXPECT_EQ(text(0, ENOENT), nullptr);
}

TEST_P(ZlvPlatformErr, IsNotPrinted)
{
    testing::internal::CaptureStdout();
    testing::internal::CaptureStderr();
    text('p', ENOENT);
    EXPECT_EQ(testing::internal::GetCapturedStdout(), "");
    EXPECT_EQ(testing::internal::GetCapturedStderr(), "");
}

INSTANTIATE_TEST_SUITE_P(Calls, ZlvPlatformErr,
                         testing::Values(Lookup{"Report", ZlvReportPlatformErr},
                                         Lookup{"GetStr", ZlvGetPlatformErrStr}),
                         [](const auto &row) { return std::string(row.param.name); });

} // namespace
} // namespace zelvo_test
