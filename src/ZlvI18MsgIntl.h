// SPDX-License-Identifier: Apache-2.0
// What the message code offers to the rest of the toolkit only.
#pragma once

#include "ZlvI18Msg.h"

namespace zelvo {

/// Binds a message as ZlvBindUI18Msg() does, with arguments that are all zero: a description has no
/// caller to give it any. The API mutex is held by the caller.
UChar *zlvBindMsgWithZeros(ZlvI18Msg *message);

} // namespace zelvo
