// SPDX-License-Identifier: Apache-2.0
// Makes chosen allocations of the library fail. The linker sends every call of the three allocating
// wrappers that crosses a source file through FailAllocWrappers.cpp, which asks here first;
// allocations of the C library, of ICU and of the tests are never touched.
#pragma once

#include <cstdint>

namespace zelvo_test {

/// While one lives, allocations that this thread makes through the wrappers fail as it says:
///
///     FailAlloc fail(2);                  // the third and all later ones give null
///     FailAlloc fail(2, FailAlloc::Once); // the third alone gives null
class FailAlloc {
public:
    enum Span { FromThereOn, Once };

    /// Lets ALLOWED allocations through before it fails the next one, or all further ones.
    explicit FailAlloc(uint32_t allowed, Span span = FromThereOn);
    FailAlloc(const FailAlloc &) = delete;
    FailAlloc &operator=(const FailAlloc &) = delete;
    ~FailAlloc();

    /// The allocations asked for since construction, failed ones included.
    uint32_t asked() const { return asked_; }
    /// The allocations that were made to fail. A test that expects a failure checks this too.
    uint32_t failed() const { return failed_; }

    /// Used by the interposed wrappers: whether the allocation now asked for is to fail.
    static bool strikes();

private:
    uint32_t allowed_;
    Span span_;
    uint32_t asked_ = 0;
    uint32_t failed_ = 0;
    FailAlloc *outer_;
};

} // namespace zelvo_test
