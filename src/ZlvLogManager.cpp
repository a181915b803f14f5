// SPDX-License-Identifier: Apache-2.0
// The registry of configurations and the tree that their dotted names make.
//
// A child stores its parent's name when it is added. Whatever is registered between the two later
// leaves the child where it is, until it is added again.
#include "ZlvLogManager.h"

#include "CxMemory.h"
#include "CxString.h"
#include "ZlvApiMutex.h"
#include "ZlvCfgChain.h"
#include "ZlvToolkitIntl.h"
#include "util/CxOwned.h"

StringGroup *ZLV_TK_CFG_NAMES = nullptr;
StringToObjCfgMap *ZLV_TK_CFG_DATA = nullptr;
ZlvBool ZLV_TK_LOG_MGR_INITIALIZED = 0;

namespace {

constexpr char ROOT[] = "/";

/// Hands each child of PARENT to VISIT, which may take the child out of the parent's group.
template <class Visit>
void forEachChild(ZlvObjCfg *parent, Visit visit)
{
    StringGroupIterator it = zlvIntlObjCfgChildrenNames(parent);
    while (zlvIntlStringGroupIterHasNext(it) != 0) {
        zelvo::OwnedStr name{zlvIntlStringGroupIterGet(it)};
        it = zlvIntlStringGroupIterNext(it);
        zelvo::CfgRef child{zlvIntlLogMgrGetCfg(name.get())};
        if (child)
            visit(child.get());
    }
}

void moveChild(ZlvObjCfg *child, ZlvObjCfg *from, ZlvObjCfg *to)
{
    zlvIntlObjCfgRemChild(from, child);
    zlvIntlObjCfgAddChild(to, child);
}

/// Links a newly registered configuration below its parent. Children of the parent that belong
/// elsewhere by now go to the new one.
void link(ZlvObjCfg *cfg, ZlvObjCfg *parent)
{
    zlvIntlObjCfgSetParent(cfg, parent);
    forEachChild(parent, [&](ZlvObjCfg *child) {
        zelvo::OwnedStr parentName{zlvLogMgrGetParentConfigName(child)};
        if (RkoStringCmp(parentName.get(), cfg->parentName) != 0)
            moveChild(child, parent, cfg);
    });
    zlvIntlObjCfgAddChild(parent, cfg);
}

void setProperties(ZlvObject *object, ZlvObjCfg *cfg)
{
    StringToStringMapIterator it = zlvIntlObjCfgProperties(cfg);
    for (; zlvIntlStringToStringMapIterHasNext(it) != 0;
         it = zlvIntlStringToStringMapIterNext(it)) {
        zelvo::OwnedStr property{zlvIntlStringToStringMapIterGetKey(it)};
        zelvo::OwnedStr value{zlvIntlStringToStringMapIterGetVal(it)};
        zlvIntlSetObjProp(object, property.get(), value.get());
    }
}

ZlvBool apply(ZlvObject *object, const char *name, const zelvo::CfgChain *below)
{
    zelvo::CfgRef cfg{zlvIntlLogMgrGetCfg(name)};
    if (!cfg || zelvo::CfgChain::contains(below, cfg.get()))
        return 0;
    zelvo::OwnedStr parentName{zlvLogMgrGetParentConfigName(cfg.get())};
    const zelvo::CfgChain chain{cfg.get(), below};
    apply(object, parentName.get(), &chain);
    setProperties(object, cfg.get());
    return 1;
}

} // namespace

void zlvInitLogMgr(void)
{
    if (ZLV_TK_LOG_MGR_INITIALIZED != 0)
        return;
    ZLV_TK_CFG_NAMES = zlvIntlAllocStringGroup();
    ZLV_TK_CFG_DATA = zlvIntlAllocStringToObjCfgMap();
    ZLV_TK_LOG_MGR_INITIALIZED = 1;
    if (ZLV_TK_CFG_NAMES == nullptr || ZLV_TK_CFG_DATA == nullptr)
        zlvCloseLogMgr();
}

void zlvCloseLogMgr(void)
{
    if (ZLV_TK_LOG_MGR_INITIALIZED == 0)
        return;
    zlvIntlFreeStringGroup(ZLV_TK_CFG_NAMES);
    zlvIntlFreeStringToObjCfgMap(ZLV_TK_CFG_DATA);
    ZLV_TK_CFG_NAMES = nullptr;
    ZLV_TK_CFG_DATA = nullptr;
    ZLV_TK_LOG_MGR_INITIALIZED = 0;
}

char *zlvLogMgrGetParentConfigName(ZlvObjCfg *cfg)
{
    if (cfg == nullptr)
        return nullptr;
    if (cfg->parentName != nullptr)
        return RkoStringDup(cfg->parentName);
    zelvo::OwnedStr prefix{RkoStringDup(cfg->name)};
    while (char *dot = RkoStringRChr(prefix.get(), '.')) {
        *dot = '\0';
        zelvo::CfgRef parent{zlvIntlStringToObjCfgMapGet(ZLV_TK_CFG_DATA, prefix.get())};
        if (parent) {
            zlvIntlObjCfgSetParent(cfg, parent.get());
            return prefix.take();
        }
    }
    return prefix ? RkoStringDup(ROOT) : nullptr;
}

