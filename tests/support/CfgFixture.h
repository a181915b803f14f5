// SPDX-License-Identifier: Apache-2.0
// An open toolkit whose tests work with configurations, and a vocabulary for their tree.
#pragma once

#include "ZlvLogManager.h"
#include "ZlvObjConfig.h"
#include "support/Elements.h"
#include "support/ToolkitFixture.h"

namespace zelvo_test {

/// Configurations that come from the fixture's calls are released by it before the toolkit closes.
class CfgFixture : public ToolkitFixture {
protected:
    void SetUp() override { open(); }

    void TearDown() override
    {
        for (ZlvObjCfg *cfg : cfgs_)
            ZlvReleaseObjCfg(cfg);
        ToolkitFixture::TearDown();
    }

    /// Leaves a reference to the fixture.
    ZlvObjCfg *keepCfg(ZlvObjCfg *cfg)
    {
        cfgs_.push_back(cfg);
        return cfg;
    }
    /// The registered configuration NAME, made when there is none.
    ZlvObjCfg *get(const char *name) { return keepCfg(ZlvLogMgrGetCfg(name)); }
    /// A new configuration that is not registered.
    ZlvObjCfg *alloc(const char *name) { return keepCfg(ZlvAllocObjCfg(name)); }

    static bool has(const char *name) { return ZlvLogMgrHasCfg(name) == 1; }

    static void set(ZlvObjCfg *cfg, const char *property, const char *value)
    {
        ZlvSetObjCfgProp(cfg, property, value);
    }
    /// The inherited lookup.
    static Text lookup(ZlvObjCfg *cfg, const char *property)
    {
        return taken(ZlvGetObjCfgProp(cfg, property, nullptr));
    }

    static Text parentOf(const ZlvObjCfg *cfg) { return peeked(cfg->parentName); }
    static Names childrenOf(ZlvObjCfg *cfg) { return names(ZlvObjCfgChildrenNames(cfg)); }

    /// The parent's name as the log manager computes and stores it.
    static Text computedParentOf(ZlvObjCfg *cfg)
    {
        HeldMutex held;
        return taken(zlvLogMgrGetParentConfigName(cfg));
    }

    /// The registered names in their order, without those that open makes for its own objects.
    static Names registered()
    {
        Names all = names(ZlvLogMgrConfigNames());
        std::erase_if(all, [](const std::string &name) { return name.starts_with("zelvo."); });
        return all;
    }

    static Names names(StringGroupIterator at)
    {
        Names all;
        for (; ZlvStringGroupIterHasNext(at); at = ZlvStringGroupIterNext(at))
            all.push_back(taken(ZlvStringGroupIterGet(at)).value_or("(null)"));
        return all;
    }

private:
    std::vector<ZlvObjCfg *> cfgs_;
};

} // namespace zelvo_test
