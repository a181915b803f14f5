// SPDX-License-Identifier: Apache-2.0
// The wildcard match of the message-ID filter. It makes one pass without going back, which decides
// some patterns in ways that a general match would not; configurations rely on that.
#include <string_view>

#include "ZlvMsgIdFilter.h"
#include "ZlvStrTokIntl.h"

using namespace zelvo;

namespace {

/// Matches the pieces of a pattern from the second on, or from the first behind a leading star,
/// each where it is found first. The last one must end the text.
bool matchesPieces(ZlvStrTokIter pieces, std::string_view text)
{
    for (Token piece = nextToken(pieces); piece.length > 0; piece = nextToken(pieces)) {
        const size_t place = text.find({piece.start, piece.length});
        if (place == std::string_view::npos)
            return false;
        text.remove_prefix(place + piece.length);
        ZlvStrTokIterNext(&pieces, pieces);
        if (ZlvStrTokIterHasNext(pieces) == 0)
            return text.empty();
    }
    return true;
}

/// Matches a pattern that begins with a piece, which then begins the text.
bool matchesAnchored(ZlvStrTokIter pieces, std::string_view text)
{
    const Token first = nextToken(pieces);
    if (!text.starts_with({first.start, first.length}))
        return false;
    const char *behind = first.start + first.length;
    text.remove_prefix(first.length);
    ZlvStrTokIterNext(&pieces, pieces);
    if (ZlvStrTokIterHasNext(pieces) != 0)
        return matchesPieces(pieces, text);
    return *behind == '*' || text.empty();
}

} // namespace

ZlvBool ZlvPatternMatch(const char *pattern, const char *text)
{
    if (pattern == nullptr || text == nullptr)
        return 0;
    ZlvStrTokIter pieces;
    ZlvStrTokIterator(&pieces, pattern, "*");
    const bool isAnchored = *pattern != '*' && *pattern != '\0';
    return isAnchored ? matchesAnchored(pieces, text) : matchesPieces(pieces, text);
}
