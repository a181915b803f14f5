// SPDX-License-Identifier: Apache-2.0
// Messages: making, copying, freeing, their parameters, their locale, and printing text.
#include <unicode/ucnv.h>

#include "ZlvIntl.h"
#include "support/BrokenMutex.h"
#include "support/FailAlloc.h"
#include "support/TestDir.h"
#include "support/Text.h"
#include "support/VaList.h"

namespace zelvo_test {
namespace {

struct FreeMessage {
    void operator()(ZlvI18Msg *message) const { zlvIntlFreeI18Msg(message); }
};
using MessageOwner = std::unique_ptr<ZlvI18Msg, FreeMessage>;

MessageOwner makeMessage()
{
    return MessageOwner(zlvIntlAllocUI18Msg("bundle", "key", u"text"));
}

/* Making. */

TEST(ZlvI18Msg, HoldsCopiesOfBundleKeyAndText)
{
    std::string bundle = "bundle", key = "key";
    std::u16string text = u"text";
    MessageOwner message(zlvIntlAllocUI18Msg(bundle.c_str(), key.c_str(), text.c_str()));
    bundle = key = "x";
    text = u"x";
    EXPECT_EQ(peeked(message->bundle), "bundle");
    EXPECT_EQ(peeked(message->key), "key");
    EXPECT_EQ(peeked(message->text), u"text");
}

TEST(ZlvI18Msg, StartsWithoutParametersLocaleAndError)
{
    MessageOwner message = makeMessage();
    EXPECT_EQ(message->parameters, nullptr);
    EXPECT_EQ(message->locale, nullptr);
    EXPECT_EQ(message->icuError, 0);
}

TEST(ZlvI18Msg, CanBeMadeOfNothing)
{
    MessageOwner message(zlvIntlAllocUI18Msg(nullptr, nullptr, nullptr));
    ASSERT_NE(message, nullptr);
    EXPECT_EQ(message->bundle, nullptr);
    EXPECT_EQ(message->key, nullptr);
    EXPECT_EQ(message->text, nullptr);
}

TEST(ZlvI18Msg, CanLackAnyOneArgument)
{
    MessageOwner noBundle(zlvIntlAllocUI18Msg(nullptr, "key", u"text"));
    EXPECT_EQ(noBundle->bundle, nullptr);
    MessageOwner noKey(zlvIntlAllocUI18Msg("bundle", nullptr, u"text"));
    EXPECT_EQ(noKey->key, nullptr);
    MessageOwner noText(zlvIntlAllocUI18Msg("bundle", "key", nullptr));
    EXPECT_EQ(noText->text, nullptr);
}

TEST(ZlvI18Msg, IsNullWhenTheRecordCannotBeMade)
{
    FailAlloc fail(0);
    EXPECT_EQ(zlvIntlAllocUI18Msg("bundle", "key", u"text"), nullptr);
    EXPECT_EQ(fail.failed(), 1u);
}

TEST(ZlvI18Msg, ThePublicFormsMakeCopyAndFree)
{
    ZlvI18Msg *message = ZlvAllocUI18Msg("bundle", "key", u"text");
    ZlvI18Msg *copy = ZlvCopyI18Msg(message);
    ZlvFreeI18Msg(message);
    ASSERT_NE(copy, nullptr);
    EXPECT_EQ(peeked(copy->bundle), "bundle");
    EXPECT_EQ(peeked(copy->key), "key");
    EXPECT_EQ(peeked(copy->text), u"text");
    ZlvFreeI18Msg(copy);
}

TEST(ZlvI18Msg, ThePublicFormsDoNothingWhenTheMutexCannotBeTaken)
{
    MessageOwner message = makeMessage();
    BrokenMutex broken;
    EXPECT_EQ(ZlvAllocUI18Msg("bundle", "key", u"text"), nullptr);
    EXPECT_EQ(ZlvCopyI18Msg(message.get()), nullptr);
    EXPECT_EQ(ZlvBindUI18Msg(message.get(), noArgs()), nullptr);
    ZlvFreeI18Msg(message.get());
    EXPECT_EQ(peeked(message->key), "key");
}

TEST(ZlvI18Msg, ThePublicFormsReleaseTheMutex)
{
    ZlvI18Msg *message = ZlvAllocUI18Msg(nullptr, nullptr, u"text");
    ZlvFreeI18Msg(ZlvCopyI18Msg(message));
    taken(ZlvBindUI18Msg(message, noArgs()));
    ZlvFreeI18Msg(message);
    ASSERT_EQ(zlvAPIMutexLock(), 1);
    zlvAPIMutexUnlock();
}

TEST(ZlvI18Msg, TheInternalFormsTakeNoLock)
{
    ASSERT_EQ(zlvAPIMutexLock(), 1);
    MessageOwner message(zlvIntlAllocUI18Msg(nullptr, nullptr, u"text"));
    MessageOwner copy(zlvIntlCopyI18Msg(message.get()));
    EXPECT_EQ(taken(zlvIntlBindUI18Msg(copy.get(), noArgs())), u"text");
    zlvAPIMutexUnlock();
}

TEST(ZlvI18Msg, NullIsCopiedAndFreedAsNothing)
{
    EXPECT_EQ(ZlvCopyI18Msg(nullptr), nullptr);
    EXPECT_EQ(zlvIntlCopyI18Msg(nullptr), nullptr);
    ZlvFreeI18Msg(nullptr);
    zlvIntlFreeI18Msg(nullptr);
}

/* Copying. */

TEST(ZlvI18MsgCopy, OwnsItsStrings)
{
    MessageOwner message = makeMessage();
    MessageOwner copy(zlvIntlCopyI18Msg(message.get()));
    EXPECT_NE(copy->bundle, message->bundle);
    EXPECT_NE(copy->key, message->key);
    EXPECT_NE(copy->text, message->text);
    message.reset();
    EXPECT_EQ(peeked(copy->bundle), "bundle");
    EXPECT_EQ(peeked(copy->key), "key");
    EXPECT_EQ(peeked(copy->text), u"text");
}

TEST(ZlvI18MsgCopy, HasNoListWhenTheMessageHasNone)
{
    MessageOwner message = makeMessage();
    MessageOwner copy(zlvIntlCopyI18Msg(message.get()));
    EXPECT_EQ(copy->parameters, nullptr);
}

TEST(ZlvI18MsgCopy, OwnsACopyOfTheParameters)
{
    MessageOwner message = makeMessage();
    ZlvParm parm{ZLV_PARM_INT, {}};
    parm.value.intValue = 42;
    ASSERT_EQ(zlvIntlParmListAppend(zlvGetI18MsgParmList(message.get()), &parm), 1);
    MessageOwner copy(zlvIntlCopyI18Msg(message.get()));
    message.reset();
    ASSERT_NE(copy->parameters, nullptr);
    EXPECT_EQ(copy->parameters->count, 1u);
    EXPECT_EQ(ZlvParmListGetIndex(copy->parameters, 0)->value.intValue, 42);
}

TEST(ZlvI18MsgCopy, SharesTheLocaleAndTakesTheError)
{
    MessageOwner message = makeMessage();
    zlvSetI18MsgLocale(message.get(), "de");
    message->icuError = 17;
    MessageOwner copy(zlvIntlCopyI18Msg(message.get()));
    EXPECT_EQ(copy->locale, message->locale);
    EXPECT_EQ(copy->icuError, 17);
}

TEST(ZlvI18MsgCopy, KeepsItsLocaleWhenTheOtherGetsANewOne)
{
    MessageOwner message = makeMessage();
    zlvSetI18MsgLocale(message.get(), "de");
    MessageOwner copy(zlvIntlCopyI18Msg(message.get()));
    zlvSetI18MsgLocale(message.get(), "ja");
    EXPECT_EQ(peeked(copy->locale), "de");
    zlvSetI18MsgLocale(copy.get(), nullptr);
    EXPECT_EQ(peeked(message->locale), "ja");
}

TEST(ZlvI18MsgCopy, KeepsItsLocaleWhenTheOtherIsFreed)
{
    MessageOwner message = makeMessage();
    zlvSetI18MsgLocale(message.get(), "pt_BR");
    MessageOwner copy(zlvIntlCopyI18Msg(message.get()));
    message.reset();
    EXPECT_EQ(peeked(copy->locale), "pt_BR");
}

TEST(ZlvI18MsgCopy, IsNullWhenTheRecordCannotBeMade)
{
    MessageOwner message = makeMessage();
    FailAlloc fail(0);
    EXPECT_EQ(zlvIntlCopyI18Msg(message.get()), nullptr);
    EXPECT_EQ(fail.failed(), 1u);
}

/* Parameters and locale. */

TEST(ZlvI18MsgParameters, AreMadeEmptyOnceAndStay)
{
    MessageOwner message = makeMessage();
    ParmList *list = zlvGetI18MsgParmList(message.get());
    ASSERT_NE(list, nullptr);
    EXPECT_EQ(list->count, 0u);
    EXPECT_EQ(zlvGetI18MsgParmList(message.get()), list);
    EXPECT_EQ(message->parameters, list);
}

TEST(ZlvI18MsgParameters, OfNullAreNull)
{
    EXPECT_EQ(zlvGetI18MsgParmList(nullptr), nullptr);
}

TEST(ZlvI18MsgParameters, AreNullWhenTheyCannotBeMade)
{
    MessageOwner message = makeMessage();
    FailAlloc fail(0);
    EXPECT_EQ(zlvGetI18MsgParmList(message.get()), nullptr);
    EXPECT_EQ(fail.failed(), 1u);
}

TEST(ZlvI18MsgParameters, AreNotUsedByTheBind)
{
    MessageOwner message(zlvIntlAllocUI18Msg(nullptr, nullptr, u"{0,number,integer}"));
    ZlvParm parm{ZLV_PARM_INT, {}};
    parm.value.intValue = 42;
    zlvIntlParmListAppend(zlvGetI18MsgParmList(message.get()), &parm);
    withArgs([&](va_list args) { EXPECT_EQ(taken(zlvIntlBindUI18Msg(message.get(), args)), u"7"); },
             7);
}

TEST(ZlvI18MsgLocale, IsCopiedAndTheArgumentReturned)
{
    MessageOwner message = makeMessage();
    std::string locale = "de";
    EXPECT_EQ(zlvSetI18MsgLocale(message.get(), locale.c_str()), locale.c_str());
    locale = "ja";
    EXPECT_EQ(peeked(message->locale), "de");
}

TEST(ZlvI18MsgLocale, IsReplacedAndCleared)
{
    MessageOwner message = makeMessage();
    zlvSetI18MsgLocale(message.get(), "de");
    zlvSetI18MsgLocale(message.get(), "ja");
    EXPECT_EQ(peeked(message->locale), "ja");
    EXPECT_EQ(zlvSetI18MsgLocale(message.get(), nullptr), nullptr);
    EXPECT_EQ(message->locale, nullptr);
}

TEST(ZlvI18MsgLocale, CanBeSetToItself)
{
    MessageOwner message = makeMessage();
    zlvSetI18MsgLocale(message.get(), "de");
    zlvSetI18MsgLocale(message.get(), message->locale);
    EXPECT_EQ(peeked(message->locale), "de");
}

TEST(ZlvI18MsgLocale, OfANullMessageIsOnlyReturned)
{
    const char *locale = "de";
    EXPECT_EQ(zlvSetI18MsgLocale(nullptr, locale), locale);
}

/* Printing. */

class ZlvI18Print : public TestDir {
protected:
    ~ZlvI18Print() override
    {
        if (stream_)
            std::fclose(stream_);
    }

