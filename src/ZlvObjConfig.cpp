// SPDX-License-Identifier: Apache-2.0
// Configurations: references and their place in the tree, which is kept by name.
#include "ZlvObjConfig.h"

#include "CxMemory.h"
#include "CxString.h"
#include "ZlvApiMutex.h"

ZlvObjCfg *zlvIntlAllocObjCfg(const char *name)
{
    if (name == nullptr)
        return nullptr;
    auto *cfg = static_cast<ZlvObjCfg *>(RkoMemoryCalloc(1, sizeof(ZlvObjCfg)));
    if (cfg == nullptr)
        return nullptr;
    cfg->refCount = 1;
    cfg->name = RkoStringDup(name);
    if (cfg->name != nullptr)
        return cfg;
    RkoMemoryFree(cfg);
    return nullptr;
}

ZlvObjCfg *zlvIntlAcquireObjCfg(ZlvObjCfg *cfg)
{
    if (cfg != nullptr)
        ++cfg->refCount;
    return cfg;
}

void zlvIntlReleaseObjCfg(ZlvObjCfg *cfg)
{
    if (cfg == nullptr || --cfg->refCount != 0)
        return;
    RkoMemoryFree(cfg->name);
    RkoMemoryFree(cfg->parentName);
    zlvIntlFreeStringGroup(cfg->children);
    zlvIntlFreeStringToStringMap(cfg->properties);
    RkoMemoryFree(cfg);
}

char *zlvIntlObjCfgGetName(ZlvObjCfg *cfg)
{
    return cfg != nullptr ? RkoStringDup(cfg->name) : nullptr;
}

ZlvBool zlvIntlObjCfgIsFromFile(ZlvObjCfg *cfg)
{
    return cfg != nullptr ? cfg->fromFile : ZlvBool{0};
}

void zlvIntlObjCfgSetFromFile(ZlvObjCfg *cfg, ZlvBool fromFile)
{
    if (cfg != nullptr)
        cfg->fromFile = fromFile;
}

ZlvObjCfg *zlvIntlObjCfgGetParent(ZlvObjCfg *cfg)
{
    return cfg != nullptr ? zlvIntlLogMgrGetCfg(cfg->parentName) : nullptr;
}

void zlvIntlObjCfgSetParent(ZlvObjCfg *cfg, ZlvObjCfg *parent)
{
    if (cfg == nullptr || parent == nullptr || RkoStringCmp(cfg->parentName, parent->name) == 0)
        return;
    char *name = RkoStringDup(parent->name);
    if (name == nullptr)
        return;
    RkoMemoryFree(cfg->parentName);
    cfg->parentName = name;
}

void zlvIntlObjCfgAddChild(ZlvObjCfg *parent, ZlvObjCfg *child)
{
    if (parent == nullptr || child == nullptr)
        return;
    if (parent->children == nullptr)
        parent->children = zlvIntlAllocStringGroup();
    zlvIntlStringGroupAdd(parent->children, child->name);
    zlvIntlObjCfgSetParent(child, parent);
}

void zlvIntlObjCfgRemChild(ZlvObjCfg *parent, ZlvObjCfg *child)
{
    if (parent != nullptr && child != nullptr)
        zlvIntlStringGroupRem(parent->children, child->name);
}

StringGroupIterator zlvIntlObjCfgChildrenNames(ZlvObjCfg *cfg)
{
    return cfg != nullptr ? zlvIntlStringGroupIterator(cfg->children) : nullptr;
}

ZlvObjCfg *ZlvAllocObjCfg(const char *name)
{
    return zelvo::locked(zlvIntlAllocObjCfg, name);
}

ZlvObjCfg *ZlvAcquireObjCfg(ZlvObjCfg *cfg)
{
    return zelvo::locked(zlvIntlAcquireObjCfg, cfg);
}

void ZlvReleaseObjCfg(ZlvObjCfg *cfg)
{
    zelvo::locked(zlvIntlReleaseObjCfg, cfg);
}

char *ZlvObjCfgGetName(ZlvObjCfg *cfg)
{
    return zelvo::locked(zlvIntlObjCfgGetName, cfg);
}

ZlvBool ZlvObjCfgIsFromFile(ZlvObjCfg *cfg)
{
    return zelvo::locked(zlvIntlObjCfgIsFromFile, cfg);
}

void ZlvObjCfgSetFromFile(ZlvObjCfg *cfg, ZlvBool fromFile)
{
    zelvo::locked(zlvIntlObjCfgSetFromFile, cfg, fromFile);
}

ZlvObjCfg *ZlvObjCfgGetParent(ZlvObjCfg *cfg)
{
    return zelvo::locked(zlvIntlObjCfgGetParent, cfg);
}

void ZlvObjCfgSetParent(ZlvObjCfg *cfg, ZlvObjCfg *parent)
{
    zelvo::locked(zlvIntlObjCfgSetParent, cfg, parent);
}

void ZlvObjCfgAddChild(ZlvObjCfg *parent, ZlvObjCfg *child)
{
    zelvo::locked(zlvIntlObjCfgAddChild, parent, child);
}

void ZlvObjCfgRemChild(ZlvObjCfg *parent, ZlvObjCfg *child)
{
    zelvo::locked(zlvIntlObjCfgRemChild, parent, child);
}

StringGroupIterator ZlvObjCfgChildrenNames(ZlvObjCfg *cfg)
{
    return zelvo::locked(zlvIntlObjCfgChildrenNames, cfg);
}
