/* SPDX-License-Identifier: Apache-2.0 */
#include "empty_call.h"

void zelvoBenchEmptyCall(void) {}
