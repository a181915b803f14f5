// SPDX-License-Identifier: Apache-2.0
// Each property that a class knows: what holds before it is set, what setting it does, what
// removing it does and when it closes a file. The table of docs/properties-keys.md says the same in
// the same words: tests/check_property_keys compares them.
#include <gtest/gtest.h>

#include <sys/sem.h>

#include <ostream>
#include <sstream>
#include <vector>

#include "Observers.h"
#include "support/TestDir.h"

namespace zelvo_test {
namespace {

struct Row {
    const char *classes; ///< names between blanks
    const char *key;
    const char *value; ///< what the property is set to
    Observer observe;
    const char *initially;
    const char *then; ///< observed once the property is set
    const char *removed;
    const char *closes; ///< "no", "yes" or "if set"
};

constexpr const char *UNCHANGED = "unchanged";
/// Stands for the name of the object's class.
constexpr const char *ITSELF = "(itself)";

#define LOGGERS "zlv_basiclogger zlv_pdlogger "
#define FILTERS "zlv_levelfilter zlv_msgidfilter "
#define FILE_HANDLERS "zlv_filehandler zlv_multiproc_filehandler "
#define HANDLERS "zlv_consolehandler " FILE_HANDLERS
#define FORMATTERS "zlv_basicformatter zlv_xmlformatter "

constexpr Row ROWS[] = {
    {LOGGERS FILTERS HANDLERS FORMATTERS "zlv_vyxtraceformatter", "className", ITSELF,
     classOfNewObject, "no object", ITSELF, "no object", "no"},
    {LOGGERS FILTERS HANDLERS FORMATTERS, "logging", "off", isEnabled, "on", "off", UNCHANGED,
     "no"},
    {LOGGERS FILTERS HANDLERS, "listenerNames", "output source", listenersOf, "none",
     "output source", "none", "no"},
    {FORMATTERS, "listenerNames", "output", listenersOf, "none", "none", "none", "no"},
    {LOGGERS, "level", "WARN", leastLevelLogged, "DEBUG_MIN", "WARN", "everything", "no"},
    {"zlv_levelfilter", "level", "WARN", leastLevelPassed, "everything", "WARN", "everything",
     "no"},
    {"zlv_pdlogger", "organization", "mine", stampOf, "none", "mine", "none", "no"},
    {"zlv_pdlogger", "product", "mine", stampOf, "none", "mine", "none", "no"},
    {"zlv_pdlogger", "component", "mine", stampOf, "none", "mine", "none", "no"},
    {"zlv_pdlogger", "client", "mine", stampOf, "none", "mine", "none", "no"},
    {"zlv_pdlogger", "server", "mine", stampOf, "host name", "mine", "none", "no"},
    {"zlv_pdlogger", "serverFormat", "mine", stampOf, "IP", "mine", "none", "no"},
    {"zlv_pdlogger", "productInstance", "mine", stampOf, "none", "mine", "none", "no"},
    {"zlv_msgidfilter", "mode", "passthru", modeOf, "BLOCK", "PASSTHRU", UNCHANGED, "no"},
    {"zlv_msgidfilter", "msgIds", "*E", identifiersBlocked, "*W *I", "*E", UNCHANGED, "no"},
    {"zlv_msgidfilter", "msgIdRepeatTime", "5000", quietTime, "0", "5000", UNCHANGED, "no"},
    {HANDLERS, "formatterName", "format", formatterOf, "zelvo.defaultFormatter", "format",
     UNCHANGED, "no"},
    {FILE_HANDLERS, "fileName", "other.log", fileWritten, "default.log", "other.log", "no file",
     "yes"},
    {FILE_HANDLERS, "maxFileBytes", "5000", limitOfFile, "1048576", "5000", "1024", "yes"},
    {FILE_HANDLERS, "maxFileSize", "5000", limitOfFile, "1048576", "5000", "1024", "yes"},
    {FILE_HANDLERS, "maxFiles", "5", filesKept, "3", "5", "3", "yes"},
    {"zlv_filehandler", "appending", "false", isAppending, "true", "false", "true", "yes"},
    {"zlv_multiproc_filehandler", "appending", "false", isAppending, "true", "true", "true", "yes"},
    {FILE_HANDLERS, "filePermission", "600", modeOfFile, "744", "600", UNCHANGED, "if set"},
    {FILE_HANDLERS, "dirPermission", "700", modeOfDirectory, "771", "700", UNCHANGED, "if set"},
    {FILE_HANDLERS, "MPFileSemKey", "40961", semaphoreKey, "31821", "40961", "0", "yes"},
    {FILE_HANDLERS, "fileEncoding", "UTF-16", encodingKept, "none", "UTF-16", "none", "yes"},
    {FILE_HANDLERS, "logInternalErrs", "false", internalErrorsFlag, "true", "true", "true", "no"},
    {"zlv_xmlformatter", "singleServer", "true", isWrittenOnce, "false", "true", "false", "no"},
    {"zlv_xmlformatter", "singleProduct", "true", isWrittenOnce, "false", "true", "false", "no"},
    {"zlv_xmlformatter", "singleProductId", "true", isWrittenOnce, "false", "true", "false", "no"},
    {"zlv_xmlformatter", "singleComponent", "true", isWrittenOnce, "false", "true", "false", "no"},
    {"zlv_xmlformatter", "forceAsMessage", "true", isForcedAsMessage, "false", "true", "false",
     "no"},
    {"zlv_xmlformatter", "forceAsTrace", "true", isForcedAsTrace, "false", "true", "false", "no"},
    {"zlv_basicformatter", "separator", "#", separatorOfFields, "one blank", "#", "one blank",
     "no"},
    {"zlv_xmlformatter", "separator", "#", separatorKept, "none", "#", "none", "no"},
    {FORMATTERS, "dateTimeFormat", "dd.MM.yyyy", dateWritten, "yyyy-MM-dd HH:mm:ss.SSS and offset",
     "16.08.2006", "yyyy-MM-dd HH:mm:ss.SSS and offset", "no"},
    {FORMATTERS, "locale", "de", localeOfNumbers, "that of the event", "de", "that of the event",
     "no"},
};

/// One class of a row.
struct Case {
    std::string className;
    const Row *row;

