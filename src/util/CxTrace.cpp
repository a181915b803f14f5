// SPDX-License-Identifier: Apache-2.0
#include "CxTrace.h"

#include <algorithm>
#include <cstdarg>
#include <cstdio>

int32_t CX_INTERNAL_TRACE_INDENT = 0;

namespace {

constexpr int32_t step = 3;

/// Writes one trace: the indentation, the word that says what it is, and the text. A trace that
/// cannot be written has nowhere to say so.
void trace(const char *word, const char *format, va_list args)
{
    const int indent = std::max(CX_INTERNAL_TRACE_INDENT, 0);
    static_cast<void>(std::fprintf(stderr, "%*s%s ", indent, "", word));
    if (format != nullptr)
        static_cast<void>(std::vfprintf(stderr, format, args));
    static_cast<void>(std::fflush(stderr));
}

} // namespace

void cxIntlTraceEnter(const char *format, ...)
{
    va_list args;
    va_start(args, format);
    trace("ENTER", format, args);
    va_end(args);
    CX_INTERNAL_TRACE_INDENT += step;
}

void cxIntlTraceLeave(const char *format, ...)
{
    CX_INTERNAL_TRACE_INDENT -= step;
    va_list args;
    va_start(args, format);
    trace("LEAVE", format, args);
    va_end(args);
}

void cxIntlTracePoint(const char *format, ...)
{
    va_list args;
    va_start(args, format);
    trace("...", format, args);
    va_end(args);
}
