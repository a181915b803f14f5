// SPDX-License-Identifier: Apache-2.0
// Tokens in place, for those who need no copy.
#pragma once

#include "ZlvStrTok.h"

namespace zelvo {

struct Token {
    const char *start;
    size_t length;
};

/// The token at or after a place; of length 0, where the search ended, when there is none.
Token nextToken(ZlvStrTokIter iterator);

} // namespace zelvo
