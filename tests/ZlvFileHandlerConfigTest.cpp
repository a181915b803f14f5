// SPDX-License-Identifier: Apache-2.0
// The properties of the file handlers.
#include "support/FileHandlerFixture.h"
#include "support/Rows.h"

namespace zelvo_test {
namespace {

class ZlvFileHandlerConfig : public FileHandlerFixture {
protected:
    /// Tells the handler that a property has changed.
    void change(const char *property)
    {
        zelvo::ApiLock lock;
        ZlvFileHandlerFCfgChange(handler_, property);
    }
};

struct IntRow {
    const char *row;
    const char *property;
    const char *value; // null: removed
    int32_t FileHandlerVars::*field;
    int32_t result;
};

class ZlvFileHandlerConfigInt : public ZlvFileHandlerConfig,
                                public testing::WithParamInterface<IntRow> {};

TEST_P(ZlvFileHandlerConfigInt, TakesTheRow)
{
    handler();
    vars()->*GetParam().field = 77;
    set(GetParam().property, GetParam().value);
    EXPECT_EQ(vars()->*GetParam().field, GetParam().result);
}

constexpr auto bytes = &FileHandlerVars::maxBytes;
constexpr auto files = &FileHandlerVars::maxFiles;
constexpr auto key = &FileHandlerVars::semKey;

INSTANTIATE_TEST_SUITE_P(
    Rows, ZlvFileHandlerConfigInt,
    testing::Values(IntRow{"SizeFound", "maxFileSize", "5000", bytes, 5000},
                    IntRow{"SizeZero", "maxFileSize", "0", bytes, 0},
                    IntRow{"SizeNegative", "maxFileSize", "-1", bytes, -1},
                    IntRow{"SizeWithTrailingText", "maxFileSize", "12abc", bytes, 12},
                    IntRow{"SizeAbsent", "maxFileSize", nullptr, bytes, 1024},
                    IntRow{"SizeMalformed", "maxFileSize", "many", bytes, 1024},
                    IntRow{"SizeEmpty", "maxFileSize", "", bytes, 1024},
                    IntRow{"BytesFound", "maxFileBytes", "5000", bytes, 5000},
                    IntRow{"BytesAbsent", "maxFileBytes", nullptr, bytes, 1024},
                    IntRow{"BytesMalformed", "maxFileBytes", "many", bytes, 1024},
                    IntRow{"FilesFound", "maxFiles", "12", files, 12},
                    IntRow{"FilesNegative", "maxFiles", "-2", files, -2},
                    IntRow{"FilesAbsent", "maxFiles", nullptr, files, 3},
                    IntRow{"FilesMalformed", "maxFiles", "few", files, 3},
                    IntRow{"KeyFound", "MPFileSemKey", "4711", key, 4711},
                    IntRow{"KeyNegative", "MPFileSemKey", "-5", key, -5},
                    IntRow{"KeyAbsent", "MPFileSemKey", nullptr, key, 0},
                    IntRow{"KeyMalformed", "MPFileSemKey", "key", key, 0}),
    byRow);

struct PermissionRow {
    const char *row;
    const char *value; // null: removed
    uint32_t mode;     // from 0123
};

class ZlvFileHandlerConfigPermission : public ZlvFileHandlerConfig,
                                       public testing::WithParamInterface<PermissionRow> {};

TEST_P(ZlvFileHandlerConfigPermission, OfFilesTakesTheRow)
{
    handler("filePermission", "123", "filePermission", GetParam().value);
    EXPECT_EQ(vars()->filePermission, GetParam().mode);
    EXPECT_EQ(vars()->dirPermission, 0771u);
}

TEST_P(ZlvFileHandlerConfigPermission, OfDirectoriesTakesTheRow)
{
    handler("dirPermission", "123", "dirPermission", GetParam().value);
    EXPECT_EQ(vars()->dirPermission, GetParam().mode);
    EXPECT_EQ(vars()->filePermission, 0744u);
}

INSTANTIATE_TEST_SUITE_P(
    Rows, ZlvFileHandlerConfigPermission,
    testing::Values(PermissionRow{"Found", "640", 0640}, PermissionRow{"FourDigits", "2750", 02750},
                    PermissionRow{"LeadingZero", "0600", 0600}, PermissionRow{"OneDigit", "7", 07},
                    PermissionRow{"Zero", "0", 0},
                    PermissionRow{"NoMoreThanFourDigits", "64012", 06401},
                    PermissionRow{"UpToWhatIsNotOctal", "6489", 064},
                    PermissionRow{"LeadingBlanks", "  640", 0640},
                    PermissionRow{"Absent", nullptr, 0123}, PermissionRow{"NotOctal", "9", 0123},
                    PermissionRow{"Letters", "rw-r-----", 0123}, PermissionRow{"Empty", "", 0123}),
    byRow);

struct FlagRow {
    const char *row;
    const char *value; // null: removed
    uint8_t flag;
};

class ZlvFileHandlerConfigAppending : public ZlvFileHandlerConfig,
                                      public testing::WithParamInterface<FlagRow> {};

TEST_P(ZlvFileHandlerConfigAppending, TakesTheRow)
{
    handler();
    vars()->appending = 2;
    set("appending", GetParam().value);
    EXPECT_EQ(vars()->appending, GetParam().flag);
}

/// The flag comes from the property "appending", whatever its own property says.
TEST_P(ZlvFileHandlerConfigAppending, DecidesWhetherInternalErrorsAreLogged)
{
    handler("appending", GetParam().value, "logInternalErrs", "false");
    EXPECT_EQ(vars()->logInternalErrs, GetParam().flag);
    vars()->logInternalErrs = 2;
    set("logInternalErrs", "true");
    EXPECT_EQ(vars()->logInternalErrs, GetParam().flag);
}

INSTANTIATE_TEST_SUITE_P(Rows, ZlvFileHandlerConfigAppending,
                         testing::Values(FlagRow{"True", "true", 1}, FlagRow{"False", "false", 0},
                                         FlagRow{"FalseInAnyCase", "FALSE", 0},
                                         FlagRow{"Absent", nullptr, 1},
                                         FlagRow{"Malformed", "no", 1}, FlagRow{"Empty", "", 1}),
                         byRow);

TEST_F(ZlvFileHandlerConfig, AloneAppendingLeavesTheLoggingOfInternalErrorsAlone)
{
    handler("appending", "false");
    EXPECT_EQ(vars()->logInternalErrs, 1);
}

TEST_F(ZlvFileHandlerConfig, RemovingTheLoggingOfInternalErrorsStillReadsAppending)
{
    handler("appending", "false", "logInternalErrs", nullptr);
    EXPECT_EQ(vars()->logInternalErrs, 0);
}

TEST_F(ZlvFileHandlerConfig, OfTheTwoLimitsTheLastOneWins)
{
    handler("maxFileSize", "1", "maxFileBytes", "2");
    EXPECT_EQ(vars()->maxBytes, 2);
    set("maxFileSize", "3");
    EXPECT_EQ(vars()->maxBytes, 3);
}

TEST_F(ZlvFileHandlerConfig, TheEncodingIsKept)
{
    handler("fileEncoding", "UTF-8");
    EXPECT_EQ(peeked(vars()->encoding), "UTF-8");
    set("fileEncoding", "latin1");
    EXPECT_EQ(peeked(vars()->encoding), "latin1");
    set("fileEncoding", nullptr);
    EXPECT_EQ(vars()->encoding, nullptr);
}

TEST_F(ZlvFileHandlerConfig, TheEncodingDoesNotChangeTheBytes)
{
    handler("fileName", "app.log", "fileEncoding", "UTF-16LE");
    log(u"a");
    EXPECT_EQ(file("app.log"), "a\n");
}

struct ClosingRow {
    const char *row;
    const char *property;
    const char *value; // null: removed
    bool closes;
};

class ZlvFileHandlerConfigClosing : public ZlvFileHandlerConfig,
                                    public testing::WithParamInterface<ClosingRow> {};

TEST_P(ZlvFileHandlerConfigClosing, IsThatOfTheRow)
{
    framedHandler("fileName", "app.log");
    log(u"a");
    set(GetParam().property, GetParam().value);
    EXPECT_EQ(vars()->isOpen, GetParam().closes ? 0 : 1);
    EXPECT_EQ(file("app.log"), GetParam().closes ? "[\na\n]\n" : "[\na\n");
}

/// The object's own class closes the file, so the handler that shares its file writes no trailer.
TEST_P(ZlvFileHandlerConfigClosing, WritesNoTrailerForTheSharedHandler)
{
    ZlvObject *shared = object("shared", "zlv_multiproc_filehandler");
    ZlvHandlerSetFormatter(shared, formatter("framed", LineFormatter::framed));
    setProp(shared, "fileName", "app.log");
    setProp(shared, "MPFileSemKey", "0");
    handler_ = shared;
    {
        zelvo::ApiLock lock;
        ZlvMultiProcFileHandlerFOpen(shared);
    }
    ASSERT_EQ(vars()->isOpen, 1);
    semctl(vars()->semId, 0, IPC_RMID);
    set(GetParam().property, GetParam().value);
    EXPECT_EQ(vars()->isOpen, GetParam().closes ? 0 : 1);
    EXPECT_EQ(file("app.log"), "");
}

INSTANTIATE_TEST_SUITE_P(
    Rows, ZlvFileHandlerConfigClosing,
    testing::Values(ClosingRow{"Size", "maxFileSize", "1", true},
                    ClosingRow{"SizeAbsent", "maxFileSize", nullptr, true},
                    ClosingRow{"SizeMalformed", "maxFileSize", "many", true},
                    ClosingRow{"Bytes", "maxFileBytes", "1", true},
                    ClosingRow{"BytesAbsent", "maxFileBytes", nullptr, true},
                    ClosingRow{"Files", "maxFiles", "1", true},
                    ClosingRow{"FilesAbsent", "maxFiles", nullptr, true},
                    ClosingRow{"Name", "fileName", "app.log", true},
                    ClosingRow{"NameAbsent", "fileName", nullptr, true},
                    ClosingRow{"Appending", "appending", "true", true},
                    ClosingRow{"AppendingAbsent", "appending", nullptr, true},
                    ClosingRow{"FilePermission", "filePermission", "640", true},
                    ClosingRow{"FilePermissionAbsent", "filePermission", nullptr, false},
                    ClosingRow{"FilePermissionMalformed", "filePermission", "x", true},
                    ClosingRow{"DirPermission", "dirPermission", "750", true},
                    ClosingRow{"DirPermissionAbsent", "dirPermission", nullptr, false},
                    ClosingRow{"DirPermissionMalformed", "dirPermission", "x", true},
                    ClosingRow{"Encoding", "fileEncoding", "UTF-8", true},
                    ClosingRow{"EncodingAbsent", "fileEncoding", nullptr, true},
                    ClosingRow{"Key", "MPFileSemKey", "4711", true},
                    ClosingRow{"KeyAbsent", "MPFileSemKey", nullptr, true},
                    ClosingRow{"LogInternalErrs", "logInternalErrs", "true", false},
                    ClosingRow{"LogInternalErrsAbsent", "logInternalErrs", nullptr, false},
                    ClosingRow{"Logging", "logging", "true", false},
                    ClosingRow{"Unknown", "filename", "other.log", false}),
    byRow);

TEST_F(ZlvFileHandlerConfig, KeysAreComparedExactly)
{
    handler("fileName", "app.log", "FileName", "b.log", "fileNames", "c.log", "maxfiles", "9");
    EXPECT_EQ(peeked(vars()->fullName), directory().string() + "/app.log");
    EXPECT_EQ(vars()->maxFiles, 3);
}

TEST_F(ZlvFileHandlerConfig, TheFormatterNameIsThatOfAllHandlers)
{
    formatter("framed", LineFormatter::framed);
    handler("fileName", "app.log", "formatterName", "framed");
    log(u"a");
    EXPECT_EQ(file("app.log"), "[\na\n");
}

TEST_F(ZlvFileHandlerConfig, LoggingIsThatOfAllObjects)
{
    handler("fileName", "app.log", "logging", "off");
    log(u"a");
    EXPECT_EQ(file("app.log"), std::nullopt);
}

TEST_F(ZlvFileHandlerConfig, ListenersAreThoseOfAllObjects)
{
    object("behind", Recorder::className);
    handler("fileName", "app.log", "listenerNames", "behind");
    log(u"a");
    EXPECT_EQ(Recorder::order(), std::vector<std::string>{"behind"});
}

TEST_F(ZlvFileHandlerConfig, OfNoHandlerDoesNothing)
{
    change("fileName");
    ZlvFileHandlerFCfgChange(nullptr, nullptr);
}

TEST_F(ZlvFileHandlerConfig, OfNoPropertyDoesNothing)
{
    handler("fileName", "app.log");
    log(u"a");
    change(nullptr);
    EXPECT_EQ(vars()->isOpen, 1);
}

TEST_F(ZlvFileHandlerConfig, OfAHandlerWithoutVariablesDoesNothing)
{
    handler_ = object("recorder", Recorder::className);
    setProp(handler_, "logging", "off");
    ZlvSetObjectEnabled(handler_, 1);
    for (const char *property : {"fileName", "maxFiles", "logInternalErrs", "logging"})
        change(property);
    EXPECT_EQ(ZlvIsObjectEnabled(handler_), 1);
}

TEST_F(ZlvFileHandlerConfig, ComesFromThePropertiesFile)
{
    close();
    open("app.className = zlv_basiclogger\napp.listenerNames = out\n"
         "out.className = zlv_filehandler\nout.fileName = sub/app.log\nout.maxFiles = 2\n");
    ZlvObject *app = object("app");
    EXPECT_TRUE(ok(ToolkitFixture::log(app, u"text")));
    EXPECT_NE(read("sub/app.log").find("text\n"), std::string::npos);
}

} // namespace
} // namespace zelvo_test
