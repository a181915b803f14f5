// SPDX-License-Identifier: Apache-2.0
// The pieces of an XML record, each by itself.
#include "ZlvPDXMLFormatter.h"

#include <ostream>

#include "support/Buffers.h"
#include "support/Records.h"

namespace zelvo_test {
namespace {

class ZlvPDXMLPiece : public XMLRecordFixture {};

/* Level words. */

struct LevelRow {
    const char *label;
    ZlvLevel level;
    const char16_t *word;
};

void PrintTo(const LevelRow &row, std::ostream *out)
{
    *out << row.label;
}

class ZlvPDXMLLevelWord : public testing::TestWithParam<LevelRow> {};

TEST_P(ZlvPDXMLLevelWord, IsThatOfItsLevel)
{
    UBuff buff;
    zlvPDXMLEmitULevel(&buff, GetParam().level);
    EXPECT_EQ(buff.text(), GetParam().word);
}

constexpr LevelRow levels[] = {
    {"DebugMax", 1000, u"MAX"},       {"DebugMid", 2000, u"MID"},
    {"DebugMin", 3000, u"MIN"},       {"Info", 4000, u"INFO"},
    {"Warn", 5000, u"WARN"},          {"Error", 6000, u"ERROR"},
    {"Fatal", 7000, u"ERROR"},        {"All", 0, u"OTHER"},
    {"Off", 9999, u"OTHER"},          {"None", -9999, u"OTHER"},
    {"BelowDebugMax", 999, u"OTHER"}, {"BetweenInfoAndWarn", 4500, u"OTHER"},
    {"AboveFatal", 7001, u"OTHER"},   {"Smallest", INT32_MIN, u"OTHER"},
    {"Largest", INT32_MAX, u"OTHER"},
};

INSTANTIATE_TEST_SUITE_P(, ZlvPDXMLLevelWord, testing::ValuesIn(levels),
                         [](const auto &row) { return std::string(row.param.label); });

/* Attributes. */

class ZlvPDXMLRejectedKey : public testing::TestWithParam<const char *> {};

TEST_P(ZlvPDXMLRejectedKey, IsNoAttributeButItsNeighboursAre)
{
    const std::string key = GetParam();
    EXPECT_EQ(zlvPDXMLCheckKey(key.c_str()), 0);
    EXPECT_EQ(zlvPDXMLCheckKey((key + "s").c_str()), 1);
    EXPECT_EQ(zlvPDXMLCheckKey(key.substr(1).c_str()), 1);
    EXPECT_EQ(zlvPDXMLCheckKey(key.substr(0, key.size() - 1).c_str()), 1);
}

INSTANTIATE_TEST_SUITE_P(, ZlvPDXMLRejectedKey,
                         testing::Values("threadId", "correlationId", "client", "zlv_prop_srcfile",
                                         "zlv_prop_srcline", "zlv_prop_srcfunction", "server",
                                         "serverFormat", "product", "component", "productInstance",
                                         "processId"),
                         [](const auto &row) { return std::string(row.param); });

class ZlvPDXMLAcceptedKey : public testing::TestWithParam<const char *> {};

TEST_P(ZlvPDXMLAcceptedKey, IsAnAttribute)
{
    EXPECT_EQ(zlvPDXMLCheckKey(GetParam()), 1);
}

INSTANTIATE_TEST_SUITE_P(, ZlvPDXMLAcceptedKey,
                         testing::Values("organization", "", "user", "ThreadId", "PRODUCT",
                                         "server ", "zlv_prop_other"));

TEST_F(ZlvPDXMLPiece, TakesNoNullKeyAsAnAttribute)
{
    EXPECT_EQ(zlvPDXMLCheckKey(nullptr), 0);
}

/* Product items. */

struct ItemRow {
    const char *label;
    ZlvBool server, product, component, instance;
    const char16_t *text;
};

void PrintTo(const ItemRow &row, std::ostream *out)
{
    *out << row.label;
}

class ZlvPDXMLItems : public XMLRecordFixture, public testing::WithParamInterface<ItemRow> {};

TEST_P(ZlvPDXMLItems, AreThoseAskedForInTheirOrder)
{
    for (const char *name : {"productInstance", "component", "product", "server", "serverFormat"})
        set(name, name);
    const ItemRow &row = GetParam();
    UBuff buff;
    zlvPDXMLEmitUProductInfo(&buff, event_, row.server, row.product, row.component, row.instance);
    EXPECT_EQ(buff.text(), row.text);
}

#define SERVER u" <Server Format=\"serverFormat\">server</Server>\n"
#define PRODUCT u" <ProductId>product</ProductId>\n"
#define COMPONENT u" <Component>component</Component>\n"
#define INSTANCE u" <ProductInstance>productInstance</ProductInstance>\n"

constexpr ItemRow items[] = {
    {"None", 0, 0, 0, 0, u""},
    {"Instance", 0, 0, 0, 1, INSTANCE},
    {"Component", 0, 0, 1, 0, COMPONENT},
    {"ComponentInstance", 0, 0, 1, 1, COMPONENT INSTANCE},
    {"Product", 0, 1, 0, 0, PRODUCT},
    {"ProductInstance", 0, 1, 0, 1, PRODUCT INSTANCE},
    {"ProductComponent", 0, 1, 1, 0, PRODUCT COMPONENT},
    {"AllButServer", 0, 1, 1, 1, PRODUCT COMPONENT INSTANCE},
    {"Server", 1, 0, 0, 0, SERVER},
    {"ServerInstance", 1, 0, 0, 1, SERVER INSTANCE},
    {"ServerComponent", 1, 0, 1, 0, SERVER COMPONENT},
    {"AllButProduct", 1, 0, 1, 1, SERVER COMPONENT INSTANCE},
    {"ServerProduct", 1, 1, 0, 0, SERVER PRODUCT},
    {"AllButComponent", 1, 1, 0, 1, SERVER PRODUCT INSTANCE},
    {"AllButInstance", 1, 1, 1, 0, SERVER PRODUCT COMPONENT},
    {"All", 1, 1, 1, 1, SERVER PRODUCT COMPONENT INSTANCE},
};

INSTANTIATE_TEST_SUITE_P(, ZlvPDXMLItems, testing::ValuesIn(items),
                         [](const auto &row) { return std::string(row.param.label); });

TEST_F(ZlvPDXMLPiece, WritesNoItemThatTheEventLacks)
{
    UBuff buff;
    set("serverFormat", "IP");
    zlvPDXMLEmitUProductInfo(&buff, event_, 1, 1, 1, 1);
    EXPECT_EQ(buff.text(), u"");
}

TEST_F(ZlvPDXMLPiece, WritesAServerWithoutFormat)
{
    UBuff buff;
    set("server", "host");
    zlvPDXMLEmitUProductInfo(&buff, event_, 1, 1, 1, 1);
    EXPECT_EQ(buff.text(), u" <Server Format=\"\">host</Server>\n");
}

TEST_F(ZlvPDXMLPiece, WritesItemsThatAreEmpty)
{
    UBuff buff;
    for (const char *name : {"productInstance", "component", "product", "server"})
        set(name, "");
    zlvPDXMLEmitUProductInfo(&buff, event_, 1, 1, 1, 1);
    EXPECT_EQ(buff.text(), u" <Server Format=\"\"></Server>\n <ProductId></ProductId>\n"
                           u" <Component></Component>\n <ProductInstance></ProductInstance>\n");
}

/* Source. */

struct SourceRow {
    const char *label;
    const char *file;
    const char *function;
    const char *line;
    const char16_t *text;
};

void PrintTo(const SourceRow &row, std::ostream *out)
{
    *out << row.label;
}

class ZlvPDXMLSource : public XMLRecordFixture, public testing::WithParamInterface<SourceRow> {};

TEST_P(ZlvPDXMLSource, IsWhatTheEventHasIfItHasAFile)
{
    const SourceRow &row = GetParam();
    set("zlv_prop_srcline", row.line);
    set("zlv_prop_srcfunction", row.function);
    set("zlv_prop_srcfile", row.file);
    UBuff buff;
    EXPECT_EQ(zlvPDXMLEmitUSource(&buff, event_), row.file != nullptr ? 1 : 0);
    EXPECT_EQ(buff.text(), row.text);
}

constexpr SourceRow sources[] = {
    {"Nothing", nullptr, nullptr, nullptr, u""},
    {"Line", nullptr, nullptr, "12", u""},
    {"Function", nullptr, "f", nullptr, u""},
    {"FunctionLine", nullptr, "f", "12", u""},
    {"File", "a.c", nullptr, nullptr, u" <Source FileName=\"a.c\"/>\n"},
    {"FileLine", "a.c", nullptr, "12", u" <Source FileName=\"a.c\" Line=\"12\"/>\n"},
    {"FileFunction", "a.c", "f", nullptr, u" <Source FileName=\"a.c\" Method=\"f\"/>\n"},
    {"All", "a.c", "f", "12", u" <Source FileName=\"a.c\" Method=\"f\" Line=\"12\"/>\n"},
    {"LineZero", "a.c", "f", "0", u" <Source FileName=\"a.c\" Method=\"f\" Line=\"0\"/>\n"},
    {"LineBelowZero", "a.c", "f", "-5", u" <Source FileName=\"a.c\" Method=\"f\" Line=\"-5\"/>\n"},
    {"LineThatIsNoNumber", "a.c", "f", "x", u" <Source FileName=\"a.c\" Method=\"f\"/>\n"},
    {"Empty", "", "", nullptr, u" <Source FileName=\"\" Method=\"\"/>\n"},
};

INSTANTIATE_TEST_SUITE_P(, ZlvPDXMLSource, testing::ValuesIn(sources),
                         [](const auto &row) { return std::string(row.param.label); });

/* Null arguments of the pieces. */

TEST_F(ZlvPDXMLPiece, WritesNoPieceIntoNoBuffer)
{
    key("plain");
    set("zlv_prop_srcfile", "a.c");
    HeldMutex held;
    zlvPDXMLEmitULevel(nullptr, ZLV_LEVEL_INFO);
    zlvPDXMLEmitUProductInfo(nullptr, event_, 1, 1, 1, 1);
    zlvPDXMLEmitUTranslationInfo(nullptr, event_, noArgs());
    EXPECT_EQ(zlvPDXMLEmitUSource(nullptr, event_), 1); // the event has a source all the same
}

TEST_F(ZlvPDXMLPiece, WritesNoPieceOfNoEvent)
{
    UBuff buff;
    HeldMutex held;
    zlvPDXMLEmitUProductInfo(&buff, nullptr, 1, 1, 1, 1);
    zlvPDXMLEmitUTranslationInfo(&buff, nullptr, noArgs());
    EXPECT_EQ(zlvPDXMLEmitUSource(&buff, nullptr), 0);
    EXPECT_EQ(buff.text(), u"");
}

} // namespace
} // namespace zelvo_test
