/* SPDX-License-Identifier: Apache-2.0 */
/*
 * ZlvVyxTraceFormatter.h - the class function of "zlv_vyxtraceformatter", which renders an event as
 * one line of fixed fields. Class functions run with the API mutex held.
 */
#ifndef ZLV_VYX_TRACE_FORMATTER_H
#define ZLV_VYX_TRACE_FORMATTER_H

#include "ZlvTypes.h"

CX_BEGIN_DECLS

/**
 * Renders an event as a record separator (0x1E) and the fields date in brackets, level in five
 * characters, server up to its first dot, process and thread, source, message identifier and
 * message, each but the last followed by " - " even when it is empty; then a line feed. The class
 * takes over no properties, so the date has its default form and the event its own locale, unless
 * somebody fills the formatter's settings by hand.
 *
 * @param formatter  the formatter; null gives null
 * @param event      the event; null gives null
 * @param args       the message's arguments; copied by each reader, never advanced
 * @return the record, which the caller frees with RkoMemoryFree(); null when there is none
 * @lock the caller holds the API mutex
 */
ZLV_API UChar *ZlvVyxTraceUFormatterFFormat(ZlvObject *formatter, ZlvEvent *event, va_list args);

CX_END_DECLS

#endif
