// SPDX-License-Identifier: Apache-2.0
// Items that an XML file holds once, before the first record after its handler opened.
#include <ostream>

#include "ZlvConsoleHandler.h"
#include "ZlvHandler.h"
#include "support/Records.h"

namespace zelvo_test {
namespace {

#define SERVER u" <Server Format=\"IP\">host</Server>\n"
#define PRODUCT u" <ProductId>Store</ProductId>\n"
#define COMPONENT u" <Component>Disk</Component>\n"
#define INSTANCE u" <ProductInstance>store-1</ProductInstance>\n"
#define BEFORE_ITEMS u"<Trace>\n" RECORD_TIME
#define BEHIND_ITEMS                                                                               \
    u" <LogText><![CDATA[text]]></LogText>\n <Source FileName=\"None\" Method=\"None\"/>\n"        \
    u"</Trace>\n"

class ZlvPDXMLSingleItems : public XMLRecordFixture {
protected:
    void SetUp() override
    {
        XMLRecordFixture::SetUp();
        console_ = handler("console");
        ZlvHandlerSetFormatter(console_, formatter_);
        set("server", "host");
        set("serverFormat", "IP");
        set("product", "Store");
        set("component", "Disk");
        set("productInstance", "store-1");
    }

    /// What the handler writes for the event; ICU's default converter is good for ASCII.
    std::u16string written()
    {
        return widened(console([&] {
            HeldMutex held;
            ZlvConsoleUHandlerFProcess(console_, event_, noArgs());
        }));
    }

    /// What the handler writes when it closes.
    std::u16string closed()
    {
        return widened(console([&] {
            HeldMutex held;
            ZlvConsoleHandlerFClose(console_);
        }));
    }

    static std::u16string widened(const std::string &bytes)
    {
        return std::u16string(bytes.begin(), bytes.end());
    }

    ZlvObject *console_ = nullptr;
};

struct SingleRow {
    const char *property;
    const char16_t *once;
    const char16_t *always;
};

void PrintTo(const SingleRow &row, std::ostream *out)
{
    *out << row.property;
}

class ZlvPDXMLSingleItem : public ZlvPDXMLSingleItems,
                           public testing::WithParamInterface<SingleRow> {
protected:
    void SetUp() override
    {
        ZlvPDXMLSingleItems::SetUp();
        setProp(formatter_, GetParam().property, "true");
        next_ = BEFORE_ITEMS + std::u16string(GetParam().always) + BEHIND_ITEMS u"\n";
        first_ = GetParam().once + next_;
    }

    std::u16string first_, next_;
};

TEST_P(ZlvPDXMLSingleItem, IsWrittenBeforeTheFirstRecordAndInNone)
{
    EXPECT_EQ(written(), first_);
    EXPECT_EQ(written(), next_);
    EXPECT_EQ(written(), next_);
}

TEST_P(ZlvPDXMLSingleItem, IsWrittenAgainWhenTheHandlerOpensAgain)
{
    EXPECT_EQ(written(), first_);
    EXPECT_EQ(closed(), u"");
    EXPECT_EQ(written(), first_);
    EXPECT_EQ(written(), next_);
}

TEST_P(ZlvPDXMLSingleItem, IsWrittenInEveryRecordWhenTurnedOff)
{
    written();
    setProp(formatter_, GetParam().property, "false");
    EXPECT_EQ(written(), BEFORE_ITEMS SERVER PRODUCT COMPONENT INSTANCE BEHIND_ITEMS u"\n");
}

TEST_P(ZlvPDXMLSingleItem, IsWrittenBeforeMessagesToo)
{
    ZlvSetEventIsMessage(event_, 1);
    EXPECT_EQ(written(), GetParam().once + std::u16string(u"<Message Id=\"None\">\n" RECORD_TIME) +
                             GetParam().always +
                             u" <LogText><![CDATA[text]]></LogText>\n</Message>\n\n");
}

INSTANTIATE_TEST_SUITE_P(
    , ZlvPDXMLSingleItem,
    testing::Values(SingleRow{"singleServer", SERVER, PRODUCT COMPONENT INSTANCE},
                    SingleRow{"singleProduct", PRODUCT, SERVER COMPONENT INSTANCE},
                    SingleRow{"singleComponent", COMPONENT, SERVER PRODUCT INSTANCE},
                    SingleRow{"singleProductId", INSTANCE, SERVER PRODUCT COMPONENT}),
    [](const auto &row) { return std::string(row.param.property); });

TEST_F(ZlvPDXMLSingleItems, AreWrittenTogetherInTheirOrder)
{
    for (const char *name : {"singleProductId", "singleComponent", "singleProduct", "singleServer"})
        setProp(formatter_, name, "true");
    EXPECT_EQ(written(), SERVER PRODUCT COMPONENT INSTANCE BEFORE_ITEMS BEHIND_ITEMS u"\n");
    EXPECT_EQ(written(), BEFORE_ITEMS BEHIND_ITEMS u"\n");
}

TEST_F(ZlvPDXMLSingleItems, AreNotWrittenWhenTheyBecomeSingleAfterTheFirstRecord)
{
    written();
    setProp(formatter_, "singleServer", "true");
    EXPECT_EQ(written(), BEFORE_ITEMS PRODUCT COMPONENT INSTANCE BEHIND_ITEMS u"\n");
    closed();
    EXPECT_EQ(written(), SERVER BEFORE_ITEMS PRODUCT COMPONENT INSTANCE BEHIND_ITEMS u"\n");
}

TEST_F(ZlvPDXMLSingleItems, ThatTheFirstEventLacksAreMissedUntilTheNextOpen)
{
    setProp(formatter_, "singleServer", "true");
    text(u"text");
    EXPECT_EQ(written(), BEFORE_ITEMS BEHIND_ITEMS u"\n");
    set("server", "host");
    set("serverFormat", "IP");
    EXPECT_EQ(written(), BEFORE_ITEMS BEHIND_ITEMS u"\n");
    closed();
    EXPECT_EQ(written(), SERVER BEFORE_ITEMS BEHIND_ITEMS u"\n");
}

TEST_F(ZlvPDXMLSingleItems, AreDueWithoutAHandlerToo)
{
    setProp(formatter_, "singleServer", "true");
    EXPECT_EQ(record(), SERVER BEFORE_ITEMS PRODUCT COMPONENT INSTANCE BEHIND_ITEMS);
    EXPECT_EQ(record(), BEFORE_ITEMS PRODUCT COMPONENT INSTANCE BEHIND_ITEMS);
}

TEST_F(ZlvPDXMLSingleItems, AreDueForOnlyOneOfTheHandlersOfAFormatter)
{
    setProp(formatter_, "singleServer", "true");
    {
        HeldMutex held;
        ZlvConsoleHandlerFOpen(console_);
    }
    EXPECT_EQ(record(), SERVER BEFORE_ITEMS PRODUCT COMPONENT INSTANCE BEHIND_ITEMS);
    EXPECT_EQ(written(), BEFORE_ITEMS PRODUCT COMPONENT INSTANCE BEHIND_ITEMS u"\n");
}

} // namespace
} // namespace zelvo_test
