// SPDX-License-Identifier: Apache-2.0
// The control: the linker gives this function to the library in place of ICU's, so the library
// never learns that the default zone has changed, and what it keeps for a zone becomes stale.
#include <unicode/ucal.h>
#include <unicode/ustring.h>

extern "C" int32_t ucal_getDefaultTimeZone(UChar *area, int32_t /*capacity*/,
                                           UErrorCode * /*status*/)
{
    return u_strlen(u_strcpy(area, u"UTC"));
}
