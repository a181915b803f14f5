/* SPDX-License-Identifier: Apache-2.0 */
/*
 * CxTrace.h - an indented trace on the standard error stream, for debugging the portability layer
 * itself. Nothing in the library calls it in normal operation. A trace writes no line end of its
 * own: the format carries it.
 */
#ifndef CX_TRACE_H
#define CX_TRACE_H

#include "CxTypes.h"

CX_BEGIN_DECLS

/**
 * Spaces before the next trace, 0 at first. One plain counter for the process: the traces of
 * several threads share it, unsynchronised, and interleave.
 */
extern ZLV_API int32_t CX_INTERNAL_TRACE_INDENT;

/**
 * Traces the entry of a function: the indentation, "ENTER " and the text. Indents what follows
 * by 3.
 *
 * @param format  a printf() format, followed by its arguments; null writes no text
 * @lock none
 */
ZLV_API void cxIntlTraceEnter(const char *format, ...) CX_PRINTF(1, 2);

/**
 * Traces the return of a function: takes the indentation back by 3, then writes it, "LEAVE " and
 * the text. An indentation below 0 writes no spaces.
 *
 * @param format  a printf() format, followed by its arguments; null writes no text
 * @lock none
 */
ZLV_API void cxIntlTraceLeave(const char *format, ...) CX_PRINTF(1, 2);

/**
 * Traces a point on the way: the indentation, "... " and the text.
 *
 * @param format  a printf() format, followed by its arguments; null writes no text
 * @lock none
 */
ZLV_API void cxIntlTracePoint(const char *format, ...) CX_PRINTF(1, 2);

CX_END_DECLS

#endif
