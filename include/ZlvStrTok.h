/* SPDX-License-Identifier: Apache-2.0 */
/* ZlvStrTok.h - walks over the tokens of a byte string without changing it. */
#ifndef ZLV_STR_TOK_H
#define ZLV_STR_TOK_H

#include "CxTypes.h"

CX_BEGIN_DECLS

/**
 * A place in a string that is being split; a plain value, copied freely. It owns neither the string
 * nor the delimiters, which must outlive it.
 */
typedef struct ZlvStrTokIter {
    const char *position;   /**< where the search for the next token starts; null: no tokens */
    const char *delimiters; /**< the bytes that separate; null or empty: each byte is a token */
} ZlvStrTokIter;

/**
 * Starts at the front of a string. Tokens are the longest runs of bytes that are not delimiters;
 * without delimiters every single byte is a token.
 *
 * @param out         receives the iterator; null is ignored
 * @param string      the string to split, borrowed; null has no tokens
 * @param delimiters  the separating bytes, borrowed; null or empty for single-byte tokens
 * @lock none
 */
ZLV_API void ZlvStrTokIterator(ZlvStrTokIter *out, const char *string, const char *delimiters);

/**
 * Tells whether a token is left.
 *
 * @param iterator  the place to look from
 * @return 1 if there is a token at or after the place, else 0
 * @lock none
 */
ZLV_API ZlvBool ZlvStrTokIterHasNext(ZlvStrTokIter iterator);

/**
 * Copies the token at the place; leading delimiters are skipped.
 *
 * @param iterator  the place to look from
 * @return the token, which the caller frees with RkoMemoryFree(); null when none is left or memory
 *         ran out
 * @lock none
 */
ZLV_API char *ZlvStrTokIterGet(ZlvStrTokIter iterator);

/**
 * Moves behind the token at the place; at the end nothing moves.
 *
 * @param out       receives the new place, the same as the result; may be null
 * @param iterator  the place to start from
 * @return the new place
 * @lock none
 */
ZLV_API ZlvStrTokIter ZlvStrTokIterNext(ZlvStrTokIter *out, ZlvStrTokIter iterator);

CX_END_DECLS

#endif
