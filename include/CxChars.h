/* SPDX-License-Identifier: Apache-2.0 */
/* CxChars.h - tests of single bytes that no locale can change, and EBCDIC conversion data. */
#ifndef CX_CHARS_H
#define CX_CHARS_H

#include "CxTypes.h"

CX_BEGIN_DECLS

/**
 * Tells whether a byte is an ASCII digit, 0x30 to 0x39.
 *
 * @param c  the byte; 0x80 to 0xFF are no digits
 * @return 1 for a digit, else 0
 * @lock none
 */
ZLV_API ZlvBool CxIsASCIIDigit(char c);

/**
 * Tells whether a byte is an ASCII letter, 0x41 to 0x5A or 0x61 to 0x7A.
 *
 * @param c  the byte; 0x80 to 0xFF are no letters
 * @return 1 for a letter, else 0
 * @lock none
 */
ZLV_API ZlvBool CxIsASCIIAlpha(char c);

/**
 * Tells whether a byte is one of the digits '0' to '9' of the character set the library is built
 * for. Where that is ASCII, the answer is that of CxIsASCIIDigit().
 *
 * @param c  the byte
 * @return 1 for a digit, else 0
 * @lock none
 */
ZLV_API ZlvBool CxIsLocalDigit(char c);

/**
 * Converts text of the build's character set to ASCII in place. The library is built for ASCII, so
 * every byte stays as it is.
 *
 * @param buffer  the bytes; null is ignored
 * @param length  number of bytes at buffer
 * @lock none
 */
ZLV_API void CxETOA(char *buffer, size_t length);

/**
 * EBCDIC code page 037 to ISO 8859-1: entry b is the character of byte b; a zero byte follows the
 * 256 entries. Plain data for callers; the library itself does not read it.
 */
extern ZLV_API const char ASCII_FROM_CP037[257];

/**
 * EBCDIC code page 1047 to ISO 8859-1, laid out like ASCII_FROM_CP037: byte 0x25 is line feed and
 * 0x15 is next line (0x85).
 */
extern ZLV_API const char ASCII_FROM_CP1047[257];

CX_END_DECLS

#endif
