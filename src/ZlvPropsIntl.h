// SPDX-License-Identifier: Apache-2.0
// How the text of a property becomes a value. Each conversion takes the text, which may be null,
// and tells through FOUND, which may be null, whether it converts; a text that does not gives 0.
// What follows a number is ignored.
#pragma once

#include "CxTypes.h"

CX_BEGIN_DECLS

/// "true" or "false" in any case of letters.
ZLV_API ZlvBool zlvPropStrToBool(const char *text, ZlvBool *found);

/// The first byte; 0 of the empty text, which converts.
ZLV_API char zlvPropStrToChar(const char *text, ZlvBool *found);

/// The low 32 bits of what zlvPropStrToInt64() gives.
ZLV_API int32_t zlvPropStrToInt32(const char *text, ZlvBool *found);

/// A decimal number; one beyond 64 bits gives the nearest one within.
ZLV_API int64_t zlvPropStrToInt64(const char *text, ZlvBool *found);

/// A floating number as sscanf() reads it.
ZLV_API float zlvPropStrToFloat32(const char *text, ZlvBool *found);

/// A floating number of double precision as sscanf() reads it.
ZLV_API double zlvPropStrToFloat64(const char *text, ZlvBool *found);

CX_END_DECLS
