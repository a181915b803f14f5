// SPDX-License-Identifier: Apache-2.0
// The linker gives these functions of the program to the library in place of ICU's, which they
// call.
#include "Openings.h"

#include <atomic>
#include <cstdio>

#include <dlfcn.h>
#include <unicode/udat.h>
#include <unicode/umsg.h>
#include <unicode/ures.h>

// ICU's names are macros that add its version.
#define NAME_AS_TEXT(name) #name
#define NAME_OF(function) NAME_AS_TEXT(function)

namespace {

std::atomic<unsigned> openings;

template <class Function>
Function *next(Function * /*type*/, const char *name)
{
    return reinterpret_cast<Function *>(dlsym(RTLD_NEXT, name));
}

} // namespace

void zelvo_equivalence::printOpenings()
{
    std::printf("%u\n", openings.load());
}

extern "C" UDateFormat *udat_open(UDateFormatStyle timeStyle, UDateFormatStyle dateStyle,
                                  const char *locale, const UChar *zone, int32_t zoneLength,
                                  const UChar *pattern, int32_t patternLength, UErrorCode *status)
{
    static auto *const open = next(&udat_open, NAME_OF(udat_open));
    ++openings;
    return open(timeStyle, dateStyle, locale, zone, zoneLength, pattern, patternLength, status);
}

extern "C" UMessageFormat *umsg_open(const UChar *pattern, int32_t length, const char *locale,
                                     UParseError *error, UErrorCode *status)
{
    static auto *const open = next(&umsg_open, NAME_OF(umsg_open));
    ++openings;
    return open(pattern, length, locale, error, status);
}

extern "C" UResourceBundle *ures_open(const char *name, const char *locale, UErrorCode *status)
{
    static auto *const open = next(&ures_open, NAME_OF(ures_open));
    ++openings;
    return open(name, locale, status);
}
