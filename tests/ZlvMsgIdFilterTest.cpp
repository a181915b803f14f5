// SPDX-License-Identifier: Apache-2.0
// What the filter by message identifiers accepts, and where identifiers come from.
#include "ZlvMsgIdFilter.h"

#include <ostream>

#include "support/FailAlloc.h"
#include "support/MsgIdFilterFixture.h"

namespace zelvo_test {
namespace {

class ZlvMsgIdFilter : public MsgIdFilterFixture {};

/* The mode and the patterns decide. */

struct DecisionRow {
    const char *label;
    const char *mode;   ///< null: never set
    const char *msgIds; ///< null: never set
    const char *id;
    bool passes;
};

void PrintTo(const DecisionRow &row, std::ostream *out)
{
    *out << row.label;
}

class ZlvMsgIdFilterDecides : public ZlvMsgIdFilter,
                              public testing::WithParamInterface<DecisionRow> {};

TEST_P(ZlvMsgIdFilterDecides, ByModeAndPatterns)
{
    if (GetParam().mode != nullptr)
        setProp(ids_, "mode", GetParam().mode);
    if (GetParam().msgIds != nullptr)
        setProp(ids_, "msgIds", GetParam().msgIds);
    EXPECT_EQ(passes(GetParam().id), GetParam().passes);
}

const DecisionRow decisions[] = {
    {"DefaultDropsInformation", nullptr, nullptr, "ABC0001I", false},
    {"DefaultDropsWarnings", nullptr, nullptr, "ABC0001W", false},
    {"DefaultPassesErrors", nullptr, nullptr, "ABC0001E", true},
    {"DefaultPassesTheEmptyIdentifier", nullptr, nullptr, "", true},
    {"DefaultPassesWhatHasTheLetterEarlierToo", nullptr, nullptr, "ABI0001I", true},
    {"BlockDropsWhatMatches", "BLOCK", "ABC*", "ABC0001E", false},
    {"BlockPassesWhatDoesNotMatch", "BLOCK", "ABC*", "XYZ0001E", true},
    {"BlockPassesTheEmptyIdentifier", "BLOCK", "ABC*", "", true},
    {"BlockOfAllDropsTheEmptyIdentifier", "BLOCK", "*", "", false},
    {"BlockOfNoPatternPasses", "BLOCK", "", "ABC0001E", true},
    {"PassthruPassesWhatMatches", "PASSTHRU", "ABC*", "ABC0001E", true},
    {"PassthruDropsWhatDoesNotMatch", "PASSTHRU", "ABC*", "XYZ0001E", false},
    {"PassthruDropsTheEmptyIdentifier", "PASSTHRU", "ABC*", "", false},
    {"PassthruOfAllPassesAnIdentifier", "PASSTHRU", "*", "XYZ0001E", true},
    {"PassthruOfAllPassesTheEmptyIdentifier", "PASSTHRU", "*", "", true},
    {"PassthruOfNoPatternDrops", "PASSTHRU", "", "ABC0001E", false},
    {"PassthruOfTheDefaults", "PASSTHRU", nullptr, "ABC0001I", true},
    {"TheSecondPatternMatches", "BLOCK", "ABC* XYZ*", "XYZ0001E", false},
    {"NeitherPatternMatches", "BLOCK", "ABC* XYZ*", "KLM0001E", true},
};

INSTANTIATE_TEST_SUITE_P(, ZlvMsgIdFilterDecides, testing::ValuesIn(decisions),
                         [](const auto &row) { return std::string(row.param.label); });

/* Where the identifier comes from. */

TEST_F(ZlvMsgIdFilter, TakesTheIdentifierFromTheStartOfTheText)
{
    EXPECT_FALSE(passesText(u"ABC0001I started"));
    EXPECT_TRUE(passesText(u"ABC0001E stopped"));
}

TEST_F(ZlvMsgIdFilter, StoresTheIdentifierThatItFound)
{
    EXPECT_TRUE(passesText(u"ABC0001E stopped"));
    EXPECT_EQ(records()[0].messageId, "ABC0001E");
}

TEST_F(ZlvMsgIdFilter, StoresTheEmptyIdentifierWhenTheTextHoldsNone)
{
    EXPECT_TRUE(passesText(u"stopped"));
    EXPECT_EQ(records()[0].messageId, "");
}

TEST_F(ZlvMsgIdFilter, StoresTheIdentifierOfWhatItDropsToo)
{
    OwnEvent event(u"ABC0001I started");
    EXPECT_EQ(ZlvMsgIdFilterFIsLoggable(ids_, event.get(), noArgs()), 0);
    EXPECT_EQ(event.messageId(), "ABC0001I");
}

TEST_F(ZlvMsgIdFilter, BindsTheTextWithTheArguments)
{
    Recorder::clear();
    ZlvLogUText(app_, u"{0} {1,number,integer}", u"ABC0001I", 5);
    EXPECT_TRUE(records().empty());
    ZlvLogUText(app_, u"{0} {1,number,integer}", u"ABC0001E", 5);
    ASSERT_EQ(records().size(), 1u);
    EXPECT_EQ(records()[0].text, u"ABC0001E 5"); // the arguments are there for those behind it
}

TEST_F(ZlvMsgIdFilter, KeepsTheIdentifierThatTheEventHas)
{
    OwnEvent event(u"ABC0001E stopped");
    ZlvSetEventMessageId(event.get(), "XYZ0001I");
    EXPECT_EQ(ZlvMsgIdFilterFIsLoggable(ids_, event.get(), noArgs()), 0);
    EXPECT_EQ(event.messageId(), "XYZ0001I");
}

TEST_F(ZlvMsgIdFilter, TakesTheEmptyIdentifierForOne)
{
    OwnEvent event(u"ABC0001I started");
    ZlvSetEventMessageId(event.get(), "");
    EXPECT_EQ(ZlvMsgIdFilterFIsLoggable(ids_, event.get(), noArgs()), 1);
    EXPECT_EQ(event.messageId(), "");
}

TEST_F(ZlvMsgIdFilter, AsksForNoIdentifierWhileDisabled)
{
    ZlvSetObjectEnabled(ids_, 0);
    OwnEvent event(u"ABC0001E stopped");
    ZlvBasicFilterFProcess(ids_, event.get(), noArgs());
    EXPECT_EQ(event.messageId(), std::nullopt);
    EXPECT_TRUE(records().empty());
}

/* The object that computes identifiers. */

TEST_F(ZlvMsgIdFilter, HoldsTheFormatterOfThatName)
{
    ASSERT_NE(vars()->formatter, nullptr);
    EXPECT_STREQ(vars()->formatter->name, "msgFormatter");
    EXPECT_STREQ(vars()->formatter->objClass->name, "zlv_xmlformatter");
    EXPECT_EQ(zlvToolkitGetObjInstance("msgFormatter"), vars()->formatter);
}

TEST_F(ZlvMsgIdFilter, SharesTheFormatterWithOtherFilters)
{
    const ZlvObject *second = filter("second", "zlv_msgidfilter");
    EXPECT_EQ(static_cast<MsgIdFilterVars *>(second->vars)->formatter, vars()->formatter);
}

class ZlvMsgIdFilterFormatter : public ToolkitFixture {
protected:
    static ZlvObject *formatterOf(const ZlvObject *filter)
    {
        return static_cast<MsgIdFilterVars *>(filter->vars)->formatter;
    }
};

TEST_F(ZlvMsgIdFilterFormatter, IsLetGoOfWithTheFilter)
{
    open();
    ZlvObject *ids = ZlvGetObject("ids", "zlv_msgidfilter");
    EXPECT_NE(formatterOf(ids), nullptr);
    ZlvReleaseObject(ids);
    EXPECT_EQ(zlvToolkitGetObjInstance("msgFormatter"), nullptr);
}

TEST_F(ZlvMsgIdFilterFormatter, IsTheOneThatThereIs)
{
    open();
    const ZlvObject *mine = formatter("msgFormatter", "zlv_xmlformatter");
    EXPECT_EQ(formatterOf(filter("ids", "zlv_msgidfilter")), mine);
}

TEST_F(ZlvMsgIdFilterFormatter, IsMadeFromItsConfiguration)
{
    open("msgFormatter.separator=;\n");
    const ZlvObject *made = formatterOf(filter("ids", "zlv_msgidfilter"));
    ASSERT_NE(made, nullptr);
    EXPECT_STREQ(made->formatter.separator, ";");
}

/// The name of the formatter belongs to an object of another class.
class ZlvMsgIdFilterWithoutFormatter : public ZlvMsgIdFilter {
protected:
    void SetUp() override
    {
        ToolkitFixture::open();
        logger("msgFormatter");
        ZlvMsgIdFilter::SetUp();
    }
};

TEST_F(ZlvMsgIdFilterWithoutFormatter, HasNone)
{
    EXPECT_EQ(vars()->formatter, nullptr);
}

TEST_F(ZlvMsgIdFilterWithoutFormatter, ComputesIdentifiersAllTheSame)
{
    EXPECT_FALSE(passesText(u"ABC0001I started"));
    EXPECT_TRUE(passesText(u"ABC0001E stopped"));
    EXPECT_EQ(records()[0].messageId, "ABC0001E");
}

/* The list of patterns. */

using Names = std::vector<std::string>;

Names split(const char *text)
{
    StringList *list = ZlvMsgIdFilterGetStringList(text);
    Names parts;
    for (const StringListNode *node = list->first; node != nullptr; node = node->next)
        parts.emplace_back(node->element);
    zlvIntlFreeStringList(list);
    return parts;
}

TEST(ZlvMsgIdFilterGetStringList, SplitsAtBlanksTabsAndLineEnds)
{
    EXPECT_EQ(split("*W *I"), (Names{"*W", "*I"}));
    EXPECT_EQ(split("a\tb\nc\rd"), (Names{"a", "b", "c", "d"}));
    EXPECT_EQ(split(" \t a \r\n b \n"), (Names{"a", "b"}));
}

TEST(ZlvMsgIdFilterGetStringList, SplitsAtNothingElse)
{
    EXPECT_EQ(split("a,b;c\vd\fe"), Names{"a,b;c\vd\fe"});
}

TEST(ZlvMsgIdFilterGetStringList, KeepsWhatComesTwice)
{
    EXPECT_EQ(split("a b a"), (Names{"a", "b", "a"}));
}

TEST(ZlvMsgIdFilterGetStringList, OfNothingIsEmptyButThere)
{
    EXPECT_EQ(split(nullptr), Names{});
    EXPECT_EQ(split(""), Names{});
    EXPECT_EQ(split(" \t\r\n"), Names{});
}

TEST(ZlvMsgIdFilterGetStringList, WithoutMemoryIsNull)
{
    FailAlloc fail(0);
    EXPECT_EQ(ZlvMsgIdFilterGetStringList("a b"), nullptr);
    EXPECT_GT(fail.failed(), 0u);
}

TEST(ZlvMsgIdFilterMatchMsgId, TriesEachPattern)
{
    StringList *list = ZlvMsgIdFilterGetStringList("AB* *E");
    EXPECT_EQ(ZlvMsgIdFilterMatchMsgId(list, "ABC"), 1);
    EXPECT_EQ(ZlvMsgIdFilterMatchMsgId(list, "XYZ0001E"), 1);
    EXPECT_EQ(ZlvMsgIdFilterMatchMsgId(list, "XYZ0001W"), 0);
    EXPECT_EQ(ZlvMsgIdFilterMatchMsgId(list, ""), 0);
    zlvIntlFreeStringList(list);
}

TEST(ZlvMsgIdFilterMatchMsgId, OfNullIsFalse)
{
    StringList *all = ZlvMsgIdFilterGetStringList("*");
    EXPECT_EQ(ZlvMsgIdFilterMatchMsgId(all, nullptr), 0);
    EXPECT_EQ(ZlvMsgIdFilterMatchMsgId(nullptr, "ABC"), 0);
    EXPECT_EQ(ZlvMsgIdFilterMatchMsgId(nullptr, nullptr), 0);
    zlvIntlFreeStringList(all);
}

TEST(ZlvMsgIdFilterMatchMsgId, OfAnEmptyListIsFalse)
{
    StringList *none = ZlvMsgIdFilterGetStringList("");
    EXPECT_EQ(ZlvMsgIdFilterMatchMsgId(none, "ABC"), 0);
    zlvIntlFreeStringList(none);
}

} // namespace
} // namespace zelvo_test
