/* SPDX-License-Identifier: Apache-2.0 */
/* ZlvMisc.h - the text of platform errors, and the one hook that platform failures are handed to.
 */
#ifndef ZLV_MISC_H
#define ZLV_MISC_H

#include "CxTypes.h"

CX_BEGIN_DECLS

/**
 * The hook that every platform failure inside the library goes through. It looks the text up and
 * stays silent: a logging library must not write where its application did not ask it to, and the
 * failing call's own result carries the failure. A debugger finds all failures here.
 *
 * @param type  type character of a status; any other than CX_STATUS_PLATFORM gives null
 * @param code  error number of the status
 * @return the text, as ZlvGetPlatformErrStr(); null when the type is not CX_STATUS_PLATFORM
 * @lock none
 */
ZLV_API const char *ZlvReportPlatformErr(char type, int32_t code);

/**
 * Gives the text of a status, that of strerror() in the current locale. It can be called from
 * several threads at once and allocates nothing itself.
 *
 * @param type  type character of a status; any other than CX_STATUS_PLATFORM gives null
 * @param code  error number of the status; an unknown one gives "Unknown error" and the number
 * @return the text, owned by the library, not to be freed: for a known number valid for good, for
 * an unknown one until this thread asks for another unknown one or ends; null when the type is not
 *     CX_STATUS_PLATFORM
 * @lock none
 */
ZLV_API const char *ZlvGetPlatformErrStr(char type, int32_t code);

CX_END_DECLS

#endif
