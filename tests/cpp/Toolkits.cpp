// SPDX-License-Identifier: Apache-2.0
// The handle of the toolkit, and owned strings.
#include <cerrno>
#include <cstdio>
#include <fstream>

#include <unistd.h>

#include "CppTest.h"

namespace zelvo_test {

TEST(CppToolkit, ClosesWhatItOpened)
{
    {
        const zelvo::Toolkit toolkit;
        ASSERT_TRUE(toolkit);
        EXPECT_EQ(toolkit.error().type, CX_STATUS_OK);
        ASSERT_TRUE(zelvo::Object("app", "zlv_basiclogger"));
    }
    EXPECT_FALSE(zelvo::Object("app", "zlv_basiclogger"));
}

TEST(CppToolkit, TellsWhyItCouldNotBeOpened)
{
    const zelvo::Toolkit toolkit("no/such/file.properties");
    EXPECT_FALSE(toolkit);
    EXPECT_EQ(toolkit.error().type, CX_STATUS_PLATFORM);
    EXPECT_EQ(toolkit.error().code, ENOENT);
}

TEST(CppToolkit, ReadsAPropertiesFile)
{
    const std::string path = testing::TempDir() + "zelvo_cpp_" + std::to_string(getpid());
    std::ofstream(path) << "from.file.className = zlv_basiclogger\n";
    {
        const zelvo::Toolkit toolkit(path.c_str());
        ASSERT_TRUE(toolkit);
        EXPECT_TRUE(zelvo::Logger("from.file"));
        EXPECT_TRUE(zelvo::Config("from.file").isFromFile());
    }
    std::remove(path.c_str());
}

TEST(CppText, OwnsItsString)
{
    zelvo::String first = zelvo::String::copyOf("abcdef");
    const char *text = first.get();
    zelvo::String second = std::move(first);
    EXPECT_FALSE(first);
    EXPECT_EQ(first.view(), "");
    EXPECT_EQ(second.get(), text);
    second = zelvo::String::copyOf("");
    EXPECT_TRUE(second);
    EXPECT_EQ(second.view(), "");
    RkoMemoryFree(second.release());
    EXPECT_FALSE(second);
}

TEST(CppText, CopiesAViewAndEndsIt)
{
    const std::u16string_view view(u"abcdef", 3);
    const zelvo::UString copy = zelvo::UString::copyOf(view);
    EXPECT_EQ(copy.get(), std::u16string(u"abc"));
}

TEST(CppText, ConvertsBetweenBytesAndUtf16)
{
    EXPECT_EQ(zelvo::utf16("abc").view(), u"abc");
    EXPECT_EQ(zelvo::utf16(std::string("abc")).view(), u"abc");
    EXPECT_EQ(zelvo::bytes(u"abc").view(), "abc");
    EXPECT_EQ(zelvo::bytes(zelvo::utf16("abc")).view(), "abc");
    const char *none = nullptr;
    EXPECT_FALSE(zelvo::utf16(none));
    EXPECT_FALSE(zelvo::bytes(zelvo::UString()));
}

} // namespace zelvo_test
