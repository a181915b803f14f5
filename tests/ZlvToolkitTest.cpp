// SPDX-License-Identifier: Apache-2.0
// Opening the toolkit.
#include "support/BrokenMutex.h"
#include "support/ToolkitFixture.h"

#include "CxString.h"
#include "ZlvHandler.h"
#include "ZlvIntl.h"

namespace zelvo_test {
namespace {

class ZlvToolkit : public ToolkitFixture {
protected:
    /// The name of the formatter that a handler is bound to.
    static Text formatterOf(ZlvObject *handler)
    {
        ZlvObject *formatter = ZlvHandlerGetFormatter(handler);
        Text name = taken(ZlvGetObjectName(formatter));
        ZlvReleaseObject(formatter);
        return name;
    }

    /// Makes the registry of classes, without which a closed toolkit creates no object.
    static void makeRegistry()
    {
        ZlvAddLoggerClass("app_logger", nullptr, nullptr, nullptr, nullptr, nullptr);
    }
};

TEST_F(ZlvToolkit, OpensWithoutAFile)
{
    EXPECT_EQ(ZlvOpenToolkit(nullptr, nullptr), 1);
    EXPECT_EQ(ZLV_TK_ISOPEN, 1);
}

TEST_F(ZlvToolkit, OpeningWithoutAFileLeavesTheErrorRecordAlone)
{
    CxStatus error{'x', 77};
    EXPECT_EQ(ZlvOpenToolkit(nullptr, &error), 1);
    EXPECT_EQ(error.type, 'x');
    EXPECT_EQ(error.code, 77);
}

TEST_F(ZlvToolkit, OpeningWithAGoodFileLeavesTheErrorRecordAlone)
{
    CxStatus error{'x', 77};
    write("good.properties", "app.level=WARN\n");
    EXPECT_EQ(ZlvOpenToolkit("good.properties", &error), 1);
    EXPECT_EQ(error.type, 'x');
    EXPECT_EQ(error.code, 77);
}

TEST_F(ZlvToolkit, OpeningTwiceSucceedsTwice)
{
    open();
    EXPECT_EQ(ZlvOpenToolkit(nullptr, nullptr), 1);
    EXPECT_EQ(ZLV_TK_ISOPEN, 1);
}

TEST_F(ZlvToolkit, TheSecondOpenReadsNoFile)
{
    open("first.level=WARN\n");
    EXPECT_EQ(tryOpen("second.level=WARN\n"), 1);
    EXPECT_EQ(ZlvLogMgrHasCfg("first"), 1);
    EXPECT_EQ(ZlvLogMgrHasCfg("second"), 0);
}

TEST_F(ZlvToolkit, TheSecondOpenDoesNotMindAnUnreadableFile)
{
    open();
    CxStatus error{'x', 77};
    EXPECT_EQ(ZlvOpenToolkit("absent.properties", &error), 1);
    EXPECT_EQ(error.type, 'x');
}

TEST_F(ZlvToolkit, TheSecondOpenMakesNoNewDefaultObjects)
{
    open();
    ZlvObject *errorLog = ZLV_TK_ERROR_LOG;
    uint32_t count = errorLog->refCount;
    ZlvOpenToolkit(nullptr, nullptr);
    EXPECT_EQ(ZLV_TK_ERROR_LOG, errorLog);
    EXPECT_EQ(errorLog->refCount, count);
}

TEST_F(ZlvToolkit, AnAbsentFileFailsOpenWithTheReadersStatus)
{
    CxStatus error{'x', 77};
    EXPECT_EQ(ZlvOpenToolkit("absent.properties", &error), 0);
    EXPECT_EQ(error.type, CX_STATUS_PLATFORM);
    EXPECT_EQ(error.code, ENOENT);
}

TEST_F(ZlvToolkit, ADirectoryFailsOpenWithTheReadersStatus)
{
    CxStatus error{'x', 77};
    EXPECT_EQ(ZlvOpenToolkit(".", &error), 0);
    EXPECT_EQ(error.type, CX_STATUS_PLATFORM);
    EXPECT_EQ(error.code, EISDIR);
}

TEST_F(ZlvToolkit, AMalformedFileFailsOpenAndOverwritesTheErrorRecordWithSuccess)
{
    write("bad.properties", "x=1\n");
    CxStatus error{'x', 77};
    EXPECT_EQ(ZlvOpenToolkit("bad.properties", &error), 0);
    EXPECT_EQ(error.type, CX_STATUS_OK);
    EXPECT_EQ(error.code, 0);
}

TEST_F(ZlvToolkit, AFailedOpenAcceptsAMissingErrorRecord)
{
    EXPECT_EQ(ZlvOpenToolkit("absent.properties", nullptr), 0);
    EXPECT_EQ(ZLV_TK_ISOPEN, 0);
}

TEST_F(ZlvToolkit, AFailedOpenCanBeFollowedByAGoodOne)
{
    EXPECT_EQ(ZlvOpenToolkit("absent.properties", nullptr), 0);
    EXPECT_EQ(ZlvOpenToolkit(nullptr, nullptr), 1);
    EXPECT_NE(zlvToolkitLogger(), nullptr);
}

TEST_F(ZlvToolkit, AFailedOpenForgetsTheEntriesReadBeforeTheFault)
{
    EXPECT_EQ(tryOpen("app.level=WARN\nx=1\n"), 0);
    EXPECT_EQ(ZlvLogMgrHasCfg("app"), 0);
    open();
    EXPECT_EQ(ZlvLogMgrHasCfg("app"), 0);
}

TEST_F(ZlvToolkit, AFailedOpenForgetsTheApplicationsClasses)
{
    makeRegistry();
    EXPECT_EQ(ZlvOpenToolkit("absent.properties", nullptr), 0);
    EXPECT_EQ(zlvToolkitGetClassDef("app_logger"), nullptr);
}

TEST_F(ZlvToolkit, AFailedOpenDestroysTheObjectsMadeBefore)
{
    makeRegistry();
    ZlvGetObject("early", "app_logger");
    EXPECT_EQ(ZlvOpenToolkit("absent.properties", nullptr), 0);
    EXPECT_EQ(ZLV_TK_INSTANCES, nullptr);
}

TEST_F(ZlvToolkit, OpenFailsWithoutTheMutexAndLeavesTheErrorRecordAlone)
{
    BrokenMutex broken;
    CxStatus error{'x', 77};
    EXPECT_EQ(ZlvOpenToolkit("absent.properties", &error), 0);
    EXPECT_EQ(error.type, 'x');
    EXPECT_EQ(error.code, 77);
    EXPECT_EQ(ZLV_TK_CLASSES, nullptr);
}

TEST_F(ZlvToolkit, OpenInitialisesTheLogManager)
{
    open();
    EXPECT_EQ(ZLV_TK_LOG_MGR_INITIALIZED, 1);
    EXPECT_NE(ZLV_TK_CFG_NAMES, nullptr);
    EXPECT_NE(ZLV_TK_CFG_DATA, nullptr);
}

TEST_F(ZlvToolkit, OpenReadsTheFileIntoConfigurations)
{
    open("app.level=WARN\n");
    EXPECT_EQ(ZlvLogMgrHasCfg("app"), 1);
}

struct DefaultObject {
    const char *name;
    const char *className;
};

class ZlvToolkitDefaults : public ToolkitFixture,
                           public testing::WithParamInterface<DefaultObject> {};

TEST_P(ZlvToolkitDefaults, IsMadeByOpenWithItsClass)
{
    open();
    ZlvObject *made = object(GetParam().name);
    ASSERT_NE(made, nullptr);
    EXPECT_STREQ(made->objClass->name, GetParam().className);
}

TEST_P(ZlvToolkitDefaults, IsConfiguredByTheFile)
{
    open(std::string(GetParam().name) + ".logging=off\n");
    EXPECT_EQ(ZlvIsObjectEnabled(object(GetParam().name)), 0);
}

INSTANTIATE_TEST_SUITE_P(
    , ZlvToolkitDefaults,
    testing::Values(DefaultObject{"zelvo.errorLogger", "zlv_basiclogger"},
                    DefaultObject{"zelvo.defaultConsole", "zlv_consolehandler"},
                    DefaultObject{"zelvo.defaultFormatter", "zlv_basicformatter"}),
    [](const auto &row) { return std::string(row.param.name).substr(6); });

TEST_F(ZlvToolkit, TheErrorLoggersOnlyListenerIsTheDefaultConsole)
{
    open();
    EXPECT_EQ(listeners(object("zelvo.errorLogger")), Names{"zelvo.defaultConsole"});
}

TEST_F(ZlvToolkit, TheDefaultConsolesFormatterIsTheDefaultFormatter)
{
    open();
    EXPECT_EQ(formatterOf(object("zelvo.defaultConsole")), "zelvo.defaultFormatter");
}

TEST_F(ZlvToolkit, KeepsTheReferencesToTheDefaultObjectsThatItMade)
{
    open();
    EXPECT_EQ(object("zelvo.errorLogger")->refCount, 2u + 1u);
    EXPECT_EQ(object("zelvo.defaultConsole")->refCount, 3u + 1u) << "the logger holds one too";
    EXPECT_EQ(object("zelvo.defaultFormatter")->refCount, 3u + 1u) << "the console holds one too";
}

TEST_F(ZlvToolkit, AdoptsAnErrorLoggerMadeBeforeOpenAsItIs)
{
    makeRegistry();
    ZlvObject *mine = logger("zelvo.errorLogger", "app_logger");
    open();
    EXPECT_EQ(ZLV_TK_ERROR_LOG, mine);
    EXPECT_EQ(listeners(mine), Names{});
    EXPECT_EQ(zlvToolkitGetObjInstance("zelvo.defaultConsole"), nullptr);
}

TEST_F(ZlvToolkit, AConsoleMadeBeforeOpenListensAndKeepsItsFormatter)
{
    makeRegistry();
    ZlvObject *console = handler("zelvo.defaultConsole");
    ZlvHandlerSetFormatter(console, formatter("mine"));
    open();
    EXPECT_EQ(listeners(object("zelvo.errorLogger")), Names{"zelvo.defaultConsole"});
    EXPECT_EQ(formatterOf(console), "mine");
}

TEST_F(ZlvToolkit, AConsoleMadeByOpenGetsTheDefaultFormatterWhateverItsConfigurationSays)
{
    open("zelvo.defaultConsole.formatterName=other\n"
         "other.className=zlv_basicformatter\n");
    EXPECT_EQ(formatterOf(object("zelvo.defaultConsole")), "zelvo.defaultFormatter");
}

TEST_F(ZlvToolkit, AConsoleMadeByTheErrorLoggersConfigurationListensOnceAndKeepsItsFormatter)
{
    open("zelvo.errorLogger.listenerNames=zelvo.defaultConsole\n"
         "zelvo.defaultConsole.className=zlv_consolehandler\n"
         "zelvo.defaultConsole.formatterName=other\n"
         "other.className=zlv_basicformatter\n");
    EXPECT_EQ(listeners(object("zelvo.errorLogger")), Names{"zelvo.defaultConsole"});
    EXPECT_EQ(formatterOf(object("zelvo.defaultConsole")), "other");
}

TEST_F(ZlvToolkit, TheConsoleFollowsTheListenersThatTheErrorLoggersConfigurationNames)
{
    open("zelvo.errorLogger.listenerNames=first\nfirst.className=zlv_consolehandler\n");
    EXPECT_EQ(listeners(object("zelvo.errorLogger")), (Names{"first", "zelvo.defaultConsole"}));
}

TEST_F(ZlvToolkit, HasNoLoggerBeforeOpen)
{
    EXPECT_EQ(zlvToolkitLogger(), nullptr);
}

TEST_F(ZlvToolkit, ItsLoggerIsTheErrorLoggerWhileOpen)
{
    open();
    ZlvObject *errorLog = object("zelvo.errorLogger");
    uint32_t count = errorLog->refCount;
    EXPECT_EQ(zlvToolkitLogger(), errorLog);
    EXPECT_EQ(errorLog->refCount, count) << "no reference goes with it";
}

TEST_F(ZlvToolkit, HasNoLoggerAfterClose)
{
    open();
    close();
    EXPECT_EQ(zlvToolkitLogger(), nullptr);
}

TEST_F(ZlvToolkit, HasNoLoggerAfterAFailedOpen)
{
    EXPECT_EQ(ZlvOpenToolkit("absent.properties", nullptr), 0);
    EXPECT_EQ(zlvToolkitLogger(), nullptr);
}

} // namespace
} // namespace zelvo_test
