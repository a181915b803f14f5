// SPDX-License-Identifier: Apache-2.0
#include "Case.h"

#include "ZlvObjClass.h"

namespace zelvo_test {

void letGo(ZlvObject *object)
{
    ZlvReleaseObject(object);
}

void letGo(ZlvObjCfg *cfg)
{
    ZlvReleaseObjCfg(cfg);
}

void letGo(ZlvObjClass *objClass)
{
    zlvFreeObjClass(objClass);
}

void letGo(ZlvEvent *event)
{
    ZlvFreeEvent(event);
}

void letGo(ZlvI18Msg *message)
{
    ZlvFreeI18Msg(message);
}

void letGo(ZlvParm *parm)
{
    ZlvFreeParm(parm);
}

void letGo(StringList *list)
{
    ZlvFreeStringList(list);
}

void letGo(ParmList *list)
{
    ZlvFreeParmList(list);
}

void letGo(StringGroup *group)
{
    ZlvFreeStringGroup(group);
}

void letGo(ListenerGroup *group)
{
    ZlvFreeListenerGroup(group);
}

void letGo(StringToStringMap *map)
{
    ZlvFreeStringToStringMap(map);
}

void letGo(StringToObjMap *map)
{
    ZlvFreeStringToObjMap(map);
}

void letGo(StringToObjCfgMap *map)
{
    ZlvFreeStringToObjCfgMap(map);
}

void letGo(StringToObjClassMap *map)
{
    ZlvFreeStringToObjClassMap(map);
}

} // namespace zelvo_test
