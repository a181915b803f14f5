// SPDX-License-Identifier: Apache-2.0
// The queries for the names of registered classes.
#include "support/ClassEntries.h"
#include "support/ToolkitFixture.h"

#include "ZlvIntl.h"

namespace zelvo_test {
namespace {

struct Query {
    const char *name;
    StringGroupIterator (*ask)();
    StringGroupIterator (*twin)();
    std::vector<std::string> builtin;
};

class ZlvObjClassQuery : public ToolkitFixture, public testing::WithParamInterface<Query> {};

TEST_P(ZlvObjClassQuery, ListsTheBuiltinClassesOfItsKindAfterOpen)
{
    open();
    EXPECT_EQ(namesFrom(GetParam().ask()), GetParam().builtin);
}

TEST_P(ZlvObjClassQuery, ListsTheApplicationsClassesInTheOrderOfTheirRegistration)
{
    open();
    addAll("b_", false);
    addAll("a_", false);
    Names expected = GetParam().builtin;
    expected.push_back(std::string("b_") + GetParam().name);
    expected.push_back(std::string("a_") + GetParam().name);
    EXPECT_EQ(namesFrom(GetParam().ask()), expected);
}

TEST_P(ZlvObjClassQuery, GivesNothingWhileThereIsNoRegistry)
{
    EXPECT_EQ(GetParam().ask(), nullptr);
}

TEST_P(ZlvObjClassQuery, ItsTwinGivesTheSame)
{
    open();
    EXPECT_EQ(GetParam().twin(), GetParam().ask());
}

INSTANTIATE_TEST_SUITE_P(
    , ZlvObjClassQuery,
    testing::Values(Query{"logger",
                          ZlvGetLoggerClasses,
                          zlvIntlGetLoggerClasses,
                          {"zlv_basiclogger", "zlv_pdlogger"}},
                    Query{"filter",
                          ZlvGetFilterClasses,
                          zlvIntlGetFilterClasses,
                          {"zlv_levelfilter", "zlv_msgidfilter"}},
                    Query{"handler",
                          ZlvGetHandlerClasses,
                          zlvIntlGetHandlerClasses,
                          {"zlv_consolehandler", "zlv_filehandler", "zlv_multiproc_filehandler"}},
                    Query{"formatter",
                          ZlvGetFormatterClasses,
                          zlvIntlGetFormatterClasses,
                          {"zlv_basicformatter", "zlv_xmlformatter", "zlv_vyxtraceformatter"}}),
    [](const auto &row) { return std::string(row.param.name); });

} // namespace
} // namespace zelvo_test
