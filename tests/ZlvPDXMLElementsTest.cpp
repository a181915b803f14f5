// SPDX-License-Identifier: Apache-2.0
// Whole XML records again: one optional element each, every kind, every source of an identifier.
#include <ostream>

#include "support/Records.h"

#define TEXT u" <LogText><![CDATA[text]]></LogText>\n"
#define NO_SOURCE u" <Source FileName=\"None\" Method=\"None\"/>\n"

namespace zelvo_test {
namespace {

class ZlvPDXMLElements : public XMLRecordFixture {
protected:
    /// The record of the event with PROPERTY = VALUE.
    UText recordWith(const char *property, const char *value)
    {
        set(property, value);
        return record();
    }
};

/* Each optional element alone. */

struct ElementRow {
    const char *property;
    const char *value;
    const char16_t *record;
};

void PrintTo(const ElementRow &row, std::ostream *out)
{
    *out << row.property << '=' << row.value;
}

class ZlvPDXMLElement : public ZlvPDXMLElements, public testing::WithParamInterface<ElementRow> {};

TEST_P(ZlvPDXMLElement, StandsInItsPlace)
{
    EXPECT_EQ(recordWith(GetParam().property, GetParam().value), GetParam().record);
}

#define OPEN u"<Trace>\n" RECORD_TIME
#define CLOSE NO_SOURCE u"</Trace>\n"

const ElementRow elements[] = {
    {"server", "x", OPEN u" <Server Format=\"\">x</Server>\n" TEXT CLOSE},
    {"product", "x", OPEN u" <ProductId>x</ProductId>\n" TEXT CLOSE},
    {"component", "x", OPEN u" <Component>x</Component>\n" TEXT CLOSE},
    {"productInstance", "x", OPEN u" <ProductInstance>x</ProductInstance>\n" TEXT CLOSE},
    {"organization", "x",
     OPEN TEXT u" <LogAttribs><Key>organization</Key><Value>x</Value></LogAttribs>\n" CLOSE},
    {"zlv_prop_srcfile", "x", OPEN TEXT u" <Source FileName=\"x\"/>\n</Trace>\n"},
    {"threadId", "3", OPEN TEXT NO_SOURCE u" <Thread>3</Thread>\n</Trace>\n"},
    {"processId", "4", OPEN TEXT NO_SOURCE u" <Process>4</Process>\n</Trace>\n"},
    {"correlationId", "x", OPEN TEXT NO_SOURCE u" <CorrelationId>x</CorrelationId>\n</Trace>\n"},
    {"client", "x", OPEN TEXT NO_SOURCE u" <Principal>x</Principal>\n</Trace>\n"},
    {"serverFormat", "x", OPEN TEXT CLOSE},
    {"zlv_prop_srcfunction", "x", OPEN TEXT CLOSE},
    {"zlv_prop_srcline", "7", OPEN TEXT CLOSE},
};

INSTANTIATE_TEST_SUITE_P(, ZlvPDXMLElement, testing::ValuesIn(elements),
                         [](const auto &row) { return std::string(row.param.property); });

TEST_F(ZlvPDXMLElements, ShowsAThreadBelowZeroAsAVeryLargeNumber)
{
    EXPECT_EQ(recordWith("threadId", "-1"),
              OPEN TEXT NO_SOURCE u" <Thread>18446744073709551615</Thread>\n</Trace>\n");
}

TEST_F(ZlvPDXMLElements, ShowsTheSmallestThreadWidenedWithItsSign)
{
    EXPECT_EQ(recordWith("threadId", "-2147483648"),
              OPEN TEXT NO_SOURCE u" <Thread>18446744071562067968</Thread>\n</Trace>\n");
}

TEST_F(ZlvPDXMLElements, ShowsAProcessBelowZeroWithItsSign)
{
    EXPECT_EQ(recordWith("processId", "-5"),
              OPEN TEXT NO_SOURCE u" <Process>-5</Process>\n</Trace>\n");
}

TEST_F(ZlvPDXMLElements, LeavesOutAThreadAndAProcessThatAreNoNumbers)
{
    set("threadId", "main");
    EXPECT_EQ(recordWith("processId", "init"), OPEN TEXT CLOSE);
}

/* Kinds. */

struct KindRow {
    const char *label;
    const char *asMessage, *asTrace;
    ZlvBool event;
    bool message;
};

void PrintTo(const KindRow &row, std::ostream *out)
{
    *out << row.label;
}

class ZlvPDXMLKind : public ZlvPDXMLElements, public testing::WithParamInterface<KindRow> {};

TEST_P(ZlvPDXMLKind, IsTheEventsOwnUnlessExactlyOneIsForced)
{
    setProp(formatter_, "forceAsMessage", GetParam().asMessage);
    setProp(formatter_, "forceAsTrace", GetParam().asTrace);
    ZlvSetEventIsMessage(event_, GetParam().event);
    EXPECT_EQ(record(), GetParam().message
                            ? u"<Message Id=\"None\">\n" RECORD_TIME TEXT u"</Message>\n"
                            : u"<Trace>\n" RECORD_TIME TEXT NO_SOURCE u"</Trace>\n");
}

constexpr KindRow kinds[] = {
    {"NothingForcedOnATrace", "false", "false", 0, false},
    {"NothingForcedOnAMessage", "false", "false", 1, true},
    {"MessageForcedOnATrace", "true", "false", 0, true},
    {"MessageForcedOnAMessage", "true", "false", 1, true},
    {"TraceForcedOnATrace", "false", "true", 0, false},
    {"TraceForcedOnAMessage", "false", "true", 1, false},
    {"BothForcedOnATrace", "true", "true", 0, false},
    {"BothForcedOnAMessage", "true", "true", 1, true},
};

INSTANTIATE_TEST_SUITE_P(, ZlvPDXMLKind, testing::ValuesIn(kinds),
                         [](const auto &row) { return std::string(row.param.label); });

/* Identifiers. */

struct IdRow {
    const char *label;
    const char *own;
    const char16_t *text;
    const char16_t *shown;
};

void PrintTo(const IdRow &row, std::ostream *out)
{
    *out << row.label;
}

class ZlvPDXMLId : public ZlvPDXMLElements, public testing::WithParamInterface<IdRow> {};

TEST_P(ZlvPDXMLId, IsTheEventsOwnOrElseThatOfItsText)
{
    const IdRow &row = GetParam();
    text(row.text);
    ZlvSetEventIsMessage(event_, 1);
    ZlvSetEventMessageId(event_, row.own);
    EXPECT_EQ(record(), u"<Message Id=\"" + std::u16string(row.shown) +
                            u"\">\n" RECORD_TIME u" <LogText><![CDATA[" + row.text +
                            u"]]></LogText>\n</Message>\n");
    EXPECT_EQ(peeked(event_->messageId), peeked(row.own));
}

const IdRow ids[] = {
    {"FromTheText", nullptr, u"KDY1234E Disk full", u"KDY1234E"},
    {"NoneInTheText", nullptr, u"disk full", u"None"},
    {"NoneInALongerWord", nullptr, u"KDY1234x", u"None"},
    {"NotBehindAnAccent", nullptr, u"\u00C9BC123I", u"None"},
    {"Own", "own", u"text", u"own"},
    {"OwnBeforeThatOfTheText", "own", u"KDY1234E Disk full", u"own"},
    {"OwnEmpty", "", u"KDY1234E Disk full", u"None"},
};

INSTANTIATE_TEST_SUITE_P(, ZlvPDXMLId, testing::ValuesIn(ids),
                         [](const auto &row) { return std::string(row.param.label); });

} // namespace
} // namespace zelvo_test
