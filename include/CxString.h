/* SPDX-License-Identifier: Apache-2.0 */
/*
 * CxString.h - the C string functions with a defined answer for absent (null) strings, so that a
 * name that may be missing can be compared, copied or measured without a test before it.
 */
#ifndef CX_STRING_H
#define CX_STRING_H

#include "CxTypes.h"

CX_BEGIN_DECLS

/**
 * Compares two strings byte by byte, as strcmp(). An absent string equals nothing, not even another
 * absent one.
 *
 * @param a  one string; null gives 1, also when both are null
 * @param b  the other; null gives -1
 * @return 0 when equal, negative when a sorts before b, positive when after
 * @lock none
 */
ZLV_API int RkoStringCmp(const char *a, const char *b);

/**
 * Compares at most the first n bytes of two strings, as strncmp().
 *
 * @param a  one string; null gives 1, also when both are null
 * @param b  the other; null gives -1
 * @param n  most bytes to compare; 0 finds two present strings equal
 * @return 0 when equal, negative when a sorts before b, positive when after
 * @lock none
 */
ZLV_API int RkoStringNCmp(const char *a, const char *b, size_t n);

/**
 * Compares two strings ignoring case, as strcasecmp() in the current locale.
 *
 * @param a  one string; null gives 1, also when both are null
 * @param b  the other; null gives -1
 * @return 0 when equal, negative when a sorts before b, positive when after
 * @lock none
 */
ZLV_API int RkoStringICmp(const char *a, const char *b);

/**
 * Compares at most the first n bytes of two strings ignoring case, as strncasecmp().
 *
 * @param a  one string; null gives 1, also when both are null
 * @param b  the other; null gives -1
 * @param n  most bytes to compare; 0 finds two present strings equal
 * @return 0 when equal, negative when a sorts before b, positive when after
 * @lock none
 */
ZLV_API int RkoStringNICmp(const char *a, const char *b, size_t n);

/**
 * Copies a string with its terminator, as strcpy(). The caller provides the room.
 *
 * @param dst  where to copy to; null gives null and writes nothing
 * @param src  the string; null makes dst the empty string
 * @return dst, still the caller's; null when dst is null
 * @lock none
 */
ZLV_API char *RkoStringCpy(char *dst, const char *src);

/**
 * Copies exactly n bytes, as strncpy(): a shorter string is padded with zero bytes, and a string of
 * n bytes or more is cut WITHOUT a terminator.
 *
 * @param dst  where to copy to; null gives null and writes nothing
 * @param src  the string; null makes dst the empty string, which takes one byte whatever n is
 * @param n  bytes to write
 * @return dst, still the caller's; null when dst is null
 * @lock none
 */
ZLV_API char *RkoStringNCpy(char *dst, const char *src, size_t n);

/**
 * Appends a string, as strcat(). The caller provides the room.
 *
 * @param dst  the string to extend; null gives null
 * @param src  what to append; null leaves dst unchanged
 * @return dst, still the caller's; null when dst is null
 * @lock none
 */
ZLV_API char *RkoStringCat(char *dst, const char *src);

/**
 * Appends at most n bytes of a string and a terminator, as strncat(): dst needs room for its text,
 * n bytes and one more.
 *
 * @param dst  the string to extend; null gives null
 * @param src  what to append; null leaves dst unchanged
 * @param n  most bytes to append
 * @return dst, still the caller's; null when dst is null
 * @lock none
 */
ZLV_API char *RkoStringNCat(char *dst, const char *src, size_t n);

/**
 * Makes a copy of a string.
 *
 * @param src  the string; null gives null
 * @return the copy, which the caller frees with RkoMemoryFree(); null when src is null or memory
 * ran out
 * @lock none
 */
ZLV_API char *RkoStringDup(const char *src);

/**
 * Measures a string.
 *
 * @param str  the string; null gives 0
 * @return its length in bytes, without the terminator
 * @lock none
 */
ZLV_API size_t RkoStringLen(const char *str);

/**
 * Finds the first occurrence of a byte, as strchr(); the terminator can be looked for too.
 *
 * @param str  the string; null gives null
 * @param c  the byte
 * @return a pointer into str, owned by the owner of str; null when not found
 * @lock none
 */
ZLV_API char *RkoStringChr(const char *str, int c);

/**
 * Finds the last occurrence of a byte, as strrchr(); the terminator can be looked for too.
 *
 * @param str  the string; null gives null
 * @param c  the byte
 * @return a pointer into str, owned by the owner of str; null when not found
 * @lock none
 */
ZLV_API char *RkoStringRChr(const char *str, int c);

/**
 * Finds the first occurrence of a string in another, as strstr().
 *
 * @param str  the string to search; null gives null
 * @param part  what to look for, "" being found at once; null gives null
 * @return a pointer into str, owned by the owner of str; null when not found
 * @lock none
 */
ZLV_API char *RkoStringStr(const char *str, const char *part);

/**
 * Finds the first byte of a string that is in a set, as strpbrk().
 *
 * @param str  the string to search; null gives null
 * @param accept  the set of bytes; null gives null
 * @return a pointer into str, owned by the owner of str; null when not found
 * @lock none
 */
ZLV_API char *RkoStringStrpbrk(const char *str, const char *accept);

/**
 * Counts the leading bytes of a string that are NOT in a set, as strcspn().
 *
 * @param str  the string; null gives -1
 * @param reject  the set of bytes; null is the empty set, which gives the length of str
 * @return the count; -1 when str is null
 * @lock none
 */
ZLV_API int32_t RkoStringStrcspn(const char *str, const char *reject);

/**
 * Counts the leading bytes of a string that ARE in a set, as strspn().
 *
 * @param str  the string; null gives -1
 * @param accept  the set of bytes; null is the empty set, which gives 0
 * @return the count; -1 when str is null
 * @lock none
 */
ZLV_API int32_t RkoStringStrspn(const char *str, const char *accept);

/**
 * Formats into a buffer, as sprintf(). This is the one call here that checks nothing: neither the
 * room nor its arguments.
 *
 * @param dst  the buffer, large enough for the text and its terminator; must not be null
 * @param format  a printf() format, followed by its arguments; must not be null
 * @return bytes written without the terminator; negative when formatting failed
 * @lock none
 */
ZLV_API int RkoStringSprintf(char *dst, const char *format, ...) CX_PRINTF(2, 3);

CX_END_DECLS

#endif
