// SPDX-License-Identifier: Apache-2.0
// The arguments of a message: of which types ICU reads them, and lists that hold exactly those.
#pragma once

#include <cstdarg>
#include <cstdint>
#include <cstring>
#include <functional>
#include <string>
#include <vector>

#include "ZlvPatternScan.h"

namespace zelvo_fuzz {

/// Larger numbers make ICU allocate a slot for every number below.
constexpr size_t MOST_ARGUMENTS = 1000;

using Kinds = std::vector<zelvo::ArgKind>;

/// The text of an input as a pattern; some of its bytes stand for characters that matter.
std::u16string patternOf(std::string_view bytes);

/// The kinds of the arguments from {0} on, by ICU's own parser; false when it refuses the pattern.
bool kindsByIcu(const std::u16string &pattern, Kinds &kinds);

/// What to pass for a pattern: what ICU reads. Where ICU refuses the pattern it reads nothing, and
/// nobody can tell what is right; then what the library reads.
Kinds kindsToPass(const std::u16string &pattern);

/// An argument as it lies in a list.
uint64_t slotOf(zelvo::ArgKind kind, unsigned choice);

/// The value of such a slot.
const UChar *textIn(uint64_t slot);
double doubleIn(uint64_t slot);

/// The slots for arguments of these kinds.
std::vector<uint64_t> slotsOf(const Kinds &kinds, unsigned choice);

/// An argument list as the processor's conventions lay it out when the registers are used up.
struct StackOnlyList {
    uint32_t nextGeneral = 48;
    uint32_t nextFloating = 176;
    const void *onStack;
    const void *registers = nullptr;
};
static_assert(sizeof(StackOnlyList) == sizeof(va_list), "only x86-64 lays lists out like this");

/// Calls ACTION with a list of exactly these arguments, which end where their memory ends.
template <class Action>
void withList(const std::vector<uint64_t> &slots, Action action)
{
    StackOnlyList layout{.onStack = slots.data()};
    va_list list;
    std::memcpy(&list, &layout, sizeof layout);
    action(list);
}

} // namespace zelvo_fuzz