    std::string own(const char *text) const { return text == ITSELF ? className : text; }
};

/// What check_property_keys reads.
void PrintTo(const Case &tested, std::ostream *out)
{
    const Row &row = *tested.row;
    *out << tested.className << '|' << row.key << '|' << row.initially << '|' << row.removed << '|'
         << row.closes;
}

std::string nameOf(const testing::TestParamInfo<Case> &info)
{
    return info.param.className + "_" + info.param.row->key;
}

std::vector<Case> cases(bool filesOnly)
{
    std::vector<Case> all;
    for (const Row &row : ROWS) {
        std::istringstream names(row.classes);
        for (std::string name; names >> name;)
            if (!filesOnly || name.find("filehandler") != std::string::npos)
                all.push_back({name, &row});
    }
    return all;
}

class PropertyKeys : public TestDir, public testing::WithParamInterface<Case> {
protected:
    PropertyKeys() : subject_(GetParam().className)
    {
        ZlvObjCfg *cfg = ZlvLogMgrGetCfg("format");
        ZlvSetObjCfgProp(cfg, "className", "zlv_basicformatter");
        ZlvReleaseObjCfg(cfg);
    }

    std::string observed() { return row_.observe(subject_, row_.key); }

    void configure(const char *value) { subject_.configure(row_.key, value); }

    /// The key's own row is looked at before this.
    void takeOwnSemaphore()
    {
        if (subject_.isFileHandler())
            subject_.takeOwnSemaphore();
    }

    bool closesWith(const char *value)
    {
        subject_.log();
        EXPECT_EQ(subject_.fileVars()->isOpen, 1);
        configure(value);
        return subject_.fileVars()->isOpen == 0;
    }

    const Row &row_ = *GetParam().row;
    Subject subject_;
};

TEST_P(PropertyKeys, HoldAsDocumented)
{
    if (row_.observe != semaphoreKey)
        takeOwnSemaphore();
    EXPECT_EQ(observed(), row_.initially);
    configure(GetParam().own(row_.value).c_str());
    EXPECT_EQ(observed(), GetParam().own(row_.then));
    configure(nullptr);
    EXPECT_EQ(observed(), row_.removed == UNCHANGED ? row_.then : row_.removed);
}

INSTANTIATE_TEST_SUITE_P(All, PropertyKeys, testing::ValuesIn(cases(false)), nameOf);

class PropertyKeysOfFiles : public PropertyKeys {};

TEST_P(PropertyKeysOfFiles, CloseTheFileAsDocumented)
{
    const std::string closes = row_.closes;
    takeOwnSemaphore();
    EXPECT_EQ(closesWith(GetParam().own(row_.value).c_str()), closes != "no");
    if (std::string(row_.key) == "logging")
        ZlvSetObjectEnabled(subject_.object(), 1);
    EXPECT_EQ(closesWith(nullptr), closes == "yes");
}

INSTANTIATE_TEST_SUITE_P(All, PropertyKeysOfFiles, testing::ValuesIn(cases(true)), nameOf);

class PropertyKeyOfSemaphore : public TestDir {};

TEST_F(PropertyKeyOfSemaphore, NamesTheSemaphoreThatARecordMakes)
{
    Subject subject("zlv_multiproc_filehandler");
    subject.takeOwnSemaphore();
    const int32_t key = subject.fileVars()->semKey;
    EXPECT_EQ(semget(key, 0, 0), -1);
    subject.log();
    EXPECT_NE(semget(key, 0, 0), -1);
}

class OtherProperties : public TestDir {};

TEST_F(OtherProperties, AreKeptAndDoNothing)
{
    Subject subject("zlv_basiclogger");
    for (const char *key : {"description", "descriptionFile", "descriptionSet", "descriptionKey"}) {
        subject.configure(key, "word");
        EXPECT_EQ(textOf(ZlvGetObjProp(subject.object(), key, nullptr)), "word");
    }
    EXPECT_EQ(ZlvGetObjectDesc(subject.object()), nullptr);
}

} // namespace
} // namespace zelvo_test
