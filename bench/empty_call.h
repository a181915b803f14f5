/* SPDX-License-Identifier: Apache-2.0 */
/* The cheapest call there is: of an empty function in another shared object. */
#ifndef ZELVO_BENCH_EMPTY_CALL_H
#define ZELVO_BENCH_EMPTY_CALL_H

#ifdef __cplusplus
extern "C"
#endif
    void
    zelvoBenchEmptyCall(void);

#endif
