// SPDX-License-Identifier: Apache-2.0
// Arrays kept in three variables of their user. The slot is a T ** for any T, so the pointer goes
// in and out by memcpy: reading it through a void ** would break the aliasing rules.
#include "CxListUtil.h"

#include <cstring>

#include "CxGrowth.h"
#include "CxMemory.h"

static void *load(const void *arraySlot)
{
    void *array = nullptr;
    std::memcpy(&array, arraySlot, sizeof array);
    return array;
}

static void store(void *arraySlot, void *array)
{
    std::memcpy(arraySlot, &array, sizeof array);
}

static bool resize(void *arraySlot, uint32_t *capacity, uint64_t elements, uint32_t elementSize)
{
    if (elements > UINT32_MAX)
        return false;
    void *array = RkoMemoryRealloc(load(arraySlot), elements * elementSize);
    if (array == nullptr)
        return false;
    store(arraySlot, array);
    *capacity = static_cast<uint32_t>(elements);
    return true;
}

ZlvBool CxListEnsureCapacity(void *arraySlot, uint32_t *capacity, uint32_t *length, uint32_t needed,
                             uint32_t elementSize)
{
    if (arraySlot == nullptr || capacity == nullptr || length == nullptr)
        return false;
    if (load(arraySlot) == nullptr) {
        if (!resize(arraySlot, capacity, needed, elementSize))
            return false;
        *length = 0;
        return true;
    }
    return *capacity >= needed ||
           resize(arraySlot, capacity, zelvo::doubledPast(16, needed), elementSize);
}

void CxListDiscard(void *arraySlot, uint32_t *capacity, uint32_t *length)
{
    if (arraySlot == nullptr || capacity == nullptr || length == nullptr)
        return;
    RkoMemoryFree(load(arraySlot));
    store(arraySlot, nullptr);
    *capacity = 0;
    *length = 0;
}
