// SPDX-License-Identifier: Apache-2.0
// A file handler whose system does not tell it about the file that it has just opened.
#include "support/FakeSystem.h"
#include "support/FileHandlerFixture.h"

// What a fake of it hands its call on to (tests/CMakeLists.txt).
extern "C" int __real_statx(int file, const char *path, int flags, unsigned wanted,
                            struct statx *facts);

namespace zelvo_test {
namespace {

class ZlvFileHandlerUnknownFile : public FileHandlerFixture {
protected:
    /// Lets the question about an open file that has this number, counted from now on, fail.
    void failQuestion(int number)
    {
        system_.statx = [number, questions = 0](int file, const char *path, int flags,
                                                unsigned wanted, struct statx *facts) mutable {
            if (*path != '\0' || ++questions != number)
                return __real_statx(file, path, flags, wanted, facts);
            errno = EIO;
            return -1;
        };
    }

    FakeSystem system_;
    FileFaults faults_;
};

TEST_F(ZlvFileHandlerUnknownFile, ThatCannotBeToldFromOthersIsMeasuredEachTime)
{
    write("app.log", "old\n");
    handler("fileName", "app.log", "maxFileSize", "10");
    failQuestion(1);
    log(u"abc");
    log(u"d");
    EXPECT_EQ(faults_.reports, 0u);
    EXPECT_EQ(vars()->currentSize, 10u);
    log(u"e");
    EXPECT_EQ(rolled(1), "old\nabc\nd\n");
}

TEST_F(ZlvFileHandlerUnknownFile, ThatCannotBeMeasuredIsNotRolledOver)
{
    write("app.log", "full");
    framedHandler("fileName", "app.log", "maxFileSize", "4");
    failQuestion(2);
    EXPECT_TRUE(succeeded(openHandler()));
    EXPECT_EQ(faults_.reports, 1u);
    EXPECT_TRUE(failedWith(faults_.reported, EIO));
    EXPECT_EQ(file("app.log"), "full[\n");
}

} // namespace
} // namespace zelvo_test
