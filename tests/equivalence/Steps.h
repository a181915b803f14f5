// SPDX-License-Identifier: Apache-2.0
// What a scenario does, step by step.
#pragma once

#include "World.h"

namespace zelvo_equivalence {

// Records, in Records.cpp: through a logging call, and straight from a formatter.
void logMessage(World &world);
void logText(World &world);
void formatEvent(World &world);

// Single calls, in SingleCalls.cpp.
void bindMessage(World &world);
void formatDate(World &world);
void appendNumber(World &world);
void convertText(World &world);
void convertBytes(World &world);
void describe(World &world);
void callTogether(World &world);

// Changes, in Changes.cpp.
void changeLocale(World &world);
void changeZone(World &world);
void changeZoneVariable(World &world);
void meetZoneLate(World &world);
void changeConverter(World &world);
void changeDataDirectory(World &world);
void changeBundle(World &world);
void changeProperty(World &world);
void replaceFormatter(World &world);
void reopen(World &world);
void reopenWithoutIcu(World &world);

/// Sets the defaults that a scenario begins with.
void setDefaults(World &world);

} // namespace zelvo_equivalence
