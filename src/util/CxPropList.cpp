// SPDX-License-Identifier: Apache-2.0
// The property list: an array searched from its start. An entry whose strings could not be copied
// keeps null pointers; RkoStringCmp() finds null equal to nothing, so every search passes it over.
#include "CxPropList.h"

#include <algorithm>

#include "CxGrowth.h"
#include "CxMemory.h"
#include "CxOwned.h"
#include "CxString.h"

static constexpr int32_t FIRST_CAPACITY = 32;

ZlvBool cxPropListHasCapacity(CxPropList *list, int32_t extra)
{
    if (list == nullptr)
        return false;
    const int32_t present = list->entries == nullptr ? 0 : list->capacity;
    const int64_t need = int64_t{list->count} + extra + 1;
    const uint64_t capacity = zelvo::capacityFor(static_cast<uint64_t>(present), FIRST_CAPACITY,
                                                 static_cast<uint64_t>(std::max<int64_t>(need, 0)));
    if (capacity == static_cast<uint64_t>(present))
        return true;
    if (capacity > INT32_MAX)
        return false;
    void *entries = RkoMemoryRealloc(list->entries, capacity * sizeof(CxPropListEntry));
    if (entries == nullptr)
        return false;
    list->entries = static_cast<CxPropListEntry *>(entries);
    list->capacity = static_cast<int32_t>(capacity);
    return true;
}

static CxPropListEntry *find(const CxPropList *list, const char *key)
{
    if (list == nullptr)
        return nullptr;
    for (int32_t i = 0; i < list->count; ++i) {
        if (RkoStringCmp(list->entries[i].key, key) == 0)
            return &list->entries[i];
    }
    return nullptr;
}

static CxPropListEntry *appendEmptyEntry(CxPropList *list)
{
    if (!cxPropListHasCapacity(list, 1))
        return nullptr;
    CxPropListEntry *entry = &list->entries[list->count++];
    *entry = {};
    return entry;
}

ZlvBool CxPropListPutStr(CxPropList *list, const char *key, const char *value)
{
    if (list == nullptr || key == nullptr || value == nullptr)
        return false;
    CxPropListEntry *entry = find(list, key);
    const bool isNew = entry == nullptr;
    if (isNew)
        entry = appendEmptyEntry(list);
    if (entry == nullptr)
        return false;
    zelvo::OwnedStr valueCopy{RkoStringDup(value)};
    if (!valueCopy)
        return false;
    if (isNew)
        entry->key = RkoStringDup(key);
    if (entry->key == nullptr)
        return false;
    RkoMemoryFree(entry->value);
    entry->value = valueCopy.take();
    return true;
}

char *CxPropListPeekStr(const CxPropList *list, const char *key, ZlvBool *found)
{
    const CxPropListEntry *entry = find(list, key);
    if (found != nullptr)
        *found = entry != nullptr;
    return entry == nullptr ? nullptr : entry->value;
}

char *CxPropListCopyStr(const CxPropList *list, const char *key, ZlvBool *found)
{
    return RkoStringDup(CxPropListPeekStr(list, key, found));
}

ZlvBool CxPropListHasKey(const CxPropList *list, const char *key)
{
    return find(list, key) != nullptr;
}

static void freeStrings(const CxPropListEntry &entry)
{
    RkoMemoryFree(entry.value);
    RkoMemoryFree(entry.key);
}

ZlvBool CxPropListRemove(CxPropList *list, const char *key)
{
    CxPropListEntry *entry = find(list, key);
    if (entry == nullptr)
        return false;
    freeStrings(*entry);
    CxPropListEntry *last = &list->entries[--list->count];
    *entry = *last;
    *last = {};
    return true;
}

void CxPropListDiscard(CxPropList *list)
{
    if (list == nullptr)
        return;
    for (int32_t i = 0; i < list->count; ++i)
        freeStrings(list->entries[i]);
    RkoMemoryFree(list->entries);
    *list = {};
}

CxPropListIter CxPropListIterator(CxPropList *list)
{
    return {list, 0};
}

static CxPropListEntry *entryAt(const CxPropList *list, int64_t index)
{
    const bool isValid = list != nullptr && 0 <= index && index < list->count;
    return isValid ? &list->entries[index] : nullptr;
}

static const CxPropListEntry *current(const CxPropListIter *iterator)
{
    return iterator == nullptr ? nullptr : entryAt(iterator->list, iterator->index);
}

ZlvBool CxPropListIterHasNext(const CxPropListIter *iterator)
{
    return iterator != nullptr && iterator->index >= 0 &&
           entryAt(iterator->list, int64_t{iterator->index} + 1) != nullptr;
}

void CxPropListIterNext(CxPropListIter *iterator)
{
    if (iterator == nullptr || iterator->index < 0)
        return;
    if (CxPropListIterHasNext(iterator))
        ++iterator->index;
    else
        *iterator = {nullptr, 0};
}

char *CxPropListIterPeekKey(const CxPropListIter *iterator)
{
    const CxPropListEntry *entry = current(iterator);
    return entry == nullptr ? nullptr : entry->key;
}

char *CxPropListIterPeekVal(const CxPropListIter *iterator)
{
    const CxPropListEntry *entry = current(iterator);
    return entry == nullptr ? nullptr : entry->value;
}

char *CxPropListIterCopyKey(const CxPropListIter *iterator)
{
    return RkoStringDup(CxPropListIterPeekKey(iterator));
}

char *CxPropListIterCopyVal(const CxPropListIter *iterator)
{
    return RkoStringDup(CxPropListIterPeekVal(iterator));
}
