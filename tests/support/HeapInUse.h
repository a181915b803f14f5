// SPDX-License-Identifier: Apache-2.0
// How much of the heap is in use, whichever allocator the build runs with.
#pragma once

#include <cstddef>

#include <malloc.h>

#ifdef ZELVO_SANITIZED
// The sanitizers' own header does not come with every compiler.
extern "C" size_t __sanitizer_get_current_allocated_bytes();
#endif

namespace zelvo_test {

/// The bytes that are allocated and not freed. The sanitizers' allocators are not seen by
/// mallinfo2.
inline size_t heapInUse()
{
#ifdef ZELVO_SANITIZED
    return __sanitizer_get_current_allocated_bytes();
#else
    return mallinfo2().uordblks;
#endif
}

} // namespace zelvo_test
