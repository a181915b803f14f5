// SPDX-License-Identifier: Apache-2.0
#include "CxBytes.h"

#include <unicode/ustring.h>

#include "CxAscii.h"
#include "CxString.h"
#include "CxUString.h"

namespace zelvo {

Bytes::Bytes(const UChar *text)
{
    const size_t length = text != nullptr ? static_cast<size_t>(u_strlen(text)) : 0;
    if (text != nullptr && length < CAPACITY && isCopiedPlainly(text, length)) {
        copyAscii(area_, text, length);
        bytes_ = area_;
        length_ = length;
        return;
    }
    owned_.reset(CxUStringDupUCharToStr(text));
    bytes_ = owned_.get();
    length_ = RkoStringLen(bytes_);
}

} // namespace zelvo
