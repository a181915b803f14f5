// SPDX-License-Identifier: Apache-2.0
// The bytes of a text on their way to a file.
#pragma once

#include <cstddef>

#include "CxOwned.h"

namespace zelvo {

/// Converts a text as CxUStringDupUCharToStr() does, without an allocation if it is short and
/// plain.
class Bytes {
public:
    explicit Bytes(const UChar *text);

    /// Null when there was no text, or memory ran out.
    const char *get() const { return bytes_; }
    size_t length() const { return length_; }

private:
    static constexpr size_t CAPACITY = 1024;

    const char *bytes_ = nullptr;
    size_t length_ = 0;
    OwnedStr owned_;
    char area_[CAPACITY];
};

} // namespace zelvo
