// SPDX-License-Identifier: Apache-2.0
#include "CxMemory.h"

#include <cstdlib>

void *RkoMemoryMalloc(size_t size)
{
    return size == 0 ? nullptr : std::malloc(size);
}

void *RkoMemoryCalloc(size_t count, size_t size)
{
    return count == 0 || size == 0 ? nullptr : std::calloc(count, size);
}

void *RkoMemoryRealloc(void *block, size_t size)
{
    return size == 0 ? nullptr : std::realloc(block, size);
}

void RkoMemoryFree(void *block)
{
    std::free(block);
}
