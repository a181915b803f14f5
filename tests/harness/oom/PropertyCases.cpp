// SPDX-License-Identifier: Apache-2.0
// Properties of maps, objects, configurations and events.
#include "PlainCase.h"

namespace zelvo_test {
namespace {

/// The getter and the setter of each type.
#define EACH_TYPE(family, of)                                                                      \
    family(Get##of##Prop), family(Get##of##PropBool), family(Get##of##PropInt),                    \
        family(Get##of##PropLong), family(Get##of##PropFloat), family(Get##of##PropDouble),        \
        family(Set##of##Prop), family(Set##of##PropBool), family(Set##of##PropInt),                \
        family(Set##of##PropLong), family(Set##of##PropFloat), family(Set##of##PropDouble)

#define PUBLIC(call) PLAIN(Zlv##call)

void append(Cases &cases, Cases more, const std::function<void(World *)> &prepare)
{
    for (Case &each : more) {
        each.prepare = prepare;
        cases.push_back(each);
    }
}

} // namespace

void addPropertyCases(Cases &cases)
{
    append(cases, {EACH_TYPE(PUBLIC, Map), PLAIN(ZlvGetMapPropChar), PLAIN(ZlvSetMapPropChar)}, {});
    append(cases, {EACH_TYPE(PAIR, Obj)},
           [](World *world) { ZlvSetObjPropInt(world->object(), "sample", 5); });
    append(cases, {EACH_TYPE(PAIR, ObjCfg), PAIR(GetInheritedObjCfgProp)},
           [](World *world) { ZlvSetObjCfgPropInt(world->sample<ZlvObjCfg *>(), "sample", 5); });
    append(cases, {EACH_TYPE(PUBLIC, Event)},
           [](World *world) { ZlvSetEventPropInt(world->event(), "sample", 5); });
    // The first property of a record makes its map.
    append(cases,
           {PAIR(SetObjProp), PAIR(SetObjCfgProp), PLAIN(ZlvSetEventProp),
            plainCase<Owner::CALLEE>("zlvFetchObjPropMap", Kind::Logger, zlvFetchObjPropMap),
            plainCase<Owner::CALLEE>("zlvFetchEventPropMap", Kind::Logger, zlvFetchEventPropMap)},
           {});
    append(cases,
           {specialCase("ZlvGetObjCfgProp inherited", Kind::Logger,
                        [](World &world) {
                            return ZlvGetObjCfgProp(world.sample<ZlvObjCfg *>(), "inherited",
                                                    world.sample<ZlvBool *>());
                        })},
           [](World *world) {
               ZlvObjCfg *parent = ZlvLogMgrGetCfg("parent");
               ZlvSetObjCfgProp(parent, "inherited", "value");
               ZlvObjCfgSetParent(world->sample<ZlvObjCfg *>(), parent);
               ZlvReleaseObjCfg(parent);
           });
}

} // namespace zelvo_test
