// SPDX-License-Identifier: Apache-2.0
// Binding a message: bundles, keys, patterns, locales, arguments and failures.
#include <unicode/putil.h>
#include <unicode/uloc.h>

#include "ZlvI18MsgIntl.h"
#include "ZlvIntl.h"
#include "support/Bundles.h"
#include "support/FailAlloc.h"
#include "support/TestDir.h"
#include "support/Text.h"
#include "support/VaList.h"

namespace zelvo_test {
namespace {

class ZlvI18MsgBind : public TestDir {
protected:
    ~ZlvI18MsgBind() override { zlvIntlFreeI18Msg(message_); }

    /// The message of the next binds: a key of a bundle, or an inline pattern.
    void key(const char *key, const char *bundle = bundlePath)
    {
        zlvIntlFreeI18Msg(message_);
        message_ = zlvIntlAllocUI18Msg(bundle, key, nullptr);
    }
    void text(const char16_t *pattern)
    {
        zlvIntlFreeI18Msg(message_);
        message_ = zlvIntlAllocUI18Msg(nullptr, nullptr, pattern);
    }

    UText in(const char *locale)
    {
        zlvSetI18MsgLocale(message_, locale);
        return bound();
    }
    UText bound() { return taken(zlvIntlBindUI18Msg(message_, noArgs())); }

    template <class... Args>
    UText with(Args... args)
    {
        UText result;
        withArgs([&](va_list list) { result = taken(zlvIntlBindUI18Msg(message_, list)); },
                 args...);
        return result;
    }

    void expectNothing(int32_t icuError)
    {
        EXPECT_EQ(bound(), UText{});
        EXPECT_EQ(message_->icuError, icuError);
    }

