// SPDX-License-Identifier: Apache-2.0
// The configurations met on the way up from one to its ancestors.
#pragma once

#include "ZlvObjConfig.h"

namespace zelvo {

/// One configuration on the chain and the part of the chain below it. Parents are stored by name,
/// so an application can tie them into a circle; a walk ends where it would meet itself.
struct CfgChain {
    const ZlvObjCfg *cfg;
    const CfgChain *below;

    static bool contains(const CfgChain *chain, const ZlvObjCfg *cfg)
    {
        for (; chain != nullptr; chain = chain->below)
            if (chain->cfg == cfg)
                return true;
        return false;
    }
};

} // namespace zelvo
