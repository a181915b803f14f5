// SPDX-License-Identifier: Apache-2.0
// Patterns of messages as ICU reads them.
#pragma once

#include <unicode/umsg.h>

namespace zelvo {

/// A pattern for a locale, null for the default one: kept from an earlier message if it can be,
/// else opened for this one. The API mutex is held.
class MessageFormat {
public:
    MessageFormat(const UChar *pattern, const char *locale);
    MessageFormat(const MessageFormat &) = delete;
    MessageFormat &operator=(const MessageFormat &) = delete;
    ~MessageFormat();

    /// Null when ICU refuses the pattern.
    const UMessageFormat *get() const { return format_; }

private:
    UMessageFormat *format_ = nullptr;
    bool isKept_ = false;
};

} // namespace zelvo
