/* SPDX-License-Identifier: Apache-2.0 */
/*
 * CxStringBuff.h - a growable, zero-terminated byte buffer.
 *
 * The record is the caller's, usually on the stack, and belongs to one thread at a time. A call
 * that cannot get memory answers 0 and leaves the buffer as it was. Text handed to a call must not
 * lie in the buffer itself, which may move.
 */
#ifndef CX_STRING_BUFF_H
#define CX_STRING_BUFF_H

#include "CxTypes.h"

CX_BEGIN_DECLS

/**
 * A byte buffer. A record of zeros is a valid empty buffer; CxStringBuffDiscard() makes it one
 * again. Fields may be read at any time and changed only through the calls.
 */
typedef struct CxStringBuff {
    uint32_t length;   /**< bytes in use, without the terminating zero */
    uint32_t capacity; /**< bytes allocated for data */
    char *data;        /**< the text with its terminating zero; null until the first append */
} CxStringBuff;

/**
 * Makes room for a number of bytes and a terminating zero after the text. The first allocation is
 * 1024 bytes; a buffer that is too small is doubled until its capacity exceeds what is needed. A
 * need that no doubled capacity within 32 bits exceeds fails.
 *
 * @param buff   the buffer; null gives 0
 * @param extra  bytes that are to be appended
 * @return 1 when the room is there (data is then allocated), else 0
 * @lock none
 */
ZLV_API ZlvBool cxStringBuffHasCapacity(CxStringBuff *buff, uint32_t extra);

/**
 * Appends one byte.
 *
 * @param buff  the buffer; null gives 0
 * @param c     the byte; a zero byte counts as one byte of length
 * @return 1 when appended, else 0
 * @lock none
 */
ZLV_API ZlvBool CxStringBuffAppendChar(CxStringBuff *buff, char c);

/**
 * Appends a code point in UTF-8. Up to 0x7F, and for every negative number, one byte with the low
 * seven bits; two bytes up to 0x7FE (0x7FF takes three); three up to 0xFFFF; four up to 0x1FFFFF;
 * five up to 0x3FFFFFF; six above, as UTF-8 was first defined. A form for which the buffer cannot
 * grow is tried again in the next longer form.
 *
 * @param buff       the buffer; null gives 0
 * @param codePoint  the code point; surrogates are encoded like any other number
 * @return 1 when appended, 0 when the buffer cannot grow for any form
 * @lock none
 */
ZLV_API ZlvBool CxStringBuffAppendUTF32Char(CxStringBuff *buff, int32_t codePoint);

/**
 * Appends one UTF-16 code unit as CxStringBuffAppendUTF32Char() appends a code point; the halves of
 * a surrogate pair are not joined.
 *
 * @param buff  the buffer; null gives 0
 * @param unit  the code unit
 * @return 1 when appended, else 0
 * @lock none
 */
ZLV_API ZlvBool CxStringBuffAppendUCS2Char(CxStringBuff *buff, uint16_t unit);

/**
 * Appends a 32-bit number in decimal.
 *
 * @param buff   the buffer; null gives 0
 * @param value  the number
 * @return 1 when appended, else 0
 * @lock none
 */
ZLV_API ZlvBool CxStringBuffAppendInt32(CxStringBuff *buff, int32_t value);

/**
 * Appends a 64-bit number in decimal, with '-' before a negative one.
 *
 * @param buff   the buffer; null gives 0
 * @param value  the number
 * @return 1 when appended, 0 when the buffer cannot grow for the whole text
 * @lock none
 */
ZLV_API ZlvBool CxStringBuffAppendInt64(CxStringBuff *buff, int64_t value);

/**
 * Appends an unsigned 64-bit number in decimal, digit by digit. Digits the buffer cannot grow for
 * are lost without notice.
 *
 * @param buff   the buffer; null gives 0
 * @param value  the number
 * @return 1, even when digits were lost; 0 for a null buffer
 * @lock none
 */
ZLV_API ZlvBool CxStringBuffAppendUInt64(CxStringBuff *buff, uint64_t value);

/**
 * Appends a 64-bit number in decimal in EBCDIC: bytes 0xF0 to 0xF9 for the digits, 0x60 for the
 * minus sign. Zero appends nothing.
 *
 * @param buff   the buffer; null gives 0
 * @param value  the number
 * @return 1 when appended, 0 when the buffer cannot grow for the whole text
 * @lock none
 */
ZLV_API ZlvBool CxStringBuffAppendEBCDICInt64(CxStringBuff *buff, int64_t value);

/**
 * Appends a string.
 *
 * @param buff  the buffer; null gives 0
 * @param str   the string; null gives 0
 * @return 1 when appended, else 0
 * @lock none
 */
ZLV_API ZlvBool CxStringBuffAppendStr(CxStringBuff *buff, const char *str);

/**
 * Appends at most a number of bytes, ending early at a zero byte. Room is made for all of them.
 *
 * @param buff   the buffer; null gives 0
 * @param bytes  the bytes; null gives 0
 * @param n      how many at most; all ones (UINT32_MAX) means up to the terminating zero
 * @return 1 when appended, else 0
 * @lock none
 */
ZLV_API ZlvBool CxStringBuffAppendStrN(CxStringBuff *buff, const char *bytes, uint32_t n);

/**
 * Inserts a string into the text. Room is asked for as many bytes more as the string and the text
 * together, so that further insertions seldom move the buffer.
 *
 * @param buff      the buffer; null gives 0
 * @param str       the string; null gives 0
 * @param position  index of the byte before which it goes, 0 to length; others give 0
 * @return 1 when inserted, else 0
 * @lock none
 */
ZLV_API ZlvBool CxStringBuffInsertStr(CxStringBuff *buff, const char *str, int32_t position);

/**
 * Lends the text.
 *
 * @param buff  the buffer; null gives null
 * @return the text, owned by the buffer and good until the buffer changes; null before the first
 *         append
 * @lock none
 */
ZLV_API char *CxStringBuffPeekStr(const CxStringBuff *buff);

/**
 * Copies the text.
 *
 * @param buff  the buffer; null gives null
 * @return a new string that the caller frees with RkoMemoryFree(); null before the first append or
 *         when memory ran out
 * @lock none
 */
ZLV_API char *CxStringBuffCopyStr(const CxStringBuff *buff);

/**
 * Hands the text over and leaves an empty buffer without storage.
 *
 * @param buff  the buffer; null gives null
 * @return the text, which the caller frees with RkoMemoryFree(); null before the first append
 * @lock none
 */
ZLV_API char *CxStringBuffTakeStr(CxStringBuff *buff);

/**
 * Empties the buffer and keeps its storage for reuse.
 *
 * @param buff  the buffer; null is ignored
 * @lock none
 */
ZLV_API void CxStringBuffRestart(CxStringBuff *buff);

/**
 * Frees the storage and leaves an empty buffer.
 *
 * @param buff  the buffer; null is ignored
 * @lock none
 */
ZLV_API void CxStringBuffDiscard(CxStringBuff *buff);

/**
 * Gives back the storage that the text and its terminating zero do not need; an empty buffer gives
 * back all of it.
 *
 * @param buff  the buffer; null gives 0
 * @return 1 when storage was given back or the buffer is empty; 0 when there was nothing to give
 *         back or the storage could not be reallocated, the buffer then being as before
 * @lock none
 */
ZLV_API ZlvBool CxStringBuffPack(CxStringBuff *buff);

CX_END_DECLS

#endif
