// SPDX-License-Identifier: Apache-2.0
// Tables as tests: each row is a record with its name in the member "row".
#pragma once

#include <gtest/gtest.h>

#include <string>

namespace zelvo_test {

/// Names the instance of a row.
inline constexpr auto byRow = [](const auto &instance) { return std::string(instance.param.row); };

} // namespace zelvo_test
