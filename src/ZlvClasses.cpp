// SPDX-License-Identifier: Apache-2.0
// The registry of classes: by name, and by kind as four lists of names.
#include "ZlvBuiltinClasses.h"
#include "ZlvToolkitIntl.h"

StringToObjClassMap *ZLV_TK_CLASSES = nullptr;
StringGroup *ZLV_TK_LOGGER_CLASSNAMES = nullptr;
StringGroup *ZLV_TK_FILTER_CLASSNAMES = nullptr;
StringGroup *ZLV_TK_HANDLER_CLASSNAMES = nullptr;
StringGroup *ZLV_TK_FORMATTER_CLASSNAMES = nullptr;

namespace {

struct KindNames {
    uint32_t kind;
    StringGroup **names;
};

constexpr KindNames kinds[] = {
    {ZLV_KIND_LOGGER, &ZLV_TK_LOGGER_CLASSNAMES},
    {ZLV_KIND_FILTER, &ZLV_TK_FILTER_CLASSNAMES},
    {ZLV_KIND_HANDLER, &ZLV_TK_HANDLER_CLASSNAMES},
    {ZLV_KIND_FORMATTER, &ZLV_TK_FORMATTER_CLASSNAMES},
};

StringGroup *namesOf(uint32_t kind)
{
    for (const KindNames &row : kinds)
        if (row.kind == kind)
            return *row.names;
    return nullptr;
}

/// Lets go of the class that another one is about to replace under its name. Only a class that was
/// made before there was a registry gets there: it could not see that a built-in has its name.
void displace(ZlvObjClass *displaced, const ZlvObjClass *successor)
{
    if (displaced == nullptr || displaced == successor)
        return;
    if (displaced->kind != successor->kind)
        zlvIntlStringGroupRem(namesOf(displaced->kind), displaced->name);
    zlvFreeObjClass(displaced);
}

/// Lists a name; tells whether it is in the list now. A kind without a list needs none.
bool list(StringGroup *names, const char *name)
{
    zlvIntlStringGroupAdd(names, name);
    return names == nullptr || ZlvStringGroupGetLink(names, name) != nullptr;
}

/// Registers a class wholly or not at all. One whose name the map could not copy is found by nobody
/// but stays in the map, which owns it until close.
void put(const char *name, ZlvObjClass *objClass)
{
    ZlvObjClass *displaced = zlvToolkitGetClassDef(name);
    StringGroup *names = namesOf(objClass->kind);
    if (!list(names, name) || zlvIntlStringToObjClassMapPut(ZLV_TK_CLASSES, name, objClass) == 0) {
        zlvIntlStringGroupRem(names, name);
        zlvFreeObjClass(objClass);
        return;
    }
    if (zlvToolkitGetClassDef(name) != objClass)
        zlvIntlStringGroupRem(names, name);
    displace(displaced, objClass);
}

} // namespace

void zlvToolkitInitObjClasses(void)
{
    if (ZLV_TK_CLASSES != nullptr)
        return;
    ZLV_TK_CLASSES = zlvIntlAllocStringToObjClassMap();
    bool isWhole = ZLV_TK_CLASSES != nullptr;
    for (const KindNames &row : kinds) {
        *row.names = zlvIntlAllocStringGroup();
        isWhole = isWhole && *row.names != nullptr;
    }
    if (!isWhole)
        return zelvo::freeClasses(); // the next call tries again
    zelvo::forEachBuiltinClass(put);
}

void zlvToolkitAddClassDef(const char *name, ZlvObjClass *objClass)
{
    if (objClass == nullptr)
        return;
    if (name == nullptr || zelvo::isClosing()) {
        zlvFreeObjClass(objClass);
        return;
    }
    zlvToolkitInitObjClasses();
    put(name, objClass);
}

ZlvObjClass *zlvToolkitGetClassDef(const char *name)
{
    return zlvIntlStringToObjClassMapGet(ZLV_TK_CLASSES, name);
}

StringGroupIterator zlvToolkitFetchClassnames(uint32_t kind)
{
    return zlvIntlStringGroupIterator(namesOf(kind));
}

void zelvo::freeClasses()
{
    for (auto it = zlvIntlStringToObjClassMapIterator(ZLV_TK_CLASSES); it != nullptr; it = it->next)
        zlvFreeObjClass(it->value);
    zlvIntlFreeStringToObjClassMap(ZLV_TK_CLASSES);
    ZLV_TK_CLASSES = nullptr;
    for (const KindNames &row : kinds) {
        zlvIntlFreeStringGroup(*row.names);
        *row.names = nullptr;
    }
}
