// SPDX-License-Identifier: Apache-2.0
// The states of the properties reader. What they do with a character is one table over classes of
// characters; only the digits of Unicode escapes are computed.
#include "ZlvReadPropsIntl.h"

#include "CxString.h"
#include "ZlvIntl.h"

namespace {

using Context = ZlvReadPropsContext;

enum CharClass { OTHER, BLANK, LINE_END, COMMENT, SEPARATOR, BACKSLASH, QUOTE, UNICODE_MARK };
constexpr int32_t CLASS_COUNT = 8;

constexpr CharClass classOf(char c)
{
    switch (c) {
    case ' ':
    case '\t':
    case '\v':
    case '\f':
        return BLANK;
    case '\n':
    case '\r':
        return LINE_END;
    case '!':
    case '#':
        return COMMENT;
    case '=':
    case ':':
        return SEPARATOR;
    case '\\':
        return BACKSLASH;
    case '"':
    case '\'':
        return QUOTE;
    case 'u':
    case 'U':
        return UNICODE_MARK;
    default:
        return OTHER;
    }
}

/// What a state does with a class of characters: go to another state (the numbers of the states),
/// or one of these.
enum Step : int32_t {
    FAIL = ZLV_RDPR_ERROR,
    KEY,   ///< append to the key, then go on with the key
    VALUE, ///< append to the value, then go on with the value
    EMIT   ///< emit the entry, then start a line
};

/// The states from the start of a line to the continuation of a value, one row each. States 1 and 2
/// differ on purpose: a separator in the first column begins a key, after blanks it is an error; a
/// backslash begins a key in both.
// clang-format off
constexpr int32_t STEPS[][CLASS_COUNT] = {
    //        other  blank  line end comment separator backslash quote  u
    /*  1 */ {KEY,   2,     1,       3,      KEY,      KEY,      KEY,   KEY},
    /*  2 */ {KEY,   2,     1,       3,      FAIL,     KEY,      KEY,   KEY},
    /*  3 */ {3,     3,     1,       3,      3,        3,        3,     3},
    /*  4 */ {KEY,   6,     FAIL,    KEY,    7,        5,        KEY,   KEY},
    /*  5 */ {FAIL,  KEY,   FAIL,    FAIL,   KEY,      KEY,      FAIL,  FAIL},
    /*  6 */ {VALUE, 6,     FAIL,    VALUE,  7,        9,        VALUE, VALUE},
    /*  7 */ {VALUE, 7,     EMIT,    VALUE,  VALUE,    9,        VALUE, VALUE},
    /*  8 */ {VALUE, VALUE, EMIT,    VALUE,  VALUE,    9,        VALUE, VALUE},
    /*  9 */ {FAIL,  VALUE, 10,      FAIL,   FAIL,     VALUE,    VALUE, 11},
    /* 10 */ {VALUE, 10,    EMIT,    VALUE,  VALUE,    9,        VALUE, VALUE},
};
// clang-format on

int32_t nextIf(bool succeeded, ZlvReadPropsState next)
{
    return succeeded ? next : ZLV_RDPR_ERROR;
}

int32_t take(ZlvReadPropsState state, char c, Context *context)
{
    if (context == nullptr)
        return ZLV_RDPR_ERROR;
    const int32_t step = STEPS[state - 1][classOf(c)];
    switch (step) {
    case KEY:
        return nextIf(CxStringBuffAppendChar(&context->key, c), ZLV_RDPR_KEY_CHARS);
    case VALUE:
        return nextIf(CxStringBuffAppendChar(&context->value, c), ZLV_RDPR_VAL_CHARS);
    case EMIT:
        return nextIf(zlvRdprEmitCfg(context), ZLV_RDPR_START_LINE);
    default:
        return step;
    }
}

/// Adds a digit to the code point, which wraps like an unsigned number.
int32_t takeDigit(char c, Context *context, int32_t weight, ZlvReadPropsState next)
{
    int32_t digit = 0;
    if (context == nullptr || !zlvRdprHexConv(c, &digit))
        return ZLV_RDPR_ERROR;
    context->codePoint = static_cast<int32_t>(static_cast<uint32_t>(context->codePoint) +
                                              static_cast<uint32_t>(digit * weight));
    return next;
}

} // namespace

