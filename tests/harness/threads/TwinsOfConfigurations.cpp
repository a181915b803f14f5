// SPDX-License-Identifier: Apache-2.0
// Configurations and the log manager, as class functions use them.
#include "Twins.h"

namespace zelvo_test {

namespace {

bool hasName(StringGroupIterator names, const char *wanted)
{
    bool found = false;
    for (; TWIN(zlvIntlStringGroupIterHasNext)(names) == 1;
         names = TWIN(zlvIntlStringGroupIterNext)(names))
        found = isText(TWIN(zlvIntlStringGroupIterGet)(names), wanted) || found;
    return found;
}

void useProperties(ZlvObjCfg *cfg, unsigned turn)
{
    const auto number = static_cast<int32_t>(turn % 1000);
    ZlvBool found = 0;
    TWIN(zlvIntlSetObjCfgProp)(cfg, "text", "value");
    HOLDS(isText(TWIN(zlvIntlGetObjCfgProp)(cfg, "text", nullptr), "value"));
    TWIN(zlvIntlSetObjCfgPropBool)(cfg, "truth", 1);
    HOLDS(TWIN(zlvIntlGetObjCfgPropBool)(cfg, "truth", &found) == 1);
    TWIN(zlvIntlSetObjCfgPropInt)(cfg, "number", number);
    HOLDS(TWIN(zlvIntlGetObjCfgPropInt)(cfg, "number", &found) == number);
    TWIN(zlvIntlSetObjCfgPropLong)(cfg, "number", number + 1);
    HOLDS(TWIN(zlvIntlGetObjCfgPropLong)(cfg, "number", &found) == number + 1);
    TWIN(zlvIntlSetObjCfgPropFloat)(cfg, "number", 0.5F);
    HOLDS(TWIN(zlvIntlGetObjCfgPropFloat)(cfg, "number", &found) == 0.5F);
    TWIN(zlvIntlSetObjCfgPropDouble)(cfg, "number", 0.25);
    HOLDS(TWIN(zlvIntlGetObjCfgPropDouble)(cfg, "number", &found) == 0.25);
    StringToStringMapIterator properties = TWIN(zlvIntlObjCfgProperties)(cfg);
    HOLDS(TWIN(zlvIntlStringToStringMapIterHasNext)(properties) == 1);
    HOLDS(isText(TWIN(zlvIntlStringToStringMapIterGetKey)(properties), "text"));
    HOLDS(isText(TWIN(zlvIntlStringToStringMapIterGetVal)(properties), "value"));
}

} // namespace

void useConfigurations(unsigned turn)
{
    ZlvObjCfg *cfg = TWIN(zlvIntlAllocObjCfg)("twins.loose");
    TWIN(zlvIntlReleaseObjCfg)(TWIN(zlvIntlAcquireObjCfg)(cfg));
    HOLDS(isText(TWIN(zlvIntlObjCfgGetName)(cfg), "twins.loose"));
    TWIN(zlvIntlObjCfgSetFromFile)(cfg, 1);
    HOLDS(TWIN(zlvIntlObjCfgIsFromFile)(cfg) == 1);
    useProperties(cfg, turn);
    TWIN(zlvIntlReleaseObjCfg)(cfg);
}

void useLogManager(unsigned turn)
{
    const std::string name = "busy.part" + std::to_string(turn % 3);
    const std::string childName = name + ".child";
    ZlvObjCfg *parent = TWIN(zlvIntlLogMgrGetCfg)(name.c_str());
    ZlvObjCfg *child = TWIN(zlvIntlAllocObjCfg)(childName.c_str());
    TWIN(zlvIntlLogMgrAddCfg)(child);
    TWIN(zlvIntlLogMgrUpdateCfg)(child);
    TWIN(zlvIntlObjCfgSetParent)(child, parent);
    TWIN(zlvIntlObjCfgAddChild)(parent, child);
    HOLDS(hasName(TWIN(zlvIntlObjCfgChildrenNames)(parent), childName.c_str()));
    HOLDS(hasName(TWIN(zlvIntlLogMgrConfigNames)(), name.c_str()));
    TWIN(zlvIntlSetObjCfgProp)(parent, "inherited", "value");
    HOLDS(isText(TWIN(zlvIntlGetInheritedObjCfgProp)(child, "inherited", nullptr), "value"));
    ZlvObjCfg *found = TWIN(zlvIntlObjCfgGetParent)(child);
    HOLDS(found == parent);
    TWIN(zlvIntlReleaseObjCfg)(found);
    ZlvObject *object = TWIN(zlvIntlGetObject)("busy.filter", "zlv_levelfilter");
    HOLDS(TWIN(zlvIntlLogMgrApplyCfg)(object, childName.c_str()) == 1);
    TWIN(zlvIntlReleaseObject)(object);
    TWIN(zlvIntlObjCfgRemChild)(parent, child);
    TWIN(zlvIntlLogMgrRemCfg)(child);
    HOLDS(TWIN(zlvIntlLogMgrHasCfg)(childName.c_str()) == 0);
    TWIN(zlvIntlReleaseObjCfg)(child);
    TWIN(zlvIntlReleaseObjCfg)(parent);
}

} // namespace zelvo_test
