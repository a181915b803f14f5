// SPDX-License-Identifier: Apache-2.0
// The portability layer: memory, strings, buffers, property lists.
#include "Case.h"
#include "ZlvToolkitIntl.h"

namespace zelvo_test {
namespace {

#define CALL(name) plainCase(#name, Kind::Logger, name)

int32_t fileWith(const char *content)
{
    FILE *file = std::fopen("sample.properties", "w");
    const int32_t written = std::fputs(content, file);
    std::fclose(file);
    return written;
}

void addMemory(Cases &cases)
{
    const Cases calls{
        CALL(RkoMemoryMalloc),
        CALL(RkoMemoryCalloc),
        CALL(RkoStringDup),
        specialCase("RkoMemoryRealloc", Kind::Logger,
                    [](World &) { return RkoMemoryRealloc(nullptr, 8); }),
        specialCase(
            "RkoMemoryRealloc grown", Kind::Logger,
            [](World &world) {
                void *grown = RkoMemoryRealloc(world.array, 2000);
                world.array = grown != nullptr ? grown : world.array;
                return ZlvBool{grown != nullptr};
            },
            [](World *world) { world->array = RkoMemoryMalloc(8); }),
        specialCase("CxMutexCreate", Kind::Logger,
                    [](World &) {
                        CxMutex mutex = nullptr;
                        const CxStatus status = CxMutexCreate(&mutex);
                        CxMutexDestroy(&mutex);
                        return status;
                    }),
        specialCase("zlvAPIMutexLock", Kind::Logger,
                    [](World &) {
                        CxMutexDestroy(&ZLV_TK_API_MUTEX);
                        ZLV_TK_API_MUTEX_EXISTS = 0;
                        const ZlvBool locked = zlvAPIMutexLock();
                        zlvAPIMutexUnlock();
                        return locked;
                    }),
    };
    cases.insert(cases.end(), calls.begin(), calls.end());
}

void addBuffers(Cases &cases)
{
    const Cases calls{
        CALL(cxStringBuffHasCapacity),
        CALL(CxStringBuffAppendChar),
        CALL(CxStringBuffAppendEBCDICInt64),
        CALL(CxStringBuffAppendInt32),
        CALL(CxStringBuffAppendInt64),
        CALL(CxStringBuffAppendStr),
        CALL(CxStringBuffAppendStrN),
        CALL(CxStringBuffAppendUCS2Char),
        CALL(CxStringBuffAppendUInt64),
        CALL(CxStringBuffAppendUTF32Char),
        CALL(CxStringBuffCopyStr),
        CALL(CxStringBuffInsertStr),
        specialCase(
            "CxStringBuffPack", Kind::Logger,
            [](World &world) { return CxStringBuffPack(world.sample<CxStringBuff *>()); },
            [](World *world) {
                CxStringBuffAppendStr(world->sample<CxStringBuff *>(), "to be packed");
            }),
        CALL(cxUStringBuffHasCapacity),
        CALL(CxUStringBuffAppendChar),
        CALL(CxUStringBuffAppendInt32),
        CALL(CxUStringBuffAppendInt64),
        CALL(CxUStringBuffAppendStr),
        CALL(CxUStringBuffAppendStrN),
        CALL(CxUStringBuffAppendUDate),
        CALL(CxUStringBuffAppendUDouble),
        CALL(CxUStringBuffAppendUInt64),
        CALL(CxUStringBuffAppendUStr),
        CALL(CxUStringDup),
        CALL(CxUStringDupStrToUChar),
        CALL(CxUStringDupUCharToStr),
        CALL(CxUStringParmToStr),
    };
    cases.insert(cases.end(), calls.begin(), calls.end());
}

ZlvBool ensure(World &world)
{
    return CxListEnsureCapacity(&world.array, &world.arrayCapacity, &world.arrayLength, 20, 8);
}

void addLists(Cases &cases)
{
    constexpr const char *TEXT = "one.a = b\ntwo.c = d\n";
    const auto prepareFile = [](World *) { fileWith(TEXT); };
    const Cases calls{
        specialCase("CxListEnsureCapacity", Kind::Logger, ensure),
        specialCase("CxListEnsureCapacity grown", Kind::Logger, ensure,
                    [](World *world) {
                        CxListEnsureCapacity(&world->array, &world->arrayCapacity,
                                             &world->arrayLength, 3, 8);
                    }),
        CALL(cxPropListHasCapacity),
        CALL(CxPropListCopyStr),
        CALL(CxPropListIterCopyKey),
        CALL(CxPropListIterCopyVal),
        CALL(CxPropListPutStr),
        specialCase("CxPropListPutStr new", Kind::Logger,
                    [](World &world) {
                        return CxPropListPutStr(world.sample<CxPropList *>(), "new", "value");
                    }),
        specialCase(
            "CxPropListRead", Kind::Logger,
            [](World &world) {
                return CxPropListRead("sample.properties", world.sample<CxPropList *>(),
                                      world.sample<CxStatus *>());
            },
            prepareFile),
        composite(specialCase(
            "zlvDoReadProps", Kind::Logger,
            [](World &world) {
                return zlvDoReadProps("sample.properties", nullptr, world.sample<CxStatus *>());
            },
            prepareFile)),
    };
    cases.insert(cases.end(), calls.begin(), calls.end());
}

} // namespace

void addPortabilityCases(Cases &cases)
{
    addMemory(cases);
    addBuffers(cases);
    addLists(cases);
}

} // namespace zelvo_test
