// SPDX-License-Identifier: Apache-2.0
// The tokens of a byte string.
#include "ZlvStrTok.h"

#include <cstring>
#include <string_view>

#include "CxMemory.h"

namespace {

/// The next token; empty, at the place where the search ended, when there is none.
std::string_view nextToken(ZlvStrTokIter iterator)
{
    if (iterator.position == nullptr || *iterator.position == '\0')
        return {iterator.position, 0};
    if (iterator.delimiters == nullptr || *iterator.delimiters == '\0')
        return {iterator.position, 1};
    const char *start = iterator.position + std::strspn(iterator.position, iterator.delimiters);
    return {start, std::strcspn(start, iterator.delimiters)};
}

char *copyOf(std::string_view token)
{
    auto *copy = static_cast<char *>(RkoMemoryMalloc(token.size() + 1));
    if (copy != nullptr) {
        std::memcpy(copy, token.data(), token.size());
        copy[token.size()] = '\0';
    }
    return copy;
}

} // namespace

void ZlvStrTokIterator(ZlvStrTokIter *out, const char *string, const char *delimiters)
{
    if (out != nullptr)
        *out = {string, delimiters};
}

ZlvBool ZlvStrTokIterHasNext(ZlvStrTokIter iterator)
{
    return nextToken(iterator).empty() ? 0 : 1;
}

char *ZlvStrTokIterGet(ZlvStrTokIter iterator)
{
    const std::string_view token = nextToken(iterator);
    return token.empty() ? nullptr : copyOf(token);
}

ZlvStrTokIter ZlvStrTokIterNext(ZlvStrTokIter *out, ZlvStrTokIter iterator)
{
    const std::string_view token = nextToken(iterator);
    const ZlvStrTokIter next{token.data() + token.size(), iterator.delimiters};
    if (out != nullptr)
        *out = next;
    return next;
}
