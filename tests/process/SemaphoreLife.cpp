// SPDX-License-Identifier: Apache-2.0
// How semaphore sets come to be, and that they do not add up.
#include <sched.h>

#include "process/Records.h"
#include "process/WriterProcess.h"
#include "zelvo.h"

using namespace zelvo_test;

namespace {

constexpr int ROUNDS = 3;

class SemaphoreLife : public SharedLogTest {
protected:
    /// Opens the toolkit, logs a record to the shared file, closes the toolkit.
    void logOnce() const
    {
        ZlvOpenToolkit(nullptr, nullptr);
        ZlvObject *logger = ZlvGetObject("life.log", "zlv_basiclogger");
        ZlvObject *handler = ZlvGetObject("life.file", "zlv_multiproc_filehandler");
        ZlvSetObjProp(handler, "fileName", "shared.log");
        ZlvSetObjPropInt(handler, "MPFileSemKey", semaphore_.key());
        ZlvAddListener(logger, handler);
        ZlvLogUText(logger, u"record");
        ZlvReleaseObject(handler);
        ZlvReleaseObject(logger);
        ZlvCloseToolkit();
    }
};

/// The kernel's list of sets, each with its key, id, permissions and number of semaphores.
std::string sets()
{
    std::ifstream list("/proc/sysvipc/sem");
    std::string text;
    for (std::string line; std::getline(list, line);) {
        std::istringstream fields(line);
        std::string field;
        for (int count = 0; count < 4 && fields >> field; ++count)
            text += field + ' ';
    }
    return text;
}

/// Elsewhere sets come and go. Root needs no users of its own for it, which not every place allows.
bool seesNoSetsOfOthers()
{
    return unshare(CLONE_NEWIPC) == 0 || unshare(CLONE_NEWUSER | CLONE_NEWIPC) == 0;
}

size_t openDescriptors()
{
    const std::filesystem::directory_iterator all("/proc/self/fd");
    return static_cast<size_t>(std::distance(begin(all), end(all)));
}

} // namespace

class CreationRace : public SharedLogTest, public testing::WithParamInterface<int> {};

TEST_P(CreationRace, Of64ProcessesMakesOneFreeSemaphore)
{
    Gate gate;
    std::vector<std::unique_ptr<WriterProcess>> writers;
    for (uint32_t writer = 0; writer < MOST_WRITERS; ++writer)
        writers.push_back(std::make_unique<WriterProcess>(WRITER, jobFor(writer, 5), &gate));
    gate.open();
    for (const auto &writer : writers)
        EXPECT_EQ(writer->result(), WRITER_DONE);
    const Census census(directory(), 1);
    EXPECT_EQ(census.distinct(), MOST_WRITERS * 5);
    EXPECT_EQ(census.doubled() + census.fragments() + census.outOfOrder(), 0U);
    EXPECT_EQ(semaphore_.value(), 1);
}

INSTANTIATE_TEST_SUITE_P(Round, CreationRace, testing::Range(0, ROUNDS));

TEST_F(SemaphoreLife, AThousandOpensAndClosesLeaveOneSetAndNoDescriptor)
{
    if (!seesNoSetsOfOthers())
        GTEST_SKIP() << "no right to be alone with semaphores";
    logOnce();
    const std::string before = sets();
    const size_t descriptors = openDescriptors();
    for (int round = 1; round < 1000; ++round)
        logOnce();
    EXPECT_EQ(sets(), before);
    EXPECT_EQ(openDescriptors(), descriptors);
    EXPECT_EQ(semaphore_.value(), 1);
}
