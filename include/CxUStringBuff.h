/* SPDX-License-Identifier: Apache-2.0 */
/*
 * CxUStringBuff.h - a growable, zero-terminated UTF-16 buffer.
 *
 * The record is the caller's, usually on the stack, and belongs to one thread at a time. A call
 * that cannot get memory answers 0 and leaves the buffer as it was. Text handed to a call must not
 * lie in the buffer itself, which may move.
 */
#ifndef CX_USTRING_BUFF_H
#define CX_USTRING_BUFF_H

#include "ZlvTypes.h"

#include <unicode/utypes.h>

CX_BEGIN_DECLS

/**
 * A UTF-16 buffer. A record of zeros is a valid empty buffer; CxUStringBuffDiscard() makes it one
 * again. Fields may be read at any time and changed only through the calls. The units differ:
 * length counts code units, capacity counts bytes.
 */
typedef struct CxUStringBuff {
    uint32_t length;   /**< code units in use, without the terminating zero */
    uint32_t capacity; /**< bytes allocated for data */
    UChar *data;       /**< the text with its terminating zero; null until the first append */
} CxUStringBuff;

/**
 * Makes room for a number of code units and a terminating zero after the text. The first
 * allocation is 1024 bytes; a buffer that is too small is doubled until its capacity exceeds the
 * bytes needed. A need that no doubled capacity within 32 bits exceeds fails.
 *
 * @param buff   the buffer; null gives 0
 * @param extra  code units that are to be appended
 * @return 1 when the room is there (data is then allocated), else 0
 * @lock none
 */
ZLV_API ZlvBool cxUStringBuffHasCapacity(CxUStringBuff *buff, uint32_t extra);

/**
 * Appends a UTF-16 string.
 *
 * @param buff  the buffer; null gives 0
 * @param str   the string; null gives 0
 * @return 1 when appended, else 0
 * @lock none
 */
ZLV_API ZlvBool CxUStringBuffAppendUStr(CxUStringBuff *buff, const UChar *str);

/**
 * Appends a byte string, converted from the default code page.
 *
 * @param buff  the buffer; null gives 0
 * @param str   the string; null gives 0
 * @return 1 when appended, else 0
 * @lock none
 */
ZLV_API ZlvBool CxUStringBuffAppendStr(CxUStringBuff *buff, const char *str);

/**
 * Appends at most a number of bytes, ending early at a zero byte, converted from the default code
 * page.
 *
 * @param buff   the buffer; null gives 0
 * @param bytes  the bytes; null gives 0
 * @param n      how many at most; all ones (UINT32_MAX) means up to the terminating zero
 * @return 1 when appended, else 0
 * @lock none
 */
ZLV_API ZlvBool CxUStringBuffAppendStrN(CxUStringBuff *buff, const char *bytes, uint32_t n);

/**
 * Appends one byte, converted from the default code page.
 *
 * @param buff  the buffer; null gives 0
 * @param c     the byte; a zero byte leaves the buffer unchanged and gives 1
 * @return 1 when appended, else 0
 * @lock none
 */
ZLV_API ZlvBool CxUStringBuffAppendChar(CxUStringBuff *buff, char c);

/**
 * Appends a 32-bit number widened to 64 bits, as CxUStringBuffAppendInt64() does.
 *
 * @param buff   the buffer; null gives 0
 * @param value  the number
 * @return 1 when appended, else 0
 * @lock none
 */
ZLV_API ZlvBool CxUStringBuffAppendInt32(CxUStringBuff *buff, int32_t value);

/**
 * Appends a 64-bit number in unsigned decimal: -1 is written as 18446744073709551615.
 *
 * @param buff   the buffer; null gives 0
 * @param value  the number
 * @return 1 when appended, else 0
 * @lock none
 */
ZLV_API ZlvBool CxUStringBuffAppendInt64(CxUStringBuff *buff, int64_t value);

/**
 * Appends an unsigned 64-bit number in decimal.
 *
 * @param buff   the buffer; null gives 0
 * @param value  the number
 * @return 1 when appended, else 0
 * @lock none
 */
ZLV_API ZlvBool CxUStringBuffAppendUInt64(CxUStringBuff *buff, uint64_t value);

/**
 * Appends a date as a whole number of milliseconds, without grouping, in the default locale.
 *
 * @param buff   the buffer; null gives 0
 * @param value  milliseconds since 1970
 * @return 1 when appended; 0, with nothing appended, when the text would exceed 31 code units or
 *         memory ran out
 * @lock none
 */
ZLV_API ZlvBool CxUStringBuffAppendUDate(CxUStringBuff *buff, UDate value);

/**
 * Appends a number with at most five fraction digits, without grouping and trailing zeros, in the
 * default locale.
 *
 * @param buff   the buffer; null gives 0
 * @param value  the number
 * @return 1 when appended; 0, with nothing appended, when the text would exceed 31 code units or
 *         memory ran out
 * @lock none
 */
ZLV_API ZlvBool CxUStringBuffAppendUDouble(CxUStringBuff *buff, double value);

/**
 * Hands the text over and leaves an empty buffer without storage.
 *
 * @param buff  the buffer; null gives null
 * @return the text, which the caller frees with RkoMemoryFree(); null before the first append
 * @lock none
 */
ZLV_API UChar *CxUStringBuffTakeUStr(CxUStringBuff *buff);

/**
 * Empties the buffer and keeps its storage for reuse.
 *
 * @param buff  the buffer; null is ignored
 * @lock none
 */
ZLV_API void CxUStringBuffRestart(CxUStringBuff *buff);

/**
 * Frees the storage and leaves an empty buffer.
 *
 * @param buff  the buffer; null is ignored
 * @lock none
 */
ZLV_API void CxUStringBuffDiscard(CxUStringBuff *buff);

CX_END_DECLS

#endif