    /// TEXT in the code page that the Unicode library takes for the process's.
    static std::string inDefaultCodePage(const UChar *text)
    {
        std::string bytes(100, '\0');
        UErrorCode status = U_ZERO_ERROR;
        UConverter *converter = ucnv_open(nullptr, &status);
        bytes.resize(
            static_cast<size_t>(ucnv_fromUChars(converter, bytes.data(), 100, text, -1, &status)));
        ucnv_close(converter);
        return bytes;
    }

    /// What has reached the file so far.
    static std::string written() { return read("out"); }

    FILE *stream_ = std::fopen("out", "w");
};

TEST_F(ZlvI18Print, WritesTheTextAndALineFeedAtOnce)
{
    EXPECT_EQ(zlvI18PrintUCharAsLocal(stream_, u"text"), 0);
    EXPECT_EQ(written(), "text\n");
}

TEST_F(ZlvI18Print, OfAnEmptyTextWritesALineFeed)
{
    zlvI18PrintUCharAsLocal(stream_, u"");
    EXPECT_EQ(written(), "\n");
}

TEST_F(ZlvI18Print, KeepsLineFeedsOfTheText)
{
    zlvI18PrintUCharAsLocal(stream_, u"one\ntwo\r\n");
    EXPECT_EQ(written(), "one\ntwo\r\n\n");
}

TEST_F(ZlvI18Print, LeavesTheStreamOpenAndInOrder)
{
    std::fputs("a", stream_);
    zlvI18PrintUCharAsLocal(stream_, u"b");
    std::fputs("c", stream_);
    zlvI18PrintUCharAsLocal(stream_, u"d");
    EXPECT_EQ(written(), "ab\ncd\n");
}

TEST_F(ZlvI18Print, WritesLongTextsWhole)
{
    std::u16string text(100000, u'x');
    zlvI18PrintUCharAsLocal(stream_, text.c_str());
    std::string bytes(100001, 'x');
    bytes.back() = '\n';
    EXPECT_EQ(written(), bytes);
}

TEST_F(ZlvI18Print, ConvertsToTheDefaultCodePage)
{
    zlvI18PrintUCharAsLocal(stream_, u"é停😀");
    EXPECT_EQ(written(), inDefaultCodePage(u"é停😀\n"));
}

TEST_F(ZlvI18Print, SubstitutesWhatCannotBeConverted)
{
    constexpr char16_t loneSurrogate[] = {u'a', 0xD800, u'b', 0};
    zlvI18PrintUCharAsLocal(stream_, loneSurrogate);
    EXPECT_EQ(written(), inDefaultCodePage(loneSurrogate) + "\n");
    EXPECT_GT(written().size(), 3u);
}

TEST_F(ZlvI18Print, OfANullTextOrToANullStreamWritesNothing)
{
    EXPECT_EQ(zlvI18PrintUCharAsLocal(stream_, nullptr), 0);
    EXPECT_EQ(zlvI18PrintUCharAsLocal(nullptr, u"text"), 0);
    EXPECT_EQ(written(), "");
}

} // namespace
} // namespace zelvo_test
