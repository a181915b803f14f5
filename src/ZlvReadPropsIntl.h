// SPDX-License-Identifier: Apache-2.0
// The state machine that reads properties files: its context, its states and their handlers.
#pragma once

#include "CxPropList.h"
#include "CxStringBuff.h"

/// What the handlers work on: the entry that is being read and where it goes.
typedef struct ZlvReadPropsContext {
    CxStringBuff key;
    CxStringBuff value;
    int32_t codePoint;  ///< sum of the digits of all Unicode escapes of the file so far
    CxPropList *target; ///< receives the entries; null sends them to the log manager
} ZlvReadPropsContext;

/// The states, as the handlers' table is indexed.
enum ZlvReadPropsState : int32_t {
    ZLV_RDPR_START_LINE = 1,
    ZLV_RDPR_START_LINE_BLANKS = 2,
    ZLV_RDPR_COMMENT_LINE = 3,
    ZLV_RDPR_KEY_CHARS = 4,
    ZLV_RDPR_KEY_CHAR_ESCAPE = 5,
    ZLV_RDPR_KEY_END_BLANKS_FIRST = 6, ///< blanks after a key, no separator yet
    ZLV_RDPR_KEY_END_BLANKS_FINAL = 7, ///< blanks after a separator
    ZLV_RDPR_VAL_CHARS = 8,
    ZLV_RDPR_VAL_ESCAPE = 9,
    ZLV_RDPR_MULTI_LINE_VAL = 10,
    ZLV_RDPR_UU0 = 11, ///< first of the four hex digits of a Unicode escape
    ZLV_RDPR_UU1 = 12,
    ZLV_RDPR_UU2 = 13,
    ZLV_RDPR_UU3 = 14,
    ZLV_RDPR_DONE = 15,
    ZLV_RDPR_ERROR = 16
};

CX_BEGIN_DECLS

/// The handlers of the fourteen working states. Each takes one character and gives the next state;
/// without a context, a handler that needs one gives ZLV_RDPR_ERROR.
ZLV_API int32_t zlvRdprDoStartLineState(char c, ZlvReadPropsContext *context);
ZLV_API int32_t zlvRdprDoStartLineBlanksState(char c, ZlvReadPropsContext *context);
ZLV_API int32_t zlvRdprDoCommentLineState(char c, ZlvReadPropsContext *context);
ZLV_API int32_t zlvRdprDoKeyCharsState(char c, ZlvReadPropsContext *context);
ZLV_API int32_t zlvRdprDoKeyCharEscapeState(char c, ZlvReadPropsContext *context);
ZLV_API int32_t zlvRdprDoKeyEndBlanksFirstState(char c, ZlvReadPropsContext *context);
ZLV_API int32_t zlvRdprDoKeyEndBlanksFinalState(char c, ZlvReadPropsContext *context);
ZLV_API int32_t zlvRdprDoValCharsState(char c, ZlvReadPropsContext *context);
ZLV_API int32_t zlvRdprDoValEscapeState(char c, ZlvReadPropsContext *context);
ZLV_API int32_t zlvRdprDoMultiLineValState(char c, ZlvReadPropsContext *context);
ZLV_API int32_t zlvRdprDoUU0State(char c, ZlvReadPropsContext *context);
ZLV_API int32_t zlvRdprDoUU1State(char c, ZlvReadPropsContext *context);
ZLV_API int32_t zlvRdprDoUU2State(char c, ZlvReadPropsContext *context);
ZLV_API int32_t zlvRdprDoUU3State(char c, ZlvReadPropsContext *context);

/// Puts the entry of the context into its target list, or hands it to the log manager, the key cut
/// at its last dot. Gives 1 when it was taken, 0 for a null context too.
ZLV_API ZlvBool zlvRdprEmitCfg(ZlvReadPropsContext *context);

/// The value of a digit of a Unicode escape: '0' to '9' count 0 to 9, letters 'a' to 'f' in either
/// case 0 to 5. Gives 0, and leaves the digit alone, for any other character or a null slot.
ZLV_API ZlvBool zlvRdprHexConv(char c, int32_t *digit);

CX_END_DECLS
