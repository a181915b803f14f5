// SPDX-License-Identifier: Apache-2.0
// Locale names that live as long as the process. Events and messages point at them, so setting a
// locale, sharing it between copies and dropping it costs nothing, leaks nothing and dangles
// nowhere. Names are never dropped: a process knows only a few.
#pragma once

namespace zelvo {

/// Gives the one lasting copy of a name; null for a null name or when memory ran out. Safe to call
/// from several threads at once, without the API mutex.
const char *internLocaleName(const char *name);

} // namespace zelvo
