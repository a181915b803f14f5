/* SPDX-License-Identifier: Apache-2.0 */
/*
 * CxKvtID.h - the identifier that a message begins with: some letters that name a component, some
 * digits that number the message, and one letter for its severity: I, W or E.
 */
#ifndef CX_KVT_ID_H
#define CX_KVT_ID_H

#include "CxTypes.h"

CX_BEGIN_DECLS

/**
 * An identifier found at the start of a text. Identifier and severity share storage, and the
 * identifier is terminated after the severity is written: of an identifier of ten characters the
 * field `severity` is 0. Take the severity from the identifier's last character.
 */
typedef struct CxKvtIDInfo {
    const char *format; /**< constant name of the format; "" when nothing was recognised */
    int32_t code;       /**< letters x 100 + digits x 10 + 1; 0 when nothing was recognised */
    int32_t length;     /**< characters, the severity included; 0 when nothing was recognised */
    CX_EXTENSION union {
        char identifier[11]; /**< the identifier and its terminating 0 */
        CX_EXTENSION struct {
            char identifierText[10];
            char severity; /**< the severity letter of up to nine characters, else 0 */
        };
    };
} CxKvtIDInfo;

/**
 * Recognises a message identifier at the start of a text. There are eleven formats:
 *
 *     letters  digits     name          code
 *     6        3          Ozk6.3.1      631
 *     5        4          Ozk45.4.1     541
 *     5        3, 2       Ozk5.3.1 ...  531, 521
 *     4        3, 4, 5    Ozk4.3.1 ...  431, 441, 451
 *     3        3 to 6     Ozk3.3.1 ...  331 to 361
 *
 * Letters and digits are those of ASCII, in either case; the severity is a capital I, W or E. What
 * follows the identifier does not matter.
 *
 * @param text  the text, of which no more than the first 10 bytes are read, and none behind its
 *              terminating 0; null is not recognised
 * @return the record; "", 0, 0, "" and 0 when nothing was recognised
 * @lock none
 */
ZLV_API CxKvtIDInfo CxParseKvtID(const char *text);

CX_END_DECLS

#endif
