// SPDX-License-Identifier: Apache-2.0
// What a logging call returns, what it records of its source, and what refuses it.
#include "ZlvLogger.h"

#include "support/BrokenMutex.h"
#include "support/Bundles.h"
#include "support/FailAlloc.h"
#include "support/Recorder.h"
#include "support/VaList.h"

namespace zelvo_test {
namespace {

using Properties = std::map<std::string, std::string>;

class ZlvLogging : public RecordedToolkit {
protected:
    static void expectNoError(const ZlvStatus &status)
    {
        EXPECT_EQ(status.type, '-');
        EXPECT_EQ(status.code, 0);
        EXPECT_EQ(status.icuError, 0);
    }

    /// The properties of the one event that was logged.
    static Properties loggedProperties()
    {
        EXPECT_EQ(records().size(), 1u);
        return records().empty() ? Properties{} : records()[0].properties;
    }
};

/* What refuses a call. */

TEST_F(ZlvLogging, ACallOnAnObjectOfAnotherKindIsRefusedSilently)
{
    ZlvObject *parent = handler("parent", Recorder::className);
    ZlvAddListener(parent, recorder_);
    expectNoError(ZlvLogUText(parent, u"text"));
    expectNoError(ZlvLogUMsg(parent, nullptr, nullptr));
    EXPECT_TRUE(records().empty());
}

TEST_F(ZlvLogging, ACallWithoutALogFunctionIsRefusedSilently)
{
    ZlvAddLoggerClass("test_bare", nullptr, nullptr, nullptr, nullptr, nullptr);
    ZlvObject *bare = logger("bare", "test_bare");
    ZlvAddListener(bare, recorder_);
    bare->objClass->logger.fLog = nullptr;
    expectNoError(ZlvLogUText(bare, u"text"));
    expectNoError(ZlvLogError(bare, nullptr, nullptr));
    EXPECT_TRUE(records().empty());
}

TEST_F(ZlvLogging, ACallIsRefusedSilentlyWhenTheMutexCannotBeTaken)
{
    Recorder::leave({'p', 28});
    {
        BrokenMutex broken;
        expectNoError(ZlvLogUText(app_, u"text"));
        expectNoError(ZlvLogError(app_, nullptr, nullptr));
    }
    EXPECT_TRUE(records().empty());
}

TEST_F(ZlvLogging, ACallWhoseEventCannotBeMadeIsRefusedSilently)
{
    Recorder::leave({'p', 28});
    FailAlloc fail(0);
    expectNoError(ZlvLogUText(app_, u"text"));
    expectNoError(ZlvLogError(app_, nullptr, nullptr));
    EXPECT_EQ(fail.failed(), 2u);
    EXPECT_TRUE(records().empty());
}

TEST_F(ZlvLogging, ACallWhoseMessageCannotBeMadeStillDispatches)
{
    FailAlloc fail(1, FailAlloc::Once);
    expectNoError(ZlvLogError(app_, bundlePath, "plain"));
    EXPECT_EQ(fail.failed(), 1u);
    ASSERT_EQ(records().size(), 1u);
    EXPECT_EQ(records()[0].text, UText{});
}

TEST_F(ZlvLogging, TheEntriesRefuseNullAndDisabledLoggersSilently)
{
    expectNoError(zlvLogUMessageEntry(nullptr, 7000, "bundle", "key", noArgs()));
    expectNoError(zlvLogUDebugEntry(nullptr, 7000, "file", "function", 1, u"text", noArgs()));
    ZlvSetObjectEnabled(app_, 0);
    expectNoError(zlvLogUMessageEntry(app_, 7000, "bundle", "key", noArgs()));
    expectNoError(zlvLogUDebugEntry(app_, 7000, "file", "function", 1, u"text", noArgs()));
    EXPECT_TRUE(records().empty());
}

TEST_F(ZlvLogging, TheEntriesTakeNoLockAndTestNoLevel)
{
    setProp(app_, "level", "OFF");
    ASSERT_EQ(zlvAPIMutexLock(), 1);
    zlvLogUMessageEntry(app_, 1, bundlePath, "plain", noArgs());
    zlvLogUDebugEntry(app_, 2, nullptr, nullptr, 0, u"debug", noArgs());
    zlvAPIMutexUnlock();
    ASSERT_EQ(records().size(), 2u);
    EXPECT_EQ(records()[0].level, 1);
    EXPECT_EQ(records()[0].text, u"Service halted");
    EXPECT_EQ(records()[1].level, 2);
    EXPECT_EQ(records()[1].text, u"debug");
}

/* The result. */

TEST_F(ZlvLogging, ACallThatGoesWellReturnsNoError)
{
    expectNoError(ZlvLogUText(app_, u"text"));
    expectNoError(ZlvLogError(app_, bundlePath, "plain"));
    EXPECT_EQ(records().size(), 2u);
}

TEST_F(ZlvLogging, ReturnsTheStatusThatAHandlerLeftInTheEvent)
{
    Recorder::leave({'p', 28});
    ZlvStatus message = ZlvLogError(app_, bundlePath, "plain");
    EXPECT_EQ(message.type, 'p');
    EXPECT_EQ(message.code, 28);
    EXPECT_EQ(message.icuError, 0);
    ZlvStatus text = ZlvLogUText(app_, u"text");
    EXPECT_EQ(text.type, 'p');
    EXPECT_EQ(text.code, 28);
}

TEST_F(ZlvLogging, ReturnsTheErrorThatBindingTheMessageLeft)
{
    ZlvStatus status = ZlvLogError(app_, bundlePath, "no such key");
    EXPECT_EQ(status.type, '-');
    EXPECT_EQ(status.code, 0);
    EXPECT_EQ(status.icuError, 2);
}

TEST_F(ZlvLogging, ReturnsBothErrorsAtOnce)
{
    Recorder::leave({'p', 5});
    ZlvStatus status = ZlvLogError(app_, bundlePath, "no such key");
    EXPECT_EQ(status.type, 'p');
    EXPECT_EQ(status.code, 5);
    EXPECT_EQ(status.icuError, 2);
}

/* The source of a debug event. */

TEST_F(ZlvLogging, RecordsSourceFileLineAndFunction)
{
    ZlvLogDebugMin(app_, "a.c", "main", 12, u"text");
    EXPECT_EQ(loggedProperties(), (Properties{{"zlv_prop_srcfile", "a.c"},
                                              {"zlv_prop_srcline", "12"},
                                              {"zlv_prop_srcfunction", "main"}}));
}

TEST_F(ZlvLogging, WithoutAFileRecordsOnlyTheFunction)
{
    ZlvLogDebugMin(app_, nullptr, "main", 12, u"text");
    EXPECT_EQ(loggedProperties(), (Properties{{"zlv_prop_srcfunction", "main"}}));
}

TEST_F(ZlvLogging, WithoutAFunctionRecordsFileAndLine)
{
    ZlvLogDebugMin(app_, "a.c", nullptr, 0, u"text");
    EXPECT_EQ(loggedProperties(),
              (Properties{{"zlv_prop_srcfile", "a.c"}, {"zlv_prop_srcline", "0"}}));
}

TEST_F(ZlvLogging, WithoutFileAndFunctionRecordsNothing)
{
    ZlvLogDebugMin(app_, nullptr, nullptr, 12, u"text");
    EXPECT_EQ(loggedProperties(), Properties{});
}

TEST_F(ZlvLogging, RecordsEmptyFileAndFunctionNames)
{
    ZlvLogDebugMin(app_, "", "", -3, u"text");
    EXPECT_EQ(loggedProperties(), (Properties{{"zlv_prop_srcfile", ""},
                                              {"zlv_prop_srcline", "-3"},
                                              {"zlv_prop_srcfunction", ""}}));
}

TEST_F(ZlvLogging, TextCallsRecordNoSource)
{
    ZlvLogUText(app_, u"text");
    EXPECT_EQ(loggedProperties(), Properties{});
}

/* Null arguments and argument lists. */

TEST_F(ZlvLogging, AMessageCallWithoutBundleAndKeyBindsToNothing)
{
    expectNoError(ZlvLogError(app_, nullptr, nullptr));
    ASSERT_EQ(records().size(), 1u);
    EXPECT_EQ(records()[0].text, UText{});
    EXPECT_TRUE(records()[0].isMessage);
}

TEST_F(ZlvLogging, AMessageCallWithoutAKeyReportsTheLookup)
{
    EXPECT_EQ(ZlvLogError(app_, bundlePath, nullptr).icuError, 2);
}

TEST_F(ZlvLogging, ADebugCallWithoutATextBindsToNothing)
{
    expectNoError(ZlvLogDebugMin(app_, "a.c", "main", 1, nullptr));
    expectNoError(ZlvLogUText(app_, nullptr));
    ASSERT_EQ(records().size(), 2u);
    EXPECT_EQ(records()[0].text, UText{});
    EXPECT_EQ(records()[1].text, UText{});
}

TEST_F(ZlvLogging, EveryListenerReadsTheArgumentsAnew)
{
    ZlvAddListener(app_, handler("second", Recorder::className));
    ZlvLogUText(app_, u"{0} {1,number,integer}", u"disk", 7);
    ASSERT_EQ(records().size(), 2u);
    EXPECT_EQ(records()[0].text, u"disk 7");
    EXPECT_EQ(records()[1].text, u"disk 7");
}

TEST_F(ZlvLogging, TheCallersArgumentListIsReadFromItsStart)
{
    withArgs(
        [&](va_list args) {
            ZlvLogUTextVA(app_, u"{0}", args);
            ZlvLogUTextVA(app_, u"{0}", args);
        },
        u"one", u"two");
    ASSERT_EQ(records().size(), 2u);
    EXPECT_EQ(records()[0].text, u"one");
    EXPECT_EQ(records()[1].text, u"one");
}

/* The toolkit's own error logger. */

class ZlvErrorLog : public RecordedToolkit {
protected:
    void SetUp() override
    {
        RecordedToolkit::SetUp();
        ZlvObject *errors = logger("zelvo.errorLogger");
        setProp(errors, "listenerNames", "");
        ZlvAddListener(errors, recorder_);
    }
};

TEST_F(ZlvErrorLog, GetsTheMessageWithItsArguments)
{
    ASSERT_EQ(zlvAPIMutexLock(), 1);
    zlvIntlLogVA(ZLV_LEVEL_ERROR, bundlePath, "both", u"disk", 3);
    zlvAPIMutexUnlock();
    ASSERT_EQ(records().size(), 1u);
    EXPECT_EQ(records()[0].level, 6000);
    EXPECT_EQ(records()[0].text, u"disk: 3 entries");
    EXPECT_TRUE(records()[0].isMessage);
}

TEST_F(ZlvErrorLog, GivesTheStatusOfTheEvent)
{
    Recorder::leave({'p', 28});
    ASSERT_EQ(zlvAPIMutexLock(), 1);
    ZlvStatus status = zlvIntlLogVA(ZLV_LEVEL_ERROR, bundlePath, "no such key");
    zlvAPIMutexUnlock();
    EXPECT_EQ(status.type, 'p');
    EXPECT_EQ(status.code, 28);
    EXPECT_EQ(status.icuError, 2);
}

TEST_F(ZlvErrorLog, TakesNullBundleAndKey)
{
    ASSERT_EQ(zlvAPIMutexLock(), 1);
    ZlvStatus status = zlvIntlLogVA(ZLV_LEVEL_ERROR, nullptr, nullptr);
    zlvAPIMutexUnlock();
    EXPECT_EQ(status.type, '-');
    EXPECT_EQ(records().size(), 1u);
}

TEST_F(ZlvErrorLog, IsNotThereWhileTheToolkitIsClosed)
{
    close();
    ZlvStatus status = zlvIntlLogVA(ZLV_LEVEL_ERROR, bundlePath, "no such key");
    EXPECT_EQ(status.type, '-');
    EXPECT_EQ(status.code, 0);
    EXPECT_EQ(status.icuError, 0);
    EXPECT_TRUE(records().empty());
}

} // namespace
} // namespace zelvo_test
