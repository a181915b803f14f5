// SPDX-License-Identifier: Apache-2.0
#include <gtest/gtest.h>

#include <fcntl.h>
#include <unistd.h>

#include <cstdio>
#include <string>

#include "CxTrace.h"
#include "support/TestDir.h"

namespace zelvo_test {
namespace {

/// Catches standard error in a file. The stream is fully buffered meanwhile, so that only what the
/// trace itself flushes is seen.
class CxTraceTest : public TestDir {
protected:
    CxTraceTest() : console_(dup(STDERR_FILENO))
    {
        int file = open("trace", O_WRONLY | O_CREAT | O_TRUNC, 0600);
        dup2(file, STDERR_FILENO);
        close(file);
        setvbuf(stderr, buffer_, _IOFBF, sizeof buffer_);
    }

    ~CxTraceTest() override
    {
        fflush(stderr);
        setvbuf(stderr, nullptr, _IONBF, 0);
        dup2(console_, STDERR_FILENO);
        close(console_);
        CX_INTERNAL_TRACE_INDENT = 0;
    }

    /// What has reached standard error.
    static std::string traced() { return read("trace"); }

private:
    int console_;
    static char buffer_[4096];
};

char CxTraceTest::buffer_[4096];

TEST_F(CxTraceTest, TheIndentationIsZeroAtFirst)
{
    EXPECT_EQ(CX_INTERNAL_TRACE_INDENT, 0);
}

TEST_F(CxTraceTest, EnterPointAndLeaveMakeAnIndentedTrace)
{
    cxIntlTraceEnter("a\n");
    cxIntlTracePoint("b\n");
    cxIntlTraceLeave("c\n");
    EXPECT_EQ(traced(), "ENTER a\n   ... b\nLEAVE c\n");
}

TEST_F(CxTraceTest, EnterFormatsItsArguments)
{
    cxIntlTraceEnter("%s %d\n", "call", 5);
    EXPECT_EQ(traced(), "ENTER call 5\n");
}

TEST_F(CxTraceTest, PointFormatsItsArguments)
{
    cxIntlTracePoint("%s %d\n", "point", 6);
    EXPECT_EQ(traced(), "... point 6\n");
}

TEST_F(CxTraceTest, LeaveFormatsItsArguments)
{
    CX_INTERNAL_TRACE_INDENT = 3;
    cxIntlTraceLeave("%s %d\n", "call", 7);
    EXPECT_EQ(traced(), "LEAVE call 7\n");
}

TEST_F(CxTraceTest, EnterRaisesTheIndentationByThree)
{
    CX_INTERNAL_TRACE_INDENT = 6;
    cxIntlTraceEnter("a");
    EXPECT_EQ(CX_INTERNAL_TRACE_INDENT, 9);
    EXPECT_EQ(traced(), "      ENTER a");
}

TEST_F(CxTraceTest, LeaveLowersTheIndentationByThreeFirst)
{
    CX_INTERNAL_TRACE_INDENT = 6;
    cxIntlTraceLeave("a");
    EXPECT_EQ(CX_INTERNAL_TRACE_INDENT, 3);
    EXPECT_EQ(traced(), "   LEAVE a");
}

TEST_F(CxTraceTest, PointKeepsTheIndentation)
{
    CX_INTERNAL_TRACE_INDENT = 6;
    cxIntlTracePoint("a");
    EXPECT_EQ(CX_INTERNAL_TRACE_INDENT, 6);
    EXPECT_EQ(traced(), "      ... a");
}

TEST_F(CxTraceTest, TheTraceWritesNoLineEndOfItsOwn)
{
    cxIntlTracePoint("a");
    cxIntlTracePoint("b");
    EXPECT_EQ(traced(), "... a... b");
}

TEST_F(CxTraceTest, ALeaveWithoutAnEnterWritesNoSpaces)
{
    cxIntlTraceLeave("a\n");
    cxIntlTracePoint("b\n");
    EXPECT_EQ(CX_INTERNAL_TRACE_INDENT, -3);
    EXPECT_EQ(traced(), "LEAVE a\n... b\n");
}

TEST_F(CxTraceTest, ANullFormatLeavesEnterAndLeaveBalanced)
{
    // Called through pointers, since the compilers refuse a null format where they see the callee.
    for (void (*trace)(const char *, ...) : {cxIntlTraceEnter, cxIntlTracePoint, cxIntlTraceLeave})
        trace(nullptr);
    EXPECT_EQ(CX_INTERNAL_TRACE_INDENT, 0);
}

} // namespace
} // namespace zelvo_test
