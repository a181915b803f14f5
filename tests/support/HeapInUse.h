// SPDX-License-Identifier: Apache-2.0
// How much of the heap is in use, whichever allocator the build runs with.
#pragma once

#include <cstddef>

#include <malloc.h>

#if defined(__SANITIZE_ADDRESS__) || defined(__SANITIZE_THREAD__)
// g++ 12 comes without the header that declares this.
// NOLINTNEXTLINE(bugprone-reserved-identifier, cert-dcl37-c, cert-dcl51-cpp): the runtime's name
extern "C" size_t __sanitizer_get_current_allocated_bytes();
#endif

namespace zelvo_test {

/// The bytes that are allocated and not freed. The sanitizers' allocators are not seen by
/// mallinfo2.
inline size_t heapInUse()
{
#if defined(__SANITIZE_ADDRESS__) || defined(__SANITIZE_THREAD__)
    return __sanitizer_get_current_allocated_bytes();
#else
    return mallinfo2().uordblks;
#endif
}

} // namespace zelvo_test
