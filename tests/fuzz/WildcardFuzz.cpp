// SPDX-License-Identifier: Apache-2.0
// Feeds strings to the tokenizer and patterns to the wildcard match. An input is two texts with a
// zero between: a string and its delimiters, which are a pattern and the text to match as well.
#include <vector>

#include "ZlvMsgIdFilter.h"
#include "ZlvStrTok.h"
#include "ZlvStringList.h"
#include "support/Fuzz.h"
#include "util/CxOwned.h"

using namespace zelvo_fuzz;
using zelvo::OwnedStr;

namespace {

using Tokens = std::vector<std::string>;

Tokens tokensOf(const std::string &text, const std::string &delimiters)
{
    Tokens tokens(1);
    for (const char c : text) {
        const bool isDelimiter = delimiters.find(c) != std::string::npos;
        if (!isDelimiter)
            tokens.back() += c;
        if (isDelimiter || delimiters.empty())
            tokens.emplace_back();
    }
    std::erase(tokens, "");
    return tokens;
}

/// Whether TEXT holds the pieces from I on, each at the first place where it is found, with the
/// last one at its end.
bool holdsPieces(const std::string &text, const Tokens &pieces, size_t i)
{
    const std::string &piece = pieces[i];
    const size_t tooFar = text.size() + (faultIsSeeded() ? 0 : 1);
    for (size_t at = 0; at + piece.size() < tooFar; ++at) {
        if (text.substr(at, piece.size()) != piece)
            continue;
        const std::string rest = text.substr(at + piece.size());
        return i + 1 == pieces.size() ? rest.empty() : holdsPieces(rest, pieces, i + 1);
    }
    return false;
}

/// The match by its rules, which take the leftmost place of each piece.
bool matchesByRules(const std::string &pattern, const std::string &text)
{
    const Tokens pieces = tokensOf(pattern, "*");
    if (pieces.empty())
        return true;
    if (pattern.front() == '*')
        return holdsPieces(text, pieces, 0);
    const std::string &first = pieces.front();
    if (text.substr(0, first.size()) != first)
        return false;
    const std::string rest = text.substr(first.size());
    if (pieces.size() > 1)
        return holdsPieces(rest, pieces, 1);
    return rest.empty() || pattern.back() == '*';
}

/// The general match, in which a star stands for any bytes. It accepts more.
bool matchesGenerally(const std::string &pattern, const std::string &text)
{
    std::vector<bool> reached(text.size() + 1, false); // after how many bytes of the text
    reached[0] = true;
    for (const char c : pattern) {
        if (c == '*') {
            const auto first = std::find(reached.begin(), reached.end(), true);
            std::fill(first, reached.end(), true);
            continue;
        }
        for (size_t i = text.size(); i > 0; --i)
            reached[i] = reached[i - 1] && text[i - 1] == c;
        reached[0] = false;
    }
    return reached.back();
}

void checkTokens(const std::string &text, const std::string &delimiters)
{
    const ExactText string(text);
    const ExactText set(delimiters);
    ZlvStrTokIter at;
    ZlvStrTokIterator(&at, string.get(), set.get());
    for (const std::string &token : tokensOf(text, delimiters)) {
        check(ZlvStrTokIterHasNext(at) == 1, "no token is missed");
        const OwnedStr copy{ZlvStrTokIterGet(at)};
        check(copy && token == copy.get(), "a token is the longest run without delimiters");
        ZlvStrTokIterNext(&at, at);
    }
    check(ZlvStrTokIterHasNext(at) == 0, "behind the last token there is none");
    check(!OwnedStr{ZlvStrTokIterGet(at)}, "behind the last token none is handed out");
    ZlvStrTokIterNext(&at, at);
    check(at.position == string.get() + text.size(), "the walk ends at the string's end");
}

void checkMatch(const std::string &pattern, const std::string &text)
{
    const bool matches = ZlvPatternMatch(ExactText(pattern).get(), ExactText(text).get()) == 1;
    check(matches == matchesByRules(pattern, text), "pieces are taken where they are found first");
    check(!matches || pattern.empty() || matchesGenerally(pattern, text),
          "nothing matches that a general match would refuse");
}

void checkList(const std::string &patterns, const std::string &id)
{
    StringList *list = ZlvMsgIdFilterGetStringList(ExactText(patterns).get());
    StringListIterator at = zlvIntlStringListIterator(list);
    bool anyMatches = false;
    for (const std::string &pattern : tokensOf(patterns, " \t\n\r")) {
        const OwnedStr copy{zlvIntlStringListIterGet(at)};
        check(copy && pattern == copy.get(), "a list of patterns is split at white space");
        anyMatches = anyMatches || matchesByRules(pattern, id);
        at = zlvIntlStringListIterNext(at);
    }
    check(zlvIntlStringListIterHasNext(at) == 0, "a list of patterns holds no more");
    check((ZlvMsgIdFilterMatchMsgId(list, id.c_str()) == 1) == anyMatches,
          "an identifier matches a list when it matches one pattern of it");
    zlvIntlFreeStringList(list);
}

} // namespace

int LLVMFuzzerTestOneInput(const uint8_t *data, size_t size)
{
    Input input(data, size);
    const std::string first = input.text();
    const std::string second = input.text();
    checkTokens(first, second);
    checkMatch(first, second);
    checkList(first, second);
    return 0;
}
