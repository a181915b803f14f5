// SPDX-License-Identifier: Apache-2.0
// Typed values: copying, freeing, comparing.
#include "ZlvParm.h"

#include "CxMemory.h"
#include "CxString.h"
#include "util/CxOwned.h"

using zelvo::Owned;

namespace {

bool isKnown(uint32_t type)
{
    return type >= ZLV_PARM_BYTE && type <= ZLV_PARM_STRING;
}

/// Copies the value of a known tag; false when memory ran out.
bool copyValue(const ZlvParm &from, ZlvParm &to)
{
    to.value = from.value;
    if (from.type != ZLV_PARM_STRING)
        return true;
    to.value.stringValue = RkoStringDup(from.value.stringValue);
    return to.value.stringValue != nullptr || from.value.stringValue == nullptr;
}

} // namespace

ZlvParm *ZlvCopyParm(const ZlvParm *parm)
{
    if (parm == nullptr)
        return nullptr;
    Owned<ZlvParm> copy{static_cast<ZlvParm *>(RkoMemoryCalloc(1, sizeof(ZlvParm)))};
    if (!copy)
        return nullptr;
    copy->type = parm->type;
    if (isKnown(parm->type) && !copyValue(*parm, *copy.get()))
        return nullptr;
    return copy.take();
}

void ZlvFreeParm(ZlvParm *parm)
{
    if (parm == nullptr)
        return;
    if (parm->type == ZLV_PARM_STRING)
        RkoMemoryFree(parm->value.stringValue);
    RkoMemoryFree(parm);
}

ZlvBool ZlvCmpParms(const ZlvParm *a, const ZlvParm *b)
{
    if (a == nullptr || b == nullptr)
        return a == b;
    if (a->type != b->type)
        return 0;
    switch (a->type) {
    case ZLV_PARM_BYTE:
    case ZLV_PARM_CHAR:
        return a->value.byteValue == b->value.byteValue;
    case ZLV_PARM_INT:
    case ZLV_PARM_LONG:
        return a->value.intValue == b->value.intValue;
    case ZLV_PARM_FLOAT:
        return a->value.floatValue == b->value.floatValue;
    case ZLV_PARM_DOUBLE:
        return a->value.doubleValue == b->value.doubleValue;
    case ZLV_PARM_STRING:
        return RkoStringCmp(a->value.stringValue, b->value.stringValue) == 0;
    default:
        return 0;
    }
}
