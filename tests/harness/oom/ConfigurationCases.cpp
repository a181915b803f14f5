// SPDX-License-Identifier: Apache-2.0
// Configurations, the log manager that keeps them, and the reader that fills them from a file.
#include "PlainCase.h"

namespace zelvo_test {
namespace {

/// Both forms of a call with the given arguments.
#define CALLED(call, ...)                                                                          \
    specialCase("Zlv" #call, Kind::Logger,                                                         \
                [](World &world) { return Zlv##call(with(world) __VA_OPT__(, ) __VA_ARGS__); }),   \
        specialCase("zlvIntl" #call, Kind::Logger, [](World &world) {                              \
            return zlvIntl##call(with(world) __VA_OPT__(, ) __VA_ARGS__);                          \
        })

/// The world's configuration, which stands below "above" and has a child.
ZlvObjCfg *with(World &world)
{
    return world.sample<ZlvObjCfg *>();
}

void addFamily(World *world)
{
    ZlvObjCfg *above = ZlvLogMgrGetCfg("above");
    ZlvObjCfg *below = ZlvLogMgrGetCfg("below");
    ZlvObjCfgAddChild(above, with(*world));
    ZlvObjCfgAddChild(with(*world), below);
    ZlvSetObjCfgProp(above, "level", "INFO");
    ZlvReleaseObjCfg(below);
    ZlvReleaseObjCfg(above);
}

void addTree(Cases &cases)
{
    Cases calls{PAIR(AllocObjCfg),
                PAIR(ObjCfgGetName),
                CALLED(LogMgrRemCfg),
                CALLED(LogMgrUpdateCfg),
                PLAIN(zlvLogMgrGetParentConfigName),
                specialCase("ZlvLogMgrGetCfg", Kind::Logger,
                            [](World &) { return ZlvLogMgrGetCfg("above.new"); }),
                specialCase("zlvIntlLogMgrGetCfg", Kind::Logger,
                            [](World &) { return zlvIntlLogMgrGetCfg("above.new"); }),
                specialCase("ZlvLogMgrApplyCfg", Kind::Logger,
                            [](World &world) { return ZlvLogMgrApplyCfg(world.object(), "cfg"); }),
                specialCase("zlvIntlLogMgrApplyCfg", Kind::Logger,
                            [](World &world) {
                                return zlvIntlLogMgrApplyCfg(world.object(), "above.other");
                            }),
                specialCase("zlvLogMgrAddCfgFromFile", Kind::Logger, [](World &) {
                    return zlvLogMgrAddCfgFromFile("above.new", "key", "value");
                })};
    for (Case &call : calls) {
        call.isComposite = true;
        call.prepare = addFamily;
    }
    append(cases, calls);
}

/// CALL(configuration of the world, another one that is made for it).
template <class Call>
Case pairCase(const char *name, Call call)
{
    Case made{.name = name, .isComposite = true};
    made.run = [call](World *world, Fault &fault) {
        ZlvObjCfg *other = ZlvAllocObjCfg("other");
        fault.during([&] { call(with(*world), other); });
        ZlvReleaseObjCfg(other);
        return textOf(with(*world)->parentName);
    };
    made.nothing = "null";
    return made;
}

/// The name of a parent that nobody has registered; getting it makes it.
void addGhost(World *world)
{
    ZlvObjCfg *ghost = ZlvAllocObjCfg("ghost");
    ZlvObjCfgSetParent(with(*world), ghost);
    ZlvReleaseObjCfg(ghost);
}

void addPairs(Cases &cases)
{
    Cases parents{CALLED(ObjCfgGetParent)};
    for (Case &call : parents)
        call.prepare = addGhost;
    for (Case &call : parents)
        cases.push_back(composite(call));
    const auto add = [](auto call) {
        return [call](ZlvObjCfg *, ZlvObjCfg *other) { call(other); };
    };
    append(cases, {pairCase("ZlvObjCfgSetParent", ZlvObjCfgSetParent),
                   pairCase("zlvIntlObjCfgSetParent", zlvIntlObjCfgSetParent),
                   pairCase("ZlvObjCfgAddChild", ZlvObjCfgAddChild),
                   pairCase("zlvIntlObjCfgAddChild", zlvIntlObjCfgAddChild),
                   pairCase("ZlvLogMgrAddCfg", add(ZlvLogMgrAddCfg)),
                   pairCase("zlvIntlLogMgrAddCfg", add(zlvIntlLogMgrAddCfg))});
}

/// A state of the reader that gets a character which it has to store.
#define READER(state, character)                                                                   \
    specialCase("zlvRdprDo" #state "State", Kind::Logger,                                          \
                [](World &world) { return zlvRdprDo##state##State(character, &world.context); })

void addReader(Cases &cases)
{
    Cases states{READER(StartLine, 'k'),         READER(StartLineBlanks, 'k'),
                 READER(KeyChars, 'k'),          READER(KeyCharEscape, ':'),
                 READER(KeyEndBlanksFirst, 'v'), READER(KeyEndBlanksFinal, 'v'),
                 READER(ValChars, 'v'),          READER(ValEscape, '\\'),
                 READER(MultiLineVal, 'v'),      READER(UU3, '1')};
    for (Case &state : states)
        state.nothing = textOf(int32_t{ZLV_RDPR_ERROR});
    states.back().isComposite = true; // it adds the digit before it appends
    append(cases, states);
    Case emit = specialCase(
        "zlvRdprEmitCfg", Kind::Logger, [](World &world) { return zlvRdprEmitCfg(&world.context); },
        [](World *world) {
            CxStringBuffDiscard(&world->context.key);
            CxStringBuffDiscard(&world->context.value);
            CxStringBuffAppendStr(&world->context.key, "new.key");
            CxStringBuffAppendStr(&world->context.value, "value");
        });
    emit.isComposite = true;
    cases.push_back(emit);
}

} // namespace

void addConfigurationCases(Cases &cases)
{
    addTree(cases);
    addPairs(cases);
    addReader(cases);
}

} // namespace zelvo_test
