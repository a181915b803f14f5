// SPDX-License-Identifier: Apache-2.0
// The entry that all filter classes share, and the filter that goes by level.
#include "ZlvLevelFilter.h"

#include "ZlvLoggerIntl.h"

using namespace zelvo;

void ZlvBasicFilterFProcess(ZlvObject *filter, ZlvEvent *event, va_list args)
{
    if (filter == nullptr || !loadRelaxed(filter->enabled))
        return;
    const ZlvObjClass *objClass = filter->objClass;
    if (objClass == nullptr || objClass->kind != ZLV_KIND_FILTER)
        return;
    const auto &entries = objClass->filter;
    if (entries.fIsLoggable == nullptr || entries.fLog == nullptr)
        return;
    if (static_cast<uint8_t>(entries.fIsLoggable(filter, event, args)) == 1)
        entries.fLog(filter, event, args);
}

int32_t ZlvLevelFilterFIsLoggable(ZlvObject *filter, ZlvEvent *event, va_list /*args*/)
{
    if (filter == nullptr || event == nullptr)
        return 0;
    const ZlvLevel threshold = loadRelaxed(filter->filter.level);
    const bool passes =
        threshold == ZLV_LEVEL_ALL || event->level == ZLV_LEVEL_NONE || event->level >= threshold;
    return passes ? 1 : 0;
}

void ZlvLevelFilterFCfgChange(ZlvObject *filter, const char *propertyName)
{
    if (filter != nullptr && propertyName != nullptr)
        followLevelChange(filter, propertyName, filter->filter.level);
}
