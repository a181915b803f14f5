// SPDX-License-Identifier: Apache-2.0
// Names of log files that lead elsewhere, are too long, or hold what names seldom hold.
#include "Hostile.h"

namespace zelvo_test {
namespace {

/// The longest path that calls on files take.
constexpr size_t LONGEST = 255;

/// A name in a directory, composed to a path of LENGTH bytes: the handler puts a '/' of its own
/// between the two.
std::string nameForPathOf(size_t length)
{
    const std::string directory(length / 2, 'd');
    return directory + "/" + std::string(length - directory.size() - sizeof "//.log" + 1, 'n') +
           ".log";
}

class HostileNames : public HostileBoth {
protected:
    void name(const std::string &name) { logTo("fileName", name.c_str()); }
};

TEST_P(HostileNames, ALineFeedIsPartOfTheName)
{
    name("a\nb.log");
    log(u"a");
    EXPECT_EQ(file("a\nb.log"), "a\n");
}

TEST_P(HostileNames, AFormatIsPartOfTheName)
{
    name("%s%n.log");
    log(u"a");
    EXPECT_EQ(file("%s%n.log"), "a\n");
}

TEST_P(HostileNames, APathOf255BytesIsOpened)
{
    name(nameForPathOf(LONGEST));
    log(u"a");
    EXPECT_EQ(file(nameForPathOf(LONGEST)), "a\n");
}

TEST_P(HostileNames, APathOf256BytesIsRefused)
{
    name(nameForPathOf(LONGEST + 1));
    EXPECT_TRUE(failed(logged(u"lost"), ENAMETOOLONG));
}

TEST_P(HostileNames, ANameOf256BytesIsRefused)
{
    name(std::string(256, 'n'));
    EXPECT_TRUE(failed(logged(u"lost"), ENAMETOOLONG));
}

TEST_P(HostileNames, TwoDotsLeadOutOfADirectory)
{
    fs::create_directory("d");
    name("d/../app.log");
    log(u"a");
    EXPECT_EQ(file("app.log"), "a\n");
}

TEST_P(HostileNames, TwoDotsBehindAMissingDirectoryOpenTheOneTheyLeadTo)
{
    permit(0700);
    name("new/../app.log");
    log(u"a");
    EXPECT_EQ(file("app.log"), "a\n");
    EXPECT_EQ(modeOf("."), 0771U); // made to be the directory of the file
}

INSTANTIATE_TEST_SUITE_P(Handlers, HostileNames, handlerClasses, byRow);

/// What the two classes do differently.
class HostileLongNames : public Hostile {
protected:
    void name(const char *className, const std::string &name)
    {
        logTo(className, "fileName", name.c_str(), "maxFileBytes", "2", "maxFiles", "2");
    }
};

TEST_F(HostileLongNames, AHandlerOfItsOwnFailsEachRecordForANameBeyond256Bytes)
{
    name(ALONE, std::string(257, 'n'));
    EXPECT_TRUE(failed(logged(u"lost"), EBADF));
    name(ALONE, std::string(4096, 'n'));
    EXPECT_TRUE(failed(logged(u"lost"), EBADF));
}

TEST_F(HostileLongNames, ASharedHandlerDropsEachRecordForANameBeyond256BytesAndSaysNothing)
{
    name(SHARED, std::string(4096, 'n'));
    log(u"lost");
    EXPECT_TRUE(fs::is_empty("."));
}

TEST_F(HostileLongNames, AFileWhoseOlderNameIsTooLongGrows)
{
    name(ALONE, nameForPathOf(LONGEST));
    log(u"a");
    log(u"b");
    EXPECT_EQ(file(nameForPathOf(LONGEST)), "a\nb\n");
}

TEST_F(HostileLongNames, AFileWhoseCopysNameIsTooLongIsEmptied)
{
    name(SHARED, nameForPathOf(LONGEST));
    log(u"a");
    const std::string printed = console([&] { log(u"b"); });
    EXPECT_TRUE(printed.starts_with("ERR opening ")) << printed;
    EXPECT_EQ(file(nameForPathOf(LONGEST)), "b\n");
}

} // namespace
} // namespace zelvo_test
