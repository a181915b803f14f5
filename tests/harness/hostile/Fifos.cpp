// SPDX-License-Identifier: Apache-2.0
// FIFOs where log files should be. Log files are opened for reading and writing, so a handler is
// its own reader: opening waits for nobody. Writing does, once the FIFO is full.
#include <sched.h>
#include <sys/ioctl.h>

#include "Hostile.h"

namespace zelvo_test {
namespace {

/// Whoever reads a FIFO, from when it is made until the end of the scope.
class Reader {
public:
    explicit Reader(const char *name) : file_(::open(name, O_RDONLY | O_NONBLOCK | O_CLOEXEC)) {}
    Reader(const Reader &) = delete;
    Reader &operator=(const Reader &) = delete;
    ~Reader() { ::close(file_); }

    /// The size of the FIFO in bytes, made as small as can be.
    size_t shrink() const
    {
        const int pageSize = static_cast<int>(sysconf(_SC_PAGESIZE));
        return static_cast<size_t>(fcntl(file_, F_SETPIPE_SZ, pageSize));
    }

    size_t waiting() const
    {
        int bytes = 0;
        ioctl(file_, FIONREAD, &bytes);
        return static_cast<size_t>(bytes);
    }

    /// What waits to be read, LEAST bytes or more.
    std::string taken(size_t least = 0) const
    {
        std::string text;
        char area[4096];
        for (ssize_t count = 1; count > 0 || text.size() < least;) {
            count = ::read(file_, area, sizeof area);
            text.append(area, count > 0 ? static_cast<size_t>(count) : 0);
        }
        return text;
    }

private:
    int file_;
};

class HostileFifos : public HostileBoth {
protected:
    void SetUp() override
    {
        HostileBoth::SetUp();
        ASSERT_EQ(mkfifo("app.log", 0600), 0);
        logTo("fileName", "app.log");
    }
};

TEST_P(HostileFifos, OpeningWaitsForNobody)
{
    EXPECT_EQ(within(PATIENCE, [this] { return ok(logged(u"a")) ? 0 : 1; }), 0);
    EXPECT_TRUE(fs::is_fifo("app.log"));
}

TEST_P(HostileFifos, AReaderGetsTheRecords)
{
    const Reader reader("app.log");
    log(u"a");
    log(u"b");
    EXPECT_EQ(reader.taken(), "a\nb\n");
}

TEST_P(HostileFifos, AFullOneMakesTheRecordWaitForItsReader)
{
    const Reader reader("app.log");
    const size_t size = reader.shrink();
    const std::u16string record(size + 100, u'x');
    Child writer([&] { return ok(logged(record.c_str())) ? 0 : 1; });
    while (reader.waiting() < size)
        sched_yield();
    EXPECT_EQ(reader.taken(size + 101), std::string(size + 100, 'x') + "\n");
    EXPECT_EQ(writer.result(), 0);
}

INSTANTIATE_TEST_SUITE_P(Handlers, HostileFifos, handlerClasses, byRow);

class HostileUnreadFifos : public Hostile {
protected:
    void SetUp() override
    {
        Hostile::SetUp();
        ASSERT_EQ(mkfifo("app.log", 0600), 0);
    }
};

TEST_F(HostileUnreadFifos, AHandlerOfItsOwnOpensItForEachRecordAndLosesTheOneBefore)
{
    logTo(ALONE, "fileName", "app.log");
    log(u"a");
    log(u"b");
    EXPECT_EQ(Reader("app.log").taken(), "b\n");
}

TEST_F(HostileUnreadFifos, ASharedHandlerKeepsItOpenWithTheRecordsInIt)
{
    logTo(SHARED, "fileName", "app.log");
    log(u"a");
    log(u"b");
    EXPECT_EQ(Reader("app.log").taken(), "a\nb\n");
}

TEST_F(HostileUnreadFifos, ASharedHandlerHoldsTheSemaphoreWhileItWaits)
{
    logTo(SHARED, "fileName", "app.log");
    const Reader reader("app.log");
    const size_t size = reader.shrink();
    const std::u16string record(size, u'x');
    Child writer([&] { return ok(logged(record.c_str())) ? 0 : 1; });
    while (reader.waiting() < size)
        sched_yield();
    EXPECT_EQ(semValue(), 0);
    reader.taken(size + 1);
    EXPECT_EQ(writer.result(), 0);
    EXPECT_EQ(semValue(), 1);
}

TEST_F(HostileUnreadFifos, ARolloverRemovesOneAtAnOlderName)
{
    ASSERT_EQ(mkfifo("app1.log", 0600), 0);
    fs::remove("app.log");
    logInTurns(SHARED);
    log(u"a");
    log(u"b");
    EXPECT_EQ(rolled(1), "a\n");
}

} // namespace
} // namespace zelvo_test
