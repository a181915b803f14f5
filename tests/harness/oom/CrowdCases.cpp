// SPDX-License-Identifier: Apache-2.0
// Lookups in large maps, which make themselves an index and do without it when there is no memory.
#include "Case.h"
#include "ZlvToolkitIntl.h"

namespace zelvo_test {
namespace {

constexpr int CROWD = 40; ///< more than are found by walking alone

template <class Visit>
void forEachName(Visit visit)
{
    for (int number = 0; number < CROWD; ++number)
        visit(("crowd" + std::to_string(number)).c_str());
}

template <class Map>
void dropIndex(Map *map)
{
    RkoMemoryFree(map->index);
    map->index = nullptr;
}

/// Fills the world's maps.
void crowdMaps(World *world)
{
    auto *texts = world->sample<StringToStringMap *>();
    auto *objects = world->sample<StringToObjMap *>();
    auto *cfgs = world->sample<StringToObjCfgMap *>();
    auto *classes = world->sample<StringToObjClassMap *>();
    forEachName([&](const char *name) {
        ZlvStringToStringMapPut(texts, name, "text");
        ZlvStringToObjMapPut(objects, name, world->object());
        ZlvStringToObjCfgMapPut(cfgs, name, world->sample<ZlvObjCfg *>());
        ZlvStringToObjClassMapPut(classes, name, world->sample<ZlvObjClass *>());
    });
    dropIndex(texts);
    dropIndex(objects);
    dropIndex(cfgs);
    dropIndex(classes);
}

/// Fills the toolkit's registries.
void crowdRegistries(World *world)
{
    forEachName([&](const char *name) {
        ZlvAddLoggerClass(name, nullptr, nullptr, nullptr, nullptr, nullptr);
        world->hold(name, "zlv_basiclogger");
    });
    dropIndex(ZLV_TK_CLASSES);
    dropIndex(ZLV_TK_INSTANCES);
    dropIndex(ZLV_TK_CFG_DATA);
}

void append(Cases &cases, const Cases &more, void (*prepare)(World *))
{
    for (const Case &each : more) {
        cases.push_back(each);
        cases.back().prepare = prepare;
    }
}

#define IN(owner, map, call)                                                                       \
    specialCase<Owner::owner>(#call, Kind::Logger,                                                 \
                              [](World &world) { return call(world.sample<map *>(), "crowd39"); })

/// The lookups of a map, in both forms; OWNER is that of the value that is handed out.
#define LOOKUPS(owner, map)                                                                        \
    IN(owner, map, Zlv##map##Get), IN(owner, map, zlvIntl##map##Get),                              \
        IN(CALLER, map, Zlv##map##HasKey), IN(CALLER, map, zlvIntl##map##HasKey),                  \
        IN(CALLER, map, Zlv##map##Rem), IN(CALLER, map, zlvIntl##map##Rem),                        \
        IN(CALLEE, map, zlvIntl##map##GetNode)

#define NAMED(call) specialCase(#call, Kind::Logger, [](World &) { return call("crowd39"); })

/// Releases an object that only the case holds, and makes it again.
template <void (*RELEASE)(ZlvObject *)>
Case releaseCase(const char *name)
{
    Case made{.name = name};
    made.run = [](World *, Fault &fault) {
        ZlvObject *object = ZlvGetObject("own", "zlv_basiclogger");
        dropIndex(ZLV_TK_INSTANCES);
        fault.during([&] { RELEASE(object); });
        return std::string();
    };
    return made;
}

/// Takes an object out of the registry, which is one of those who hold it.
Case removalCase()
{
    Case made{.name = "zlvToolkitRemObjInstance"};
    made.run = [](World *, Fault &fault) {
        ZlvObject *object = ZlvAcquireObject(ZlvGetObject("own", "zlv_basiclogger"));
        dropIndex(ZLV_TK_INSTANCES);
        fault.during([&] { zlvToolkitRemObjInstance("own"); });
        ZlvReleaseObject(object);
        return std::string();
    };
    return made;
}

} // namespace

void addCrowdCases(Cases &cases)
{
    append(cases,
           {LOOKUPS(CALLER, StringToStringMap), LOOKUPS(CALLER, StringToObjMap),
            LOOKUPS(CALLER, StringToObjCfgMap), LOOKUPS(CALLEE, StringToObjClassMap)},
           crowdMaps);
    append(cases,
           {NAMED(ZlvLogMgrHasCfg), NAMED(zlvIntlLogMgrHasCfg), NAMED(zlvToolkitGetObjInstance),
            specialCase<Owner::CALLEE>("zlvToolkitGetClassDef", Kind::Logger,
                                       [](World &) { return zlvToolkitGetClassDef("crowd39"); }),
            removalCase(), releaseCase<ZlvReleaseObject>("ZlvReleaseObject"),
            releaseCase<zlvIntlReleaseObject>("zlvIntlReleaseObject")},
           crowdRegistries);
}

} // namespace zelvo_test