int32_t zlvRdprDoStartLineState(char c, ZlvReadPropsContext *context)
{
    if (context != nullptr) {
        CxStringBuffRestart(&context->key);
        CxStringBuffRestart(&context->value);
    }
    return take(ZLV_RDPR_START_LINE, c, context);
}

int32_t zlvRdprDoStartLineBlanksState(char c, ZlvReadPropsContext *context)
{
    return take(ZLV_RDPR_START_LINE_BLANKS, c, context);
}

int32_t zlvRdprDoCommentLineState(char c, ZlvReadPropsContext *context)
{
    return take(ZLV_RDPR_COMMENT_LINE, c, context);
}

int32_t zlvRdprDoKeyCharsState(char c, ZlvReadPropsContext *context)
{
    return take(ZLV_RDPR_KEY_CHARS, c, context);
}

int32_t zlvRdprDoKeyCharEscapeState(char c, ZlvReadPropsContext *context)
{
    return take(ZLV_RDPR_KEY_CHAR_ESCAPE, c, context);
}

int32_t zlvRdprDoKeyEndBlanksFirstState(char c, ZlvReadPropsContext *context)
{
    return take(ZLV_RDPR_KEY_END_BLANKS_FIRST, c, context);
}

int32_t zlvRdprDoKeyEndBlanksFinalState(char c, ZlvReadPropsContext *context)
{
    return take(ZLV_RDPR_KEY_END_BLANKS_FINAL, c, context);
}

int32_t zlvRdprDoValCharsState(char c, ZlvReadPropsContext *context)
{
    return take(ZLV_RDPR_VAL_CHARS, c, context);
}

int32_t zlvRdprDoValEscapeState(char c, ZlvReadPropsContext *context)
{
    return take(ZLV_RDPR_VAL_ESCAPE, c, context);
}

int32_t zlvRdprDoMultiLineValState(char c, ZlvReadPropsContext *context)
{
    return take(ZLV_RDPR_MULTI_LINE_VAL, c, context);
}

int32_t zlvRdprDoUU0State(char c, ZlvReadPropsContext *context)
{
    return takeDigit(c, context, 0x1000, ZLV_RDPR_UU1);
}

int32_t zlvRdprDoUU1State(char c, ZlvReadPropsContext *context)
{
    return takeDigit(c, context, 0x100, ZLV_RDPR_UU2);
}

int32_t zlvRdprDoUU2State(char c, ZlvReadPropsContext *context)
{
    return takeDigit(c, context, 0x10, ZLV_RDPR_UU3);
}

int32_t zlvRdprDoUU3State(char c, ZlvReadPropsContext *context)
{
    const int32_t next = takeDigit(c, context, 1, ZLV_RDPR_VAL_CHARS);
    if (next == ZLV_RDPR_ERROR)
        return next;
    return nextIf(CxStringBuffAppendUTF32Char(&context->value, context->codePoint),
                  ZLV_RDPR_VAL_CHARS);
}

static bool countFrom(char first, char last, char c, int32_t *digit)
{
    if (c < first || last < c)
        return false;
    *digit = c - first;
    return true;
}

ZlvBool zlvRdprHexConv(char c, int32_t *digit)
{
    // The letters count from 0, not from 10: files in use rely on it.
    return digit != nullptr && (countFrom('0', '9', c, digit) || countFrom('a', 'f', c, digit) ||
                                countFrom('A', 'F', c, digit));
}

ZlvBool zlvRdprEmitCfg(ZlvReadPropsContext *context)
{
    if (context == nullptr)
        return false;
    char *key = CxStringBuffPeekStr(&context->key);
    const char *value = CxStringBuffPeekStr(&context->value);
    if (context->target != nullptr)
        return CxPropListPutStr(context->target, key, value);
    char *dot = RkoStringRChr(key, '.');
    if (dot == nullptr)
        return false;
    *dot = '\0';
    const ZlvBool isSet = zlvLogMgrAddCfgFromFile(key, dot + 1, value);
    *dot = '.';
    return isSet;
}
