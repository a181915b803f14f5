/* SPDX-License-Identifier: Apache-2.0 */
/*
 * CxUString.h - conversions between byte strings and zero-terminated UTF-16 strings, through the
 * Unicode library's default converter.
 */
#ifndef CX_USTRING_H
#define CX_USTRING_H

#include "ZlvTypes.h"

CX_BEGIN_DECLS

/**
 * Makes a UTF-16 string from a byte string in the default code page.
 *
 * @param str  the bytes; null gives null
 * @return a new string that the caller frees with RkoMemoryFree(); null when memory ran out
 * @lock none
 */
ZLV_API UChar *CxUStringDupStrToUChar(const char *str);

/**
 * Makes a byte string in the default code page from a UTF-16 string. Room is made for four bytes
 * per code unit.
 *
 * @param str  the UTF-16 string; null gives null
 * @return a new string that the caller frees with RkoMemoryFree(); null when memory ran out
 * @lock none
 */
ZLV_API char *CxUStringDupUCharToStr(const UChar *str);

/**
 * Copies a UTF-16 string.
 *
 * @param str  the string; null gives null
 * @return a new string that the caller frees with RkoMemoryFree(); null when memory ran out
 * @lock none
 */
ZLV_API UChar *CxUStringDup(const UChar *str);

/**
 * Renders a typed value as text: a byte or character as the character, the integers in signed
 * decimal, the floating ones with six fraction digits and never cut, a string as itself, cut at
 * 255 code units. A record with a tag outside ZLV_PARM_BYTE to ZLV_PARM_STRING gives "".
 *
 * @param parm  the value; null gives null
 * @return a new string in the default code page that the caller frees with RkoMemoryFree(); null
 *         when memory ran out
 * @lock none
 */
ZLV_API char *CxUStringParmToStr(const ZlvParm *parm);

/**
 * Writes a string and a line feed to the standard output in the default code page and flushes it.
 * Callers serialise their output themselves. What cannot be written is lost without notice.
 *
 * @param str  the string; null writes nothing
 * @return success, always
 * @lock none
 */
ZLV_API CxStatus CxUStringToStdout(const UChar *str);

CX_END_DECLS

#endif
