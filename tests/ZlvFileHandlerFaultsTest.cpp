// SPDX-License-Identifier: Apache-2.0
// File handlers on a real file system that fails them: the caller of the logging call learns of it,
// and logging resumes when the cause is gone.
#include "support/Child.h"
#include "support/FileHandlerFixture.h"
#include "support/Limits.h"
#include "support/Rows.h"

namespace zelvo_test {
namespace {

struct HandlerClass {
    const char *row;
    const char *name;
};

/// Faults that both handlers must take.
class ZlvFileHandlerFaults : public MultiProcFixture,
                             public testing::WithParamInterface<HandlerClass> {
protected:
    /// The handler of the row's class.
    template <class... Properties>
    void logger(Properties... properties)
    {
        useClass(GetParam().name);
        handler(properties...);
    }

    /// Has the handler close its file, so that the next record opens it.
    void reopenNext() { set("maxFiles", "1"); }
};

TEST_P(ZlvFileHandlerFaults, AFullDisk)
{
    const SmallDisk disk;
    // Mounting takes root; without it the limit on file sizes stands in, further below.
    if (!disk.isThere())
        GTEST_SKIP() << "no right to mount a file system";
    SmallDisk::fill();
    logger("fileName", "disk/app.log");
    EXPECT_TRUE(failed(logged(u"lost"), ENOSPC));
    EXPECT_TRUE(failed(logged(u"lost"), ENOSPC));
    SmallDisk::makeRoom();
    log(u"a");
    EXPECT_EQ(file("disk/app.log"), "a\n");
    closeHandler();
}

TEST_P(ZlvFileHandlerFaults, ADiskThatFillsWhileLogging)
{
    const SmallDisk disk;
    // Mounting takes root; without it the limit on file sizes stands in, further below.
    if (!disk.isThere())
        GTEST_SKIP() << "no right to mount a file system";
    logger("fileName", "disk/app.log");
    const std::u16string record(4095, u'x');
    int written = 0;
    while (ok(logged(record.c_str())))
        ++written;
    EXPECT_EQ(written, 16);
    EXPECT_TRUE(failed(logged(record.c_str()), ENOSPC));
    std::filesystem::resize_file("disk/app.log", 0);
    log(u"a");
    EXPECT_EQ(file("disk/app.log"), "a\n");
    closeHandler();
}

TEST_P(ZlvFileHandlerFaults, AFileThatMayNotGrow)
{
    logger("fileName", "app.log");
    log(u"a");
    {
        FileSizeLimit limit(2);
        EXPECT_TRUE(failed(logged(u"lost"), EFBIG));
    }
    log(u"b");
    EXPECT_EQ(file("app.log"), "a\nb\n");
}

TEST_P(ZlvFileHandlerFaults, AWriteThatIsCutShortIsNoFailure)
{
    logger("fileName", "app.log");
    FileSizeLimit limit(5);
    log(u"1234567890");
    EXPECT_EQ(file("app.log"), "12345");
    EXPECT_TRUE(failed(logged(u"lost"), EFBIG));
}

TEST_P(ZlvFileHandlerFaults, ADeviceThatIsAlwaysFull)
{
    std::filesystem::create_symlink("/dev/full", "app.log");
    logger("fileName", "app.log");
    EXPECT_TRUE(failed(logged(u"lost"), ENOSPC));
    EXPECT_TRUE(failed(logged(u"lost"), ENOSPC));
    std::filesystem::remove("app.log");
    reopenNext();
    log(u"a");
    EXPECT_EQ(file("app.log"), "a\n");
}

TEST_P(ZlvFileHandlerFaults, ADirectoryInThePlaceOfTheFile)
{
    std::filesystem::create_directory("app.log");
    logger("fileName", "app.log");
    EXPECT_TRUE(failed(logged(u"lost"), EISDIR));
    EXPECT_TRUE(failed(logged(u"lost"), EISDIR));
    std::filesystem::remove("app.log");
    log(u"a");
    EXPECT_EQ(file("app.log"), "a\n");
}

TEST_P(ZlvFileHandlerFaults, AFileInThePlaceOfTheDirectory)
{
    write("d", "");
    logger("fileName", "d/app.log");
    EXPECT_TRUE(failed(logged(u"lost"), ENOTDIR));
    std::filesystem::remove("d");
    log(u"a");
    EXPECT_EQ(file("d/app.log"), "a\n");
}

TEST_P(ZlvFileHandlerFaults, ADirectoryOfSomebodyElse)
{
    // A file that is one's own can always be opened again: this takes a second user.
    if (geteuid() != 0)
        GTEST_SKIP() << "only root can become somebody else";
    std::filesystem::permissions(".", std::filesystem::perms{0777});
    logger("fileName", "d/app.log");
    const int result = inChild([this] {
        const bool ready = becomeNobody() && std::filesystem::create_directory("d");
        std::filesystem::permissions("d", std::filesystem::perms{0500});
        const bool refused = bool(failed(logged(u"lost"), EACCES));
        std::filesystem::permissions("d", std::filesystem::perms{0700});
        return ready && refused && ok(logged(u"a")) ? 0 : 1;
    });
    EXPECT_EQ(result, 0);
    EXPECT_EQ(file("d/app.log"), "a\n");
}

TEST_P(ZlvFileHandlerFaults, NoDescriptorsLeft)
{
    logger("fileName", "app.log");
    {
        Limit limit(RLIMIT_NOFILE, nextDescriptor());
        EXPECT_TRUE(failed(logged(u"lost"), EMFILE));
    }
    log(u"a");
    EXPECT_EQ(file("app.log"), "a\n");
}

TEST_P(ZlvFileHandlerFaults, ASymbolicLinkThatLeadsNowhere)
{
    std::filesystem::create_symlink("nowhere/app.log", "app.log");
    logger("fileName", "app.log");
    EXPECT_TRUE(failed(logged(u"lost"), ENOENT));
    std::filesystem::create_directory("nowhere");
    log(u"a");
    EXPECT_EQ(file("nowhere/app.log"), "a\n");
}

TEST_P(ZlvFileHandlerFaults, ALinkToItself)
{
    std::filesystem::create_symlink("app.log", "app.log");
    logger("fileName", "app.log");
    EXPECT_TRUE(failed(logged(u"lost"), ELOOP));
    std::filesystem::remove("app.log");
    log(u"a");
    EXPECT_EQ(file("app.log"), "a\n");
}

TEST_P(ZlvFileHandlerFaults, ACallerGetsTheFailureOfEachRecordAndOfNoOther)
{
    std::filesystem::create_directory("app.log");
    logger("fileName", "app.log");
    EXPECT_TRUE(failed(logged(u"lost"), EISDIR));
    std::filesystem::remove("app.log");
    EXPECT_TRUE(ok(logged(u"a")));
    EXPECT_TRUE(ok(logged(u"b")));
}

INSTANTIATE_TEST_SUITE_P(Classes, ZlvFileHandlerFaults,
                         testing::Values(HandlerClass{"Alone", "zlv_filehandler"},
                                         HandlerClass{"Shared", "zlv_multiproc_filehandler"}),
                         byRow);

/// Faults of the open file, which the file handler alone looks for.
class ZlvFileHandlerLiveFaults : public FileHandlerFixture {
protected:
    void SetUp() override
    {
        FileHandlerFixture::SetUp();
        framedHandler("fileName", "app.log");
        log(u"a");
    }
};

TEST_F(ZlvFileHandlerLiveFaults, ADeletedFileIsMadeAgain)
{
    std::filesystem::remove("app.log");
    log(u"b");
    EXPECT_EQ(file("app.log"), "[\nb\n");
}

TEST_F(ZlvFileHandlerLiveFaults, AFileMovedAwayIsMadeAgain)
{
    std::filesystem::rename("app.log", "moved.log");
    log(u"b");
    EXPECT_EQ(file("moved.log"), "[\na\n]\n");
    EXPECT_EQ(file("app.log"), "[\nb\n");
}

TEST_F(ZlvFileHandlerLiveFaults, ADirectoryPutInItsPlaceIsAFailureUntilItIsGone)
{
    std::filesystem::rename("app.log", "moved.log");
    std::filesystem::create_directory("app.log");
    EXPECT_TRUE(failed(logged(u"lost"), EISDIR));
    EXPECT_EQ(file("moved.log"), "[\na\n]\n");
    std::filesystem::remove("app.log");
    log(u"b");
    EXPECT_EQ(file("app.log"), "[\nb\n");
}

TEST_F(ZlvFileHandlerLiveFaults, ADirectoryMovedAwayIsMadeAgain)
{
    set("fileName", "d/app.log");
    log(u"b");
    std::filesystem::rename("d", "moved");
    log(u"c");
    EXPECT_EQ(file("moved/app.log"), "[\nb\n]\n");
    EXPECT_EQ(file("d/app.log"), "[\nc\n");
}

TEST_F(ZlvFileHandlerLiveFaults, ADescriptorClosedBehindTheHandlerIsOpenedAgain)
{
    ::close(vars()->file);
    log(u"b");
    EXPECT_EQ(file("app.log"), "[\na\n[\nb\n");
}

TEST_F(ZlvFileHandlerLiveFaults, ADescriptorThatCannotBeOpenedAgainIsAFailure)
{
    std::filesystem::remove("app.log");
    ::close(vars()->file);
    std::filesystem::create_directory("app.log");
    EXPECT_TRUE(failed(logged(u"lost"), EISDIR));
    std::filesystem::remove("app.log");
    log(u"b");
    EXPECT_EQ(file("app.log"), "[\nb\n");
}

TEST_F(ZlvFileHandlerLiveFaults, AClosedDescriptorWithNoneLeftIsAFailure)
{
    const int file = vars()->file;
    ::close(file);
    {
        Limit limit(RLIMIT_NOFILE, static_cast<rlim_t>(file));
        EXPECT_TRUE(failed(logged(u"lost"), EMFILE));
    }
    log(u"b");
    EXPECT_EQ(read("app.log"), "[\na\n[\nb\n");
}

} // namespace
} // namespace zelvo_test