void zlvIntlLogMgrAddCfg(ZlvObjCfg *cfg)
{
    if (cfg == nullptr || cfg->name == nullptr || zlvIntlLogMgrHasCfg(cfg->name) != 0 ||
        zlvIntlStringToObjCfgMapPut(ZLV_TK_CFG_DATA, cfg->name, cfg) == 0)
        return;
    zelvo::OwnedStr parentName{zlvLogMgrGetParentConfigName(cfg)};
    zelvo::CfgRef parent{zlvIntlLogMgrGetCfg(parentName.get())};
    if (parent)
        link(cfg, parent.get());
    zlvIntlStringGroupAdd(ZLV_TK_CFG_NAMES, cfg->name);
}

void zlvIntlLogMgrRemCfg(ZlvObjCfg *cfg)
{
    if (cfg == nullptr || zlvIntlLogMgrHasCfg(cfg->name) == 0)
        return;
    zelvo::CfgRef keep{zlvIntlAcquireObjCfg(cfg)};
    zlvIntlStringToObjCfgMapRem(ZLV_TK_CFG_DATA, cfg->name);
    zelvo::CfgRef parent{zlvIntlObjCfgGetParent(cfg)};
    zlvIntlObjCfgRemChild(parent.get(), cfg);
    forEachChild(cfg, [&](ZlvObjCfg *child) { moveChild(child, cfg, parent.get()); });
    zlvIntlStringGroupRem(ZLV_TK_CFG_NAMES, cfg->name);
}

void zlvIntlLogMgrUpdateCfg(ZlvObjCfg *cfg)
{
    if (cfg == nullptr || zlvIntlLogMgrHasCfg(cfg->name) == 0)
        return;
    zelvo::CfgRef keep{zlvIntlAcquireObjCfg(cfg)};
    zlvIntlLogMgrRemCfg(cfg);
    zlvIntlLogMgrAddCfg(cfg);
}

StringGroupIterator zlvIntlLogMgrConfigNames(void)
{
    return zlvIntlStringGroupIterator(ZLV_TK_CFG_NAMES);
}

ZlvObjCfg *zlvIntlLogMgrGetCfg(const char *name)
{
    if (name == nullptr || RkoStringCmp(name, ROOT) == 0)
        return nullptr;
    if (ZlvObjCfg *registered = zlvIntlStringToObjCfgMapGet(ZLV_TK_CFG_DATA, name))
        return registered;
    ZlvObjCfg *cfg = zlvIntlAllocObjCfg(name);
    zlvIntlLogMgrAddCfg(cfg);
    return cfg;
}

ZlvBool zlvIntlLogMgrHasCfg(const char *name)
{
    return zlvIntlStringToObjCfgMapHasKey(ZLV_TK_CFG_DATA, name);
}

ZlvBool zlvIntlLogMgrApplyCfg(ZlvObject *object, const char *name)
{
    return object != nullptr ? apply(object, name, nullptr) : ZlvBool{0};
}

ZlvBool zlvLogMgrAddCfgFromFile(const char *configName, const char *key, const char *value)
{
    if (RkoStringLen(configName) == 0 || RkoStringLen(key) == 0 || value == nullptr)
        return 0;
    const bool isNew = zlvIntlLogMgrHasCfg(configName) == 0;
    zelvo::CfgRef cfg{zlvIntlLogMgrGetCfg(configName)};
    if (!cfg)
        return 0;
    zlvIntlSetObjCfgProp(cfg.get(), key, value);
    if (isNew)
        zlvIntlObjCfgSetFromFile(cfg.get(), 1);
    return 1;
}

void ZlvLogMgrAddCfg(ZlvObjCfg *cfg)
{
    zelvo::locked(zlvIntlLogMgrAddCfg, cfg);
}

void ZlvLogMgrRemCfg(ZlvObjCfg *cfg)
{
    zelvo::locked(zlvIntlLogMgrRemCfg, cfg);
}

void ZlvLogMgrUpdateCfg(ZlvObjCfg *cfg)
{
    zelvo::locked(zlvIntlLogMgrUpdateCfg, cfg);
}

StringGroupIterator ZlvLogMgrConfigNames(void)
{
    return zelvo::locked(zlvIntlLogMgrConfigNames);
}

ZlvObjCfg *ZlvLogMgrGetCfg(const char *name)
{
    return zelvo::locked(zlvIntlLogMgrGetCfg, name);
}

ZlvBool ZlvLogMgrHasCfg(const char *name)
{
    return zelvo::locked(zlvIntlLogMgrHasCfg, name);
}

ZlvBool ZlvLogMgrApplyCfg(ZlvObject *object, const char *name)
{
    return zelvo::locked(zlvIntlLogMgrApplyCfg, object, name);
}
