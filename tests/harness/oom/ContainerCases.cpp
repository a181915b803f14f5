// SPDX-License-Identifier: Apache-2.0
// Lists, groups and maps; each operation in its public and in its internal form.
#include <cstring>

#include "Case.h"
#include "ZlvToolkitIntl.h"

namespace zelvo_test {
namespace {

/// Both forms of an operation, with samples of its parameters.
#define PLAIN(operation)                                                                           \
    plainCase("Zlv" #operation, Kind::Logger, Zlv##operation),                                     \
        plainCase("zlvIntl" #operation, Kind::Logger, zlvIntl##operation)

/// Both forms of an operation, with the given arguments.
#define CALLED(operation, ...)                                                                     \
    specialCase("Zlv" #operation, Kind::Logger,                                                    \
                [](World &world) { return Zlv##operation(__VA_ARGS__); }),                         \
        specialCase("zlvIntl" #operation, Kind::Logger,                                            \
                    [](World &world) { return zlvIntl##operation(__VA_ARGS__); })

#define SAMPLE(type) world.sample<type *>()

void addLists(Cases &cases)
{
    append(cases, {PLAIN(AllocStringList), PLAIN(AllocParmList), PLAIN(CopyStringList),
                   PLAIN(CopyParmList), PLAIN(StringListAppend), PLAIN(ParmListAppend),
                   PLAIN(StringListIterGet), PLAIN(ParmListIterGet)});
    append(cases, {plainCase("ZlvCopyParm", Kind::Logger, ZlvCopyParm),
                   specialCase("ZlvCopyParm text", Kind::Logger,
                               [](World &) {
                                   char text[] = "text";
                                   const ZlvParm parm{ZLV_PARM_STRING, {.stringValue = text}};
                                   return ZlvCopyParm(&parm);
                               }),
                   specialCase("ZlvParmListAppend text", Kind::Logger, [](World &world) {
                       char text[] = "text";
                       const ZlvParm parm{ZLV_PARM_STRING, {.stringValue = text}};
                       return ZlvParmListAppend(SAMPLE(ParmList), &parm);
                   })});
}

int byText(const void *a, const void *b)
{
    return std::strcmp(*static_cast<char *const *>(a), *static_cast<char *const *>(b));
}

int byNumber(const void *a, const void *b)
{
    return (*static_cast<ZlvParm *const *>(a))->value.intValue -
           (*static_cast<ZlvParm *const *>(b))->value.intValue;
}

void addTokens(Cases &cases)
{
    append(cases, {plainCase("ZlvStrTokIterGet", Kind::Logger, ZlvStrTokIterGet),
                   specialCase("ZlvMsgIdFilterGetStringList", Kind::Logger,
                               [](World &) { return ZlvMsgIdFilterGetStringList("ABC* *E"); })});
}

void addSorts(Cases &cases)
{
    append(cases,
           {specialCase(
                "ZlvSortStringList", Kind::Logger,
                [](World &world) { ZlvSortStringList(SAMPLE(StringList), byText); },
                [](World *world) { ZlvStringListAppend(world->sample<StringList *>(), "first"); }),
            specialCase(
                "ZlvSortParmList", Kind::Logger,
                [](World &world) { ZlvSortParmList(SAMPLE(ParmList), byNumber); },
                [](World *world) {
                    const ZlvParm least{ZLV_PARM_INT, {.intValue = -1}};
                    ZlvParmListAppend(world->sample<ParmList *>(), &least);
                })});
    for (Case &sort : cases)
        if (sort.name.starts_with("ZlvSort"))
            sort.keeps = 1;
}

void addGroups(Cases &cases)
{
    append(cases, {PLAIN(AllocStringGroup), PLAIN(AllocListenerGroup), PLAIN(StringGroupIterGet),
                   CALLED(StringGroupAdd, SAMPLE(StringGroup), "new"),
                   CALLED(ListenerGroupAdd, SAMPLE(ListenerGroup), ZLV_TK_ERROR_LOG)});
}

void addMaps(Cases &cases)
{
    append(cases,
           {PLAIN(AllocStringToStringMap), PLAIN(AllocStringToObjMap),
            PLAIN(AllocStringToObjCfgMap), PLAIN(AllocStringToObjClassMap),
            PLAIN(CopyStringToStringMap), PLAIN(CopyStringToObjMap), PLAIN(CopyStringToObjCfgMap),
            PLAIN(CopyStringToObjClassMap), PLAIN(StringToStringMapGet),
            PLAIN(StringToStringMapIterGetKey), PLAIN(StringToObjMapIterGetKey),
            PLAIN(StringToObjCfgMapIterGetKey), PLAIN(StringToObjClassMapIterGetKey),
            PLAIN(StringToStringMapIterGetVal),
            CALLED(StringToStringMapPut, SAMPLE(StringToStringMap), "sample", "replaced"),
            CALLED(StringToObjMapPut, SAMPLE(StringToObjMap), "new", world.object()),
            CALLED(StringToObjCfgMapPut, SAMPLE(StringToObjCfgMap), "new", SAMPLE(ZlvObjCfg)),
            CALLED(StringToObjClassMapPut, SAMPLE(StringToObjClassMap), "new", SAMPLE(ZlvObjClass)),
            specialCase("ZlvStringToStringMapPut new", Kind::Logger, [](World &world) {
                return ZlvStringToStringMapPut(SAMPLE(StringToStringMap), "new", "value");
            })});
}

} // namespace

void addContainerCases(Cases &cases)
{
    addLists(cases);
    addTokens(cases);
    addSorts(cases);
    addGroups(cases);
    addMaps(cases);
}

} // namespace zelvo_test
