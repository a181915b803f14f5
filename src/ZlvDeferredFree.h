// SPDX-License-Identifier: Apache-2.0
// Records whose last rites are done but whose memory is freed only when the API mutex is released.
//
// Class functions are foreign code: in the middle of one of our walks they may remove the very node
// the walk stands on, or destroy the object it is about to visit. Such a record is taken apart at
// once, but stays readable until no walk can be under way. It goes on a list threaded through one
// of its own dead fields, so that deferring never needs memory. The caller holds the API mutex.
#pragma once

#include "ZlvListenerGroup.h"
#include "ZlvStringToObjCfgMap.h"
#include "ZlvStringToObjMap.h"
#include "ZlvTypes.h"

namespace zelvo {

void defer(ZlvObject *object);
void defer(ListenerGroup *group);
void defer(ListenerGroupNode *node);
void defer(StringToObjMapNode *node);
void defer(StringToObjCfgMapNode *node);

/// Frees all that was deferred. Runs just before the API mutex is released and at the end of close.
void freeDeferred();

} // namespace zelvo
