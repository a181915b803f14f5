// SPDX-License-Identifier: Apache-2.0
// Containers of all families, as class functions use them: each makes its own and walks it.
#include "Twins.h"

namespace zelvo_test {

namespace {

/// What all families have, under the names of one.
#define WALK(FAMILY, CONTAINER, FREE)                                                              \
    for (auto at = TWIN(zlvIntl##FAMILY##Iterator)(CONTAINER);                                     \
         TWIN(zlvIntl##FAMILY##IterHasNext)(at) == 1; at = TWIN(zlvIntl##FAMILY##IterNext)(at))    \
    FREE(TWIN(zlvIntl##FAMILY##IterGet)(at))

#define REMOVE_FIRST(FAMILY, CONTAINER)                                                            \
    TWIN(zlvIntl##FAMILY##IterRem)(TWIN(zlvIntl##FAMILY##Iterator)(CONTAINER))

#define LIST_OF(FAMILY, ELEMENT, FREE)                                                             \
    do {                                                                                           \
        FAMILY *list = TWIN(zlvIntlAlloc##FAMILY)();                                               \
        HOLDS(TWIN(zlvIntl##FAMILY##Append)(list, ELEMENT) == 1);                                  \
        HOLDS(TWIN(zlvIntl##FAMILY##Append)(list, ELEMENT) == 1);                                  \
        FAMILY *copy = TWIN(zlvIntlCopy##FAMILY)(list);                                            \
        TWIN(zlvIntlFree##FAMILY)(list);                                                           \
        WALK(FAMILY, copy, FREE);                                                                  \
        REMOVE_FIRST(FAMILY, copy);                                                                \
        TWIN(zlvIntlFree##FAMILY)(copy);                                                           \
    } while (false)

#define GROUP_OF(FAMILY, FIRST, SECOND, FREE)                                                      \
    do {                                                                                           \
        FAMILY *group = TWIN(zlvIntlAlloc##FAMILY)();                                              \
        HOLDS(TWIN(zlvIntl##FAMILY##Add)(group, FIRST) == 1);                                      \
        HOLDS(TWIN(zlvIntl##FAMILY##Add)(group, SECOND) == 1);                                     \
        WALK(FAMILY, group, FREE);                                                                 \
        REMOVE_FIRST(FAMILY, group);                                                               \
        HOLDS(TWIN(zlvIntl##FAMILY##Rem)(group, SECOND) == 1);                                     \
        TWIN(zlvIntlFree##FAMILY)(group);                                                          \
    } while (false)

#define MAP_OF(FAMILY, VALUE, FREE)                                                                \
    do {                                                                                           \
        FAMILY *map = TWIN(zlvIntlAlloc##FAMILY)();                                                \
        HOLDS(TWIN(zlvIntl##FAMILY##Put)(map, "first", VALUE) == 1);                               \
        HOLDS(TWIN(zlvIntl##FAMILY##Put)(map, "second", VALUE) == 1);                              \
        FAMILY *copy = TWIN(zlvIntlCopy##FAMILY)(map);                                             \
        TWIN(zlvIntlFree##FAMILY)(map);                                                            \
        for (auto at = TWIN(zlvIntl##FAMILY##Iterator)(copy);                                      \
             TWIN(zlvIntl##FAMILY##IterHasNext)(at) == 1;                                          \
             at = TWIN(zlvIntl##FAMILY##IterNext)(at)) {                                           \
            RkoMemoryFree(TWIN(zlvIntl##FAMILY##IterGetKey)(at));                                  \
            FREE(TWIN(zlvIntl##FAMILY##IterGetVal)(at));                                           \
        }                                                                                          \
        FREE(TWIN(zlvIntl##FAMILY##Get)(copy, "first"));                                           \
        TWIN(zlvIntl##FAMILY##Rem)(copy, "first");                                                 \
        HOLDS(TWIN(zlvIntl##FAMILY##HasKey)(copy, "first") == 0);                                  \
        TWIN(zlvIntl##FAMILY##RemNode)(copy, TWIN(zlvIntl##FAMILY##GetNode)(copy, "second"));      \
        HOLDS(TWIN(zlvIntl##FAMILY##GetNode)(copy, "second") == nullptr);                          \
        TWIN(zlvIntlFree##FAMILY)(copy);                                                           \
    } while (false)

void leaveAlone(const ZlvObjClass *) {}

} // namespace

void useLists()
{
    ZlvParm parm{.type = ZLV_PARM_INT, .value = {.intValue = 7}};
    LIST_OF(StringList, "text", RkoMemoryFree);
    LIST_OF(ParmList, &parm, ZlvFreeParm);
    GROUP_OF(StringGroup, "first", "second", RkoMemoryFree);
    ZlvObject *first = TWIN(zlvIntlGetObject)("busy.listener0", "quiet_handler");
    ZlvObject *second = TWIN(zlvIntlGetObject)("busy.listener1", "quiet_handler");
    GROUP_OF(ListenerGroup, first, second, TWIN(zlvIntlReleaseObject));
    TWIN(zlvIntlReleaseObject)(first);
    TWIN(zlvIntlReleaseObject)(second);
}

void useMaps()
{
    MAP_OF(StringToStringMap, "value", RkoMemoryFree);
    MAP_OF(StringToObjClassMap, zlvToolkitGetClassDef("zlv_basiclogger"), leaveAlone);
    ZlvObject *object = TWIN(zlvIntlGetObject)("busy.listener0", "quiet_handler");
    MAP_OF(StringToObjMap, object, TWIN(zlvIntlReleaseObject));
    TWIN(zlvIntlReleaseObject)(object);
    ZlvObjCfg *cfg = TWIN(zlvIntlAllocObjCfg)("twins.loose");
    MAP_OF(StringToObjCfgMap, cfg, TWIN(zlvIntlReleaseObjCfg));
    TWIN(zlvIntlReleaseObjCfg)(cfg);
}

} // namespace zelvo_test
