// SPDX-License-Identifier: Apache-2.0
#include "ToolkitState.h"

#include "ZlvToolkitIntl.h"

namespace zelvo_test {
namespace {

std::string consoleText(const void *vars)
{
    return textOf(static_cast<const ConsoleHandlerVars *>(vars)->opened);
}

std::string fileText(const void *vars)
{
    return textOf(*static_cast<const FileHandlerVars *>(vars));
}

std::string idFilterText(const void *vars)
{
    const auto &filter = *static_cast<const MsgIdFilterVars *>(vars);
    return textOf(filter.mode) + textOf(filter.patterns) + textOf(filter.formatter) +
           textOf(filter.repeatTime) + textOf(filter.lastPassed);
}

std::string loggerText(const void *vars)
{
    const auto &logger = *static_cast<const PDLoggerVars *>(vars);
    std::string text = textOf(logger.idFormatter);
    for (const char *stamp : {logger.organization, logger.product, logger.component, logger.client,
                              logger.server, logger.serverFormat, logger.productInstance})
        text += " " + textOf(stamp);
    return text;
}

std::string xmlText(const void *vars)
{
    const auto &formatter = *static_cast<const PDXMLFormatterVars *>(vars);
    std::string text;
    for (const uint8_t flag :
         {formatter.emitSingleItems, formatter.singleComponent, formatter.singleProduct,
          formatter.singleProductId, formatter.singleServer, formatter.forceAsMessage,
          formatter.forceAsTrace})
        text += textOf(flag);
    return text;
}

struct VarsText {
    ZlvFFreeVars owner; ///< the entry that tells whose variables they are
    std::string (*text)(const void *vars);
};

constexpr VarsText VARS_TEXTS[] = {
    {ZlvConsoleHandlerFFreeVars, consoleText}, {ZlvFileHandlerFFreeVars, fileText},
    {ZlvMsgIdFilterFFreeVars, idFilterText},   {ZlvPDLoggerFFreeVars, loggerText},
    {ZlvPDXMLFormatterFFreeVars, xmlText},
};

std::string varsText(const ZlvObject &object)
{
    for (const VarsText &row : VARS_TEXTS)
        if (object.vars != nullptr && row.owner == object.objClass->fFreeVars)
            return row.text(object.vars);
    return textOf(object.vars);
}

void addKind(Lines &lines, const std::string &head, const ZlvObject &object)
{
    switch (object.objClass->kind) {
    case ZLV_KIND_LOGGER:
        lines.push_back(head + "level " + textOf(object.logger.level));
        return addElements(lines, head + "listeners", object.logger.listeners);
    case ZLV_KIND_FILTER:
        lines.push_back(head + "level " + textOf(object.filter.level));
        return addElements(lines, head + "listeners", object.filter.listeners);
    case ZLV_KIND_HANDLER:
        lines.push_back(head + "formatter " + textOf(object.handler.formatter));
        return addElements(lines, head + "listeners", object.handler.listeners);
    default:
        lines.push_back(head + "separator " + textOf(object.formatter.separator));
        lines.push_back(head + "date " + textOf(object.formatter.dateTimeFormat));
        lines.push_back(head + "locale " + textOf(object.formatter.locale));
    }
}

void addObject(Lines &lines, const ZlvObject &object)
{
    const std::string head = "object " + textOf(&object) + " ";
    lines.push_back(head + "count " + textOf(object.refCount));
    lines.push_back(head + "enabled " + textOf(object.enabled));
    lines.push_back(head + "variables " + varsText(object));
    addKind(lines, head, object);
    addElements(lines, head + "properties", object.properties);
}

void addCfg(Lines &lines, const ZlvObjCfg &cfg)
{
    const std::string head = "configuration " + textOf(cfg.name) + " ";
    lines.push_back(head + "count " + textOf(cfg.refCount));
    lines.push_back(head + "parent " + textOf(cfg.parentName));
    lines.push_back(head + "from file " + textOf(cfg.fromFile));
    addElements(lines, head + "children", cfg.children);
    addElements(lines, head + "properties", cfg.properties);
}

/// The names of a registry, and what ADD says of its values.
template <class Map, class Add>
void addRegistry(Lines &lines, const char *name, const Map *map, Add add)
{
    lines.push_back(std::string(name) + (map != nullptr ? "" : " absent"));
    for (auto *node = map != nullptr ? map->first : nullptr; node != nullptr; node = node->next) {
        lines.push_back(std::string(name) + " " + textOf(node->key));
        add(lines, *node->value);
    }
}

template <class Map>
auto nodesOf(const Map *map)
{
    return map != nullptr ? map->first : nullptr;
}

const StringGroup *namesOf(uint32_t kind)
{
    const StringGroup *names[] = {ZLV_TK_LOGGER_CLASSNAMES, ZLV_TK_FILTER_CLASSNAMES,
                                  ZLV_TK_HANDLER_CLASSNAMES, ZLV_TK_FORMATTER_CLASSNAMES};
    return names[kind - ZLV_KIND_LOGGER];
}

void addClass(Lines &lines, const ZlvObjClass &objClass)
{
    lines.push_back("named " + textOf(&objClass));
}

} // namespace

void addToolkitState(Lines &lines)
{
    lines.push_back("open " + textOf(ZLV_TK_ISOPEN));
    if (ZLV_TK_ISOPEN != 0)
        lines.push_back("error logger " + textOf(ZLV_TK_ERROR_LOG));
    addRegistry(lines, "class", ZLV_TK_CLASSES, addClass);
    addElements(lines, "logger classes", ZLV_TK_LOGGER_CLASSNAMES);
    addElements(lines, "filter classes", ZLV_TK_FILTER_CLASSNAMES);
    addElements(lines, "handler classes", ZLV_TK_HANDLER_CLASSNAMES);
    addElements(lines, "formatter classes", ZLV_TK_FORMATTER_CLASSNAMES);
    addRegistry(lines, "instance", ZLV_TK_INSTANCES, addObject);
    addRegistry(lines, "registered", ZLV_TK_CFG_DATA, addCfg);
    addElements(lines, "registered names", ZLV_TK_CFG_NAMES);
}

Lines registryFlaws()
{
    Lines flaws;
    const auto check = [&](bool isSound, const char *flaw) {
        if (!isSound)
            flaws.push_back(flaw);
    };
    for (auto *node = nodesOf(ZLV_TK_CLASSES); node != nullptr; node = node->next)
        check(node->key == nullptr ||
                  ZlvStringGroupGetLink(namesOf(node->value->kind), node->key) != nullptr,
              "a class is found, but not listed");
    for (uint32_t kind = ZLV_KIND_LOGGER; kind <= ZLV_KIND_FORMATTER; ++kind)
        for (auto *node = nodesOf(namesOf(kind)); node != nullptr; node = node->next)
            check(zlvToolkitGetClassDef(node->element) != nullptr,
                  "a class is listed, but not found");
    for (auto *node = nodesOf(ZLV_TK_INSTANCES); node != nullptr; node = node->next)
        check(node->key != nullptr && node->value->refCount >= 2, "an object is lost");
    for (auto *node = nodesOf(ZLV_TK_CFG_DATA); node != nullptr; node = node->next)
        check(node->key == nullptr || ZlvStringGroupGetLink(ZLV_TK_CFG_NAMES, node->key) != nullptr,
              "a configuration is found, but not listed");
    for (auto *node = nodesOf(ZLV_TK_CFG_NAMES); node != nullptr; node = node->next)
        check(zlvIntlLogMgrHasCfg(node->element) == 1, "a configuration is listed, but not found");
    return flaws;
}

} // namespace zelvo_test