    ZlvI18Msg *message_ = nullptr;
};

/* Bundles. */

TEST_F(ZlvI18MsgBind, TakesTheTextOfTheLocale)
{
    key("plain");
    EXPECT_EQ(in("de"), u"Dienst beendet");
    EXPECT_EQ(in("ja"), u"サービスは停止しました");
    EXPECT_EQ(in("en"), u"Service halted");
}

TEST_F(ZlvI18MsgBind, WithoutALocaleTakesTheDefaultOne)
{
    key("plain");
    EXPECT_EQ(bound(), u"Service halted");
    UErrorCode status = U_ZERO_ERROR;
    uloc_setDefault("de_DE", &status);
    EXPECT_EQ(bound(), u"Dienst beendet");
}

TEST_F(ZlvI18MsgBind, FallsBackFromTheCountryToTheLanguage)
{
    key("plain");
    EXPECT_EQ(in("de_CH"), u"Dienst beendet");
    EXPECT_EQ(message_->icuError, 0);
}

TEST_F(ZlvI18MsgBind, FallsBackToTheRootForAKeyThatTheLanguageLacks)
{
    key("onlyInRoot");
    EXPECT_EQ(in("ja"), u"from the root");
    EXPECT_EQ(message_->icuError, 0);
}

TEST_F(ZlvI18MsgBind, FallsBackToTheDefaultLocaleForALanguageThatIsNotThere)
{
    key("plain");
    EXPECT_EQ(in("fr"), u"Service halted");
    EXPECT_EQ(message_->icuError, 0);
}

TEST_F(ZlvI18MsgBind, FormatsAKeysPatternWithTheArguments)
{
    key("both");
    EXPECT_EQ(with(u"disk", 1234), u"disk: 1234 entries");
    zlvSetI18MsgLocale(message_, "de");
    EXPECT_EQ(with(u"disk", 1234), u"1.234 Einträge in disk");
    key("named");
    zlvSetI18MsgLocale(message_, "ja");
    EXPECT_EQ(with(u"印刷"), u"サービス印刷は停止しました");
}

TEST_F(ZlvI18MsgBind, PrefersTheBundleToTheText)
{
    message_ = zlvIntlAllocUI18Msg(bundlePath, "plain", u"inline");
    EXPECT_EQ(in("de"), u"Dienst beendet");
}

TEST_F(ZlvI18MsgBind, DoesNotFallBackFromTheBundleToTheText)
{
    message_ = zlvIntlAllocUI18Msg("no_such_bundle", "plain", u"inline");
    expectNothing(U_MISSING_RESOURCE_ERROR);
}

TEST_F(ZlvI18MsgBind, OfAnEmptyTextInTheBundleIsNull)
{
    key("empty");
    EXPECT_EQ(in("de"), UText{});
    EXPECT_EQ(message_->icuError, 0);
}

TEST_F(ZlvI18MsgBind, OpensABundleOnTheDataPathByItsName)
{
    u_setDataDirectory(bundleDirectory);
    key("plain", "zelvomsg");
    EXPECT_EQ(in("de"), u"Dienst beendet");
}

TEST_F(ZlvI18MsgBind, OpensABundleByARelativePath)
{
    std::filesystem::create_directory_symlink(bundleDirectory, "here");
    key("plain", "./here/zelvomsg");
    EXPECT_EQ(in("de"), u"Dienst beendet");
}

TEST_F(ZlvI18MsgBind, RetriesAPathThatDoesNotOpenByItsBareName)
{
    u_setDataDirectory(bundleDirectory);
    key("plain", "no/such/directory/zelvomsg");
    EXPECT_EQ(in("de"), u"Dienst beendet");
    EXPECT_EQ(message_->icuError, 0);
}

TEST_F(ZlvI18MsgBind, RetriesARelativePathThatIcuItselfDoesNotLookUp)
{
    u_setDataDirectory(bundleDirectory);
    std::filesystem::create_directory("nothing");
    key("plain", "nothing/zelvomsg");
    EXPECT_EQ(in("ja"), u"サービスは停止しました");
}

TEST_F(ZlvI18MsgBind, ReportsABundleWithoutASlashThatDoesNotOpen)
{
    key("plain", "no_such_bundle");
    expectNothing(U_MISSING_RESOURCE_ERROR);
}

TEST_F(ZlvI18MsgBind, ReportsAPathWhoseBareNameDoesNotOpenEither)
{
    key("plain", "some/no_such_bundle");
    expectNothing(U_MISSING_RESOURCE_ERROR);
}

TEST_F(ZlvI18MsgBind, ReportsAPathThatEndsInASlash)
{
    key("plain", "some/");
    expectNothing(U_MISSING_RESOURCE_ERROR);
}

TEST_F(ZlvI18MsgBind, ReportsABundleWithAnEmptyName)
{
    key("plain", "");
    expectNothing(U_MISSING_RESOURCE_ERROR);
}

TEST_F(ZlvI18MsgBind, ReportsAKeyThatIsNotThere)
{
    key("no such key");
    expectNothing(U_MISSING_RESOURCE_ERROR);
}

TEST_F(ZlvI18MsgBind, ReportsANullKey)
{
    key(nullptr);
    expectNothing(U_MISSING_RESOURCE_ERROR);
}

TEST_F(ZlvI18MsgBind, ReportsAKeyThatHoldsNoString)
{
    key("several");
    expectNothing(U_RESOURCE_TYPE_MISMATCH);
}

TEST_F(ZlvI18MsgBind, KeepsTheErrorOfTheLastFailedBindThroughASuccess)
{
    key("onlyInRoot");
    message_->icuError = 99;
    EXPECT_EQ(bound(), u"from the root");
    EXPECT_EQ(message_->icuError, 99);
}

TEST_F(ZlvI18MsgBind, ReplacesAnEarlierErrorByALaterOne)
{
    key("no such key");
    message_->icuError = 99;
    expectNothing(U_MISSING_RESOURCE_ERROR);
}

/* Inline patterns. */

TEST_F(ZlvI18MsgBind, OfAnInlineTextIsTheText)
{
    text(u"plain text");
    EXPECT_EQ(bound(), u"plain text");
}

TEST_F(ZlvI18MsgBind, OfAnEmptyInlineTextIsNull)
{
    text(u"");
    expectNothing(0);
}

TEST_F(ZlvI18MsgBind, OfAPatternThatFormatsToNothingIsNull)
{
    text(u"{0}");
    EXPECT_EQ(with(u""), UText{});
    EXPECT_EQ(message_->icuError, 0);
}

TEST_F(ZlvI18MsgBind, OfNeitherBundleNorTextIsNull)
{
    text(nullptr);
    expectNothing(0);
}

TEST_F(ZlvI18MsgBind, OfAKeyAloneIsNull)
{
    message_ = zlvIntlAllocUI18Msg(nullptr, "plain", nullptr);
    expectNothing(0);
}

TEST_F(ZlvI18MsgBind, OfNullIsNull)
{
    EXPECT_EQ(zlvIntlBindUI18Msg(nullptr, noArgs()), nullptr);
    EXPECT_EQ(ZlvBindUI18Msg(nullptr, noArgs()), nullptr);
}

TEST_F(ZlvI18MsgBind, FormatsANumberByTheMessagesLocale)
{
    text(u"{0,number,integer}");
    zlvSetI18MsgLocale(message_, "de");
    EXPECT_EQ(with(1234567), u"1.234.567");
    zlvSetI18MsgLocale(message_, "en");
    EXPECT_EQ(with(1234567), u"1,234,567");
    zlvSetI18MsgLocale(message_, "ar_EG");
    EXPECT_EQ(with(12), u"١٢");
}

TEST_F(ZlvI18MsgBind, FormatsEachKindOfArgument)
{
    text(u"{0}|{1,number}|{2,number,integer}|{3,choice,0#none|1#one|1<many}");
    EXPECT_EQ(with(u"s", 2.5, -3, 2.0), u"s|2.5|-3|many");
}

TEST_F(ZlvI18MsgBind, TakesArgumentsByTheirNumber)
{
    text(u"{1} before {0} and {1}");
    EXPECT_EQ(with(u"a", u"b"), u"b before a and b");
}

TEST_F(ZlvI18MsgBind, UnderstandsQuotes)
{
    text(u"It''s '{0}' it's");
    EXPECT_EQ(bound(), u"It's {0} it's");
    key("quoted");
    EXPECT_EQ(bound(), u"It's {here}");
}

TEST_F(ZlvI18MsgBind, GivesLongTextsWhole)
{
    text(u"<{0}>");
    std::u16string argument(70000, u'x');
    EXPECT_EQ(with(argument.c_str()), u"<" + argument + u">");
}

TEST_F(ZlvI18MsgBind, OfABrokenPatternIsNullAndReportsNothing)
{
    text(u"{0");
    expectNothing(0);
    key("broken");
    expectNothing(0);
}

TEST_F(ZlvI18MsgBind, SeesAPatternThatWasExchanged)
{
    text(u"first");
    EXPECT_EQ(bound(), u"first");
    text(u"second");
    EXPECT_EQ(bound(), u"second");
}

/* The argument list. */

TEST_F(ZlvI18MsgBind, LeavesTheCallersListAtItsStart)
{
    text(u"{0,number,integer}");
    withArgs(
        [&](va_list args) {
            EXPECT_EQ(taken(zlvIntlBindUI18Msg(message_, args)), u"7");
            EXPECT_EQ(taken(ZlvBindUI18Msg(message_, args)), u"7");
            EXPECT_EQ(va_arg(args, int), 7);
        },
        7);
}

TEST_F(ZlvI18MsgBind, ReadsArgumentsBeyondTheRegisters)
{
    text(u"{0}{1}{2}{3}{4}{5}{6,number,integer}{7}");
    EXPECT_EQ(with(u"a", u"b", u"c", u"d", u"e", u"f", 7, u"h"), u"abcdef7h");
}

TEST_F(ZlvI18MsgBind, WithoutAListFormatsAPatternWithoutArguments)
{
    text(u"plain '{'text'}'");
    EXPECT_EQ(bound(), u"plain {text}");
}

TEST_F(ZlvI18MsgBind, WithoutAListReadsNumbersAsZero)
{
    text(u"{0,number,integer} {1,number}");
    EXPECT_EQ(bound(), u"0 0");
}

TEST_F(ZlvI18MsgBind, WithoutAListHasNoTextForAString)
{
    text(u"a {0} b");
    expectNothing(0);
}

TEST_F(ZlvI18MsgBind, OfANullStringArgumentIsNull)
{
    text(u"a {0} b");
    EXPECT_EQ(with(static_cast<const UChar *>(nullptr)), UText{});
}

TEST_F(ZlvI18MsgBind, WithZerosReadsEveryArgumentAsZero)
{
    text(u"{0,number,integer} {1,number} {2,number,integer}");
    EXPECT_EQ(taken(zelvo::zlvBindMsgWithZeros(message_)), u"0 0 0");
}

TEST_F(ZlvI18MsgBind, WithZerosTakesANullMessage)
{
    EXPECT_EQ(zelvo::zlvBindMsgWithZeros(nullptr), nullptr);
}

/* Memory. */

TEST_F(ZlvI18MsgBind, IsNullAndLeaksNothingAtEveryFailingAllocation)
{
    key("both");
    uint32_t struck = 1;
    UText last;
    for (uint32_t allowed = 0; struck != 0; ++allowed) {
        FailAlloc fail(allowed, FailAlloc::Once);
        last = with(u"disk", 3);
        struck = fail.failed();
        ASSERT_TRUE(!last || last == u"disk: 3 entries");
        ASSERT_LT(allowed, 100u);
    }
    EXPECT_EQ(last, u"disk: 3 entries");
}

} // namespace
} // namespace zelvo_test
