// SPDX-License-Identifier: Apache-2.0
// Owners of one allocation or one argument list each, so that every return path lets go of them.
#pragma once

#include <cstdarg>
#include <type_traits>

#include <unicode/umachine.h>

#include "CxMemory.h"

namespace zelvo {

/// Owns one block that came from the RkoMemory wrappers.
template <class T>
class Owned {
public:
    explicit Owned(T *block = nullptr) : block_(block) {}
    Owned(const Owned &) = delete;
    Owned &operator=(const Owned &) = delete;
    ~Owned() { RkoMemoryFree(block_); }

    T *get() const { return block_; }
    T *operator->() const { return block_; }
    explicit operator bool() const { return block_ != nullptr; }

    /// Takes over a block in place of the one owned so far.
    void reset(T *block)
    {
        RkoMemoryFree(block_);
        block_ = block;
    }

    /// Hands the block to the caller.
    T *take()
    {
        T *block = block_;
        block_ = nullptr;
        return block;
    }

private:
    T *block_;
};

using OwnedStr = Owned<char>;
using OwnedUStr = Owned<UChar>;

/// A reader's own copy of a caller's argument list, which must not be absent.
class ArgList {
public:
    explicit ArgList(va_list source) { va_copy(list, source); }
    ArgList(const ArgList &) = delete;
    ArgList &operator=(const ArgList &) = delete;
    ~ArgList() { va_end(list); }

    va_list list;
};

/// Tells whether a caller passed no argument list at all, where the platform can express that.
template <class List>
bool isAbsent(const List &list)
{
    if constexpr (std::is_pointer_v<List>)
        return list == nullptr;
    else
        return false;
}

} // namespace zelvo
