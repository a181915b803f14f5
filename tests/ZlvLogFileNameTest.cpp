// SPDX-License-Identifier: Apache-2.0
// How the names of log files are taken apart and put together.
#include "ZlvFileHandler.h"

#include <memory>

#include "support/FailAlloc.h"
#include "support/FileFaults.h"
#include "support/Rows.h"
#include "support/TestDir.h"
#include "support/Text.h"

namespace zelvo_test {
namespace {

/// Variables to split names into.
class Parts {
public:
    explicit Parts(const char *name) { split(name); }
    Parts(const Parts &) = delete;
    Parts &operator=(const Parts &) = delete;
    ~Parts() { split(nullptr); }

    void split(const char *name) { zlvFHGetFileNameParts(name, &vars_); }

    Text directory() const { return peeked(vars_.directory); }
    Text base() const { return peeked(vars_.base); }
    int number() const { return vars_.number; }
    Text extension() const { return peeked(vars_.extension); }
    Text composed() const
    {
        return taken(
            zlvSetFileNameParts(vars_.directory, vars_.base, vars_.number, vars_.extension));
    }
    bool isEmpty() const
    {
        return !directory() && !base() && !extension() && number() == 0 && !composed();
    }

private:
    FileHandlerVars vars_{};
};

std::string cwd()
{
    return std::filesystem::current_path().string();
}

const std::string longBase(251, 'a');
constexpr const char *here = nullptr; // the working directory

struct NameForm {
    const char *row;
    std::string name;
    const char *directory;
    std::string base;
    int number;
    Text extension;
    std::string composed; // behind the working directory, where that is the directory
};

class ZlvLogFileNameForms : public TestDir, public testing::WithParamInterface<NameForm> {};

TEST_P(ZlvLogFileNameForms, AreSplitAndComposedAgain)
{
    const NameForm &form = GetParam();
    Parts parts(form.name.c_str());
    EXPECT_EQ(parts.directory(), form.directory ? form.directory : cwd());
    EXPECT_EQ(parts.base(), form.base);
    EXPECT_EQ(parts.number(), form.number);
    EXPECT_EQ(parts.extension(), form.extension);
    EXPECT_EQ(parts.composed(), (form.directory ? "" : cwd()) + form.composed);
}

INSTANTIATE_TEST_SUITE_P(
    Rows, ZlvLogFileNameForms,
    testing::Values(
        NameForm{"Plain", "run.txt", here, "run", 0, "txt", "/run.txt"},
        NameForm{"DigitsBeforeTheDot", "app2.log", here, "app", 2, "log", "/app2.log"},
        NameForm{"SeveralDigits", "app1234.log", here, "app", 1234, "log", "/app1234.log"},
        NameForm{"LeadingZeros", "app007.log", here, "app", 7, "log", "/app7.log"},
        NameForm{"NumberZero", "app0.log", here, "app", 0, "log", "/app.log"},
        NameForm{"NothingButDigits", "12.log", here, "", 12, "log", "/12.log"},
        NameForm{"DigitsInTheMiddle", "a1b.log", here, "a1b", 0, "log", "/a1b.log"},
        NameForm{"AMinusIsNoSign", "app-5.log", here, "app-", 5, "log", "/app-5.log"},
        NameForm{"BeyondThirtyTwoBits", "app4294967298.log", here, "app", 2, "log", "/app2.log"},
        NameForm{"NoDot", "app", here, "app", 0, {}, "/app"},
        NameForm{"NoDotButDigits", "app12", here, "app", 12, {}, "/app12"},
        NameForm{"TwoDots", "a.b.log", here, "a.b", 0, "log", "/a.b.log"},
        NameForm{"TrailingDot", "app.", here, "app", 0, "", "/app."},
        NameForm{"TrailingDotAfterADigit", "app3.", here, "app", 3, "", "/app3."},
        NameForm{"NothingButAnExtension", ".log", here, "", 0, "log", "/.log"},
        NameForm{"NothingButADot", ".", here, "", 0, "", "/."},
        NameForm{"Empty", "", here, "", 0, {}, "/"},
        NameForm{"Relative", "logs/run.txt", "logs", "/run", 0, "txt", "logs//run.txt"},
        NameForm{"Backslash", "logs\\run.txt", "logs", "/run", 0, "txt", "logs//run.txt"},
        NameForm{"BothSeparators", "a\\b/c\\d.txt", "a/b/c", "/d", 0, "txt", "a/b/c//d.txt"},
        NameForm{"Parent", "../run.txt", "..", "/run", 0, "txt", "..//run.txt"},
        NameForm{"Absolute", "/var/log/app.log", "/var/log", "/app", 0, "log", "/var/log//app.log"},
        NameForm{"AbsoluteWithNumber", "/var/log/app2.log", "/var/log", "/app", 2, "log",
                 "/var/log//app2.log"},
        NameForm{"UnderTheRoot", "/x.log", here, "/x", 0, "log", "//x.log"},
        NameForm{"Root", "/", here, "/", 0, {}, "//"},
        NameForm{"TrailingSeparator", "dir/", "dir", "/", 0, {}, "dir//"},
        NameForm{"NothingButDigitsInADirectory", "dir/9.log", "dir", "/", 9, "log", "dir//9.log"},
        NameForm{"DigitsOfADirectory", "dir2/app.log", "dir2", "/app", 0, "log", "dir2//app.log"},
        NameForm{"DotInADirectoryAndName", "v1.2/app.log", "v1.2", "/app", 0, "log",
                 "v1.2//app.log"},
        NameForm{"DotInADirectoryAlone", "v1.2/app", here, "v", 1, "2/app", "/v1.2/app"},
        NameForm{"DotInADirectoryBehindABackslash", "a\\v.2\\app", "a", "/v", 0, "2/app",
                 "a//v.2/app"},
        NameForm{"Of255Bytes", longBase + ".log", here, longBase, 0, "log",
                 "/" + longBase + ".log"},
        NameForm{"Of256Bytes", longBase + "a.log", here, longBase + "a", 0, "log",
                 "/" + longBase + "a.log"},
        NameForm{"Of256BytesWithNumber", longBase + "7.log", here, longBase, 7, "log",
                 "/" + longBase + "7.log"}),
    byRow);

using ZlvLogFileName = TestDir;

TEST_F(ZlvLogFileName, Of257BytesHasNoParts)
{
    EXPECT_TRUE(Parts((longBase + "aa.log").c_str()).isEmpty());
}

TEST_F(ZlvLogFileName, ThatIsAbsentHasNoParts)
{
    EXPECT_TRUE(Parts(nullptr).isEmpty());
}

TEST_F(ZlvLogFileName, SplittingReplacesTheFormerParts)
{
    Parts parts("logs/app7.txt");
    parts.split("run");
    EXPECT_EQ(parts.composed(), cwd() + "/run");
    parts.split(nullptr);
    EXPECT_TRUE(parts.isEmpty());
}

TEST_F(ZlvLogFileName, SplittingIntoNothingIsHarmless)
{
    zlvFHGetFileNameParts("app.log", nullptr);
}

TEST_F(ZlvLogFileName, SplittingGivesAllPartsOrNone)
{
    for (uint32_t allowed = 0;; ++allowed) {
        Parts parts(nullptr);
        FailAlloc fail(allowed, FailAlloc::Once);
        parts.split("app2.log");
        if (fail.failed() == 0)
            break;
        EXPECT_TRUE(parts.isEmpty()) << "after " << allowed;
    }
}

TEST_F(ZlvLogFileName, AWorkingDirectoryThatIsGoneIsReportedAndLeftOut)
{
    std::filesystem::create_directory("gone");
    std::filesystem::current_path("gone");
    std::filesystem::remove("../gone");
    FileFaults faults;
    Parts parts("app.log");
    EXPECT_EQ(parts.directory(), std::nullopt);
    EXPECT_EQ(parts.composed(), "app.log");
    EXPECT_EQ(faults.reports, 1u);
    EXPECT_EQ(faults.reported.code, ENOENT);
}

TEST_F(ZlvLogFileName, AWorkingDirectoryBeyond256BytesIsReportedAndLeftOut)
{
    for (int depth = 0; depth < 2; ++depth) {
        std::filesystem::create_directory(std::string(200, 'd'));
        std::filesystem::current_path(std::string(200, 'd'));
    }
    FileFaults faults;
    Parts parts("app.log");
    EXPECT_EQ(parts.directory(), std::nullopt);
    EXPECT_EQ(faults.reports, 1u);
    EXPECT_EQ(faults.reported.code, ERANGE);
}

struct Composition {
    const char *row;
    const char *directory;
    const char *base;
    int32_t number;
    const char *extension;
    Text name;
};

class ZlvLogFileNameCompositions : public testing::TestWithParam<Composition> {};

TEST_P(ZlvLogFileNameCompositions, AreAsStated)
{
    const Composition &of = GetParam();
    EXPECT_EQ(taken(zlvSetFileNameParts(of.directory, of.base, of.number, of.extension)), of.name);
}

INSTANTIATE_TEST_SUITE_P(
    Rows, ZlvLogFileNameCompositions,
    testing::Values(Composition{"All", "/var/log", "/app", 2, "log", "/var/log//app2.log"},
                    Composition{"NumberZero", "/var/log", "/app", 0, "log", "/var/log//app.log"},
                    Composition{"NoDirectory", nullptr, "app", 1, "log", "app1.log"},
                    Composition{"EmptyDirectory", "", "app", 1, "log", "/app1.log"},
                    Composition{"NoExtension", "d", "app", 3, nullptr, "d/app3"},
                    Composition{"EmptyExtension", "d", "app", 3, "", "d/app3."},
                    Composition{"NoBase", "d", nullptr, 3, "log", {}},
                    Composition{"EmptyBase", "d", "", 3, "log", "d/3.log"},
                    Composition{"Nothing", nullptr, nullptr, 0, nullptr, {}},
                    Composition{"LargestNumber", "d", "a", INT32_MAX, "log", "d/a2147483647.log"},
                    Composition{"NegativeNumber", "d", "a", -1, "log", "d/a-1.log"}),
    byRow);

TEST(ZlvLogFileNameComposing, GivesNothingWithoutMemory)
{
    FailAlloc fail(0);
    EXPECT_EQ(taken(zlvSetFileNameParts("d", "app", 1, "log")), std::nullopt);
    EXPECT_GT(fail.failed(), 0u);
}

struct TrailingDigit {
    const char *row;
    const char *name;
    int32_t index;
};

class ZlvLogFileNameTrailingDigits : public testing::TestWithParam<TrailingDigit> {};

/// The name stands in memory of exactly its size, so that no byte outside it is read unseen.
TEST_P(ZlvLogFileNameTrailingDigits, AreFound)
{
    const char *name = GetParam().name;
    const size_t size = name ? std::string(name).size() + 1 : 0;
    const std::unique_ptr<char[]> copy(name ? new char[size] : nullptr);
    if (name)
        std::copy(name, name + size, copy.get());
    EXPECT_EQ(zlvFHTrailingBaseDigit(copy.get()), GetParam().index);
}

INSTANTIATE_TEST_SUITE_P(Rows, ZlvLogFileNameTrailingDigits,
                         testing::Values(TrailingDigit{"BeforeTheDot", "app2.log", 3},
                                         TrailingDigit{"LastOfSeveral", "app10.log", 4},
                                         TrailingDigit{"NoneBeforeTheDot", "app.log", -1},
                                         TrailingDigit{"OnlyInTheExtension", "app.7", -1},
                                         TrailingDigit{"BeforeTheLastDot", "a1.b2.log", 4},
                                         TrailingDigit{"OnlyBeforeAnEarlierDot", "a1.b.log", -1},
                                         TrailingDigit{"AtTheEnd", "app2", 3},
                                         TrailingDigit{"NoneAtTheEnd", "app", -1},
                                         TrailingDigit{"TrailingDot", "app2.", 3},
                                         TrailingDigit{"NothingButADigit", "2", 0},
                                         TrailingDigit{"NothingBeforeTheDot", ".log", -1},
                                         TrailingDigit{"Empty", "", -1},
                                         TrailingDigit{"DotInADirectory", "v1.2/app", 1},
                                         TrailingDigit{"Absent", nullptr, -1}),
                         byRow);

struct NativePath {
    const char *row;
    const char *name;
    size_t size;
    Text copied;
};

class ZlvLogFileNameNativePaths : public testing::TestWithParam<NativePath> {};

TEST_P(ZlvLogFileNameNativePaths, AreCopied)
{
    char copy[16] = "before";
    const ZlvBool copied = zlvGetNativePath(GetParam().name, copy, GetParam().size);
    EXPECT_EQ(copied, GetParam().copied ? 1 : 0);
    EXPECT_EQ(std::string(copy), GetParam().copied.value_or("before"));
}

INSTANTIATE_TEST_SUITE_P(Rows, ZlvLogFileNameNativePaths,
                         testing::Values(NativePath{"Slashes", "a/b.log", 16, "a/b.log"},
                                         NativePath{"Backslashes", "\\a\\b.log", 16, "/a/b.log"},
                                         NativePath{"ThatJustFit", "a\\b", 4, "a/b"},
                                         NativePath{"WithoutRoomForTheTerminator", "a\\b", 3, {}},
                                         NativePath{"WithoutAnyRoom", "", 0, {}},
                                         NativePath{"ThatAreEmpty", "", 1, ""},
                                         NativePath{"ThatAreAbsent", nullptr, 16, {}}),
                         byRow);

TEST(ZlvLogFileNameNativePath, NeedsADestination)
{
    EXPECT_EQ(zlvGetNativePath("a", nullptr, 16), 0);
}

} // namespace
} // namespace zelvo_test
