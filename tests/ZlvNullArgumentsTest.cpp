// SPDX-License-Identifier: Apache-2.0
// Every public call, with each of its pointer arguments null in turn.
#include <algorithm>
#include <cstring>
#include <fstream>
#include <set>

#include "support/Console.h"
#include "support/NullCalls.h"
#include "support/TestDir.h"

namespace zelvo_test {
namespace {

std::vector<NullCall> allCalls()
{
    std::vector<NullCall> all = portabilityNullCalls();
    for (const auto &more : {containerNullCalls(), toolkitNullCalls(), classNullCalls()})
        all.insert(all.end(), more.begin(), more.end());
    return all;
}

class ZlvNullArguments : public TestDir, public testing::WithParamInterface<NullCall> {};

TEST_P(ZlvNullArguments, HaveADefinedResult)
{
    ASSERT_EQ(std::strlen(GetParam().answers), GetParam().pointers);
    Console quiet;
    for (size_t position = 0; position < GetParam().pointers; ++position) {
        if (GetParam().answers[position] == 'x')
            continue;
        SCOPED_TRACE("pointer argument " + std::to_string(position));
        GetParam().run(GetParam().answers[position], position);
    }
}

INSTANTIATE_TEST_SUITE_P(, ZlvNullArguments, testing::ValuesIn(allCalls()),
                         [](const auto &row) { return std::string(row.param.name); });

/// Whether NAME is that of a public call, rather than of an internal one or of data.
bool isPublicCall(const std::string &name)
{
    return name.starts_with("Zlv") || name.starts_with("Cx") || name.starts_with("Rko");
}

TEST(ZlvNullArgumentsTable, NamesEveryExportedPublicCallAndNoOther)
{
    std::set<std::string> exported;
    std::ifstream list(ZELVO_TEST_EXPORTS);
    for (std::string name; std::getline(list, name);)
        if (isPublicCall(name))
            exported.insert(name);
    std::set<std::string> named;
    for (const NullCall &call : allCalls())
        named.insert(call.name);
    EXPECT_FALSE(exported.empty());
    EXPECT_EQ(named, exported);
}

} // namespace
} // namespace zelvo_test
