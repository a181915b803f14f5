// SPDX-License-Identifier: Apache-2.0
// Filters of classes that an application registered.
#include "support/Recorder.h"
#include "support/VaList.h"

#include "ZlvLevelFilter.h"

namespace zelvo_test {
namespace {

/// "app" with one listener, a filter of a class of the test's own, which has one recorder.
class ZlvObjClassFilter : public RecordedToolkit {
protected:
    void addFilter(const char *className)
    {
        ZlvRemListener(app_, recorder_);
        filter_ = filter("filter", className);
        ZlvAddListener(app_, filter_);
        ZlvAddListener(filter_, recorder_);
    }

    /// How many events reach the recorder through a class whose accept entry gives RESULT.
    size_t passedWhenAcceptGives(int32_t (*entry)(ZlvObject *, ZlvEvent *, va_list))
    {
        ZlvAddFilterClass("mine", nullptr, nullptr, nullptr, nullptr, nullptr, entry, nullptr);
        addFilter("mine");
        log(app_, u"text");
        return records().size();
    }

    ZlvObject *filter_ = nullptr;
};

TEST_F(ZlvObjClassFilter, WithoutEntriesFiltersByLevel)
{
    ZlvAddFilterClass("mine", nullptr, nullptr, nullptr, nullptr, nullptr, nullptr, nullptr);
    addFilter("mine");
    filter_->filter.level = ZLV_LEVEL_WARN;
    ZlvLogInfo(app_, "bundle", "key");
    EXPECT_EQ(records().size(), 0u);
    ZlvLogWarn(app_, "bundle", "key");
    EXPECT_EQ(records().size(), 1u);
}

TEST_F(ZlvObjClassFilter, WithoutEntriesIsTransparentAtFirst)
{
    ZlvAddFilterClass("mine", nullptr, nullptr, nullptr, nullptr, nullptr, nullptr, nullptr);
    addFilter("mine");
    ZlvLogInfo(app_, "bundle", "key");
    EXPECT_EQ(records().size(), 1u);
}

TEST_F(ZlvObjClassFilter, PassesWhatItsAcceptEntryAnswersWithOne)
{
    EXPECT_EQ(passedWhenAcceptGives([](ZlvObject *, ZlvEvent *, va_list) { return 1; }), 1u);
}

TEST_F(ZlvObjClassFilter, PassesWhatItsAcceptEntryAnswersWithOneInTheLowEightBits)
{
    EXPECT_EQ(passedWhenAcceptGives([](ZlvObject *, ZlvEvent *, va_list) { return 0x101; }), 1u);
}

TEST_F(ZlvObjClassFilter, RefusesWhatItsAcceptEntryAnswersWithTwo)
{
    EXPECT_EQ(passedWhenAcceptGives([](ZlvObject *, ZlvEvent *, va_list) { return 2; }), 0u);
}

TEST_F(ZlvObjClassFilter, RefusesWhatItsAcceptEntryAnswersWithZero)
{
    EXPECT_EQ(passedWhenAcceptGives([](ZlvObject *, ZlvEvent *, va_list) { return 0; }), 0u);
}

TEST_F(ZlvObjClassFilter, PassesNothingWithoutALogEntry)
{
    ZlvAddFilterClass("mine", nullptr, nullptr, nullptr, nullptr, nullptr, nullptr, nullptr);
    zlvToolkitGetClassDef("mine")->filter.fLog = nullptr;
    addFilter("mine");
    log(app_, u"text");
    EXPECT_EQ(records().size(), 0u);
}

TEST_F(ZlvObjClassFilter, PassesNothingWithoutAnAcceptEntry)
{
    ZlvAddFilterClass("mine", nullptr, nullptr, nullptr, nullptr, nullptr, nullptr, nullptr);
    zlvToolkitGetClassDef("mine")->filter.fIsLoggable = nullptr;
    addFilter("mine");
    log(app_, u"text");
    EXPECT_EQ(records().size(), 0u);
}

TEST_F(ZlvObjClassFilter, TheProcessEntryIgnoresANullFilterAndOtherKinds)
{
    ZlvBasicFilterFProcess(nullptr, nullptr, noArgs());
    ZlvBasicFilterFProcess(app_, nullptr, noArgs());
    EXPECT_EQ(records().size(), 0u);
}

TEST_F(ZlvObjClassFilter, TheArgumentsOfTheCallReachTheListeners)
{
    addFilter("zlv_levelfilter");
    ZlvLogUText(app_, u"{0} and {1}", u"one", u"two");
    ASSERT_EQ(records().size(), 1u);
    EXPECT_EQ(records()[0].text, u"one and two");
}

} // namespace
} // namespace zelvo_test
