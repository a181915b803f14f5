// SPDX-License-Identifier: Apache-2.0
// What the scenario chooses from, plain things and strange ones alike.
#pragma once

#include <string>

#include "Random.h"

namespace zelvo_equivalence {

/// Whether anyLocale() may give a locale that ICU knows nothing of.
void useUnknownLocales(bool use);
const char *anyLocale(Random &random);
const char16_t *anyZone(Random &random);
const char *anyDatePattern(Random &random); ///< now and then null, which means the default form
const char *anyConverter(Random &random);
const char *anySeparator(Random &random);
int32_t anyInteger(Random &random);
double anyDouble(Random &random);
double anyTime(Random &random);

/// Up to 5,000 units, none of them zero.
std::u16string anyText(Random &random);
/// Up to 600 bytes, none of them zero.
std::string anyBytes(Random &random);

} // namespace zelvo_equivalence
