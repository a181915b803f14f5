// SPDX-License-Identifier: Apache-2.0
// Made by scripts/mkGroupTemplate; do not edit.
#include "ZlvStringGroup.h"

#include "ZlvGroupImpl.h"
#include "ZlvOwned.h"

using zelvo::ApiLock;

namespace {

/// How elements come in, are handed out and go.
struct Traits {
    using Header = StringGroup;
    using Node = StringGroupNode;
    using Element = char *;
    using Given = const char *;
    static constexpr bool deferred = false;

    static char *takeIn(const char *element) { return RkoStringDup(element); }
    static char *handOut(char *element) { return RkoStringDup(element); }
    static void letGo(char *element) { RkoMemoryFree(element); }
    static bool same(const char *a, const char *b) { return zelvo::sameText(a, b); }
};

using Impl = zelvo::GroupImpl<Traits>;

} // namespace

StringGroup *zlvIntlAllocStringGroup(void)
{
    return zelvo::allocRecord<StringGroup>();
}

StringGroup *ZlvAllocStringGroup(void)
{
    ApiLock lock;
    return lock ? zlvIntlAllocStringGroup() : nullptr;
}

void zlvIntlFreeStringGroup(StringGroup *group)
{
    Impl::free(group);
}

void ZlvFreeStringGroup(StringGroup *group)
{
    ApiLock lock;
    if (lock)
        zlvIntlFreeStringGroup(group);
}

StringGroupIterator zlvIntlStringGroupIterator(const StringGroup *group)
{
    return zelvo::firstNode(group);
}

StringGroupIterator ZlvStringGroupIterator(const StringGroup *group)
{
    ApiLock lock;
    return lock ? zlvIntlStringGroupIterator(group) : nullptr;
}

ZlvBool zlvIntlStringGroupIterHasNext(StringGroupIterator iterator)
{
    return iterator != nullptr;
}

ZlvBool ZlvStringGroupIterHasNext(StringGroupIterator iterator)
{
    ApiLock lock;
    return lock && zlvIntlStringGroupIterHasNext(iterator);
}

StringGroupIterator zlvIntlStringGroupIterNext(StringGroupIterator iterator)
{
    return zelvo::nextNode(iterator);
}

StringGroupIterator ZlvStringGroupIterNext(StringGroupIterator iterator)
{
    ApiLock lock;
    return lock ? zlvIntlStringGroupIterNext(iterator) : nullptr;
}

char *zlvIntlStringGroupIterGet(StringGroupIterator iterator)
{
    return Impl::iterGet(iterator);
}

char *ZlvStringGroupIterGet(StringGroupIterator iterator)
{
    ApiLock lock;
    return lock ? zlvIntlStringGroupIterGet(iterator) : nullptr;
}

StringGroupIterator zlvIntlStringGroupIterRem(StringGroupIterator iterator)
{
    return Impl::iterRemove(iterator);
}

StringGroupIterator ZlvStringGroupIterRem(StringGroupIterator iterator)
{
    ApiLock lock;
    return lock ? zlvIntlStringGroupIterRem(iterator) : nullptr;
}

StringGroupNode *ZlvStringGroupGetLink(const StringGroup *group, const char *element)
{
    return Impl::getLink(group, element);
}

ZlvBool zlvIntlStringGroupAdd(StringGroup *group, const char *element)
{
    return Impl::add(group, element);
}

ZlvBool ZlvStringGroupAdd(StringGroup *group, const char *element)
{
    ApiLock lock;
    return lock && zlvIntlStringGroupAdd(group, element);
}

ZlvBool zlvIntlStringGroupRem(StringGroup *group, const char *element)
{
    return Impl::removeElement(group, element);
}

ZlvBool ZlvStringGroupRem(StringGroup *group, const char *element)
{
    ApiLock lock;
    return lock && zlvIntlStringGroupRem(group, element);
}
