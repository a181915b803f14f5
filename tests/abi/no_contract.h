/* SPDX-License-Identifier: Apache-2.0 */
/* What the check of contracts must find: each declaration here lacks something. */
#ifndef NO_CONTRACT_H
#define NO_CONTRACT_H

ZLV_API void noCommentAtAll(void);

/** Lacks what its parameter means. @return a number @lock none */
ZLV_API int noParameter(int number);

/** Lacks its result. @param number any @lock none */
ZLV_API int noResult(int number);

/** Lacks its lock. */
ZLV_API void noLock(void);

/** @twin nobody */
ZLV_API void noTwin(void);

typedef int noCommentEither;

#endif
