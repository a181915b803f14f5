// SPDX-License-Identifier: Apache-2.0
// Directories where log files, or older ones, should be.
#include "Hostile.h"

namespace zelvo_test {
namespace {

class HostileDirectories : public Hostile {
protected:
    /// A directory that cannot be removed.
    static void occupy(const std::string &name)
    {
        fs::create_directory(name);
        write(name + "/content", "");
    }

    /// What the standard output gets while a record is written.
    std::string printedBy(const char16_t *record)
    {
        return console([&] { log(record); });
    }
};

TEST_F(HostileDirectories, AnEmptyOneAtTheOldestNameIsRemovedByARollover)
{
    fs::create_directory("app1.log");
    logInTurns(ALONE);
    log(u"a");
    log(u"b");
    EXPECT_EQ(rolled(1), "a\n");
    EXPECT_EQ(file("app.log"), "b\n");
}

TEST_F(HostileDirectories, AFullOneAtTheOnlyOlderNameStopsARenamingRollover)
{
    occupy("app1.log");
    logInTurns(ALONE);
    log(u"a");
    log(u"b");
    log(u"c");
    EXPECT_EQ(file("app.log"), "a\nb\nc\n");
    EXPECT_TRUE(fs::exists("app1.log/content"));
}

TEST_F(HostileDirectories, AFullOneAtTheOldestNameCostsTheFileBeforeIt)
{
    occupy("app2.log");
    logInTurns(ALONE, "maxFiles", "3");
    log(u"a");
    log(u"b");
    log(u"c");
    EXPECT_EQ(rolled(1), "b\n");
    EXPECT_EQ(file("app.log"), "c\n");
    EXPECT_TRUE(fs::exists("app2.log/content"));
}

TEST_F(HostileDirectories, OneAtAnOlderNameMovesOnLikeAFile)
{
    occupy("app1.log");
    logInTurns(ALONE, "maxFiles", "3");
    log(u"a");
    log(u"b");
    EXPECT_EQ(rolled(1), "a\n");
    EXPECT_TRUE(fs::exists("app2.log/content"));
}

TEST_F(HostileDirectories, AFullOneAtTheCopysNameCostsTheLiveFile)
{
    occupy("app1.log");
    logInTurns(SHARED);
    log(u"a");
    EXPECT_EQ(printedBy(u"b"),
              "ERR opening " + fs::current_path().string() + "/app1.log pre rollover\n");
    EXPECT_EQ(file("app.log"), "b\n");
    EXPECT_TRUE(fs::exists("app1.log/content"));
}

} // namespace
} // namespace zelvo_test
