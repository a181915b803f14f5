// SPDX-License-Identifier: Apache-2.0
// The names that records give to levels.
#pragma once

#include <unicode/umachine.h>

#include "ZlvLevel.h"

namespace zelvo {

struct LevelWords {
    ZlvLevel level;
    const UChar *word;
    const UChar *field; ///< the same in five characters
};

inline constexpr LevelWords LEVEL_WORDS[] = {
    {ZLV_LEVEL_DEBUG_MAX, u"MAX", u" MAX "}, {ZLV_LEVEL_DEBUG_MID, u"MID", u" MID "},
    {ZLV_LEVEL_DEBUG_MIN, u"MIN", u" MIN "}, {ZLV_LEVEL_INFO, u"INFO", u"INFO "},
    {ZLV_LEVEL_WARN, u"WARN", u"WARN "},     {ZLV_LEVEL_ERROR, u"ERROR", u"ERROR"},
    {ZLV_LEVEL_FATAL, u"ERROR", u"ERROR"},
};

inline LevelWords wordsOf(ZlvLevel level)
{
    for (const LevelWords &words : LEVEL_WORDS)
        if (words.level == level)
            return words;
    return {level, u"OTHER", u"OTHER"};
}

} // namespace zelvo
