/* SPDX-License-Identifier: Apache-2.0 */
/* CxSystem.h - the wall clock and the host's name. */
#ifndef CX_SYSTEM_H
#define CX_SYSTEM_H

#include "CxTypes.h"

CX_BEGIN_DECLS

/**
 * Gives the wall-clock time, as the Unicode library's dates are written.
 *
 * @return milliseconds since 1970-01-01 00:00 UTC, a whole number
 * @lock none
 */
ZLV_API double CxSystemGetTimestamp(void);

/**
 * Gives the host's name, qualified if it can be: the name itself when it has a dot, else the
 * resolver's official name when that has one, else the short name. Every failure of the lookup
 * carries the fixed code 38, since the resolver leaves no errno.
 *
 * The resolver call beneath is not reentrant: callers serialise, the library itself by the API
 * mutex.
 *
 * @param buffer  receives the name: the short name when the resolver does not know it, "" when
 * there is not even that; room for at least one byte. An official name of size bytes or more is cut
 *     WITHOUT a terminator. Null gives 'p'/22
 * @param size  bytes of the buffer
 * @return '-', or 'p' with 22 or 38
 * @lock none
 */
ZLV_API CxStatus CxSystemGetFQHostname(char *buffer, size_t size);

CX_END_DECLS

#endif
