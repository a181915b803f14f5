// SPDX-License-Identifier: Apache-2.0
// The tokens of a byte string.
#include "ZlvStrTokIntl.h"

#include <cstring>

#include "CxMemory.h"

using namespace zelvo;

Token zelvo::nextToken(ZlvStrTokIter iterator)
{
    if (iterator.position == nullptr || *iterator.position == '\0')
        return {iterator.position, 0};
    if (iterator.delimiters == nullptr || *iterator.delimiters == '\0')
        return {iterator.position, 1};
    const char *start = iterator.position + std::strspn(iterator.position, iterator.delimiters);
    return {start, std::strcspn(start, iterator.delimiters)};
}

namespace {

char *copyOf(Token token)
{
    auto *copy = static_cast<char *>(RkoMemoryMalloc(token.length + 1));
    if (copy != nullptr) {
        std::memcpy(copy, token.start, token.length);
        copy[token.length] = '\0';
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
    return nextToken(iterator).length > 0 ? 1 : 0;
}

char *ZlvStrTokIterGet(ZlvStrTokIter iterator)
{
    const Token token = nextToken(iterator);
    return token.length > 0 ? copyOf(token) : nullptr;
}

ZlvStrTokIter ZlvStrTokIterNext(ZlvStrTokIter *out, ZlvStrTokIter iterator)
{
    const Token token = nextToken(iterator);
    const ZlvStrTokIter next{token.start + token.length, iterator.delimiters};
    if (out != nullptr)
        *out = next;
    return next;
}
