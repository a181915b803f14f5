// SPDX-License-Identifier: Apache-2.0
// Symbolic and hard links where log files should be.
#include "Hostile.h"

namespace zelvo_test {
namespace {

class HostileLinks : public HostileBoth {};

TEST_P(HostileLinks, ALinkIsFollowed)
{
    fs::create_symlink(write("target", "t\n"), "app.log");
    logTo("fileName", "app.log");
    log(u"a");
    EXPECT_EQ(file("target"), "t\na\n");
    EXPECT_TRUE(isLink("app.log"));
}

TEST_P(HostileLinks, ADanglingLinkMakesTheFileItLeadsTo)
{
    fs::create_symlink("target", "app.log");
    logTo("fileName", "app.log");
    log(u"a");
    EXPECT_EQ(file("target"), "a\n");
}

TEST_P(HostileLinks, ALinkToADirectoryIsFollowed)
{
    fs::create_directory("real");
    fs::create_symlink("real", "d");
    logTo("fileName", "d/app.log");
    log(u"a");
    EXPECT_EQ(file("real/app.log"), "a\n");
}

TEST_P(HostileLinks, ADanglingLinkToADirectoryMakesNone)
{
    fs::create_symlink("real", "d");
    logTo("fileName", "d/app.log");
    EXPECT_TRUE(failed(logged(u"lost"), ENOENT));
    EXPECT_FALSE(fs::exists("real"));
}

TEST_P(HostileLinks, ALinkToTheLogOfAnotherHandlerSharesIt)
{
    fs::create_symlink("app.log", "other.log");
    logTo("fileName", "app.log");
    log(u"a");
    ZlvObject *other = object("other", GetParam().name);
    ZlvHandlerSetFormatter(other, formatter("plain", LineFormatter::plain));
    setProp(other, "MPFileSemKey", std::to_string(key_).c_str());
    setProp(other, "fileName", "other.log");
    ZlvAddListener(app_, other);
    log(u"b");
    EXPECT_EQ(file("app.log"), "a\nb\nb\n");
}

TEST_P(HostileLinks, AHardLinkSharesItsContent)
{
    fs::create_hard_link(write("other", "t\n"), "app.log");
    logTo("fileName", "app.log");
    log(u"a");
    EXPECT_EQ(file("other"), "t\na\n");
}

INSTANTIATE_TEST_SUITE_P(Handlers, HostileLinks, handlerClasses, byRow);

/// Rollovers, which the two classes do differently.
class HostileRolledLinks : public Hostile {};

TEST_F(HostileRolledLinks, ARenamingRolloverRenamesTheLinkItself)
{
    fs::create_symlink("target", "app.log");
    logInTurns(ALONE);
    log(u"a");
    log(u"b");
    EXPECT_TRUE(isLink("app1.log"));
    EXPECT_FALSE(isLink("app.log"));
    EXPECT_EQ(file("target"), "a\n");
    EXPECT_EQ(file("app.log"), "b\n");
}

TEST_F(HostileRolledLinks, ACopyingRolloverEmptiesWhatTheLinkLeadsTo)
{
    fs::create_symlink("target", "app.log");
    logInTurns(SHARED);
    log(u"a");
    log(u"b");
    EXPECT_EQ(rolled(1), "a\n");
    EXPECT_EQ(file("target"), "b\n");
}

TEST_F(HostileRolledLinks, ARenamingRolloverReplacesALinkAtAnOlderName)
{
    fs::create_symlink(write("victim", "v\n"), "app1.log");
    logInTurns(ALONE);
    log(u"a");
    log(u"b");
    EXPECT_EQ(rolled(1), "a\n");
    EXPECT_EQ(file("victim"), "v\n");
}

TEST_F(HostileRolledLinks, ACopyingRolloverReplacesALinkAtAnOlderName)
{
    fs::create_symlink(write("victim", "v\n"), "app1.log");
    logInTurns(SHARED);
    log(u"a");
    log(u"b");
    EXPECT_EQ(rolled(1), "a\n");
    EXPECT_EQ(file("victim"), "v\n");
}

TEST_F(HostileRolledLinks, ACopyingRolloverMovesALinkThatHasAnOlderNameLeft)
{
    fs::create_symlink(write("victim", "v\n"), "app1.log");
    logInTurns(SHARED, "maxFiles", "3");
    log(u"a");
    log(u"b");
    EXPECT_EQ(rolled(1), "a\n");
    EXPECT_TRUE(isLink("app2.log"));
    EXPECT_EQ(file("victim"), "v\n");
}

TEST_F(HostileRolledLinks, ARenamingRolloverLeavesAHardLinkItsContent)
{
    fs::create_hard_link(write("other", ""), "app.log");
    logInTurns(ALONE);
    log(u"a");
    log(u"b");
    EXPECT_EQ(file("other"), "a\n");
}

TEST_F(HostileRolledLinks, ACopyingRolloverEmptiesEveryHardLink)
{
    fs::create_hard_link(write("other", ""), "app.log");
    logInTurns(SHARED);
    log(u"a");
    log(u"b");
    EXPECT_EQ(file("other"), "b\n");
}

TEST_F(HostileRolledLinks, AHandlerBehindALinkGoesOnInTheFileThatAnotherOneRolledAway)
{
    fs::create_symlink("app.log", "other.log");
    logInTurns(ALONE, "maxFileBytes", "4");
    ZlvObject *other = object("other", ALONE);
    ZlvHandlerSetFormatter(other, formatter("plain", LineFormatter::plain));
    setProp(other, "fileName", "other.log");
    ZlvAddListener(app_, other);
    log(u"a");
    log(u"b");
    EXPECT_EQ(file("app.log"), "b\n");
    EXPECT_EQ(rolled(1), "a\na\nb\n");
}

} // namespace
} // namespace zelvo_test
