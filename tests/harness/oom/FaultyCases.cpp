// SPDX-License-Identifier: Apache-2.0
// Calls as they might have been written by mistake. The sweep has to find the fault of each.
#include "Case.h"

namespace zelvo_test {
namespace {

/// Forgets its first block when the second cannot be had.
ZlvBool leak(World &)
{
    void *first = RkoMemoryMalloc(8);
    void *second = RkoMemoryMalloc(8);
    if (second == nullptr)
        return 0;
    RkoMemoryFree(first);
    RkoMemoryFree(second);
    return 1;
}

/// Tells of success although it has stored nothing.
ZlvBool pretend(World &world)
{
    ZlvStringListAppend(world.sample<StringList *>(), "element");
    return 1;
}

/// Lets go of what there is before it knows that it can replace it.
ZlvBool lose(World &world)
{
    CxStringBuffDiscard(world.sample<CxStringBuff *>());
    return CxStringBuffAppendStr(world.sample<CxStringBuff *>(), "text");
}

/// Refuses for good in a world in which it has failed once.
ZlvBool giveUp(World &world)
{
    static const World *failedIn = nullptr;
    void *block = RkoMemoryMalloc(8);
    failedIn = block == nullptr ? &world : failedIn;
    RkoMemoryFree(block);
    return failedIn != &world;
}

/// Uses what it has not got.
ZlvBool crash(World &)
{
    char *text = RkoStringDup("text");
    text[0] = 'T';
    RkoMemoryFree(text);
    return 1;
}

} // namespace

void addFaultyCases(Cases &cases)
{
    cases.push_back(specialCase("leak", Kind::Logger, leak));
    cases.push_back(specialCase("pretend", Kind::Logger, pretend));
    cases.push_back(specialCase("lose", Kind::Logger, lose));
    cases.push_back(specialCase("giveUp", Kind::Logger, giveUp));
    cases.push_back(specialCase("crash", Kind::Logger, crash));
}

} // namespace zelvo_test
