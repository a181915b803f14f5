// SPDX-License-Identifier: Apache-2.0
// Log files that are replaced between two records. What stands in their place is looked at by the
// handler of its own before each record, by the shared one never.
#include "Hostile.h"

namespace zelvo_test {
namespace {

class HostileReplaced : public HostileBoth {
protected:
    void SetUp() override
    {
        HostileBoth::SetUp();
        logTo("fileName", "app.log");
        log(u"a");
        fs::rename("app.log", "former.log");
    }
};

TEST_P(HostileReplaced, ByAnotherFileWritesGoOnInTheOneThatWasOpened)
{
    write("app.log", "f\n");
    log(u"b");
    EXPECT_EQ(file("app.log"), "f\n");
    EXPECT_EQ(file("former.log"), "a\nb\n");
}

TEST_P(HostileReplaced, ByALinkWritesGoOnInTheOneThatWasOpened)
{
    fs::create_symlink(write("victim", "v\n"), "app.log");
    log(u"b");
    EXPECT_EQ(file("victim"), "v\n");
    EXPECT_EQ(file("former.log"), "a\nb\n");
}

TEST_P(HostileReplaced, ByALinkTheNextOpeningFollowsIt)
{
    fs::create_symlink(write("victim", "v\n"), "app.log");
    closeFile();
    log(u"b");
    EXPECT_EQ(file("victim"), "v\nb\n");
}

INSTANTIATE_TEST_SUITE_P(Handlers, HostileReplaced, handlerClasses, byRow);

/// What the two classes do differently.
class HostileReplacedOtherwise : public Hostile {
protected:
    void logAndMoveAway(const char *className)
    {
        logTo(className, "fileName", "app.log");
        log(u"a");
        fs::rename("app.log", "former.log");
    }
};

TEST_F(HostileReplacedOtherwise, ByADirectoryAHandlerOfItsOwnFailsEachRecord)
{
    logAndMoveAway(ALONE);
    fs::create_directory("app.log");
    EXPECT_TRUE(failed(logged(u"lost"), EISDIR));
    EXPECT_EQ(file("former.log"), "a\n");
}

TEST_F(HostileReplacedOtherwise, ByADanglingLinkAHandlerOfItsOwnFollowsIt)
{
    logAndMoveAway(ALONE);
    fs::create_symlink("elsewhere", "app.log");
    log(u"b");
    EXPECT_EQ(file("elsewhere"), "b\n");
}

TEST_F(HostileReplacedOtherwise, ByAFifoAHandlerOfItsOwnWritesIntoIt)
{
    logAndMoveAway(ALONE);
    ASSERT_EQ(mkfifo("app.log", 0600), 0);
    EXPECT_EQ(within(PATIENCE, [this] { return ok(logged(u"b")) ? 0 : 1; }), 0);
    EXPECT_EQ(file("former.log"), "a\n");
}

TEST_F(HostileReplacedOtherwise, ByAnythingASharedHandlerGoesOnInTheOneThatWasOpened)
{
    logAndMoveAway(SHARED);
    fs::create_directory("app.log");
    log(u"b");
    EXPECT_EQ(file("former.log"), "a\nb\n");
}

} // namespace
} // namespace zelvo_test
