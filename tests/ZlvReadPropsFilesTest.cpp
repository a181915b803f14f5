// SPDX-License-Identifier: Apache-2.0
// Failures of the file, of the memory and of the arguments.
#include "support/ReadProps.h"

#include <cerrno>
#include <filesystem>

namespace zelvo_test {
namespace {

using ZlvReadPropsFiles = ReadProps;

/// The number of descriptors that this process has open.
auto openFiles()
{
    std::filesystem::directory_iterator files("/proc/self/fd");
    return std::distance(begin(files), end(files));
}

TEST_F(ZlvReadPropsFiles, AMissingFileIsReportedAndCopied)
{
    FileFaults faults;
    EXPECT_EQ(zlvDoReadProps("missing", &list, &error), 0);
    EXPECT_TRUE(errorIs('p', ENOENT));
    EXPECT_EQ(faults.reports, 1U);
    EXPECT_EQ(faults.reported.type, 'p');
    EXPECT_EQ(faults.reported.code, ENOENT);
}

TEST_F(ZlvReadPropsFiles, ADirectoryFailsAtItsFirstRead)
{
    FileFaults faults;
    std::filesystem::create_directory("dir");
    EXPECT_EQ(zlvDoReadProps("dir", &list, &error), 0);
    EXPECT_TRUE(errorIs('p', EISDIR));
    EXPECT_EQ(EISDIR, 21);
    EXPECT_EQ(faults.reports, 1U);
    EXPECT_EQ(faults.reported.code, EISDIR);
}

TEST_F(ZlvReadPropsFiles, AFailingReadEndsTheReadEvenWithAnEntryPending)
{
    FileFaults faults;
    faults.failReads(7, EIO);
    EXPECT_FALSE(reads("a=1\nb=2\nc=3\n"));
    EXPECT_TRUE(errorIs('p', EIO));
    EXPECT_EQ(faults.reports, 1U);
    EXPECT_EQ(list.all(), "a=1");
}

TEST_F(ZlvReadPropsFiles, AFailingReadThatGaveAByteFailsAsWell)
{
    FileFaults faults;
    faults.failReads(4, EIO, 1);
    EXPECT_FALSE(reads("a=1\nb=2\n"));
    EXPECT_TRUE(errorIs('p', EIO));
    EXPECT_EQ(faults.reports, 1U);
}

TEST_F(ZlvReadPropsFiles, AReadOfNoByteIsTheEndOfInputEvenWhenItFails)
{
    FileFaults faults;
    faults.failReads(7, EIO, 0);
    EXPECT_TRUE(reads("a=1\nb=2\nc=3\n"));
    EXPECT_EQ(list.all(), "a=1 b=2");
    EXPECT_TRUE(errorUntouched());
    EXPECT_EQ(faults.reports, 0U);
}

TEST_F(ZlvReadPropsFiles, AReadMayFailAnywhereInTheFile)
{
    const std::string text = "a=one\\\r\n  two\r\n# c\r\nb=\\u0041\n";
    for (size_t bytes = 1; bytes < text.size(); ++bytes) {
        FileFaults faults;
        faults.failReads(bytes, EIO);
        EXPECT_FALSE(reads(text)) << bytes;
        EXPECT_EQ(faults.reports, 1U);
    }
    EXPECT_TRUE(reads(text));
    EXPECT_EQ(list.all(), "a=onetwo b=A");
}

TEST_F(ZlvReadPropsFiles, AFailingCloseIsCopiedWithoutChangingTheResult)
{
    FileFaults faults;
    faults.failCloses(EIO);
    EXPECT_TRUE(reads("a=1\n"));
    EXPECT_TRUE(errorIs('p', EIO));
    EXPECT_EQ(faults.reports, 1U);
    EXPECT_EQ(faults.reported.code, EIO);
    EXPECT_EQ(list.all(), "a=1");
}

TEST_F(ZlvReadPropsFiles, AFailingCloseAfterASyntaxErrorStaysAFailure)
{
    FileFaults faults;
    faults.failCloses(EIO);
    EXPECT_FALSE(reads("a\n"));
    EXPECT_TRUE(errorIs('p', EIO));
}

TEST_F(ZlvReadPropsFiles, AGoodReadReportsNothing)
{
    FileFaults faults;
    EXPECT_TRUE(reads("a=1\n"));
    EXPECT_EQ(faults.reports, 0U);
    EXPECT_TRUE(errorUntouched());
}

TEST_F(ZlvReadPropsFiles, ASyntaxErrorIsNotReported)
{
    FileFaults faults;
    EXPECT_FALSE(reads("a\n"));
    EXPECT_EQ(faults.reports, 0U);
    EXPECT_TRUE(errorUntouched());
}

TEST_F(ZlvReadPropsFiles, ANullPathIsAMissingArgument)
{
    EXPECT_EQ(zlvDoReadProps(nullptr, &list, &error), 0);
    EXPECT_TRUE(errorIs('p', EINVAL));
}

TEST_F(ZlvReadPropsFiles, TheErrorRecordMayBeNull)
{
    std::filesystem::create_directory("dir");
    EXPECT_EQ(zlvDoReadProps("missing", &list, nullptr), 0);
    EXPECT_EQ(zlvDoReadProps("dir", &list, nullptr), 0);
    EXPECT_EQ(zlvDoReadProps(write("bad", "a\n").c_str(), &list, nullptr), 0);
    FileFaults faults;
    faults.failCloses(EIO);
    EXPECT_EQ(zlvDoReadProps(write("good", "a=1\n").c_str(), &list, nullptr), 1);
}

TEST_F(ZlvReadPropsFiles, EveryReadClosesItsFile)
{
    std::filesystem::create_directory("dir");
    const auto before = openFiles();
    EXPECT_TRUE(reads("a=1\n"));
    EXPECT_FALSE(reads("a\n"));
    EXPECT_EQ(zlvDoReadProps("dir", &list, &error), 0);
    EXPECT_EQ(zlvDoReadProps("missing", &list, &error), 0);
    EXPECT_EQ(openFiles(), before);
}

TEST_F(ZlvReadPropsFiles, APathWithBackslashesIsLocalised)
{
    std::filesystem::create_directory("sub");
    write("sub/p", "a=1\n");
    EXPECT_EQ(zlvDoReadProps("sub\\p", &list, &error), 1);
    EXPECT_EQ(list.all(), "a=1");
}

TEST_F(ZlvReadPropsFiles, APathWithoutRoomForItsLocalFormIsReported)
{
    EXPECT_EQ(zlvDoReadProps(std::string(256, 'n').c_str(), &list, &error), 0);
    EXPECT_TRUE(errorIs('p', ENAMETOOLONG));
}

// Whichever allocation fails, the read fails, nothing leaks and the error record stays.
TEST_F(ZlvReadPropsFiles, AnyFailedAllocationFailsTheRead)
{
    FailAlloc counted(UINT32_MAX);
    EXPECT_TRUE(reads("a=1\nbc=23"));
    const uint32_t allocations = counted.asked();
    EXPECT_GE(allocations, 7U); // two buffers, the array, two keys, two values
    for (uint32_t allowed = 0; allowed < allocations; ++allowed) {
        CxPropListDiscard(&list);
        FailAlloc fail(allowed);
        EXPECT_FALSE(reads("a=1\nbc=23")) << allowed;
        EXPECT_TRUE(errorUntouched());
    }
}

} // namespace
} // namespace zelvo_test
