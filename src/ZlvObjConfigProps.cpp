// SPDX-License-Identifier: Apache-2.0
// Properties of configurations: own ones are set, inherited ones are read.
#include "ZlvApiMutex.h"
#include "ZlvCfgChain.h"
#include "ZlvProps.h"
#include "ZlvPropsIntl.h"
#include "util/CxOwned.h"

namespace {

char *lookUp(ZlvObjCfg *cfg, const char *property, ZlvBool *found, const zelvo::CfgChain *below)
{
    *found = 0;
    if (cfg == nullptr || zelvo::CfgChain::contains(below, cfg))
        return nullptr;
    char *value = ZlvGetMapProp(cfg->properties, property, found);
    if (*found != 0)
        return value;
    const zelvo::CfgChain chain{cfg, below};
    zelvo::CfgRef parent{zlvIntlObjCfgGetParent(cfg)};
    return lookUp(parent.get(), property, found, &chain);
}

/// Reads an inherited property as text and converts it.
template <class Value>
Value get(ZlvObjCfg *cfg, const char *property, ZlvBool *found,
          Value (*convert)(const char *, ZlvBool *))
{
    zelvo::OwnedStr text{zlvIntlGetInheritedObjCfgProp(cfg, property, nullptr)};
    return convert(text.get(), found);
}

/// Stores a value with the setter of its type.
template <class Setter, class Value>
void set(ZlvObjCfg *cfg, const char *property, Setter setter, Value value)
{
    if (cfg == nullptr || property == nullptr)
        return;
    if (cfg->properties == nullptr)
        cfg->properties = zlvIntlAllocStringToStringMap();
    setter(cfg->properties, property, value);
}

} // namespace

char *zlvIntlGetInheritedObjCfgProp(ZlvObjCfg *cfg, const char *property, ZlvBool *found)
{
    ZlvBool present = 0;
    char *value = property != nullptr ? lookUp(cfg, property, &present, nullptr) : nullptr;
    if (found != nullptr)
        *found = present;
    return value;
}

char *zlvIntlGetObjCfgProp(ZlvObjCfg *cfg, const char *property, ZlvBool *found)
{
    return zlvIntlGetInheritedObjCfgProp(cfg, property, found);
}

ZlvBool zlvIntlGetObjCfgPropBool(ZlvObjCfg *cfg, const char *property, ZlvBool *found)
{
    return get(cfg, property, found, zlvPropStrToBool);
}

int32_t zlvIntlGetObjCfgPropInt(ZlvObjCfg *cfg, const char *property, ZlvBool *found)
{
    return get(cfg, property, found, zlvPropStrToInt32);
}

int64_t zlvIntlGetObjCfgPropLong(ZlvObjCfg *cfg, const char *property, ZlvBool *found)
{
    return get(cfg, property, found, zlvPropStrToInt64);
}

float zlvIntlGetObjCfgPropFloat(ZlvObjCfg *cfg, const char *property, ZlvBool *found)
{
    return get(cfg, property, found, zlvPropStrToFloat32);
}

double zlvIntlGetObjCfgPropDouble(ZlvObjCfg *cfg, const char *property, ZlvBool *found)
{
    return get(cfg, property, found, zlvPropStrToFloat64);
}

void zlvIntlSetObjCfgProp(ZlvObjCfg *cfg, const char *property, const char *value)
{
    set(cfg, property, ZlvSetMapProp, value);
}

void zlvIntlSetObjCfgPropBool(ZlvObjCfg *cfg, const char *property, ZlvBool value)
{
    set(cfg, property, ZlvSetMapPropBool, value);
}

void zlvIntlSetObjCfgPropInt(ZlvObjCfg *cfg, const char *property, int32_t value)
{
    set(cfg, property, ZlvSetMapPropInt, value);
}

void zlvIntlSetObjCfgPropLong(ZlvObjCfg *cfg, const char *property, int64_t value)
{
    set(cfg, property, ZlvSetMapPropLong, value);
}

void zlvIntlSetObjCfgPropFloat(ZlvObjCfg *cfg, const char *property, float value)
{
    set(cfg, property, ZlvSetMapPropFloat, value);
}

void zlvIntlSetObjCfgPropDouble(ZlvObjCfg *cfg, const char *property, double value)
{
    set(cfg, property, ZlvSetMapPropDouble, value);
}

StringToStringMapIterator zlvIntlObjCfgProperties(ZlvObjCfg *cfg)
{
    return zlvIntlStringToStringMapIterator(cfg != nullptr ? cfg->properties : nullptr);
}

char *ZlvGetInheritedObjCfgProp(ZlvObjCfg *cfg, const char *property, ZlvBool *found)
{
    return zelvo::locked(zlvIntlGetInheritedObjCfgProp, cfg, property, found);
}

char *ZlvGetObjCfgProp(ZlvObjCfg *cfg, const char *property, ZlvBool *found)
{
    return zelvo::locked(zlvIntlGetObjCfgProp, cfg, property, found);
}

ZlvBool ZlvGetObjCfgPropBool(ZlvObjCfg *cfg, const char *property, ZlvBool *found)
{
    return zelvo::locked(zlvIntlGetObjCfgPropBool, cfg, property, found);
}

int32_t ZlvGetObjCfgPropInt(ZlvObjCfg *cfg, const char *property, ZlvBool *found)
{
    return zelvo::locked(zlvIntlGetObjCfgPropInt, cfg, property, found);
}

int64_t ZlvGetObjCfgPropLong(ZlvObjCfg *cfg, const char *property, ZlvBool *found)
{
    return zelvo::locked(zlvIntlGetObjCfgPropLong, cfg, property, found);
}

float ZlvGetObjCfgPropFloat(ZlvObjCfg *cfg, const char *property, ZlvBool *found)
{
    return zelvo::locked(zlvIntlGetObjCfgPropFloat, cfg, property, found);
}

double ZlvGetObjCfgPropDouble(ZlvObjCfg *cfg, const char *property, ZlvBool *found)
{
    return zelvo::locked(zlvIntlGetObjCfgPropDouble, cfg, property, found);
}

void ZlvSetObjCfgProp(ZlvObjCfg *cfg, const char *property, const char *value)
{
    zelvo::locked(zlvIntlSetObjCfgProp, cfg, property, value);
}

void ZlvSetObjCfgPropBool(ZlvObjCfg *cfg, const char *property, ZlvBool value)
{
    zelvo::locked(zlvIntlSetObjCfgPropBool, cfg, property, value);
}

void ZlvSetObjCfgPropInt(ZlvObjCfg *cfg, const char *property, int32_t value)
{
    zelvo::locked(zlvIntlSetObjCfgPropInt, cfg, property, value);
}

void ZlvSetObjCfgPropLong(ZlvObjCfg *cfg, const char *property, int64_t value)
{
    zelvo::locked(zlvIntlSetObjCfgPropLong, cfg, property, value);
}

void ZlvSetObjCfgPropFloat(ZlvObjCfg *cfg, const char *property, float value)
{
    zelvo::locked(zlvIntlSetObjCfgPropFloat, cfg, property, value);
}

void ZlvSetObjCfgPropDouble(ZlvObjCfg *cfg, const char *property, double value)
{
    zelvo::locked(zlvIntlSetObjCfgPropDouble, cfg, property, value);
}

StringToStringMapIterator ZlvObjCfgProperties(ZlvObjCfg *cfg)
{
    return zelvo::locked(zlvIntlObjCfgProperties, cfg);
}
