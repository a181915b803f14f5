// SPDX-License-Identifier: Apache-2.0
// Relaxed access to the plain fields that are read without the API mutex: an object's enabled flag
// and its level. Every reader and every writer of such a field goes through these two.
#pragma once

#include <atomic>
#include <type_traits>

namespace zelvo {

template <class T>
T loadRelaxed(const T &field)
{
    // A read-only atomic_ref needs C++26; the fields themselves are never const.
    return std::atomic_ref<T>(const_cast<T &>(field)).load(std::memory_order_relaxed);
}

template <class T>
void storeRelaxed(T &field, std::type_identity_t<T> value)
{
    std::atomic_ref<T>(field).store(value, std::memory_order_relaxed);
}

} // namespace zelvo
