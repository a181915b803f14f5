/* SPDX-License-Identifier: Apache-2.0 */
/*
 * CxTypes.h - what every other header stands on: export and compiler macros, the byte boolean and
 * the status record of the portability layer.
 */
#ifndef CX_TYPES_H
#define CX_TYPES_H

#include <stdarg.h>
#include <stddef.h>
#include <stdint.h>

#ifdef __cplusplus
#define CX_BEGIN_DECLS extern "C" {
#define CX_END_DECLS }
#else
#define CX_BEGIN_DECLS
#define CX_END_DECLS
#endif

/* Marks what the shared library exports; everything else is hidden. */
#define ZLV_API __attribute__((visibility("default")))

/* Lets the compiler check printf-like calls: FORMAT and FIRST count arguments from 1. */
#define CX_PRINTF(FORMAT, FIRST) __attribute__((format(printf, FORMAT, FIRST)))

/* Unnamed unions inside records, which C99 knows only as an extension. */
#define CX_EXTENSION __extension__

/** One-byte truth value. The library hands out 0 or 1; a setter says what it does with others. */
typedef uint8_t ZlvBool;

/** Type character of a status that reports success. */
#define CX_STATUS_OK '-'
/** Type character of a status that carries a platform error number. */
#define CX_STATUS_PLATFORM 'p'

/**
 * Outcome of one fallible portability call. `type` is CX_STATUS_OK or CX_STATUS_PLATFORM; `code`
 * is 0 on success, else a number in errno's numbering: 22 (EINVAL) for a missing argument and
 * 12 (ENOMEM) for a failed allocation among them. Callers test `type` alone.
 */
typedef struct CxStatus {
    char type;
    int32_t code;
} CxStatus;

#endif
