// SPDX-License-Identifier: Apache-2.0
// Calls whose arguments all come from the world.
#pragma once

#include "Case.h"

#define PLAIN(call) plainCase(#call, Kind::Logger, call)
/// Both forms of a call.
#define PAIR(call) PLAIN(Zlv##call), PLAIN(zlvIntl##call)
