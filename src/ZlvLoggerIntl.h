// SPDX-License-Identifier: Apache-2.0
// What the logging calls, the logger class and the level filter share.
#pragma once

#include "CxString.h"
#include "ZlvIntl.h"
#include "ZlvRelaxed.h"
#include "util/CxOwned.h"

namespace zelvo {

/// What a logging call answers as long as nothing has failed, a refusal included.
inline constexpr ZlvStatus NO_ERROR{CX_STATUS_OK, 0, 0};

/// Brings a threshold in step with the object's "level" property if that is what has changed, and
/// leaves every other name to the basic object.
inline void followLevelChange(ZlvObject *object, const char *propertyName, ZlvLevel &threshold)
{
    if (RkoStringCmp(propertyName, "level") != 0)
        return ZlvBasicObjectFCfgChange(object, propertyName);
    const OwnedStr level{zlvIntlGetObjProp(object, propertyName, nullptr)};
    storeRelaxed(threshold, ZlvGetLevelFromString(level.get()));
}

} // namespace zelvo
